// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QMessageBox>

/**
 * Message boxes that may outlive the widget they belong to.
 *
 * The static functions of QMessageBox keep the box on the stack; when the parent goes away
 * while it is open, it is deleted there.
 */
namespace MessageBox {

/**
 * Shows a box and waits for an answer, as the static functions of QMessageBox do.
 *
 * The text is plain text: names of files and actions that stand in it may look like rich text.
 *
 * @return the button pressed; NoButton when \a parent went away meanwhile, after which the
 *         caller must not touch it
 */
QMessageBox::StandardButton show(QWidget *parent, QMessageBox::Icon icon, const QString &title,
                                 const QString &text, QMessageBox::StandardButtons buttons = QMessageBox::Ok,
                                 QMessageBox::StandardButton defaultButton = QMessageBox::NoButton);

} // namespace MessageBox
