// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FaultySystem.h"
#include "OrdinaryUser.h"
#include "TestCase.h"

#include <AtomicFile.h>

#include <QDir>

#include <acl/libacl.h>
#include <fcntl.h>
#include <sys/acl.h>
#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <cerrno>
#include <ctime>

/// Files that are replaced whole or not at all.
class tst_AtomicFile : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void findsWhatStandsAtAPath();
    void findsWhereLinksLead();
    void findsNothingAtTheEndOfNoWay_data();
    void findsNothingAtTheEndOfNoWay();
    void writesANewFile();
    void neverLetsAnybodyReadMoreThanBefore_data();
    void neverLetsAnybodyReadMoreThanBefore();
    void replacesNoFolder();
    void leavesNothingBesideWhenItFails();
    void tellsWhetherTheTargetIsUnchanged();
    void keepsToItsFolderWhateverThatIsCalledMeanwhile();
    void writesInAFolderThatMayNotBeRead();

    void keepsAnAccessList();
    void keepsUserAttributesAndNoOthers();
    void takesNoAccessListFromTheFolder();
    void narrowsTheRightsWhereTheAccessListCannotBeKept();
    void lendsNobodyElseTheRightsOfTheOwner_data();
    void lendsNobodyElseTheRightsOfTheOwner();
    void followsNoLinkThatAnotherUserPlanted_data();
    void followsNoLinkThatAnotherUserPlanted();
    void removesWhatKilledReplacementsLeft_data();
    void removesWhatKilledReplacementsLeft();
    void looksForLeftoversOnceInEachFolder();

private:
    QByteArray encoded(const QString &name) const { return QFile::encodeName(path(name)); }
};

namespace {

constexpr uid_t Stranger = 12345;

bool replace(const AtomicFile::Target &target, std::string_view bytes)
{
    AtomicFile::Replacement replacement(target, bytes);
    return replacement.isReady() && replacement.commit();
}

uint modeOf(const QByteArray &path)
{
    struct stat status = {};
    return ::lstat(path.constData(), &status) == 0 ? status.st_mode & 07777 : 0;
}

bool setAccessList(const QByteArray &path, const char *text, acl_type_t type = ACL_TYPE_ACCESS)
{
    const acl_t list = ::acl_from_text(text);
    const bool done = list && ::acl_set_file(path.constData(), type, list) == 0;
    ::acl_free(list);
    return done;
}

QByteArray accessList(const QByteArray &path)
{
    const acl_t list = ::acl_get_file(path.constData(), ACL_TYPE_ACCESS);
    char *const text = ::acl_to_any_text(list, nullptr, ',', TEXT_NUMERIC_IDS | TEXT_ABBREVIATE);
    const QByteArray result(text);
    ::acl_free(text);
    ::acl_free(list);
    return result;
}

// Two hours ago.
bool makeOld(const QByteArray &path)
{
    const time_t old = ::time(nullptr) - 2 * 60 * 60;
    const timespec times[] = {{old, 0}, {old, 0}};
    return ::utimensat(AT_FDCWD, path.constData(), times, AT_SYMLINK_NOFOLLOW) == 0;
}

} // namespace

void tst_AtomicFile::findsWhatStandsAtAPath()
{
    write(QStringLiteral("x"), "abc");
    const auto there = AtomicFile::find(encoded(QStringLiteral("x")));
    QVERIFY(there && there->exists);
    QCOMPARE(there->status.st_size, off_t(3));
    const auto missing = AtomicFile::find(encoded(QStringLiteral("y")));
    QVERIFY(missing && !missing->exists);
    QCOMPARE(missing->path, encoded(QStringLiteral("y")));
}

