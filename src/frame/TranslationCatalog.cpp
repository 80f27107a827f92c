// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The library's start-up work: its translations go into the application that loads it.

#include <QCoreApplication>
#include <QLocale>
#include <QThread>
#include <QTimer>
#include <QTranslator>

#include <memory>

namespace {

void loadCatalog()
{
    const QString directory = QStringLiteral(VEL_TRANSLATIONS_DIR);
    if (directory.isEmpty())
        return;

    auto translator = std::make_unique<QTranslator>(QCoreApplication::instance());
    // A missing catalog is no error: the texts stay English.
    if (!translator->load(QLocale::system(), QStringLiteral("libveluiextra"), QStringLiteral("_"), directory))
        return;
    QCoreApplication::installTranslator(translator.release()); // the application's now
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
