// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryFormAssistance.h"

#include "EntryTextDialog.h"
#include "FieldDescriptions.h"
#include "FieldEdit.h"
#include "FormHistory.h"
#include "LanguageBar.h"
#include "LanguageRows.h"
#include "TrialLine.h"
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
    m_descriptions = std::make_unique<FieldDescriptions>(m_form, *m_languageRows);
    addHistory();
    addText();
    addTrial();
    // Who shows something beside a field has to look anew.
    connect(m_languageRows.get(), &LanguageRows::turned, this, &EntryFormAssistance::recordChanged);
    connect(&m_form, &EntryFormHost::recordChanged, this, &EntryFormAssistance::recordChanged);
}

EntryFormAssistance::~EntryFormAssistance()
{
    releaseRows();
    // What other parts did is taken back first.
    qDeleteAll(findChildren<QObject *>(QString(), Qt::FindDirectChildrenOnly));
    m_text.reset();
    m_trial.reset();
    m_history.reset();
    m_descriptions.reset();
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

void EntryFormAssistance::holdRows()
{
    m_form.formLayout()->holdRows();
}

void EntryFormAssistance::showAhead(const FormRow &row)
{
    m_form.formLayout()->showAhead(row.number);
}

void EntryFormAssistance::releaseRows()
{
    m_form.formLayout()->releaseRows();
}

QToolButton *EntryFormAssistance::addButton(const char *name)
{
    auto *button = new QToolButton;
    button->setObjectName(QLatin1String(name));
    button->setFocusPolicy(Qt::StrongFocus);
    m_bar->addButton(button);
    return button;
}

void EntryFormAssistance::addHistory()
{
    m_history = std::make_unique<FormHistory>(m_form, *m_languageRows);
    addButton("undoButton")->setDefaultAction(m_history->undoAction());
    addButton("redoButton")->setDefaultAction(m_history->redoAction());
}

void EntryFormAssistance::addText()
{
    m_textButton = addButton("textButton");
    m_textButton->setText(tr("Te&xt", "button: shows the file of the entry"));
    m_textButton->setToolTip(tr("Shows the file as it would be saved"));
    m_textButton->setCheckable(true);
    connect(m_textButton, &QToolButton::toggled, this, &EntryFormAssistance::showText);
}

void EntryFormAssistance::showText(bool isShown)
{
    if (!isShown) {
        // It may be in the middle of telling that it was closed.
        if (m_text)
            m_text.release()->deleteLater();
        return;
    }
    m_text = std::make_unique<EntryTextDialog>(
        m_form, QList<QAction *>{m_history->undoAction(), m_history->redoAction()});
    connect(m_text.get(), &QDialog::finished, m_textButton, [this] { m_textButton->setChecked(false); });
    m_text->show();
}

void EntryFormAssistance::addTrial()
{
    m_trial = std::make_unique<TrialLine>(m_form, addButton("tryButton"));
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
