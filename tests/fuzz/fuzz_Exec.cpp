// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// An Exec line whose field codes are filled in, against GLib's reader of command lines. The first
// line of an input is the Exec value, the rest is the argument.

#include "FuzzTarget.h"

#include <CommandWords.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <glib.h>

namespace {

using Words = std::optional<QStringList>;

Words wordsOfGlib(const QString &line)
{
    int count = 0;
    char **words = nullptr;
    GError *error = nullptr;
    QStringList result;
    if (!g_shell_parse_argv(line.toUtf8().constData(), &count, &words, &error)) {
        const bool isEmpty = g_error_matches(error, G_SHELL_ERROR, G_SHELL_ERROR_EMPTY_STRING);
        g_error_free(error);
        return isEmpty ? std::make_optional(result) : std::nullopt;
    }
    for (int i = 0; i < count; ++i)
        result.append(QString::fromUtf8(words[i]));
    g_strfreev(words);
    return result;
}

QString expanded(const QString &exec, const QString &argument)
{
    VelUIDesktopEntry::ExecFormatString format(exec);
    return format.filePath(argument).appName(argument).icon(argument).desktopFilePath(argument);
}

QString textOf(QByteArray bytes)
{
    return QString::fromUtf8(bytes.replace('\0', ' '));
}

// GLib takes "#" for the begin of a comment, and a backslash before a line feed for a continuation.
bool isReadAlike(const QString &line)
{
    return !line.contains(QLatin1Char('#')) && !line.contains(QLatin1String("\\\n"));
}

} // namespace

void Fuzz::test(const QByteArray &input)
{
    const Parts parts = cut(input);
    const QString exec = textOf(parts.head);
    if (isReadAlike(exec))
        require(commandWords(exec) == wordsOfGlib(exec), "GLib reads the same words");

    // An argument fills the places of the field codes and nothing else, whatever is in it.
    const QString marker = QStringLiteral("VELMARKER");
    const QString argument = QLatin1Char('/') + textOf(parts.rest);
    if (exec.contains(QLatin1String("VELM")))
        return;
    const QString line = expanded(exec, argument);
    Words expected = commandWords(expanded(exec, marker));
    if (expected)
        expected->replaceInStrings(marker, argument);
    require(commandWords(line) == expected, "an argument stays within its word");
    if (isReadAlike(line))
        require(wordsOfGlib(line) == expected, "an argument stays within its word for GLib");
}
