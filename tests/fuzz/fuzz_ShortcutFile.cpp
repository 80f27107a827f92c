// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The window manager's file of global shortcuts. The first line of an input is a key sequence to
// look for, the rest is the file.

#include "FuzzTarget.h"

#include <shortcuts/GlobalShortcuts.h>

#include <QKeySequence>

void Fuzz::test(const QByteArray &input)
{
    const Parts parts = cut(input);
    const QKeySequence sequence = QKeySequence::fromString(QString::fromUtf8(parts.head));
    const QString path = write("keyshortcutrc", parts.rest);
    const QString found = GlobalShortcuts::find(path, sequence);
    require(GlobalShortcuts::find(path, sequence) == found, "the same file gives the same answer");

    // Whatever stands before it, a section of ours is found. But a zero byte ends the file, and an
    // open bracket alone in its line takes the next line for its name.
    if (parts.rest.contains('\0'))
        return;
    write("keyshortcutrc", parts.rest + "\n; end\n[ShortCutKeys]\nControl+Alt+F12=Ours\n");
    require(!GlobalShortcuts::find(path, QKeySequence(QStringLiteral("Ctrl+Alt+F12"))).isNull(),
            "no line hides the lines behind it");
}
