// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/FormLayout.h>
#include <desktopentry/fields/RowSlot.h>

#include <QAbstractButton>
#include <QAccessible>
#include <QCheckBox>
#include <QRadioButton>
#include <QToolButton>

using VelUI::FormLayout;

class tst_FormLayout : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void addsTheColonToTheLabel();
    void numbersARowByTheRowCountBefore();
    void putsALayoutIntoTheSecondColumn();
    void putsTwoWidgetsSideBySideWithoutALabel();
    void spansBothColumnsWithOneWidget();
    void hidesAndShowsBothHalvesOfARow();
    void hidesEveryWidgetOfANestedLayout();
    void ignoresARowThatDoesNotExist();
    void makesALabelBoldAndNothingElse();
    void makesTheLabelTheBuddyOfTheFieldThatTakesTheKeys();
    void givesEveryPartOfAFieldAName();
    void keepsTheNameThatAButtonHas();
    void leavesNoGapForHiddenRows();
    void showsWhatComesUnderARowBeforeItMovesTheOthers_data();
    void showsWhatComesUnderARowBeforeItMovesTheOthers();
};

void tst_FormLayout::addsTheColonToTheLabel()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *field = new QLineEdit;
    const int row = layout->addRow(QStringLiteral("Exec"), field);
    auto *label = qobject_cast<QLabel *>(layout->itemAtPosition(row, 0)->widget());
    QVERIFY(label);
    QCOMPARE(label->text(), QStringLiteral("Exec:"));
    QCOMPARE(layout->itemAtPosition(row, 1)->widget(), field);
}

void tst_FormLayout::numbersARowByTheRowCountBefore()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    const int before = layout->rowCount();
    QCOMPARE(layout->addRow(QStringLiteral("One"), new QLineEdit), before);
    QCOMPARE(layout->addRow(new QCheckBox), before + 1);
    QCOMPARE(layout->addRow(new QRadioButton, new QLineEdit), before + 2);
    QCOMPARE(layout->addRow(QStringLiteral("Two"), new QHBoxLayout), before + 3);
    QCOMPARE(layout->rowCount(), before + 4);
}

void tst_FormLayout::putsALayoutIntoTheSecondColumn()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *inner = new QHBoxLayout;
    const int row = layout->addRow(QStringLiteral("Url"), inner);
    QCOMPARE(layout->itemAtPosition(row, 1)->layout(), inner);
    QCOMPARE(qobject_cast<QLabel *>(layout->itemAtPosition(row, 0)->widget())->text(),
             QStringLiteral("Url:"));
}

void tst_FormLayout::putsTwoWidgetsSideBySideWithoutALabel()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *left = new QRadioButton;
    auto *right = new QLineEdit;
    const int row = layout->addRow(left, right);
    QCOMPARE(layout->itemAtPosition(row, 0)->widget(), left);
    QCOMPARE(layout->itemAtPosition(row, 1)->widget(), right);
    QVERIFY(form.findChildren<QLabel *>().isEmpty());
}

void tst_FormLayout::spansBothColumnsWithOneWidget()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *box = new QCheckBox;
    const int row = layout->addRow(box);
    int foundRow, column, rowSpan, columnSpan;
    layout->getItemPosition(layout->indexOf(box), &foundRow, &column, &rowSpan, &columnSpan);
    QCOMPARE(foundRow, row);
    QCOMPARE(column, 0);
    QCOMPARE(rowSpan, 1);
    QCOMPARE(columnSpan, 2);
}

void tst_FormLayout::hidesAndShowsBothHalvesOfARow()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *first = new QLineEdit;
    auto *second = new QLineEdit;
    layout->addRow(QStringLiteral("First"), first);
    const int row = layout->addRow(QStringLiteral("Second"), second);
    QWidget *label = layout->itemAtPosition(row, 0)->widget();

    layout->hideRow(row);
    QVERIFY(second->isHidden() && label->isHidden());
    QVERIFY(!first->isHidden());
    layout->showRow(row);
    QVERIFY(!second->isHidden() && !label->isHidden());
    layout->setRowVisible(row, false);
    QVERIFY(second->isHidden() && label->isHidden());
    layout->setRowVisible(row, true);
    QVERIFY(!second->isHidden() && !label->isHidden());
}

void tst_FormLayout::hidesEveryWidgetOfANestedLayout()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *inner = new QHBoxLayout;
    auto *innermost = new QVBoxLayout;
    auto *line = new QLineEdit;
    auto *upper = new QToolButton;
    auto *lower = new QToolButton;
    inner->addWidget(line);
    inner->addStretch();
    inner->addLayout(innermost);
    innermost->addWidget(upper);
    innermost->addWidget(lower);
    const int row = layout->addRow(QStringLiteral("Url"), inner);

    layout->hideRow(row);
    QVERIFY(line->isHidden() && upper->isHidden() && lower->isHidden());
    layout->showRow(row);
    QVERIFY(!line->isHidden() && !upper->isHidden() && !lower->isHidden());
}

void tst_FormLayout::ignoresARowThatDoesNotExist()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *field = new QLineEdit;
    const int row = layout->addRow(QStringLiteral("One"), field);
    layout->hideRow(row + 7);
    layout->setRowLabelBold(row + 7);
    QVERIFY(!field->isHidden());
}

