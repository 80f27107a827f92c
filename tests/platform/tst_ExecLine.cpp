// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <ExecLine.h>

/// Command lines of entries.
class tst_ExecLine : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void findsTheProgram_data();
    void findsTheProgram();
    void quotesForThePlace_data();
    void quotesForThePlace();
};

void tst_ExecLine::findsTheProgram_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("program");
    const QString none = QStringLiteral("(none)");
    QTest::newRow("alone") << QStringLiteral("vi") << QStringLiteral("vi");
    QTest::newRow("with arguments") << QStringLiteral(" vi \"%f\" x") << QStringLiteral("vi");
    QTest::newRow("in quotes") << QStringLiteral("\"my prog\" %u") << QStringLiteral("my prog");
    QTest::newRow("in single quotes") << QStringLiteral("'my\\ prog'") << QStringLiteral("my\\ prog");
    QTest::newRow("quoted in part") << QStringLiteral("my\" \"prog x") << QStringLiteral("my prog");
    QTest::newRow("with an escape") << QStringLiteral("my\\ prog") << QStringLiteral("my prog");
    QTest::newRow("with a percent sign") << QStringLiteral("a%%b") << QStringLiteral("a%b");
    QTest::newRow("empty") << QString() << QString();
    QTest::newRow("an open quote") << QStringLiteral("\"vi") << none;
    QTest::newRow("an open escape") << QStringLiteral("vi\\") << none;
    QTest::newRow("a field code") << QStringLiteral("%f") << none;
    QTest::newRow("an unknown code") << QStringLiteral("vi %y") << none;
    for (const char mark : {'#', ';', '|', '&', '<', '>'}) {
        const QString with = QString::fromLatin1("vi a") + QLatin1Char(mark);
        const auto row = [mark](const char *where) { return QByteArray(1, mark) + ' ' + where; };
        QTest::newRow(row("before a code")) << with + QStringLiteral(" b %f") << none;
        QTest::newRow(row("beside a code")) << with + QStringLiteral("%u") << none;
        QTest::newRow(row("before a code in quotes")) << with + QStringLiteral(" \"%f\"") << none;
        QTest::newRow(row("before a second code"))
            << QStringLiteral("vi %f ") + QLatin1Char(mark) + QStringLiteral(" %c") << none;
        QTest::newRow(row("in the program"))
            << QStringLiteral("v") + QLatin1Char(mark) + QStringLiteral("i %f") << none;
        QTest::newRow(row("behind a code"))
            << QStringLiteral("vi %f ") + QLatin1Char(mark) + QStringLiteral(" x") << QStringLiteral("vi");
        QTest::newRow(row("before a percent sign")) << with + QStringLiteral(" 5%%") << QStringLiteral("vi");
        QTest::newRow(row("without a code")) << with << QStringLiteral("vi");
        QTest::newRow(row("in double quotes"))
            << QStringLiteral("vi \"a") + QLatin1Char(mark) + QStringLiteral("\" %f") << QStringLiteral("vi");
        QTest::newRow(row("in single quotes"))
            << QStringLiteral("vi 'a") + QLatin1Char(mark) + QStringLiteral("' %f") << QStringLiteral("vi");
        QTest::newRow(row("behind a backslash"))
            << QStringLiteral("vi a\\") + QLatin1Char(mark) + QStringLiteral(" %f") << QStringLiteral("vi");
    }
}

void tst_ExecLine::findsTheProgram()
{
    QFETCH(QString, exec);
    QFETCH(QString, program);
    QCOMPARE(ExecLine::program(exec).value_or(QStringLiteral("(none)")), program);
}

void tst_ExecLine::quotesForThePlace_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("line");
    QTest::newRow("bare") << QStringLiteral("x %f") << QStringLiteral("x 'a $'\\''b'");
    QTest::newRow("in double quotes") << QStringLiteral("x \"%f\"") << QStringLiteral("x \"a \\$'b\"");
    QTest::newRow("in single quotes") << QStringLiteral("x '%f'") << QStringLiteral("x 'a $'\\''b'");
    QTest::newRow("behind a backslash") << QStringLiteral("x \\%f") << QStringLiteral("x \\\\'a $'\\''b'");
    QTest::newRow("nothing given") << QStringLiteral("x %i%k%m") << QStringLiteral("x ");
    QTest::newRow("unknown") << QStringLiteral("x %y") << QString();
}

void tst_ExecLine::quotesForThePlace()
{
    QFETCH(QString, exec);
    QFETCH(QString, line);
    ExecLine::Arguments arguments;
    arguments.filePath = QStringLiteral("a $'b");
    QCOMPARE(ExecLine::expand(exec, arguments), line);
}

VEL_TEST_GUILESS_MAIN(tst_ExecLine)

#include "tst_ExecLine.moc"
