// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CategoryChooser.h"

#include "CategoryNames.h"
#include "check/RegisteredCategories.h"
#include "choosers/ChoiceDialog.h"

#include <frame/GuardedDialog.h>

namespace VelUI {

namespace {

using RegisteredCategories::Category;
using RegisteredCategories::Kind;

// Those that nobody registered stand last.
constexpr int Unknown = int(Kind::Deprecated) + 1;

// The lists of categories of which one has to stand beside it.
QString relatedNames(const Category &category)
{
    QStringList lists;
    for (const QStringList &related : category.related) {
        QStringList names;
        for (const QString &name : related)
            names.append(CategoryNames::of(name));
        lists.append(names.join(QStringLiteral(" + ")));
    }
    return lists.join(QStringLiteral(" / "));
}

} // namespace

QVector<Choice> CategoryChooser::choices(const QStringList &current)
{
    QVector<Choice> choices;
    const auto add = [&choices](const QString &category, const QString &remark, int group) {
        Choice choice;
        choice.value = category;
        choice.texts = QStringList{CategoryNames::of(category), category, remark};
        choice.group = group;
        choices.append(choice);
    };
    for (const Category &category : RegisteredCategories::all()) {
        const QString related = relatedNames(category);
        if (category.kind == Kind::Main)
            add(category.name, tr("Main category"), int(category.kind));
        else if (category.kind == Kind::Additional)
            add(category.name, related.isEmpty() ? QString() : tr("Goes with %1").arg(related),
                int(category.kind));
        else if (category.kind == Kind::Reserved)
            add(category.name, tr("Only beside \"Only show in\""), int(category.kind));
        else if (current.contains(category.name))
            add(category.name, tr("Deprecated"), int(category.kind));
    }
    QStringList unknown = current;
    unknown.removeDuplicates();
    for (const QString &category : qAsConst(unknown)) {
        if (!RegisteredCategories::find(category))
            add(category,
                RegisteredCategories::isExtension(category)
                    ? tr("Extension", "a category of somebody's own, X-...")
                    : tr("Not registered"),
                Unknown);
    }
    return choices;
}

std::optional<QStringList> CategoryChooser::choose(QWidget *parent, const QStringList &current)
{
    const ChoiceDialog::Texts texts{tr("Choose categories"),
                                    {tr("Name", "title of a column"), tr("Category", "title of a column"),
                                     tr("Remark", "title of a column")},
                                    QStringLiteral("CategoryChooser")};
    GuardedDialog<ChoiceDialog> dialog(ChoiceModel::Kind::Several, texts, parent);
    dialog->model()->add(choices(current));
    dialog->setChosen(current);
    return dialog.run() ? std::make_optional(dialog->chosen()) : std::nullopt;
}

} // namespace VelUI
