// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

/// One text of a catalog's source file; a text with a number is there once for each of its forms.
struct Message
{
    QString context;
    QString source;
    QString comment;
    QString translation;
    QString type; ///< of the translation; empty when it is finished
    int number = -1; ///< one that takes this form of the translation; -1 where no number is told

    /// The text's line in a list of texts.
    QString line() const;
};

/// A catalog's source file.
struct Catalog
{
    QString language;
    QVector<Message> messages;
    QString error; ///< empty when the file could be read

    static Catalog read(const QString &path);

    /// The lines of all texts, each once, sorted.
    QStringList lines() const;
};
