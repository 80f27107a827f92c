// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "QtMajor.h"
#include "ShortcutsModelTestCase.h"

#include <QAction>
#include <QPixmap>
#include <QShortcut>
#include <QSignalSpy>

/// The rows of the model and the keys in them.
class tst_ShortcutsModel : public ShortcutsModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isEmptyAtFirst();
    void keepsTheGroupsInTheOrderOfTheirRegistration();
    void sortsTheNamesWithinAGroup();
    void addressesRowsByGroup();
    void givesTheDataOfEachKindOfRow();
    void givesNothingElse();
    void namesItsColumns();
    void letsOnlyTheKeyBeEdited();
    void takesTheGroupFromTheParentOfTheWrappedObject();
    void ignoresWhatIsNoObject();
    void tellsShortcutsFromGroups();
    void readsTheKeysOfARowFromEitherColumn();
    void setsTheKeyOfARowFromEitherColumn();
    void refusesWhatIsNoKey_data();
    void refusesWhatIsNoKey();
    void announcesAnEditOnce();
    void findsTheFirstHolderOfAKey();
    void comparesWholeSequences();
};

void tst_ShortcutsModel::isEmptyAtFirst()
{
    QCOMPARE(m_model->rowCount(), 0);
    QCOMPARE(m_model->columnCount(), 2);
    QVERIFY(!m_model->index(0, 0).isValid());
    QVERIFY(!m_model->hasKeySequence(QKeySequence()));
    m_model->restoreDefaults();
    m_model->resetShortcuts();
    m_model->commitChanges();
}

void tst_ShortcutsModel::keepsTheGroupsInTheOrderOfTheirRegistration()
{
    addAction("a", "File");
    addAction("b", "Edit");
    addAction("c", "File");
    QCOMPARE(m_model->rowCount(), 2);
    QCOMPARE(m_model->index(0, 0).data().toString(), str("File"));
    QCOMPARE(m_model->index(1, 0).data().toString(), str("Edit"));
    QCOMPARE(m_model->rowCount(m_model->index(0, 0)), 2);
    QCOMPARE(m_model->rowCount(m_model->index(1, 0)), 1);
}

void tst_ShortcutsModel::sortsTheNamesWithinAGroup()
{
    for (const char *name : {"b", "a", "Z", "c", "B"})
        addAction(name, "g");
    QStringList texts;
    for (int i = 0; i < 5; ++i)
        texts.append(row(0, i).data().toString());
    QCOMPARE(texts.join(QLatin1Char(',')), str("Text of B,Text of Z,Text of a,Text of b,Text of c"));
}

void tst_ShortcutsModel::addressesRowsByGroup()
{
    addAction("a", "File");
    addAction("b", "Edit");
    addAction("c", "Edit");
    const QModelIndex group = m_model->index(1, 0);
    QCOMPARE(group.internalId(), ~quintptr(0));
    QVERIFY(!group.parent().isValid());
    const QModelIndex shortcut = row(1, 1, 1);
    QCOMPARE(shortcut.internalId(), quintptr(1));
    QCOMPARE(shortcut.row(), 1);
    QCOMPARE(shortcut.parent(), group);
    QCOMPARE(m_model->rowCount(shortcut), 0);
    QCOMPARE(m_model->rowCount(row(1, 1, 0)), 0);
    QCOMPARE(m_model->columnCount(group), 2);
    QCOMPARE(m_model->columnCount(shortcut), 2);
    QVERIFY(!row(1, 2).isValid());
    QVERIFY(!row(1, 0, 2).isValid());
    QVERIFY(!m_model->index(2, 0).isValid());
    QVERIFY(!m_model->index(-1, 0).isValid());
}

void tst_ShortcutsModel::givesTheDataOfEachKindOfRow()
{
    QPixmap pixmap(16, 16);
    pixmap.fill(Qt::red);
    QAction *action = addAction("a", "File", QKeySequence(Qt::CTRL | Qt::Key_S));
    action->setIcon(QIcon(pixmap));
    m_model->setKeySequence(row(0, 0), VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C));

    QCOMPARE(m_model->index(0, 0).data(Qt::DisplayRole), QVariant(str("File")));
    QCOMPARE(row(0, 0).data(Qt::DisplayRole), QVariant(str("Text of a")));
    QCOMPARE(row(0, 0).data(Qt::DecorationRole).value<QIcon>().cacheKey(), action->icon().cacheKey());
    QCOMPARE(row(0, 0, 1).data(Qt::DisplayRole), QVariant(str("Ctrl+K, Ctrl+C")));
    QCOMPARE(row(0, 0, 1).data(Qt::EditRole),
             QVariant(VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C)));
    QCOMPARE(row(0, 0, 1).data(Qt::UserRole), QVariant(QKeySequence(Qt::CTRL | Qt::Key_S)));
}

