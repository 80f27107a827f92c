// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutsModel.h"
#include "SpokenChanges.h"

#include <QObject>
#include <QPointer>

#include <memory>

class KeyColumn;
class QAbstractItemDelegate;
class QAction;
class ShortcutDelegate;
class ShortcutsTreeView;

/**
 * Shows the keys in a tree of shortcuts at a glance: always in view, with what is changed and the
 * way back.
 *
 * When it is destroyed the tree is as it was.
 */
class TreeAssistance : public QObject
{
    Q_OBJECT

public:
    /// Completes \a view, which shows \a shortcuts, or nothing when that is null.
    TreeAssistance(ShortcutsTreeView *view, ShortcutsModel *shortcuts);
    ~TreeAssistance() override;

    KeyColumn *keyColumn() const { return m_keyColumn.get(); }

Q_SIGNALS:
    /// A change was taken back.
    void keysChanged();

private:
    void addResetAction();
    void enableReset();
    void reset(const QModelIndex &index);

    ShortcutsTreeView *const m_view;
    const QPointer<ShortcutsModel> m_model;
    const SpokenChanges m_spokenChanges;
    QAbstractItemDelegate *m_plainDelegate = nullptr;
    std::unique_ptr<ShortcutDelegate> m_delegate;
    std::unique_ptr<KeyColumn> m_keyColumn;
    std::unique_ptr<QAction> m_resetAction;
};
