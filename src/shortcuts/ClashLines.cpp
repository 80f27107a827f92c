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

ClashLine::Content lineFor(const ShortcutClash &clash, const QKeySequence &key)
{
    ClashLine::Content line;
    line.text = clash.text;
    line.key = key.toString(QKeySequence::NativeText);
    line.isSerious = clash.kind == ShortcutClash::SameKey || isGlobal(clash);
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
    const auto rows = clashes.isEmpty() ? QHash<QString, ClashingRows::Rows>() : ClashingRows::of(model, key);
    QVector<ClashLine::Content> lines;
    for (int i = 0; i < clashes.size() && i < MostLines; ++i) {
        lines.append(lineFor(clashes.at(i), key));
        const ClashingRows::Rows others = rows.value(clashes.at(i).otherName);
        if (const IShortcutObject *other = ShortcutRows::at(model, others.first)) {
            lines.last().otherName = other->name();
            lines.last().otherText = other->text();
            // A further key stays with its action.
            lines.last().canTakeOver = !others.pending.isEmpty() && !isTakenGlobally;
        }
    }
    if (clashes.size() > MostLines) {
        ClashLine::Content rest;
        rest.text =
            QCoreApplication::translate("ClashLine", "Further clashes: %1").arg(clashes.size() - MostLines);
        lines.append(rest);
    }
    return lines;
}
