// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RadioBoxDriving.h"
#include "TestCase.h"

#include <QProxyStyle>
#include <QSignalSpy>
#include <QStyle>
#include <QStyleOptionGroupBox>

namespace {

// Puts the indicator into the corner.
class CornerStyle : public QProxyStyle
{
    Q_OBJECT

public:
    QRect subControlRect(ComplexControl control, const QStyleOptionComplex *option, SubControl part,
                         const QWidget *widget) const override
    {
        if (control == CC_GroupBox && part == SC_GroupBoxCheckBox)
            return {0, 0, 16, 16};
        return QProxyStyle::subControlRect(control, option, part, widget);
    }
};

} // namespace

/// The box under the mouse.
class tst_VelRadioGroupBoxMouse : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hasTheSunkenStateWhilePressed();
    void isChosenByAClick_data();
    void isChosenByAClick();
    void staysCheckedWhenItIsClickedAgain();
    void letsOtherButtonsAndPlacesPass();
    void isRaisedWhenThePointerLeavesAndLoweredWhenItReturns();
    void isNotChosenWhenReleasedOutside();
    void acceptsMovesOnTheTitleAndLetsOthersPass();
    void ignoresAReleaseWithoutAPress();
    void roundsPositionsAwayFromZero();
    void isRepaintedAtOnce();
};

void tst_VelRadioGroupBoxMouse::hasTheSunkenStateWhilePressed()
{
    Form form;
    QStyleOptionGroupBox option;
    option.state = QStyle::State_Sunken;
    form.one->initStyleOption(&option);
    QVERIFY(!(option.state & QStyle::State_Sunken));
    press(form.one, form.one->indicator());
    form.one->initStyleOption(&option);
    QVERIFY(option.state & QStyle::State_Sunken);
    QCOMPARE(option.text, s("&One"));
}

void tst_VelRadioGroupBoxMouse::isChosenByAClick_data()
{
    QTest::addColumn<bool>("onLabel");
    QTest::addColumn<bool>("rightToLeft");
    QTest::newRow("indicator") << false << false;
    QTest::newRow("title") << true << false;
    QTest::newRow("indicator, right to left") << false << true;
    QTest::newRow("title, right to left") << true << true;
}

void tst_VelRadioGroupBoxMouse::isChosenByAClick()
{
    QFETCH(bool, onLabel);
    QFETCH(bool, rightToLeft);
    Form form;
    form.setLayoutDirection(rightToLeft ? Qt::RightToLeft : Qt::LeftToRight);
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    const QPoint place = onLabel ? form.one->label() : form.one->indicator();
    QCOMPARE(place.x() > form.one->width() / 2, rightToLeft);
    QVERIFY(form.one->hitButtonOrLabel(place));
    QSignalSpy clicked(form.one, &QGroupBox::clicked);

    QVERIFY(press(form.one, place));
    QVERIFY(form.one->isSunken());
    QVERIFY(!form.one->isChecked());
    QVERIFY(release(form.one, place));
    QVERIFY(!form.one->isSunken());
    QVERIFY(form.one->isChecked());
    QVERIFY(clicked.isEmpty());
    QCOMPARE(form.presses + form.releases, 0);
}

void tst_VelRadioGroupBoxMouse::staysCheckedWhenItIsClickedAgain()
{
    Form form;
    form.show();
    form.one->setChecked(true);
    QSignalSpy spy(form.one, &QGroupBox::toggled);
    QTest::mouseClick(form.one, Qt::LeftButton, Qt::NoModifier, form.one->indicator());
    QVERIFY(form.one->isChecked());
    QVERIFY(spy.isEmpty());
}

void tst_VelRadioGroupBoxMouse::letsOtherButtonsAndPlacesPass()
{
    Form form;
    form.show();
    QVERIFY(!form.one->hitButtonOrLabel(form.one->inside()));
    press(form.one, form.one->inside());
    QCOMPARE(form.presses, 1);
    for (const Qt::MouseButton button : {Qt::RightButton, Qt::MiddleButton}) {
        press(form.one, form.one->indicator(), button);
        release(form.one, form.one->indicator(), button);
    }
    QCOMPARE(form.presses, 3);
    QCOMPARE(form.releases, 2);
    QVERIFY(!form.one->isSunken() && !form.one->isChecked());
}

void tst_VelRadioGroupBoxMouse::isRaisedWhenThePointerLeavesAndLoweredWhenItReturns()
{
    Form form;
    form.show();
    press(form.one, form.one->label());
    QVERIFY(move(form.one, form.one->inside()));
    QVERIFY(!form.one->isSunken());
    QVERIFY(move(form.one, form.one->indicator()));
    QVERIFY(form.one->isSunken());
    release(form.one, form.one->indicator());
    QVERIFY(form.one->isChecked());
}

