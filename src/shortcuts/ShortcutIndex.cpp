// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutIndex.h"

#include "FurtherKeys.h"
#include "IShortcutObject.h"
#include "ShortcutChange.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"

#include <frame/QtMajor.h>

namespace {

// Between texts that no word may span.
constexpr QChar Border = QLatin1Char('\n');

QString groupName(const ShortcutsModel &model, int group)
{
    return ShortcutFilter::folded(model.index(group, 0).data().toString());
}

} // namespace

ShortcutIndex::Matches ShortcutIndex::matches(const ShortcutsModel &model, const ShortcutFilter &filter)
{
    begin(model);
    Matches matches(m_groups.size());
    for (int group = 0; group < m_groups.size(); ++group) {
        const QVector<const IShortcutObject *> objects = ShortcutRows::ofGroup(model, group);
        const QString name = groupName(model, group);
        matches[group].resize(objects.size());
        for (int row = 0; row < objects.size(); ++row) {
            const IShortcutObject *object = objects.at(row);
            if (!object)
                continue;
            Entry &entry = m_groups[group][row];
            if (!entry.isRead)
                entry = entryOf(*object, name);
            else if (entry.key != object->keySequence())
                setKey(&entry, *object);
            if (filter.isChangedOnly())
                entry.row.isChanged = ShortcutChange::isChanged(*object);
            matches[group][row] = filter.matches(entry.row);
        }
    }
    return matches;
}

bool ShortcutIndex::readSome(const ShortcutsModel &model, int count)
{
    begin(model);
    for (; m_group < m_groups.size(); ++m_group, m_row = 0) {
        const QVector<const IShortcutObject *> objects = ShortcutRows::ofGroup(model, m_group);
        const QString name = groupName(model, m_group);
        for (; m_row < objects.size(); ++m_row) {
            if (count-- == 0)
                return true;
            Entry &entry = m_groups[m_group][m_row];
            if (objects.at(m_row) && !entry.isRead)
                entry = entryOf(*objects.at(m_row), name);
        }
    }
    return false;
}

void ShortcutIndex::begin(const ShortcutsModel &model)
{
    if (fits(model))
        return;
    m_groups = QVector<QVector<Entry>>(model.rowCount());
    for (int group = 0; group < m_groups.size(); ++group)
        m_groups[group].resize(model.rowCount(model.index(group, 0)));
    m_group = 0;
    m_row = 0;
}

bool ShortcutIndex::fits(const ShortcutsModel &model) const
{
    bool fits = m_groups.size() == model.rowCount();
    for (int group = 0; fits && group < m_groups.size(); ++group)
        fits = m_groups.at(group).size() == model.rowCount(model.index(group, 0));
    return fits;
}

ShortcutIndex::Entry ShortcutIndex::entryOf(const IShortcutObject &object, const QString &group)
{
    Entry entry;
    entry.names = ShortcutFilter::folded(object.text()) + Border + group + Border;
    setKey(&entry, object);
    entry.isRead = true;
    return entry;
}

void ShortcutIndex::setKey(Entry *entry, const IShortcutObject &object)
{
    entry->key = object.keySequence();
    entry->row.keys = {entry->key};
    const QList<QKeySequence> furtherKeys = FurtherKeys::of(object);
    for (const QKeySequence &key : furtherKeys)
        entry->row.keys.append(key);
    entry->row.text = entry->names;
    for (const QKeySequence &key : qAsConst(entry->row.keys))
        entry->row.text += textOf(key);
}

QString ShortcutIndex::textOf(const QKeySequence &key)
{
    QString portable;
    QString native;
    for (int i = 0; i < key.count(); ++i) {
        const int chord = QtMajor::chord(key, i);
        ChordText &text = m_chords[chord];
        if (text.portable.isNull())
            text = {ShortcutFilter::folded(QKeySequence(chord).toString(QKeySequence::PortableText)),
                    ShortcutFilter::folded(QKeySequence(chord).toString(QKeySequence::NativeText))};
        const QLatin1String separator(i > 0 ? ", " : "");
        portable += separator + text.portable;
        native += separator + text.native;
    }
    return native == portable ? portable + Border : portable + Border + native + Border;
}
