// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FaultySystem.h"
#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <functional>

using Steps = std::function<void(VelUIDesktopEntry &)>;
Q_DECLARE_METATYPE(Steps)

/// How a record's file is replaced: whole or not at all, with what others wrote meanwhile.
class tst_VelUIDesktopEntrySaving : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void leavesTheOldFileWholeWhenACallFails_data();
    void leavesTheOldFileWholeWhenACallFails();
    void failsWhenTheDiskIsFull();
    void failsInAFolderThatMayNotBeWritten();
    void failsOnAFileThatMayNotBeWritten();
    void failsWithoutAPlaceToSaveTo_data();
    void failsWithoutAPlaceToSaveTo();
    void failsWhenTheFileWouldBeTooLargeToRead();
    void doesNotReplaceAFileThatItCouldNotRead();
    void writesEverythingWhenWritesComeInPieces();

    void syncsAHiddenFileBesideTheTargetAndRenamesIt_data();
    void syncsAHiddenFileBesideTheTargetAndRenamesIt();
    void keepsThePermissions_data();
    void keepsThePermissions();
    void givesANewFileTheUsualPermissions();
    void keepsTheOwner();
    void writesThroughLinks();
    void writesThroughADanglingLink();

    void mergesIntoAFileThatChangedMeanwhile_data();
    void mergesIntoAFileThatChangedMeanwhile();
    void mergesIntoAFileThatChangedWithoutANewSizeOrTime();
    void writesAFileThatIsGoneWhole();
    void writesAFileThatWasEmptiedWhole();
    void createsAFileWhenThereIsNothingToWrite();
    void savesAgainAfterSaving();
    void savesThroughNoLinkThatAnotherUserPlanted();

private:
    QString m_file;
};

namespace {

const QByteArray Header = "[Desktop Entry]\n";

QStringList everything(const QString &folder)
{
    return QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot);
}

// Runs as somebody who may not write everywhere, in a process of its own.
bool asNobody(const std::function<bool()> &run)
{
    const pid_t child = ::fork();
    if (child == 0) {
        constexpr uid_t Nobody = 65534;
        const bool good = ::geteuid() != 0
            || (::setresgid(Nobody, Nobody, Nobody) == 0 && ::setresuid(Nobody, Nobody, Nobody) == 0);
        ::_exit(good && run() ? 0 : 1);
    }
    int status = 1;
    return ::waitpid(child, &status, 0) == child && WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

mode_t modeOf(const QString &path)
{
    struct stat status;
    return ::stat(qPrintable(path), &status) == 0 ? status.st_mode & 07777 : 0;
}

} // namespace

void tst_VelUIDesktopEntrySaving::init()
{
    TestCase::init();
    qputenv("LANG", "de_DE.UTF-8");
    m_file = write(QStringLiteral("x.desktop"), Header + "Name=A\n");
}

void tst_VelUIDesktopEntrySaving::leavesTheOldFileWholeWhenACallFails_data()
{
    QTest::addColumn<QByteArray>("call");
    QTest::addColumn<int>("error");
    QTest::newRow("no new file") << QByteArray("open") << EACCES;
    QTest::newRow("disk full") << QByteArray("write") << ENOSPC;
    QTest::newRow("permissions not kept") << QByteArray("fchmod") << EPERM;
    QTest::newRow("disk broken") << QByteArray("fsync") << EIO;
    QTest::newRow("no renaming") << QByteArray("rename") << EXDEV;
}

void tst_VelUIDesktopEntrySaving::leavesTheOldFileWholeWhenACallFails()
{
    QFETCH(QByteArray, call);
    QFETCH(int, error);
    // Permissions that a new file does not have by itself.
    QCOMPARE(::chmod(qPrintable(m_file), 0640), 0);
    VelUIDesktopEntry record(m_file);
    record.setName(QStringLiteral("B"));
    FaultySystem::failAt(call, error);
    const bool saved = record.save();
    FaultySystem::reset();
    QVERIFY(!saved);
    QCOMPARE(read(m_file), Header + "Name=A\n");
    QCOMPARE(everything(folder()), QStringList{QStringLiteral("x.desktop")});

    QCOMPARE(record.getName(), QStringLiteral("B"));
    QVERIFY(record.save());
    QCOMPARE(read(m_file), Header + "Name=B\n");
}