void tst_VelRadioGroupBoxMouse::isNotChosenWhenReleasedOutside()
{
    Form form;
    form.show();
    press(form.one, form.one->label());
    move(form.one, form.one->inside());
    release(form.one, form.one->inside());
    QCOMPARE(form.releases, 1); // let pass, the button was up already
    QVERIFY(!form.one->isSunken() && !form.one->isChecked());

    // The same without a move in between.
    press(form.one, form.one->label());
    form.one->painted = QRegion();
    release(form.one, form.one->inside());
    QCOMPARE(form.releases, 2);
    QVERIFY(!form.one->isSunken() && !form.one->isChecked());
    QVERIFY(form.one->painted.isEmpty());
}

void tst_VelRadioGroupBoxMouse::acceptsMovesOnTheTitleAndLetsOthersPass()
{
    Form form;
    form.show();
    form.setMouseTracking(true);
    form.one->setMouseTracking(true); // or Qt withholds moves without a button
    press(form.one, form.one->label());
    QVERIFY(move(form.one, form.one->indicator())); // nothing changes
    QCOMPARE(form.moves, 0);
    move(form.one, form.one->inside());
    QCOMPARE(form.moves, 0);
    move(form.one, form.one->inside() + QPoint(1, 0)); // outside as before
    QCOMPARE(form.moves, 1);
    move(form.one, form.one->indicator(), Qt::NoButton);
    move(form.one, form.one->indicator(), Qt::RightButton);
    QCOMPARE(form.moves, 3);
    QVERIFY(!form.one->isSunken());
    QVERIFY(move(form.one, form.one->indicator(), Qt::LeftButton | Qt::RightButton));
    QVERIFY(form.one->isSunken());
}

void tst_VelRadioGroupBoxMouse::ignoresAReleaseWithoutAPress()
{
    Form form;
    form.show();
    release(form.one, form.one->indicator());
    QCOMPARE(form.releases, 1);
    QVERIFY(!form.one->isChecked());
    press(form.one, form.one->indicator());
    release(form.one, form.one->indicator(), Qt::RightButton);
    QCOMPARE(form.releases, 2);
    QVERIFY(form.one->isSunken() && !form.one->isChecked());
}

void tst_VelRadioGroupBoxMouse::roundsPositionsAwayFromZero()
{
    Form form;
    form.show();
    // Whatever the style: find the first column of the indicator, then come from both sides.
    const QRect indicator = form.one->rectOf(QStyle::SC_GroupBoxCheckBox);
    const qreal left = indicator.left();
    const qreal y = indicator.center().y();
    QVERIFY(!form.one->hitButtonOrLabel(QPoint(indicator.left() - 1, indicator.center().y())));
    press(form.one, QPointF(left - 0.6, y));
    QVERIFY(!form.one->isSunken());
    press(form.one, QPointF(left - 0.5, y)); // half a pixel goes up
    QVERIFY(form.one->isSunken());
    release(form.one, QPointF(left - 0.5, y));
    QVERIFY(form.one->isChecked());

    // Half a pixel above the corner is outside: -0.5 goes to -1, not to 0.
    CornerStyle corner;
    form.two->setStyle(&corner);
    press(form.two, QPointF(0, -0.5));
    QVERIFY(!form.two->isSunken());
    press(form.two, QPointF(0, -0.4));
    QVERIFY(form.two->isSunken());
    form.two->setStyle(nullptr);
}

void tst_VelRadioGroupBoxMouse::isRepaintedAtOnce()
{
    Form form;
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    QCoreApplication::processEvents();
    const auto repainted = [](OpenBox *box) {
        const bool all = box->painted.contains(box->rect().center());
        box->painted = QRegion();
        return all;
    };
    repainted(form.one);
    repainted(form.two);
    form.one->setChecked(true);
    QVERIFY(repainted(form.one));
    QVERIFY(repainted(form.two));
    press(form.one, form.one->label());
    QVERIFY(repainted(form.one));
    move(form.one, form.one->inside());
    QVERIFY(repainted(form.one));
    move(form.one, form.one->label());
    QVERIFY(repainted(form.one));
    release(form.one, form.one->label());
    QVERIFY(repainted(form.one));
    form.one->setChecked(false);
    QVERIFY(repainted(form.one));
}

VEL_TEST_MAIN(tst_VelRadioGroupBoxMouse)
#include "tst_VelRadioGroupBoxMouse.moc"
