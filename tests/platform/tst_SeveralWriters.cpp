// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <EntryDocument.h>

#include <velcore/folderlock.h>
#include <velintegration/desktopitems.h>

#include <QDir>
#include <QElapsedTimer>

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <functional>

/// Programs that save to one file at a time.
class tst_SeveralWriters : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void losesNoKeyOfARecord_data();
    void losesNoKeyOfARecord();
    void losesNoKeyOfAFileThatNoneHasMadeYet();
    void losesNeitherTheOrderNorTheKeysOfAFolder();
    void losesNoDesktopItem_data();
    void losesNoDesktopItem();
    void goesOnWithoutALockThatIsHeldForGood_data();
    void goesOnWithoutALockThatIsHeldForGood();
    void waitsAsLongAsOthersGetOn();
    void waitsAgainWhenAnotherWasFaster_data();
    void waitsAgainWhenAnotherWasFaster();
    void readsWhateverIsLocked();
    void isFreeAgainWhenTheHolderIsKilled();
    void holdsNoLockOnAFolderThatIsNone();
};

namespace {

// VEL_TEST_ROUNDS sets another number: where all is slow, a lock is waited for in vain now and then.
const int Saves =
    qEnvironmentVariableIsSet("VEL_TEST_ROUNDS") ? qEnvironmentVariableIntValue("VEL_TEST_ROUNDS") : 300;
constexpr const char *Main = "Desktop Entry";

using Work = std::function<bool(int writer)>;

// Runs the work in so many processes at a time; whether all of them succeeded.
bool runInProcesses(int count, const Work &work)
{
    std::vector<pid_t> children;
    for (int i = 0; i < count; ++i) {
        const pid_t child = ::fork();
        if (child == 0)
            ::_exit(work(i) ? 0 : 1);
        children.push_back(child);
    }
    bool good = true;
    for (const pid_t child : children) {
        int status = 1;
        good = child > 0 && ::waitpid(child, &status, 0) == child && status == 0 && good;
    }
    return good;
}

std::string keyOf(int writer, int save)
{
    return "X-" + std::to_string(writer) + "-" + std::to_string(save);
}

bool setKey(const QByteArray &path, const std::string &key, const QString &value)
{
    EntryDocument document;
    document.setPath(path);
    document.load();
    document.setText(Main, key, value);
    return document.save();
}

int missingKeys(const QByteArray &path, int writers)
{
    EntryDocument document;
    document.setPath(path);
    document.load();
    int missing = 0;
    for (int writer = 0; writer < writers; ++writer) {
        for (int save = 0; save < Saves; ++save)
            missing += document.text(Main, keyOf(writer, save)) == QString::number(save) ? 0 : 1;
    }
    return missing;
}

// A process that holds the lock on a folder for three times as long as others wait for one that does not get
// on, and does something every millisecond.
class BusyHolder
{
public:
    BusyHolder(const QString &folder, const std::function<void(int turn)> &work)
    {
        int answers[2];
        if (::pipe(answers) != 0)
            return;
        m_child = ::fork();
        if (m_child == 0)
            run(folder, work, answers[1]);
        ::close(answers[1]);
        m_answers = answers[0];
        int turn = -1;
        m_isHeld = ::read(m_answers, &turn, sizeof turn) == sizeof turn;
    }
    ~BusyHolder()
    {
        if (m_child <= 0)
            return;
        ::kill(m_child, SIGKILL);
        ::waitpid(m_child, nullptr, 0);
        ::close(m_answers);
    }
    Q_DISABLE_COPY(BusyHolder)

    bool isHeld() const { return m_isHeld; }
    /// Waits for its end; how often it did something.
    int turns() const
    {
        int turns = -1;
        return ::read(m_answers, &turns, sizeof turns) == sizeof turns ? turns : -1;
    }

private:
    [[noreturn]] static void run(const QString &folder, const std::function<void(int turn)> &work,
                                 int answers)
    {
        const Vel::FolderLock lock(QFile::encodeName(folder).toStdString());
        QElapsedTimer timer;
        timer.start();
        int turn = 0;
        bool good = lock.isHeld() && ::write(answers, &turn, sizeof turn) == sizeof turn;
        for (; good && !timer.hasExpired(3000); ++turn) {
            work(turn);
            ::usleep(1000);
        }
        good = good && ::write(answers, &turn, sizeof turn) == sizeof turn;
        ::_exit(good ? 0 : 1);
    }

