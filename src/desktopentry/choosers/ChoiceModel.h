// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "Choice.h"
#include "ChosenValues.h"

#include <QAbstractTableModel>
#include <QVector>

namespace VelUI {

/// The things that a user may choose, a row each. Several are chosen by check boxes, one as the
/// current row of a view.
class ChoiceModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    enum class Kind { Several, One };

    ChoiceModel(Kind kind, const QStringList &headers, QObject *parent = nullptr);

    Kind kind() const { return m_kind; }

    /// Appends \a choices; their values must be new.
    void add(const QVector<Choice> &choices);
    /// Shows \a choice in \a row; its value must stay.
    void change(int row, const Choice &choice);
    const Choice &at(int row) const { return m_rows.at(row).choice; }
    /// What the row is found by, folded.
    const QString &searched(int row) const;
    bool hasValue(const QString &value) const;

    /// Begins with \a values as the chosen ones.
    void setChosen(const QStringList &values);
    const ChosenValues &chosen() const { return m_chosen; }

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;

Q_SIGNALS:
    /// The user chose a value or took one out.
    void chosenChanged();

private:
    struct Row
    {
        Choice choice;
        mutable QString searched; // empty until it is asked for
    };

    bool hasBox(const QModelIndex &index) const;

    const Kind m_kind;
    const QStringList m_headers;
    QVector<Row> m_rows;
    ChosenValues m_chosen;
};

} // namespace VelUI
