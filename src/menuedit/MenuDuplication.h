// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileTransfer.h"

#include <QMap>
#include <QObject>
#include <QPointer>
#include <QStringList>
#include <QVector>

class MenuFind;
class MenuHistory;
class MenuSelection;
class MenuVoice;
class QAction;
class QMenu;
class QTreeView;
class ShownMenu;

/**
 * Copying of the selected items beside themselves: an entry of the context menu, with a key.
 *
 * A copy has another file name and is listed right below what it is a copy of. All that is in the
 * files stays the same to the last byte, also the names in all languages: which one is the copy shows
 * by its being selected.
 */
class MenuDuplication : public QObject
{
    Q_OBJECT

public:
    MenuDuplication(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuFind &find,
                    MenuVoice &voice, MenuHistory &history);
    ~MenuDuplication() override;

    /// Puts the entry into \a menu after \a before, and gives the view its key; a null menu takes both away.
    void setContextMenu(QMenu *menu, QAction *before = nullptr);
    /// Copies the selected items, folders with everything in them, in one step. The user is told when
    /// that cannot be done.
    void duplicate();

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

private:
    using Items = QVector<FileTransfer::Item>;
    /// The lists that the folders are to have, by their paths.
    using Orders = QMap<QString, QStringList>;

    void update();
    bool copy(const Items &items);
    Orders ordersWith(const Items &items) const;
    QStringList write(const Orders &orders) const;
    void show(const Items &items) const;

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    MenuHistory &m_history;
    QPointer<QMenu> m_contextMenu;
    QAction *m_action;
};
