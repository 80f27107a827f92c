// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <ShellQuoting.h>

using ShellQuoting::Kind;
using ShellQuoting::Quote;

/// The steps over a line that is quoted as in a shell.
class tst_ShellQuoting : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsWhatEachStepMeets_data();
    void tellsWhatEachStepMeets();
    void takesOneCharacterWhateverItIs();
    void escapesForThePlace_data();
    void escapesForThePlace();
};

void tst_ShellQuoting::tellsWhatEachStepMeets_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<QString>("kinds"); // the first letters
    QTest::addColumn<QString>("meant");
    QTest::addColumn<int>("quote"); // at the end
    const auto row = [](const char *name, const char *line, const char *kinds, const char *meant, Quote end) {
        QTest::newRow(name) << QString::fromLatin1(line) << QString::fromLatin1(kinds)
                            << QString::fromLatin1(meant) << int(end);
    };
    row("nothing", "", "", "", Quote::None);
    row("an open double quote", "\"a b", "MCCC", "a b", Quote::Double);
    row("an open single quote", "'a\"", "MCC", "a\"", Quote::Single);
    row("a backslash at the end", "a\\", "CO", "a", Quote::None);
    row("a backslash at the end of quotes", "\"\\", "MO", "", Quote::Double);
    row("a backslash at the end of single quotes", "'\\", "MC", "\\", Quote::Single);
    row("blanks", "a \t\n'\t'", "CBBBMCM", "a\t", Quote::None);
    row("escapes outside", "\\a\\ \\\\\\'", "EEEE", "a \\'", Quote::None);
    row("escapes in double quotes", "\"\\\"\\a\\$\\`\\\\\\'\"", "MEEEEEEM", "\"\\a$`\\\\'", Quote::None);
    row("quotes in quotes", "\"'\"'\"'", "MCMMCM", "'\"", Quote::None);
}

void tst_ShellQuoting::tellsWhatEachStepMeets()
{
    QFETCH(QString, line);
    QFETCH(int, quote);
    QString kinds;
    QString written;
    QString meant;
    ShellQuoting::Scanner scanner(line);
    while (!scanner.atEnd()) {
        const ShellQuoting::Piece piece = scanner.next();
        kinds += QStringLiteral("CEOMB").at(int(piece.kind));
        ShellQuoting::append(written, piece.written);
        ShellQuoting::append(meant, piece.meant);
    }
    QTEST(kinds, "kinds");
    QTEST(meant, "meant");
    QCOMPARE(written, line);
    QCOMPARE(int(scanner.quote()), quote);
}

void tst_ShellQuoting::takesOneCharacterWhateverItIs()
{
    const QString line = QStringLiteral("%\"a");
    ShellQuoting::Scanner scanner(line);
    QCOMPARE(scanner.next().character(), QChar(QLatin1Char('%')));
    QCOMPARE(scanner.take(), QChar(QLatin1Char('"')));
    QCOMPARE(scanner.next().kind, Kind::Character);
    QCOMPARE(scanner.quote(), Quote::None);
    QVERIFY(scanner.atEnd());
    QCOMPARE(scanner.take(), QChar());
}

void tst_ShellQuoting::escapesForThePlace_data()
{
    QTest::addColumn<int>("quote");
    QTest::addColumn<QString>("text");
    QTest::newRow("outside") << int(Quote::None) << QStringLiteral("a '\\''\"\\`$");
    QTest::newRow("single quotes") << int(Quote::Single) << QStringLiteral("a '\\''\"\\`$");
    QTest::newRow("double quotes") << int(Quote::Double) << QStringLiteral("a '\\\"\\\\\\`\\$");
}

void tst_ShellQuoting::escapesForThePlace()
{
    QFETCH(int, quote);
    QTEST(ShellQuoting::escaped(QStringLiteral("a '\"\\`$"), Quote(quote)), "text");
}

VEL_TEST_GUILESS_MAIN(tst_ShellQuoting)

#include "tst_ShellQuoting.moc"
