// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Saves, moves, drops and default menus that are cut short: by a kill, a full disk or missing
// rights, or that two processes do at a time. VEL_TEST_FULL kills 1,000 times instead of 20; VEL_TEST_SEED
// repeats a run.

#include "FaultScene.h"
#include "OrdinaryUser.h"
#include "TestCase.h"

#include <QDir>
#include <QProcess>
#include <QRandomGenerator>
#include <QStorageInfo>

#include <unistd.h>

namespace {

bool isFull()
{
    return qEnvironmentVariableIsSet("VEL_TEST_FULL");
}

// A small file system of its own; needs the superuser.
class SmallDisk
{
public:
    SmallDisk(const QString &path, int kilobytes)
        : m_path(path)
    {
        QDir().mkpath(path);
        const QString options = QStringLiteral("size=%1k").arg(kilobytes);
        m_isMounted = geteuid() == 0
            && run(QStringLiteral("mount"),
                   {QStringLiteral("-t"), QStringLiteral("tmpfs"), QStringLiteral("-o"), options,
                    QStringLiteral("tmpfs"), path});
    }
    ~SmallDisk()
    {
        if (m_isMounted)
            run(QStringLiteral("umount"), {m_path});
    }
    Q_DISABLE_COPY(SmallDisk)

    bool isMounted() const { return m_isMounted; }
    bool setReadOnly(bool readOnly)
    {
        return run(QStringLiteral("mount"),
                   {QStringLiteral("-o"),
                    readOnly ? QStringLiteral("remount,ro") : QStringLiteral("remount,rw"), m_path});
    }

private:
    static bool run(const QString &program, const QStringList &arguments)
    {
        return QProcess::execute(program, arguments) == 0;
    }

    QString m_path;
    bool m_isMounted = false;
};

// Takes up so much of a disk that no more than so many bytes are left.
bool fillUp(const QString &path, qint64 left)
{
    QFile::remove(path);
    const qint64 free = QStorageInfo(QFileInfo(path).path()).bytesAvailable();
    QFile file(path);
    return file.open(QIODevice::WriteOnly)
        && (free <= left || file.write(QByteArray(int(free - left), 'f')) == free - left);
}

} // namespace

class tst_OperationFaults : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void losesNothingWhenItIsKilled_data();
    void losesNothingWhenItIsKilled();
    void losesNothingWhenTwoDoTheSame_data();
    void losesNothingWhenTwoDoTheSame();
    void losesNothingOnAFullDisk_data();
    void losesNothingOnAFullDisk();
    void changesNothingOnAReadOnlyDisk_data();
    void changesNothingOnAReadOnlyDisk();
    void changesNothingWithoutPermission_data();
    void changesNothingWithoutPermission();

private:
    QString kill(FaultScene *scene, const QString &name, const QString &other, int delay, int *done);

    // In memory where that is possible: another file system than folder(), and nothing there waits
    // for a disk.
    QTemporaryDir m_other{
        (QFileInfo(QStringLiteral("/dev/shm")).isWritable() ? QStringLiteral("/dev/shm") : QDir::tempPath())
        + QStringLiteral("/veltest-XXXXXX")};
};

void tst_OperationFaults::losesNothingWhenItIsKilled_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"save", "move", "drop", "menu", "undo"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

QString tst_OperationFaults::kill(FaultScene *scene, const QString &name, const QString &other, int delay,
                                  int *done)
{
    scene->build();
    QProcess child;
    child.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    child.start(QStringLiteral(VEL_FAULT_CHILD), {name, path(QStringLiteral("scene")), other});
    while (!child.canReadLine()) {
        if (!child.waitForReadyRead(60000))
            return QStringLiteral("the program does not begin");
    }
    usleep(useconds_t(delay));
    child.kill();
    child.waitForFinished();
    if (child.exitStatus() != QProcess::CrashExit)
        return QStringLiteral("an operation failed that nobody disturbed");
    *done += child.readAllStandardOutput().count("done");
    return scene->fault();
}

void tst_OperationFaults::losesNothingWhenItIsKilled()
{
    QFETCH(QString, name);
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : QRandomGenerator::global()->generate() & 0x7fffffff;
    QRandomGenerator random(seed);
    const QString here = path(QStringLiteral("scene"));
    const QString other = m_other.filePath(QStringLiteral("scene"));
    const auto scene = FaultScene::make(name, here, other);
    const int kills = isFull() ? 250 : 5;
    int done = 0;
    int cut = 0;
    for (int i = 0; i < kills; ++i) {
        const QString fault = kill(scene.get(), name, other, random.bounded(40000), &done);
        QVERIFY2(fault.isEmpty(),
                 qPrintable(QStringLiteral("kill %1 of seed %2: %3").arg(i).arg(seed).arg(fault)));
        cut += scene->strays().isEmpty() ? 0 : 1;
        // Each process looks for what is left but once in a while.
        QCOMPARE(
            QProcess::execute(QStringLiteral(VEL_FAULT_CHILD), {name, here, other, QStringLiteral("next")}),
            0);
        QCOMPARE(scene->fault(), QString());
        QCOMPARE(scene->strays(), QStringList());
    }
    qInfo("seed %u: %d kills after %d operations, %d left something beside, nothing lost", seed, kills, done,
          cut);
}

