// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// What happens to a key, on a window that is no more than a frame for the form.

#include "KeyTestObject.h"
#include "TestCase.h"

#include <shortcuts/EditShortcutsDialogPrivate.h>
#include <shortcuts/ShortcutsTreeView.h>

#include <QDialog>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QRadioButton>

#include <memory>

class tst_EditShortcutsDialogPrivate : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void followsAKeyFromTheFieldToTheModel();
    void takesTheDefaultKeyWhenItsButtonIsChosen();
    void putsEditsIntoForceOnlyOnCommit();
    void discardsEdits();
    void leavesTheFormAloneOnceItIsGone();

private:
    void select(QAbstractItemView *view) const
    {
        view->setCurrentIndex(m_model->index(0, 0, m_model->index(0, 0)));
    }

    const QKeySequence m_f1{Qt::Key_F1};
    const QKeySequence m_f9{Qt::Key_F9};
    std::unique_ptr<ShortcutsModel> m_model;
    std::unique_ptr<QDialog> m_window;
    std::unique_ptr<EditShortcutsDialogPrivate> m_logic;
    KeyTestObject *m_object = nullptr;
};

void tst_EditShortcutsDialogPrivate::init()
{
    TestCase::init();
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    m_model = std::make_unique<ShortcutsModel>(nullptr, QString());
    m_object = new KeyTestObject(QStringLiteral("open"), QStringLiteral("File"), m_f1);
    m_model->registerShortcutObject(m_object);
    m_window = std::make_unique<QDialog>();
    m_logic = std::make_unique<EditShortcutsDialogPrivate>(m_window.get(), m_model.get());
    select(m_logic->form.treeView);
}

void tst_EditShortcutsDialogPrivate::cleanup()
{
    m_logic.reset();
    m_window.reset();
    m_model.reset();
    qunsetenv("VEL_CONFIG_HOME");
    TestCase::cleanup();
}

void tst_EditShortcutsDialogPrivate::followsAKeyFromTheFieldToTheModel()
{
    m_logic->form.customKeyRB->setChecked(true);
    QVERIFY(!m_logic->isChanged());
    m_logic->form.keyWidget->setKeySequence(m_f9);
    QCOMPARE(m_object->keySequence(), m_f9);
    QVERIFY(m_logic->isChanged());
}

void tst_EditShortcutsDialogPrivate::takesTheDefaultKeyWhenItsButtonIsChosen()
{
    m_logic->entry().enter(m_f9);
    QVERIFY(m_logic->form.customKeyRB->isChecked());
    m_logic->enterDefaultKey();
    QCOMPARE(m_object->keySequence(), m_f9);
    m_logic->form.defaultKeyRB->setChecked(true);
    QCOMPARE(m_object->keySequence(), m_f1);
}

void tst_EditShortcutsDialogPrivate::putsEditsIntoForceOnlyOnCommit()
{
    m_logic->entry().enter(m_f9);
    QCOMPARE(m_object->inForce, m_f1);
    m_logic->commit();
    QCOMPARE(m_object->inForce, m_f9);
}

void tst_EditShortcutsDialogPrivate::discardsEdits()
{
    m_logic->entry().enter(m_f9);
    m_logic->discard();
    QCOMPARE(m_object->keySequence(), m_f1);
    QVERIFY(!m_logic->isChanged());
}

void tst_EditShortcutsDialogPrivate::leavesTheFormAloneOnceItIsGone()
{
    const EditShortcutsForm form = m_logic->form;
    m_logic.reset();
    form.keyWidget->setKeySequence(m_f9);
    form.treeView->setCurrentIndex(QModelIndex());
    QCOMPARE(m_object->keySequence(), m_f1);
    QVERIFY(form.groupBox->isEnabled());
    m_model.reset();
    QVERIFY(form.groupBox->isEnabled());
}

VEL_TEST_MAIN(tst_EditShortcutsDialogPrivate)

#include "tst_EditShortcutsDialogPrivate.moc"
