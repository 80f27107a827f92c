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

void loadCatalogue()
{
    const QString directory = QStringLiteral(VEL_TRANSLATIONS_DIR);
    if (directory.isEmpty())
        return;

    auto translator = std::make_unique<QTranslator>(QCoreApplication::instance());
    // A missing catalogue is no error: the texts stay English.
    if (!translator->load(QLocale::system(), QStringLiteral("libveluiextra"), QStringLiteral("_"), directory))
        return;
    QCoreApplication::installTranslator(translator.release()); // the application's now
}

// A library opened by a worker thread leaves the translator to the application's thread.
void installCatalogue()
{
    QCoreApplication *application = QCoreApplication::instance();
    if (QThread::currentThread() == application->thread())
        loadCatalogue();
    else
        QTimer::singleShot(0, application, loadCatalogue);
}

// Qt calls the routine when the application object is made, or at once when there is one.
Q_COREAPP_STARTUP_FUNCTION(installCatalogue)

} // namespace
