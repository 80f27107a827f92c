// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Random steps of applications and of the user against a plain model of the rules, with updates that
// are killed among them. VEL_TEST_FULL does 1,000 steps with 100 kills, VEL_TEST_ROUNDS another number of
// steps; VEL_TEST_SEED repeats a run.

#include "FollowedMenu.h"
#include "KilledSystem.h"
#include "StartMenuUpdateTestCase.h"

#include <QElapsedTimer>
#include <QRandomGenerator>

#include <algorithm>

#include <csignal>
#include <sys/wait.h>
#include <unistd.h>

namespace {

const QStringList Categories = {QStringLiteral("Game"), QStringLiteral("Office"), QStringLiteral("Other")};
const QStringList Folders = Categories + QStringList{QStringLiteral("Mine"), QString()};

int rounds()
{
    if (qEnvironmentVariableIntValue("VEL_TEST_ROUNDS") > 0)
        return qEnvironmentVariableIntValue("VEL_TEST_ROUNDS");
    return qEnvironmentVariableIsSet("VEL_TEST_FULL") ? 1000 : 150;
}

} // namespace

class tst_startmenu_random : public StartMenuUpdateTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void followsTheRulesAtEachStep();
    void losesNothingWhenItIsKilled();

private:
    int number(int below) { return int(m_random.bounded(quint32(below))); }
    QString anyOf(const QStringList &names) { return names.at(number(names.size())); }
    QString anyEntry() { return m_model.files.isEmpty() ? QString() : anyOf(m_model.files.keys()); }

    void step();
    void installOne();
    void uninstallOne();
    void editOne();
    void removeOne();
    void moveOne();
    void copyOne();
    void removeFolder();
    void editFolder();
    void shuffleFolder();
    void check(const QMap<QString, QStringList> &orders);
    void run(VelStartMenu::Look look);
    bool kill(int longest);
    QMap<QString, QStringList> orders() const;
    void put(const QString &name, const QByteArray &bytes);

    QRandomGenerator m_random;
    FollowedMenu m_model;
    int m_version = 0;
};

void tst_startmenu_random::init()
{
    StartMenuUpdateTestCase::init();
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : QRandomGenerator::global()->generate() & 0x7fffffff;
    qInfo("seed %u", seed);
    m_random.seed(seed);
    m_model = {};
    for (int i = 0; i < 6; ++i)
        installOne();
    m_model.update();
    QVERIFY(update());
    write(QStringLiteral("config/vel/startmenu/Mine/.directory"), "[Desktop Entry]\nType=Directory\n");
}

void tst_startmenu_random::step()
{
    const int kind = number(20);
    if (kind < 6)
        installOne();
    else if (kind < 9)
        uninstallOne();
    else if (kind < 11)
        editOne();
    else if (kind < 13)
        removeOne();
    else if (kind < 16)
        moveOne();
    else if (kind < 17)
        copyOne();
    else if (kind < 18)
        shuffleFolder();
    else if (kind < 19)
        editFolder();
    else if (number(3) == 0)
        removeFolder();
}

// As package managers do it: the new file takes the name of the old one.
void tst_startmenu_random::installOne()
{
    const QString name = QStringLiteral("app%1.desktop").arg(number(12));
    // Of the same application, now and then another version without anything else.
    const QString category = m_model.installed.contains(name) && number(2)
        ? m_model.installed.value(name).category
        : anyOf(Categories);
    const QByteArray categories = category == QLatin1String("Other") ? QByteArray() : category.toUtf8() + ';';
    const QByteArray version = QByteArray::number(number(3));
    const QString made = write(QStringLiteral("new"),
                               "[Desktop Entry]\nType=Application\nName=" + name.toUtf8() + version
                                   + "\nExec=true\nCategories=" + categories + '\n');
    const QString target = path(QStringLiteral("home/applications/") + name);
    QDir().mkpath(QFileInfo(target).path());
    QFile::remove(target);
    QVERIFY(QFile::rename(made, target));
    m_model.installed[name] = {category, read(target)};
}

