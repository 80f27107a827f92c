// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "TestCase.h"

#include <velintegration/desktopitems.h>

#include <QDir>
#include <QScopeGuard>

#include <csignal>
#include <thread>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

class DesktopItemsTest : public TestCase
{
    Q_OBJECT

private:
    QString file() const { return path(QStringLiteral("config/desktopitems")); }
    static QPoint position(const char *name)
    {
        QPoint point(-99, -99);
        int x = 0;
        int y = 0;
        return ReadDesktopItemPosition(name, &x, &y) ? QPoint(x, y) : point;
    }
    static QPoint unknown() { return QPoint(-99, -99); }

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        qputenv("VEL_CONFIG_HOME", QFile::encodeName(path(QStringLiteral("config"))));
    }

    void knowsNothingWithoutAFile()
    {
        QCOMPARE(position("a.desktop"), unknown());
        QVERIFY(!QFile::exists(path(QStringLiteral("config"))));
    }

    void refusesAnEmptyName()
    {
        QVERIFY(!SaveDesktopItemPosition(nullptr, 1, 2));
        QVERIFY(!SaveDesktopItemPosition("", 1, 2));
        QVERIFY(!ReadDesktopItemPosition(nullptr, nullptr, nullptr));
        QVERIFY(!ReadDesktopItemPosition("", nullptr, nullptr));
        QVERIFY(!QFile::exists(file()));
    }

    void writesOneLineAnItem()
    {
        QVERIFY(SaveDesktopItemPosition("a.desktop", 10, -20));
        QVERIFY(SaveDesktopItemPosition("my file.desktop", 0, 7));
        QCOMPARE(read(file()), QByteArray("10 -20 a.desktop\n0 7 my%20file.desktop\n"));
    }

    void readsWhatItWrote_data()
    {
        QTest::addColumn<QByteArray>("name");
        QTest::newRow("plain") << QByteArray("a.desktop");
        QTest::newRow("blank") << QByteArray(" a  b ");
        QTest::newRow("line feed") << QByteArray("a\nb");
        QTest::newRow("percent") << QByteArray("50%20");
        QTest::newRow("UTF-8") << QByteArray("B\xc3\xbcro");
        QTest::newRow("no UTF-8") << QByteArray("B\xfcro");
        QTest::newRow("all kinds") << QByteArray("\t\r\x01\x7f'\"\\$&;");
    }

    void readsWhatItWrote()
    {
        QFETCH(QByteArray, name);
        QVERIFY(SaveDesktopItemPosition(name.constData(), 2147483647, -2147483647));
        QCOMPARE(position(name.constData()), QPoint(2147483647, -2147483647));
        QCOMPARE(position("other"), unknown());
        QCOMPARE(read(file()).count('\n'), 1);
    }

    void replacesTheLineOfTheItem()
    {
        write(QStringLiteral("config/desktopitems"), "1 1 a\n2 2 b\n3 3 c\n9 9 b\n");
        QVERIFY(SaveDesktopItemPosition("b", 5, 6));
        QCOMPARE(read(file()), QByteArray("1 1 a\n5 6 b\n3 3 c\n"));
    }

    void keepsLinesThatItDoesNotUnderstand()
    {
        write(QStringLiteral("config/desktopitems"), "# mine\n\nx 1 a\n1 2 3 b\n4 5 z\nno end");
        QVERIFY(SaveDesktopItemPosition("b", 5, 6));
        QCOMPARE(read(file()), QByteArray("# mine\n\nx 1 a\n1 2 3 b\n4 5 z\nno end\n5 6 b\n"));
        QCOMPARE(position("a"), unknown());
        QCOMPARE(position("b"), QPoint(5, 6));
        QCOMPARE(position("z"), QPoint(4, 5));
    }

    void readsNamesThatAreEscapedMoreThanNeeded()
    {
        write(QStringLiteral("config/desktopitems"), "1 2 %61%2edesktop\n");
        QCOMPARE(position("a.desktop"), QPoint(1, 2));
        QVERIFY(SaveDesktopItemPosition("a.desktop", 3, 4));
        QCOMPARE(read(file()), QByteArray("3 4 a.desktop\n"));
    }

    void leavesTheArgumentsAloneWhenNothingIsKnown()
    {
        int x = 5;
        int y = 6;
        QVERIFY(!ReadDesktopItemPosition("a", &x, &y));
        QCOMPARE(QPoint(x, y), QPoint(5, 6));
        QVERIFY(SaveDesktopItemPosition("a", 1, 2));
        QVERIFY(ReadDesktopItemPosition("a", nullptr, &y));
        QVERIFY(ReadDesktopItemPosition("a", &x, nullptr));
        QCOMPARE(QPoint(x, y), QPoint(1, 2));
    }

    void failsWhenTheFileCannotBeWritten()
    {
        QVERIFY(QDir().mkpath(file() + QStringLiteral("/in the way")));
        QVERIFY(!SaveDesktopItemPosition("a", 1, 2));
        QVERIFY(QDir(file() + QStringLiteral("/in the way")).exists());
        QCOMPARE(QDir(path(QStringLiteral("config")))
                     .entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
                 QStringList(QStringLiteral("desktopitems")));
    }

    void leavesAFileThatItCannotRead()
    {
        write(QStringLiteral("config/desktopitems"), "1 1 a\n");
        const OrdinaryUser user(folder());
        QVERIFY(QFile::setPermissions(file(), QFile::WriteOwner));
        QVERIFY(!SaveDesktopItemPosition("b", 2, 2));
        QCOMPARE(position("a"), unknown());
        QVERIFY(QFile::setPermissions(file(), QFile::ReadOwner));
        QCOMPARE(read(file()), QByteArray("1 1 a\n"));
    }

    void failsWhenTheRootCannotBeMade()
    {
        write(QStringLiteral("config"), "a file");
        QVERIFY(!SaveDesktopItemPosition("a", 1, 2));
        QCOMPARE(read(path(QStringLiteral("config"))), QByteArray("a file"));
    }

    void aFullDiskLeavesTheOldFileWhole()
    {
        const QByteArray old = "1 1 a\n" + QByteArray(5000, '#') + '\n';
        write(QStringLiteral("config/desktopitems"), old);
        rlimit limit;
        getrlimit(RLIMIT_FSIZE, &limit);
        const rlimit small = {1000, limit.rlim_max};
        const auto previous = std::signal(SIGXFSZ, SIG_IGN);
        setrlimit(RLIMIT_FSIZE, &small);
        const bool saved = SaveDesktopItemPosition("b", 2, 2);
        setrlimit(RLIMIT_FSIZE, &limit);
        std::signal(SIGXFSZ, previous);
        QVERIFY(!saved);
        QCOMPARE(read(file()), old);
        QCOMPARE(QDir(path(QStringLiteral("config")))
                     .entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
                 QStringList(QStringLiteral("desktopitems")));
    }

    void leavesWhatIsNoSmallFile_data()
    {
        QTest::addColumn<QString>("kind");
        QTest::newRow("named pipe") << QStringLiteral("pipe");
        QTest::newRow("device") << QStringLiteral("device");
        QTest::newRow("too large") << QStringLiteral("large");
        QTest::newRow("would be too large") << QStringLiteral("full");
    }

    void leavesWhatIsNoSmallFile()
    {
        QFETCH(QString, kind);
        QVERIFY(QDir().mkpath(path(QStringLiteral("config"))));
        if (kind == QLatin1String("pipe"))
            QCOMPARE(mkfifo(QFile::encodeName(file()).constData(), 0600), 0);
        else if (kind == QLatin1String("device"))
            QVERIFY(QFile::link(QStringLiteral("/dev/zero"), file()));
        else
            write(QStringLiteral("config/desktopitems"),
                  "1 1 a\n" + QByteArray(1024 * 1024 - (kind == QLatin1String("full") ? 6 : 5), '#'));
        QVERIFY(!SaveDesktopItemPosition("b", 2, 2));
        QCOMPARE(position("b"), unknown());
        QCOMPARE(position("a") == QPoint(1, 1), kind == QLatin1String("full"));
        QCOMPARE(QDir(path(QStringLiteral("config")))
                     .entryList(QDir::AllEntries | QDir::System | QDir::Hidden | QDir::NoDotAndDotDot),
                 QStringList(QStringLiteral("desktopitems")));
    }

    void followsNoLinkThatAnotherUserPlanted()
    {
        if (geteuid() != 0)
            QSKIP("only root can make a link of another user's");
        const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
        QCOMPARE(chmod(qPrintable(outside.path()), 01777), 0);
        qputenv("VEL_CONFIG_HOME", QFile::encodeName(outside.path()));
        const QString real = write(QStringLiteral("real"), "1 1 a\n");
        const QString link = outside.filePath(QStringLiteral("desktopitems"));
        QVERIFY(QFile::link(real, link));
        QCOMPARE(lchown(qPrintable(link), 12345, 12345), 0);
        const OrdinaryUser user(folder());
        QVERIFY(!SaveDesktopItemPosition("b", 2, 2));
        QCOMPARE(read(real), QByteArray("1 1 a\n"));
    }

    void givesNobodyMoreRightsThanBefore()
    {
        write(QStringLiteral("config/desktopitems"), "1 1 a\n");
        const QByteArray path = QFile::encodeName(file());
        // user::rw- user:12345:rw- group::--- mask::rw- other::---, as the system stores it.
        const unsigned char list[] = {2, 0,  0,   0,   1,   0,   6,  0, 255, 255, 255, 255, 2,   0,  6,
                                      0, 57, 48,  0,   0,   4,   0,  0, 0,   255, 255, 255, 255, 16, 0,
                                      6, 0,  255, 255, 255, 255, 32, 0, 0,   0,   255, 255, 255, 255};
        if (setxattr(path.constData(), "system.posix_acl_access", list, sizeof list, 0) != 0)
            QSKIP("there are no access lists here");
        QVERIFY(SaveDesktopItemPosition("b", 2, 2));
        struct stat status;
        QCOMPARE(stat(path.constData(), &status), 0);
        QCOMPARE(uint(status.st_mode & 07777), 0600U);
    }

    void losesNothingWhenTwoSaveAtOnce()
    {
        const auto save = [](char letter) {
            for (int i = 0; i < 50; ++i)
                SaveDesktopItemPosition((std::string(1, letter) + std::to_string(i)).c_str(), i, i);
        };
        std::thread first(save, 'a');
        std::thread second(save, 'b');
        first.join();
        second.join();
        QCOMPARE(read(file()).count('\n'), 100);
    }

    // Nobody may keep the desktop waiting; without a limit this would not come back.
    void savesThoughTheFolderStaysLocked()
    {
        QVERIFY(SaveDesktopItemPosition("a.desktop", 1, 2));
        const int folder = open(QFile::encodeName(path(QStringLiteral("config"))).constData(),
                                O_RDONLY | O_DIRECTORY | O_CLOEXEC);
        QVERIFY(folder >= 0);
        const auto closing = qScopeGuard([folder] { close(folder); });
        QCOMPARE(flock(folder, LOCK_EX), 0);
        QVERIFY(SaveDesktopItemPosition("b.desktop", 3, 4));
        QCOMPARE(position("a.desktop"), QPoint(1, 2));
        QCOMPARE(position("b.desktop"), QPoint(3, 4));
    }
};

VEL_TEST_GUILESS_MAIN(DesktopItemsTest)
#include "tst_desktopitems.moc"
