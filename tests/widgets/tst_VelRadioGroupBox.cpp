// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <VelRadioGroupBox.h>

#include <QLineEdit>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QProxyStyle>
#include <QSignalSpy>
#include <QStyle>
#include <QStyleOptionGroupBox>
#include <QVBoxLayout>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

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

// Shows what is protected, and what was repainted.
class OpenBox : public VelRadioGroupBox
{
    Q_OBJECT

public:
    using VelRadioGroupBox::event;
    using VelRadioGroupBox::hitButtonOrLabel;
    using VelRadioGroupBox::initStyleOption;
    using VelRadioGroupBox::VelRadioGroupBox;

    QStyleOptionGroupBox option() const
    {
        QStyleOptionGroupBox result;
        initStyleOption(&result);
        return result;
    }

    bool isSunken() const { return option().state & QStyle::State_Sunken; }

    QRect rectOf(QStyle::SubControl part) const
    {
        const QStyleOptionGroupBox groupBox = option();
        return style()->subControlRect(QStyle::CC_GroupBox, &groupBox, part, this);
    }

    QPoint indicator() const { return rectOf(QStyle::SC_GroupBoxCheckBox).center(); }
    QPoint label() const { return rectOf(QStyle::SC_GroupBoxLabel).center(); }
    // A place in the contents.
    QPoint inside() const { return {width() / 2, height() - 8}; }

    QRegion painted;

protected:
    void paintEvent(QPaintEvent *event) override
    {
        painted += event->region();
        VelRadioGroupBox::paintEvent(event);
    }
};

// A parent that notes what its children let pass.
class Form : public QWidget
{
    Q_OBJECT

public:
    Form()
        : one(new OpenBox(s("&One"), this))
        , two(new OpenBox(s("&Two"), this))
    {
        auto *layout = new QVBoxLayout(this);
        layout->addWidget(one);
        layout->addWidget(two);
        QWidget *before = one;
        for (OpenBox *box : {one, two}) {
            auto *edit = new QLineEdit(box);
            (new QVBoxLayout(box))->addWidget(edit);
            setTabOrder(before, box);
            setTabOrder(box, edit);
            before = edit;
        }
        resize(300, 240);
    }

    OpenBox *const one;
    OpenBox *const two;
    int presses = 0;
    int moves = 0;
    int releases = 0;
    QVector<int> keys;

protected:
    void mousePressEvent(QMouseEvent *) override { ++presses; }
    void mouseMoveEvent(QMouseEvent *) override { ++moves; }
    void mouseReleaseEvent(QMouseEvent *) override { ++releases; }
    void keyPressEvent(QKeyEvent *event) override { keys.append(event->key()); }
    void keyReleaseEvent(QKeyEvent *event) override { keys.append(-event->key()); }
};

bool sendMouse(QWidget *widget, QEvent::Type type, const QPointF &position, Qt::MouseButton button,
               Qt::MouseButtons buttons)
{
    QMouseEvent event(type, position, button, buttons, Qt::NoModifier);
    QCoreApplication::sendEvent(widget, &event);
    return event.isAccepted();
}

// QTest does not know every key.
void sendKey(QWidget *widget, QEvent::Type type, int key)
{
    QKeyEvent event(type, key, Qt::NoModifier);
    QCoreApplication::sendEvent(widget, &event);
}

bool press(QWidget *widget, const QPointF &position, Qt::MouseButton button = Qt::LeftButton)
{
    return sendMouse(widget, QEvent::MouseButtonPress, position, button, button);
}

bool move(QWidget *widget, const QPointF &position, Qt::MouseButtons buttons = Qt::LeftButton)
{
    return sendMouse(widget, QEvent::MouseMove, position, Qt::NoButton, buttons);
}

