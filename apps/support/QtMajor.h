// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QLibraryInfo>

#ifdef QT_GUI_LIB
#include <QKeySequence>
#endif

/// What Qt 5 and Qt 6 call differently, for the programs.
namespace QtMajor {

#if QT_VERSION_MAJOR >= 6

/// The folder of Qt's own translations.
inline QString translationsPath()
{
    return QLibraryInfo::path(QLibraryInfo::TranslationsPath);
}

#ifdef QT_GUI_LIB
/// The chord of \a keys at \a index as one number: a key with its modifiers.
inline int chord(const QKeySequence &keys, int index)
{
    return keys[uint(index)].toCombined();
}
#endif

#else

inline QString translationsPath()
{
    return QLibraryInfo::location(QLibraryInfo::TranslationsPath);
}

#ifdef QT_GUI_LIB
inline int chord(const QKeySequence &keys, int index)
{
    return keys[uint(index)];
}
#endif

#endif

} // namespace QtMajor
