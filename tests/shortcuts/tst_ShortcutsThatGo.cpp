// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Shortcuts, groups and models that go or come while they are in use.

#include "DialogTestCase.h"
#include "KeyTestObject.h"

#include <QPointer>
#include <QSignalSpy>

namespace {

// Takes an action with it.
class OwningObject : public KeyTestObject
{
public:
    OwningObject(const QString &name, QAction *action)
        : KeyTestObject(name, QStringLiteral("Owners"))
        , m_action(action)
    {
    }
    ~OwningObject() override
    {
        delete m_action;
        // What it wraps is gone, too.
        Q_EMIT deleteMe();
    }
    Q_DISABLE_COPY(OwningObject)

private:
    const QPointer<QAction> m_action;
};

} // namespace

class tst_ShortcutsThatGo : public DialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void deletesEachObjectOnceWhenObjectsDeleteActions();
    void deletesAnObjectOnceThatAsksForItAgain();
    void hidesAGroupWhoseLastShortcutWent();
    void showsAGroupAgainThatIsUsedAgain();
    void hidesAGroupThatIsEmptyWhenTheDialogOpens();
    void leavesTheHeaderOfAGroupThatGoes();
    void opensAGroupThatIsRegisteredLater();
    void leavesAGroupClosedThatTheUserClosed();
    void asksNothingWhenTheModelIsGone();

private:
    bool isShown(const QModelIndex &index) const { return !tree()->visualRect(index).isEmpty(); }
    // The groups that are seen.
    QStringList shownGroups() const
    {
        QStringList names;
        for (QModelIndex index = tree()->indexAt({1, 1}); index.isValid();
             index = tree()->indexBelow(index)) {
            if (!index.parent().isValid())
                names.append(index.siblingAtColumn(0).data().toString());
        }
        return names;
    }
};

void tst_ShortcutsThatGo::deletesEachObjectOnceWhenObjectsDeleteActions()
{
    // The order is that of addresses; some of many are deleted before the actions they own.
    m_dialog.reset();
    for (int i = 0; i < 40; ++i) {
        QAction *action = addAction(qPrintable(str("owned %1").arg(i)), "File", QKeySequence());
        m_model->registerShortcutObject(new OwningObject(str("owner %1").arg(i), action));
    }
    m_model.reset();
    QCOMPARE(m_owner->findChildren<QAction *>().size(), 5);
}

void tst_ShortcutsThatGo::deletesAnObjectOnceThatAsksForItAgain()
{
    auto *object = new OwningObject(str("owner"), nullptr);
    m_model->registerShortcutObject(object);
    QSignalSpy spy(object, &QObject::destroyed);
    Q_EMIT object->deleteMe();
    QCOMPARE(spy.count(), 1);
}

void tst_ShortcutsThatGo::hidesAGroupWhoseLastShortcutWent()
{
    m_dialog->show();
    QTRY_COMPARE(shownGroups(), QStringList({str("File"), str("Edit")}));
    delete copy;
    QTRY_VERIFY(!isShown(m_model->index(0, 0, m_model->index(1, 0))));
    QCOMPARE(shownGroups(), QStringList({str("File"), str("Edit")}));
    delete cut;
    QTRY_COMPARE(shownGroups(), QStringList({str("File")}));
    QVERIFY(isShown(row("open")));
}

void tst_ShortcutsThatGo::showsAGroupAgainThatIsUsedAgain()
{
    m_dialog->show();
    delete copy;
    delete cut;
    QTRY_COMPARE(shownGroups(), QStringList({str("File")}));
    addAction("paste", "Edit", QKeySequence());
    QTRY_COMPARE(shownGroups(), QStringList({str("File"), str("Edit")}));
    QVERIFY(isShown(row("paste")));
}

void tst_ShortcutsThatGo::hidesAGroupThatIsEmptyWhenTheDialogOpens()
{
    delete copy;
    delete cut;
    EditShortcutsDialog dialog(m_model.get());
    auto *view = dialog.findChild<ShortcutsTreeView *>(str("treeView"));
    QVERIFY(view->isRowHidden(1, QModelIndex()));
    QVERIFY(!view->isRowHidden(0, QModelIndex()));
}

void tst_ShortcutsThatGo::leavesTheHeaderOfAGroupThatGoes()
{
    m_dialog->show();
    tree()->setCurrentIndex(m_model->index(1, 0));
    delete copy;
    delete cut;
    QTRY_VERIFY(!tree()->currentIndex().isValid());
}

void tst_ShortcutsThatGo::opensAGroupThatIsRegisteredLater()
{
    m_dialog->show();
    addAction("zoom", "View", QKeySequence());
    QTRY_VERIFY(isShown(row("zoom")));
    QVERIFY(tree()->isExpanded(m_model->index(2, 0)));
}

void tst_ShortcutsThatGo::leavesAGroupClosedThatTheUserClosed()
{
    m_dialog->show();
    tree()->collapse(m_model->index(1, 0));
    addAction("paste", "Edit", QKeySequence());
    addAction("zoom", "View", QKeySequence());
    QTRY_VERIFY(isShown(row("zoom")));
    QVERIFY(!isShown(row("paste")));
}

void tst_ShortcutsThatGo::asksNothingWhenTheModelIsGone()
{
    const ModalDriver modal;
    m_dialog->show();
    m_dialog->setChanged(true);
    m_model.reset();
    QVERIFY(!isChanged());
    m_dialog->setChanged(true);
    QVERIFY(m_dialog->close());
    QVERIFY(modal.finished());
}

VEL_TEST_MAIN(tst_ShortcutsThatGo)

#include "tst_ShortcutsThatGo.moc"