void tst_VelUIDesktopEntrySaving::failsWhenTheDiskIsFull()
{
    VelUIDesktopEntry record(m_file);
    record.setComment(QString(100000, QLatin1Char('x')));
    struct rlimit limit;
    QCOMPARE(::getrlimit(RLIMIT_FSIZE, &limit), 0);
    const auto previous = std::signal(SIGXFSZ, SIG_IGN);
    const struct rlimit small = {50000, limit.rlim_max};
    QCOMPARE(::setrlimit(RLIMIT_FSIZE, &small), 0);
    const bool saved = record.save();
    QCOMPARE(::setrlimit(RLIMIT_FSIZE, &limit), 0);
    std::signal(SIGXFSZ, previous);
    QVERIFY(!saved);
    QCOMPARE(read(m_file), Header + "Name=A\n");
    QCOMPARE(everything(folder()), QStringList{QStringLiteral("x.desktop")});
}

void tst_VelUIDesktopEntrySaving::failsInAFolderThatMayNotBeWritten()
{
    // Somebody else has to reach the folder.
    const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
    QVERIFY(outside.isValid());
    const QString file = outside.filePath(QStringLiteral("x.desktop"));
    QVERIFY(QFile::copy(m_file, file));
    QCOMPARE(::chmod(qPrintable(file), 0666), 0);
    QCOMPARE(::chmod(qPrintable(outside.path()), 0555), 0);
    QVERIFY(asNobody([&file] {
        VelUIDesktopEntry record(file);
        record.setName(QStringLiteral("B"));
        return record.getName() == QLatin1String("B") && !record.save();
    }));
    QCOMPARE(read(file), Header + "Name=A\n");
    QCOMPARE(everything(outside.path()), QStringList{QStringLiteral("x.desktop")});
    QCOMPARE(::chmod(qPrintable(outside.path()), 0755), 0);
}

void tst_VelUIDesktopEntrySaving::failsOnAFileThatMayNotBeWritten()
{
    const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
    QVERIFY(outside.isValid());
    QCOMPARE(::chmod(qPrintable(outside.path()), 0777), 0);
    const QString file = outside.filePath(QStringLiteral("x.desktop"));
    QVERIFY(QFile::copy(m_file, file));
    QCOMPARE(::chmod(qPrintable(file), 0444), 0);
    QVERIFY(asNobody([&file] {
        VelUIDesktopEntry record(file);
        record.setName(QStringLiteral("B"));
        return !record.save();
    }));
    QCOMPARE(read(file), Header + "Name=A\n");
    QCOMPARE(everything(outside.path()), QStringList{QStringLiteral("x.desktop")});
}

void tst_VelUIDesktopEntrySaving::failsWithoutAPlaceToSaveTo_data()
{
    QTest::addColumn<QString>("name");
    QTest::newRow("no path") << QString();
    QTest::newRow("missing folder") << QStringLiteral("missing/x.desktop");
    QTest::newRow("below a file") << QStringLiteral("x.desktop/y.desktop");
    QTest::newRow("a folder") << QStringLiteral("folder");
    QTest::newRow("a named pipe") << QStringLiteral("pipe");
    QTest::newRow("a link in a circle") << QStringLiteral("circle");
    QTest::newRow("a link into a missing folder") << QStringLiteral("lost");
    QTest::newRow("a name that is too long") << QString(300, QLatin1Char('x'));
}

void tst_VelUIDesktopEntrySaving::failsWithoutAPlaceToSaveTo()
{
    QFETCH(QString, name);
    QVERIFY(QDir().mkpath(path(QStringLiteral("folder"))));
    QCOMPARE(::mkfifo(qPrintable(path(QStringLiteral("pipe"))), 0600), 0);
    QVERIFY(QFile::link(QStringLiteral("circle"), path(QStringLiteral("circle"))));
    QVERIFY(QFile::link(QStringLiteral("missing/x"), path(QStringLiteral("lost"))));
    const QStringList before = everything(folder());
    VelUIDesktopEntry record;
    record.setName(QStringLiteral("B"));
    if (!name.isEmpty())
        record.setFilePath(path(name));
    QVERIFY(!record.save());
    QCOMPARE(everything(folder()), before);
    QCOMPARE(everything(path(QStringLiteral("folder"))), QStringList());

    VelUIDesktopEntry other(m_file);
    other.setFilePath(name.isEmpty() ? name : path(name));
    QVERIFY(!other.save());
    QCOMPARE(everything(folder()), before);
}

void tst_VelUIDesktopEntrySaving::failsWhenTheFileWouldBeTooLargeToRead()
{
    VelUIDesktopEntry record(m_file);
    record.setComment(QString(1024 * 1024, QLatin1Char('x')));
    QVERIFY(!record.save());
    QCOMPARE(read(m_file), Header + "Name=A\n");
}

