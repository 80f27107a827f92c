// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QString>
#include <QStringList>
#include <QVector>

/**
 * Which of many shortcuts a user wants to see: by words, by a key, by whether they were changed.
 */
class ShortcutFilter
{
public:
    /// What is known of a shortcut.
    struct Row
    {
        QString text; ///< all that words are looked for in, folded
        QVector<QKeySequence> keys;
        bool isChanged = false;
    };

    /// A text as it is compared: without case, and without accents.
    static QString folded(const QString &text);

    /// Shortcuts have to hold every word of \a text, in any order.
    void setText(const QString &text);
    /// A key of the shortcuts has to be \a key or to begin with it; an empty one asks for nothing.
    void setKey(const QKeySequence &key) { m_key = key; }
    /// Whether shortcuts have to be changed ones.
    void setChangedOnly(bool isOn) { m_changedOnly = isOn; }

    QKeySequence key() const { return m_key; }
    bool isChangedOnly() const { return m_changedOnly; }
    /// Whether it asks for anything.
    bool isActive() const { return m_changedOnly || !m_key.isEmpty() || !m_words.isEmpty(); }
    /// Whether a shortcut is to be seen.
    bool matches(const Row &row) const;

private:
    QStringList m_words;
    QKeySequence m_key;
    bool m_changedOnly = false;
};
