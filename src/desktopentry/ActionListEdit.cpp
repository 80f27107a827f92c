// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionListEdit.h"

#include "ActionIds.h"
#include "EditActionsDialog.h"

#include <frame/GuardedDialog.h>

#include <QToolButton>

namespace VelUI {

namespace {

const ListLineForm::Names FormNames = {
    "ActionListEdit",
    "actionListShow",
    "editActionsButton",
    QT_TRANSLATE_NOOP("ActionListEdit", "Form"),
    QT_TRANSLATE_NOOP("ActionListEdit", "..."),
};

} // namespace

ActionListEdit::ActionListEdit(QWidget *parent)
    : QWidget(parent)
{
    m_ui.setupUi(this, FormNames);
    connect(m_ui.button, &QToolButton::clicked, this, &ActionListEdit::editActions);
}

void ActionListEdit::setActions(const QList<VelUIDesktopAction> &actions)
{
    m_actions = actions;
    m_ui.show(ActionIds::of(m_actions));
}

QList<VelUIDesktopAction> ActionListEdit::actions() const
{
    return m_actions;
}

void ActionListEdit::setTexts(const QString &title, const QString &addTitle, const QString &editTitle)
{
    m_title = title;
    m_addTitle = addTitle;
    m_editTitle = editTitle;
}

void ActionListEdit::setReadOnly(bool readOnly)
{
    m_ui.setReadOnly(readOnly);
}

void ActionListEdit::editActions()
{
    GuardedDialog<EditActionsDialog> dialog(m_actions, this);
    dialog->setWindowTitle(m_title);
    if (!m_addTitle.isNull() || !m_editTitle.isNull())
        dialog->setTexts(m_addTitle, m_editTitle);
    if (!dialog.run())
        return;
    setActions(dialog->actions());
    Q_EMIT changed();
}

QList<VelUIDesktopAction> fieldValue(const ActionListEdit *field)
{
    return field->actions();
}

void setFieldValue(ActionListEdit *field, const QList<VelUIDesktopAction> &value)
{
    field->setActions(value);
}

} // namespace VelUI
