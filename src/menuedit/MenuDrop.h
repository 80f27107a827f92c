// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileTransfer.h"
#include "MenuDropHost.h"

#include <QPersistentModelIndex>
#include <QString>
#include <QStringList>

class FolderWatch;
class QFileSystemModel;

/**
 * One drop of files into a folder of the menu: checks it, has the user asked, transfers the
 * files and writes the order of the folder when they are there. What fails is taken back.
 */
class MenuDrop
{
public:
    /// What is to be done; the data that it was read from may be gone while the user is asked.
    struct Request
    {
        QStringList sources; ///< absolute paths, at least one
        Qt::DropAction action;
        int row; ///< the source row before which the first file is to be listed, or -1
        QPersistentModelIndex folder;
    };

    MenuDrop(QFileSystemModel &model, FolderWatch &watch, MenuDropHost &host, const Request &request);

    /// Does it. Event loops run where the user is asked and while files are transferred; when the
    /// model goes away meanwhile, nothing is done, or what was done is taken back.
    DropResult carryOut();

private:
    bool isHere(const QString &source) const;
    DropResult reorder();
    DropResult bringIn();
    bool confirm();
    FileTransfer::Result transfer();
    FileTransfer::Result link();
    QString write(const std::optional<QStringList> &order) const;
    DropResult done(bool sortAnew, const QString &complaint) const;
    DropResult refused(const FileTransfer::Result &result) const;

    QFileSystemModel &m_model;
    FolderWatch &m_watch;
    MenuDropHost &m_host;
    Request m_request;
    QString m_folder; // the path
    QStringList m_targets;
};
