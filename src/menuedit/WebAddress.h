// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QList>
#include <QString>
#include <QUrl>
#include <QVector>

/**
 * An address in the web, or one that mail is sent to, which may become an entry of the menu.
 */
struct WebAddress
{
    QUrl url;
    QString title; ///< what the page that it was taken from calls it; may be empty

    /// Whether \a url is one: of http, https or ftp with a host, or of mailto with an address.
    static bool isOne(const QUrl &url);

    /// The name of an entry for it: the title, else the host or the mail address.
    QString name() const;
    /// What the file of an entry for it is called before its suffix, in plain characters.
    QString fileStem() const;
    /// Writes an entry for it to the new file \a path; whether it was saved.
    bool save(const QString &path) const;

    /// The addresses in \a text, in which browsers hand out what they show, as "text/x-moz-url" or
    /// "_NETSCAPE_URL": lines that are in turn an address and its title, in UTF-16 or UTF-8.
    static QVector<WebAddress> parsed(const QByteArray &text);
    /// The \a urls with the titles that any of the \a texts has for them.
    static QVector<WebAddress> withTitles(const QList<QUrl> &urls, const QList<QByteArray> &texts);
};
