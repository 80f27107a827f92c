// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

#include <QMap>
#include <QPair>
#include <QString>
#include <QVariant>

#include <functional>

/// What was edited of an entry in languages that are not the user's, and is not saved yet.
class Translations
{
public:
    bool isEmpty() const { return m_values.isEmpty(); }
    /// Sets a text or a list; an empty one removes the key.
    void set(const QString &key, const QString &language, const QVariant &value);
    /// Writes the values of the keys that \a isWanted; nothing else of the entry changes.
    void applyTo(VelUIDesktopEntry *entry, const std::function<bool(const QString &key)> &isWanted) const;

    bool operator==(const Translations &other) const { return m_values == other.m_values; }
    bool operator!=(const Translations &other) const { return m_values != other.m_values; }

    /// The text or the list that \a key has in \a language.
    static QVariant value(const VelUIDesktopEntry &entry, const QString &key, const QString &language);
    /// The value of \a key without a language.
    static QVariant baseValue(const VelUIDesktopEntry &entry, const QString &key);
    /// The language in which the user's row edits \a key.
    static QString ownLanguage(const VelUIDesktopEntry &entry, const QString &key);

private:
    QMap<QPair<QString, QString>, QVariant> m_values;
};
