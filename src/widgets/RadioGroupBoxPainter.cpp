// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RadioGroupBoxPainter.h"

#include <QPainter>
#include <QProxyStyle>
#include <QStyleOption>
#include <QWidget>

namespace {

// The distance that the common style leaves between the frame and the indicator.
constexpr int FrameGap = 4;

} // namespace

RadioGroupBoxPainter::RadioGroupBoxPainter(QPainter *painter, const QStyleOptionGroupBox &option,
                                           const QWidget *widget)
    : m_painter(painter)
    , m_option(option)
    , m_widget(widget)
    , m_style(widget->style())
    , m_indicator(rectOf(QStyle::SC_GroupBoxCheckBox))
    , m_label(rectOf(QStyle::SC_GroupBoxLabel))
{
}

void RadioGroupBoxPainter::drawFrame()
{
    QStyleOptionFrame frame;
    frame.QStyleOption::operator=(m_option);
    frame.features = m_option.features;
    frame.lineWidth = m_option.lineWidth;
    frame.midLineWidth = m_option.midLineWidth;
    frame.rect = rectOf(QStyle::SC_GroupBoxFrame);

    QRegion outline(m_option.rect);
    if (!m_option.text.isEmpty()) {
        const bool leftToRight = m_option.direction == Qt::LeftToRight;
        outline -= m_indicator.united(m_label).adjusted(leftToRight ? -FrameGap : 0, 0,
                                                        leftToRight ? 0 : FrameGap, 0);
    }
    m_painter->save();
    m_painter->setClipRegion(outline);
    m_style->drawPrimitive(QStyle::PE_FrameGroupBox, &frame, m_painter, m_widget);
    m_painter->restore();
}

void RadioGroupBoxPainter::drawTitle()
{
    if (m_option.text.isEmpty())
        return;
    // Its colors are known to nobody else.
    if (m_style->inherits("QStyleSheetStyle")) {
        drawTitleByStyle();
        return;
    }
    int flags = int(Qt::TextShowMnemonic) | int(titleAlignment()) | int(m_option.textAlignment);
    if (!m_style->styleHint(QStyle::SH_UnderlineShortcut, &m_option, m_widget))
        flags |= Qt::TextHideMnemonic;
    const bool ownColor = m_option.textColor.isValid();
    if (ownColor)
        m_painter->setPen(m_option.textColor);
    m_style->drawItemText(m_painter, m_label, flags, m_option.palette, m_option.state & QStyle::State_Enabled,
                          m_option.text, ownColor ? QPalette::NoRole : QPalette::WindowText);
}

void RadioGroupBoxPainter::drawFocus()
{
    if (!(m_option.state & QStyle::State_HasFocus))
        return;
    QStyleOptionFocusRect focus;
    focus.QStyleOption::operator=(m_option);
    focus.rect = m_indicator.united(m_label);
    m_style->drawPrimitive(QStyle::PE_FrameFocusRect, &focus, m_painter, m_widget);
}

void RadioGroupBoxPainter::drawIndicator()
{
    QStyleOptionButton button;
    button.QStyleOption::operator=(m_option);
    button.rect = m_indicator;
    m_style->drawPrimitive(QStyle::PE_IndicatorRadioButton, &button, m_painter, m_widget);
}

// A style sheet draws the frame unasked, and replaces the clip region to do it: a box without an inside
// has none. Makes \a option one, if its title is as large as in the whole box; returns where the title is.
QRect RadioGroupBoxPainter::shrink(QStyleOptionGroupBox *option) const
{
    const auto labelOf = [this](const QStyleOptionGroupBox &box) {
        return m_style->subControlRect(QStyle::CC_GroupBox, &box, QStyle::SC_GroupBoxLabel, m_widget);
    };
    const QRect whole = labelOf(*option);
    QStyleOptionGroupBox shrunk(*option);
    // As high as the margins, which would be filled otherwise.
    shrunk.rect.setSize(QSize(0, m_option.rect.height() - rectOf(QStyle::SC_GroupBoxFrame).height()));
    const QRect label = labelOf(shrunk);
    if (label.size() != whole.size())
        return whole;
    *option = shrunk;
    return label;
}

// Lets the style draw a box that has nothing but a title, and shows no more of it than that.
void RadioGroupBoxPainter::drawTitleByStyle()
{
    QStyleOptionGroupBox option(m_option);
    option.subControls = QStyle::SC_GroupBoxLabel;
    option.state &= ~QStyle::State_HasFocus;
    const QRect label = shrink(&option);
    m_painter->save();
    m_painter->setClipRect(m_label);
    // The text is in the middle of its height, which need not be the same without an indicator.
    m_painter->translate(m_option.direction == Qt::LeftToRight ? m_label.left() - label.left()
                                                               : m_label.right() - label.right(),
                         m_label.center().y() - label.center().y());
    m_style->drawComplexControl(QStyle::CC_GroupBox, &option, m_painter, m_widget);
    m_painter->restore();
}

// Centered in its rectangle as the common style has it; but Fusion makes the rectangle as wide as
// the text with its marks and begins at the edge.
Qt::AlignmentFlag RadioGroupBoxPainter::titleAlignment() const
{
    const QStyle *style = m_style;
    while (const auto *proxy = qobject_cast<const QProxyStyle *>(style))
        style = proxy->baseStyle();
    return style->inherits("QFusionStyle") ? Qt::AlignLeft : Qt::AlignHCenter;
}

QRect RadioGroupBoxPainter::rectOf(QStyle::SubControl part) const
{
    return m_style->subControlRect(QStyle::CC_GroupBox, &m_option, part, m_widget);
}