    pid_t m_child = -1;
    int m_answers = -1;
    bool m_isHeld = false;
};

void append(const QByteArray &path, const QByteArray &line)
{
    const int file = ::open(path.constData(), O_WRONLY | O_APPEND | O_CLOEXEC);
    if (file < 0 || ::write(file, line.constData(), std::size_t(line.size())) != line.size())
        ::_exit(1);
    ::close(file);
}

// A process that holds the lock on a folder until it is killed.
class Holder
{
public:
    explicit Holder(const QString &folder)
    {
        int ready[2];
        if (::pipe(ready) != 0)
            return;
        m_child = ::fork();
        if (m_child == 0) {
            const Vel::FolderLock lock(QFile::encodeName(folder).toStdString());
            const char answer = lock.isHeld() ? 'y' : 'n';
            if (::write(ready[1], &answer, 1) == 1)
                ::pause();
            ::_exit(0);
        }
        char answer = 'n';
        m_isHeld = ::read(ready[0], &answer, 1) == 1 && answer == 'y';
        ::close(ready[0]);
        ::close(ready[1]);
    }
    ~Holder() { end(); }
    Q_DISABLE_COPY(Holder)

    bool isHeld() const { return m_isHeld; }
    void end()
    {
        if (m_child <= 0)
            return;
        ::kill(m_child, SIGKILL);
        ::waitpid(m_child, nullptr, 0);
        m_child = -1;
    }

private:
    pid_t m_child = -1;
    bool m_isHeld = false;
};

} // namespace

void tst_SeveralWriters::losesNoKeyOfARecord_data()
{
    QTest::addColumn<int>("writers");
    QTest::newRow("two") << 2;
    QTest::newRow("four") << 4;
}

