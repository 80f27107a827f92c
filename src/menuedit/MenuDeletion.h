// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QStringList>

class MenuFind;
class MenuHistory;
class MenuSelection;
class MenuVoice;
class QTreeView;
class ShownMenu;

/**
 * Deleting of items that can be taken back: they go into the trash without a question. Only where no
 * trash can be had the user is asked, and told that it is final.
 */
class MenuDeletion : public QObject
{
    Q_OBJECT

public:
    MenuDeletion(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuFind &find,
                 MenuVoice &voice, MenuHistory &history);
    ~MenuDeletion() override;

    /// Deletes what is at the \a paths, folders with everything in them, in one step.
    void remove(const QStringList &paths);

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

private:
    QStringList putAway(const QStringList &paths);
    bool confirmFinal(const QStringList &paths) const;
    bool removeForGood(const QStringList &paths);
    void leave(const QStringList &paths);

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    MenuHistory &m_history;
};
