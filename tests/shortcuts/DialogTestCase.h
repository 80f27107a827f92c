// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EditShortcutsDialog.h"
#include "ModalDriver.h"
#include "QtMajor.h"
#include "ShortcutsModel.h"
#include "TestCase.h"

#include <shortcuts/ShortcutsTreeView.h>

#include <QAction>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QPushButton>
#include <QRadioButton>

#include <memory>

/**
 * A dialog on five actions: "open" (F1), "save" (F2) and "print" (no key) in "File", "copy"
 * (F3) and "cut" (Ctrl+K, Ctrl+C) in "Edit"; rows are sorted by name.
 */
class DialogTestCase : public TestCase
{
    Q_OBJECT

protected Q_SLOTS:
    void init()
    {
        TestCase::init();
        qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
        m_owner.reset(new QObject);
        m_model.reset(new ShortcutsModel(nullptr, QString()));
        open = addAction("open", "File", QKeySequence(Qt::Key_F1));
        save = addAction("save", "File", QKeySequence(Qt::Key_F2));
        print = addAction("print", "File", QKeySequence());
        copy = addAction("copy", "Edit", QKeySequence(Qt::Key_F3));
        cut = addAction("cut", "Edit", VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C));
        m_dialog.reset(new EditShortcutsDialog(m_model.get()));
    }

    void cleanup()
    {
        m_dialog.reset();
        m_model.reset();
        m_owner.reset();
        qunsetenv("VEL_CONFIG_HOME");
        TestCase::cleanup();
    }

protected:
    static inline const QKeySequence f1{Qt::Key_F1};
    static inline const QKeySequence f2{Qt::Key_F2};
    static inline const QKeySequence f9{Qt::Key_F9};

    static QString str(const char *text) { return QString::fromLatin1(text); }

    QAction *addAction(const char *name, const char *group, const QKeySequence &key)
    {
        auto *action = new QAction(str("&Text of ") + str(name), m_owner.get());
        action->setShortcut(key);
        m_model->registerAction(str(name), action, str(group));
        return action;
    }

    QModelIndex row(const char *name) const
    {
        for (int group = 0; group < m_model->rowCount(); ++group) {
            const QModelIndex parent = m_model->index(group, 0);
            for (int i = 0; i < m_model->rowCount(parent); ++i) {
                if (m_model->index(i, 0, parent).data().toString() == str("Text of ") + str(name))
                    return m_model->index(i, 0, parent);
            }
        }
        return {};
    }
    void select(const char *name) { tree()->setCurrentIndex(row(name)); }
    QKeySequence pendingKey(const char *name) const { return m_model->keySequence(row(name)); }

    template <typename Widget>
    Widget *child(const char *name) const
    {
        return m_dialog->findChild<Widget *>(str(name));
    }
    ShortcutsTreeView *tree() const { return child<ShortcutsTreeView>("treeView"); }
    QGroupBox *groupBox() const { return child<QGroupBox>("groupBox"); }
    QRadioButton *defaultButton() const { return child<QRadioButton>("defaultKeyRB"); }
    QRadioButton *customButton() const { return child<QRadioButton>("customKeyRB"); }
    QLabel *defaultLabel() const { return child<QLabel>("defaultKeyLabel"); }
    QKeySequenceEdit *keyWidget() const { return child<QKeySequenceEdit>("keyWidget"); }
    QPushButton *button(QDialogButtonBox::StandardButton which) const
    {
        return child<QDialogButtonBox>("buttonBox")->button(which);
    }
    bool isChanged() const
    {
        const bool changed = button(QDialogButtonBox::Ok)->isEnabled();
        return button(QDialogButtonBox::Reset)->isEnabled() == changed && changed;
    }

    ModalDriver::Box localConflict(const char *key, const char *action) const
    {
        return {QMessageBox::Critical, str("Shortcuts conflict"),
                str("Shortcut '%1' is already used for action '%2'. Please try another.")
                    .arg(str(key), str(action)),
                QMessageBox::Ok};
    }
    ModalDriver::Box globalConflict(const char *key, const char *action) const
    {
        return {QMessageBox::Critical, str("Shortcuts conflict"),
                str("Shortcut '%1' is already used for global action '%2'.").arg(str(key), str(action)),
                QMessageBox::Ok};
    }
    ModalDriver::Box closeQuestion() const
    {
        return {QMessageBox::Warning, str("Apply changes"),
                str("Some shortcuts have been changed. Do you want to apply changes?"),
                QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel, QMessageBox::Cancel};
    }

    std::unique_ptr<QObject> m_owner;
    std::unique_ptr<ShortcutsModel> m_model;
    std::unique_ptr<EditShortcutsDialog> m_dialog;
    QAction *open = nullptr;
    QAction *save = nullptr;
    QAction *print = nullptr;
    QAction *copy = nullptr;
    QAction *cut = nullptr;
};
