// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DropTargets.h"
#include "FileProgress.h"

#include <QPersistentModelIndex>
#include <QString>
#include <QStringList>

#include <memory>
#include <optional>

class KeptThing;
class QObject;
class VelMenuView;

/**
 * What came of a drop.
 */
struct DropResult
{
    bool isDone = false; ///< whether everything is where it was dropped
    QString complaint; ///< what the user is to hear of what was not done; may be empty
    QPersistentModelIndex folder; ///< in the file model
    QStringList targets; ///< the paths of all files in the folder; the first is the one dropped first.
                         ///< None where nothing was a file
    QStringList moved; ///< the paths at which files were before
    bool sortAnew = false; ///< whether the order of the folder may have changed
};

/**
 * What a drop has to ask of those who show the menu, and tells them.
 */
class MenuDropHost
{
public:
    /**
     * Returns the host that answers for \a view; null for a model that nobody shows.
     *
     * @param owner the parent of the model, over which questions are asked if it is a widget
     */
    static std::unique_ptr<MenuDropHost> create(VelMenuView *view, QObject *owner);

    virtual ~MenuDropHost() = default;

    /**
     * Asks the user about a \a target that exists; whether to go on. An event loop runs meanwhile,
     * in which the model and this object may be deleted.
     *
     * A Yes overwrites nothing: what is still there when the files are transferred is left as it
     * is. The question tells that the name is taken before anything was tried, and while it
     * stands the user can make room for what was dropped.
     */
    virtual bool confirmOverwrite(const QString &target) = 0;

    /**
     * Asks the user what is to become of a file whose name is taken, where there is assistance. An event
     * loop runs meanwhile, in which the model and this object may be deleted; all is canceled then.
     */
    virtual NameClash::Answer askAbout(const NameClash &clash)
    {
        Q_UNUSED(clash)
        return {};
    }

    /// The list for \a folder of the file model as it is shown, with the \a names, each once, before the
    /// child at the source row \a row; nothing where nobody shows an order.
    virtual std::optional<QStringList> orderWith(const QStringList &names, int row,
                                                 const QModelIndex &folder) = 0;

    /// The \a items are about to come to \a folder, a path, whose order may be written too.
    virtual void begins(const QVector<DropItem> &items, Qt::DropAction action, const QString &folder)
    {
        Q_UNUSED(items)
        Q_UNUSED(action)
        Q_UNUSED(folder)
    }

    /// What was at \a path has made room for one of the items, and is \a kept.
    virtual void replaced(const QString &path, std::unique_ptr<KeptThing> kept);

    /**
     * Returns what follows the copying or moving of files. An event loop may run whenever it is
     * asked whether to go on, in which the model and this object may be deleted; it says no then.
     */
    virtual std::unique_ptr<FileProgress> follow(Qt::DropAction action)
    {
        Q_UNUSED(action)
        return std::make_unique<FileProgress>();
    }

    /// Shows what came of the drop.
    virtual void finished(const DropResult &result) = 0;
};
