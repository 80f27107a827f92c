// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QTreeView>

namespace VelUI {

/// A list of choices. A click anywhere in a row checks its box, and so does Space; what else is
/// typed is for the filter.
class ChoiceView : public QTreeView
{
    Q_OBJECT

public:
    explicit ChoiceView(QWidget *parent = nullptr);

    void setModel(QAbstractItemModel *model) override;
    void dataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight,
                     const QVector<int> &roles = QVector<int>()) override;
    /// Makes the first row current unless another one is.
    void beginAtFirst();

Q_SIGNALS:
    /// The user goes up from the first row.
    void leftUpward();
    /// The user types what is meant for the filter.
    void typed(QKeyEvent *event);

protected:
    void keyPressEvent(QKeyEvent *event) override;

private:
    bool toggleCurrent();
    void speakBox(const QModelIndex &index);
};

} // namespace VelUI
