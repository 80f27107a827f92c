// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LanguageNote.h"

#include "LanguageCode.h"

namespace {

// The more exact languages, whose users see something else.
QStringList variantsOf(const QString &language, const LanguageNote::Languages &languages)
{
    QStringList variants;
    for (const QStringList &existing : languages) {
        for (const QString &other : existing) {
            if (other != language && LanguageCode::served(other).contains(language)
                && !variants.contains(other))
                variants.append(other);
        }
    }
    return variants;
}

} // namespace

QString LanguageNote::seen(const QString &language, const Languages &languages)
{
    bool hasOwn = false;
    bool isPartial = false;
    QString other;
    for (const QStringList &existing : languages) {
        const QString inForce = LanguageCode::inForce(language, existing);
        hasOwn = hasOwn || inForce == language;
        isPartial = isPartial || inForce != language;
        if (other.isEmpty() && inForce != language)
            other = inForce;
    }
    if (hasOwn && !isPartial)
        return tr("Users of %1 see these texts.").arg(language);
    if (hasOwn && !other.isEmpty())
        return tr("Users of %1 see these texts, and those of %2 where one is missing.").arg(language, other);
    if (hasOwn)
        return tr("Users of %1 see these texts, and those without a language where one is missing.")
            .arg(language);
    if (!other.isEmpty())
        return tr("Users of %1 see the texts of %2.").arg(language, other);
    return tr("Users of %1 see the texts without a language.").arg(language);
}

QString LanguageNote::text(const QString &language, const Languages &languages)
{
    const QStringList variants = variantsOf(language, languages);
    if (variants.isEmpty())
        return seen(language, languages);
    return tr("%1 Texts of their own have: %2.", "%1 is a sentence, %2 a list of languages")
        .arg(seen(language, languages), variants.join(QLatin1String(", ")));
}
