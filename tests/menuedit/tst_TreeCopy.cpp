// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "OtherFileSystem.h"
#include "TestCase.h"

#include <menuedit/FileTransfer.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

using namespace FileTransfer;

/// Whom copied and moved files are open to, and what killed copies left.
class tst_TreeCopy : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void copiesFollowTheUmask();
    void copiesCarryNoSetIdBits();
    void movesKeepPermissionsAcrossFileSystems();
    void aMoveLendsNobodyTheRightsOfAnotherOwner();
    void removesWhatKilledCopiesLeft_data();
    void removesWhatKilledCopiesLeft();

private:
    bool setMode(const char *name, mode_t mode) const
    {
        return chmod(qPrintable(path(QLatin1String(name))), mode) == 0;
    }
    uint mode(const char *name) const { return modeOf(path(QLatin1String(name))); }
    static uint modeOf(const QString &file)
    {
        struct stat status = {};
        return stat(QFile::encodeName(file).constData(), &status) == 0 ? status.st_mode & 07777 : 0;
    }
};

void tst_TreeCopy::init()
{
    TestCase::init();
    QDir(folder()).mkpath(QStringLiteral("from"));
    QDir(folder()).mkpath(QStringLiteral("to"));
}

void tst_TreeCopy::copiesFollowTheUmask()
{
    write(QStringLiteral("from/d/open/a"), "a");
    write(QStringLiteral("from/d/closed/b"), "b");
    QVERIFY(setMode("from/d", 0777) && setMode("from/d/open", 0777) && setMode("from/d/open/a", 0666)
            && setMode("from/d/closed/b", 0400) && setMode("from/d/closed", 0500));
    const mode_t previous = umask(027);
    const Result result =
        transfer({path(QStringLiteral("from/d"))}, path(QStringLiteral("to")), Action::Copy);
    umask(previous);

    QVERIFY(result.succeeded());
    QCOMPARE(mode("to/d"), 0750U);
    QCOMPARE(mode("to/d/open"), 0750U);
    QCOMPARE(mode("to/d/open/a"), 0640U);
    QCOMPARE(mode("to/d/closed"), 0500U);
    QCOMPARE(mode("to/d/closed/b"), 0400U);
    QVERIFY(setMode("from/d/closed", 0700) && setMode("to/d/closed", 0700));
}

void tst_TreeCopy::copiesCarryNoSetIdBits()
{
    write(QStringLiteral("from/d/a"), "a");
    QVERIFY(setMode("from/d/a", 06755) && setMode("from/d", 03755));
    const mode_t previous = umask(022);
    const Result result =
        transfer({path(QStringLiteral("from/d"))}, path(QStringLiteral("to")), Action::Copy);
    umask(previous);

    QVERIFY(result.succeeded());
    QCOMPARE(mode("to/d"), 0755U);
    QCOMPARE(mode("to/d/a"), 0755U);
}

void tst_TreeCopy::movesKeepPermissionsAcrossFileSystems()
{
    const QString other = otherFileSystem(folder());
    if (other.isEmpty())
        QSKIP("there is no second file system to write to");
    const QTemporaryDir target(other + QStringLiteral("/tst_TreeCopy-XXXXXX"));
    write(QStringLiteral("from/d/a"), "a");
    QVERIFY(setMode("from/d/a", 04666) && setMode("from/d", 02777));
    const mode_t previous = umask(077);
    const Result result = transfer({path(QStringLiteral("from/d"))}, target.path(), Action::Move);
    umask(previous);

    QVERIFY(result.succeeded());
    QCOMPARE(modeOf(target.filePath(QStringLiteral("d"))), 02777U);
    QCOMPARE(modeOf(target.filePath(QStringLiteral("d/a"))), 04666U);
}

