// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

/// What follows from the type of an entry; knows no widget.
namespace EntryTypeRules {

inline const QLatin1String Application("Application");
inline const QLatin1String Link("Link");
inline const QLatin1String Directory("Directory");

/// The types of entries that a row of the form is for.
enum class ShownFor { All, Applications, Links };

/// Whether a row is shown for an entry of \a type.
bool isShown(ShownFor row, const QString &type);

/// The types to choose from when \a allowed are asked for: all of them when it is empty.
QStringList choices(const QStringList &allowed);

/// Whether the form shows a choice between \a choices for an entry of \a type: a folder that can
/// be nothing else has none.
bool hasChoice(const QString &type, const QStringList &choices);

/// The type that a new entry gets and those that the user may turn it into.
struct NewEntry
{
    QString type; ///< empty where the path says nothing
    QStringList allowed;
};

/// What a new entry at \a path may be.
NewEntry newEntryAt(const QString &path);

} // namespace EntryTypeRules
