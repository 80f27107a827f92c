// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/DesktopEntryRecord.h>

class tst_DesktopEntryRecord : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void bringsInBothRecordClasses();
};

void tst_DesktopEntryRecord::bringsInBothRecordClasses()
{
    const VelUIDesktopAction action(QStringLiteral("new-window"));
    QCOMPARE(action.getId(), QStringLiteral("new-window"));
    QVERIFY(!VelUIDesktopEntry().isValid());
}

VEL_TEST_GUILESS_MAIN(tst_DesktopEntryRecord)

#include "tst_DesktopEntryRecord.moc"
