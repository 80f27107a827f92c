// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QBoxLayout>
#include <QWidget>

namespace VelUI {

/// A place in a row of a form for further widgets. It is shown when its row is and at least one of
/// the widgets is not hidden, so an empty place takes no room.
class RowSlot : public QWidget
{
    Q_OBJECT

public:
    RowSlot(QBoxLayout::Direction direction, QWidget *parent);

    /// Puts \a widget behind the others and owns it. It may be hidden, shown and deleted at will.
    void add(QWidget *widget);
    /// Tells whether the row is shown.
    void setRowVisible(bool visible);
    /// Paints itself at \a place at once, over whatever is there, unless that is its own place.
    void cover(const QRect &place);
    /// Tells that nothing else is where it is.
    void takePlace();

    bool eventFilter(QObject *watched, QEvent *event) override;

Q_SIGNALS:
    /// There is a widget to be shown here, or none any more.
    void filled(bool isFilled);

protected:
    void childEvent(QChildEvent *event) override;

private:
    void update();

    QBoxLayout *const m_layout;
    bool m_isRowVisible = true;
    bool m_isFilled = false;
    bool m_hasPlace = false;
};

} // namespace VelUI