void tst_ShortcutsModel::givesNothingElse()
{
    addAction("a", "File", f1);
    for (int role = 0; role <= Qt::UserRole + 1; ++role) {
        QVERIFY(!m_model->data(QModelIndex(), role).isValid());
        QVERIFY(!m_model->index(0, 1).data(role).isValid());
        QCOMPARE(m_model->index(0, 0).data(role).isValid(), role == Qt::DisplayRole);
        QCOMPARE(row(0, 0).data(role).isValid(), role == Qt::DisplayRole || role == Qt::DecorationRole);
        QCOMPARE(row(0, 0, 1).data(role).isValid(),
                 role == Qt::DisplayRole || role == Qt::EditRole || role == Qt::UserRole);
    }
}

void tst_ShortcutsModel::namesItsColumns()
{
    QCOMPARE(m_model->headerData(0, Qt::Horizontal), QVariant(str("Action")));
    QCOMPARE(m_model->headerData(1, Qt::Horizontal), QVariant(str("Shortcut")));
    QCOMPARE(m_model->headerData(7, Qt::Horizontal), QVariant(str("Shortcut")));
    QVERIFY(!m_model->headerData(0, Qt::Vertical).isValid());
    QVERIFY(!m_model->headerData(0, Qt::Horizontal, Qt::ToolTipRole).isValid());
}

void tst_ShortcutsModel::letsOnlyTheKeyBeEdited()
{
    addAction("a", "File", f1);
    const Qt::ItemFlags plain = Qt::ItemIsSelectable | Qt::ItemIsEnabled;
    QCOMPARE(m_model->index(0, 0).flags(), plain);
    QCOMPARE(m_model->index(0, 1).flags(), plain);
    QCOMPARE(row(0, 0).flags(), plain);
    QCOMPARE(row(0, 0, 1).flags(), plain | Qt::ItemIsEditable);
    QCOMPARE(m_model->flags(QModelIndex()), Qt::ItemFlags());
}

void tst_ShortcutsModel::takesTheGroupFromTheParentOfTheWrappedObject()
{
    m_window->setObjectName(str("mainWindow"));
    m_model->registerShortcut(str("a"), new QShortcut(f1, m_window.get()), str("One"));
    m_model->registerAction(str("b"), new QAction(str("Two"), m_window.get()));
    m_model->registerShortcut(str("c"), new QShortcut(f2, m_window.get()), str("Three"), str("Other"));
    QCOMPARE(m_model->rowCount(), 2);
    QCOMPARE(m_model->index(0, 0).data().toString(), str("mainWindow"));
    QCOMPARE(row(0, 0).data().toString(), str("One"));
    QCOMPARE(row(0, 1).data().toString(), str("Two"));
    QCOMPARE(row(1, 0).data().toString(), str("Three"));
}

void tst_ShortcutsModel::ignoresWhatIsNoObject()
{
    m_model->registerShortcut(str("a"), nullptr, str("One"));
    m_model->registerAction(str("a"), nullptr);
    m_model->registerShortcutObject(nullptr);
    QCOMPARE(m_model->rowCount(), 0);
    auto *object = new KeyTestObject(str("n"), str("g"));
    m_model->registerShortcutObject(object);
    m_model->registerShortcutObject(object);
    QCOMPARE(m_model->rowCount(m_model->index(0, 0)), 1);
}

void tst_ShortcutsModel::tellsShortcutsFromGroups()
{
    addAction("a", "File");
    QVERIFY(!m_model->isShortcutItem(QModelIndex()));
    QVERIFY(!m_model->isShortcutItem(m_model->index(0, 0)));
    QVERIFY(!m_model->isShortcutItem(m_model->index(0, 1)));
    QVERIFY(m_model->isShortcutItem(row(0, 0)));
    QVERIFY(m_model->isShortcutItem(row(0, 0, 1)));
}

void tst_ShortcutsModel::readsTheKeysOfARowFromEitherColumn()
{
    addAction("a", "File", f1);
    m_model->setKeySequence(row(0, 0), f2);
    for (int column : {0, 1}) {
        QCOMPARE(m_model->keySequence(row(0, 0, column)), f2);
        QCOMPARE(m_model->defaultKeySequence(row(0, 0, column)), f1);
    }
    QVERIFY(m_model->keySequence(m_model->index(0, 0)).isEmpty());
    QVERIFY(m_model->defaultKeySequence(m_model->index(0, 0)).isEmpty());
    QVERIFY(m_model->keySequence(QModelIndex()).isEmpty());
}

