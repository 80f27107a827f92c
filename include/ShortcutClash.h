// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QKeySequence>
#include <QString>
#include <QVector>

class QWidget;
class ShortcutsModel;

/**
 * Something that speaks against a key for a shortcut, in words for the user.
 *
 * \code
 * const QVector<ShortcutClash> clashes = ShortcutClash::find(*model, name, key, window);
 * for (const ShortcutClash &clash : clashes)
 *     list->addItem(clash.text);
 * \endcode
 *
 * EditShortcutsDialog refuses a pending key of another shortcut and a GlobalKey; all else is
 * advice.
 *
 * A plain value; find() is for the GUI thread alone.
 *
 * \image html shortcut-clash.png
 *
 * \since 1.0
 */
struct VELUIEXTRA_EXPORT ShortcutClash
{
    /// What a key clashes with.
    enum Kind {
        SameKey, ///< another shortcut of the model has it, as its pending key or as a further one
        Prefix, ///< it begins the longer key of another shortcut of the model, or the other way round
        Mnemonic, ///< its first chord opens a menu, or leads to a widget, of the window
        StandardKey, ///< its first chord is a standard key of the platform
        GlobalKey, ///< a global shortcut of the desktop has it
        BareKey, ///< its first chord is what one types a character with
        NotOnLayout ///< the keyboard layout in use cannot produce one of its chords
    };

    Kind kind; ///< what it clashes with
    QString text; ///< a whole translated sentence; plain text
    QString otherName; ///< the name of the other shortcut of the model; else empty

    /**
     * Finds everything that speaks against a key.
     *
     * The pending keys of a model are looked at, the further keys of its actions, and the names of
     * its shortcuts, so that a key may be looked up before it is set. Shortcuts with the same name, in
     * whatever group, are one.
     *
     * The file of global shortcuts and the keyboard layout are read anew at every call. A window
     * manager's icon actions keep no key from others. Whether a key is on the layout is known under
     * X11 alone, and of keys that X11 has; other keys pass.
     *
     * To be called on the GUI thread; keeps no state.
     *
     * @param model the model
     * @param name the name of the shortcut that is to get the key; need not be in the model
     * @param key the key; an empty one, and one that is no known key, clashes with nothing
     * @param window the window in which the shortcut is to work, for the mnemonics of its menu
     *               bar and its widgets, which are looked at if they would show; null for none
     * @return the clashes by kind, in the order of Kind, those of one kind in the order of the
     *         rows; empty when there is none
     */
    static QVector<ShortcutClash> find(const ShortcutsModel &model, const QString &name,
                                       const QKeySequence &key, const QWidget *window = nullptr);
};