void tst_AtomicFile::findsWhereLinksLead()
{
    write(QStringLiteral("sub/x"), "abc");
    QVERIFY(QFile::link(QStringLiteral("x"), path(QStringLiteral("sub/near"))));
    QVERIFY(QFile::link(path(QStringLiteral("sub/near")), path(QStringLiteral("far"))));
    const auto there = AtomicFile::find(encoded(QStringLiteral("far")));
    QVERIFY(there && there->exists);
    QCOMPARE(there->path, encoded(QStringLiteral("sub/x")));

    QVERIFY(QFile::link(QStringLiteral("sub/none"), path(QStringLiteral("dangling"))));
    const auto missing = AtomicFile::find(encoded(QStringLiteral("dangling")));
    QVERIFY(missing && !missing->exists);
    QCOMPARE(missing->path, encoded(QStringLiteral("sub/none")));
}

void tst_AtomicFile::findsNothingAtTheEndOfNoWay_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::newRow("links in a circle") << QByteArray("circle");
    QTest::newRow("a zero byte") << QByteArray("x\0y", 3);
    QTest::newRow("below a file") << QByteArray("x/y");
    QTest::newRow("a name that is too long") << QByteArray(300, 'x');
}

void tst_AtomicFile::findsNothingAtTheEndOfNoWay()
{
    QFETCH(QByteArray, name);
    write(QStringLiteral("x"), "abc");
    QVERIFY(QFile::link(QStringLiteral("circle"), path(QStringLiteral("circle"))));
    QVERIFY(!AtomicFile::find(QFile::encodeName(folder()) + '/' + name));
}

void tst_AtomicFile::writesANewFile()
{
    const auto target = AtomicFile::find(encoded(QStringLiteral("x")));
    QVERIFY(target && replace(*target, "abc"));
    QCOMPARE(read(path(QStringLiteral("x"))), QByteArray("abc"));
}

void tst_AtomicFile::neverLetsAnybodyReadMoreThanBefore_data()
{
    QTest::addColumn<uint>("mode");
    QTest::addColumn<uint>("first");
    QTest::newRow("for everybody") << 0644U << 0644U;
    QTest::newRow("for the owner") << 0600U << 0600U;
    QTest::newRow("for a group") << 0640U << 0600U;
    QTest::newRow("for a group to write") << 0664U << 0600U;
    QTest::newRow("for all but a group") << 0604U << 0600U;
}

void tst_AtomicFile::neverLetsAnybodyReadMoreThanBefore()
{
    QFETCH(uint, mode);
    QFETCH(uint, first);
    const QString file = write(QStringLiteral("x"), "abc");
    QCOMPARE(::chmod(qPrintable(file), mode), 0);
    const auto target = AtomicFile::find(QFile::encodeName(file));
    const mode_t previous = ::umask(0);
    FaultySystem::failAt("", 0);
    const bool replaced = replace(*target, "def");
    const QByteArrayList log = FaultySystem::log();
    FaultySystem::reset();
    ::umask(previous);
    QVERIFY(replaced);
    // With no mask, a file made with the right bits needs no other ones.
    QCOMPARE(log.contains("fchmod"), mode != first);
    struct stat status;
    QCOMPARE(::stat(qPrintable(file), &status), 0);
    QCOMPARE(uint(status.st_mode & 07777), mode);
}

void tst_AtomicFile::replacesNoFolder()
{
    QVERIFY(QDir().mkpath(path(QStringLiteral("sub"))));
    const auto target = AtomicFile::find(encoded(QStringLiteral("sub")));
    QVERIFY(target && target->exists);
    QVERIFY(!replace(*target, "abc"));
    QVERIFY(QDir(path(QStringLiteral("sub"))).exists());
}

