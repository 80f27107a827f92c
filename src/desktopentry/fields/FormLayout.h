// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QBoxLayout>
#include <QGridLayout>
#include <QHash>

namespace VelUI {

class RowSlot;

/// Two columns of labels and fields whose rows can be hidden.
///
/// A label becomes the buddy of its field, and the field is announced by the label's text;
/// in a field of several parts every part is.
///
/// Between spread() and pack() there is a place behind each field and one under it. Rows keep their
/// numbers, though in the grid only every other line is a row then.
class FormLayout : public QGridLayout
{
    Q_OBJECT

public:
    explicit FormLayout(QWidget *parent = nullptr);

    /// Appends a row; \a label is the bare word, the layout adds the colon. Returns the row.
    int addRow(const QString &label, QWidget *field);
    int addRow(const QString &label, QLayout *field);
    /// Appends a row of two widgets; \a left is taken for the label when it is a button.
    int addRow(QWidget *left, QWidget *right);
    /// Appends a row of one widget across both columns.
    int addRow(QWidget *field);

    void setRowVisible(int row, bool visible);
    void hideRow(int row);
    void showRow(int row);
    void setRowLabelBold(int row);
    bool isRowVisible(int row) const;
    /// The number of the row that has \a field in it; -1 where none has.
    int rowOf(QWidget *field) const;
    /// The label of a row, or the button or field that stands in its place.
    QWidget *labelOf(int row) const;
    /// Shows another widget as the field of a labeled row, under another label, and hides the one before.
    void setField(int row, const QString &label, QWidget *field);

    void spread();
    /// Takes the places out again, with what is in them.
    void pack();
    bool isSpread() const { return m_spacing > 1; }
    /// Puts \a widget behind \a field in its row, where the Tab key comes to it after the field. Only while
    /// the layout is spread.
    void addBeside(int row, QWidget *field, QWidget *widget);
    /// The places of a row; only while the layout is spread.
    RowSlot *besideRow(int row);
    RowSlot *belowRow(int row);
    /// The same behind the field; null where nothing was put there yet.
    RowSlot *usedBesideRow(int row) const { return m_beside.value(row); }

    /// Has all rows stay where they are until releaseRows(), whatever is shown or hidden: moving them takes
    /// longer than what is shown may wait.
    void holdRows();
    /// Paints what is under a row of held ones, at once and over what is still there.
    void showAhead(int row);
    /// Makes the room that is needed meanwhile.
    void releaseRows();

private:
    struct Cell
    {
        int row, column, rowSpan, columnSpan;
    };

    QLayoutItem *rowItem(int row, int column) const { return itemAtPosition(row * m_spacing, column); }
    RowSlot *makeSlot(int row, QBoxLayout::Direction direction);
    void makeRoomBeside(int row, bool isNeeded);
    void put(QLayoutItem *item, const Cell &cell);
    void moveRows(int spacing);

    int m_spacing = 1; ///< lines of the grid for each row
    QHash<int, RowSlot *> m_beside;
    QHash<int, RowSlot *> m_below;
};

} // namespace VelUI
