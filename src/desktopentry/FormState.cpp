// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormState.h"

#include "FieldEdit.h"
#include "TextChange.h"

#include <algorithm>

namespace VelUI {

namespace {

bool areEqual(const QVector<QVariant> &left, const QVector<QVariant> &right)
{
    return std::equal(left.begin(), left.end(), right.begin(), right.end(), FieldEdit::areEqual);
}

bool haveSameFrame(const FormState &left, const FormState &right)
{
    return left.type == right.type && left.isTypeDecided == right.isTypeDecided
        && left.isOnlyShowIn == right.isOnlyShowIn;
}

} // namespace

bool FormState::isEqualTo(const FormState &other) const
{
    return haveSameFrame(*this, other) && areEqual(own, other.own) && translations == other.translations;
}

bool FormState::isTypedAfter(const FormState &before) const
{
    if (!haveSameFrame(before, *this) || before.language != language)
        return false;
    for (int i = 0; i < shown.size(); ++i) {
        if (FieldEdit::areEqual(before.shown.at(i), shown.at(i)))
            continue;
        if (shown.at(i).userType() != QMetaType::QString
            || !TextChange(before.shown.at(i).toString(), shown.at(i).toString()).isTyped())
            return false;
    }
    return true;
}

bool FormState::continues(const FormState &before, const FormState &between) const
{
    for (int i = 0; i < shown.size(); ++i) {
        const QString texts[] = {before.shown.at(i).toString(), between.shown.at(i).toString(),
                                 shown.at(i).toString()};
        if ((texts[0] == texts[1]) != (texts[1] == texts[2]))
            return false;
        if (texts[0] != texts[1] && !TextChange(texts[1], texts[2]).continues(TextChange(texts[0], texts[1])))
            return false;
    }
    return true;
}

} // namespace VelUI
