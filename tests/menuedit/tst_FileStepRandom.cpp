// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Random sequences of operations with undo and redo at random points, compared with what the disk was.
// VEL_TEST_ROUNDS sets how many sequences; VEL_TEST_SEED repeats a run.

#include "ExactTree.h"
#include "OtherFileSystem.h"
#include "TestCase.h"

#include <menuedit/FileProgress.h>
#include <menuedit/FileTransfer.h>
#include <menuedit/FolderOrder.h>
#include <menuedit/KeptThing.h>
#include <menuedit/ReplacedThings.h>
#include <menuedit/StepRecorder.h>

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QDirIterator>
#include <QRandomGenerator>
#include <QTemporaryDir>

#include <random>
#include <vector>

#include <sys/stat.h>
#include <unistd.h>

class tst_FileStepRandom : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void leavesEveryStateAsItWas();

private:
    static constexpr int Operations = 12;

    void sequence();
    void build();
    void operate();
    void operateWith(StepRecorder &recorder);
    void create(StepRecorder &recorder);
    void edit(StepRecorder &recorder);
    void reorder(StepRecorder &recorder);
    void remove(StepRecorder &recorder);
    void transfer(StepRecorder &recorder);
    void cross(StepRecorder &recorder);
    void replace(StepRecorder &recorder);
    void duplicate(StepRecorder &recorder);
    void undo();
    void redo();
    void meddle();
    void compare();
    void note(const QString &what) { m_log.append(what); }

    ExactTree state() const;
    void touch(const QString &path);
    QStringList all(const QString &top, bool foldersOnly) const;
    QString any(const QStringList &list) { return list.isEmpty() ? QString() : list.at(number(list.size())); }
    QString anyItem() { return any(all(menu(), false)); }
    QString anyFolder() { return any(all(menu(), true) + QStringList{menu()}); }
    int number(int below) { return std::uniform_int_distribution<int>(0, below - 1)(m_random); }
    bool chance(int percent) { return number(100) < percent; }
    QString fresh() { return QStringLiteral("new%1.desktop").arg(++m_counter); }
    QString menu() const { return m_disk->filePath(QStringLiteral("menu")); }
    QString elsewhere() const { return path(QStringLiteral("elsewhere")); }

    std::unique_ptr<QTemporaryDir> m_disk;
    QByteArray m_home;
    QByteArray m_dataHome;
    std::mt19937 m_random;
    std::vector<FileStep> m_steps;
    std::vector<ExactTree> m_states; // one more than steps
    std::size_t m_index = 0; // of the state
    QSet<ino_t> m_rewritten; // numbers of what is not to keep its number
    QStringList m_log;
    int m_counter = 0;
};

// The trash has to be where the menu is, and all of it in memory, where nothing waits for a disk.
void tst_FileStepRandom::initTestCase()
{
    const QString other = otherFileSystem(QDir::tempPath());
    m_disk = std::make_unique<QTemporaryDir>((other.isEmpty() ? QDir::tempPath() : other)
                                             + QStringLiteral("/tst_FileStepRandom-XXXXXX"));
    QVERIFY(m_disk->isValid());
    m_home = qgetenv("HOME");
    m_dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("HOME", QFile::encodeName(m_disk->path()));
    qputenv("XDG_DATA_HOME", QFile::encodeName(m_disk->filePath(QStringLiteral("data"))));
}

void tst_FileStepRandom::cleanupTestCase()
{
    qputenv("HOME", m_home);
    qputenv("XDG_DATA_HOME", m_dataHome);
    m_disk.reset();
}

ExactTree tst_FileStepRandom::state() const
{
    ExactTree tree = ExactTree::of(menu());
    tree.add(elsewhere());
    return tree;
}

QStringList tst_FileStepRandom::all(const QString &top, bool foldersOnly) const
{
    QStringList paths;
    QDirIterator it(top, QDir::AllEntries | QDir::System | QDir::NoDotAndDotDot,
                    QDirIterator::Subdirectories);
    while (it.hasNext()) {
        const QString path = it.next();
        if (!foldersOnly || (it.fileInfo().isDir() && !it.fileInfo().isSymLink()))
            paths.append(path);
    }
    paths.sort();
    return paths;
}

// What is at a path, and below, may come back under other numbers.
void tst_FileStepRandom::touch(const QString &path)
{
    const QMap<QByteArray, ino_t> numbers = ExactTree::of(path).numbers();
    for (const ino_t number : numbers)
        m_rewritten.insert(number);
}

