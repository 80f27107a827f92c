// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModalDriver.h"

#include <QAbstractButton>
#include <QApplication>
#include <QDialog>
#include <QPushButton>
#include <QTest>

#include <algorithm>

ModalDriver::ModalDriver(QObject *parent)
    : QObject(parent)
{
    connect(&m_timer, &QTimer::timeout, this, &ModalDriver::look);
    m_timer.start(10);
}

ModalDriver::~ModalDriver() = default;

void ModalDriver::answer(const Box &expected, QMessageBox::StandardButton button)
{
    answerWith(expected, [button](QMessageBox *box) {
        if (QAbstractButton *press = box->button(button)) {
            press->click();
        } else {
            QTest::qFail("the message box lacks the button to press", __FILE__, __LINE__);
            box->done(QMessageBox::NoButton);
        }
    });
}

void ModalDriver::answerWith(const Box &expected, const std::function<void(QMessageBox *)> &act)
{
    Step step;
    step.isBox = true;
    step.box = expected;
    step.act = [act](QWidget *window) { act(qobject_cast<QMessageBox *>(window)); };
    m_steps.append(step);
}

void ModalDriver::handle(const std::function<void(QWidget *)> &act)
{
    Step step;
    step.act = act;
    m_steps.append(step);
}

bool ModalDriver::finished() const
{
    return !m_failed && m_steps.isEmpty();
}

void ModalDriver::look()
{
    // A window that was closed may come back later as the same object.
    m_handled.erase(
        std::remove_if(m_handled.begin(), m_handled.end(),
                       [](const QPointer<QWidget> &window) { return !window || !window->isVisible(); }),
        m_handled.end());

    QWidget *window = QApplication::activePopupWidget();
    if (!window)
        window = QApplication::activeModalWidget();
    if (!window || !window->isVisible() || m_handled.contains(window))
        return;
    m_handled.append(window);

    if (m_steps.isEmpty()) {
        m_failed = true;
        QTest::qFail(qPrintable(QStringLiteral("unannounced window: ") + window->windowTitle()), __FILE__,
                     __LINE__);
        window->close();
        return;
    }
    const Step step = m_steps.takeFirst();
    if (step.isBox && !compare(step.box, window)) {
        m_failed = true;
        window->close();
        return;
    }
    // Not from here: what it does may open the next window, and this timer has to see that one.
    const QPointer<QWidget> guarded(window);
    QTimer::singleShot(0, window, [step, guarded] {
        step.act(guarded);
        // A check that failed may have left it open, and its loop would go on for ever.
        if (guarded && guarded->isVisible() && QTest::currentTestFailed())
            guarded->close();
    });
}

bool ModalDriver::compare(const Box &expected, QWidget *window)
{
    auto *box = qobject_cast<QMessageBox *>(window);
    if (!box) {
        QTest::qFail(qPrintable(QStringLiteral("not a message box: ") + window->windowTitle()), __FILE__,
                     __LINE__);
        return false;
    }
    QMessageBox::StandardButton defaultButton = QMessageBox::NoButton;
    if (box->defaultButton())
        defaultButton = box->standardButton(box->defaultButton());
    return QTest::qCompare(box->windowTitle(), expected.title, "title", "expected.title", __FILE__, __LINE__)
        && QTest::qCompare(box->text(), expected.text, "text", "expected.text", __FILE__, __LINE__)
        && QTest::qCompare(int(box->icon()), int(expected.icon), "icon", "expected.icon", __FILE__, __LINE__)
        && QTest::qCompare(int(box->standardButtons()), int(expected.buttons), "buttons", "expected.buttons",
                           __FILE__, __LINE__)
        && (expected.defaultButton == QMessageBox::NoButton
            || QTest::qCompare(int(defaultButton), int(expected.defaultButton), "default button",
                               "expected.defaultButton", __FILE__, __LINE__));
}
