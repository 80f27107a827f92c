// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "XDoTool.h"

#include <QApplication>
#include <QPointer>
#include <QProcess>
#include <QTest>
#include <QWidget>
#include <QWindow>

namespace XDoTool {

namespace {

constexpr int LongestWait = 5000; // milliseconds

bool finish(QProcess &process, const QString &script)
{
    process.start(QStringLiteral("xdotool"), script.split(QLatin1Char(' '), Qt::SkipEmptyParts));
    return QTest::qWaitFor([&] { return process.state() == QProcess::NotRunning; }, 30000)
        && process.exitStatus() == QProcess::NormalExit && process.exitCode() == 0;
}

// A modal window takes all keys, but only once it has the focus: until then they would go to the window
// behind it and be lost. For a dialog, QTest::qWaitForWindowActive() is content with its parent.
void awaitFocus(const QString &script)
{
    const QPointer<QWidget> modal(QApplication::activeModalWidget());
    const bool isForKeys =
        script.startsWith(QLatin1String("key ")) || script.startsWith(QLatin1String("type "));
    if (!modal || QApplication::activePopupWidget() || !isForKeys)
        return;
    const bool hasFocus = QTest::qWaitFor(
        [&modal] { return !modal || QGuiApplication::focusWindow() == modal->windowHandle(); }, LongestWait);
    Q_UNUSED(hasFocus) // a window that does not want it may be modal, too
}

} // namespace

void run(const QString &script)
{
    awaitFocus(script);
    QProcess process;
    QVERIFY2(finish(process, script),
             qPrintable(script + QLatin1String(": ") + process.errorString() + QLatin1Char(' ')
                        + QString::fromLocal8Bit(process.readAllStandardError())));
}

QByteArray ask(const QString &script)
{
    QProcess process;
    return finish(process, script) ? process.readAllStandardOutput().trimmed() : QByteArray();
}

// From the window's corner: Qt may not have heard yet where that is.
QString at(const QWidget *widget, const QPoint &place)
{
    const QWidget *window = widget->window();
    const QPoint inside = widget->mapTo(window, place);
    return QStringLiteral("--window %1 %2 %3").arg(window->winId()).arg(inside.x()).arg(inside.y());
}

void click(const QWidget *widget, const QPoint &place)
{
    run(QStringLiteral("mousemove %1 sleep 0.1 click 1").arg(at(widget, place)));
}

void click(const QWidget *widget)
{
    click(widget, widget->rect().center());
}

void press(const QString &keys)
{
    run(QStringLiteral("key --clearmodifiers %1").arg(keys));
}

} // namespace XDoTool