void tst_FileStepRandom::build()
{
    for (const QString &top : {menu(), elsewhere(), m_disk->filePath(QStringLiteral("data"))})
        QDir(top).removeRecursively();
    QDir().mkpath(elsewhere());
    for (int i = 0; i < 25; ++i) {
        static const char *const folders[] = {"", "games/", "games/deep/", "office/", "tools/"};
        const QString folder = menu() + QLatin1Char('/') + QLatin1String(folders[i % 5]);
        QDir().mkpath(folder);
        if (i % 10 == 9) {
            QCOMPARE(symlink(i % 20 == 9 ? "../target" : "/usr", qPrintable(folder + fresh())), 0);
            continue;
        }
        QFile file(folder + (i < 5 && chance(60) ? QStringLiteral(".directory") : fresh()));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write("[Desktop Entry]\nType=Application\nName=" + QByteArray::number(i) + '\n');
        file.close();
        QCOMPARE(chmod(qPrintable(file.fileName()), chance(70) ? 0644 : 0600), 0);
    }
    m_steps.clear();
    m_states.clear();
    m_rewritten.clear();
    m_log.clear();
    m_index = 0;
    m_states.push_back(state());
}

void tst_FileStepRandom::create(StepRecorder &recorder)
{
    const bool isFolder = chance(40);
    const QString path = anyFolder() + QLatin1Char('/') + fresh();
    note(QLatin1String("new ") + path);
    recorder.mayMake(path);
    if (isFolder)
        QVERIFY(QDir().mkdir(path));
    VelUIDesktopEntry record(isFolder ? path + QStringLiteral("/.directory") : path);
    record.setName(path);
    QVERIFY(record.save());
}

void tst_FileStepRandom::edit(StepRecorder &recorder)
{
    const QString path = anyItem();
    const QFileInfo info(path);
    if (path.isEmpty() || info.isSymLink())
        return;
    const QString file = info.isDir() ? path + QStringLiteral("/.directory") : path;
    note(QLatin1String("edit ") + file);
    recorder.mayWrite(file);
    touch(file);
    VelUIDesktopEntry record(file);
    record.setComment(QString::number(number(1000)));
    QVERIFY(record.save());
    touch(file);
}

void tst_FileStepRandom::reorder(StepRecorder &recorder)
{
    const QString folder = anyFolder();
    note(QLatin1String("reorder ") + folder);
    recorder.mayWrite(folder + QStringLiteral("/.directory"));
    touch(folder + QStringLiteral("/.directory"));
    QVERIFY(FolderOrder::write(folder, {QStringLiteral("*"), fresh()}));
    touch(folder + QStringLiteral("/.directory"));
}

void tst_FileStepRandom::remove(StepRecorder &recorder)
{
    for (int count = 1 + number(3); count > 0; --count) {
        const QString path = anyItem();
        if (path.isEmpty() || (QFileInfo(path).isSymLink() && !QFileInfo::exists(path)))
            continue;
        note(QLatin1String("delete ") + path);
        std::unique_ptr<KeptThing> kept = KeptThing::inTrash(path);
        QVERIFY(kept);
        recorder.deleted(path, std::move(kept));
    }
}

void tst_FileStepRandom::transfer(StepRecorder &recorder)
{
    const bool isMove = chance(60);
    const QString folder = anyFolder();
    QStringList sources;
    for (int count = 1 + number(2); count > 0; --count) {
        const QString source = anyItem();
        const QString target = folder + QLatin1Char('/') + QFileInfo(source).fileName();
        if (source.isEmpty() || (!sources.isEmpty() && source.startsWith(sources.constFirst())))
            continue;
        sources.append(source);
        if (isMove)
            recorder.mayMove(source, target);
        else
            recorder.mayMake(target);
    }
    if (sources.isEmpty())
        return;
    note(
        QStringLiteral("transfer %1 to %2, move %3").arg(sources.join(QLatin1Char(' ')), folder).arg(isMove));
    for (const QString &source : qAsConst(sources)) {
        if (QFileInfo(source).isSymLink())
            touch(source);
    }
    recorder.mayWrite(folder + QStringLiteral("/.directory"));
    touch(folder + QStringLiteral("/.directory"));
    if (FileTransfer::transfer(sources, folder,
                               isMove ? FileTransfer::Action::Move : FileTransfer::Action::Copy)
            .succeeded()
        && chance(50))
        FolderOrder::write(folder, {QStringLiteral("*"), QFileInfo(sources.constFirst()).fileName()});
    touch(folder + QStringLiteral("/.directory"));
    for (const QString &source : qAsConst(sources)) {
        if (QFileInfo(folder + QLatin1Char('/') + QFileInfo(source).fileName()).isSymLink())
            touch(folder + QLatin1Char('/') + QFileInfo(source).fileName());
    }
}

