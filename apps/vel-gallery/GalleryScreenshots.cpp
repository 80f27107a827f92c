// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryScreenshots.h"

#include "GalleryWindow.h"

#include <support/Program.h>

#include <QApplication>
#include <QDeadlineTimer>
#include <QDir>
#include <QPixmap>
#include <QProcess>
#include <QStyle>

namespace {

constexpr int scales[] = {1, 2};
constexpr int readyTimeout = 10000; // milliseconds

QPalette darkPalette()
{
    const QColor window(0x31, 0x36, 0x3b);
    const QColor text(0xef, 0xf0, 0xf1);
    const QColor gray(0x7f, 0x8c, 0x8d);
    QPalette palette(text, window.lighter(115), window.lighter(150), window.darker(150), window.darker(120),
                     text, Qt::white, QColor(0x23, 0x26, 0x29), window);
    palette.setColor(QPalette::Highlight, QColor(0x3d, 0xae, 0xe9));
    palette.setColor(QPalette::HighlightedText, Qt::white);
    palette.setColor(QPalette::AlternateBase, window);
    palette.setColor(QPalette::ToolTipBase, window);
    palette.setColor(QPalette::ToolTipText, text);
    palette.setColor(QPalette::Link, QColor(0x3d, 0xae, 0xe9));
    palette.setColor(QPalette::PlaceholderText, gray);
    for (const QPalette::ColorRole role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(QPalette::Disabled, role, gray);
    return palette;
}

bool waitUntilReady(const GalleryPage &page, QWidget *widget)
{
    const QDeadlineTimer deadline(readyTimeout);
    do {
        QCoreApplication::processEvents(QEventLoop::AllEvents, 50);
        if (!page.isReady || page.isReady(widget)) {
            QCoreApplication::processEvents();
            return true;
        }
    } while (!deadline.hasExpired());
    Program::printError(
        QCoreApplication::translate("vel-gallery", "the page %1 did not finish loading").arg(page.name));
    return false;
}

bool writeScreenshot(GalleryWindow *window, const GalleryPage &page, const QString &path)
{
    window->showPage(page.name);
    if (!waitUntilReady(page, window->currentPage()))
        return false;
    if (window->grab().save(path))
        return true;
    Program::printError(QCoreApplication::translate("vel-gallery", "cannot write %1").arg(path));
    return false;
}

} // namespace

namespace GalleryScreenshots {

bool writeAtThisScale(const QVector<GalleryPage> &pages, const GalleryContext &context,
                      const QString &directory, int scale)
{
    if (!QDir().mkpath(directory)) {
        Program::printError(
            QCoreApplication::translate("vel-gallery", "cannot make the folder %1").arg(directory));
        return false;
    }
    const struct
    {
        QString name;
        QPalette palette;
    } palettes[] = {
        {QStringLiteral("light"), QApplication::style()->standardPalette()},
        {QStringLiteral("dark"), darkPalette()},
    };
    bool written = true;
    for (const auto &palette : palettes) {
        QApplication::setPalette(palette.palette);
        for (const Qt::LayoutDirection direction : {Qt::LeftToRight, Qt::RightToLeft}) {
            QApplication::setLayoutDirection(direction);
            GalleryWindow window(pages, context);
            window.show();
            for (const GalleryPage &page : pages) {
                const QString name =
                    QStringLiteral("%1-%2-%3-%4.png")
                        .arg(page.name, palette.name,
                             direction == Qt::LeftToRight ? QStringLiteral("ltr") : QStringLiteral("rtl"),
                             QString::number(scale));
                written = writeScreenshot(&window, page, QDir(directory).filePath(name)) && written;
            }
        }
    }
    return written;
}

bool runAtEveryScale(const QStringList &arguments)
{
    bool succeeded = true;
    for (const int scale : scales) {
        QProcess process;
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("QT_SCALE_FACTOR"), QString::number(scale));
        process.setProcessEnvironment(environment);
        process.setProcessChannelMode(QProcess::ForwardedChannels);
        // In front: what follows "--" is no option.
        process.start(QCoreApplication::applicationFilePath(),
                      QStringList{QStringLiteral("--scale"), QString::number(scale)} + arguments);
        succeeded = process.waitForFinished(-1) && process.exitStatus() == QProcess::NormalExit
            && process.exitCode() == 0 && succeeded;
    }
    return succeeded;
}

} // namespace GalleryScreenshots
