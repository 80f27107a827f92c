// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

#include <QString>
#include <QVariant>

/// Another value for one key of an entry, which mends what was found.
struct EntryRepair
{
    QString label; ///< what it does, for a button
    QString key;
    QVariant value; ///< a text, a list of texts or a bool; empty to take the key away
    QString action = {}; ///< the id of the action that has the key; empty for the entry itself

    /// Gives \a entry the value; no other key changes.
    void applyTo(VelUIDesktopEntry *entry) const;
    /// Whether it makes a difference to \a entry: a record leaves a line alone that already says so.
    bool changes(const VelUIDesktopEntry &entry) const;

private:
    void applyToAction(VelUIDesktopEntry *entry) const;
    bool changesAction(const VelUIDesktopEntry &entry) const;
};
