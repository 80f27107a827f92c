// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QMap>
#include <QSet>
#include <QString>

#include <sys/types.h>

#include <ctime>

/**
 * Everything below some folders, to the last byte, on the names that the file system knows: kinds,
 * permissions, contents and times of files, link texts, and the numbers by which the file system knows them.
 */
class ExactTree
{
public:
    /// What lies in the folder \a path now.
    static ExactTree of(const QString &path);

    /// Adds what lies in another folder.
    void add(const QString &path);
    /// What is different in \a found, for a person; empty when nothing is. Numbers of files are compared
    /// for those only that are not among \a rewritten ("*" for all).
    QString difference(const ExactTree &found, const QSet<QByteArray> &rewritten = {}) const;
    int count() const { return m_items.size(); }
    /// The numbers by which the file system knows what is there, by paths.
    QMap<QByteArray, ino_t> numbers() const;
    /// The contents of all files.
    QSet<QByteArray> contents() const;

private:
    struct Item
    {
        mode_t mode = 0;
        QByteArray bytes; // of a file, or the text of a link
        ino_t number = 0;
        timespec modified = {};
    };

    void add(const QByteArray &path);

    QMap<QByteArray, Item> m_items;
};
