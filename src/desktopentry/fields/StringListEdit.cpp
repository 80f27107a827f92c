// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StringListEdit.h"

#include "EditStringsDialog.h"

#include <frame/GuardedDialog.h>

#include <QToolButton>

namespace VelUI {

namespace {

const ListLineForm::Names FormNames = {
    "StringListEdit",
    "stringListShow",
    "editStringsButton",
    QT_TRANSLATE_NOOP("StringListEdit", "Form"),
    QT_TRANSLATE_NOOP("StringListEdit", "..."),
};

} // namespace

StringListEdit::StringListEdit(QWidget *parent)
    : QWidget(parent)
{
    m_ui.setupUi(this, FormNames);
    connect(m_ui.button, &QToolButton::clicked, this, &StringListEdit::editStrings);
}

void StringListEdit::setStrings(const QStringList &strings)
{
    m_strings = strings;
    m_ui.show(m_strings);
}

QStringList StringListEdit::strings() const
{
    return m_strings;
}

void StringListEdit::clear()
{
    setStrings({});
}

void StringListEdit::setTexts(const QString &title, const QString &addTitle, const QString &addLabel,
                              const QString &editTitle, const QString &editLabel)
{
    m_title = title;
    m_addTitle = addTitle;
    m_addLabel = addLabel;
    m_editTitle = editTitle;
    m_editLabel = editLabel;
}

void StringListEdit::setInputFunction(InputFunction function)
{
    m_inputFunction = function;
}

void StringListEdit::setReadOnly(bool readOnly)
{
    m_ui.setReadOnly(readOnly);
}

bool StringListEdit::hasPromptTexts() const
{
    return !m_addTitle.isNull() || !m_addLabel.isNull() || !m_editTitle.isNull() || !m_editLabel.isNull();
}

void StringListEdit::editStrings()
{
    GuardedDialog<EditStringsDialog> dialog(m_strings, this);
    dialog->setWindowTitle(m_title);
    if (m_inputFunction)
        dialog->setInputFunction(m_inputFunction);
    if (hasPromptTexts())
        dialog->setTexts(m_addTitle, m_addLabel, m_editTitle, m_editLabel);
    if (!dialog.run())
        return;
    setStrings(dialog->strings());
    Q_EMIT changed();
}

QStringList fieldValue(const StringListEdit *field)
{
    return field->strings();
}

void setFieldValue(StringListEdit *field, const QStringList &value)
{
    field->setStrings(value);
}

} // namespace VelUI
