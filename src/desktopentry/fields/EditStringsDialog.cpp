// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditStringsDialog.h"

#include "EditableListWidget.h"
#include "ListMessage.h"

#include <algorithm>

namespace VelUI {

namespace {

const ListDialogForm::Names FormNames = {
    "EditStringsDialog",
    QT_TRANSLATE_NOOP("EditStringsDialog", "Strings"),
};

constexpr QChar Semicolon = QLatin1Char(';');

// The row of the first string with a semicolon; the number of strings where there is none.
int rowOfSemicolon(const QStringList &strings)
{
    const auto found = std::find_if(strings.begin(), strings.end(),
                                    [](const QString &string) { return string.contains(Semicolon); });
    return int(found - strings.begin());
}

QStringList partsOf(const QString &string)
{
    QStringList parts;
    for (const QString &part : string.split(Semicolon)) {
        if (!part.trimmed().isEmpty())
            parts.append(part.trimmed());
    }
    return parts;
}

} // namespace

EditStringsDialog::EditStringsDialog(const QStringList &strings, QWidget *parent)
    : QDialog(parent)
    , m_listWidget(new EditableListWidget(this))
{
    m_ui.setupUi(this, m_listWidget, FormNames);
    m_listWidget->setStrings(strings);
    m_ui.repair = [this] { splitAtSemicolons(); };
    connect(m_listWidget, &EditableListWidget::changed, this, [this] {
        setChanged(true);
        tellOfSemicolons();
    });
    setChanged(false);
    tellOfSemicolons();
}

void EditStringsDialog::tellOfSemicolons()
{
    const QStringList all = strings();
    const int row = rowOfSemicolon(all);
    if (row == all.size()) {
        m_ui.tell(QString(), QString());
        return;
    }
    const int count = partsOf(all.at(row)).size();
    m_ui.tell(tr("The \";\" in \"%1\" does not separate items, it becomes part of one item.")
                  .arg(ListMessage::shortened(all.at(row))),
              count == 0 ? QString() : tr("Make %n item(s) of it", nullptr, count));
}

void EditStringsDialog::splitAtSemicolons()
{
    QStringList all = strings();
    const int row = rowOfSemicolon(all);
    const QStringList parts = partsOf(all.value(row));
    if (parts.isEmpty())
        return;
    all.removeAt(row);
    for (int i = 0; i < parts.size(); ++i)
        all.insert(row + i, parts.at(i));
    m_listWidget->setStrings(all);
    m_listWidget->select(row);
    m_listWidget->setFocus();
    setChanged(true);
    tellOfSemicolons();
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
