// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ModalDriver.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QInputDialog>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTest>

/// What the tests of the forms do to widgets.
namespace FormDriving {

/// The only descendant of that class and name.
template <typename Widget>
Widget *child(const QObject *parent, const char *name)
{
    auto *found = parent->findChild<Widget *>(QLatin1String(name));
    if (!found)
        qFatal("there is no child %s", name);
    return found;
}

inline QPushButton *okButton(const QWidget *dialog)
{
    return dialog->findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
}

inline QPushButton *cancelButton(const QWidget *dialog)
{
    return dialog->findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Cancel);
}

inline void click(QWidget *button)
{
    QTest::mouseClick(button, Qt::LeftButton);
}

/// Runs a dialog and presses one of its buttons; the result of its loop.
inline int runAndPress(QDialog &dialog, QPushButton *(*button)(const QWidget *))
{
    ModalDriver modal;
    modal.handle([button](QWidget *window) { click(button(window)); });
    return dialog.exec();
}

/// Replaces the text of a line as a user does.
inline void retype(QLineEdit *line, const QString &text)
{
    line->selectAll();
    QTest::keyClick(line, Qt::Key_Delete);
    QTest::keyClicks(line, text);
}

/// What a prompt for one line showed.
struct Prompt
{
    QString title;
    QString label;
    QString text;
};

/// The next window is a prompt for one line: notes what it shows, types \a answer and
/// presses Return; a null answer presses Escape.
inline void answerPrompt(ModalDriver &modal, const QString &answer, Prompt *shown = nullptr)
{
    modal.handle([answer, shown](QWidget *window) {
        auto *prompt = qobject_cast<QInputDialog *>(window);
        QVERIFY(prompt);
        auto *line = prompt->findChild<QLineEdit *>();
        if (shown)
            *shown = {prompt->windowTitle(), prompt->labelText(), line->text()};
        if (answer.isNull()) {
            QTest::keyClick(prompt, Qt::Key_Escape);
            return;
        }
        retype(line, answer);
        QTest::keyClick(line, Qt::Key_Return);
    });
}

} // namespace FormDriving
