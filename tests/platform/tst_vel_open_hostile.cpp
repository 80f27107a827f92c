// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "VelOpenTestCase.h"

#include <QDir>

#include <atomic>
#include <thread>

#include <cstdio>
#include <unistd.h>

namespace {

constexpr uid_t Somebody = 12345;

/// Gives \a path to \a owner with the rights of the superuser, which the process has kept.
bool giveTo(const QString &path, uid_t owner)
{
    const uid_t self = geteuid();
    const bool isDone = seteuid(0) == 0 && chown(QFile::encodeName(path).constData(), owner, owner) == 0;
    return seteuid(self) == 0 && isDone;
}

/// Whether no byte of \a line but its end is obeyed by a terminal.
bool isPlain(const QByteArray &line)
{
    const QString text = QString::fromUtf8(line);
    for (int i = 0; i < text.size() - 1; ++i) {
        if (text.at(i).category() == QChar::Other_Control)
            return false;
    }
    return text.endsWith(QLatin1Char('\n'));
}

} // namespace

/// What vel-open does with entries that mean harm.
class tst_vel_open_hostile : public VelOpenTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void givesNoOptionToWhatOpensFiles_data();
    void givesNoOptionToWhatOpensFiles();
    void openedNamesAreNoOptions();
    void sendsNoControlCharacterToTheTerminal_data();
    void sendsNoControlCharacterToTheTerminal();
    void showsLettersOfAllLanguages();
    void runsAnEntryOfSomebodyElseOnlyWithTrust_data();
    void runsAnEntryOfSomebodyElseOnlyWithTrust();
    void refusesALinkOfSomebodyElseToo();
    void judgesTheFileThatALinkLeadsTo();
    void runsWhatItHasJudged();

private:
    QByteArray m_dataHome;
};

void tst_vel_open_hostile::init()
{
    VelOpenTestCase::init();
    m_dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", bytes(path(QStringLiteral("data"))));
}

void tst_vel_open_hostile::cleanup()
{
    qputenv("XDG_DATA_HOME", m_dataHome);
    VelOpenTestCase::cleanup();
}

void tst_vel_open_hostile::givesNoOptionToWhatOpensFiles_data()
{
    QTest::addColumn<QByteArray>("url");
    for (const char *url : {"-", "--help", "-x https://localhost/", "--\\n"})
        QTest::newRow(url) << QByteArray(url);
}

void tst_vel_open_hostile::givesNoOptionToWhatOpensFiles()
{
    QFETCH(QByteArray, url);
    probe("xdg-open", "printf '%s|' \"$@\"");
    QCOMPARE(open(entry("Type=Link\nName=x\nURL=" + url + '\n')), 1);
    QVERIFY2(m_error.contains("begins with \"-\""), m_error.constData());
    QVERIFY(isPlain(m_error));
    QCOMPARE(told(), QByteArray());
}

void tst_vel_open_hostile::openedNamesAreNoOptions()
{
    probe("xdg-open", "printf '%s|' \"$@\"");
    write(QStringLiteral("--help"), "text");
    QCOMPARE(open(QStringLiteral("--help")), 0);
    QTRY_COMPARE(told(), bytes(path(QStringLiteral("--help"))) + '|');
}

void tst_vel_open_hostile::sendsNoControlCharacterToTheTerminal_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<QByteArray>("shown");
    QTest::newRow("a program") << QByteArray("Exec=a\033[31mb\n") << QByteArray("a?[31mb");
    QTest::newRow("a path") << QByteArray("Exec=/a\033]0;x\007b\n") << QByteArray("/a?]0;x?b");
    QTest::newRow("a folder") << QByteArray("Exec=true\nPath=/a\bb\n") << QByteArray("/a?b");
    QTest::newRow("a command") << QByteArray("Exec=a\177 \"\n") << QByteArray("a? ");
    QTest::newRow("escapes of entries") << QByteArray("Exec=\"a\\nb\\rc\\td\"\n") << QByteArray("a?b?c?d");
    QTest::newRow("one of eight bits") << QByteArray("Exec=a\xC2\x9B"
                                                     "31mb\n")
                                       << QByteArray("a?31mb");
    QTest::newRow("in a terminal") << QByteArray("Exec=a\033[31mb\nTerminal=true\n") << QByteArray("a?[31mb");
}

