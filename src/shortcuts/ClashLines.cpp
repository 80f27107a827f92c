// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClashLines.h"

#include "ClashingRows.h"
#include "IShortcutObject.h"
#include "ShortcutClash.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"

#include <QCoreApplication>

#include <algorithm>

namespace {

using Clashes = QVector<ShortcutClash>;

constexpr int MostLines = 20;

bool isGlobal(const ShortcutClash &clash)
{
    return clash.kind == ShortcutClash::GlobalKey;
}

ClashLine::Content lineFor(const ShortcutsModel &model, const ShortcutClash &clash, const QKeySequence &key)
{
    ClashLine::Content line;
    line.text = clash.text;
    line.key = key.toString(QKeySequence::NativeText);
    line.isSerious = clash.kind == ShortcutClash::SameKey || isGlobal(clash);
    if (clash.otherName.isEmpty())
        return line;
    const QModelIndex row = ClashingRows::first(model, clash.otherName, key);
    if (const IShortcutObject *other = ShortcutRows::at(model, row)) {
        line.otherName = clash.otherName;
        line.otherText = other->text();
        // A further key stays with its action.
        line.canTakeOver = !ClashingRows::of(model, clash.otherName, key).isEmpty();
    }
    return line;
}

} // namespace

QVector<ClashLine::Content> ClashLines::of(const ShortcutsModel &model, const IShortcutObject &shortcut,
                                           const QKeySequence &key, const QWidget *window)
{
    Clashes clashes = ShortcutClash::find(model, shortcut.name(), key, window);
    if (key == shortcut.defaultKeySequence()) {
        const auto isStandard = [](const ShortcutClash &clash) {
            return clash.kind == ShortcutClash::StandardKey;
        };
        clashes.erase(std::remove_if(clashes.begin(), clashes.end(), isStandard), clashes.end());
    }
    // Nobody can take over what a global shortcut keeps.
    const bool isTakenGlobally = std::any_of(clashes.cbegin(), clashes.cend(), isGlobal);
    QVector<ClashLine::Content> lines;
    for (int i = 0; i < clashes.size() && i < MostLines; ++i) {
        lines.append(lineFor(model, clashes.at(i), key));
        lines.last().canTakeOver = lines.constLast().canTakeOver && !isTakenGlobally;
    }
    if (clashes.size() > MostLines) {
        ClashLine::Content rest;
        rest.text =
            QCoreApplication::translate("ClashLine", "Further clashes: %1").arg(clashes.size() - MostLines);
        lines.append(rest);
    }
    return lines;
}
