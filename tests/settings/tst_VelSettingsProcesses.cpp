// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// What other processes and a failing disk do to a settings file, and what stays of it.

#include "TestCase.h"

#include <VelSettings.h>

#include <QDir>
#include <QProcess>

#include <memory>

#include <csignal>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

struct Result
{
    QByteArray output;
    QByteArray errors;
    int exitCode = -1;
};

std::unique_ptr<QProcess> startWriter(const QStringList &arguments)
{
    auto process = std::make_unique<QProcess>();
    process->start(QStringLiteral(SETTINGS_WRITER), arguments);
    if (!process->waitForStarted())
        QTest::qFail("settings_writer does not start", __FILE__, __LINE__);
    return process;
}

Result finish(QProcess &process)
{
    Result result;
    if (!process.waitForFinished() || process.exitStatus() != QProcess::NormalExit)
        QTest::qFail("settings_writer does not end well", __FILE__, __LINE__);
    result.output = process.readAllStandardOutput();
    result.errors = process.readAllStandardError();
    result.exitCode = process.exitCode();
    return result;
}

Result runWriter(const QStringList &arguments)
{
    return finish(*startWriter(arguments));
}

// Lets every user pass through the folders of the test, so that a process without the rights of
// root comes to its files.
void openFolders(const QString &folder)
{
    const QString root = VelTest::TestEnvironment::instance().root();
    const auto everyone =
        QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner | QFile::ReadOther | QFile::ExeOther;
    for (QString path = folder; path.startsWith(root); path = QFileInfo(path).path())
        QFile::setPermissions(path, everyone);
}

} // namespace

class tst_VelSettingsProcesses : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void keepsWhatAnotherProcessWroteBetweenReadingAndWriting();
    void keepsItsOwnChangeWhereBothChangedAKey();
    void takesOverWhatAnotherProcessWrote();
    void losesNoKeyWhenTwoProcessesWriteAtOnce();
    void leavesTheOldFileWholeWhenTheDiskIsFull();
    void leavesTheOldFileWholeInAReadOnlyFolder();
    void leavesAReadOnlyFileAlone();
    void reportsAFileThatItMayNotRead();
    void leavesAWholeFileWhenItIsKilled();
    void keepsALinkAndWritesItsTarget();
    void keepsTheModeOfTheFile();
};

void tst_VelSettingsProcesses::keepsWhatAnotherProcessWroteBetweenReadingAndWriting()
{
    const QString file = write(s("rc"), "[Main]\na=1\nb=2\n");
    VelSettings settings(file);
    settings.setValue(s("a"), 10);
    QCOMPARE(runWriter({file, s("b=theirs"), s("c=new")}).output, QByteArray("parsed\n"));
    settings.sync();
    QCOMPARE(read(file), QByteArray("[Main]\na=10\nb=theirs\nc=new\n"));
    QCOMPARE(settings.value(s("c")), QVariant(s("new")));
}

void tst_VelSettingsProcesses::keepsItsOwnChangeWhereBothChangedAKey()
{
    const QString file = write(s("rc"), "a=1\nb=2\n");
    VelSettings settings(file);
    settings.setValue(s("a"), s("ours"));
    settings.remove(s("b"));
    runWriter({file, s("a=theirs"), s("b=theirs")});
    settings.sync();
    QCOMPARE(read(file), QByteArray("a=ours\n"));
}

void tst_VelSettingsProcesses::takesOverWhatAnotherProcessWrote()
{
    const QString file = write(s("rc"), "a=1\n");
    VelSettings settings(file);
    runWriter({file, s("a=2"), s("b=3")});
    settings.sync();
    QCOMPARE(settings.value(s("a")), QVariant(2));
    QCOMPARE(settings.value(s("b")), QVariant(3));
}

void tst_VelSettingsProcesses::losesNoKeyWhenTwoProcessesWriteAtOnce()
{
    const QString file = write(s("rc"), "[Main]\nkept=1\n");
    const auto one = startWriter({file, s("count"), s("one"), s("100")});
    const auto two = startWriter({file, s("count"), s("two"), s("100")});
    finish(*one);
    finish(*two);
    VelSettings settings(file);
    QCOMPARE(settings.value(s("SectionName")), QVariant(s("Main")));
    QCOMPARE(settings.value(s("kept")), QVariant(1));
    for (int i = 0; i < 100; ++i) {
        QCOMPARE(settings.value(s("one") + QString::number(i)), QVariant(i));
        QCOMPARE(settings.value(s("two") + QString::number(i)), QVariant(i));
    }
}

