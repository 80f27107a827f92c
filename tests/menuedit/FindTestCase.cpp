// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FindTestCase.h"

#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QDialog>
#include <QLineEdit>

void FindTestCase::find(VelMenuView &view, const QString &text)
{
    ModalDriver modal;
    modal.handle([&text](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(text);
        qobject_cast<QDialog *>(window)->accept();
    });
    view.slotFind();
    QVERIFY(modal.finished());
    QVERIFY(!QGuiApplication::overrideCursor());
}
