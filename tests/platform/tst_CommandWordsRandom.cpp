// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <CommandWords.h>

#include <QRandomGenerator>

#include <glib.h>

namespace {

// Without line feeds and "#", which GLib takes for continuations and comments.
QString randomLine(QRandomGenerator &random)
{
    const QString alphabet = QStringLiteral("ab \t'\"\\`$%é");
    QString line;
    for (int n = random.bounded(16); n > 0; --n)
        line += alphabet.at(random.bounded(alphabet.size()));
    return line;
}

std::optional<QStringList> wordsOfGlib(const QString &line)
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

} // namespace

/// Random command lines: GLib, which reads Exec keys for others, takes the same words from them.
class tst_CommandWordsRandom : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void agreesWithGlib();
};

void tst_CommandWordsRandom::agreesWithGlib()
{
    QRandomGenerator random(7);
    int good = 0;
    for (int round = 0; round < 200000; ++round) {
        const QString line = randomLine(random);
        const auto words = commandWords(line);
        QVERIFY2(words == wordsOfGlib(line), qPrintable(line));
        good += words ? 1 : 0;
    }
    QVERIFY2(good > 20000, "too few of the lines are good ones");
}

VEL_TEST_GUILESS_MAIN(tst_CommandWordsRandom)

#include "tst_CommandWordsRandom.moc"