void tst_AtomicFile::leavesNothingBesideWhenItFails()
{
    const QString file = write(QStringLiteral("x"), "abc");
    const auto target = AtomicFile::find(QFile::encodeName(file));
    FaultySystem::failAt("rename", EXDEV);
    const bool replaced = replace(*target, "def");
    FaultySystem::reset();
    QVERIFY(!replaced);
    QCOMPARE(read(file), QByteArray("abc"));
    QCOMPARE(QDir(folder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList{QStringLiteral("x")});
}

void tst_AtomicFile::tellsWhetherTheTargetIsUnchanged()
{
    const auto missing = AtomicFile::find(encoded(QStringLiteral("x")));
    QVERIFY(AtomicFile::isUnchanged(*missing));
    write(QStringLiteral("x"), "abc");
    QVERIFY(!AtomicFile::isUnchanged(*missing));
    const auto there = AtomicFile::find(encoded(QStringLiteral("x")));
    QVERIFY(AtomicFile::isUnchanged(*there));
    QVERIFY(replace(*there, "abc"));
    QVERIFY(!AtomicFile::isUnchanged(*there));
    QVERIFY(QFile::remove(path(QStringLiteral("x"))));
    QVERIFY(!AtomicFile::isUnchanged(*there));
}

void tst_AtomicFile::keepsToItsFolderWhateverThatIsCalledMeanwhile()
{
    write(QStringLiteral("sub/x"), "abc");
    write(QStringLiteral("sub/y"), "abc");
    const auto x = AtomicFile::find(encoded(QStringLiteral("sub/x")));
    const auto y = AtomicFile::find(encoded(QStringLiteral("sub/y")));
    {
        AtomicFile::Replacement replacement(*x, "def");
        const AtomicFile::Replacement dropped(*y, "def");
        QVERIFY(replacement.isReady() && dropped.isReady());
        QVERIFY(QDir().rename(path(QStringLiteral("sub")), path(QStringLiteral("other"))));
        write(QStringLiteral("sub/x"), "ghi");
        QVERIFY(AtomicFile::isUnchanged(*x));
        QVERIFY(replacement.commit());
    }
    QCOMPARE(read(path(QStringLiteral("sub/x"))), QByteArray("ghi"));
    QCOMPARE(read(path(QStringLiteral("other/x"))), QByteArray("def"));
    QCOMPARE(QDir(path(QStringLiteral("other"))).entryList(QDir::Files | QDir::Hidden),
             QStringList({QStringLiteral("x"), QStringLiteral("y")}));
}

void tst_AtomicFile::writesInAFolderThatMayNotBeRead()
{
    const OrdinaryUser user(folder());
    const QString file = write(QStringLiteral("sub/x"), "abc");
    const QByteArray sub = encoded(QStringLiteral("sub"));
    QCOMPARE(::chmod(sub.constData(), 0300), 0);
    const bool replaced = replace(*AtomicFile::find(QFile::encodeName(file)), "def");
    QCOMPARE(::chmod(sub.constData(), 0700), 0);
    QVERIFY(replaced);
    QCOMPARE(read(file), QByteArray("def"));
}

void tst_AtomicFile::keepsAnAccessList()
{
    const QByteArray file = QFile::encodeName(write(QStringLiteral("x"), "abc"));
    const QByteArray list = "u::rw-,u:12345:---,g::r--,g:12346:rw-,m::rw-,o::r--";
    if (!setAccessList(file, list.constData()))
        QSKIP("there are no access lists here");
    QCOMPARE(accessList(file), list);
    QVERIFY(replace(*AtomicFile::find(file), "def"));
    QCOMPARE(read(path(QStringLiteral("x"))), QByteArray("def"));
    QCOMPARE(accessList(file), list);
    QCOMPARE(modeOf(file), 0664U);
}

void tst_AtomicFile::keepsUserAttributesAndNoOthers()
{
    const QByteArray file = QFile::encodeName(write(QStringLiteral("x"), "abc"));
    if (::setxattr(file.constData(), "user.note", "mine", 4, 0) != 0)
        QSKIP("there are no attributes here");
    // The right to listen at low ports, for a program that was checked; only root may give it.
    const unsigned char capability[20] = {0, 0, 0, 2, 0, 4};
    const bool hasCapability =
        ::setxattr(file.constData(), "security.capability", capability, sizeof capability, 0) == 0;
    QVERIFY(hasCapability || ::geteuid() != 0);
    QVERIFY(replace(*AtomicFile::find(file), "def"));
    char value[8];
    QCOMPARE(::getxattr(file.constData(), "user.note", value, sizeof value), ssize_t(4));
    QCOMPARE(QByteArray(value, 4), QByteArray("mine"));
    QCOMPARE(::getxattr(file.constData(), "security.capability", nullptr, 0), ssize_t(-1));
}

void tst_AtomicFile::takesNoAccessListFromTheFolder()
{
    const QByteArray file = QFile::encodeName(write(QStringLiteral("x"), "abc"));
    QCOMPARE(::chmod(file.constData(), 0664), 0);
    if (!setAccessList(QFile::encodeName(folder()), "u::rwx,u:12345:rwx,g::rwx,m::rwx,o::---",
                       ACL_TYPE_DEFAULT))
        QSKIP("there are no access lists here");
    QVERIFY(replace(*AtomicFile::find(file), "def"));
    QCOMPARE(accessList(file), QByteArray("u::rw-,g::rw-,o::r--"));
}

void tst_AtomicFile::narrowsTheRightsWhereTheAccessListCannotBeKept()
{
    const QByteArray file = QFile::encodeName(write(QStringLiteral("x"), "abc"));
    if (!setAccessList(file, "u::rw-,u:12345:r--,g::r--,m::rw-,o::rw-"))
        QSKIP("there are no access lists here");
    FaultySystem::failAt("fsetxattr", ENOTSUP);
    const bool replaced = replace(*AtomicFile::find(file), "def");
    FaultySystem::reset();
    QVERIFY(replaced);
    QCOMPARE(modeOf(file), 0644U);
}

void tst_AtomicFile::lendsNobodyElseTheRightsOfTheOwner_data()
{
    QTest::addColumn<uint>("old");
    QTest::addColumn<uint>("replaced");
    QTest::newRow("set-user-id") << 04777U << 0777U;
    QTest::newRow("set-group-id") << 02777U << 0777U;
    QTest::newRow("all three") << 07777U << 0777U;
    QTest::newRow("rights of another group") << 0676U << 0666U;
    QTest::newRow("another group may less") << 0646U << 0644U;
}

void tst_AtomicFile::lendsNobodyElseTheRightsOfTheOwner()
{
    QFETCH(uint, old);
    QFETCH(uint, replaced);
    if (::geteuid() != 0)
        QSKIP("only root can make a file of another user's");
    const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
    QCOMPARE(::chmod(qPrintable(outside.path()), 0777), 0);
    const QByteArray file = QFile::encodeName(outside.filePath(QStringLiteral("x")));
    QVERIFY(QFile::copy(write(QStringLiteral("x"), "abc"), QFile::decodeName(file)));
    QCOMPARE(::chown(file.constData(), Stranger, Stranger), 0);
    QCOMPARE(::chmod(file.constData(), old), 0);
    {
        const OrdinaryUser user(folder());
        QVERIFY(replace(*AtomicFile::find(file), "def"));
    }
    QCOMPARE(read(QFile::decodeName(file)), QByteArray("def"));
    QCOMPARE(QString::number(modeOf(file), 8), QString::number(replaced, 8));
}

void tst_AtomicFile::followsNoLinkThatAnotherUserPlanted_data()
{
    QTest::addColumn<uint>("folderMode");
    QTest::addColumn<uint>("linkOwner");
    QTest::addColumn<bool>("isFollowed");
    constexpr uint Nobody = 65534;
    QTest::newRow("planted") << 01777U << uint(Stranger) << false;
    QTest::newRow("the user's own") << 01777U << Nobody << true;
    QTest::newRow("of the folder's owner") << 01777U << 0U << true;
    QTest::newRow("not sticky") << 0777U << uint(Stranger) << true;
    QTest::newRow("not for all") << 01755U << uint(Stranger) << true;
}

void tst_AtomicFile::followsNoLinkThatAnotherUserPlanted()
{
    QFETCH(uint, folderMode);
    QFETCH(uint, linkOwner);
    QFETCH(bool, isFollowed);
    if (::geteuid() != 0)
        QSKIP("only root can make a link of another user's");
    const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
    QCOMPARE(::chmod(qPrintable(outside.path()), folderMode), 0);
    const QString file = write(QStringLiteral("x"), "abc");
    const QByteArray link = QFile::encodeName(outside.filePath(QStringLiteral("link")));
    QVERIFY(QFile::link(file, QFile::decodeName(link)));
    QCOMPARE(::lchown(link.constData(), linkOwner, linkOwner), 0);
    // A link of the user's own that leads to it.
    QVERIFY(QFile::link(QFile::decodeName(link), path(QStringLiteral("own"))));
    const OrdinaryUser user(folder());
    for (const QByteArray &way : {link, encoded(QStringLiteral("own"))}) {
        const auto target = AtomicFile::find(way);
        QCOMPARE(target.has_value(), isFollowed);
        if (target)
            QCOMPARE(target->path, QFile::encodeName(file));
    }
}

void tst_AtomicFile::removesWhatKilledReplacementsLeft_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("kind");
    QTest::addColumn<bool>("stays");
    const auto row = [](const char *title, const char *name, const char *kind, bool stays) {
        QTest::newRow(title) << QString::fromLatin1(name) << QString::fromLatin1(kind) << stays;
    };
    row("old", ".velentry-1a2b3c", "old file", false);
    row("shortest name", ".velentry-0", "old file", false);
    row("longest name", ".velentry-1z141z3", "old file", false);
    row("young", ".velentry-1a2b3c", "young file", true);
    row("of another user", ".velentry-1a2b3c", "strange file", true);
    row("folder", ".velentry-1a2b3c", "old folder", true);
    row("link", ".velentry-1a2b3c", "old link", true);
    row("no number", ".velentry-", "old file", true);
    row("too long", ".velentry-1a2b3c4d", "old file", true);
    row("other letters", ".velentry-ABC", "old file", true);
    row("with a suffix", ".velentry-abc.desktop", "old file", true);
    row("without a dot", "velentry-abc", "old file", true);
}

