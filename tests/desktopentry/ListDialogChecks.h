// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FormDriving.h"

#include <QFrame>
#include <QVBoxLayout>

namespace FormDriving {

/// Fails the test unless \a dialog is laid out around \a list as both list dialogs are.
inline void verifyListDialogForm(const QDialog &dialog, const char *name, const char *title,
                                 const QWidget *list)
{
    QCOMPARE(dialog.objectName(), QLatin1String(name));
    QCOMPARE(dialog.windowTitle(), QLatin1String(title));
    QCOMPARE(dialog.size(), QSize(400, 300));
    auto *layout = qobject_cast<QVBoxLayout *>(dialog.layout());
    QVERIFY(layout);
    QCOMPARE(layout->objectName(), QStringLiteral("verticalLayout"));
    QCOMPARE(layout->itemAt(0)->widget(), list);
    auto *line = child<QFrame>(&dialog, "line");
    QCOMPARE(layout->itemAt(1)->widget(), line);
    QCOMPARE(line->frameShape(), QFrame::HLine);
    QCOMPARE(line->frameShadow(), QFrame::Sunken);
    auto *box = child<QDialogButtonBox>(&dialog, "buttonBox");
    QCOMPARE(layout->itemAt(2)->widget(), box);
    QCOMPARE(box->orientation(), Qt::Horizontal);
    QCOMPARE(box->standardButtons(), QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
}

} // namespace FormDriving
