// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QPersistentModelIndex>
#include <QPointer>
#include <QSet>
#include <QString>

class QEventLoop;
class QFileSystemModel;

/**
 * Makes a file-system model read folders that it was never asked for.
 *
 * Made together with the model, as it takes note of every folder that was read.
 */
class TreeLoader : public QObject
{
    Q_OBJECT

public:
    explicit TreeLoader(QFileSystemModel *model, QObject *parent = nullptr);
    ~TreeLoader() override;

    /// How much one load() reads at most, so that a link into the root of the disk does not hold the user up.
    void setLimits(int folders, int milliseconds);

    /**
     * Reads \a root and every folder below it, and waits until their rows are there.
     *
     * Runs an event loop without user input, in which this object, the model and all around
     * them may be deleted; a caller checks. A link to a folder that it lies in is not
     * followed.
     *
     * @return whether the whole tree is there; false when a limit was reached, when the model
     *         or this object went away, or when a load is under way already
     */
    bool load(const QModelIndex &root);

private:
    void folderLoaded(const QString &path);
    void forgetFolders(const QModelIndex &parent, int first, int last);
    void visit(const QModelIndex &folder);
    void visitChildren(const QModelIndex &folder);
    bool leadsAbove(const QString &path) const;

    QPointer<QFileSystemModel> m_model;
    QSet<QString> m_loaded;
    QSet<QString> m_pending;
    QString m_root;
    QEventLoop *m_loop = nullptr;
    int m_folderLimit = 20000;
    int m_milliseconds = 10000;
    int m_folders = 0;
    bool m_busy = false;
    bool m_complete = false;
};
