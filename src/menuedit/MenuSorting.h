// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "NameOrder.h"

#include <QObject>
#include <QPointer>

class MenuFind;
class MenuHistory;
class MenuSelection;
class MenuVoice;
class QAction;
class QMenu;
class ShownMenu;

/**
 * Putting what a folder holds into the order of the names: an entry of the context menu, for the
 * selected folder, or the one that the selected item lies in, or the menu itself.
 */
class MenuSorting : public QObject
{
    Q_OBJECT

public:
    MenuSorting(const ShownMenu &menu, MenuSelection &selection, MenuFind &find, MenuVoice &voice,
                MenuHistory &history);
    ~MenuSorting() override;

    /// Puts the entry at the end of \a menu; null takes it out again. It is enabled where the folder can be
    /// sorted: it may be written, and no other rule orders it.
    void setContextMenu(QMenu *menu);
    /// Sorts the folder, whether or not it was ever opened. The user is told when it is sorted already, and
    /// when the order cannot be saved.
    void sort();

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

private:
    void update();
    QString folder() const;
    QVector<NameOrder::Child> childrenOf(const QString &folder) const;

    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    MenuHistory &m_history;
    QPointer<QMenu> m_contextMenu;
    QAction *m_action;
};
