// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CategoryCheck.h"

#include "ItemRepair.h"
#include "RegisteredCategories.h"

#include <QCoreApplication>
#include <QSet>

#include <algorithm>

namespace {

using RegisteredCategories::Category;
using RegisteredCategories::Kind;

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

const QStringList &names()
{
    static const QStringList all = [] {
        QStringList list;
        for (const Category &category : RegisteredCategories::all())
            list.append(category.name);
        return list;
    }();
    return all;
}

void checkUnknown(const QByteArray &item, const CheckedValue &value)
{
    const QString name = EntryText::text(item);
    if (item.isEmpty())
        return value.add(EntryProblem::UnknownCategory, EntryFinding::Error,
                         Text::tr("A category is empty."));
    const QString meant = ItemRepair::meant(item, names());
    const QString better = meant.isEmpty() ? QLatin1String("X-") + name.trimmed() : meant;
    value.add(
        EntryProblem::UnknownCategory, EntryFinding::Error,
        Text::tr("There is no registered category '%1'; one of your own has to begin with 'X-'.").arg(name),
        Text::tr("Change it to '%1'").arg(better), ItemRepair::replaced(value, item, {better}));
}

bool hasAll(const QStringList &wanted, const QStringList &items)
{
    return std::all_of(wanted.cbegin(), wanted.cend(),
                       [&](const QString &name) { return items.contains(name); });
}

QString listed(const QVector<QStringList> &related)
{
    QStringList texts;
    for (const QStringList &list : related)
        texts.append(list.join(QLatin1String(" + ")));
    return texts.join(QLatin1String(", "));
}

// What \a category needs and \a items lack, and what that needs in its turn.
QStringList missingFor(const Category &category, const QStringList &items)
{
    QStringList missing;
    const auto add = [&](const Category &needing) {
        for (const QString &name : needing.related.value(0)) {
            if (!items.contains(name) && !missing.contains(name))
                missing.append(name);
        }
    };
    add(category);
    for (int i = 0; i < missing.size(); ++i) {
        const Category *const needed = RegisteredCategories::find(missing.at(i));
        if (needed && needed->kind == Kind::Main)
            add(*needed);
    }
    return missing;
}

// A main category that wants another one may not stand without it.
void checkRelated(const Category &category, const QStringList &items, const CheckedValue &value)
{
    const auto isSatisfied = [&items](const QStringList &list) { return hasAll(list, items); };
    if (category.related.isEmpty()
        || std::any_of(category.related.cbegin(), category.related.cend(), isSatisfied))
        return;
    const QStringList added = missingFor(category, items);
    const bool isMain = category.kind == Kind::Main;
    const QString sentence = isMain ? Text::tr("The category '%1' also needs: %2.")
                                    : Text::tr("The category '%1' goes with one of these: %2.");
    value.add(EntryProblem::MissingRelatedCategory, isMain ? EntryFinding::Error : EntryFinding::Hint,
              sentence.arg(category.name, listed(category.related)),
              Text::tr("Add '%1'").arg(added.join(QLatin1String("', '"))),
              value.isLong ? QStringList() : items + added);
}

void checkKnown(const Category &category, const QByteArray &item, const QStringList &items,
                const CheckedValue &value)
{
    const QString remove = Text::tr("Remove it");
    if (category.kind == Kind::Deprecated)
        value.add(EntryProblem::DeprecatedCategory, EntryFinding::Warning,
                  Text::tr("The category '%1' is out of use.").arg(category.name), remove,
                  ItemRepair::replaced(value, item, {}));
    else if (category.kind == Kind::Reserved && !EntryText::key(value.group, "OnlyShowIn"))
        value.add(EntryProblem::ReservedCategory, EntryFinding::Error,
                  Text::tr("The category '%1' is only for entries that list desktops in 'Only show in'.")
                      .arg(category.name),
                  remove, ItemRepair::replaced(value, item, {}));
    else
        checkRelated(category, items, value);
}

// Audio and Video go with AudioVideo and are no further place in a menu.
int mainPlaces(const QStringList &items)
{
    int places = 0;
    const bool hasBoth = items.contains(QLatin1String("AudioVideo"));
    for (const QString &name : items) {
        const Category *category = RegisteredCategories::find(name);
        const bool isPlace = category && category->kind == Kind::Main;
        places += isPlace && (category->related.isEmpty() || !hasBoth) ? 1 : 0;
    }
    return places;
}

void checkMain(const QStringList &items, const CheckedValue &value)
{
    const int places = mainPlaces(items);
    if (places == 0)
        value.add(EntryProblem::MissingMainCategory, EntryFinding::Hint,
                  Text::tr("No main category is among them, so menus may not know where to show the entry."));
    else if (places > 1)
        value.add(
            EntryProblem::SeveralMainCategories, EntryFinding::Hint,
            Text::tr("Several main categories are among them, so the entry may be shown more than once."));
}

} // namespace

void CategoryCheck::check(const CheckedValue &value)
{
    if (value.key.value.isEmpty())
        return;
    const QByteArrayList written = EntryText::items(value.key.value);
    QStringList items;
    QSet<QByteArray> seen;
    for (const QByteArray &item : written)
        items.append(EntryText::text(item));
    for (int i = 0; i < written.size(); ++i) {
        const Category *category = RegisteredCategories::find(items.at(i));
        if (seen.contains(written.at(i)))
            value.add(EntryProblem::RepeatedItem, EntryFinding::Warning,
                      Text::tr("'%1' stands more than once.").arg(items.at(i)), Text::tr("Keep the first"),
                      ItemRepair::replaced(value, written.at(i), {items.at(i)}));
        else if (category)
            checkKnown(*category, written.at(i), items, value);
        else if (!RegisteredCategories::isExtension(items.at(i)))
            checkUnknown(written.at(i), value);
        seen.insert(written.at(i));
    }
    items.removeDuplicates();
    checkMain(items, value);
}
