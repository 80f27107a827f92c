// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <VelRadioGroupBox.h>

#include <QAccessible>
#include <QLineEdit>
#include <QWidget>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

class SpecialBox : public VelRadioGroupBox
{
    Q_OBJECT

public:
    using VelRadioGroupBox::VelRadioGroupBox;
};

} // namespace

class tst_RadioGroupBoxAccessible : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isUnknownBeforeTheFirstBox();
    void isARadioButton();
    void isARadioButtonInASubclass();
    void isNamedByItsTitle_data();
    void isNamedByItsTitle();
    void prefersTheAccessibleName();
    void tellsItsState();
    void choosesTheBoxByThePressAction();
    void offersNoPressWhileItIsDisabled();
    void hasTheWidgetsOfTheBoxAsChildren();
};

// Runs first: the factory comes with the first box, not with the library.
void tst_RadioGroupBoxAccessible::isUnknownBeforeTheFirstBox()
{
    QGroupBox plain(s("Plain"));
    plain.setCheckable(true);
    QVERIFY(QAccessible::queryAccessibleInterface(&plain)->role() != QAccessible::RadioButton);
    VelRadioGroupBox box(s("Radio"));
    QCOMPARE(QAccessible::queryAccessibleInterface(&box)->role(), QAccessible::RadioButton);
    QGroupBox other(s("Plain"));
    other.setCheckable(true);
    QVERIFY(QAccessible::queryAccessibleInterface(&other)->role() != QAccessible::RadioButton);
}

void tst_RadioGroupBoxAccessible::isARadioButton()
{
    VelRadioGroupBox box(s("Title"));
    const QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(&box);
    QVERIFY(interface);
    QCOMPARE(interface->role(), QAccessible::RadioButton);
    QCOMPARE(interface->object(), &box);
}

void tst_RadioGroupBoxAccessible::isARadioButtonInASubclass()
{
    SpecialBox box(s("Title"));
    QCOMPARE(QAccessible::queryAccessibleInterface(&box)->role(), QAccessible::RadioButton);
}

void tst_RadioGroupBoxAccessible::isNamedByItsTitle_data()
{
    QTest::addColumn<QString>("title");
    QTest::addColumn<QString>("name");
    QTest::newRow("plain") << s("Title") << s("Title");
    QTest::newRow("mnemonic") << s("&Manual set-up") << s("Manual set-up");
    QTest::newRow("inner mnemonic") << s("Set &up") << s("Set up");
    QTest::newRow("ampersand") << s("Cut && &paste") << s("Cut & paste");
    QTest::newRow("at the end") << s("Title&") << s("Title");
    QTest::newRow("none") << QString() << QString();
}

void tst_RadioGroupBoxAccessible::isNamedByItsTitle()
{
    QFETCH(QString, title);
    QFETCH(QString, name);
    VelRadioGroupBox box(title);
    QCOMPARE(QAccessible::queryAccessibleInterface(&box)->text(QAccessible::Name), name);
}

void tst_RadioGroupBoxAccessible::prefersTheAccessibleName()
{
    VelRadioGroupBox box(s("Title"));
    box.setAccessibleName(s("Name"));
    box.setAccessibleDescription(s("Description"));
    const QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(&box);
    QCOMPARE(interface->text(QAccessible::Name), s("Name"));
    QCOMPARE(interface->text(QAccessible::Description), s("Description"));
}

void tst_RadioGroupBoxAccessible::tellsItsState()
{
    QWidget parent;
    VelRadioGroupBox one(s("One"), &parent);
    VelRadioGroupBox two(s("Two"), &parent);
    one.setChecked(true);
    const QAccessible::State oneState = QAccessible::queryAccessibleInterface(&one)->state();
    const QAccessible::State twoState = QAccessible::queryAccessibleInterface(&two)->state();
    QVERIFY(oneState.checkable && twoState.checkable);
    QVERIFY(oneState.checked && !twoState.checked);
    QVERIFY(oneState.focusable && twoState.focusable);
    QVERIFY(!oneState.disabled);
    two.setEnabled(false);
    QVERIFY(QAccessible::queryAccessibleInterface(&two)->state().disabled);
}

void tst_RadioGroupBoxAccessible::choosesTheBoxByThePressAction()
{
    QWidget parent;
    VelRadioGroupBox one(s("One"), &parent);
    VelRadioGroupBox two(s("Two"), &parent);
    one.setChecked(true);
    QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(&two);
    QAccessibleActionInterface *action = interface->actionInterface();
    QVERIFY(action);
    QCOMPARE(action->actionNames().value(0), QAccessibleActionInterface::pressAction());
    action->doAction(QAccessibleActionInterface::pressAction());
    QVERIFY(two.isChecked());
    QVERIFY(!one.isChecked());
    action->doAction(QAccessibleActionInterface::pressAction());
    QVERIFY(two.isChecked()); // a radio button stays chosen
}

void tst_RadioGroupBoxAccessible::offersNoPressWhileItIsDisabled()
{
    QWidget parent;
    VelRadioGroupBox one(s("One"), &parent);
    VelRadioGroupBox two(s("Two"), &parent);
    two.setEnabled(false);
    QAccessibleActionInterface *action = QAccessible::queryAccessibleInterface(&two)->actionInterface();
    QVERIFY(!action->actionNames().contains(QAccessibleActionInterface::pressAction()));
    action->doAction(QAccessibleActionInterface::pressAction());
    QVERIFY(!two.isChecked());
}

void tst_RadioGroupBoxAccessible::hasTheWidgetsOfTheBoxAsChildren()
{
    VelRadioGroupBox box(s("Title"));
    QLineEdit edit(&box);
    const QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(&box);
    QCOMPARE(interface->childCount(), 1);
    QCOMPARE(interface->child(0)->object(), &edit);
}

VEL_TEST_MAIN(tst_RadioGroupBoxAccessible)

#include "tst_RadioGroupBoxAccessible.moc"
