// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LanguageCode.h"

#include <QCollator>
#include <QHash>
#include <QLocale>
#include <QRegularExpression>

#include <algorithm>
#include <utility>

namespace {

struct Parts
{
    QString language;
    QString country; // with its "_"
    QString modifier; // with its "@"
};

// What is called the encoding counts for nothing.
Parts partsOf(const QString &code)
{
    const int modifier = code.indexOf(QLatin1Char('@'));
    QString rest = code.left(modifier);
    rest.truncate(rest.contains(QLatin1Char('.')) ? rest.indexOf(QLatin1Char('.')) : rest.size());
    const int country = rest.indexOf(QLatin1Char('_'));
    return {rest.left(country), country < 0 ? QString() : rest.mid(country),
            modifier < 0 ? QString() : code.mid(modifier)};
}

// The language alone is called by the shortest of its names: the others speak of a country, too.
QString shortestName(const QLocale &locale)
{
    QString shortest = locale.nativeLanguageName();
    const auto all = QLocale::matchingLocales(locale.language(), locale.script(), QLocale::AnyCountry);
    for (const QLocale &other : all) {
        const QString name = other.nativeLanguageName();
        if (!name.isEmpty() && name.size() < shortest.size())
            shortest = name;
    }
    return shortest;
}

QString findName(const QString &code)
{
    const Parts parts = partsOf(code);
    const QLocale locale(parts.language + parts.country);
    // An unknown language is given as "C", and an unknown country without a word.
    if (locale.name().section(QLatin1Char('_'), 0, 0) != parts.language)
        return {};
    QString name = parts.country.isEmpty() ? shortestName(locale) : locale.nativeLanguageName();
    if (!name.isEmpty())
        name[0] = name[0].toUpper();
    return name;
}

} // namespace

bool LanguageCode::isValid(const QString &code)
{
    static const QRegularExpression pattern(
        QStringLiteral("^[a-z]{2,8}(_([A-Z]{2}|[0-9]{3}))?(@[A-Za-z0-9]+)?$"));
    return pattern.match(code).hasMatch() && !code.endsWith(QLatin1Char('\n'));
}

QStringList LanguageCode::served(const QString &code)
{
    const Parts parts = partsOf(code);
    QStringList codes;
    for (const QString &candidate :
         {parts.language + parts.country + parts.modifier, parts.language + parts.country,
          parts.language + parts.modifier, parts.language}) {
        if (!codes.contains(candidate))
            codes.append(candidate);
    }
    return codes;
}

QString LanguageCode::inForce(const QString &code, const QStringList &existing)
{
    const QStringList codes = served(code);
    const auto found = std::find_if(codes.begin(), codes.end(), [&existing](const QString &candidate) {
        return existing.contains(candidate);
    });
    return found == codes.end() ? QString() : *found;
}

QString LanguageCode::nativeName(const QString &code)
{
    // Asked for at every change of an entry.
    static QHash<QString, QString> names;
    const auto known = names.constFind(code);
    return known == names.constEnd() ? *names.insert(code, findName(code)) : *known;
}

QStringList LanguageCode::known()
{
    QVector<QPair<QString, QString>> names;
    const auto locales =
        QLocale::matchingLocales(QLocale::AnyLanguage, QLocale::AnyScript, QLocale::AnyCountry);
    QStringList codes;
    for (const QLocale &locale : locales)
        codes.append(locale.name().section(QLatin1Char('_'), 0, 0));
    codes.removeDuplicates();
    for (const QString &code : std::as_const(codes)) {
        const QString name = isValid(code) ? nativeName(code) : QString();
        if (!name.isEmpty())
            names.append({name, code});
    }
    const QCollator collator;
    std::sort(names.begin(), names.end(), [&collator](const auto &left, const auto &right) {
        return collator.compare(left.first, right.first) < 0;
    });
    codes.clear();
    for (const auto &name : std::as_const(names))
        codes.append(name.second);
    return codes;
}
