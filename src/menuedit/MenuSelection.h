// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QModelIndex>
#include <QObject>
#include <QString>

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

    /// The first selected item in the file model; invalid when nothing is selected.
    QModelIndex item() const;
    /// Its path; empty when nothing is selected.
    QString path() const;

    /// The item of the sorting model for \a path; invalid unless it lies below the menu directory.
    QModelIndex shown(const QString &path) const;

    void clear();
    /// Selects \a index of the sorting model alone; the keyboard goes on from there.
    void select(const QModelIndex &index);
    /// Selects the item of \a path alone, opens its folder and scrolls to it, at the latest when
    /// the event loop runs.
    void show(const QString &path);
    /// Scrolls to the item of \a path when the event loop runs: rows that come and go meanwhile do not
    /// push it out of sight.
    void reveal(const QString &path);
    /// Clears the selection, and puts the keyboard beside the item at \a path, which is about to go.
    void leave(const QString &path);

private:
    void leaveRows(const QModelIndex &parent, int first, int last);
    void awaitRows();
    void selectAwaited();

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    // The selected item whose row went although the file is there: its row comes back.
    QString m_awaited;
};
