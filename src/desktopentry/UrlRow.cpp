// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "UrlRow.h"

#include "fields/FormLayout.h"
#include "fields/NamedField.h"
#include "fields/PlainFields.h"

#include <QHBoxLayout>
#include <QStyle>
#include <QToolButton>

namespace VelUI {

UrlRow::UrlRow(FormLayout *layout)
    : UrlRow(layout, makeRow(layout))
{
}

UrlRow::UrlRow(FormLayout *layout, const Field &field)
    : PropsRow(ShownFor::Links, layout, field.number)
    , m_number(field.number)
    , m_line(field.line)
    , m_infoButton(field.button)
{
}

UrlRow::Field UrlRow::makeRow(FormLayout *layout)
{
    QWidget *const parent = layout->parentWidget();
    auto *line = makeField<QLineEdit>("urlEdit", parent);
    auto *button = makeField<QToolButton>("urlInfoButton", parent);
    button->setIcon(QIcon::fromTheme(QStringLiteral("document-properties"),
                                     parent->style()->standardIcon(QStyle::SP_FileDialogInfoView)));
    button->setToolTip(tr("Information about the URL"));
    button->setAccessibleName(button->toolTip());
    button->hide();

    auto *field = new QHBoxLayout;
    field->setContentsMargins(0, 0, 0, 0);
    field->addWidget(line);
    field->addWidget(button);
    const int number = layout->addRow(tr("Url"), field);
    layout->setRowLabelBold(number);
    return {line, button, number};
}

QString UrlRow::url() const
{
    return fieldValue(m_line);
}

QToolButton *UrlRow::infoButton() const
{
    return m_infoButton;
}

void UrlRow::setInfoButtonWanted(bool wanted)
{
    if (wanted == m_isInfoButtonWanted)
        return;
    m_isInfoButtonWanted = wanted;
    m_infoButton->setVisible(wanted && m_isVisible);
}

FormRow UrlRow::row() const
{
    return {QStringLiteral("URL"), tr("Url"), ShownFor::Links, {}, m_number, m_line};
}

void UrlRow::setVisible(bool visible)
{
    m_isVisible = visible;
    PropsRow::setVisible(visible);
    m_infoButton->setVisible(visible && m_isInfoButtonWanted);
}

void UrlRow::load(const VelUIDesktopEntry &entry)
{
    setFieldValue(m_line, entry.getURL());
}

void UrlRow::save(VelUIDesktopEntry *entry) const
{
    entry->setURL(url());
}

void UrlRow::putAway()
{
    m_kept.putAway(m_line);
}

void UrlRow::restore()
{
    m_kept.restore(m_line);
}

void UrlRow::forget()
{
    m_kept.forget();
}

} // namespace VelUI
