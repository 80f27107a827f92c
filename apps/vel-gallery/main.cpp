// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPages.h"
#include "GalleryScreenshots.h"
#include "GalleryWindow.h"

#include <support/WindowProgram.h>

#include <velintegration/help.h>

#include <QApplication>
#include <QCommandLineParser>
#include <QShortcut>

#include <algorithm>

namespace {

enum ExitStatus { Done = 0, NotShown = 1, WrongUsage = 2 };

struct Options
{
    QString page;
    QString screenshots;
    int scale = 0; // 0: screenshots at every scale
    GalleryContext context;
    QString error; ///< what is wrong with the command line; empty when nothing is
};

Options parse()
{
    QCommandLineParser parser;
    parser.setApplicationDescription(QCoreApplication::translate(
        "vel-gallery", "Shows the library's widgets, dialogs and models in action."));
    parser.addHelpOption();
    parser.addVersionOption();
    const QCommandLineOption page(QStringLiteral("page"),
                                  QCoreApplication::translate("vel-gallery", "Start with the page <name>."),
                                  QStringLiteral("name"));
    const QCommandLineOption screenshots(
        QStringLiteral("screenshots"),
        QCoreApplication::translate(
            "vel-gallery",
            "Write screenshots of every page, or of the page given with --page, to <dir> and exit."),
        QStringLiteral("dir"));
    QCommandLineOption scale(QStringLiteral("scale"), QString(), QStringLiteral("factor"),
                             QStringLiteral("0"));
    scale.setFlags(QCommandLineOption::HiddenFromHelp);
    parser.addOptions({page, screenshots, scale});
    parser.addPositionalArgument(
        QStringLiteral("file"),
        QCoreApplication::translate("vel-gallery", "The settings file that the settings page edits."),
        QStringLiteral("[file]"));

    Options options;
    options.error = Program::parse(parser);
    options.page = parser.value(page);
    options.screenshots = parser.value(screenshots);
    options.scale = parser.value(scale).toInt();
    options.context.settingsFile = parser.positionalArguments().value(0);
    return options;
}

bool hasPage(const QVector<GalleryPage> &pages, const QString &name)
{
    return std::any_of(pages.begin(), pages.end(),
                       [&name](const GalleryPage &page) { return page.name == name; });
}

bool writeScreenshots(const QVector<GalleryPage> &pages, const Options &options, const QStringList &arguments)
{
    if (options.scale == 0)
        return GalleryScreenshots::runAtEveryScale(arguments);
    QVector<GalleryPage> chosen;
    std::copy_if(pages.begin(), pages.end(), std::back_inserter(chosen), [&options](const GalleryPage &page) {
        return options.page.isEmpty() || page.name == options.page;
    });
    return GalleryScreenshots::writeAtThisScale(chosen, options.context, options.screenshots, options.scale);
}

int run(const Options &options, const QStringList &arguments)
{
    QApplication::setApplicationDisplayName(QCoreApplication::translate("vel-gallery", "Widget gallery"));
    const QVector<GalleryPage> pages = galleryPages();
    if (!options.page.isEmpty() && !hasPage(pages, options.page))
        return Program::fail(
            QCoreApplication::translate("vel-gallery", "there is no page %1").arg(options.page), NotShown);
    if (!options.screenshots.isEmpty())
        return writeScreenshots(pages, options, arguments) ? Done : NotShown;

    GalleryWindow window(pages, options.context);
    if (!options.page.isEmpty())
        window.showPage(options.page);
    QObject::connect(new QShortcut(QKeySequence(Qt::Key_F1), &window), &QShortcut::activated, &window,
                     [] { velHelpShow("vel-gallery"); });
    window.fitToScreen();
    window.show();
    return QApplication::exec();
}

} // namespace

int main(int argc, char **argv)
{
    // All of them, before the application object takes out those that are Qt's own.
    QStringList arguments;
    for (int i = 1; i < argc; ++i)
        arguments.append(QString::fromLocal8Bit(argv[i]));

    return Program::runWithWindows(argc, argv, QStringLiteral("vel-gallery"), WrongUsage, parse,
                                   [&arguments](const Options &options) { return run(options, arguments); });
}
