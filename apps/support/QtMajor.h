// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QLibraryInfo>

/// What Qt 5 and Qt 6 call differently, for the programs.
namespace QtMajor {

/// The folder of Qt's own translations.
inline QString translationsPath()
{
#if QT_VERSION_MAJOR >= 6
    return QLibraryInfo::path(QLibraryInfo::TranslationsPath);
#else
    return QLibraryInfo::location(QLibraryInfo::TranslationsPath);
#endif
}

} // namespace QtMajor
