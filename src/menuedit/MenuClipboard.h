// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/QtMajor.h>

#include <QByteArrayList>
#include <QList>
#include <QMimeData>
#include <QString>
#include <QStringList>
#include <QUrl>

/**
 * The formats in which menu items travel over the clipboard and in a drag.
 *
 * "text/uri-list" holds the bytes "file:/", the path of the item in the local 8-bit encoding
 * and a line feed; "text/uri-move-list" holds the same and marks a cut by its presence. Those
 * bytes are no proper URL, so other programs are offered their own formats beside them.
 */
namespace MenuClipboard {

/// The type that every item has.
QString copyFormat();
/// The type that a cut item has as well.
QString moveFormat();

/// The bytes of both types for the item at \a path.
QByteArray encoded(const QString &path);

/**
 * Menu items on the clipboard, a line for each. Keeps their bytes exactly, which a plain QMimeData
 * does not: that one stores parsed URLs and writes them anew. urls() gives the exact paths all the same.
 */
class ItemData : public QMimeData
{
    Q_OBJECT

public:
    /// The item at the absolute \a path, cut when \a action is Qt::MoveAction, else copied.
    ItemData(const QString &path, Qt::DropAction action);
    /// The same for several.
    ItemData(const QStringList &paths, Qt::DropAction action);

    QStringList paths() const { return m_paths; }

    QStringList formats() const override;
    bool hasFormat(const QString &mimeType) const override;

protected:
    QVariant retrieveData(const QString &mimeType, QtMajor::MimeType type) const override;

private:
    QByteArray bytesOf(const QString &mimeType) const;

    QStringList m_paths;
    bool m_isCut;
};

/// The format of ours that \a data has, a cut before a copy; empty when there is none.
QString format(const QMimeData *data);

/// Whether a clipboard that offers the \a types, by their names on X11, has a format of ours.
bool areFiles(const QByteArrayList &types);

/// The URLs that \a data has in \a format. Text without a line separator is complained about
/// on standard error and is one URL.
QList<QUrl> urls(const QMimeData *data, const QString &format);

/**
 * The local files that the URL list of \a data means, whoever wrote it: this process, another
 * one with the bytes of ours, or any program that writes proper URLs. Clean absolute paths;
 * an empty string stands for a URL that is no local file.
 */
QStringList localPaths(const QMimeData *data);

/// The URLs among them that are no local files, in their order.
QList<QUrl> foreignUrls(const QMimeData *data);

/// The texts of \a data in which browsers give titles for URLs; see WebAddress::parsed().
QList<QByteArray> titleTexts(const QMimeData *data);

} // namespace MenuClipboard
