// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "ShortcutsModelTestCase.h"

#include <QAction>
#include <QPersistentModelIndex>
#include <QPointer>
#include <QShortcut>
#include <QSignalSpy>

/// Objects that share a row, come and go.
class tst_ShortcutsModelObjects : public ShortcutsModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void sharesARowAmongObjectsOfOneName();
    void emptiesTheRowOfADestroyedObject();
    void keepsTheRowWhileAnotherObjectOfTheNameLives();
    void givesOtherGroupsAnEmptyEntryOfTheName();
    void keepsPersistentIndexesOnTheirShortcuts();
    void losesAllActionsOfADestroyedWindow();
    void survivesRemovalsInBulkOperations_data();
    void survivesRemovalsInBulkOperations();
    void survivesRegistrationInABulkOperation();
    void tellsFurtherKeysOfActions();
    void keepsFurtherKeysThroughEdits();
    void deletesItsObjectsButNotWhatTheyWrap();
};

void tst_ShortcutsModelObjects::sharesARowAmongObjectsOfOneName()
{
    QAction *first = addAction("a", "File", f1);
    first->setText(str("First"));
    QAction *second = addAction("a", "File", f2);
    QCOMPARE(m_model->rowCount(m_model->index(0, 0)), 1);
    QCOMPARE(row(0, 0).data().toString(), str("First"));

    m_model->setKeySequence(row(0, 0), f3);
    m_model->commitChanges();
    QCOMPARE(first->shortcut(), f3);
    QCOMPARE(second->shortcut(), f2);

    second->setShortcut(f3);
    m_model->restoreDefaults();
    m_model->commitChanges();
    QCOMPARE(first->shortcut(), f1);
    QCOMPARE(second->shortcut(), f2);

    first->setShortcut(f3);
    second->setShortcut(f1);
    m_model->resetShortcuts();
    m_model->commitChanges();
    QCOMPARE(first->shortcut(), f3);
    QCOMPARE(second->shortcut(), f1);
}

void tst_ShortcutsModelObjects::emptiesTheRowOfADestroyedObject()
{
    QAction *action = addAction("a", "File", f1);
    addAction("b", "File", f2);
    const QPointer<QObject> object(m_model->hasKeySequence(f1));
    QSignalSpy dataSpy(m_model.get(), &QAbstractItemModel::dataChanged);
    QSignalSpy resetSpy(m_model.get(), &QAbstractItemModel::modelReset);
    QSignalSpy rowsSpy(m_model.get(), &QAbstractItemModel::rowsRemoved);
    delete action;
    QVERIFY(!object);
    QCOMPARE(dataSpy.count() + resetSpy.count() + rowsSpy.count(), 0);

    QCOMPARE(m_model->rowCount(m_model->index(0, 0)), 2);
    for (int column : {0, 1}) {
        for (int role : {int(Qt::DisplayRole), int(Qt::DecorationRole), int(Qt::EditRole), int(Qt::UserRole)})
            QVERIFY(!row(0, 0, column).data(role).isValid());
    }
    QVERIFY(!m_model->setData(row(0, 0, 1), f3));
    QVERIFY(!m_model->hasKeySequence(f1));
    QVERIFY(!m_model->hasKeySequence(QKeySequence()));
    QVERIFY(m_model->keySequence(row(0, 0)).isEmpty());
    QCOMPARE(m_model->keySequence(row(0, 1)), f2);

    // The name can be used again.
    addAction("a", "File", f3);
    QCOMPARE(m_model->keySequence(row(0, 0)), f3);
}

void tst_ShortcutsModelObjects::keepsTheRowWhileAnotherObjectOfTheNameLives()
{
    QAction *first = addAction("a", "File", f1);
    QAction *second = addAction("a", "File", f2);
    delete first;
    QCOMPARE(m_model->keySequence(row(0, 0)), f2);
    m_model->setKeySequence(row(0, 0), f3);
    m_model->commitChanges();
    QCOMPARE(second->shortcut(), f3);
}

void tst_ShortcutsModelObjects::givesOtherGroupsAnEmptyEntryOfTheName()
{
    QAction *action = addAction("a", "File", f1);
    addAction("b", "Edit", f2);
    delete action;
    QCOMPARE(m_model->rowCount(m_model->index(1, 0)), 2);
    QVERIFY(!row(1, 0).data().isValid());
    QCOMPARE(m_model->keySequence(row(1, 1)), f2);
}

void tst_ShortcutsModelObjects::keepsPersistentIndexesOnTheirShortcuts()
{
    QAction *action = addAction("b", "File", f1);
    addAction("a", "Edit", f2);
    addAction("c", "Edit", f3);
    const QPersistentModelIndex before(row(1, 0, 1));
    const QPersistentModelIndex after(row(1, 1, 1));
    const QPersistentModelIndex group(m_model->index(1, 0));
    delete action;
    QCOMPARE(m_model->keySequence(before), f2);
    QCOMPARE(m_model->keySequence(after), f3);
    QCOMPARE(after.row(), 2);
    QCOMPARE(group.row(), 1);
    addAction("0", "Edit", f1);
    QCOMPARE(m_model->keySequence(before), f2);
    QCOMPARE(m_model->keySequence(after), f3);
    QCOMPARE(QModelIndex(group).data().toString(), str("Edit"));
}

