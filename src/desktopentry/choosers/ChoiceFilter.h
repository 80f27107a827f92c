// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCollator>
#include <QSortFilterProxyModel>

namespace VelUI {

class ChoiceModel;

/// The choices that hold what a user typed. First those that were chosen from the beginning, then
/// group by group, by their first text: before the others the ones that it begins, then those of files
/// that usually have the suffix that was typed.
class ChoiceFilter : public QSortFilterProxyModel
{
    Q_OBJECT

public:
    /// Shows the rows of \a model, which must outlive it.
    explicit ChoiceFilter(ChoiceModel *model, QObject *parent = nullptr);

    /// Shows the rows that hold all words of \a typed, in any order; blind to case and accents.
    void setTyped(const QString &typed);
    /// The row of the model that is shown at \a index.
    int modelRow(const QModelIndex &index) const;

protected:
    bool filterAcceptsRow(int row, const QModelIndex &parent) const override;
    bool lessThan(const QModelIndex &left, const QModelIndex &right) const override;

private:
    bool hasSuffix(const QString &text) const;
    int rank(int row) const;

    const ChoiceModel *const m_model;
    QStringList m_words;
    QString m_beginning; // typed, folded
    QString m_fileNames; // how the text of their pattern begins, if a suffix was typed
    QCollator m_collator;
};

} // namespace VelUI
