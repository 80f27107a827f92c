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
    m_fileNames.clear();
    if (m_beginning.startsWith(QLatin1String("*.")))
        m_fileNames = QLatin1Char('\n') + m_beginning;
    else if (m_beginning.startsWith(QLatin1Char('.')))
        m_fileNames = QLatin1String("\n*") + m_beginning;
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

// Of the patterns of a type's file names the first is the most usual one.
bool ChoiceFilter::hasSuffix(const QString &text) const
{
    const int begin = m_fileNames.isEmpty() ? -1 : int(text.indexOf(m_fileNames));
    if (begin < 0)
        return false;
    const QStringView next = QStringView(text).mid(begin + m_fileNames.size(), 1);
    return next.isEmpty() || next == QLatin1String(",") || next == QLatin1String("\n");
}

// What is found there begins with the first text, and a line feed behind that.
int ChoiceFilter::rank(int row) const
{
    const QString &text = m_model->searched(row);
    if (m_beginning.isEmpty() || !text.startsWith(m_beginning))
        return hasSuffix(text) ? 2 : 3;
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
