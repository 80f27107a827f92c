// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PathEdit.h"

#include <frame/GuardedDialog.h>

#include <QFileDialog>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QToolButton>

#include <climits>

namespace VelUI {

PathEdit::PathEdit(QWidget *parent)
    : QWidget(parent)
    , m_lineEdit(new QLineEdit(this))
    , m_button(new QToolButton(this))
{
    m_lineEdit->setObjectName(QStringLiteral("lineEdit"));
    m_lineEdit->setMaxLength(INT_MAX);
    m_button->setObjectName(QStringLiteral("selectPathButton"));
    m_button->setText(tr("..."));
    m_button->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Preferred);

    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_lineEdit);
    layout->addWidget(m_button);
    setFocusProxy(m_lineEdit);

    connect(m_lineEdit, &QLineEdit::textChanged, this, &PathEdit::changed);
    connect(m_button, &QToolButton::clicked, this, &PathEdit::selectPathButtonClicked);
}

QString PathEdit::text() const
{
    return m_lineEdit->text();
}

void PathEdit::setReadOnly(bool readOnly)
{
    m_lineEdit->setReadOnly(readOnly);
    m_button->setVisible(!readOnly);
}

void PathEdit::clear()
{
    m_lineEdit->clear();
}

void PathEdit::setText(const QString &text)
{
    m_lineEdit->setText(text);
    m_lineEdit->setCursorPosition(0); // the program is what matters
}

void PathEdit::selectPathButtonClicked()
{
    // Qt's own function keeps the dialog on the stack, where it must not be deleted with this field.
    GuardedDialog<QFileDialog> dialog(this, tr("Choose application exec path"), QStringLiteral("/usr/bin"));
    dialog->setFileMode(QFileDialog::ExistingFile);
    dialog->setSupportedSchemes({QStringLiteral("file")});
    if (!dialog.run())
        return;
    const QString chosen = dialog->selectedFiles().value(0);
    if (!chosen.isNull())
        setText(chosen);
}

QString fieldValue(const PathEdit *field)
{
    return field->text();
}

void setFieldValue(PathEdit *field, const QString &value)
{
    field->setText(value);
}

} // namespace VelUI
