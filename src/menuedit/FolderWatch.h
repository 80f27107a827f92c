// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QSet>
#include <QStringList>
#include <QTimer>

#include <functional>
#include <utility>

class QFileSystemModel;
class QModelIndex;

/**
 * Lets a file-system model hear of what happens in folders that were moved or renamed.
 *
 * The model watches every folder that it has read, and the watch goes along with a folder that
 * moves. The model does not notice: it would take what happens at the new place for news of the
 * old one, and never show it.
 *
 * What is watched again is read twice: a folder that waits for its turn to be read when the model is told
 * to read it is not watched.
 */
class FolderWatch : public QObject
{
    Q_OBJECT

public:
    /// Belongs to \a model; folders that others move are seen to from now on.
    explicit FolderWatch(QFileSystemModel *model);
    ~FolderWatch() override;

    /// Stops watching those \a paths in the menu that are about to move, and all folders below
    /// them; returns what was being watched.
    QStringList release(const QStringList &paths);
    /// Watches those of the \a folders again that are still there.
    void watchAgain(const QStringList &folders);
    /// Of rows for whose paths \a isInPlace holds, going does not tell that a folder was moved.
    void leaveAlone(std::function<bool(const QString &path)> isInPlace)
    {
        m_isInPlace = std::move(isInPlace);
    }
    /// Off, the model notices nothing; on again, it reads anew what it had read.
    void setOn(bool on);

private:
    void noticeRemoval(const QModelIndex &parent, int first, int last);
    void renew();
    void expectReading(const QStringList &folders);
    void noticeReading(const QString &folder);
    void read(const QStringList &folders);
    void collect(const QModelIndex &folder, QStringList &paths) const;
    void forget(const QStringList &folders);

    QFileSystemModel *m_model;
    QTimer m_timer;
    bool m_isOn = true;
    QSet<QString> m_expected; // folders that are being read once
    QStringList m_readOnce;
    std::function<bool(const QString &path)> m_isInPlace;
};
