// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShowInChoice.h"

#include "StringListEdit.h"

#include <QButtonGroup>

namespace VelUI {

RowRadioButton::RowRadioButton(const QString &text, QWidget *parent)
    : QRadioButton(text, parent)
{
}

void RowRadioButton::focusInEvent(QFocusEvent *event)
{
    // Takes Tab away from the others of the group.
    QRadioButton::focusInEvent(event);
    const QList<QAbstractButton *> buttons = group() ? group()->buttons() : QList<QAbstractButton *>();
    for (QAbstractButton *button : buttons)
        button->setFocusPolicy(Qt::StrongFocus);
}

void ShowInChoice::connectUp(QObject *owner) const
{
    auto *group = new QButtonGroup(owner);
    group->setExclusive(true);
    group->addButton(onlyButton);
    group->addButton(notButton);
    onlyButton->setChecked(true);
    notList->setEnabled(false);
    QObject::connect(onlyButton, &QRadioButton::toggled, onlyList, &QWidget::setEnabled);
    QObject::connect(onlyButton, &QRadioButton::toggled, notList, &QWidget::setDisabled);
}

void ShowInChoice::load(const QStringList &only, const QStringList &no) const
{
    onlyList->setStrings(only);
    notList->setStrings(no);
    (no.isEmpty() ? onlyButton : notButton)->setChecked(true);
}

} // namespace VelUI
