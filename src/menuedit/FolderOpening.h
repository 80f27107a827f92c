// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QPointer>

class MenuSelection;
class MenuVoice;
class QAction;
class QMenu;
class QWidget;

/**
 * The way from an item of the menu to its file: an entry of the context menu that shows it in the
 * desktop's file manager.
 */
class FolderOpening : public QObject
{
    Q_OBJECT

public:
    FolderOpening(QWidget *view, const MenuSelection &selection, MenuVoice &voice);
    ~FolderOpening() override;

    /// Puts the entry into \a menu, above its action \a next; a null menu takes it out again.
    void setContextMenu(QMenu *menu, QAction *next);

    /// Shows the selected items; the user is told when that fails, which may be later.
    void open();

private:
    void update();

    QWidget *const m_view;
    const MenuSelection &m_selection;
    MenuVoice &m_voice;
    QPointer<QMenu> m_contextMenu;
    QAction *m_action;
};