void tst_VelUIDesktopEntrySaving::doesNotReplaceAFileThatItCouldNotRead()
{
    const QByteArray large = Header + QByteArray(1024 * 1024, '#');
    write(QStringLiteral("x.desktop"), large);
    VelUIDesktopEntry record(m_file);
    QVERIFY(!record.isValid());
    record.setName(QStringLiteral("B"));
    QVERIFY(!record.save());
    QVERIFY(read(m_file) == large);
}

void tst_VelUIDesktopEntrySaving::writesEverythingWhenWritesComeInPieces()
{
    VelUIDesktopEntry record(m_file);
    record.setName(QStringLiteral("B"));
    FaultySystem::writeInPieces();
    const bool saved = record.save();
    FaultySystem::reset();
    QVERIFY(saved);
    QCOMPARE(read(m_file), Header + "Name=B\n");
}

void tst_VelUIDesktopEntrySaving::syncsAHiddenFileBesideTheTargetAndRenamesIt_data()
{
    QTest::addColumn<uint>("mode");
    QTest::addColumn<QByteArrayList>("calls");
    QTest::newRow("usual permissions") << 0644U << QByteArrayList{"write", "fsync"};
    QTest::newRow("a group of its own") << 0640U << QByteArrayList{"write", "fchmod", "fsync"};
}

void tst_VelUIDesktopEntrySaving::syncsAHiddenFileBesideTheTargetAndRenamesIt()
{
    QFETCH(uint, mode);
    QFETCH(QByteArrayList, calls);
    QCOMPARE(::chmod(qPrintable(m_file), mode), 0);
    const mode_t previous = ::umask(022);
    VelUIDesktopEntry record(m_file);
    record.setName(QStringLiteral("B"));
    FaultySystem::reset();
    const bool saved = record.save();
    const QByteArrayList log = FaultySystem::log();
    ::umask(previous);
    QVERIFY(saved);
    QCOMPARE(log.size(), calls.size() + 2);
    QVERIFY2(log[0].startsWith("open " + QFile::encodeName(folder()) + "/."), log[0].constData());
    const QByteArray temporary = log[0].mid(5);
    QVERIFY2(!temporary.endsWith(".desktop") && !temporary.mid(folder().size() + 1).contains('/'),
             temporary.constData());
    calls.append("rename " + temporary + " " + QFile::encodeName(m_file));
    QCOMPARE(log.mid(1), calls);
    QCOMPARE(everything(folder()), QStringList{QStringLiteral("x.desktop")});
}

void tst_VelUIDesktopEntrySaving::keepsThePermissions_data()
{
    QTest::addColumn<uint>("mode");
    for (const uint mode : {0600U, 0640U, 0644U, 0666U, 0755U, 02750U})
        QTest::newRow(QByteArray::number(mode, 8).constData()) << mode;
}

void tst_VelUIDesktopEntrySaving::keepsThePermissions()
{
    QFETCH(uint, mode);
    QCOMPARE(::chmod(qPrintable(m_file), mode), 0);
    VelUIDesktopEntry record(m_file);
    record.setName(QStringLiteral("B"));
    QVERIFY(record.save());
    QCOMPARE(uint(modeOf(m_file)), mode);
    QCOMPARE(read(m_file), Header + "Name=B\n");
}

void tst_VelUIDesktopEntrySaving::givesANewFileTheUsualPermissions()
{
    const mode_t previous = ::umask(027);
    VelUIDesktopEntry record(path(QStringLiteral("new.desktop")));
    record.setName(QStringLiteral("B"));
    const bool saved = record.save();
    ::umask(previous);
    QVERIFY(saved);
    QCOMPARE(uint(modeOf(path(QStringLiteral("new.desktop")))), 0640U);
}

void tst_VelUIDesktopEntrySaving::keepsTheOwner()
{
    if (::geteuid() != 0)
        QSKIP("only root can give a file away");
    QCOMPARE(::chown(qPrintable(m_file), 65534, 65533), 0);
    VelUIDesktopEntry record(m_file);
    record.setName(QStringLiteral("B"));
    QVERIFY(record.save());
    struct stat status;
    QCOMPARE(::stat(qPrintable(m_file), &status), 0);
    QCOMPARE(uint(status.st_uid), 65534U);
    QCOMPARE(uint(status.st_gid), 65533U);
}

