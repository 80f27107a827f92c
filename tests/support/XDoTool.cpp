// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "XDoTool.h"

#include <QProcess>
#include <QTest>
#include <QWidget>

namespace XDoTool {

namespace {

bool finish(QProcess &process, const QString &script)
{
    process.start(QStringLiteral("xdotool"), script.split(QLatin1Char(' '), Qt::SkipEmptyParts));
    return QTest::qWaitFor([&] { return process.state() == QProcess::NotRunning; }, 30000)
        && process.exitStatus() == QProcess::NormalExit && process.exitCode() == 0;
}

} // namespace

void run(const QString &script)
{
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
