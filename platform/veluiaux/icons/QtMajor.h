// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>

/**
 * What Qt 5 and Qt 6 do differently with icons, in one place.
 */
namespace QtMajor {

#if QT_VERSION_MAJOR >= 6
/// What follows the questions that an engine is const for in Qt 5 alone.
#define VEL_ICON_ENGINE_CONST

/// Whether QIcon::pixmap() makes more pixels than it was asked for on a screen that has more.
inline bool hasHighDpiPixmaps()
{
    return true;
}
#else
#define VEL_ICON_ENGINE_CONST const

inline bool hasHighDpiPixmaps()
{
    return QCoreApplication::testAttribute(Qt::AA_UseHighDpiPixmaps);
}
#endif

} // namespace QtMajor