void tst_startmenu_random::uninstallOne()
{
    if (m_model.installed.size() < 2)
        return;
    const QString name = anyOf(m_model.installed.keys());
    uninstall(name);
    m_model.installed.remove(name);
}

void tst_startmenu_random::put(const QString &name, const QByteArray &bytes)
{
    write(QStringLiteral("config/vel/startmenu/") + name, bytes);
    m_model.files[name] = bytes;
}

void tst_startmenu_random::editOne()
{
    const QString name = anyEntry();
    if (!name.isEmpty())
        put(name, m_model.files.value(name) + "# " + QByteArray::number(++m_version) + '\n');
}

void tst_startmenu_random::removeOne()
{
    const QString name = anyEntry();
    if (name.isEmpty())
        return;
    QVERIFY(QFile::remove(inMenu(name)));
    m_model.files.remove(name);
}

// Also to where an entry of an application belongs, and back to where it was.
void tst_startmenu_random::moveOne()
{
    const QString from = anyEntry();
    const QString folder = anyOf(Folders);
    const QString name =
        number(2) ? from.section(QLatin1Char('/'), -1) : QStringLiteral("app%1.desktop").arg(number(12));
    const QString to = folder.isEmpty() ? name : folder + QLatin1Char('/') + name;
    if (from.isEmpty() || m_model.files.contains(to) || !QFileInfo(inMenu(folder)).isDir())
        return;
    QVERIFY(QFile::rename(inMenu(from), inMenu(to)));
    m_model.files[to] = m_model.files.take(from);
}

void tst_startmenu_random::copyOne()
{
    const QString from = anyEntry();
    if (!from.isEmpty())
        put(QStringLiteral("Mine/copy%1.desktop").arg(number(5)), m_model.files.value(from));
}

void tst_startmenu_random::removeFolder()
{
    if (m_model.folders.isEmpty())
        return;
    const QString folder = anyOf(m_model.folders.values());
    QVERIFY(QDir(inMenu(folder)).removeRecursively());
    m_model.removeFolder(folder);
}

void tst_startmenu_random::editFolder()
{
    if (m_model.folders.isEmpty())
        return;
    const QString folder = anyOf(m_model.folders.values());
    const QString record = QStringLiteral("config/vel/startmenu/") + folder + QStringLiteral("/.directory");
    write(record, read(path(record)) + "X-Mine=" + QByteArray::number(++m_version) + '\n');
    m_model.editedFolders.insert(folder);
}

void tst_startmenu_random::shuffleFolder()
{
    if (m_model.folders.isEmpty())
        return;
    const QString folder = anyOf(m_model.folders.values());
    QStringList list = sortOrder(inMenu(folder));
    std::shuffle(list.begin(), list.end(), m_random);
    if (!list.isEmpty())
        order(folder, list.join(QLatin1Char(';')).toUtf8() + ';');
}

QMap<QString, QStringList> tst_startmenu_random::orders() const
{
    QMap<QString, QStringList> orders;
    for (const QString &folder : Folders)
        orders[folder] = sortOrder(inMenu(folder));
    return orders;
}