void tst_ShortcutsModel::setsTheKeyOfARowFromEitherColumn()
{
    QAction *action = addAction("a", "File", f1);
    m_model->setKeySequence(row(0, 0, 1), f2);
    QCOMPARE(m_model->keySequence(row(0, 0)), f2);
    m_model->setKeySequence(row(0, 0, 0), f3);
    QCOMPARE(m_model->keySequence(row(0, 0)), f3);
    m_model->setKeySequence(m_model->index(0, 0), f1);
    m_model->setKeySequence(QModelIndex(), f1);
    QCOMPARE(m_model->keySequence(row(0, 0)), f3);
    QCOMPARE(action->shortcut(), f1);
}

void tst_ShortcutsModel::refusesWhatIsNoKey_data()
{
    QTest::addColumn<bool>("isGroup");
    QTest::addColumn<int>("column");
    QTest::addColumn<QVariant>("value");
    QTest::addColumn<int>("role");
    const QVariant key(f2);
    QTest::newRow("text") << false << 1 << QVariant(str("F2")) << int(Qt::EditRole);
    QTest::newRow("number") << false << 1 << QVariant(int(Qt::Key_F2)) << int(Qt::EditRole);
    QTest::newRow("nothing") << false << 1 << QVariant() << int(Qt::EditRole);
    QTest::newRow("other role") << false << 1 << key << int(Qt::DisplayRole);
    QTest::newRow("default key") << false << 1 << key << int(Qt::UserRole);
    QTest::newRow("text column") << false << 0 << key << int(Qt::EditRole);
    QTest::newRow("group") << true << 0 << key << int(Qt::EditRole);
    QTest::newRow("group key") << true << 1 << key << int(Qt::EditRole);
    QTest::newRow("same key") << false << 1 << QVariant(f1) << int(Qt::EditRole);
}

void tst_ShortcutsModel::refusesWhatIsNoKey()
{
    QFETCH(bool, isGroup);
    QFETCH(int, column);
    QFETCH(QVariant, value);
    QFETCH(int, role);
    addAction("a", "File", f1);
    QSignalSpy spy(m_model.get(), &QAbstractItemModel::dataChanged);
    const QModelIndex index = isGroup ? m_model->index(0, column) : row(0, 0, column);
    QVERIFY(!m_model->setData(index, value, role));
    QVERIFY(!m_model->setData(QModelIndex(), value, role));
    QCOMPARE(m_model->keySequence(row(0, 0)), f1);
    QCOMPARE(spy.count(), 0);
}

void tst_ShortcutsModel::announcesAnEditOnce()
{
    addAction("a", "File", f1);
    QSignalSpy spy(m_model.get(), &QAbstractItemModel::dataChanged);
    QVERIFY(m_model->setData(row(0, 0, 1), f2));
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.at(0).at(0).toModelIndex(), row(0, 0, 1));
    QCOMPARE(spy.at(0).at(1).toModelIndex(), row(0, 0, 1));
    QVERIFY(spy.at(0).at(2).value<QVector<int>>().isEmpty());
    QVERIFY(!m_model->setData(row(0, 0, 1), f2));
    QCOMPARE(spy.count(), 1);
    QVERIFY(m_model->setData(row(0, 0, 1), QKeySequence()));
    QCOMPARE(row(0, 0, 1).data(), QVariant(QString()));
}

void tst_ShortcutsModel::findsTheFirstHolderOfAKey()
{
    addAction("z", "File", f1);
    addAction("b", "Edit", f2);
    addAction("a", "Edit", f1);
    addAction("y", "File", QKeySequence());
    addAction("z", "File", f3);
    QCOMPARE(m_model->hasKeySequence(f1)->name(), str("z"));
    QCOMPARE(m_model->hasKeySequence(f2)->name(), str("b"));
    // Only the first object of a name counts.
    QVERIFY(!m_model->hasKeySequence(f3));
    QCOMPARE(m_model->hasKeySequence(QKeySequence())->name(), str("y"));
    // Pending keys count, not those in force.
    m_model->setKeySequence(row(1, 1), f3);
    QVERIFY(!m_model->hasKeySequence(f2));
    QCOMPARE(m_model->hasKeySequence(f3)->name(), str("b"));
}

void tst_ShortcutsModel::comparesWholeSequences()
{
    addAction("a", "File", QKeySequence(Qt::CTRL | Qt::Key_K));
    QVERIFY(!m_model->hasKeySequence(VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C)));
    m_model->setKeySequence(row(0, 0), VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C));
    QVERIFY(!m_model->hasKeySequence(QKeySequence(Qt::CTRL | Qt::Key_K)));
}

VEL_TEST_MAIN(tst_ShortcutsModel)
#include "tst_ShortcutsModel.moc"
