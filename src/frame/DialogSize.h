// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSize>

class QString;
class QWidget;

/// The size that a dialog remembers in the application's default QSettings, as "Width" and "Height".
namespace DialogSize {

/**
 * Gives \a dialog the size kept under \a group, or \a fallback where none is; no number counts as 0.
 *
 * What is larger than the screen is cut to it when the dialog is first shown: the size may have been
 * kept on another screen.
 */
void restore(QWidget &dialog, const QString &group, QSize fallback);

/**
 * The same for a dialog that is just being shown, which keeps its own size where none is kept.
 *
 * For those who cannot reach a dialog before it finds its size.
 */
void restoreShown(QWidget &dialog, const QString &group);

/**
 * Keeps the size of \a dialog under \a group.
 *
 * Nothing is written when that size stands there already: QSettings waits for whoever holds the
 * lock of its file, and a dialog that was only opened and closed should not have to.
 */
void remember(const QWidget &dialog, const QString &group);

} // namespace DialogSize