void tst_VelUIDesktopEntrySaving::writesThroughLinks()
{
    const QString real = write(QStringLiteral("sub/real"), Header + "Name=R\n");
    QVERIFY(QFile::link(QStringLiteral("sub/real"), path(QStringLiteral("relative"))));
    QVERIFY(QFile::link(path(QStringLiteral("relative")), path(QStringLiteral("sub/absolute"))));
    const QString chain = path(QStringLiteral("chain.desktop"));
    QVERIFY(QFile::link(QStringLiteral("sub/absolute"), chain));
    VelUIDesktopEntry record(chain);
    QCOMPARE(record.getName(), QStringLiteral("R"));
    record.setName(QStringLiteral("B"));
    QVERIFY(record.save());
    QCOMPARE(read(real), Header + "Name=B\n");
    QVERIFY(!QFileInfo(real).isSymLink());
    for (const char *link : {"relative", "sub/absolute", "chain.desktop"})
        QVERIFY(QFileInfo(path(QLatin1String(link))).isSymLink());
    QCOMPARE(everything(path(QStringLiteral("sub"))),
             (QStringList{QStringLiteral("absolute"), QStringLiteral("real")}));
}

void tst_VelUIDesktopEntrySaving::writesThroughADanglingLink()
{
    const QString link = path(QStringLiteral("link.desktop"));
    QVERIFY(QFile::link(QStringLiteral("later.desktop"), link));
    VelUIDesktopEntry record(link);
    record.setName(QStringLiteral("B"));
    QVERIFY(record.save());
    QVERIFY(QFileInfo(link).isSymLink());
    QCOMPARE(read(path(QStringLiteral("later.desktop"))), Header + "Name=B\n");
}

void tst_VelUIDesktopEntrySaving::mergesIntoAFileThatChangedMeanwhile_data()
{
    QTest::addColumn<QByteArray>("theirs");
    QTest::addColumn<Steps>("steps");
    QTest::addColumn<QByteArray>("merged");
    const auto row = [](const char *name, const QByteArray &theirs, const Steps &steps,
                        const QByteArray &merged) { QTest::newRow(name) << theirs << steps << merged; };
    const Steps name = [](auto &record) { record.setName(QStringLiteral("B")); };
    const Steps noName = [](auto &record) { record.setName({}); };
    const Steps local = [](auto &record) { record.setLocalName(QStringLiteral("L")); };
    const Steps action = [](auto &record) {
        VelUIDesktopAction added(QStringLiteral("b"));
        added.setName(QStringLiteral("B"));
        record.setActions(record.getActions() << added);
    };
    const Steps noAction = [](auto &record) { record.setActions({}); };

    row("their other keys stay", Header + "#new\nIcon=theirs\nName=A\n[X]\n", name,
        Header + "#new\nIcon=theirs\nName=B\n[X]\n");
    row("ours counts", Header + "Name=Theirs\n", name, Header + "Name=B\n");
    row("they removed what we changed", Header + "Icon=theirs\n", name, Header + "Icon=theirs\nName=B\n");
    row("they changed what we removed", Header + "Name=Theirs\nIcon=i\n", noName, Header + "Icon=i\n");
    row("they removed what we removed", Header + "Icon=i\n", noName, Header + "Icon=i\n");
    row("other language", Header + "Name=Theirs\nName[fr]=F\n", local,
        Header + "Name=Theirs\nName[fr]=F\nName[de]=L\n");
    row("their action stays",
        Header + "Actions=a;c;\n[Desktop Action a]\nName=A\n[Desktop Action c]\nName=C\n", action,
        Header
            + "Actions=a;b;\n[Desktop Action a]\nName=A\n[Desktop Action c]\nName=C\n\n[Desktop Action "
              "b]\nName=B\n");
    row("their change of an action we removed",
        Header + "Actions=a;\n[Desktop Action a]\nName=Theirs\nExec=e\n#x\n[X]\n", noAction,
        Header + "#x\n[X]\n");
}

void tst_VelUIDesktopEntrySaving::mergesIntoAFileThatChangedMeanwhile()
{
    QFETCH(QByteArray, theirs);
    QFETCH(Steps, steps);
    QFETCH(QByteArray, merged);
    write(QStringLiteral("x.desktop"), Header + "Name=A\nActions=a;\n[Desktop Action a]\nName=A\n");
    VelUIDesktopEntry record(m_file);
    steps(record);
    write(QStringLiteral("x.desktop"), theirs);
    QVERIFY(record.save());
    QCOMPARE(read(m_file), merged);
    QCOMPARE(record.getName(), VelUIDesktopEntry(m_file).getName());
    QCOMPARE(record.getIcon(), VelUIDesktopEntry(m_file).getIcon());
}

