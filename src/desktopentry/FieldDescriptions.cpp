// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FieldDescriptions.h"

#include "KeyDescription.h"
#include "LanguageRows.h"
#include "fields/FormLayout.h"

#include <QAbstractButton>
#include <QLineEdit>

#include <utility>

namespace VelUI {

FieldDescriptions::FieldDescriptions(EntryFormHost &form, LanguageRows &rows)
    : m_form(form)
    , m_rows(rows)
{
    connect(&m_rows, &LanguageRows::turned, this, &FieldDescriptions::describe);
    describe();
}

FieldDescriptions::~FieldDescriptions()
{
    for (const QPointer<QWidget> &widget : std::as_const(m_described)) {
        if (widget)
            widget->setAccessibleDescription(QString());
    }
    for (const QPointer<QWidget> &widget : std::as_const(m_tipped)) {
        if (widget)
            widget->setToolTip(QString());
    }
}

void FieldDescriptions::describe()
{
    for (const FormRow &row : m_rows.rows()) {
        const QString text =
            row.isTranslation() ? KeyDescription::ofTranslation(row.key) : KeyDescription::of(row.key);
        setDescription(row.field, text);
        const auto lines = row.field->findChildren<QLineEdit *>();
        for (QLineEdit *line : lines)
            setDescription(line, text);
        QWidget *const label = m_form.formLayout()->labelOf(row.number);
        setTip(label, text);
        if (qobject_cast<QAbstractButton *>(label))
            setDescription(label, text);
    }
}

// Others add to it.
void FieldDescriptions::setDescription(QWidget *widget, const QString &text)
{
    if (m_described.contains(widget) || !widget->accessibleDescription().isEmpty())
        return;
    widget->setAccessibleDescription(text);
    m_described.append(widget);
}

void FieldDescriptions::setTip(QWidget *widget, const QString &text)
{
    if (m_tipped.contains(widget) || !widget->toolTip().isEmpty())
        return;
    widget->setToolTip(text);
    m_tipped.append(widget);
}

} // namespace VelUI