bool release(QWidget *widget, const QPointF &position, Qt::MouseButton button = Qt::LeftButton)
{
    return sendMouse(widget, QEvent::MouseButtonRelease, position, button, Qt::NoButton);
}

} // namespace

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
    void hasTheSunkenStateWhilePressed();
    void enablesItsWidgetsOnlyWhileItIsChecked();
    void survivesTheDeletionOfBoxesByAListener();

    void isChosenByAClick_data();
    void isChosenByAClick();
    void staysCheckedWhenItIsClickedAgain();
    void letsOtherButtonsAndPlacesPass();
    void isRaisedWhenThePointerLeavesAndLoweredWhenItReturns();
    void isNotChosenWhenReleasedOutside();
    void acceptsMovesOnTheTitleAndLetsOthersPass();
    void ignoresAReleaseWithoutAPress();
    void roundsPositionsAwayFromZero();

    void isChosenByKeys_data();
    void isChosenByKeys();
    void updatesTheIndicatorAloneOnAKeyPress();
    void letsOtherKeysPass();
    void isReachedByTabAndChosenBySpace();
    void doesNothingForItsMnemonic();
    void passesEventsByTheBaseClass();
    void isRepaintedAtOnce();
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

void tst_VelRadioGroupBox::hasTheSunkenStateWhilePressed()
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

void tst_VelRadioGroupBox::isChosenByAClick_data()
{
    QTest::addColumn<bool>("onLabel");
    QTest::addColumn<bool>("rightToLeft");
    QTest::newRow("indicator") << false << false;
    QTest::newRow("title") << true << false;
    QTest::newRow("indicator, right to left") << false << true;
    QTest::newRow("title, right to left") << true << true;
}

void tst_VelRadioGroupBox::isChosenByAClick()
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

void tst_VelRadioGroupBox::staysCheckedWhenItIsClickedAgain()
{
    Form form;
    form.show();
    form.one->setChecked(true);
    QSignalSpy spy(form.one, &QGroupBox::toggled);
    QTest::mouseClick(form.one, Qt::LeftButton, Qt::NoModifier, form.one->indicator());
    QVERIFY(form.one->isChecked());
    QVERIFY(spy.isEmpty());
}

void tst_VelRadioGroupBox::letsOtherButtonsAndPlacesPass()
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

void tst_VelRadioGroupBox::isRaisedWhenThePointerLeavesAndLoweredWhenItReturns()
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

void tst_VelRadioGroupBox::isNotChosenWhenReleasedOutside()
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

void tst_VelRadioGroupBox::acceptsMovesOnTheTitleAndLetsOthersPass()
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

void tst_VelRadioGroupBox::ignoresAReleaseWithoutAPress()
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

void tst_VelRadioGroupBox::roundsPositionsAwayFromZero()
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

void tst_VelRadioGroupBox::isChosenByKeys_data()
{
    QTest::addColumn<int>("key");
    QTest::newRow("Space") << int(Qt::Key_Space);
    QTest::newRow("Select") << int(Qt::Key_Select);
}

void tst_VelRadioGroupBox::isChosenByKeys()
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

void tst_VelRadioGroupBox::updatesTheIndicatorAloneOnAKeyPress()
{
    Form form;
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    QCoreApplication::processEvents();
    form.one->painted = QRegion();
    QTest::keyPress(form.one, Qt::Key_Space);
    QTRY_COMPARE(form.one->painted, QRegion(form.one->rectOf(QStyle::SC_GroupBoxCheckBox)));
}

void tst_VelRadioGroupBox::letsOtherKeysPass()
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

void tst_VelRadioGroupBox::isReachedByTabAndChosenBySpace()
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

void tst_VelRadioGroupBox::doesNothingForItsMnemonic()
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

void tst_VelRadioGroupBox::passesEventsByTheBaseClass()
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

void tst_VelRadioGroupBox::isRepaintedAtOnce()
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

VEL_TEST_MAIN(tst_VelRadioGroupBox)

#include "tst_VelRadioGroupBox.moc"