void tst_vel_open_hostile::sendsNoControlCharacterToTheTerminal()
{
    QFETCH(QByteArray, keys);
    QFETCH(QByteArray, shown);
    const QString name = QString::fromUtf8("odd\033[2J\xC2\x9B"
                                           "2J.desktop");
    QCOMPARE(open(entry("Type=Application\nName=x\n" + keys, name)), 1);
    QVERIFY2(isPlain(m_error), m_error.constData());
    QVERIFY2(m_error.contains("odd?[2J?2J.desktop: "), m_error.constData());
    QVERIFY2(m_error.contains(shown), m_error.constData());

    // Bytes that are no text in the user's language are none for the terminal, either.
    QProcess process;
    process.start(QStringLiteral("sh"),
                  {QStringLiteral("-c"), QStringLiteral("exec \"$0\" --exec \"$(printf '/none\\233\\303')\""),
                   program()});
    QVERIFY(process.waitForFinished());
    QVERIFY(process.readAllStandardError().startsWith("vel-open: /none??: "));
}

void tst_vel_open_hostile::showsLettersOfAllLanguages()
{
    QCOMPARE(open(application("Exec=/n\xC3\xB6/\xE6\xBC\xA2\n")), 1);
    QVERIFY2(m_error.contains("/n\xC3\xB6/\xE6\xBC\xA2"), m_error.constData());
}

void tst_vel_open_hostile::runsAnEntryOfSomebodyElseOnlyWithTrust_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<uint>("owner");
    QTest::addColumn<bool>("executable");
    QTest::addColumn<bool>("trusted");
    QTest::addColumn<bool>("runs");
    const QString here = QStringLiteral("x.desktop");
    QTest::newRow("of somebody else") << here << uint(Somebody) << false << false << false;
    QTest::newRow("executable") << here << uint(Somebody) << true << false << true;
    QTest::newRow("trusted") << here << uint(Somebody) << false << true << true;
    QTest::newRow("of the superuser") << here << 0U << false << false << true;
    QTest::newRow("of the user") << here << 65534U << false << false << true;
    QTest::newRow("in the data folder")
        << QStringLiteral("data/applications/x.desktop") << uint(Somebody) << false << false << true;
    QTest::newRow("in a shared data folder")
        << QStringLiteral("shared/x.desktop") << uint(Somebody) << false << false << true;
    QTest::newRow("by a way out of the data folder")
        << QStringLiteral("data/../x.desktop") << uint(Somebody) << false << false << false;
    QTest::newRow("in a folder named nearly so")
        << QStringLiteral("database/x.desktop") << uint(Somebody) << false << false << false;
}

void tst_vel_open_hostile::runsAnEntryOfSomebodyElseOnlyWithTrust()
{
    QFETCH(QString, file);
    QFETCH(uint, owner);
    QFETCH(bool, executable);
    QFETCH(bool, trusted);
    QFETCH(bool, runs);
    if (geteuid() != 0)
        QSKIP("only the superuser can give files to others");
    QVERIFY(QDir().mkpath(path(QStringLiteral("data"))));
    // A data folder may be reached through a link.
    QVERIFY(QDir().mkpath(path(QStringLiteral("shared"))));
    QVERIFY(QFile::link(path(QStringLiteral("shared")), path(QStringLiteral("link"))));
    const QByteArray dirs = qgetenv("XDG_DATA_DIRS");
    qputenv("XDG_DATA_DIRS", dirs + ':' + bytes(path(QStringLiteral("link"))));
    probe("probe", "echo ran");
    const QString entry = this->entry("Type=Application\nName=x\nExec=probe\n", file);
    const QFile::Permissions readable(QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther);
    QVERIFY(QFile::setPermissions(entry, executable ? readable | QFile::ExeOther : readable));
    {
        const OrdinaryUser user(folder());
        QVERIFY(giveTo(entry, owner));
        QCOMPARE(open(entry, trusted ? QStringList(QStringLiteral("--trust")) : QStringList()), runs ? 0 : 1);
    }
    qputenv("XDG_DATA_DIRS", dirs);
    if (runs)
        QTRY_COMPARE(told(), QByteArray("ran\n"));
    else
        QVERIFY2(m_error.contains("belongs to another user") && m_error.contains("--trust"),
                 m_error.constData());
}

