// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "TestCase.h"

#include <FolderReplacement.h>

#include <QDir>

#include <cerrno>
#include <cstdio>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

/// What a start menu's tests cannot bring about: file systems that exchange nothing, other users.
class FolderReplacementTest : public TestCase
{
    Q_OBJECT

private:
    std::filesystem::path target() const { return path(QStringLiteral("menu")).toStdString(); }
    QStringList names(const QString &folder) const
    {
        return QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot, QDir::Name);
    }
    void fill(const FolderReplacement &replacement)
    {
        QFile file(QString::fromStdString((replacement.folder() / "new").string()));
        QVERIFY(file.open(QIODevice::WriteOnly));
    }

    static int unknownExchange(const char *, const char *)
    {
        errno = EINVAL;
        return -1;
    }
    static int exchangeSoOften(const char *first, const char *second)
    {
        // What is taken back later is no longer in the way of anything.
        if (s_exchanges-- != 0)
            return FolderReplacement::exchangePaths(first, second);
        errno = EIO;
        return -1;
    }
    static inline int s_exchanges = 0;
    // The exchange is unknown and the folder that was to take the place is gone.
    static int exchangeThatLosesTheNew(const char *first, const char *)
    {
        std::rename(first, (std::string(first) + "-lost").c_str());
        errno = ENOSYS;
        return -1;
    }

