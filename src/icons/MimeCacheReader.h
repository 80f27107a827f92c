// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QString>

#include <functional>

/**
 * Reads the file name patterns of a "mime.cache" file, whose layout the freedesktop.org
 * shared MIME information describes. No byte outside of the file is touched, whatever it says.
 */
class MimeCacheReader
{
public:
    using Visitor = std::function<void(const QString &pattern)>;

    explicit MimeCacheReader(const QByteArray &cache);

    /// Calls \a visit with every pattern; false when the file is malformed or of another version.
    bool visitPatterns(const Visitor &visit);

private:
    quint32 number(quint32 offset);
    QString text(quint32 offset);
    void visitList(quint32 offset, const Visitor &visit);
    void visitTree(quint32 count, quint32 offset, const QString &suffix, const Visitor &visit);

    const QByteArray m_cache;
    int m_nodesLeft; // no sane file has more; ends a tree that bites its own tail
    int m_textLeft; // the same for entries that all name one long text
    bool m_valid = true;
};
