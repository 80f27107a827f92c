// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditActionsDialog.h"

#include "EditActionsWidget.h"

namespace VelUI {

namespace {

const ListDialogForm::Names FormNames = {
    "EditActionsDialog",
    QT_TRANSLATE_NOOP("EditActionsDialog", "Actions"),
};

} // namespace

EditActionsDialog::EditActionsDialog(const QList<VelUIDesktopAction> &actions, QWidget *parent)
    : QDialog(parent)
    , m_listWidget(new EditActionsWidget(this))
{
    m_ui.setupUi(this, m_listWidget, FormNames);
    m_listWidget->setActions(actions);
    connect(m_listWidget, &EditActionsWidget::changed, this, [this] { setChanged(true); });
    setChanged(false);
}

QList<VelUIDesktopAction> EditActionsDialog::actions() const
{
    return m_listWidget->actions();
}

void EditActionsDialog::setTexts(const QString &addTitle, const QString &editTitle)
{
    m_listWidget->setTexts(addTitle, editTitle);
}

void EditActionsDialog::setChanged(bool changed)
{
    m_ui.setOkEnabled(changed);
}

} // namespace VelUI