void tst_ShortcutsModelObjects::losesAllActionsOfADestroyedWindow()
{
    for (int i = 0; i < 100; ++i) {
        addAction(qPrintable(QString::number(i)), i % 2 ? "Odd" : "Even", f1);
        m_model->registerShortcut(QString::number(i), new QShortcut(f2, m_window.get()), str("Twin"),
                                  str("Twins"));
    }
    m_window.reset();
    QVERIFY(!m_model->hasKeySequence(f1));
    QVERIFY(!m_model->hasKeySequence(f2));
    QCOMPARE(m_model->rowCount(), 3);
    m_model->restoreDefaults();
    m_model->resetShortcuts();
    m_model->commitChanges();
}

void tst_ShortcutsModelObjects::survivesRemovalsInBulkOperations_data()
{
    QTest::addColumn<int>("operation");
    QTest::newRow("commit") << 0;
    QTest::newRow("reset") << 1;
    QTest::newRow("restore") << 2;
}

void tst_ShortcutsModelObjects::survivesRemovalsInBulkOperations()
{
    QFETCH(int, operation);
    QList<QAction *> actions;
    for (const char *name : {"a", "b", "b", "c", "d"})
        actions.append(addAction(name, *name < 'c' ? "File" : "Edit", f1));
    const auto removeAll = [&actions] {
        qDeleteAll(actions);
        actions.clear();
    };
    if (operation == 0)
        connect(actions.at(1), &QAction::changed, this, removeAll);
    else
        connect(m_model.get(), &QAbstractItemModel::dataChanged, this, removeAll);
    for (int group = 0; group < 2; ++group) {
        const QSignalBlocker blocker(m_model.get());
        m_model->setKeySequence(row(group, 1), f2);
    }
    if (operation == 0)
        m_model->commitChanges();
    else if (operation == 1)
        m_model->resetShortcuts();
    else
        m_model->restoreDefaults();
    QVERIFY(actions.isEmpty());
    QVERIFY(!m_model->hasKeySequence(f1));
    QVERIFY(!m_model->hasKeySequence(f2));
}

void tst_ShortcutsModelObjects::survivesRegistrationInABulkOperation()
{
    auto *object = new KeyTestObject(str("m"), str("g"), f1);
    m_model->registerShortcutObject(object);
    for (int i = 0; i < 5; ++i)
        m_model->registerShortcutObject(new KeyTestObject(QString::number(i), str("g"), f2));
    object->onApply = [this] {
        for (int i = 0; i < 100; ++i)
            m_model->registerShortcutObject(
                new KeyTestObject(str("x") + QString::number(i), QString::number(i % 7)));
    };
    m_model->commitChanges();
    QCOMPARE(m_model->rowCount(), 8);
}

void tst_ShortcutsModelObjects::tellsFurtherKeysOfActions()
{
    QAction *action = addAction("a", "File", f1);
    m_model->registerShortcutObject(new KeyTestObject(str("b"), str("File"), f2));
    QVERIFY(m_model->furtherKeySequences(row(0, 0)).isEmpty());
    action->setShortcuts({f1, f2, f3});
    for (const int column : {0, 1})
        QCOMPARE(m_model->furtherKeySequences(row(0, 0, column)), (QList<QKeySequence>{f2, f3}));
    m_model->setKeySequence(row(0, 0), f3);
    QCOMPARE(m_model->furtherKeySequences(row(0, 0)), QList<QKeySequence>{f2});
    QVERIFY(m_model->furtherKeySequences(row(0, 1)).isEmpty());
    QVERIFY(m_model->furtherKeySequences(m_model->index(0, 0)).isEmpty());
    QVERIFY(m_model->furtherKeySequences(QModelIndex()).isEmpty());
    const QModelIndex index = row(0, 0);
    delete action;
    QVERIFY(m_model->furtherKeySequences(index).isEmpty());
}

void tst_ShortcutsModelObjects::keepsFurtherKeysThroughEdits()
{
    QAction *action = addAction("a", "File", f1);
    action->setShortcuts({f1, f2});
    m_model->setKeySequence(row(0, 0), f2);
    m_model->commitChanges();
    QCOMPARE(action->shortcuts(), QList<QKeySequence>{f2});
    m_model->restoreDefaults();
    m_model->commitChanges();
    QCOMPARE(action->shortcuts(), (QList<QKeySequence>{f1, f2}));
    m_model->setKeySequence(row(0, 0), QKeySequence());
    m_model->commitChanges();
    QCOMPARE(action->shortcut(), QKeySequence());
    QCOMPARE(m_model->furtherKeySequences(row(0, 0)), QList<QKeySequence>{f2});
    m_model->resetShortcuts();
    m_model->restoreDefaults();
    m_model->commitChanges();
    QCOMPARE(action->shortcuts(), (QList<QKeySequence>{f1, f2}));
}

void tst_ShortcutsModelObjects::deletesItsObjectsButNotWhatTheyWrap()
{
    const QPointer<QAction> action(addAction("a", "File", f1));
    auto *object = new KeyTestObject(str("b"), str("File"), f2);
    m_model->registerShortcutObject(object);
    const QPointer<QObject> own(object);
    const QPointer<QObject> wrapper(m_model->hasKeySequence(f1));
    QVERIFY(wrapper);
    m_model.reset();
    QVERIFY(action);
    QVERIFY(!own);
    QVERIFY(!wrapper);
}

VEL_TEST_MAIN(tst_ShortcutsModelObjects)
#include "tst_ShortcutsModelObjects.moc"
