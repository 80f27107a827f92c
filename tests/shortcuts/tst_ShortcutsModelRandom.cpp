// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A thousand random operations against a plain model of what must hold; VEL_TEST_ROUNDS sets
// another number, VEL_TEST_SEED repeats a run.

#include "ShortcutsModel.h"
#include "TestCase.h"

#include <shortcuts/ShortcutsTreeView.h>

#include <QAbstractItemModelTester>
#include <QAction>
#include <QRandomGenerator>
#include <QSettings>
#include <QShortcut>
#include <QWidget>

#include <map>
#include <memory>
#include <vector>

namespace {

// What the model has to know of one wrapped object.
struct Thing
{
    QObject *object;
    QString name;
    QString text;
    QKeySequence defaultKey;
    QKeySequence pendingKey;
    QKeySequence inForce;
};

using Group = std::map<QString, std::vector<Thing>>;

// The keys of the wrapped object itself.
QKeySequence keyOf(const QObject *object)
{
    if (const auto *action = qobject_cast<const QAction *>(object))
        return action->shortcut();
    return qobject_cast<const QShortcut *>(object)->key();
}

} // namespace

class tst_ShortcutsModelRandom : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void holdsWhatAPlainModelHolds();

private:
    void step();
    void add();
    void destroyOne();
    void edit();
    void saveAll();
    void compare() const;
    void compareGroup(int index) const;
    QKeySequence randomKey();
    int random(int bound) { return int(m_random.bounded(bound)); }
    template <typename Function>
    void forEach(const Function &function)
    {
        for (auto &group : m_groups) {
            for (auto &name : group) {
                for (Thing &thing : name.second)
                    function(thing);
            }
        }
    }

    QRandomGenerator m_random;
    std::unique_ptr<QSettings> m_settings;
    std::unique_ptr<QWidget> m_owner;
    std::unique_ptr<ShortcutsModel> m_model;
    std::unique_ptr<ShortcutsTreeView> m_view;
    QStringList m_groupNames;
    std::vector<Group> m_groups;
    std::map<QString, QKeySequence> m_saved;
};

QKeySequence tst_ShortcutsModelRandom::randomKey()
{
    switch (random(8)) {
    case 0:
        return {};
    case 1:
        return QKeySequence(int(Qt::CTRL) | Qt::Key_K, Qt::Key_A + random(4));
    default:
        return QKeySequence((random(2) ? int(Qt::CTRL) : 0) | (Qt::Key_A + random(12)));
    }
}

void tst_ShortcutsModelRandom::add()
{
    const QString name = QStringLiteral("name%1").arg(random(40));
    const QString groupName = QStringLiteral("Group %1").arg(random(5));
    Thing thing{nullptr, name, QStringLiteral("Text %1").arg(random(1000)), randomKey(), {}, {}};
    const auto saved = m_saved.find(name);
    thing.inForce = saved == m_saved.end() ? thing.defaultKey : saved->second;
    thing.pendingKey = thing.inForce;
    if (random(2)) {
        auto *action = new QAction(thing.text, m_owner.get());
        action->setShortcut(thing.defaultKey);
        m_model->registerAction(name, action, groupName);
        thing.object = action;
    } else {
        auto *shortcut = new QShortcut(thing.defaultKey, m_owner.get());
        m_model->registerShortcut(name, shortcut, thing.text, groupName);
        thing.object = shortcut;
    }
    int group = m_groupNames.indexOf(groupName);
    if (group < 0) {
        group = m_groupNames.size();
        m_groupNames.append(groupName);
        m_groups.emplace_back();
    }
    m_groups[std::size_t(group)][name].push_back(thing);
}

void tst_ShortcutsModelRandom::destroyOne()
{
    std::vector<Thing> things;
    forEach([&things](const Thing &thing) { things.push_back(thing); });
    if (things.empty())
        return;
    const Thing gone = things[std::size_t(random(int(things.size())))];
    for (Group &group : m_groups) {
        std::vector<Thing> &list = group[gone.name];
        for (auto it = list.begin(); it != list.end();)
            it = it->object == gone.object ? list.erase(it) : it + 1;
    }
    delete gone.object;
}

void tst_ShortcutsModelRandom::edit()
{
    if (m_groups.empty())
        return;
    const int groupRow = random(int(m_groups.size()));
    Group &group = m_groups[std::size_t(groupRow)];
    const int row = random(int(group.size()));
    const QKeySequence key = randomKey();
    auto entry = std::next(group.begin(), row);
    const QModelIndex index = m_model->index(row, random(2), m_model->index(groupRow, 0));
    m_view->setCurrentIndex(index);
    m_view->setKeySequence(key);
    if (!entry->second.empty())
        entry->second.front().pendingKey = key;
}

void tst_ShortcutsModelRandom::saveAll()
{
    m_model->saveKeys(m_settings.get(), QStringLiteral("Keys"));
    for (const Group &group : m_groups) {
        for (const auto &name : group) {
            if (!name.second.empty())
                m_saved[name.first] = name.second.front().inForce;
        }
    }
}

