// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSize>
#include <QtGlobal>

/// How large a picture may be that an icon is made of; a few kilobytes can claim any size.
namespace PictureLimits {

/// The longest edge, in pixels.
constexpr int Edge = 4096;
/// All pictures of one file together, in pixels.
constexpr qint64 Area = qint64(Edge) * Edge;
/// A file that has to be read whole before its pictures are, and its contents, in bytes.
constexpr int Bytes = 16 * 1024 * 1024;

/// Whether a picture of \a size may be decoded; not one whose size is unknown.
inline bool fits(const QSize &size)
{
    return !size.isEmpty() && size.width() <= Edge && size.height() <= Edge;
}

/// Counts the pictures of one file.
class Sum
{
public:
    /// Adds \a count pictures of \a size; whether they fit as yet.
    bool add(const QSize &size, int count = 1)
    {
        if (!fits(size))
            return false;
        m_area += qint64(size.width()) * size.height() * count;
        return m_area <= Area;
    }

private:
    qint64 m_area = 0;
};

} // namespace PictureLimits
