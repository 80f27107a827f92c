// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "Program.h"

#include <QApplication>

namespace Program {

/**
 * The whole main() of the program \a name, which opens windows.
 *
 * The parameters are those of runAs(). Where the command line looks as if it asked for help or the
 * version, \a parse is called without a display first, and again if that was but the value of another
 * option.
 */
template <typename Parse, typename Run>
int runWithWindows(int &argc, char **argv, const QString &name, int wrongUsage, Parse parse, Run run)
{
    describe(name);
    if (mayWantNoWindow(argc, argv)) {
        const auto goOn = [](const auto &) { return 0; };
        const int status = runAs<QCoreApplication>(argc, argv, wrongUsage, parse, goOn);
        if (status != 0)
            return status;
    }
#if QT_VERSION_MAJOR < 6
    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps); // as it is always in Qt 6
#endif
    QGuiApplication::setDesktopFileName(name);
    return runAs<QApplication>(argc, argv, wrongUsage, parse, run);
}

} // namespace Program
