// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <VelRadioGroupBox.h>

#include "RadioGroupBoxAccessible.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QPointer>
#include <QStyle>
#include <QStyleOption>

#include <cmath>

class VelRadioGroupBoxPrivate
{
public:
    bool pressed = false;
};

namespace {

// The distance that the common style leaves between the frame and the indicator.
constexpr int FrameGap = 4;

// QPointF::toPoint() takes -0.5 to 0, which would lie inside.
QPoint wholePixels(const QPointF &position)
{
    return {int(std::lround(position.x())), int(std::lround(position.y()))};
}

bool isPressKey(const QKeyEvent *event)
{
    return event->key() == Qt::Key_Space || event->key() == Qt::Key_Select;
}

// Draws one group box with the style of its widget.
class GroupBoxPainter
{
public:
    GroupBoxPainter(QPainter *painter, const QStyleOptionGroupBox &option, const QWidget *widget)
        : m_painter(painter)
        , m_option(option)
        , m_widget(widget)
        , m_style(widget->style())
        , m_indicator(rectOf(QStyle::SC_GroupBoxCheckBox))
        , m_label(rectOf(QStyle::SC_GroupBoxLabel))
    {
    }

    void drawFrame()
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

    void drawTitle()
    {
        if (m_option.text.isEmpty())
            return;
        int flags = int(Qt::TextShowMnemonic) | int(Qt::AlignHCenter) | int(m_option.textAlignment);
        if (!m_style->styleHint(QStyle::SH_UnderlineShortcut, &m_option, m_widget))
            flags |= Qt::TextHideMnemonic;
        const bool ownColor = m_option.textColor.isValid();
        if (ownColor)
            m_painter->setPen(m_option.textColor);
        m_style->drawItemText(m_painter, m_label, flags, m_option.palette,
                              m_option.state & QStyle::State_Enabled, m_option.text,
                              ownColor ? QPalette::NoRole : QPalette::WindowText);
    }

    void drawFocus()
    {
        if (!(m_option.state & QStyle::State_HasFocus))
            return;
        QStyleOptionFocusRect focus;
        focus.QStyleOption::operator=(m_option);
        focus.rect = m_indicator.united(m_label);
        m_style->drawPrimitive(QStyle::PE_FrameFocusRect, &focus, m_painter, m_widget);
    }

    void drawIndicator()
    {
        QStyleOptionButton button;
        button.QStyleOption::operator=(m_option);
        button.rect = m_indicator;
        m_style->drawPrimitive(QStyle::PE_IndicatorRadioButton, &button, m_painter, m_widget);
    }

private:
    QRect rectOf(QStyle::SubControl part) const
    {
        return m_style->subControlRect(QStyle::CC_GroupBox, &m_option, part, m_widget);
    }

    QPainter *const m_painter;
    const QStyleOptionGroupBox &m_option;
    const QWidget *const m_widget;
    QStyle *const m_style;
    const QRect m_indicator;
    const QRect m_label;
};

} // namespace

VelRadioGroupBox::VelRadioGroupBox(QWidget *parent)
    : QGroupBox(parent)
    , d(std::make_unique<VelRadioGroupBoxPrivate>())
{
    init();
}

VelRadioGroupBox::VelRadioGroupBox(const QString &title, QWidget *parent)
    : QGroupBox(title, parent)
    , d(std::make_unique<VelRadioGroupBoxPrivate>())
{
    init();
}

VelRadioGroupBox::~VelRadioGroupBox() = default;

void VelRadioGroupBox::init()
{
    RadioGroupBoxAccessible::install(this);
    d->pressed = false;
    setCheckable(true);
    setChecked(false);
}

void VelRadioGroupBox::setChecked(bool on)
{
    if (!on) {
        const QPointer<VelRadioGroupBox> self(this);
        QGroupBox::setChecked(false);
        if (self)
            repaint();
        return;
    }
    if (!parent())
        return;
    const auto found = parent()->findChildren<VelRadioGroupBox *>(QString(), Qt::FindChildrenRecursively);
    if (found.size() < 2)
        return;
    // Who listens to toggled() may delete boxes, this one included.
    const QVector<QPointer<VelRadioGroupBox>> group(found.begin(), found.end());
    const QPointer<VelRadioGroupBox> self(this);
    for (const QPointer<VelRadioGroupBox> &box : group) {
        if (box && box != this)
            box->setChecked(false);
    }
    if (self)
        QGroupBox::setChecked(true);
    if (self)
        repaint();
}

void VelRadioGroupBox::initStyleOption(QStyleOptionGroupBox *option) const
{
    QGroupBox::initStyleOption(option);
    option->state.setFlag(QStyle::State_Sunken, d->pressed);
}

bool VelRadioGroupBox::hitButtonOrLabel(const QPoint &point) const
{
    QStyleOptionGroupBox option;
    initStyleOption(&option);
    const QStyle::SubControl hit = style()->hitTestComplexControl(QStyle::CC_GroupBox, &option, point, this);
    return hit & (QStyle::SC_GroupBoxCheckBox | QStyle::SC_GroupBoxLabel);
}

bool VelRadioGroupBox::event(QEvent *event)
{
    return QWidget::event(event); // NOLINT(bugprone-parent-virtual-call)
}

void VelRadioGroupBox::mousePressEvent(QMouseEvent *event)
{
    if (event->button() != Qt::LeftButton || !hitButtonOrLabel(wholePixels(event->localPos()))) {
        event->ignore();
        return;
    }
    d->pressed = true;
    repaint();
}

void VelRadioGroupBox::mouseMoveEvent(QMouseEvent *event)
{
    if (!(event->buttons() & Qt::LeftButton)) {
        event->ignore();
        return;
    }
    const bool hit = hitButtonOrLabel(wholePixels(event->localPos()));
    if (hit != d->pressed) {
        d->pressed = hit;
        repaint();
        event->accept();
    } else {
        event->setAccepted(hit);
    }
}

void VelRadioGroupBox::mouseReleaseEvent(QMouseEvent *event)
{
    if (event->button() != Qt::LeftButton || !d->pressed) {
        event->ignore();
        return;
    }
    d->pressed = false;
    if (!hitButtonOrLabel(wholePixels(event->localPos()))) {
        event->ignore();
        return;
    }
    const QPointer<VelRadioGroupBox> self(this);
    setChecked(true);
    if (self)
        repaint();
}

void VelRadioGroupBox::keyPressEvent(QKeyEvent *event)
{
    if (!isPressKey(event)) {
        QWidget::keyPressEvent(event); // NOLINT(bugprone-parent-virtual-call)
        return;
    }
    d->pressed = true;
    QStyleOptionGroupBox option;
    initStyleOption(&option);
    update(style()->subControlRect(QStyle::CC_GroupBox, &option, QStyle::SC_GroupBoxCheckBox, this));
}

void VelRadioGroupBox::keyReleaseEvent(QKeyEvent *event)
{
    if (!isPressKey(event)) {
        QWidget::keyReleaseEvent(event); // NOLINT(bugprone-parent-virtual-call)
        return;
    }
    d->pressed = false;
    const QPointer<VelRadioGroupBox> self(this);
    setChecked(true);
    if (self)
        repaint();
}

void VelRadioGroupBox::paintEvent(QPaintEvent *event)
{
    Q_UNUSED(event)
    QStyleOptionGroupBox option;
    initStyleOption(&option);
    QPainter painter(this);
    GroupBoxPainter groupBox(&painter, option, this);
    groupBox.drawFrame();
    groupBox.drawTitle();
    groupBox.drawFocus();
    groupBox.drawIndicator();
}
