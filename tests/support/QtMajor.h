// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QKeySequence>
#include <QLibraryInfo>
#include <QMetaType>

/// What Qt 5 and Qt 6 call differently, for the tests.
namespace VelTest {

#if QT_VERSION_MAJOR >= 6

/// A type whose values may be moved as bytes.
constexpr auto RelocatableType = QMetaType::RelocatableType;

/// A key with its modifiers as one number.
constexpr int keyNumber(QKeyCombination key)
{
    return key.toCombined();
}

/// The folder of Qt's own translations.
inline QString translationsPath()
{
    return QLibraryInfo::path(QLibraryInfo::TranslationsPath);
}

#else

constexpr auto RelocatableType = QMetaType::MovableType;

inline QString translationsPath()
{
    return QLibraryInfo::location(QLibraryInfo::TranslationsPath);
}

#endif

constexpr int keyNumber(int key)
{
    return key;
}

constexpr int keyNumber(Qt::Key key)
{
    return key;
}

/// The sequence of \a keys, each with or without modifiers.
template <typename... Keys>
QKeySequence keySequence(Keys... keys)
{
    return QKeySequence(keyNumber(keys)...);
}

/// Has icons give as many pixels as the screen has; before the application is made.
inline void useHighDpiPixmaps()
{
#if QT_VERSION_MAJOR < 6
    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps);
#endif
}

} // namespace VelTest
