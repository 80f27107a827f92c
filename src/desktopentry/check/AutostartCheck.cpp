// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "AutostartCheck.h"

#include <QCoreApplication>

namespace {

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

bool isKnown(const QString &condition)
{
    static const QStringList known{QStringLiteral("GNOME"),     QStringLiteral("GNOME3"),
                                   QStringLiteral("GSettings"), QStringLiteral("KDE"),
                                   QStringLiteral("if-exists"), QStringLiteral("unless-exists")};
    return known.contains(condition) || condition.startsWith(QLatin1String("X-"));
}

// What is wrong with the words behind the condition; empty where nothing is.
QString argumentSentence(const QString &condition, const QString &arguments)
{
    if (condition.endsWith(QLatin1String("-exists")) && arguments.isEmpty())
        return Text::tr("The condition '%1' needs a file.").arg(condition);
    if (condition.endsWith(QLatin1String("-exists")) && arguments.startsWith(QLatin1Char('/')))
        return Text::tr(
                   "The file of the condition '%1' is one in the folder of settings, without '/' before it.")
            .arg(condition);
    if (condition == QLatin1String("GNOME") && arguments.isEmpty())
        return Text::tr("The condition '%1' needs a key.").arg(condition);
    if (condition == QLatin1String("GNOME3") && !arguments.startsWith(QLatin1String("if-session "))
        && !arguments.startsWith(QLatin1String("unless-session ")))
        return Text::tr("The condition '%1' needs 'if-session' or 'unless-session' and a session.")
            .arg(condition);
    if (condition == QLatin1String("GSettings") && arguments.count(QLatin1Char(' ')) != 1)
        return Text::tr("The condition '%1' needs a schema and a key.").arg(condition);
    return {};
}

} // namespace

void AutostartCheck::check(const CheckedValue &value)
{
    const QString text = value.text();
    const int blank = text.indexOf(QLatin1Char(' '));
    const QString condition = text.left(blank);
    const QString arguments = blank < 0 ? QString() : text.mid(blank + 1).trimmed();
    const QString sentence = isKnown(condition) ? argumentSentence(condition, arguments)
                                                : Text::tr("There is no condition '%1'.").arg(condition);
    if (!sentence.isEmpty())
        value.add(EntryProblem::InvalidCondition, EntryFinding::Error, sentence);
}
