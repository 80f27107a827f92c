// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QString>

class ShortcutsModel;

/**
 * The keys of an application on a sheet: to print, to mail, to put on the clipboard.
 *
 * \code
 * QGuiApplication::clipboard()->setText(ShortcutSheet::plainText(*model));
 * \endcode
 *
 * A sheet has the groups and rows of a ShortcutsModel in the order in which it shows them, with
 * the pending keys and the further ones of actions as QKeySequence::NativeText. Shortcuts without a
 * key stand there, too; groups without a shortcut do not. Line breaks and runs of blanks in names
 * become one blank.
 *
 * The functions keep no state, change nothing and cannot fail. They are to be called on the GUI thread.
 *
 * \image html shortcut-sheet.png
 *
 * \since 1.0
 */
namespace ShortcutSheet {

/**
 * Returns a whole HTML document, with a table for each group.
 *
 * It needs nothing but itself, and a page break leaves rows whole. It has the language of the
 * default QLocale and, where that is written so, the attribute dir="rtl". What is saved as a file
 * has to be written as UTF-8.
 *
 * @param model the model; without a shortcut the document has no table
 */
VELUIEXTRA_EXPORT QString html(const ShortcutsModel &model);

/**
 * Returns lines of text: each group under its name, the keys in one column.
 *
 * The columns are aligned in a font of fixed width, where Chinese, Japanese and Korean characters
 * are two columns wide. No line ends in a blank; the last one ends in a line feed.
 *
 * @param model the model; without a shortcut the text is empty
 */
VELUIEXTRA_EXPORT QString plainText(const ShortcutsModel &model);

} // namespace ShortcutSheet