void tst_OperationFaults::losesNothingWhenTwoDoTheSame_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("operations");
    QTest::newRow("save") << "save" << 10;
    QTest::newRow("move") << "move" << 1;
    QTest::newRow("drop") << "drop" << 3;
    QTest::newRow("menu") << "menu" << 3;
}

void tst_OperationFaults::losesNothingWhenTwoDoTheSame()
{
    QFETCH(QString, name);
    QFETCH(int, operations);
    const QString here = m_other.filePath(QStringLiteral("scene"));
    const QString other = path(QStringLiteral("scene"));
    const auto scene = FaultScene::make(name, here, other);
    const int rounds = isFull() ? 100 : 2;
    int done = 0;
    for (int i = 0; i < rounds; ++i) {
        scene->build();
        QProcess children[2];
        for (QProcess &child : children) {
            child.setProcessChannelMode(QProcess::ForwardedErrorChannel);
            child.start(QStringLiteral(VEL_FAULT_CHILD), {name, here, other, QString::number(operations)});
        }
        for (QProcess &child : children) {
            QVERIFY(child.waitForFinished(60000));
            QCOMPARE(child.exitStatus(), QProcess::NormalExit);
            done += child.readAllStandardOutput().count("done");
        }
        QCOMPARE(scene->fault(), QString());
        QCOMPARE(scene->strays(), QStringList());
    }
    QVERIFY2(done >= rounds, "of two that do the same, one can");
    qInfo("%d rounds of two processes, %d operations, nothing lost", rounds, done);
}

void tst_OperationFaults::losesNothingOnAFullDisk_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("need");
    QTest::newRow("save") << "save" << 16 * 1024;
    QTest::newRow("move") << "move" << 1500 * 1024;
    QTest::newRow("drop") << "drop" << 400 * 1024;
    QTest::newRow("menu") << "menu" << 400 * 1024;
}

// From a disk without a single free block up to one that just has room.
void tst_OperationFaults::losesNothingOnAFullDisk()
{
    QFETCH(QString, name);
    QFETCH(int, need);
    const SmallDisk disk(path(QStringLiteral("small")), 4096);
    if (!disk.isMounted())
        QSKIP("only the superuser can mount a small disk, and not everywhere");
    const bool isMove = name == QLatin1String("move");
    const QString filler = path(QStringLiteral("small/filler"));
    const auto scene =
        FaultScene::make(name, path(isMove ? QStringLiteral("scene") : QStringLiteral("small/scene")),
                         path(QStringLiteral("small/other")));
    const int rounds = isFull() ? 100 : 10;
    int failed = 0;
    for (int i = 0; i <= rounds; ++i) {
        QFile::remove(filler);
        scene->build();
        QVERIFY(fillUp(filler, qint64(need) * i / rounds));
        const bool succeeded = scene->step(0);
        failed += succeeded ? 0 : 1;
        QVERIFY2(succeeded || i < rounds, "there was room enough");
        QCOMPARE(scene->fault(), QString());
        QCOMPARE(scene->strays(), QStringList());
    }
    QVERIFY(failed > 0);
    qInfo("%d operations on a full disk failed, nothing lost", failed);
}

void tst_OperationFaults::changesNothingOnAReadOnlyDisk_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("isTarget");
    for (const char *name : {"save", "move", "drop", "menu"})
        QTest::newRow(name) << QString::fromLatin1(name) << false;
    QTest::newRow("move to it") << QStringLiteral("move") << true;
}

void tst_OperationFaults::changesNothingOnAReadOnlyDisk()
{
    QFETCH(QString, name);
    QFETCH(bool, isTarget);
    SmallDisk disk(path(QStringLiteral("small")), 4096);
    if (!disk.isMounted())
        QSKIP("only the superuser can mount a small disk, and not everywhere");
    const QString here = path(QStringLiteral("scene"));
    const QString there = path(QStringLiteral("small/scene"));
    const auto scene = FaultScene::make(name, isTarget ? here : there, isTarget ? there : here);
    scene->build();
    const auto before = FaultScene::treeOf(folder());
    QVERIFY(disk.setReadOnly(true));

    QVERIFY(!scene->step(0));

    QCOMPARE(FaultScene::treeOf(folder()), before);
    QCOMPARE(scene->fault(), QString());
}

void tst_OperationFaults::changesNothingWithoutPermission_data()
{
    losesNothingWhenItIsKilled_data();
}

void tst_OperationFaults::changesNothingWithoutPermission()
{
    QFETCH(QString, name);
    const auto scene = FaultScene::make(name, path(QStringLiteral("scene")), path(QStringLiteral("other")));
    scene->build();
    const OrdinaryUser user(folder());
    const auto before = FaultScene::treeOf(folder());
    const QStringList paths = before.keys();
    const auto permit = [&](QFile::Permissions permissions) {
        for (const QString &item : paths) {
            if (QFileInfo(path(item)).isDir())
                QFile::setPermissions(path(item), permissions);
        }
    };
    permit(QFile::ReadOwner | QFile::ExeOwner);

    const bool succeeded = scene->step(0);

    permit(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    QVERIFY(!succeeded);
    QCOMPARE(FaultScene::treeOf(folder()), before);
}

VEL_TEST_GUILESS_MAIN(tst_OperationFaults)

#include "tst_OperationFaults.moc"