void tst_TreeCopy::aMoveLendsNobodyTheRightsOfAnotherOwner()
{
    const QString other = otherFileSystem(folder());
    if (other.isEmpty())
        QSKIP("there is no second file system to write to");
    if (geteuid() != 0)
        QSKIP("only root can make a file of another user's");
    const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
    const QTemporaryDir target(other + QStringLiteral("/tst_TreeCopy-XXXXXX"));
    const QString file = outside.filePath(QStringLiteral("a"));
    QVERIFY(QFile::copy(write(QStringLiteral("a"), "a"), file));
    QCOMPARE(chown(qPrintable(file), 12345, 12345), 0);
    QCOMPARE(chmod(qPrintable(file), 06755), 0);
    QCOMPARE(chmod(qPrintable(outside.path()), 0777), 0);
    QCOMPARE(chmod(qPrintable(target.path()), 0777), 0);
    {
        const OrdinaryUser user(folder());
        QVERIFY(transfer({file}, target.path(), Action::Move).succeeded());
    }
    struct stat status = {};
    QCOMPARE(stat(qPrintable(target.filePath(QStringLiteral("a"))), &status), 0);
    QVERIFY(status.st_uid != 12345);
    QCOMPARE(uint(status.st_mode & 07777), 0755U);
}

void tst_TreeCopy::removesWhatKilledCopiesLeft_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("kind");
    QTest::addColumn<bool>("stays");
    const auto row = [](const char *title, const char *name, const char *kind, bool stays) {
        QTest::newRow(title) << QString::fromLatin1(name) << QString::fromLatin1(kind) << stays;
    };
    row("old", ".velcopy-aB3dE6", "folder", false);
    row("young", ".velcopy-aB3dE6", "young", true);
    row("in use", ".velcopy-aB3dE6", "locked", true);
    row("of another user", ".velcopy-aB3dE6", "strange", true);
    row("file", ".velcopy-aB3dE6", "file", true);
    row("link", ".velcopy-aB3dE6", "link", true);
    row("too short", ".velcopy-aB3dE", "folder", true);
    row("too long", ".velcopy-aB3dE67", "folder", true);
    row("other letters", ".velcopy-aB3.E6", "folder", true);
    row("without a dot", "velcopy-aB3dE6", "folder", true);
}

void tst_TreeCopy::removesWhatKilledCopiesLeft()
{
    QFETCH(QString, name);
    QFETCH(QString, kind);
    QFETCH(bool, stays);
    const QString left = path(QStringLiteral("to/") + name);
    const QByteArray encoded = QFile::encodeName(left);
    write(QStringLiteral("elsewhere/kept"), "x");
    if (kind == QLatin1String("file")) {
        write(QStringLiteral("to/") + name, "x");
    } else if (kind == QLatin1String("link")) {
        QVERIFY(QFile::link(path(QStringLiteral("elsewhere")), left));
    } else {
        write(QStringLiteral("to/") + name + QStringLiteral("/item/sub/a"), "x");
        QVERIFY(QFile::link(path(QStringLiteral("elsewhere")), left + QStringLiteral("/item/link")));
        QCOMPARE(chmod((encoded + "/item/sub").constData(), 0), 0);
    }
    if (kind == QLatin1String("strange") && lchown(encoded.constData(), 12345, 12345) != 0)
        QSKIP("only root can make a folder of another user's");
    const timespec old[] = {{1600000000, 0}, {1600000000, 0}};
    QVERIFY(kind == QLatin1String("young")
            || utimensat(AT_FDCWD, encoded.constData(), old, AT_SYMLINK_NOFOLLOW) == 0);
    const int lock = kind == QLatin1String("locked") ? open(encoded.constData(), O_RDONLY) : -1;
    QVERIFY(lock < 0 || flock(lock, LOCK_SH) == 0);

    QVERIFY(transfer({write(QStringLiteral("from/a"), "a")}, path(QStringLiteral("to")), Action::Copy)
                .succeeded());

    struct stat status = {};
    QCOMPARE(lstat(encoded.constData(), &status) == 0, stays);
    QVERIFY(QFile::exists(path(QStringLiteral("elsewhere/kept"))));
    if (lock >= 0)
        close(lock);
    if (S_ISDIR(status.st_mode))
        chmod((encoded + "/item/sub").constData(), 0700);
}

VEL_TEST_GUILESS_MAIN(tst_TreeCopy)
#include "tst_TreeCopy.moc"
