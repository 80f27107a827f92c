// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// What other programs put on the clipboard. The first letter of an input says which formats there
// are, the rest of the first line is the name of a file, and what follows are the bytes.

#include "FuzzTarget.h"

#include <menuedit/MenuClipboard.h>

#include <QFile>
#include <QMimeData>

namespace {

const char *const formats[] = {"text/uri-list", "text/uri-move-list", "x-special/gnome-copied-files",
                               "application/x-kde-cutselection", "text/plain"};

void tryAnyBytes(int kinds, const QByteArray &bytes)
{
    QMimeData data;
    for (const char *format : formats) {
        if ((kinds & 1) != 0)
            data.setData(QLatin1String(format), bytes);
        kinds >>= 1;
    }
    const QString format = MenuClipboard::format(&data);
    if (!format.isEmpty())
        MenuClipboard::urls(&data, format);
    const QStringList paths = MenuClipboard::localPaths(&data);
    for (const QString &path : paths) {
        Fuzz::require(path.isEmpty() || path.startsWith(QLatin1Char('/')), "a path is absolute");
        Fuzz::require(!path.contains(QLatin1String("/../")) && !path.contains(QLatin1String("/./")),
                      "a path is clean");
    }
}

bool canBeName(const QByteArray &name)
{
    return !name.isEmpty() && name.size() < 200 && !name.contains('/') && !name.contains('\0') && name != "."
        && name != ".." && QString::fromUtf8(name).toUtf8() == name;
}

// What another process of ours gets to see of an item.
void tryOwnBytes(const QByteArray &name, Qt::DropAction action)
{
    const QString path = Fuzz::write(name.constData(), QByteArray());
    const MenuClipboard::ItemData item(path, action);
    QMimeData received;
    const QStringList offered = item.formats();
    for (const QString &format : offered)
        received.setData(format, item.data(format));
    const QStringList paths = MenuClipboard::localPaths(&received);
    QFile::remove(path);
    Fuzz::require(paths == QStringList{path}, "an item comes out of the clipboard as it went in");
}

} // namespace

void Fuzz::test(const QByteArray &input)
{
    const Parts parts = cut(input);
    const int kinds = parts.head.isEmpty() ? 0 : parts.head.at(0);
    tryAnyBytes(kinds, parts.rest);
    const QByteArray name = parts.head.mid(1);
    if (canBeName(name))
        tryOwnBytes(name, (kinds & 0x20) != 0 ? Qt::MoveAction : Qt::CopyAction);
}
