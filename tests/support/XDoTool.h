// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QPoint>
#include <QString>

class QWidget;

/**
 * The mouse and the keyboard of the X server, for tests that work as a person does.
 *
 * Events go on while the tool works, also those of a drag. Keys are pressed once the modal window, if
 * there is one, has the focus.
 */
namespace XDoTool {

/// Runs the commands of \a script, separated by blanks; the test fails when one of them does.
void run(const QString &script);
/// What the commands of \a script print, without white space around it; empty when one fails.
QByteArray ask(const QString &script);

/// The arguments of a "mousemove" to \a place in \a widget.
QString at(const QWidget *widget, const QPoint &place);
void click(const QWidget *widget, const QPoint &place);
/// Clicks into the middle.
void click(const QWidget *widget);
/// Presses one key or combination, like "ctrl+a".
void press(const QString &keys);

} // namespace XDoTool
