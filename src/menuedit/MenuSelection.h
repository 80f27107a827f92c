// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QModelIndexList>
#include <QObject>
#include <QPersistentModelIndex>
#include <QSet>
#include <QStringList>

#include <functional>

class QItemSelection;
class QTreeView;
class ShownMenu;

/**
 * What is selected in a view of a menu: finds items, selects them, and keeps the selection where
 * it was meant to be when rows come and go.
 */
class MenuSelection : public QObject
{
    Q_OBJECT

public:
    /// For \a view, which shows \a menu from now on. To be made before the view is given the
    /// sorting model, as it has to see first which rows go.
    MenuSelection(QTreeView *view, const ShownMenu &menu);
    ~MenuSelection() override;

    /// The selected item in the file model, of several the one that the keyboard is on, or else the
    /// first; invalid when nothing is selected.
    QModelIndex item() const;
    /// Its path; empty when nothing is selected.
    QString path() const;

    /// All selected items of the sorting model, in the order in which they were selected.
    QModelIndexList all() const;
    /// How many there are.
    int count() const;
    bool isSeveral() const { return count() > 1; }
    /// The paths of all selected items from the top to the bottom, without those that lie in others of them.
    QStringList paths() const;

    /// The item of the sorting model for \a path; invalid unless it lies below the menu directory.
    QModelIndex shown(const QString &path) const;

    void clear();
    /// Selects \a index of the sorting model alone; the keyboard goes on from there.
    void select(const QModelIndex &index);
    /// Selects the item of \a path alone, opens its folder and scrolls to it, at the latest when
    /// the event loop runs.
    void show(const QString &path);
    /// The same for the \a paths, of which the first gets the keyboard, as far as the view may select
    /// several. Those whose rows are not there yet follow when they come.
    void show(const QStringList &paths);
    /// Takes out of the selection what \a isToGo says of items of the sorting model.
    void deselect(const std::function<bool(const QModelIndex &)> &isToGo);
    /// Scrolls to the item of \a path when the event loop runs: rows that come and go meanwhile do not
    /// push it out of sight.
    void reveal(const QString &path);
    /// Takes the item at \a path, which is about to go, out of the selection and puts the keyboard beside it.
    void leave(const QString &path);
    /// The same for the \a paths, none of which lies in another, from the top to the bottom. A keyboard
    /// that is elsewhere stays there.
    void leave(const QStringList &paths);

    /// To be told what was selected besides: who selects something else waits for nothing any more.
    void noteSelected(const QItemSelection &selected);

private:
    QModelIndex goingOne(const QModelIndex &index, const QSet<QString> &going) const;
    QModelIndex neighborOf(const QModelIndex &index, const QSet<QString> &going) const;
    QString pathOf(const QModelIndex &shown) const;
    QModelIndex shownFolder(const QString &path) const;
    void openFolder(const QModelIndex &folder);
    void add(const QModelIndexList &rows);
    void keepEachRow();
    void awaitGoing(const QModelIndex &parent, int first, int last);
    void leaveRows(const QModelIndex &parent, int first, int last);
    void awaitRows(const QModelIndex &parent, int first, int last);
    void selectAwaited();

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    // The selected items whose rows went although the files are there, and those whose rows are still
    // to come.
    QSet<QString> m_awaited;
    QList<QPersistentModelIndex> m_came; // of these, to be selected in a moment
    bool m_isSelecting = false;
};
