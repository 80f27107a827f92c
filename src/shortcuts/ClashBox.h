// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ClashLine.h"

#include <QScrollArea>
#include <QVector>

class QLabel;
class QVBoxLayout;

/**
 * What speaks against a key, a line for each.
 *
 * Its height stays the same, whatever it holds: some three lines are in view, the others are
 * scrolled to. A line that is still there when others come and go stays the same widget, so that a
 * click on it is not lost.
 */
class ClashBox : public QScrollArea
{
    Q_OBJECT

public:
    explicit ClashBox(QWidget *parent = nullptr);
    ~ClashBox() override;

    /// Shows \a contents, and new ones as alerts.
    void setLines(const QVector<ClashLine::Content> &contents);
    /// Shows \a hint while there are no lines; an empty one for none.
    void setHint(const QString &hint);
    /// What Tab stops at, in its order.
    QVector<QWidget *> tabStops();

Q_SIGNALS:
    /// A button of a line was pressed.
    void goToRequested(const QString &otherName);
    /// A button of a line was pressed.
    void takeOverRequested(const QString &otherName);
    /// The lines went in which the focus was.
    void focusLost();
    /// Tab is to stop at other widgets.
    void tabStopsChanged();

protected:
    void changeEvent(QEvent *event) override;

private:
    ClashLine *takeLine(const ClashLine::Content &content);
    ClashLine *makeLine(const ClashLine::Content &content);
    void removeLines(const QVector<ClashLine *> &lines);
    void moveFocus();
    void updateHeight();
    void followScrolling();

    QVBoxLayout *m_layout = nullptr;
    QLabel *m_hint = nullptr;
    QVector<ClashLine *> m_lines;
};