void tst_FormLayout::makesALabelBoldAndNothingElse()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *field = new QLineEdit;
    auto *radio = new QRadioButton;
    const int row = layout->addRow(QStringLiteral("Name"), field);
    const int radioRow = layout->addRow(radio, new QLineEdit);
    QWidget *label = layout->itemAtPosition(row, 0)->widget();
    const QFont before = label->font();

    layout->setRowLabelBold(row);
    layout->setRowLabelBold(radioRow);
    QCOMPARE(QFont::Weight(label->font().weight()), QFont::Bold);
    QCOMPARE(label->font().pointSizeF(), before.pointSizeF());
    QCOMPARE(label->font().family(), before.family());
    QVERIFY(!field->font().bold());
    QVERIFY(!radio->font().bold());
}

void tst_FormLayout::makesTheLabelTheBuddyOfTheFieldThatTakesTheKeys()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *plain = new QLineEdit;
    auto *compound = new QWidget;
    auto *inside = new QLineEdit(compound);
    compound->setFocusProxy(inside);
    auto *nested = new QLineEdit;
    auto *inner = new QHBoxLayout;
    inner->addWidget(nested);
    inner->addWidget(new QToolButton);

    const auto buddyOf = [layout](int row) {
        return qobject_cast<QLabel *>(layout->itemAtPosition(row, 0)->widget())->buddy();
    };
    QCOMPARE(buddyOf(layout->addRow(QStringLiteral("Plain"), plain)), plain);
    QCOMPARE(buddyOf(layout->addRow(QStringLiteral("Compound"), compound)), inside);
    QCOMPARE(buddyOf(layout->addRow(QStringLiteral("Nested"), inner)), nested);
}

void tst_FormLayout::givesEveryPartOfAFieldAName()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *compound = new QWidget;
    auto *line = new QLineEdit(compound);
    auto *button = new QToolButton(compound);
    layout->addRow(QStringLiteral("Icon"), compound);
    auto *list = new QLineEdit;
    layout->addRow(new QRadioButton(QStringLiteral("Only show in")), list);

    const auto spoken = [](QWidget *widget) {
        return QAccessible::queryAccessibleInterface(widget)->text(QAccessible::Name);
    };
    QCOMPARE(spoken(line), QStringLiteral("Icon"));
    QCOMPARE(spoken(button), QStringLiteral("Edit Icon"));
    QCOMPARE(spoken(list), QStringLiteral("Only show in"));
}

void tst_FormLayout::keepsTheNameThatAButtonHas()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    auto *inner = new QHBoxLayout;
    auto *line = new QLineEdit;
    auto *button = new QToolButton;
    button->setAccessibleName(QStringLiteral("Information"));
    inner->addWidget(line);
    inner->addWidget(button);
    layout->addRow(QStringLiteral("Url"), inner);
    QCOMPARE(line->accessibleName(), QStringLiteral("Url"));
    QCOMPARE(button->accessibleName(), QStringLiteral("Information"));
}

void tst_FormLayout::leavesNoGapForHiddenRows()
{
    QWidget form;
    auto *layout = new FormLayout(&form);
    layout->addRow(QStringLiteral("One"), new QLineEdit);
    const int height = form.sizeHint().height();
    for (int i = 0; i < 5; ++i)
        layout->hideRow(layout->addRow(QStringLiteral("Hidden"), new QLineEdit));
    layout->activate();
    QCOMPARE(form.sizeHint().height(), height);
}

void tst_FormLayout::showsWhatComesUnderARowBeforeItMovesTheOthers_data()
{
    QTest::addColumn<Qt::LayoutDirection>("direction");
    QTest::newRow("left to right") << Qt::LeftToRight;
    QTest::newRow("right to left") << Qt::RightToLeft;
}

void tst_FormLayout::showsWhatComesUnderARowBeforeItMovesTheOthers()
{
    QFETCH(Qt::LayoutDirection, direction);
    QWidget form;
    form.setLayoutDirection(direction);
    form.resize(400, 300);
    auto *layout = new FormLayout(&form);
    const int row = layout->addRow(QStringLiteral("One"), new QLineEdit);
    auto *next = new QLineEdit;
    layout->addRow(QStringLiteral("Two"), next);
    layout->setRowStretch(layout->rowCount(), 1);
    layout->spread();
    VelUI::RowSlot *slot = layout->belowRow(row);
    auto *sentence = new QLabel(QStringLiteral("This is wrong."));
    sentence->hide();
    slot->add(sentence);
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    const QRect former = next->geometry();

    for (int time = 0; time < 2; ++time) {
        layout->holdRows();
        sentence->show();
        layout->showAhead(row);
        const QRect ahead = slot->geometry();
        QVERIFY(sentence->isVisible());
        QVERIFY(slot->autoFillBackground());
        QCOMPARE(next->geometry(), former);
        layout->releaseRows();
        QCOMPARE(slot->geometry(), ahead);
        QVERIFY(!slot->autoFillBackground());
        QVERIFY(next->y() > former.y());
        sentence->hide();
        layout->activate();
        QCOMPARE(next->geometry(), former);
    }
}

VEL_TEST_MAIN(tst_FormLayout)

#include "tst_FormLayout.moc"
