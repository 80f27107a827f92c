// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TestCase.h"

#include <QByteArray>
#include <QModelIndex>
#include <QString>
#include <QStringList>

class QAction;
class QFileSystemModel;
class QSortFilterProxyModel;
class VelMenuView;

/**
 * Base of the tests that show a menu directory: builds menus below folder() and looks into a view.
 *
 * The desktop's own directories lie in path("config"), which is empty at first, and the icon
 * theme has the names that the menu editor asks for.
 */
class MenuTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

    /// The menu directory that the helpers below write to.
    QString menu() const { return path(QStringLiteral("menu")); }
    /// The desktop's start-menu directory.
    static QString startMenu();

    /// The text of an entry; \a more are further lines.
    static QByteArray entryText(const QString &name, const QByteArray &more = "Exec=true\n");
    /// Writes an entry below the menu and returns its path.
    QString writeEntry(const QString &file, const QString &name, const QByteArray &more = "Exec=true\n");
    /// Writes the ".directory" of a folder below the menu (the menu itself for an empty name).
    QString writeFolder(const QString &folder, const QString &name,
                        const QByteArray &sortOrder = QByteArray());
    /// The `SortOrder` line of a folder, without the key; null when there is none.
    QByteArray sortOrderOf(const QString &folder) const;
    /// All files and folders below \a folder, dot files included, sorted.
    static QStringList everythingIn(const QString &folder);

    static QFileSystemModel *files(const VelMenuView &view);
    static QSortFilterProxyModel *proxy(const VelMenuView &view);
    /// The shown index of \a path.
    static QModelIndex shown(const VelMenuView &view, const QString &path);
    /// The names shown in a folder, from top to bottom.
    static QStringList names(const VelMenuView &view, const QString &folder);
    /// Opens a folder and waits until \a count rows are there; false when they do not come.
    static bool open(VelMenuView &view, const QString &folder, int count);
    /// Selects the item of \a path as a click does.
    static void select(VelMenuView &view, const QString &path);
    static QAction *action(const VelMenuView &view, const QString &name);
    /// The object names of the actions that are enabled, in the view's order.
    static QStringList enabledActions(const VelMenuView &view);

protected Q_SLOTS:
    void init();
};

/**
 * Takes write permission away for real while it lives, from the superuser too: access checks
 * are made for somebody else, files are still opened as before.
 */
class WithoutPermission
{
public:
    WithoutPermission();
    ~WithoutPermission();
    Q_DISABLE_COPY_MOVE(WithoutPermission)
};
