// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "TestCase.h"

#include <shortcuts/ShortcutChange.h>

class tst_ShortcutChange : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void knowsWhatWasChangedAndTheWayBack_data();
    void knowsWhatWasChangedAndTheWayBack();
};

void tst_ShortcutChange::knowsWhatWasChangedAndTheWayBack_data()
{
    QTest::addColumn<QKeySequence>("inForce");
    QTest::addColumn<QKeySequence>("pending");
    QTest::addColumn<bool>("isEdited");
    QTest::addColumn<bool>("isChanged");
    QTest::addColumn<QKeySequence>("before");
    // The default key.
    const QKeySequence f1(Qt::Key_F1);
    const QKeySequence f2(Qt::Key_F2);
    const QKeySequence f3(Qt::Key_F3);
    const QKeySequence none;
    QTest::newRow("never changed") << f1 << f1 << false << false << f1;
    QTest::newRow("edited") << f1 << f2 << true << true << f1;
    QTest::newRow("taken away") << f1 << none << true << true << f1;
    QTest::newRow("changed before") << f2 << f2 << false << true << f1;
    QTest::newRow("taken away before") << none << none << false << true << f1;
    QTest::newRow("changed before and edited") << f2 << f3 << true << true << f2;
    QTest::newRow("changed before and back to the default") << f2 << f1 << true << true << f2;
}

void tst_ShortcutChange::knowsWhatWasChangedAndTheWayBack()
{
    QFETCH(QKeySequence, inForce);
    QFETCH(QKeySequence, pending);
    KeyTestObject object(QStringLiteral("open"), QString(), QKeySequence(Qt::Key_F1));
    object.setObjectKeySequence(inForce);
    object.setKeySequence(pending);
    QTEST(ShortcutChange::isEdited(object), "isEdited");
    QTEST(ShortcutChange::isChanged(object), "isChanged");
    QTEST(ShortcutChange::keyBefore(object), "before");
}

VEL_TEST_GUILESS_MAIN(tst_ShortcutChange)

#include "tst_ShortcutChange.moc"
