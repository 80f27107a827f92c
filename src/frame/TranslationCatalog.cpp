// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The library's start-up work: its translations go into the application that loads it.

#include "LibraryPlace.h"

#include <QCoreApplication>
#include <QLocale>
#include <QThread>
#include <QTimer>
#include <QTranslator>

#include <memory>

namespace {

bool loadCatalogFrom(const QString &directory)
{
    // Without a directory Qt would look in the working directory.
    if (directory.isEmpty())
        return false;
    auto translator = std::make_unique<QTranslator>(QCoreApplication::instance());
    if (!translator->load(QLocale::system(), QStringLiteral("libveluiextra"), QStringLiteral("_"), directory))
        return false;
    QCoreApplication::installTranslator(translator.release()); // the application's now
    return true;
}

void loadCatalog()
{
    const QString directory = QStringLiteral(VEL_TRANSLATIONS_DIR);
    // A missing catalog is no error: the texts stay English.
    if (!directory.isEmpty() && !loadCatalogFrom(directory))
        loadCatalogFrom(LibraryPlace::catalogs());
}

// A library opened by a worker thread leaves the translator to the application's thread.
void installCatalog()
{
    QCoreApplication *application = QCoreApplication::instance();
    if (QThread::currentThread() == application->thread())
        loadCatalog();
    else
        QTimer::singleShot(0, application, loadCatalog);
}

// Qt calls the routine when the application object is made, or at once when there is one.
Q_COREAPP_STARTUP_FUNCTION(installCatalog)

} // namespace

#ifdef VELUIEXTRA_STATIC_DEFINE
// What a host of the static library has the linker look for, so that this file comes with it.
extern "C" {
extern const char veluiextra_catalog;
const char veluiextra_catalog = 0;
}
#endif
