// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RadioBoxDriving.h"
#include "TestCase.h"

#include <VelRadioGroupBox.h>

#include <QLineEdit>
#include <QSignalSpy>

/// Which of the boxes of a group is checked.
class tst_VelRadioGroupBox : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isUncheckedAndCheckableAfterConstruction();
    void addsNothingToTheMetaObject();
    void checkingOneUnchecksTheOthers();
    void checkingTheCheckedOneChangesNothing();
    void uncheckingLeavesTheOthersAlone();
    void groupsBoxesAtEveryDepth();
    void leavesBoxesBelowAnotherParentAlone();
    void cannotBeCheckedAlone();
    void cannotBeCheckedWithoutAParent();
    void enablesItsWidgetsOnlyWhileItIsChecked();
    void survivesTheDeletionOfBoxesByAListener();
};

void tst_VelRadioGroupBox::isUncheckedAndCheckableAfterConstruction()
{
    QWidget parent;
    VelRadioGroupBox untitled(&parent);
    VelRadioGroupBox titled(s("Title"), &parent);
    for (const VelRadioGroupBox *box : {&untitled, &titled}) {
        QVERIFY(box->isCheckable());
        QVERIFY(!box->isChecked());
        QCOMPARE(box->parentWidget(), &parent);
    }
    QCOMPARE(untitled.title(), QString());
    QCOMPARE(titled.title(), s("Title"));
}

void tst_VelRadioGroupBox::addsNothingToTheMetaObject()
{
    const QMetaObject &meta = VelRadioGroupBox::staticMetaObject;
    QCOMPARE(meta.className(), "VelRadioGroupBox");
    QCOMPARE(meta.superClass(), &QGroupBox::staticMetaObject);
    QCOMPARE(meta.methodOffset(), meta.methodCount());
    QCOMPARE(meta.propertyOffset(), meta.propertyCount());
}

void tst_VelRadioGroupBox::checkingOneUnchecksTheOthers()
{
    Form form;
    form.one->setChecked(true);
    QVERIFY(form.one->isChecked() && !form.two->isChecked());
    QSignalSpy one(form.one, &QGroupBox::toggled);
    QSignalSpy two(form.two, &QGroupBox::toggled);
    form.two->setChecked(true);
    QVERIFY(!form.one->isChecked() && form.two->isChecked());
    QCOMPARE(one, (QList<QList<QVariant>>{{false}}));
    QCOMPARE(two, (QList<QList<QVariant>>{{true}}));
}

void tst_VelRadioGroupBox::checkingTheCheckedOneChangesNothing()
{
    Form form;
    form.one->setChecked(true);
    QSignalSpy spy(form.one, &QGroupBox::toggled);
    form.one->setChecked(true);
    QVERIFY(form.one->isChecked());
    QVERIFY(spy.isEmpty());
}

void tst_VelRadioGroupBox::uncheckingLeavesTheOthersAlone()
{
    Form form;
    form.one->setChecked(true);
    form.two->setChecked(false);
    QVERIFY(form.one->isChecked());
    form.one->setChecked(false);
    QVERIFY(!form.one->isChecked() && !form.two->isChecked());
}

void tst_VelRadioGroupBox::groupsBoxesAtEveryDepth()
{
    Form form;
    QWidget middle(&form);
    QWidget inner(&middle);
    VelRadioGroupBox deep(s("Deep"), &inner);
    QGroupBox plain(s("Plain"), &form);
    plain.setCheckable(true);
    form.one->setChecked(true);
    QVERIFY(form.one->isChecked());

    // From above the deep one is in the group; from below it is alone under its parent.
    static_cast<QGroupBox &>(deep).setChecked(true);
    QVERIFY(deep.isChecked());
    form.two->setChecked(true);
    QVERIFY(!deep.isChecked() && !form.one->isChecked() && form.two->isChecked());
    QVERIFY(plain.isChecked());
}

void tst_VelRadioGroupBox::leavesBoxesBelowAnotherParentAlone()
{
    QWidget window;
    auto *left = new QWidget(&window);
    auto *right = new QWidget(&window);
    VelRadioGroupBox leftOne(left);
    VelRadioGroupBox leftTwo(left);
    VelRadioGroupBox rightOne(right);
    VelRadioGroupBox rightTwo(right);
    leftOne.setChecked(true);
    rightTwo.setChecked(true);
    QVERIFY(leftOne.isChecked() && rightTwo.isChecked());
    QVERIFY(!leftTwo.isChecked() && !rightOne.isChecked());
}

void tst_VelRadioGroupBox::cannotBeCheckedAlone()
{
    QWidget parent;
    OpenBox box(s("Alone"), &parent);
    parent.resize(200, 100);
    box.resize(200, 100);
    box.setChecked(true);
    QVERIFY(!box.isChecked());
    press(&box, box.indicator());
    release(&box, box.indicator());
    QVERIFY(!box.isChecked());
    QTest::keyClick(&box, Qt::Key_Space);
    QVERIFY(!box.isChecked());
}

void tst_VelRadioGroupBox::cannotBeCheckedWithoutAParent()
{
    OpenBox box(s("Orphan"));
    VelRadioGroupBox child(s("Child"), &box);
    static_cast<QGroupBox &>(child).setChecked(true);
    box.setChecked(true);
    QVERIFY(!box.isChecked());
    QVERIFY(child.isChecked()); // nothing at all was done
}

void tst_VelRadioGroupBox::enablesItsWidgetsOnlyWhileItIsChecked()
{
    Form form;
    const auto *edit = form.one->findChild<QLineEdit *>();
    QVERIFY(!edit->isEnabled());
    form.one->setChecked(true);
    QVERIFY(edit->isEnabled());
    form.two->setChecked(true);
    QVERIFY(!edit->isEnabled());
    QVERIFY(form.one->isEnabled()); // so that it can be chosen again
}

void tst_VelRadioGroupBox::survivesTheDeletionOfBoxesByAListener()
{
    QWidget parent;
    auto *one = new VelRadioGroupBox(s("One"), &parent);
    auto *two = new VelRadioGroupBox(s("Two"), &parent);
    auto *three = new VelRadioGroupBox(s("Three"), &parent);
    one->setChecked(true);
    connect(one, &QGroupBox::toggled, two, [two, three] {
        delete three;
        delete two;
    });
    three->setChecked(true);
    QCOMPARE(parent.findChildren<VelRadioGroupBox *>(), QList<VelRadioGroupBox *>{one});
}

VEL_TEST_MAIN(tst_VelRadioGroupBox)
#include "tst_VelRadioGroupBox.moc"
