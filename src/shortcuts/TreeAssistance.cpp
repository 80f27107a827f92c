// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeAssistance.h"

#include "KeyColumn.h"
#include "ShortcutChange.h"
#include "ShortcutDelegate.h"
#include "ShortcutRows.h"
#include "ShortcutsTreeView.h"

#include <QAction>

TreeAssistance::TreeAssistance(ShortcutsTreeView *view, ShortcutsModel *shortcuts)
    : m_view(view)
    , m_model(shortcuts)
    , m_spokenChanges(shortcuts)
    , m_delegate(std::make_unique<ShortcutDelegate>(view))
{
    m_plainDelegate = m_view->itemDelegate();
    m_view->setItemDelegate(m_delegate.get());
    m_keyColumn = std::make_unique<KeyColumn>(m_view);
    connect(m_delegate.get(), &ShortcutDelegate::resetRequested, this, &TreeAssistance::reset);
    addResetAction();
    // The name of a changed row stands out, too, and the view paints the cell of the key alone.
    if (m_model)
        connect(m_model, &QAbstractItemModel::dataChanged, m_delegate.get(),
                [this](const QModelIndex &topLeft) { m_view->update(topLeft.siblingAtColumn(0)); });
}

TreeAssistance::~TreeAssistance()
{
    m_view->setContextMenuPolicy(Qt::DefaultContextMenu);
    m_view->setItemDelegate(m_plainDelegate);
}

// For those who have no mouse.
void TreeAssistance::addResetAction()
{
    m_resetAction = std::make_unique<QAction>(tr("&Reset this shortcut"));
    m_resetAction->setObjectName(QStringLiteral("resetAction"));
    m_resetAction->setShortcut(QKeySequence(Qt::Key_Backspace));
    m_resetAction->setShortcutContext(Qt::WidgetShortcut);
    m_view->addAction(m_resetAction.get());
    m_view->setContextMenuPolicy(Qt::ActionsContextMenu);
    connect(m_resetAction.get(), &QAction::triggered, this, [this] { reset(m_view->currentIndex()); });
    connect(m_view, &ShortcutsTreeView::currentShortcutChanged, this, &TreeAssistance::enableReset);
    connect(m_view, &ShortcutsTreeView::currentItemIsNotShortcut, this, &TreeAssistance::enableReset);
    enableReset();
}

void TreeAssistance::enableReset()
{
    const IShortcutObject *object = m_model ? ShortcutRows::at(*m_model, m_view->currentIndex()) : nullptr;
    m_resetAction->setEnabled(object && ShortcutChange::isChanged(*object));
}

void TreeAssistance::reset(const QModelIndex &index)
{
    const IShortcutObject *object = m_model ? ShortcutRows::at(*m_model, index) : nullptr;
    if (!object || !ShortcutChange::isChanged(*object))
        return;
    m_model->setKeySequence(index, ShortcutChange::keyBefore(*object));
    Q_EMIT keysChanged();
}
