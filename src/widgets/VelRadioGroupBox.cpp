// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <VelRadioGroupBox.h>

#include "IdleMnemonic.h"
#include "RadioGroupBoxAccessible.h"
#include "RadioGroupBoxPainter.h"

#include <frame/QtMajor.h>

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QPointer>
#include <QStyle>
#include <QStyleOptionGroupBox>

#include <algorithm>
#include <cmath>

class VelRadioGroupBoxPrivate
{
public:
    explicit VelRadioGroupBoxPrivate(VelRadioGroupBox *box)
        : mnemonic(box)
    {
    }

    bool pressed = false;
    IdleMnemonic mnemonic;
};

namespace {

// QPointF::toPoint() takes -0.5 to 0, which would lie inside.
QPoint wholePixels(const QPointF &position)
{
    return {int(std::lround(position.x())), int(std::lround(position.y()))};
}

// Whether a press ends before its release: nobody else will tell.
bool endsPress(const VelRadioGroupBox &box, const QEvent &event)
{
    switch (event.type()) {
    case QEvent::FocusOut:
        return static_cast<const QFocusEvent &>(event).reason() != Qt::PopupFocusReason;
    case QEvent::EnabledChange:
        return !box.isEnabled();
    case QEvent::Hide:
        return true;
    default:
        return false;
    }
}

// Who listens to toggled() may delete boxes.
QVector<QPointer<VelRadioGroupBox>> groupOf(const VelRadioGroupBox &box)
{
    if (!box.parent())
        return {};
    const auto found = box.parent()->findChildren<VelRadioGroupBox *>(QString(), Qt::FindChildrenRecursively);
    return {found.begin(), found.end()};
}

void uncheckOthers(const VelRadioGroupBox &box, const QVector<QPointer<VelRadioGroupBox>> &group)
{
    const VelRadioGroupBox *const self = &box;
    for (const QPointer<VelRadioGroupBox> &other : group) {
        if (other && other != self)
            other->setChecked(false);
    }
}

bool hasOtherChecked(const VelRadioGroupBox &box, const QVector<QPointer<VelRadioGroupBox>> &group)
{
    return std::any_of(group.begin(), group.end(),
                       [&box](const auto &other) { return other != &box && other->isChecked(); });
}

bool isPressKey(const QKeyEvent *event)
{
    return event->key() == Qt::Key_Space || event->key() == Qt::Key_Select;
}

} // namespace

VelRadioGroupBox::VelRadioGroupBox(QWidget *parent)
    : QGroupBox(parent)
    , d(std::make_unique<VelRadioGroupBoxPrivate>(this))
{
    init();
}

VelRadioGroupBox::VelRadioGroupBox(const QString &title, QWidget *parent)
    : QGroupBox(title, parent)
    , d(std::make_unique<VelRadioGroupBoxPrivate>(this))
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
    // The property "checked" goes past setChecked(), to the base.
    connect(this, &QGroupBox::toggled, this, [this](bool on) {
        const QVector<QPointer<VelRadioGroupBox>> group = groupOf(*this);
        if (on && hasOtherChecked(*this, group))
            uncheckOthers(*this, group);
    });
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
    // Without a parent there is no group.
    const QVector<QPointer<VelRadioGroupBox>> group = groupOf(*this);
    if (group.size() < 2)
        return;
    const QPointer<VelRadioGroupBox> self(this);
    uncheckOthers(*this, group);
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
    d->mnemonic.watch(*event);
    if (d->pressed && endsPress(*this, *event)) {
        d->pressed = false;
        update();
    }
    return QWidget::event(event); // NOLINT(bugprone-parent-virtual-call)
}

void VelRadioGroupBox::mousePressEvent(QMouseEvent *event)
{
    if (event->button() != Qt::LeftButton || !hitButtonOrLabel(wholePixels(QtMajor::positionOf(*event)))) {
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
    const bool hit = hitButtonOrLabel(wholePixels(QtMajor::positionOf(*event)));
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
    if (!hitButtonOrLabel(wholePixels(QtMajor::positionOf(*event)))) {
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
    if (event->isAutoRepeat())
        return;
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
    if (event->isAutoRepeat())
        return;
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
    RadioGroupBoxPainter groupBox(&painter, option, this);
    groupBox.drawFrame();
    groupBox.drawTitle();
    groupBox.drawFocus();
    groupBox.drawIndicator();
}
