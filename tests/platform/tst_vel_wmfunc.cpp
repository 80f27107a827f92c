// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velintegration/wmcommandreceiver.h>

#include <QProcess>

class VelWmfuncTest : public TestCase
{
    Q_OBJECT

private:
    int run(const QStringList &words, const QStringList &environment = {})
    {
        QProcess process;
        process.setEnvironment(QProcess::systemEnvironment() + environment);
        process.start(QCoreApplication::applicationDirPath() + QStringLiteral("/../bin/vel-wmfunc"), words);
        process.waitForFinished();
        m_output = process.readAllStandardOutput();
        m_error = process.readAllStandardError();
        return process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1;
    }

    QByteArray m_output;
    QByteArray m_error;

private Q_SLOTS:
    void failsWithoutWords()
    {
        WmCommandReceiver receiver(nullptr);
        QVERIFY(receiver.acquire());
        QCOMPARE(run({}), 2);
        QCOMPARE(m_error.count('\n'), 1);
        QCOMPARE(run({QString()}), 2);
    }

    void failsWithoutAWindowManager()
    {
        QCOMPARE(run({QStringLiteral("VELWM_QUIT")}), 1);
        QCOMPARE(m_error.count('\n'), 1);
        QVERIFY(m_error.startsWith("vel-wmfunc: "));
    }

    void failsWithoutADisplay()
    {
        QCOMPARE(run({QStringLiteral("VELWM_QUIT")}, {QStringLiteral("DISPLAY=:99999")}), 1);
        QCOMPARE(m_error.count('\n'), 1);
        QVERIFY(m_error.startsWith("vel-wmfunc: "));
    }

    void refusesMoreThanOneLine()
    {
        QByteArray lines;
        WmCommandReceiver receiver([&lines](const std::string &line) { lines += line.c_str(); });
        QVERIFY(receiver.acquire());
        QCOMPARE(run({QStringLiteral("VELWM_A\nVELWM_B")}), 1);
        QCOMPARE(m_error.count('\n'), 1);
        receiver.processEvents();
        QCOMPARE(lines, QByteArray());
    }

    void sendsTheWordsJoinedByOneBlank_data()
    {
        QTest::addColumn<QStringList>("words");
        QTest::addColumn<QByteArray>("line");
        QTest::newRow("one") << QStringList({QStringLiteral("VELWM_QUIT")}) << QByteArray("VELWM_QUIT");
        QTest::newRow("more") << QStringList(
            {QStringLiteral("VELWM_MOVE"), QStringLiteral("1"), QStringLiteral("2")})
                              << QByteArray("VELWM_MOVE 1 2");
        QTest::newRow("blanks within")
            << QStringList({QStringLiteral("VELWM_A  b"), QStringLiteral(""), QStringLiteral("c")})
            << QByteArray("VELWM_A  b  c");
        QTest::newRow("an option among words")
            << QStringList({QStringLiteral("VELWM_A"), QStringLiteral("--help")})
            << QByteArray("VELWM_A --help");
        QTest::newRow("UTF-8") << QStringList({QStringLiteral("VELWM_Ü")}) << QByteArray("VELWM_\xc3\x9c");
    }

    void sendsTheWordsJoinedByOneBlank()
    {
        QFETCH(QStringList, words);
        QFETCH(QByteArray, line);
        QList<QByteArray> lines;
        WmCommandReceiver receiver([&lines](const std::string &text) { lines.append(text.c_str()); });
        QVERIFY(receiver.acquire());
        QCOMPARE(run(words), 0);
        QCOMPARE(m_error, QByteArray());
        receiver.processEvents();
        QCOMPARE(lines, QList<QByteArray>({line}));
    }

    void tellsHowItIsUsed()
    {
        QCOMPARE(run({QStringLiteral("--help")}), 0);
        QVERIFY(m_output.startsWith("usage: vel-wmfunc WORDS..."));
        QCOMPARE(run({QStringLiteral("--version")}), 0);
        QCOMPARE(m_output, QByteArray("vel-wmfunc " VEL_VERSION "\n"));
    }
};

VEL_TEST_GUILESS_MAIN(VelWmfuncTest)
#include "tst_vel_wmfunc.moc"
