// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DropTargets.h"
#include "FileTransfer.h"
#include "MenuDropHost.h"

#include <QPersistentModelIndex>
#include <QString>
#include <QStringList>
#include <QVector>

#include <optional>

class FolderWatch;
class QFileSystemModel;
class ReplacedThings;

/**
 * One drop of files and web addresses into a folder of the menu: checks it, has the user asked,
 * transfers the files, writes entries for the addresses, and then the order of the folder. What fails
 * is taken back.
 *
 * Where there is no assistance, the user is asked about the first file alone, nothing that is
 * there makes room, and only the first file gets a place in the order of the folder.
 */
class MenuDrop
{
public:
    /// What is to be done; the data that it was read from may be gone while the user is asked.
    struct Request
    {
        QStringList sources; ///< absolute paths, at least one; see DropTargets
        Qt::DropAction action;
        int row; ///< the source row before which the first file is to be listed, or -1
        QPersistentModelIndex folder;
        bool isAssisted = false; ///< see VelMenuView::setAssistance()
        QVector<WebAddress> addresses = {}; ///< only where there is assistance
    };

    MenuDrop(QFileSystemModel &model, FolderWatch &watch, MenuDropHost &host, const Request &request);

    /// Does it. Event loops run where the user is asked and while files are transferred; when the
    /// model goes away meanwhile, nothing is done, or what was done is taken back.
    DropResult carryOut();

private:
    bool areAllHere() const;
    bool settle();
    bool settleFirst();
    bool settleAll();
    DropResult reorder();
    DropResult bringIn();
    std::optional<DropResult> carryOver();
    FileTransfer::Result check() const;
    bool makeRoom(ReplacedThings &replaced, QString *occupied) const;
    QString writeEntries(QStringList *made) const;
    FileTransfer::Result transfer();
    QStringList leavingPaths() const;
    bool isListed() const;
    std::optional<QStringList> order() const;
    QString write(const std::optional<QStringList> &order) const;
    DropResult result() const;
    DropResult done(bool sortAnew, const QString &complaint) const;
    DropResult refused(const QString &complaint) const;
    DropResult refused(const FileTransfer::Result &failure) const;

    QFileSystemModel &m_model;
    FolderWatch &m_watch;
    MenuDropHost &m_host;
    Request m_request;
    QString m_folder; // the path
    DropTargets m_targets;
    QVector<DropItem> m_items;
};