void tst_VelUIDesktopEntrySaving::mergesIntoAFileThatChangedWithoutANewSizeOrTime()
{
    struct stat status;
    VelUIDesktopEntry record(m_file);
    QCOMPARE(::stat(qPrintable(m_file), &status), 0);
    record.setIcon(QStringLiteral("i"));
    // Written in place right after, with the old times: only the change of the inode tells.
    write(QStringLiteral("x.desktop"), Header + "Name=Z\n");
    const timespec times[] = {status.st_atim, status.st_mtim};
    QCOMPARE(::utimensat(AT_FDCWD, qPrintable(m_file), times, 0), 0);
    QVERIFY(record.save());
    QCOMPARE(read(m_file), Header + "Name=Z\nIcon=i\n");
}

void tst_VelUIDesktopEntrySaving::writesAFileThatIsGoneWhole()
{
    const QByteArray bytes = "#c\n" + Header + "Name=A\nX=\xFF\n\n[O]\n";
    write(QStringLiteral("x.desktop"), bytes);
    VelUIDesktopEntry record(m_file);
    QVERIFY(QFile::remove(m_file));
    QVERIFY(record.save());
    QCOMPARE(read(m_file), bytes);
    record.setName(QStringLiteral("B"));
    QVERIFY(QFile::remove(m_file));
    QVERIFY(record.save());
    QCOMPARE(read(m_file), QByteArray(bytes).replace("=A", "=B"));
}

void tst_VelUIDesktopEntrySaving::writesAFileThatWasEmptiedWhole()
{
    const QByteArray bytes = "#c\n" + Header + "Name=A\nX=\xFF\n\n[O]\n";
    write(QStringLiteral("x.desktop"), bytes);
    VelUIDesktopEntry record(m_file);
    QCOMPARE(record.getName(), QStringLiteral("A"));
    write(QStringLiteral("x.desktop"), QByteArray());
    record.setName(QStringLiteral("B"));
    QVERIFY(record.save());
    QCOMPARE(read(m_file), QByteArray(bytes).replace("=A", "=B"));
}

void tst_VelUIDesktopEntrySaving::createsAFileWhenThereIsNothingToWrite()
{
    VelUIDesktopEntry record(path(QStringLiteral("new.desktop")));
    QVERIFY(record.save());
    QCOMPARE(read(path(QStringLiteral("new.desktop"))), Header);
}

void tst_VelUIDesktopEntrySaving::savesAgainAfterSaving()
{
    VelUIDesktopEntry record(m_file);
    record.setName(QStringLiteral("B"));
    QVERIFY(record.save());
    record.setIcon(QStringLiteral("i"));
    QVERIFY(record.save());
    QCOMPARE(read(m_file), Header + "Name=B\nIcon=i\n");
    write(QStringLiteral("x.desktop"), Header + "Name=C\n");
    record.setIcon(QStringLiteral("j"));
    QVERIFY(record.save());
    QCOMPARE(read(m_file), Header + "Name=C\nIcon=j\n");
    record.setName(QStringLiteral("C"));
    QVERIFY(record.save());
    QCOMPARE(read(m_file), Header + "Name=C\nIcon=j\n");
}

void tst_VelUIDesktopEntrySaving::savesThroughNoLinkThatAnotherUserPlanted()
{
    if (::geteuid() != 0)
        QSKIP("only root can make a link of another user's");
    const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
    QCOMPARE(::chmod(qPrintable(outside.path()), 01777), 0);
    const QString real = outside.filePath(QStringLiteral("real"));
    const QString link = outside.filePath(QStringLiteral("link.desktop"));
    QVERIFY(QFile::copy(m_file, real) && QFile::link(real, link));
    QCOMPARE(::chown(qPrintable(real), 65534, 65534), 0);
    QCOMPARE(::lchown(qPrintable(link), 12345, 12345), 0);
    QVERIFY(asNobody([&] {
        VelUIDesktopEntry record(real);
        record.setFilePath(link);
        record.setName(QStringLiteral("B"));
        return !record.save();
    }));
    QCOMPARE(read(real), Header + "Name=A\n");
    QCOMPARE(everything(outside.path()),
             (QStringList{QStringLiteral("link.desktop"), QStringLiteral("real")}));
}

VEL_TEST_GUILESS_MAIN(tst_VelUIDesktopEntrySaving)

#include "tst_VelUIDesktopEntrySaving.moc"
