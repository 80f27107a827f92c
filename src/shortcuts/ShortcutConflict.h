// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QString>

class ShortcutsModel;

/**
 * Who has a key already.
 */
struct ShortcutConflict
{
    enum Kind {
        None, ///< the key is free
        Global, ///< a global shortcut of the desktop has it
        Local ///< a shortcut of the model has it
    };

    Kind kind = None;
    QString holder; ///< the name of the global action, or the text of the shortcut

    /**
     * Looks for the holder of a key, first among the global shortcuts, then in a model.
     *
     * Whole sequences are compared. An empty key, and one that is no known key, is free.
     */
    static ShortcutConflict find(const ShortcutsModel &model, const QKeySequence &key);

    /// Whether a global action keeps its key from others; its icon actions do not.
    static bool blocksKey(const QString &globalAction);
};