void tst_VelSettingsProcesses::leavesTheOldFileWholeWhenTheDiskIsFull()
{
    const QByteArray bytes("# old\n[Main]\na=1\n");
    const QString file = write(s("rc"), bytes);
    // Room for the lock file, but not for the text.
    const Result result =
        runWriter({s("--limit"), s("4096"), file, s("b=") + QString(10000, QLatin1Char('x'))});
    QCOMPARE(result.output, QByteArray("parsed\n"));
    QCOMPARE(read(file), bytes);
    QCOMPARE(QDir(folder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList{s("rc")});
}

void tst_VelSettingsProcesses::leavesTheOldFileWholeInAReadOnlyFolder()
{
    const QByteArray bytes("# old\na=1\n");
    const QString file = write(s("sub/rc"), bytes);
    openFolders(folder());
    QFile::setPermissions(file, QFile::Permissions(0x6666));
    QFile::setPermissions(path(s("sub")),
                          QFile::ReadOwner | QFile::ExeOwner | QFile::ReadOther | QFile::ExeOther);
    const Result result = runWriter({s("--drop-root"), file, s("a=2"), s("sync"), s("b=3")});
    QFile::setPermissions(path(s("sub")), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    QCOMPARE(result.exitCode, 0);
    QCOMPARE(result.output, QByteArray("parsed\n"));
    QCOMPARE(read(file), bytes);
    QCOMPARE(QDir(path(s("sub"))).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList{s("rc")});
}

void tst_VelSettingsProcesses::leavesAReadOnlyFileAlone()
{
    const QByteArray bytes("# old\na=1\n");
    const QString file = write(s("rc"), bytes);
    openFolders(folder());
    QFile::setPermissions(file, QFile::ReadOwner | QFile::ReadOther);
    const Result result = runWriter({s("--drop-root"), file, s("a=2")});
    QCOMPARE(result.exitCode, 0);
    QCOMPARE(result.output, QByteArray("parsed\n"));
    QCOMPARE(read(file), bytes);
}

void tst_VelSettingsProcesses::reportsAFileThatItMayNotRead()
{
    const QString file = write(s("rc"), "a=1\n");
    openFolders(folder());
    QFile::setPermissions(file, QFile::Permissions());
    const Result result = runWriter({s("--drop-root"), file, s("a=2"), s("sync")});
    QCOMPARE(result.exitCode, 0);
    QCOMPARE(result.output, QByteArray("failed\n"));
    QCOMPARE(result.errors, "Permission Denied for '" + file.toLocal8Bit() + "'!\n");
    QFile::setPermissions(file, QFile::ReadOwner | QFile::WriteOwner);
    QCOMPARE(read(file), QByteArray("a=1\n"));
}

void tst_VelSettingsProcesses::leavesAWholeFileWhenItIsKilled()
{
    const QString file = write(s("rc"), "[Main]\nkept=1\nlength=0\n");
    for (int round = 0; round < 20; ++round) {
        const auto writer = startWriter({file, s("grow")});
        QVERIFY(writer->waitForReadyRead());
        // Somewhere in the writing, later each time.
        qint64 size = QFileInfo(file).size();
        for (int change = 0; change <= round; ++change) {
            const auto hasChanged = [&] { return QFileInfo(file).size() != size; };
            QVERIFY(QTest::qWaitFor(hasChanged));
            size = QFileInfo(file).size();
        }
        writer->kill();
        QVERIFY(writer->waitForFinished());
        // Qt waits half a minute for the owner of a lock that names none; that need not be seen here.
        const QString lock = file + s(".lock");
        if (QFileInfo(lock).size() == 0)
            QFile::remove(lock);

        VelSettings settings(file);
        QVERIFY(settings.isParsed());
        QCOMPARE(settings.value(s("SectionName")), QVariant(s("Main")));
        QCOMPARE(settings.value(s("kept")), QVariant(1));
        QCOMPARE(settings.value(s("text")).toString().size(), settings.value(s("length")).toInt());
        // Neither a lock nor a temporary file of the dead process stands in the way.
        settings.setValue(s("round"), round);
        settings.sync();
        QVERIFY(read(file).contains("round=" + QByteArray::number(round) + '\n'));
    }
}

void tst_VelSettingsProcesses::keepsALinkAndWritesItsTarget()
{
    const QString target = write(s("real/rc"), "a=1\n");
    const QString link = path(s("link"));
    QVERIFY(QFile::link(s("real/rc"), link));
    {
        VelSettings settings(link);
        QVERIFY(settings.isParsed());
        settings.setValue(s("a"), 2);
        settings.sync(true);
    }
    QVERIFY(QFileInfo(link).isSymLink());
    QCOMPARE(read(target), QByteArray("a=2\n"));
}

void tst_VelSettingsProcesses::keepsTheModeOfTheFile()
{
    const QString file = write(s("rc"), "a=1\n");
    const auto mode =
        QFile::ReadOwner | QFile::WriteOwner | QFile::ReadUser | QFile::WriteUser | QFile::ReadGroup;
    QVERIFY(QFile::setPermissions(file, mode));
    {
        VelSettings settings(file);
        settings.setValue(s("a"), 2);
    }
    QCOMPARE(read(file), QByteArray("a=2\n"));
    QCOMPARE(QFile::permissions(file), mode);
}

VEL_TEST_GUILESS_MAIN(tst_VelSettingsProcesses)

#include "tst_VelSettingsProcesses.moc"
