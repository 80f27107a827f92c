// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QColor>
#include <QString>
#include <QVector>

/**
 * A small icon theme of plainly colored squares, on disk.
 */
class IconThemeFolder
{
public:
    /// The theme \a name below the folder \a searchPath, with folders for pictures of \a sizes.
    /// Nothing is written before write() or add().
    IconThemeFolder(const QString &searchPath, const QString &name,
                    const QVector<int> &sizes = {8, 16, 22, 32});

    /// Writes the description of the theme.
    void write() const;
    /// Adds the icon \a name in every size.
    void add(const QString &name, const QColor &color) const;
    /// Adds the icon \a name in one size.
    void add(const QString &name, const QColor &color, int size) const;

    /// Makes this the theme of the application, and its search path the only one.
    void use() const;

private:
    QString m_searchPath;
    QString m_name;
    QVector<int> m_sizes;
};