// To the other file system and back.
void tst_FileStepRandom::cross(StepRecorder &recorder)
{
    const QDir::Filters filters = QDir::AllEntries | QDir::System | QDir::NoDotAndDotDot;
    const bool isBack = chance(50) && !QDir(elsewhere()).entryList(filters).isEmpty();
    const QString source =
        isBack ? elsewhere() + QLatin1Char('/') + any(QDir(elsewhere()).entryList(filters)) : anyItem();
    const QString folder = isBack ? anyFolder() : elsewhere();
    const QString target = folder + QLatin1Char('/') + QFileInfo(source).fileName();
    if (source.isEmpty())
        return;
    note(QStringLiteral("move %1 to %2").arg(source, target));
    recorder.mayMove(source, target);
    touch(source);
    FileTransfer::transfer({source}, folder, FileTransfer::Action::Move);
    touch(target);
}

// What makes room is put away; now and then it comes back, as nothing takes its place.
void tst_FileStepRandom::replace(StepRecorder &recorder)
{
    const QString source = anyItem();
    const QString target = anyItem();
    const auto isAtOrBelow = [](const QString &path, const QString &folder) {
        return path == folder || path.startsWith(folder + QLatin1Char('/'));
    };
    if (source.isEmpty() || isAtOrBelow(source, target) || isAtOrBelow(target, source))
        return;
    const bool isMove = chance(50);
    // A link that leads nowhere can be moved alone.
    if (!isMove && !QFileInfo::exists(source))
        return;
    note(QStringLiteral("replace %1 by %2, move %3").arg(target, source).arg(isMove));
    for (const QString &path : {source, target}) {
        if (QFileInfo(path).isSymLink())
            touch(path);
    }
    ReplacedThings replaced;
    QVERIFY(replaced.putAway(target));
    if (chance(20))
        return;
    if (isMove)
        recorder.mayMove(source, target);
    else
        recorder.mayMake(target);
    FileProgress nobody;
    const auto action = isMove ? FileTransfer::Action::Move : FileTransfer::Action::Copy;
    QVERIFY(FileTransfer::transfer({{source, target}}, action, nobody).succeeded());
    std::vector<ReplacedThings::Thing> things = replaced.take();
    for (ReplacedThings::Thing &thing : things)
        recorder.deleted(thing.path, std::move(thing.kept));
    if (QFileInfo(target).isSymLink())
        touch(target);
}

void tst_FileStepRandom::duplicate(StepRecorder &recorder)
{
    const QString source = anyItem();
    const QString target = source + QLatin1Char('-') + fresh();
    if (source.isEmpty())
        return;
    const QString record = QFileInfo(source).path() + QStringLiteral("/.directory");
    note(QStringLiteral("duplicate %1 as %2").arg(source, target));
    recorder.mayWrite(record);
    recorder.mayMake(target);
    touch(record);
    FileProgress nobody;
    if (FileTransfer::transfer({{source, target}}, FileTransfer::Action::Copy, nobody).succeeded())
        FolderOrder::write(QFileInfo(source).path(), {QStringLiteral("*"), QFileInfo(target).fileName()});
    touch(record);
}

void tst_FileStepRandom::operateWith(StepRecorder &recorder)
{
    const int what = number(100);
    if (what < 20)
        create(recorder);
    else if (what < 40)
        edit(recorder);
    else if (what < 50)
        reorder(recorder);
    else if (what < 65)
        remove(recorder);
    else if (what < 80)
        transfer(recorder);
    else if (what < 86)
        replace(recorder);
    else if (what < 92)
        duplicate(recorder);
    else
        cross(recorder);
}