void tst_AtomicFile::removesWhatKilledReplacementsLeft()
{
    QFETCH(QString, name);
    QFETCH(QString, kind);
    QFETCH(bool, stays);
    const QByteArray left = encoded(name);
    if (kind == QLatin1String("old folder"))
        QVERIFY(QDir().mkpath(path(name)));
    else if (kind == QLatin1String("old link"))
        QVERIFY(QFile::link(QStringLiteral("nowhere"), path(name)));
    else
        write(name, "abc");
    QVERIFY(kind == QLatin1String("young file") || makeOld(left));
    if (kind == QLatin1String("strange file") && ::chown(left.constData(), Stranger, Stranger) != 0)
        QSKIP("only root can make a file of another user's");
    QVERIFY(replace(*AtomicFile::find(encoded(QStringLiteral("x"))), "abc"));
    struct stat status;
    QCOMPARE(::lstat(left.constData(), &status) == 0, stays);
    QCOMPARE(read(path(QStringLiteral("x"))), QByteArray("abc"));
}

void tst_AtomicFile::looksForLeftoversOnceInEachFolder()
{
    QVERIFY(replace(*AtomicFile::find(encoded(QStringLiteral("x"))), "abc"));
    const QString left = write(QStringLiteral(".velentry-abc"), "abc");
    QVERIFY(makeOld(QFile::encodeName(left)));
    QVERIFY(replace(*AtomicFile::find(encoded(QStringLiteral("x"))), "def"));
    QVERIFY(QFile::exists(left));
}

VEL_TEST_GUILESS_MAIN(tst_AtomicFile)

#include "tst_AtomicFile.moc"
