// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QGuiApplication>
#include <QIcon>
#include <QIconEngine>
#include <QLibraryInfo>
#include <QPixmap>
#include <QSize>
#include <QVersionNumber>
#include <QtMath>

/**
 * What Qt 5 and Qt 6, and the versions of Qt 6, do differently with icons, in one place.
 *
 * Asked is the version that runs, which may be later than the one of the build.
 */
namespace QtMajor {

/// How Qt looks for the files of an icon, and which it takes for a size.
enum class ThemeRules {
    NamesFirst, ///< a shorter name in the theme comes before the theme's parents
    ParentsFirst, ///< the parents come before a shorter name, under which some folders are left out
    LargerFirst ///< as before, and a picture that is too large comes before one that is too small
};

#if QT_VERSION_MAJOR >= 6
/// What follows the questions that an engine is const for in Qt 5 alone.
#define VEL_ICON_ENGINE_CONST

inline int minorVersion()
{
    static const int minor = QLibraryInfo::version().minorVersion();
    return minor;
}

inline ThemeRules themeRules()
{
    if (minorVersion() < 5)
        return ThemeRules::NamesFirst;
    return minorVersion() < 11 ? ThemeRules::ParentsFirst : ThemeRules::LargerFirst;
}

/// Whether themeRules() is sure: between the versions that are known, one or the other may hold.
inline bool areThemeRulesKnown()
{
    return minorVersion() < 5 || minorVersion() == 8 || minorVersion() > 10;
}

/// The ratio to ask QIcon for, to have what it shows on a device of the ratio \a ratio.
inline qreal askedRatio(qreal ratio)
{
    return qMax(ratio, 1.0);
}

/// The same for what an icon of the theme paints.
inline qreal paintedRatio(qreal ratio)
{
    return minorVersion() < 11 ? 1.0 : askedRatio(ratio);
}

/// The ratio for which QIcon::actualSize() makes a size smaller that was made larger before.
inline qreal ratioOfSizes()
{
    return qGuiApp->devicePixelRatio();
}

inline QPixmap pixmap(const QIcon &icon, const QSize &size, qreal ratio, QIcon::Mode mode, QIcon::State state)
{
    return icon.pixmap(size, ratio, mode, state);
}

/// The pixels that QIcon asks its engine for.
inline QSize pixelsOf(const QIconEngine::ScaledPixmapArgument &argument)
{
    return minorVersion() < 8 ? argument.size : argument.size * argument.scale;
}

/// The size for which Qt looks for a file to draw \a size at the ratio \a ratio.
inline QSize sizeOfFile(const QSize &size, qreal ratio)
{
    return minorVersion() < 8 ? size * ratio / qCeil(ratio) : size;
}

/// The most pixels that Qt says that a file has which is meant for \a size at the ratio \a scale.
inline int edgeOfFile(int size, int scale)
{
    return minorVersion() < 8 ? size : size * scale;
}

/// How Qt makes the pixmap of a drawing, which may be without a transparent pixel.
inline Qt::ImageConversionFlags flagsOfDrawings()
{
    return minorVersion() < 8 ? Qt::AutoColor : Qt::NoOpaqueDetection;
}
#else
#define VEL_ICON_ENGINE_CONST const

inline ThemeRules themeRules()
{
    return ThemeRules::NamesFirst;
}

inline bool areThemeRulesKnown()
{
    return true;
}

inline qreal ratioOfSizes()
{
    return QCoreApplication::testAttribute(Qt::AA_UseHighDpiPixmaps) ? qGuiApp->devicePixelRatio() : 1.0;
}

// Asked for a logical size, QIcon multiplies it by its own ratio.
inline qreal askedRatio(qreal)
{
    return ratioOfSizes();
}

inline qreal paintedRatio(qreal)
{
    return ratioOfSizes();
}

inline QPixmap pixmap(const QIcon &icon, const QSize &size, qreal, QIcon::Mode mode, QIcon::State state)
{
    return icon.pixmap(size, mode, state);
}

inline QSize pixelsOf(const QIconEngine::ScaledPixmapArgument &argument)
{
    return argument.size;
}

inline QSize sizeOfFile(const QSize &size, qreal ratio)
{
    return size * ratio / qCeil(ratio);
}

inline int edgeOfFile(int size, int)
{
    return size;
}

inline Qt::ImageConversionFlags flagsOfDrawings()
{
    return Qt::AutoColor;
}
#endif

} // namespace QtMajor
