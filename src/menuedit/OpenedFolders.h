// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QSet>
#include <QString>
#include <QStringList>
#include <QTimer>

class MenuSelection;
class QTreeView;
class ShownMenu;

/**
 * Which folders of a menu are opened in its view, and opening them again as they were once.
 *
 * They are opened a few at a time, each once the one that it lies in is open: one in a closed folder
 * waits until the user opens that. What lies outside the menu directory, behind a link, is never opened
 * so, nor is more than the user would wait for.
 */
class OpenedFolders : public QObject
{
    Q_OBJECT

public:
    /// So many folders are opened at most.
    static constexpr int MostFolders = 200;
    /// So many items may lie in them altogether.
    static constexpr int MostItems = 5000;

    OpenedFolders(QTreeView *view, const ShownMenu &menu, MenuSelection &selection);
    ~OpenedFolders() override;

    /// The paths of the folders that are opened in \a view.
    static QSet<QString> in(const QTreeView &view, const ShownMenu &menu, const MenuSelection &selection);

    /// Opens \a folders, paths below the menu directory, when it can be done.
    void open(const QStringList &folders);
    /// The paths below the menu directory of what is opened, and of what waits to be: sorted, and none of
    /// what open() would never open.
    QStringList opened() const;

private:
    void watchFiles();
    void openSome();
    bool isReady(const QString &path) const;
    bool isWithin(const QString &path) const;
    bool takeItems(const QString &path);

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    QSet<QString> m_waiting;
    // Too much to be opened; remembered all the same.
    QSet<QString> m_left;
    int m_items = 0;
    QTimer m_turn;
};
