// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExecLine.h"

#include <ShellQuoting.h>

namespace {

using ShellQuoting::Kind;
using ShellQuoting::Piece;
using ShellQuoting::Quote;

constexpr QChar Percent = QLatin1Char('%');

bool isDeprecatedCode(QChar code)
{
    return QLatin1String("dDnNvm").contains(code);
}

bool isArgumentCode(QChar code)
{
    return QLatin1String("fFuUick").contains(code);
}

bool isCode(QChar code)
{
    return code == Percent || isArgumentCode(code) || isDeprecatedCode(code);
}

// What a shell would not take as part of a word. Behind it an argument that is filled in would be
// lost in a comment, be a command of its own or name a file to write to.
bool endsCommand(const Piece &piece, Quote quote)
{
    return quote == Quote::None && piece.kind == Kind::Character
        && QLatin1String("#;|&<>").contains(piece.character());
}

QStringList fileOrNothing(const QString &argument)
{
    return argument.isEmpty() ? QStringList() : QStringList(argument);
}

QStringList argumentsOf(QChar code, const ExecLine::Arguments &arguments)
{
    const QString &url = arguments.url.isEmpty() ? arguments.filePath : arguments.url;
    switch (code.unicode()) {
    case 'f':
        return fileOrNothing(arguments.filePath);
    case 'F':
        return arguments.filePaths.isEmpty() ? fileOrNothing(arguments.filePath) : arguments.filePaths;
    case 'u':
        return fileOrNothing(url);
    case 'U':
        return arguments.urls.isEmpty() ? fileOrNothing(url) : arguments.urls;
    case 'i':
        return arguments.icon.isEmpty() ? QStringList()
                                        : QStringList{QStringLiteral("--icon"), arguments.icon};
    case 'c':
        return fileOrNothing(arguments.appName);
    case 'k':
        return fileOrNothing(arguments.desktopFilePath);
    default:
        return {};
    }
}

// One word an argument; inside quotes they end between two words and begin again.
QString quoted(const QStringList &arguments, Quote quote)
{
    const QChar mark = quote == Quote::Double ? QLatin1Char('"') : QLatin1Char('\'');
    QString words;
    for (const QString &argument : arguments) {
        if (!words.isEmpty())
            words += mark + QStringLiteral(" ") + mark;
        words += ShellQuoting::escaped(argument, quote);
    }
    if (quote == Quote::None && !arguments.isEmpty())
        return mark + words + mark;
    return words;
}

} // namespace

QString ExecLine::expand(const QString &exec, const Arguments &arguments)
{
    QString line;
    line.reserve(exec.size());
    ShellQuoting::Scanner scanner(exec);
    while (!scanner.atEnd()) {
        const Piece piece = scanner.next();
        if (piece.character() != Percent) {
            ShellQuoting::append(line, piece.written);
            continue;
        }
        const QChar code = scanner.take();
        if (!isCode(code))
            return {};
        // A backslash before a code stands for itself; it must not undo the quoting of what comes in.
        if (piece.kind == Kind::Escape)
            line += code == Percent ? QLatin1String("\\") : QLatin1String("\\\\");
        line += code == Percent ? QString(Percent) : quoted(argumentsOf(code, arguments), scanner.quote());
    }
    return line;
}

std::optional<QString> ExecLine::program(const QString &exec)
{
    QString program;
    bool begun = false;
    bool ended = false;
    bool isAtRisk = false;
    ShellQuoting::Scanner scanner(exec);
    while (!scanner.atEnd()) {
        const Piece piece = scanner.next();
        if (piece.kind == Kind::OpenEscape)
            return std::nullopt;
        isAtRisk = isAtRisk || endsCommand(piece, scanner.quote());
        if (piece.kind == Kind::Blank) {
            ended = begun;
            continue;
        }
        if (piece.kind == Kind::Character && piece.character() == Percent) {
            const QChar code = scanner.take();
            if (!isCode(code) || (!ended && isArgumentCode(code)))
                return std::nullopt;
            if (code != Percent) {
                if (isAtRisk)
                    return std::nullopt;
                continue;
            }
        }
        begun = true;
        if (!ended)
            ShellQuoting::append(program, piece.meant);
    }
    if (scanner.quote() != Quote::None)
        return std::nullopt;
    return program;
}