void tst_FileStepRandom::operate()
{
    StepRecorder recorder;
    operateWith(recorder);
    FileStep step = recorder.finish();
    const ExactTree now = state();
    const QString change = m_states.at(m_index).difference(now, {"*"});
    if (step.isEmpty()) {
        QCOMPARE(change, QString());
        return;
    }
    QVERIFY(!change.isEmpty());
    m_steps.erase(m_steps.begin() + std::ptrdiff_t(m_index), m_steps.end());
    m_states.erase(m_states.begin() + std::ptrdiff_t(m_index) + 1, m_states.end());
    m_steps.push_back(std::move(step));
    m_states.push_back(now);
    ++m_index;
}

void tst_FileStepRandom::compare()
{
    const ExactTree &expected = m_states.at(m_index);
    const ExactTree found = state();
    QCOMPARE(expected.difference(found, {"*"}), QString());
    const QMap<QByteArray, ino_t> before = expected.numbers();
    const QMap<QByteArray, ino_t> now = found.numbers();
    for (auto it = before.begin(); it != before.end(); ++it) {
        if (m_rewritten.contains(*it))
            m_rewritten.insert(now.value(it.key()));
        QVERIFY2(now.value(it.key()) == *it || m_rewritten.contains(*it), it.key().constData());
    }
}

void tst_FileStepRandom::undo()
{
    if (m_index == 0)
        return;
    note(QStringLiteral("undo"));
    --m_index;
    QCOMPARE(m_steps.at(m_index).undo().reason, QString());
    compare();
}

void tst_FileStepRandom::redo()
{
    if (m_index == m_steps.size())
        return;
    note(QStringLiteral("redo"));
    QCOMPARE(m_steps.at(m_index).redo().reason, QString());
    ++m_index;
    compare();
}

// Somebody else renames or changes something; what is undone then is undone as a whole or not at all, and no
// content is lost.
void tst_FileStepRandom::meddle()
{
    const QString path = anyItem();
    if (path.isEmpty() || m_index == 0)
        return;
    note(QLatin1String("meddle with ") + path);
    const QFileInfo info(path);
    if (info.isSymLink() || chance(50)) {
        QVERIFY(QFile::rename(path, menu() + QLatin1Char('/') + fresh()));
    } else {
        QFile file(info.isDir() ? path + QLatin1Char('/') + fresh() : path);
        QVERIFY(file.open(QIODevice::Append) && file.write("theirs\n") == 7);
    }
    const ExactTree before = state();
    const auto contents = [this] {
        ExactTree everything = state();
        everything.add(m_disk->filePath(QStringLiteral("data/Trash/files")));
        return everything.contents();
    };
    const QSet<QByteArray> known = contents();
    const Refusal refusal = m_steps.at(m_index - 1).undo();
    note(QLatin1String("undo: ") + refusal.reason);
    if (refusal) {
        // A record that was written back meanwhile is another file.
        QCOMPARE(before.difference(state(), {"*"}), QString());
        return;
    }
    QSet<QByteArray> lost = known - contents();
    // Of an edit that was undone.
    if (lost.size() == 1)
        QVERIFY(!lost.cbegin()->contains("theirs"));
    QVERIFY(lost.size() <= 1);
}

void tst_FileStepRandom::sequence()
{
    build();
    for (int i = 0; i < Operations && !QTest::currentTestFailed(); ++i) {
        operate();
        for (int j = 0; j < 4 && !QTest::currentTestFailed() && chance(40); ++j) {
            if (chance(60))
                undo();
            else
                redo();
        }
    }
    while (m_index > 0 && !QTest::currentTestFailed())
        undo();
    while (m_index < m_steps.size() && !QTest::currentTestFailed())
        redo();
    if (!QTest::currentTestFailed())
        meddle();
}

void tst_FileStepRandom::leavesEveryStateAsItWas()
{
    const int wanted = qEnvironmentVariableIntValue("VEL_TEST_ROUNDS");
    const int rounds = wanted > 0 ? wanted : 200;
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : QRandomGenerator::global()->generate() & 0x7fffffff;
    qInfo("seed %u, %d sequences", seed, rounds);
    m_random.seed(seed);
    int steps = 0;
    for (int i = 0; i < rounds; ++i) {
        sequence();
        steps += int(m_steps.size());
        if (QTest::currentTestFailed()) {
            qInfo("sequence %d:\n%s", i, qPrintable(m_log.join(QLatin1Char('\n'))));
            return;
        }
    }
    qInfo("%d steps undone and done again", steps);
    QVERIFY(steps > rounds);
    m_steps.clear();
}

VEL_TEST_GUILESS_MAIN(tst_FileStepRandom)
#include "tst_FileStepRandom.moc"
