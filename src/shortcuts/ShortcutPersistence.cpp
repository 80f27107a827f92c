// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The part of the model that moves keys in bulk: between settings, objects and edits.

#include "ShortcutsModel.h"

#include "KeySequences.h"

#include <QSettings>

namespace {

// Enters a group of the settings, if one is named, for as long as it lives.
class SettingsGroup
{
public:
    SettingsGroup(QSettings *settings, const QString &name)
        : m_settings(name.isEmpty() ? nullptr : settings)
    {
        if (m_settings)
            m_settings->beginGroup(name);
    }

    ~SettingsGroup()
    {
        if (m_settings)
            m_settings->endGroup();
    }

    Q_DISABLE_COPY(SettingsGroup)

private:
    QSettings *const m_settings;
};

} // namespace

// NOLINTNEXTLINE(performance-unnecessary-value-param)
void ShortcutsModel::loadKeys(QSettings *settings, QString settingsGroup)
{
    if (!settings)
        return;
    const SettingsGroup group(settings, settingsGroup);
    const QStringList names = settings->childKeys();
    for (const QString &name : names) {
        const QString text = settings->value(name, QVariant()).toString();
        m_loadedKeys.insert(name, KeySequences::fromSavedText(text));
    }
}

// NOLINTNEXTLINE(performance-unnecessary-value-param)
void ShortcutsModel::saveKeys(QSettings *settings, QString settingsGroup)
{
    if (!settings)
        return;
    const SettingsGroup settingsGroupGuard(settings, settingsGroup);
    for (const Group &group : qAsConst(m_groups)) {
        for (auto it = group.cbegin(); it != group.cend(); ++it) {
            if (it->isEmpty())
                continue;
            const QKeySequence key = it->constFirst()->objectKeySequence();
            // Its text would be another key the next time.
            if (!KeySequences::survivesSaving(key))
                continue;
            settings->setValue(it.key(), key.toString(QKeySequence::PortableText));
            m_loadedKeys.insert(it.key(), key);
        }
    }
}

void ShortcutsModel::commitChanges()
{
    QVector<QPointer<IShortcutObject>> objects;
    for (int group = 0; group < m_groups.size(); ++group)
        objects += objectsOf(group);
    for (const QPointer<IShortcutObject> &object : qAsConst(objects)) {
        if (object)
            object->apply();
    }
}

void ShortcutsModel::resetShortcuts()
{
    for (int group = 0; group < m_groups.size(); ++group) {
        const auto objects = objectsOf(group);
        for (const QPointer<IShortcutObject> &object : objects) {
            if (object)
                object->reset();
        }
        emitKeysChanged(group);
    }
}

void ShortcutsModel::restoreDefaults()
{
    for (int group = 0; group < m_groups.size(); ++group) {
        const auto objects = objectsOf(group);
        for (const QPointer<IShortcutObject> &object : objects) {
            if (object)
                object->setKeySequence(object->defaultKeySequence());
        }
        emitKeysChanged(group);
    }
}

// What a host does when it hears of a new key may destroy shortcuts or register others, so
// that the lists must not be walked meanwhile.
QVector<QPointer<IShortcutObject>> ShortcutsModel::objectsOf(int group) const
{
    QVector<QPointer<IShortcutObject>> objects;
    const Group &names = m_groups.at(group);
    objects.reserve(names.size());
    for (const Objects &list : names) {
        for (IShortcutObject *object : list)
            objects.append(object);
    }
    return objects;
}

void ShortcutsModel::emitKeysChanged(int group)
{
    const QModelIndex parent = index(group, 0);
    Q_EMIT dataChanged(index(0, 1, parent), index(rowCount(parent) - 1, 1, parent));
}
