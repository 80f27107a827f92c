// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QList>
#include <QObject>
#include <QPersistentModelIndex>
#include <QString>

class MenuSelection;
class QTreeView;
class ShownMenu;

/**
 * Finding items by their names: the text asked for, the matches and the one that is shown.
 */
class MenuFind : public QObject
{
    Q_OBJECT

public:
    MenuFind(QTreeView *view, const ShownMenu &menu, MenuSelection &selection);
    ~MenuFind() override;

    /// Asks for a text and selects the first match; the user may take this object away meanwhile.
    void ask();
    /// Searches the whole tree and selects the first match, or goes on to the \a next one of the
    /// last search; whether a match was selected.
    bool find(bool next);
    /// Drops the matches, so that the next search begins anew.
    void clear();

private:
    bool showNext();
    void show();
    QModelIndexList matches() const;

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    QString m_text;
    // In the sorting model; persistent, as rows come and go between two searches.
    QList<QPersistentModelIndex> m_matches;
    int m_shown = -1;
};
