// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Translations.h"

#include <velcore/language.h>

namespace {

bool isList(const QString &key)
{
    return key == QLatin1String("Keywords");
}

} // namespace

void Translations::set(const QString &key, const QString &language, const QVariant &value)
{
    m_values.insert({key, language}, value);
}

void Translations::applyTo(VelUIDesktopEntry *entry,
                           const std::function<bool(const QString &key)> &isWanted) const
{
    for (auto value = m_values.begin(); value != m_values.end(); ++value) {
        const auto &[key, language] = value.key();
        if (!isWanted(key))
            continue;
        if (isList(key))
            entry->setTranslatedList(key, language, value->toStringList());
        else
            entry->setTranslation(key, language, value->toString());
    }
}

QVariant Translations::value(const VelUIDesktopEntry &entry, const QString &key, const QString &language)
{
    if (isList(key))
        return entry.getTranslatedList(key, language);
    return entry.getTranslation(key, language);
}

QVariant Translations::baseValue(const VelUIDesktopEntry &entry, const QString &key)
{
    if (key == QLatin1String("Name"))
        return entry.getName();
    if (key == QLatin1String("GenericName"))
        return entry.getGenericName();
    if (key == QLatin1String("Comment"))
        return entry.getComment();
    if (key == QLatin1String("Icon"))
        return entry.getIcon();
    return entry.getKeywords();
}

QString Translations::ownLanguage(const VelUIDesktopEntry &entry, const QString &key)
{
    const QString inForce = entry.getLanguageInForce(key);
    return inForce.isEmpty() ? QString::fromStdString(velLanguageCode()) : inForce;
}
