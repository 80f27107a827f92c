// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RadioBoxDriving.h"
#include "TestCase.h"

#include <QLineEdit>
#include <QStyle>

/// The box and the keyboard.
class tst_VelRadioGroupBoxKeys : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isChosenByKeys_data();
    void isChosenByKeys();
    void updatesTheIndicatorAloneOnAKeyPress();
    void letsOtherKeysPass();
    void isReachedByTabAndChosenBySpace();
    void doesNothingForItsMnemonic();
    void passesEventsByTheBaseClass();
};

void tst_VelRadioGroupBoxKeys::isChosenByKeys_data()
{
    QTest::addColumn<int>("key");
    QTest::newRow("Space") << int(Qt::Key_Space);
    QTest::newRow("Select") << int(Qt::Key_Select);
}

void tst_VelRadioGroupBoxKeys::isChosenByKeys()
{
    QFETCH(int, key);
    Form form;
    form.show();
    sendKey(form.one, QEvent::KeyPress, key);
    QVERIFY(form.one->isSunken());
    QVERIFY(!form.one->isChecked());
    sendKey(form.one, QEvent::KeyRelease, key);
    QVERIFY(!form.one->isSunken());
    QVERIFY(form.one->isChecked());
    sendKey(form.one, QEvent::KeyPress, key);
    sendKey(form.one, QEvent::KeyRelease, key);
    QVERIFY(form.one->isChecked()); // a second time changes nothing
    QVERIFY(form.keys.isEmpty());
}

void tst_VelRadioGroupBoxKeys::updatesTheIndicatorAloneOnAKeyPress()
{
    Form form;
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    QCoreApplication::processEvents();
    form.one->painted = QRegion();
    QTest::keyPress(form.one, Qt::Key_Space);
    QTRY_COMPARE(form.one->painted, QRegion(form.one->rectOf(QStyle::SC_GroupBoxCheckBox)));
}

void tst_VelRadioGroupBoxKeys::letsOtherKeysPass()
{
    Form form;
    form.show();
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_A, Qt::Key_Down})
        QTest::keyClick(form.one, key);
    QCOMPARE(
        form.keys,
        (QVector<int>{Qt::Key_Return, -Qt::Key_Return, Qt::Key_A, -Qt::Key_A, Qt::Key_Down, -Qt::Key_Down}));
    QVERIFY(!form.one->isChecked() && !form.one->isSunken());
}

void tst_VelRadioGroupBoxKeys::isReachedByTabAndChosenBySpace()
{
    Form form;
    form.one->setChecked(true);
    form.show();
    form.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&form));
    form.one->setFocus();
    QTest::keyClick(form.focusWidget(), Qt::Key_Tab);
    QCOMPARE(form.focusWidget(), form.one->findChild<QLineEdit *>());
    QTest::keyClick(form.focusWidget(), Qt::Key_Tab);
    QCOMPARE(form.focusWidget(), form.two);
    QTest::keyClick(form.focusWidget(), Qt::Key_Space);
    QVERIFY(form.two->isChecked() && !form.one->isChecked());
    QTest::keyClick(form.focusWidget(), Qt::Key_Tab);
    QCOMPARE(form.focusWidget(), form.two->findChild<QLineEdit *>());
    QTest::keyClick(form.focusWidget(), Qt::Key_Tab);
    QCOMPARE(form.focusWidget(), form.one); // its disabled field is passed by
}

void tst_VelRadioGroupBoxKeys::doesNothingForItsMnemonic()
{
    Form form;
    form.show();
    form.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&form));
    form.one->setFocus();
    QTest::keyClick(&form, Qt::Key_T, Qt::AltModifier);
    QVERIFY(!form.two->isChecked());
    QCOMPARE(form.focusWidget(), form.one);
}

void tst_VelRadioGroupBoxKeys::passesEventsByTheBaseClass()
{
    Form form;
    // The base class would take hovering and shortcuts for its own; this one leaves them.
    QEvent shortcut(QEvent::Shortcut);
    QVERIFY(!form.one->event(&shortcut));
    QKeyEvent space(QEvent::KeyPress, Qt::Key_Space, Qt::NoModifier);
    QVERIFY(form.one->event(&space));
    QVERIFY(form.one->isSunken());
    QVERIFY(!(form.one->option().activeSubControls & QStyle::SC_GroupBoxCheckBox));
}

VEL_TEST_MAIN(tst_VelRadioGroupBoxKeys)
#include "tst_VelRadioGroupBoxKeys.moc"