// What came stands in the order, once; of what stood there before and stands there now, nothing was moved.
void tst_startmenu_random::check(const QMap<QString, QStringList> &before)
{
    FollowedMenu::Files found;
    QSet<QString> folders;
    const auto all = tree(menu());
    for (auto it = all.begin(); it != all.end(); ++it) {
        if (it.key().endsWith(QLatin1String(".desktop")))
            found.insert(it.key(), it.value());
        else if (Categories.contains(it.key()))
            folders.insert(it.key());
        else
            QVERIFY2(it.key().endsWith(QLatin1String(".directory")) || it.key() == QLatin1String("Mine"),
                     qPrintable(it.key()));
    }
    QCOMPARE(found.keys(), m_model.files.keys());
    QCOMPARE(found, m_model.files);
    QCOMPARE(folders, m_model.folders);
    const auto after = orders();
    for (const QString &folder : Folders) {
        QStringList kept = before.value(folder);
        QStringList now = after.value(folder);
        const QStringList ours = folder.isEmpty() ? m_model.folders.values() : m_model.untouchedIn(folder);
        for (const QString &name : ours)
            QVERIFY2(now.isEmpty() || now.contains(name), qPrintable(folder + QLatin1Char('/') + name));
        QCOMPARE(now.removeDuplicates(), 0);
        kept.erase(std::remove_if(kept.begin(), kept.end(),
                                  [&](const QString &name) { return !now.contains(name); }),
                   kept.end());
        now.erase(
            std::remove_if(now.begin(), now.end(), [&](const QString &name) { return !kept.contains(name); }),
            now.end());
        QCOMPARE(now, kept);
    }
}

void tst_startmenu_random::run(VelStartMenu::Look look)
{
    const auto before = orders();
    m_model.update();
    QVERIFY(VelStartMenu::update(QFile::encodeName(menu()).constData(), nullptr, look)
            != VelStartMenu::Result::Failed);
    check(before);
}

void tst_startmenu_random::followsTheRulesAtEachStep()
{
    const int count = rounds();
    int updates = 0;
    int repeated = 0;
    for (int i = 0; i < count; ++i) {
        step();
        if (number(3) == 0) // several steps between two updates
            continue;
        run(number(2) ? VelStartMenu::Look::Folders : VelStartMenu::Look::Files);
        ++updates;
        if (QTest::currentTestFailed()) {
            qInfo("at step %d", i);
            return;
        }
        if (number(10) == 0) {
            const auto before = times(path(QStringLiteral("config")));
            QVERIFY(update());
            QCOMPARE(times(path(QStringLiteral("config"))), before);
            ++repeated;
        }
    }
    qInfo("%d steps, %d updates, %d of them done again without a write", count, updates, repeated);
}

// At a random call by which something changes, or after a random time.
bool tst_startmenu_random::kill(int longest)
{
    const QByteArray directory = QFile::encodeName(menu());
    const bool isByCall = number(4) != 0;
    const int call = number(60);
    const pid_t child = fork();
    if (child == 0) {
        if (isByCall)
            KilledSystem::killAt(call);
        UpdateStartMenu(directory.constData(), nullptr);
        _exit(0);
    }
    if (!isByCall) {
        usleep(useconds_t(number(longest)));
        ::kill(child, SIGKILL);
    }
    int status = 0;
    return waitpid(child, &status, 0) == child && WIFSIGNALED(status);
}

void tst_startmenu_random::losesNothingWhenItIsKilled()
{
    const int wanted = qEnvironmentVariableIsSet("VEL_TEST_FULL") ? 100 : 15;
    int killed = 0;
    qint64 longest = 1;
    while (killed < wanted) {
        for (int steps = 0; steps < 5; ++steps)
            step();
        for (int times = number(3); times >= 0; --times)
            killed += kill(int(longest));
        QElapsedTimer timer;
        timer.start();
        run(VelStartMenu::Look::Folders);
        longest = std::max(longest, timer.nsecsElapsed() / 1000);
        if (QTest::currentTestFailed()) {
            qInfo("after %d kills", killed);
            return;
        }
    }
    qInfo("%d kills", killed);
    // Nothing half-done stays, but for what would have become the memory; the next one is written over it.
    QStringList beside = names(path(QStringLiteral("config/vel")));
    beside.removeAll(QStringLiteral(".startmenu.sources.new"));
    QCOMPARE(beside, QStringList({QStringLiteral("startmenu"), QStringLiteral("startmenu.sources")}));
}

VEL_TEST_GUILESS_MAIN(tst_startmenu_random)
#include "tst_startmenu_random.moc"
