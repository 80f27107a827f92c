// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuVoice.h"

#include <QObject>
#include <QStringList>

class MenuFind;
class MenuHistory;
class MenuSelection;
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

    /// Deletes what is at the \a paths, folders with everything in them, in one step. None of them lies in
    /// another. The user can end it, which leaves what is not yet deleted, and is told of what stays.
    void remove(const QStringList &paths);

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

private:
    /// What was to be removed when the user ended it. A folder may have lost the file that names it.
    struct Begun
    {
        QString path;
        QString name; ///< by which the user knows it
    };

    struct Outcome
    {
        void refuse(const QString &path);

        QStringList untrashed; ///< what cannot be put into the trash
        QStringList complaints; ///< what cannot be deleted, and why
        Begun begun;
        bool isCanceled = false;
        bool isChanged = false;
        MenuVoice::Subject subject = MenuVoice::Subject::Other; ///< of what is told in the end
    };

    void putAway(const QStringList &paths, Outcome *outcome);
    bool confirmFinal(const QStringList &paths) const;
    void removeForGood(Outcome *outcome);
    void forget(const QStringList &paths);
    void selectWhatStays(const QStringList &paths);
    void tellWhatStays(const QStringList &paths, const Outcome &outcome);
    QString canceledText(const QStringList &paths, const Outcome &outcome) const;

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    MenuHistory &m_history;
};
