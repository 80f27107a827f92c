// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QMap>
#include <QSet>
#include <QString>
#include <QStringList>
#include <QVector>

/**
 * The project's source files, as text. All paths are relative to the project's folder.
 */
namespace SourceFiles {

/// One #include line.
struct Include
{
    QString file; ///< the file of ours that is meant; empty for what is not ours
    QString written; ///< what stands between the brackets
    int line; ///< counted from 1
};

/// The absolute path of \a file.
QString absolute(const QString &file);

/// The contents of \a file; empty when there is none.
QString textOf(const QString &file);

/// The .h, .cpp and .c files below \a folder, sorted.
QStringList below(const QString &folder);

/// Whether \a file lies below \a folder.
bool isBelow(const QString &file, const QString &folder);

/// The #include lines of \a file.
QVector<Include> includesOf(const QString &file);

/// The string literals of C++ \a text, without their quotation marks; comments have none.
QStringList stringLiterals(const QString &text);

/// The header and the source file of one name are a unit: their path without the suffix. A
/// public header belongs to the unit of the source file that has its name.
QString unitOf(const QString &file);

/// Which units each unit uses.
using Graph = QMap<QString, QSet<QString>>;

/// The groups of two and more units of which each uses every other, if by way of further ones.
QVector<QStringList> circles(const Graph &graph);

} // namespace SourceFiles