private Q_SLOTS:
    void replacesInTwoStepsWhereNothingCanBeExchanged()
    {
        write(QStringLiteral("menu/old"), "x");
        {
            FolderReplacement replacement(target(), unknownExchange);
            QVERIFY(replacement.isOpen());
            fill(replacement);
            QVERIFY(replacement.commit());
        }
        QCOMPARE(names(path(QStringLiteral("menu"))), QStringList(QStringLiteral("new")));
        QCOMPARE(names(path(QStringLiteral("menu.previous"))), QStringList(QStringLiteral("old")));
        QCOMPARE(names(folder()), QStringList({QStringLiteral("menu"), QStringLiteral("menu.previous")}));
    }

    void keepsOneCopyWhereNothingCanBeExchanged()
    {
        write(QStringLiteral("menu/old"), "x");
        write(QStringLiteral("menu.previous/older"), "x");
        {
            FolderReplacement replacement(target(), unknownExchange);
            fill(replacement);
            QVERIFY(replacement.commit());
        }
        QCOMPARE(names(path(QStringLiteral("menu.previous"))), QStringList(QStringLiteral("old")));
        QCOMPARE(names(folder()), QStringList({QStringLiteral("menu"), QStringLiteral("menu.previous")}));
    }

    void leavesTheOldWhenTheExchangeFails_data()
    {
        QTest::addColumn<bool>("hasCopy");
        QTest::addColumn<int>("exchanges");
        QTest::newRow("first time") << false << 0;
        QTest::newRow("the copy's") << true << 0;
        QTest::newRow("the target's") << true << 1;
    }

    void leavesTheOldWhenTheExchangeFails()
    {
        QFETCH(bool, hasCopy);
        QFETCH(int, exchanges);
        write(QStringLiteral("menu/old"), "x");
        if (hasCopy)
            write(QStringLiteral("menu.previous/older"), "x");
        const QStringList before = names(folder());
        {
            s_exchanges = exchanges;
            FolderReplacement replacement(target(), exchangeSoOften);
            fill(replacement);
            QVERIFY(!replacement.commit());
        }
        QCOMPARE(names(path(QStringLiteral("menu"))), QStringList(QStringLiteral("old")));
        QCOMPARE(names(path(QStringLiteral("menu.previous"))),
                 hasCopy ? QStringList(QStringLiteral("older")) : QStringList());
        QCOMPARE(names(folder()), before);
    }

    void putsTheOldBackWhenTheSecondStepFails_data()
    {
        QTest::addColumn<bool>("hasCopy");
        QTest::newRow("first time") << false;
        QTest::newRow("with a copy") << true;
    }

    void putsTheOldBackWhenTheSecondStepFails()
    {
        QFETCH(bool, hasCopy);
        write(QStringLiteral("menu/old"), "x");
        if (hasCopy)
            write(QStringLiteral("menu.previous/older"), "x");
        {
            FolderReplacement replacement(target(), exchangeThatLosesTheNew);
            QVERIFY(!replacement.commit());
        }
        QCOMPARE(names(path(QStringLiteral("menu"))), QStringList(QStringLiteral("old")));
        QCOMPARE(names(path(QStringLiteral("menu.previous"))),
                 hasCopy ? QStringList(QStringLiteral("older")) : QStringList());
    }

    void bringsTheCopyBackThatAKilledReplacementPutAway_data()
    {
        QTest::addColumn<QString>("place");
        QTest::addColumn<bool>("hasCopy");
        QTest::addColumn<QString>("copy");
        // Where the new menu was when the program was killed; what is the copy afterwards.
        QTest::newRow("before the copy was touched") << ".menu.kept%1" << true << "older";
        QTest::newRow("in the place of the copy") << "menu.previous" << true << "older";
        QTest::newRow("in the place of the menu") << "menu" << true << "old";
        QTest::newRow("before the steps") << ".menu.new1-1" << false << "older";
    }

    void bringsTheCopyBackThatAKilledReplacementPutAway()
    {
        QFETCH(QString, place);
        QFETCH(bool, hasCopy);
        QFETCH(QString, copy);
        write(QStringLiteral("new/new"), "x");
        struct stat status = {};
        QCOMPARE(stat(qPrintable(path(QStringLiteral("new"))), &status), 0);
        const QString kept = QStringLiteral(".menu.kept%1").arg(status.st_ino);
        const bool isNewKept = place.contains(QLatin1String("kept"));
        place.replace(QLatin1String("%1"), QString::number(status.st_ino));
        QVERIFY(QDir(folder()).rename(QStringLiteral("new"), place));
        if (place != QLatin1String("menu"))
            write(QStringLiteral("menu/old"), "x");
        else
            write(QStringLiteral("menu.previous/old"), "x");
        if (!isNewKept)
            write(kept + QStringLiteral("/older"), "x");
        else if (hasCopy)
            write(QStringLiteral("menu.previous/older"), "x");
        {
            const FolderReplacement replacement(target());
        }
        QCOMPARE(names(path(QStringLiteral("menu.previous"))), QStringList(copy));
        QVERIFY(!QFile::exists(path(kept)));
        QCOMPARE(names(path(QStringLiteral("menu"))),
                 QStringList(place == QLatin1String("menu") ? QStringLiteral("new") : QStringLiteral("old")));
    }

    void leavesNothingWithoutACommit()
    {
        {
            FolderReplacement replacement(target() / "deep" / "deeper");
            QVERIFY(replacement.isOpen());
            fill(replacement);
        }
        QCOMPARE(names(folder()), QStringList());
    }

    void removesWhatKilledReplacementsLeft_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("kind");
        QTest::addColumn<bool>("stays");
        const auto row = [](const char *title, const char *name, const char *kind, bool stays) {
            QTest::newRow(title) << QString::fromLatin1(name) << QString::fromLatin1(kind) << stays;
        };
        row("new one", ".menu.new4711-0", "folder", false);
        row("old one", ".menu.old4711-12", "folder", false);
        row("old one without a menu", ".menu.old4711-12", "only", true);
        row("young", ".menu.new4711-0", "young", true);
        row("in use", ".menu.new4711-0", "locked", true);
        row("of another user", ".menu.new4711-0", "strange", true);
        row("file", ".menu.new4711-0", "file", true);
        row("link", ".menu.new4711-0", "link", true);
        row("of another menu", ".other.new4711-0", "folder", true);
        row("no numbers", ".menu.newest", "folder", true);
        row("one number", ".menu.new4711", "folder", true);
        row("another purpose", ".menu.bak4711-0", "folder", true);
        row("more behind", ".menu.new4711-0.x", "folder", true);
    }

    void removesWhatKilledReplacementsLeft()
    {
        QFETCH(QString, name);
        QFETCH(QString, kind);
        QFETCH(bool, stays);
        const QByteArray left = QFile::encodeName(path(name));
        write(QStringLiteral("elsewhere/kept"), "x");
        if (kind == QLatin1String("file"))
            write(name, "x");
        else if (kind == QLatin1String("link"))
            QVERIFY(QFile::link(path(QStringLiteral("elsewhere")), path(name)));
        else
            write(name + QStringLiteral("/sub/entry"), "x");
        if (QFileInfo(path(name)).isDir() && kind != QLatin1String("link")) {
            QVERIFY(QFile::link(path(QStringLiteral("elsewhere")), path(name) + QStringLiteral("/link")));
            QCOMPARE(chmod((left + "/sub").constData(), 0500), 0);
        }
        if (kind != QLatin1String("only"))
            write(QStringLiteral("menu/old"), "x");
        if (kind == QLatin1String("strange") && lchown(left.constData(), 12345, 12345) != 0)
            QSKIP("only root can make a folder of another user's");
        const timespec old[] = {{1600000000, 0}, {1600000000, 0}};
        QVERIFY(kind == QLatin1String("young")
                || utimensat(AT_FDCWD, left.constData(), old, AT_SYMLINK_NOFOLLOW) == 0);
        const int lock = kind == QLatin1String("locked") ? open(left.constData(), O_RDONLY) : -1;
        QVERIFY(lock < 0 || flock(lock, LOCK_SH) == 0);
        FolderReplacement replacement(target());
        QVERIFY(replacement.isOpen());
        struct stat status;
        QCOMPARE(lstat(left.constData(), &status) == 0, stays);
        QVERIFY(QFile::exists(path(QStringLiteral("elsewhere/kept"))));
        if (lock >= 0)
            close(lock);
        if (stays && S_ISDIR(status.st_mode))
            chmod((left + "/sub").constData(), 0700);
    }

    void tellsOthersThatItIsInUse()
    {
        FolderReplacement replacement(target());
        const int folder = open(replacement.folder().c_str(), O_RDONLY);
        QVERIFY(flock(folder, LOCK_EX | LOCK_NB) != 0);
        QVERIFY(replacement.commit());
        close(folder);
    }

    void followsNoLinkThatAnotherUserPlanted()
    {
        if (geteuid() != 0)
            QSKIP("only root can make a link of another user's");
        const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
        QCOMPARE(chmod(qPrintable(outside.path()), 01777), 0);
        const QString link = outside.filePath(QStringLiteral("menu"));
        write(QStringLiteral("menu/old"), "x");
        QVERIFY(QFile::link(path(QStringLiteral("menu")), link));
        QCOMPARE(lchown(qPrintable(link), 12345, 12345), 0);
        const OrdinaryUser user(folder());
        for (const char *end : {"", "/"})
            QVERIFY(!FolderReplacement(link.toStdString() + end).isOpen());
        QCOMPARE(names(folder()), (QStringList{QStringLiteral("menu"), QStringLiteral("runtime")}));
    }

    void lendsNobodyTheRightsOfAnotherOwner_data()
    {
        QTest::addColumn<uint>("old");
        QTest::addColumn<uint>("owner");
        QTest::addColumn<uint>("replaced");
        QTest::newRow("same owner") << 02775U << 0U << 02775U;
        QTest::newRow("another owner and group") << 03775U << 12345U << 0755U;
    }

    void lendsNobodyTheRightsOfAnotherOwner()
    {
        QFETCH(uint, old);
        QFETCH(uint, owner);
        QFETCH(uint, replaced);
        write(QStringLiteral("menu/old"), "x");
        const QByteArray menu = QFile::encodeName(path(QStringLiteral("menu")));
        if (geteuid() != 0)
            QSKIP("only root can give a folder away");
        {
            const OrdinaryUser user(folder());
        }
        owner = owner ? owner : 65534U;
        QCOMPARE(chown(menu.constData(), owner, owner), 0);
        QCOMPARE(chmod(menu.constData(), old), 0);
        QCOMPARE(chmod(qPrintable(folder()), 0777), 0);
        {
            // Without handing anything over again.
            const OrdinaryUser user(path(QStringLiteral("runtime")));
            FolderReplacement replacement(target());
            QVERIFY(replacement.isOpen());
            QVERIFY(replacement.commit());
        }
        struct stat status;
        QCOMPARE(stat(menu.constData(), &status), 0);
        QCOMPARE(QString::number(status.st_mode & 07777, 8), QString::number(replaced, 8));
    }

    void buildsBesideTheTargetOutOfSight()
    {
        FolderReplacement replacement(target());
        QCOMPARE(replacement.folder().parent_path(), target().parent_path());
        QCOMPARE(replacement.folder().filename().string().front(), '.');
    }
};

VEL_TEST_GUILESS_MAIN(FolderReplacementTest)
#include "tst_FolderReplacement.moc"
