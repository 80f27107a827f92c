// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QString>

class QKeySequence;

/**
 * Translates between Qt's key codes and the key strings of the window manager, and looks up
 * the desktop's global shortcuts.
 *
 * A key string is a list of names joined by "+": any number of modifiers ("Ctrl" or
 * "Control", "Shift", "Alt", "Meta" or "Mod4", in any case) and one key, named as the X
 * Window System names its key symbols ("a", "Return", "F5", "space"; the case matters).
 *
 * The functions keep no state and report no error but by an empty result. They are to be
 * called on the GUI thread of an application that runs under X11; elsewhere the usual
 * assignment of the modifiers is assumed.
 *
 * \image html gallery-key-names.png
 *
 * \since 1.0
 */
namespace VelKeyServer {

/**
 * Returns the key string of a Qt key code.
 *
 * The modifiers are written in the order "Ctrl", "Shift", "Alt", "Mod4".
 *
 * @param code a Qt::Key or-ed with Qt::KeyboardModifier bits, as one element of a
 *             QKeySequence holds it
 * @return the key string, for instance "Ctrl+Alt+F2"; a null string when X11 has no such
 *         key; an empty string that is not null when the key's symbol has no name
 */
VELUIEXTRA_EXPORT QString KeyQtToKeyStringX(int code);

/**
 * Returns the shortcut that a key string stands for, as QKeySequence::PortableText.
 *
 * Parts before the last one that name no modifier are skipped.
 *
 * @param text a key string
 * @return the text, for instance "Ctrl+Alt+F2"; a null string when the key is unknown, is
 *         given by number ("#23"), is one of the Super keys themselves or has no Qt key
 */
VELUIEXTRA_EXPORT QString KeyStringXToQt(const QString &text);

/**
 * Looks a key sequence up in the window manager's file of global shortcuts.
 *
 * The file is "keyshortcutrc" and the session's suffix in the window manager's directory. It
 * is read anew at every call. Only its section "ShortCutKeys" counts, where each key is a key
 * string ("|" may stand for "+") or a Qt key text, and each value the name of an action.
 *
 * Sequences are compared as a whole: "Ctrl+K" and "Ctrl+K, Ctrl+C" are two different ones,
 * although the first begins the second. A key that cannot be parsed matches nothing.
 *
 * @param sequence the sequence to look for
 * @return the name of the global action as it stands in the file, without quotes; of two
 *         keys with the same sequence the one that sorts first. A null string when
 *         none is bound to it or the file cannot be read
 */
VELUIEXTRA_EXPORT QString checkForGlobalShortcut(const QKeySequence &sequence);

} // namespace VelKeyServer