void tst_ShortcutsModelRandom::step()
{
    switch (random(12)) {
    case 0:
        m_model->commitChanges();
        forEach([](Thing &thing) { thing.inForce = thing.pendingKey; });
        break;
    case 1:
        m_model->resetShortcuts();
        forEach([](Thing &thing) { thing.pendingKey = thing.inForce; });
        break;
    case 2:
        m_model->restoreDefaults();
        forEach([](Thing &thing) { thing.pendingKey = thing.defaultKey; });
        break;
    case 3:
        saveAll();
        break;
    case 4:
    case 5:
    case 6:
        add();
        break;
    case 7:
    case 8:
        destroyOne();
        break;
    default:
        edit();
        break;
    }
    if (random(4) == 0)
        QCoreApplication::processEvents();
}

void tst_ShortcutsModelRandom::compareGroup(int index) const
{
    const Group &group = m_groups[std::size_t(index)];
    const QModelIndex parent = m_model->index(index, 0);
    QCOMPARE(parent.data().toString(), m_groupNames.at(index));
    QCOMPARE(m_model->rowCount(parent), int(group.size()));
    int row = 0;
    for (const auto &name : group) {
        const QModelIndex text = m_model->index(row, 0, parent);
        const QModelIndex key = m_model->index(row, 1, parent);
        ++row;
        if (name.second.empty()) {
            QVERIFY(!text.data().isValid() && !key.data().isValid());
            continue;
        }
        const Thing &first = name.second.front();
        QCOMPARE(text.data().toString(), first.text);
        QCOMPARE(key.data().toString(), first.pendingKey.toString(QKeySequence::PortableText));
        QCOMPARE(m_model->keySequence(text), first.pendingKey);
        QCOMPARE(m_model->defaultKeySequence(text), first.defaultKey);
        for (const Thing &thing : name.second)
            QCOMPARE(keyOf(thing.object), thing.inForce);
    }
}

void tst_ShortcutsModelRandom::compare() const
{
    QCOMPARE(m_model->rowCount(), int(m_groups.size()));
    QMap<QString, QString> holders; // by key, the first one
    for (int group = 0; group < int(m_groups.size()); ++group) {
        compareGroup(group);
        if (QTest::currentTestFailed())
            return;
        for (const auto &name : m_groups[std::size_t(group)]) {
            if (!name.second.empty() && !holders.contains(name.second.front().pendingKey.toString()))
                holders.insert(name.second.front().pendingKey.toString(), name.first);
        }
    }
    for (int key = Qt::Key_A; key < Qt::Key_A + 12; ++key) {
        const IShortcutObject *holder = m_model->hasKeySequence(QKeySequence(key));
        QCOMPARE(holder ? holder->name() : QString(), holders.value(QKeySequence(key).toString()));
    }
}

void tst_ShortcutsModelRandom::holdsWhatAPlainModelHolds()
{
    const int rounds = qEnvironmentVariableIntValue("VEL_TEST_ROUNDS") > 0
        ? qEnvironmentVariableIntValue("VEL_TEST_ROUNDS")
        : 1000;
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : QRandomGenerator::global()->generate() & 0x7fffffff;
    qInfo("seed %u, %d rounds", seed, rounds);
    m_random.seed(seed);
    m_settings.reset(new QSettings(path(QStringLiteral("app.conf")), QSettings::IniFormat));
    m_owner.reset(new QWidget);
    m_model.reset(new ShortcutsModel(m_settings.get(), QStringLiteral("Keys")));
    m_view.reset(new ShortcutsTreeView);
    m_view->setModel(m_model.get());
    m_view->show();
    for (int i = 0; i < rounds && !QTest::currentTestFailed(); ++i) {
        step();
        compare();
        if (i % 100 == 0)
            QAbstractItemModelTester tester(m_model.get(),
                                            QAbstractItemModelTester::FailureReportingMode::QtTest);
    }
    m_settings->sync();
    QSettings saved(path(QStringLiteral("app.conf")), QSettings::IniFormat);
    saved.beginGroup(QStringLiteral("Keys"));
    QCOMPARE(saved.childKeys().size(), int(m_saved.size()));
    for (const auto &entry : m_saved)
        QCOMPARE(saved.value(entry.first).toString(), entry.second.toString(QKeySequence::PortableText));

    // With the window of all that is left, and the view still open.
    m_owner.reset();
    QCoreApplication::processEvents();
    for (int key = Qt::Key_A; key < Qt::Key_A + 12; ++key)
        QVERIFY(!m_model->hasKeySequence(QKeySequence(key)));
    m_view.reset();
    m_model.reset();
    m_settings.reset();
}

VEL_TEST_MAIN(tst_ShortcutsModelRandom)

#include "tst_ShortcutsModelRandom.moc"
