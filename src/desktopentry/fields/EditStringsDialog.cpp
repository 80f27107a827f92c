// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditStringsDialog.h"

#include "EditableListWidget.h"

namespace VelUI {

namespace {

const ListDialogForm::Names FormNames = {
    "EditStringsDialog",
    QT_TRANSLATE_NOOP("EditStringsDialog", "Strings"),
};

} // namespace

EditStringsDialog::EditStringsDialog(const QStringList &strings, QWidget *parent)
    : QDialog(parent)
    , m_listWidget(new EditableListWidget(this))
{
    m_ui.setupUi(this, m_listWidget, FormNames);
    m_listWidget->setStrings(strings);
    connect(m_listWidget, &EditableListWidget::changed, this, [this] { setChanged(true); });
    setChanged(false);
}

QStringList EditStringsDialog::strings() const
{
    return m_listWidget->strings();
}

void EditStringsDialog::setInputFunction(InputFunction function)
{
    m_listWidget->setInputFunction(function);
}

void EditStringsDialog::setTexts(const QString &addTitle, const QString &addLabel, const QString &editTitle,
                                 const QString &editLabel)
{
    m_listWidget->setTexts(addTitle, addLabel, editTitle, editLabel);
}

void EditStringsDialog::setChanged(bool changed)
{
    m_ui.setOkEnabled(changed);
}

} // namespace VelUI
