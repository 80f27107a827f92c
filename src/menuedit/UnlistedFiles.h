// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QSet>
#include <QString>

class QFileSystemModel;

/**
 * Gives a file-system model the rows that it has none of because its listing of a folder ends
 * where a name is no text.
 *
 * Each time that the model has read such a folder, the rows that it took away again come back.
 * Of a folder whose names are all text, they are only read once more, and no file is looked at.
 */
class UnlistedFiles : public QObject
{
    Q_OBJECT

public:
    /// Belongs to \a model.
    explicit UnlistedFiles(QFileSystemModel *model);
    ~UnlistedFiles() override;

    /// Whether the row of \a path may go though nothing has become of its file.
    bool mayGoAndCome(const QString &path) const;
    /// Whether there are files that are gone and whose rows the model keeps.
    bool keepsGone() const { return !m_gone.isEmpty(); }
    /// Whether the file of the row at \a path is gone.
    bool isGone(const QString &path) const { return m_gone.contains(path); }

private:
    void complete(const QString &path);
    void setGone(const QString &path, bool isGone);
    void markGone(const QString &folder, const QSet<QString> &names, const QSet<QString> &shown);
    QSet<QString> shownIn(const QString &folder) const;
    bool isShown(const QString &path) const;

    QFileSystemModel *m_model;
    QSet<QString> m_folders; // that have such a name
    QSet<QString> m_gone; // the files of which a row may stand
};
