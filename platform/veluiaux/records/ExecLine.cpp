// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExecLine.h"

namespace {

enum class Quote { None, Single, Double };

constexpr QChar Backslash = QLatin1Char('\\');
constexpr QChar SingleQuote = QLatin1Char('\'');
constexpr QChar DoubleQuote = QLatin1Char('"');
constexpr QChar Percent = QLatin1Char('%');
constexpr QChar Blank = QLatin1Char(' ');

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

// The state of quoting behind a character that no backslash stands before.
Quote after(Quote quote, QChar c)
{
    if (c == SingleQuote && quote != Quote::Double)
        return quote == Quote::Single ? Quote::None : Quote::Single;
    if (c == DoubleQuote && quote != Quote::Single)
        return quote == Quote::Double ? Quote::None : Quote::Double;
    return quote;
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

// An argument as it stands inside the given quoting, without the quotes around it.
QString escaped(const QString &argument, Quote quote)
{
    QString text;
    text.reserve(argument.size() + 2);
    for (const QChar c : argument) {
        if (quote == Quote::Double && QLatin1String("\\\"`$").contains(c))
            text += Backslash;
        if (quote != Quote::Double && c == SingleQuote)
            text += QLatin1String("'\\''");
        else
            text += c;
    }
    return text;
}

// One word an argument; inside quotes they end between two words and begin again.
QString quoted(const QStringList &arguments, Quote quote)
{
    const QChar mark = quote == Quote::Double ? DoubleQuote : SingleQuote;
    QString words;
    for (const QString &argument : arguments) {
        if (!words.isEmpty())
            words += mark + QString(Blank) + mark;
        words += escaped(argument, quote);
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
    Quote quote = Quote::None;
    for (int i = 0; i < exec.size(); ++i) {
        const QChar c = exec.at(i);
        const QChar next = i + 1 < exec.size() ? exec.at(i + 1) : QChar();
        if (c == Percent) {
            if (!isCode(next))
                return {};
            line += next == Percent ? QString(Percent) : quoted(argumentsOf(next, arguments), quote);
            ++i;
        } else if (c == Backslash && quote != Quote::Single && next == Percent) {
            // Before a code it stands for itself; it must not undo the quoting of what comes in.
            const bool plainPercent = i + 2 < exec.size() && exec.at(i + 2) == Percent;
            line += plainPercent ? QLatin1String("\\") : QLatin1String("\\\\");
        } else if (c == Backslash && quote != Quote::Single && i + 1 < exec.size()) {
            line += c;
            line += next;
            ++i;
        } else {
            line += c;
            quote = after(quote, c);
        }
    }
    return line;
}

std::optional<QString> ExecLine::program(const QString &exec)
{
    QString program;
    bool begun = false;
    bool ended = false;
    Quote quote = Quote::None;
    const auto add = [&](QChar c) {
        begun = true;
        if (!ended)
            program += c;
    };
    for (int i = 0; i < exec.size(); ++i) {
        const QChar c = exec.at(i);
        const QChar next = i + 1 < exec.size() ? exec.at(i + 1) : QChar();
        if (c == Percent) {
            if (!isCode(next) || (!ended && isArgumentCode(next)))
                return std::nullopt;
            if (next == Percent)
                add(Percent);
            ++i;
        } else if (c == Backslash && quote != Quote::Single) {
            if (i + 1 == exec.size())
                return std::nullopt;
            if (quote == Quote::Double && !QLatin1String("\\\"`$").contains(next))
                add(c);
            add(next);
            ++i;
        } else if (quote == Quote::None && (c == Blank || c == QLatin1Char('\t') || c == QLatin1Char('\n'))) {
            ended = begun;
        } else if (after(quote, c) != quote) {
            begun = true;
            quote = after(quote, c);
        } else {
            add(c);
        }
    }
    if (quote != Quote::None)
        return std::nullopt;
    return program;
}
