// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FindTestCase.h"

#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QDialog>
#include <QDir>
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

void FindTestCase::writeMaze()
{
    for (int from = 0; from < 9; ++from) {
        const QString folder = QStringLiteral("%1/m%2").arg(menu()).arg(from);
        QVERIFY(QDir().mkpath(folder));
        for (int to = 0; to < 9; ++to) {
            if (to != from)
                QVERIFY(QFile::link(QStringLiteral("../m%1").arg(to),
                                    QStringLiteral("%1/l%2").arg(folder).arg(to)));
        }
    }
}
