// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuDialogAssistance.h"

#include "MenuFilterBar.h"
#include "MessageLine.h"
#include "OnDisk.h"
#include "OpenedMenus.h"
#include "ToolBarExtension.h"
#include "ToolBarFocus.h"
#include "VelMenuView.h"
#include "VelMenuViewPrivate.h"

#include <QAction>
#include <QCoreApplication>
#include <QDialog>
#include <QEvent>
#include <QFileInfo>
#include <QShortcut>
#include <QToolBar>
#include <QVBoxLayout>

namespace {

constexpr int Warning = 1;

} // namespace

MenuDialogAssistance::MenuDialogAssistance(QDialog *dialog, QVBoxLayout *layout, VelMenuView *view,
                                           QToolBar *toolBar)
    : m_dialog(dialog)
    , m_view(view)
    , m_isEditable(toolBar)
    , m_toolBarFocus(toolBar ? std::make_unique<ToolBarFocus>(toolBar, view) : nullptr)
    , m_toolBarExtension(toolBar ? std::make_unique<ToolBarExtension>(toolBar) : nullptr)
    , m_filterBar(std::make_unique<MenuFilterBar>(view, dialog))
    , m_message(std::make_unique<MessageLine>(dialog))
{
    layout->insertWidget(layout->indexOf(view), m_filterBar.get());
    layout->insertWidget(layout->indexOf(view) + 1, m_message.get());
    m_filterBar->setTabOrderBefore(view);
    m_message->setTabOrderAfter(view);
    // The tree is what the keyboard belongs to when the dialog opens.
    if (!dialog->focusWidget())
        view->setFocus();
    m_message->setUndoAction(view->undoAction());
    connect(view, &VelMenuView::told, m_message.get(), [this](const QString &text, int kind) {
        m_message->tell(text, kind, VelMenuViewPrivate::voiceOf(*m_view).subject());
    });
    connect(m_filterBar.get(), &MenuFilterBar::textChanged, m_message.get(), &MessageLine::clear);
    takeKeys();
    dialog->installEventFilter(this);
    tellIfReadOnly();
    VelMenuViewPrivate::openedFoldersOf(*view).open(OpenedMenus::foldersOf(view->menuDir()));
}

MenuDialogAssistance::~MenuDialogAssistance()
{
    giveKeysBack();
}

// A filter opens folders of its own.
void MenuDialogAssistance::remember() const
{
    m_view->setFilter(QString());
    OpenedMenus::keep(m_view->menuDir(), VelMenuViewPrivate::openedFoldersOf(*m_view).opened());
}

QAction *MenuDialogAssistance::action(const char *name) const
{
    const QLatin1String wanted(name);
    const QList<QAction *> actions = m_view->actions();
    for (QAction *action : actions) {
        if (action->objectName() == wanted)
            return action;
    }
    return nullptr;
}

// The keys to find with are good everywhere in the dialog. A view that only is looked at has no
// actions for them.
void MenuDialogAssistance::takeKeys()
{
    if (!m_isEditable) {
        connect(new QShortcut(QKeySequence::Find, m_filterBar.get()), &QShortcut::activated, this,
                &MenuDialogAssistance::focusFilter);
        connect(new QShortcut(QKeySequence::FindNext, m_filterBar.get()), &QShortcut::activated, m_view,
                &VelMenuView::slotFindNext);
        return;
    }
    QAction *find = action("findAction");
    disconnect(find, &QAction::triggered, m_view, &VelMenuView::slotFind);
    connect(find, &QAction::triggered, this, &MenuDialogAssistance::focusFilter);
    find->setShortcutContext(Qt::WindowShortcut);
    action("findNextAction")->setShortcutContext(Qt::WindowShortcut);
}

void MenuDialogAssistance::giveKeysBack()
{
    if (!m_isEditable || !action("findAction"))
        return;
    QAction *find = action("findAction");
    connect(find, &QAction::triggered, m_view, &VelMenuView::slotFind);
    find->setShortcutContext(Qt::WidgetShortcut);
    action("findNextAction")->setShortcutContext(Qt::WidgetShortcut);
}

void MenuDialogAssistance::focusFilter()
{
    m_filterBar->focusLine();
}

// Who comes back to the window may have changed what the menu directory lets one do.
bool MenuDialogAssistance::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_dialog && event->type() == QEvent::WindowActivate)
        tellIfReadOnly();
    return false;
}

void MenuDialogAssistance::tellIfReadOnly()
{
    if (!m_isEditable)
        return;
    const QFileInfo info(m_view->menuDir());
    QString text;
    if (!OnDisk::exists(info.filePath()))
        text = QCoreApplication::translate("VelMenuDialog",
                                           "This menu cannot be changed: the folder %1 does not exist.")
                   .arg(info.filePath());
    else if (!info.isWritable())
        text = QCoreApplication::translate("VelMenuDialog",
                                           "This menu cannot be changed: you may not write to the folder %1.")
                   .arg(info.filePath());
    m_message->setRest(text, Warning);
}
