// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryFormAssistance.h"

#include "FieldEdit.h"
#include "FormHistory.h"
#include "LanguageBar.h"
#include "LanguageRows.h"
#include "fields/FormLayout.h"
#include "fields/RowSlot.h"
#include "fields/TabOrder.h"

#include <QAction>
#include <QToolButton>

#include <algorithm>

namespace VelUI {

EntryFormAssistance::EntryFormAssistance(EntryFormHost &form)
    : m_form(form)
    , m_rows(form.formRows())
{
    m_form.formLayout()->spread();
    m_languageRows = std::make_unique<LanguageRows>(m_form, m_rows);
    m_bar = std::make_unique<LanguageBar>(m_form, *m_languageRows);
    m_history = std::make_unique<FormHistory>(m_form, *m_languageRows);
    addAction("undoButton", m_history->undoAction());
    addAction("redoButton", m_history->redoAction());
    connect(&m_form, &EntryFormHost::recordChanged, this, &EntryFormAssistance::recordChanged);
}

EntryFormAssistance::~EntryFormAssistance()
{
    m_history.reset();
    m_bar.reset();
    m_languageRows.reset();
    m_form.formLayout()->pack();
}

const QVector<FormRow> &EntryFormAssistance::rows() const
{
    return m_rows;
}

const FormRow *EntryFormAssistance::row(const QString &key) const
{
    const auto found = std::find_if(rows().begin(), rows().end(), [&key](const FormRow &row) {
        return !row.isTranslation() && row.key == key;
    });
    return found == rows().end() ? nullptr : &*found;
}

bool EntryFormAssistance::isShown(const FormRow &row) const
{
    return m_form.formLayout()->isRowVisible(row.number);
}

void EntryFormAssistance::addBeside(const FormRow &row, QWidget *widget)
{
    m_form.formLayout()->addBeside(row.number, row.field, widget);
}

void EntryFormAssistance::addBelow(const FormRow &row, QWidget *widget)
{
    RowSlot *const slot = m_form.formLayout()->belowRow(row.number);
    RowSlot *const beside = m_form.formLayout()->usedBesideRow(row.number);
    QWidget *const last =
        beside ? TabOrder::lastOf({row.field, beside, slot}) : TabOrder::lastOf({row.field, slot});
    slot->add(widget);
    TabOrder::putBehind(last, widget);
}

void EntryFormAssistance::addAction(const char *name, QAction *action)
{
    auto *button = new QToolButton;
    button->setObjectName(QLatin1String(name));
    button->setDefaultAction(action);
    button->setFocusPolicy(Qt::StrongFocus);
    m_bar->addButton(button);
}

void EntryFormAssistance::edit(const FormRow &row, const QVariant &value)
{
    m_history->beginStep();
    FieldEdit::setValue(row.field, value);
    m_history->beginStep();
}

VelUIDesktopEntry EntryFormAssistance::record() const
{
    return m_form.record();
}

} // namespace VelUI