void tst_vel_open_hostile::refusesALinkOfSomebodyElseToo()
{
    if (geteuid() != 0)
        QSKIP("only the superuser can give files to others");
    probe("xdg-open", "echo ran");
    const QString link = entry("Type=Link\nName=x\nURL=https://localhost/\n");
    const OrdinaryUser user(folder());
    QVERIFY(giveTo(link, Somebody));
    QCOMPARE(open(link), 1);
    QCOMPARE(open(link, {QStringLiteral("--trust")}), 0);
}

void tst_vel_open_hostile::judgesTheFileThatALinkLeadsTo()
{
    if (geteuid() != 0)
        QSKIP("only the superuser can give files to others");
    probe("probe", "echo ran");
    const QString outside = application("Exec=probe\n");
    const QString inside = entry("Type=Application\nName=x\nExec=probe\n", QStringLiteral("data/in.desktop"));
    const QString planted = path(QStringLiteral("data/planted.desktop"));
    QVERIFY(QFile::link(outside, planted));
    const QString wayIn = path(QStringLiteral("way in.desktop"));
    QVERIFY(QFile::link(inside, wayIn));
    const OrdinaryUser user(folder());
    QVERIFY(giveTo(outside, Somebody));
    QVERIFY(giveTo(inside, Somebody));
    QCOMPARE(open(planted), 1);
    QCOMPARE(open(wayIn), 0);
}

// Somebody changes what the path leads to as fast as they can.
void tst_vel_open_hostile::runsWhatItHasJudged()
{
    if (geteuid() != 0)
        QSKIP("only the superuser can give files to others");
    script(QStringLiteral("good"), "");
    script(QStringLiteral("bad"), "echo bad >'" + bytes(path(QStringLiteral("told"))) + "'\n");
    const QString good = entry("Type=Application\nName=x\nExec=good\n", QStringLiteral("good.desktop"));
    const QString bad = entry("Type=Application\nName=x\nExec=bad\n", QStringLiteral("bad.desktop"));
    const QString changing = path(QStringLiteral("changing.desktop"));
    QVERIFY(QFile::link(good, changing));
    const OrdinaryUser user(folder());
    QVERIFY(giveTo(bad, Somebody));

    std::atomic<bool> isDone{false};
    std::thread changer([&] {
        const QByteArray next = bytes(path(QStringLiteral("next")));
        for (bool isGood = false; !isDone; isGood = !isGood) {
            const QByteArray target = bytes(isGood ? good : bad);
            if (symlink(target.constData(), next.constData()) == 0)
                std::rename(next.constData(), bytes(changing).constData());
        }
    });
    int runs = 0;
    for (int i = 0; i < 60; ++i)
        runs += open(changing) == 0 ? 1 : 0;
    isDone = true;
    changer.join();
    QVERIFY(runs > 0);
    QTest::qWait(300); // for a program that should not have been started
    QCOMPARE(told(), QByteArray());
}

VEL_TEST_GUILESS_MAIN(tst_vel_open_hostile)
#include "tst_vel_open_hostile.moc"
