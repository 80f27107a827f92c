// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <VelRadioGroupBox.h>

#include <QCoreApplication>
#include <QLineEdit>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QStyle>
#include <QStyleOptionGroupBox>
#include <QVBoxLayout>

/// A text in UTF-8.
inline QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

/// Shows what is protected, and what was repainted.
class OpenBox : public VelRadioGroupBox
{
    Q_OBJECT

public:
    using VelRadioGroupBox::event;
    using VelRadioGroupBox::hitButtonOrLabel;
    using VelRadioGroupBox::initStyleOption;
    using VelRadioGroupBox::VelRadioGroupBox;

    QStyleOptionGroupBox option() const
    {
        QStyleOptionGroupBox result;
        initStyleOption(&result);
        return result;
    }

    bool isSunken() const { return option().state & QStyle::State_Sunken; }

    QRect rectOf(QStyle::SubControl part) const
    {
        const QStyleOptionGroupBox groupBox = option();
        return style()->subControlRect(QStyle::CC_GroupBox, &groupBox, part, this);
    }

    QPoint indicator() const { return rectOf(QStyle::SC_GroupBoxCheckBox).center(); }
    QPoint label() const { return rectOf(QStyle::SC_GroupBoxLabel).center(); }
    // A place in the contents.
    QPoint inside() const { return {width() / 2, height() - 8}; }

    QRegion painted;

protected:
    void paintEvent(QPaintEvent *event) override
    {
        painted += event->region();
        VelRadioGroupBox::paintEvent(event);
    }
};

/// A parent that notes what its children let pass.
class Form : public QWidget
{
    Q_OBJECT

public:
    Form()
        : one(new OpenBox(s("&One"), this))
        , two(new OpenBox(s("&Two"), this))
    {
        auto *layout = new QVBoxLayout(this);
        layout->addWidget(one);
        layout->addWidget(two);
        QWidget *before = one;
        for (OpenBox *box : {one, two}) {
            auto *edit = new QLineEdit(box);
            (new QVBoxLayout(box))->addWidget(edit);
            setTabOrder(before, box);
            setTabOrder(box, edit);
            before = edit;
        }
        resize(300, 240);
    }

    OpenBox *const one;
    OpenBox *const two;
    int presses = 0;
    int moves = 0;
    int releases = 0;
    QVector<int> keys;

protected:
    void mousePressEvent(QMouseEvent *) override { ++presses; }
    void mouseMoveEvent(QMouseEvent *) override { ++moves; }
    void mouseReleaseEvent(QMouseEvent *) override { ++releases; }
    void keyPressEvent(QKeyEvent *event) override { keys.append(event->key()); }
    void keyReleaseEvent(QKeyEvent *event) override { keys.append(-event->key()); }
};

/// Sends an event of the mouse; whether it was accepted.
inline bool sendMouse(QWidget *widget, QEvent::Type type, const QPointF &position, Qt::MouseButton button,
                      Qt::MouseButtons buttons)
{
    QMouseEvent event(type, position, widget->mapToGlobal(position.toPoint()), button, buttons,
                      Qt::NoModifier);
    QCoreApplication::sendEvent(widget, &event);
    return event.isAccepted();
}

/// Sends an event of the keyboard: QTest does not know every key.
inline void sendKey(QWidget *widget, QEvent::Type type, int key)
{
    QKeyEvent event(type, key, Qt::NoModifier);
    QCoreApplication::sendEvent(widget, &event);
}

/// Presses a button; whether the event was accepted.
inline bool press(QWidget *widget, const QPointF &position, Qt::MouseButton button = Qt::LeftButton)
{
    return sendMouse(widget, QEvent::MouseButtonPress, position, button, button);
}

/// Moves the mouse; whether the event was accepted.
inline bool move(QWidget *widget, const QPointF &position, Qt::MouseButtons buttons = Qt::LeftButton)
{
    return sendMouse(widget, QEvent::MouseMove, position, Qt::NoButton, buttons);
}

/// Releases a button; whether the event was accepted.
inline bool release(QWidget *widget, const QPointF &position, Qt::MouseButton button = Qt::LeftButton)
{
    return sendMouse(widget, QEvent::MouseButtonRelease, position, button, Qt::NoButton);
}
