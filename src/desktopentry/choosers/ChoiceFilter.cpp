// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ChoiceFilter.h"

#include "ChoiceModel.h"

#include <frame/SearchText.h>

#include <algorithm>

namespace VelUI {

ChoiceFilter::ChoiceFilter(ChoiceModel *model, QObject *parent)
    : QSortFilterProxyModel(parent)
    , m_model(model)
{
    m_collator.setCaseSensitivity(Qt::CaseInsensitive);
    m_collator.setNumericMode(true);
    setSourceModel(model);
    sort(0);
}

void ChoiceFilter::setTyped(const QString &typed)
{
    m_words = SearchText::words(typed);
    m_beginning = SearchText::folded(typed).trimmed();
    invalidate();
}

int ChoiceFilter::modelRow(const QModelIndex &index) const
{
    return mapToSource(index).row();
}

bool ChoiceFilter::filterAcceptsRow(int row, const QModelIndex &) const
{
    const QString &text = m_model->searched(row);
    return std::all_of(m_words.cbegin(), m_words.cend(),
                       [&text](const QString &word) { return text.contains(word); });
}

// What is found there begins with the first text, and a line feed behind that.
int ChoiceFilter::rank(int row) const
{
    const QString &text = m_model->searched(row);
    if (m_beginning.isEmpty() || !text.startsWith(m_beginning))
        return 2;
    return QStringView(text).mid(m_beginning.size(), 1) == QLatin1String("\n") ? 0 : 1;
}

// A box that is checked now moves nothing under the user's hands.
bool ChoiceFilter::lessThan(const QModelIndex &left, const QModelIndex &right) const
{
    const Choice &a = m_model->at(left.row());
    const Choice &b = m_model->at(right.row());
    const bool isAChosen = m_model->chosen().wasChosen(a.value);
    if (isAChosen != m_model->chosen().wasChosen(b.value))
        return isAChosen;
    if (a.group != b.group)
        return a.group < b.group;
    const int rankOfA = rank(left.row());
    const int rankOfB = rank(right.row());
    if (rankOfA != rankOfB)
        return rankOfA < rankOfB;
    const int order = m_collator.compare(a.texts.value(0), b.texts.value(0));
    return order != 0 ? order < 0 : a.value < b.value;
}

} // namespace VelUI
