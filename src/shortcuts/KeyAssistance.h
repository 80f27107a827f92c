// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ClashLine.h"
#include "EditShortcutsForm.h"
#include "RowsListening.h"

#include <QKeySequence>
#include <QObject>
#include <QPointer>
#include <QTimer>

class ClashBox;
class IShortcutObject;
class QPushButton;
class ShortcutsModel;

/**
 * What helps with the key of the current shortcut: a button that takes it away, and a box that tells
 * what speaks against it.
 *
 * It puts both into the form when it is made and takes them out again when it is destroyed. What is
 * done with the keys others do: it only asks for it.
 */
class KeyAssistance : public QObject
{
    Q_OBJECT

public:
    /// Completes \a form, which shows \a shortcuts, or nothing when that is null.
    KeyAssistance(const EditShortcutsForm &form, ShortcutsModel *shortcuts);
    ~KeyAssistance() override;

    /// The key that is told of: the one in the key field, or else the pending one.
    QKeySequence key() const;
    /// Whether the focus is in the key field or in one of the widgets that act on what stands there.
    bool hasFocus() const;

Q_SIGNALS:
    /// The shortcut is to have no key.
    void noneChosen();
    /// The shortcut of that name is to be the current one.
    void goToRequested(const QString &otherName);
    /// The current shortcut is to have key(), and the one of that name is to give it away.
    void takeOverRequested(const QString &otherName);
    /// The focus went to another part of the window.
    void left();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void addNoneButton();
    void addClashBox();
    void describeKeyField(const QString &hint);
    void connectForm();
    void enterField();
    void orderTabs();
    void followFocus(const QWidget *now);
    void update();
    void showNames(const QString &text);
    QVector<ClashLine::Content> linesFor(const IShortcutObject &current) const;

    const EditShortcutsForm m_form;
    const QPointer<ShortcutsModel> m_model;
    const RowsListening m_rowsListening;
    QPointer<QPushButton> m_noneButton;
    QPointer<ClashBox> m_clashBox;
    QTimer m_timer; // many changes at once are shown once
};
