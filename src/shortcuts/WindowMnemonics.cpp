// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "WindowMnemonics.h"

#include <QAbstractButton>
#include <QAction>
#include <QGroupBox>
#include <QLabel>
#include <QMenuBar>
#include <QTabBar>

namespace {

QString withoutMark(const QString &marked)
{
    QString text;
    for (int i = 0; i < marked.size(); ++i) {
        // The first of two stands for the second.
        if (marked.at(i) == QLatin1Char('&') && ++i == marked.size())
            break;
        text += marked.at(i);
    }
    return text;
}

// The texts of a widget whose letters it answers to.
QStringList markedTexts(const QWidget &widget)
{
    if (const auto *button = qobject_cast<const QAbstractButton *>(&widget))
        return {button->text()};
    if (const auto *label = qobject_cast<const QLabel *>(&widget))
        return label->buddy() ? QStringList{label->text()} : QStringList();
    // The radio group box underlines a letter, too, but does not answer to it.
    if (const auto *box = qobject_cast<const QGroupBox *>(&widget))
        return widget.inherits("VelRadioGroupBox") ? QStringList() : QStringList{box->title()};
    QStringList texts;
    if (const auto *bar = qobject_cast<const QTabBar *>(&widget)) {
        for (int tab = 0; tab < bar->count(); ++tab)
            texts.append(bar->tabText(tab));
    }
    return texts;
}

QStringList menuTexts(const QMenuBar &bar)
{
    QStringList texts;
    const QList<QAction *> actions = bar.actions();
    for (const QAction *action : actions) {
        if (action->isVisible())
            texts.append(action->text());
    }
    return texts;
}

} // namespace

QVector<WindowMnemonics::Owner> WindowMnemonics::ownersOf(const QWidget &window, const QKeySequence &key)
{
    QVector<Owner> menus;
    QVector<Owner> others;
    const QList<QWidget *> widgets = window.findChildren<QWidget *>();
    for (const QWidget *widget : widgets) {
        // A dialog is a child of its window, too.
        if (widget->window() != window.window() || !widget->isVisibleTo(&window))
            continue;
        const auto *bar = qobject_cast<const QMenuBar *>(widget);
        const QStringList texts = bar ? menuTexts(*bar) : markedTexts(*widget);
        for (const QString &text : texts) {
            if (text.contains(QLatin1Char('&')) && QKeySequence::mnemonic(text) == key)
                (bar ? menus : others).append({withoutMark(text), bar != nullptr});
        }
    }
    return menus + others;
}
