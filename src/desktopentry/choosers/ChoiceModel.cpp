// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ChoiceModel.h"

#include <frame/SearchText.h>

#include <algorithm>

namespace VelUI {

ChoiceModel::ChoiceModel(Kind kind, const QStringList &headers, QObject *parent)
    : QAbstractTableModel(parent)
    , m_kind(kind)
    , m_headers(headers)
{
}

void ChoiceModel::add(const QVector<Choice> &choices)
{
    if (choices.isEmpty())
        return;
    beginInsertRows({}, m_rows.size(), m_rows.size() + choices.size() - 1);
    m_rows.reserve(m_rows.size() + choices.size());
    for (const Choice &choice : choices)
        m_rows.append({choice, {}});
    endInsertRows();
}

void ChoiceModel::change(int row, const Choice &choice)
{
    m_rows[row] = {choice, {}};
    Q_EMIT dataChanged(index(row, 0), index(row, m_headers.size() - 1));
}

const QString &ChoiceModel::searched(int row) const
{
    const Row &asked = m_rows.at(row);
    if (asked.searched.isEmpty()) {
        const QStringList texts = asked.choice.texts + QStringList{asked.choice.value, asked.choice.words};
        asked.searched = SearchText::folded(texts.join(QLatin1Char('\n')));
    }
    return asked.searched;
}

bool ChoiceModel::hasValue(const QString &value) const
{
    return std::any_of(m_rows.cbegin(), m_rows.cend(),
                       [&value](const Row &row) { return row.choice.value == value; });
}

void ChoiceModel::setChosen(const QStringList &values)
{
    m_chosen = ChosenValues(values);
    if (!m_rows.isEmpty())
        Q_EMIT dataChanged(index(0, 0), index(m_rows.size() - 1, 0), {Qt::CheckStateRole});
}

int ChoiceModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_rows.size();
}

int ChoiceModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_headers.size();
}

bool ChoiceModel::hasBox(const QModelIndex &index) const
{
    return m_kind == Kind::Several && index.isValid() && index.column() == 0;
}

QVariant ChoiceModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid())
        return {};
    const Choice &choice = m_rows.at(index.row()).choice;
    switch (role) {
    case Qt::DisplayRole:
    case Qt::ToolTipRole: // a narrow column shows a part of it
        return choice.texts.value(index.column());
    case Qt::DecorationRole:
        return index.column() == 0 && !choice.icon.isNull() ? choice.icon : QVariant();
    case Qt::CheckStateRole:
        if (!hasBox(index))
            return {};
        return m_chosen.contains(choice.value) ? Qt::Checked : Qt::Unchecked;
    default:
        return {};
    }
}

QVariant ChoiceModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return QAbstractTableModel::headerData(section, orientation, role);
    return m_headers.value(section);
}

Qt::ItemFlags ChoiceModel::flags(const QModelIndex &index) const
{
    const Qt::ItemFlags flags = QAbstractTableModel::flags(index);
    return hasBox(index) ? flags | Qt::ItemIsUserCheckable : flags;
}

bool ChoiceModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (role != Qt::CheckStateRole || !hasBox(index))
        return false;
    m_chosen.set(m_rows.at(index.row()).choice.value, value.toInt() == Qt::Checked);
    Q_EMIT dataChanged(index, index, {Qt::CheckStateRole});
    Q_EMIT chosenChanged();
    return true;
}

} // namespace VelUI
