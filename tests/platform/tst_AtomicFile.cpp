// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FaultySystem.h"
#include "TestCase.h"

#include <AtomicFile.h>

#include <QDir>

#include <sys/stat.h>
#include <unistd.h>

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

private:
    QByteArray encoded(const QString &name) const { return QFile::encodeName(path(name)); }
};

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
    QVERIFY(target && AtomicFile::replace(*target, "abc"));
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
    const bool replaced = AtomicFile::replace(*target, "def");
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
    QVERIFY(!AtomicFile::replace(*target, "abc"));
    QVERIFY(QDir(path(QStringLiteral("sub"))).exists());
}

void tst_AtomicFile::leavesNothingBesideWhenItFails()
{
    const QString file = write(QStringLiteral("x"), "abc");
    const auto target = AtomicFile::find(QFile::encodeName(file));
    FaultySystem::failAt("rename", EXDEV);
    const bool replaced = AtomicFile::replace(*target, "def");
    FaultySystem::reset();
    QVERIFY(!replaced);
    QCOMPARE(read(file), QByteArray("abc"));
    QCOMPARE(QDir(folder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList{QStringLiteral("x")});
}

VEL_TEST_GUILESS_MAIN(tst_AtomicFile)

#include "tst_AtomicFile.moc"