void tst_SeveralWriters::losesNoKeyOfARecord()
{
    QFETCH(int, writers);
    const QByteArray file =
        QFile::encodeName(write(QStringLiteral("x.desktop"), "[Desktop Entry]\nName=A\n"));
    QVERIFY(runInProcesses(writers, [&file](int writer) {
        bool saved = true;
        for (int i = 0; i < Saves; ++i)
            saved = setKey(file, keyOf(writer, i), QString::number(i)) && saved;
        return saved;
    }));
    QCOMPARE(missingKeys(file, writers), 0);
    QCOMPARE(QDir(folder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList{QStringLiteral("x.desktop")});
}

void tst_SeveralWriters::losesNoKeyOfAFileThatNoneHasMadeYet()
{
    for (int i = 0; i < 20; ++i) {
        const QByteArray file = QFile::encodeName(path(QStringLiteral("%1.desktop").arg(i)));
        QVERIFY(runInProcesses(
            4, [&file](int writer) { return setKey(file, keyOf(writer, 0), QString::number(0)); }));
        EntryDocument document;
        document.setPath(file);
        QVERIFY(document.load());
        for (int writer = 0; writer < 4; ++writer)
            QVERIFY(document.has(Main, keyOf(writer, 0)));
    }
}

void tst_SeveralWriters::losesNeitherTheOrderNorTheKeysOfAFolder()
{
    const QByteArray file =
        QFile::encodeName(write(QStringLiteral(".directory"), "[Desktop Entry]\nName=A\n"));
    QVERIFY(runInProcesses(3, [&file](int writer) {
        bool saved = true;
        for (int i = 0; i < Saves; ++i) {
            if (writer > 0) {
                saved = setKey(file, keyOf(writer, i), QString::number(i)) && saved;
                continue;
            }
            // What a menu editor does with a new item: one more at the end of the order.
            EntryDocument document;
            document.setPath(file);
            document.load();
            QStringList order = document.list(Main, "SortOrder");
            saved = order.size() == i && saved;
            document.setList(Main, "SortOrder", order << QString::number(i));
            saved = document.save() && saved;
        }
        return saved;
    }));
    EntryDocument document;
    document.setPath(file);
    QVERIFY(document.load());
    QCOMPARE(document.list(Main, "SortOrder").size(), int(Saves));
    for (int i = 0; i < Saves; ++i)
        QVERIFY(document.has(Main, keyOf(1, i)) && document.has(Main, keyOf(2, i)));
}

void tst_SeveralWriters::losesNoDesktopItem_data()
{
    losesNoKeyOfARecord_data();
}

void tst_SeveralWriters::losesNoDesktopItem()
{
    QFETCH(int, writers);
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    QVERIFY(runInProcesses(writers, [](int writer) {
        bool saved = true;
        for (int i = 0; i < Saves; ++i)
            saved = SaveDesktopItemPosition(keyOf(writer, i).c_str(), writer, i) && saved;
        return saved;
    }));
    QCOMPARE(read(path(QStringLiteral("desktopitems"))).count('\n'), writers * Saves);
}

void tst_SeveralWriters::goesOnWithoutALockThatIsHeldForGood_data()
{
    QTest::addColumn<bool>("isRecord");
    QTest::newRow("a record") << true;
    QTest::newRow("a desktop item") << false;
}

void tst_SeveralWriters::goesOnWithoutALockThatIsHeldForGood()
{
    QFETCH(bool, isRecord);
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    const QByteArray file =
        QFile::encodeName(write(QStringLiteral("x.desktop"), "[Desktop Entry]\nName=A\n"));
    const Holder holder(folder());
    QVERIFY(holder.isHeld());
    QElapsedTimer timer;
    timer.start();
    QVERIFY(isRecord ? setKey(file, "Icon", QStringLiteral("i")) : SaveDesktopItemPosition("a", 1, 2));
    QVERIFY2(timer.elapsed() >= 900, "it did not wait");
    QVERIFY2(timer.elapsed() < 3000, "it waited for too long");
    QCOMPARE(read(path(QStringLiteral("x.desktop"))).contains("Icon=i\n"), isRecord);
    QCOMPARE(QFile::exists(path(QStringLiteral("desktopitems"))), !isRecord);
}

// A long queue, as one that waits sees it: the lock is always held, and files are replaced.
void tst_SeveralWriters::waitsAsLongAsOthersGetOn()
{
    const QByteArray file = QFile::encodeName(path(QStringLiteral("x")));
    const BusyHolder queue(folder(), [&file](int turn) {
        if (turn % 2 == 0)
            ::close(::open(file.constData(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600));
        else
            ::unlink(file.constData());
    });
    QVERIFY(queue.isHeld());
    QVERIFY(Vel::FolderLock(QFile::encodeName(folder()).toStdString()).isHeld());
    QVERIFY(queue.turns() > 0);
}

void tst_SeveralWriters::waitsAgainWhenAnotherWasFaster_data()
{
    goesOnWithoutALockThatIsHeldForGood_data();
}

// The file changes in its place, and the folder does not.
void tst_SeveralWriters::waitsAgainWhenAnotherWasFaster()
{
    QFETCH(bool, isRecord);
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    const QByteArray file =
        QFile::encodeName(isRecord ? write(QStringLiteral("x.desktop"), "[Desktop Entry]\nName=A\n")
                                   : write(QStringLiteral("desktopitems"), "0 0 a\n"));
    const BusyHolder other(folder(), [&](int turn) {
        for (int i = turn * 5; i < turn * 5 + 5; ++i)
            append(file,
                   isRecord ? "X-0-" + QByteArray::number(i) + "=1\n"
                            : "0 0 " + QByteArray::number(i) + '\n');
    });
    QVERIFY(other.isHeld());
    QVERIFY(isRecord ? setKey(file, "Icon", QStringLiteral("i")) : SaveDesktopItemPosition("b", 1, 2));
    const int lines = other.turns() * 5;
    const QByteArray text = read(QFile::decodeName(file));
    QVERIFY(text.contains(isRecord ? "Icon=i\n" : "1 2 b\n"));
    QCOMPARE(text.count(isRecord ? "\nX-0-" : "\n0 0 "), lines);
}

void tst_SeveralWriters::readsWhateverIsLocked()
{
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    const QByteArray file =
        QFile::encodeName(write(QStringLiteral("x.desktop"), "[Desktop Entry]\nName=A\n"));
    write(QStringLiteral("desktopitems"), "1 2 a\n");
    const Holder holder(folder());
    QVERIFY(holder.isHeld());
    QElapsedTimer timer;
    timer.start();
    EntryDocument document;
    document.setPath(file);
    QVERIFY(document.load());
    QVERIFY(document.save()); // without a change
    QVERIFY(ReadDesktopItemPosition("a", nullptr, nullptr));
    QVERIFY(timer.elapsed() < 800);
}

void tst_SeveralWriters::isFreeAgainWhenTheHolderIsKilled()
{
    Holder holder(folder());
    QVERIFY(holder.isHeld());
    holder.end();
    QVERIFY(Vel::FolderLock(QFile::encodeName(folder()).toStdString()).isHeld());
    QCOMPARE(QDir(folder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot), QStringList());
}

void tst_SeveralWriters::holdsNoLockOnAFolderThatIsNone()
{
    QElapsedTimer timer;
    timer.start();
    QVERIFY(!Vel::FolderLock(QFile::encodeName(path(QStringLiteral("missing"))).toStdString()).isHeld());
    QVERIFY(!Vel::FolderLock(QFile::encodeName(write(QStringLiteral("x"), "")).toStdString()).isHeld());
    QVERIFY(timer.elapsed() < 800);
}

VEL_TEST_GUILESS_MAIN(tst_SeveralWriters)

#include "tst_SeveralWriters.moc"
