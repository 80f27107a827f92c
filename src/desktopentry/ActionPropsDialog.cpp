// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionPropsDialog.h"

#include "fields/FormLayout.h"
#include "fields/IconEdit.h"
#include "fields/LocalizedLabel.h"
#include "fields/NamedField.h"
#include "fields/PathEdit.h"
#include "fields/PlainFields.h"
#include "fields/ShowInChoice.h"
#include "fields/StringListEdit.h"

#include <QDialogButtonBox>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace VelUI {

namespace {

bool isBlank(const QString &text)
{
    return text.trimmed().isEmpty();
}

} // namespace

ActionPropsDialog::ActionPropsDialog(const VelUIDesktopAction &action, QWidget *parent)
    : QDialog(parent)
{
    build();
    load(action);
    connectChanges();
    setChanged(false);
}

void ActionPropsDialog::build()
{
    auto *layout = new QVBoxLayout(this);
    auto *form = new FormLayout;
    layout->addLayout(form);
    addRows(form);

    layout->addStretch();
    m_buttonBox = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    m_buttonBox->setObjectName(QStringLiteral("buttonBox"));
    layout->addWidget(m_buttonBox);
    connect(m_buttonBox, &QDialogButtonBox::accepted, this, &ActionPropsDialog::accept);
    connect(m_buttonBox, &QDialogButtonBox::rejected, this, &ActionPropsDialog::reject);
}

void ActionPropsDialog::addRows(FormLayout *layout)
{
    m_id = makeField<QLineEdit>("idEdit", this);
    layout->setRowLabelBold(layout->addRow(tr("Id"), m_id));
    m_name = makeField<QLineEdit>("nameEdit", this);
    layout->setRowLabelBold(layout->addRow(tr("Name"), m_name));
    m_localName = makeField<QLineEdit>("localNameEdit", this);
    layout->addRow(localizedLabel(tr("Name")), m_localName);
    m_icon = makeField<IconEdit>("iconEdit", this);
    layout->addRow(tr("Icon"), m_icon);
    m_localIcon = makeField<IconEdit>("localIconEdit", this);
    layout->addRow(localizedLabel(tr("Icon")), m_localIcon);
    m_showIn = new ShowInChoice({tr("Only show in"), tr("Not show in"), tr("Add desktop environment:"),
                                 tr("Edit desktop environment:")},
                                layout);
    m_exec = makeField<PathEdit>("execEdit", this);
    layout->setRowLabelBold(layout->addRow(tr("Exec"), m_exec));
}

void ActionPropsDialog::load(const VelUIDesktopAction &action)
{
    setFieldValue(m_id, action.getId());
    setFieldValue(m_name, action.getName());
    setFieldValue(m_localName, action.getLocalName());
    setFieldValue(m_icon, action.getIcon());
    setFieldValue(m_localIcon, action.getLocalIcon());
    m_showIn->load(action);
    setFieldValue(m_exec, action.getExec());
}

void ActionPropsDialog::connectChanges()
{
    const auto mark = [this] { setChanged(true); };
    for (QLineEdit *line : findChildren<QLineEdit *>())
        connect(line, &QLineEdit::textEdited, this, mark);
    for (IconEdit *icon : {m_icon, m_localIcon})
        connect(icon, &IconEdit::iconChanged, this, mark);
    connect(m_exec, &PathEdit::changed, this, mark);
    for (StringListEdit *list : findChildren<StringListEdit *>())
        connect(list, &StringListEdit::changed, this, mark);
}

VelUIDesktopAction ActionPropsDialog::action() const
{
    VelUIDesktopAction action(m_id->text());
    action.setName(m_name->text());
    action.setLocalName(m_localName->text());
    action.setIcon(m_icon->icon());
    action.setLocalIcon(m_localIcon->icon());
    m_showIn->save(&action);
    action.setExec(m_exec->text());
    return action;
}

void ActionPropsDialog::setChanged(bool changed)
{
    const bool complete = !isBlank(m_name->text()) && !isBlank(m_id->text()) && !isBlank(m_exec->text());
    m_buttonBox->button(QDialogButtonBox::Ok)->setEnabled(changed && complete);
}

} // namespace VelUI
