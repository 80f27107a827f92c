// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QRect>
#include <QStyle>

class QPainter;
class QStyleOptionGroupBox;
class QWidget;

/**
 * Draws one group box with the style of its widget, and with a radio button in its title.
 */
class RadioGroupBoxPainter
{
public:
    /// All three outlive the painter.
    RadioGroupBoxPainter(QPainter *painter, const QStyleOptionGroupBox &option, const QWidget *widget);

    void drawFrame();
    void drawTitle();
    void drawFocus();
    void drawIndicator();

private:
    QRect rectOf(QStyle::SubControl part) const;
    QRect shrink(QStyleOptionGroupBox *option) const;
    void drawTitleByStyle();
    Qt::AlignmentFlag titleAlignment() const;

    QPainter *const m_painter;
    const QStyleOptionGroupBox &m_option;
    const QWidget *const m_widget;
    QStyle *const m_style;
    const QRect m_indicator;
    const QRect m_label;
};
