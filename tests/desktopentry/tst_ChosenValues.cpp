// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/choosers/ChosenValues.h>

using VelUI::ChosenValues;

namespace {

const QString a = QStringLiteral("a");
const QString b = QStringLiteral("b");
const QString c = QStringLiteral("c");
const QString d = QStringLiteral("d");

} // namespace

class tst_ChosenValues : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void keepsWhatNobodyTouches();
    void putsNewOnesBehind();
    void givesOneThatComesBackItsPlace();
    void takesOutOneThatStandsTwice();
    void hearsNothingNewInWhatIsSo();
};

void tst_ChosenValues::keepsWhatNobodyTouches()
{
    const QStringList odd{c, a, QString(), a, b};
    const ChosenValues chosen(odd);
    QCOMPARE(chosen.values(), odd);
    QCOMPARE(chosen.count(), 4);
    QVERIFY(chosen.contains(a));
    QVERIFY(!chosen.contains(d));
    QCOMPARE(ChosenValues().values(), QStringList());
}

void tst_ChosenValues::putsNewOnesBehind()
{
    ChosenValues chosen({c});
    chosen.set(d, true);
    chosen.set(a, true);
    QCOMPARE(chosen.values(), (QStringList{c, d, a}));
    chosen.set(d, false);
    chosen.set(d, true);
    QCOMPARE(chosen.values(), (QStringList{c, a, d}));
    QVERIFY(chosen.wasChosen(c));
    QVERIFY(!chosen.wasChosen(d));
}

void tst_ChosenValues::givesOneThatComesBackItsPlace()
{
    ChosenValues chosen({a, b, c});
    chosen.set(b, false);
    QVERIFY(!chosen.contains(b));
    QVERIFY(chosen.wasChosen(b));
    QCOMPARE(chosen.values(), (QStringList{a, c}));
    chosen.set(d, true);
    chosen.set(b, true);
    QCOMPARE(chosen.values(), (QStringList{a, b, c, d}));
}

void tst_ChosenValues::takesOutOneThatStandsTwice()
{
    ChosenValues chosen({a, b, a});
    chosen.set(a, false);
    QCOMPARE(chosen.values(), QStringList(b));
    chosen.set(a, true);
    QCOMPARE(chosen.values(), (QStringList{a, b, a}));
}

void tst_ChosenValues::hearsNothingNewInWhatIsSo()
{
    ChosenValues chosen({a});
    chosen.set(a, true);
    chosen.set(b, true);
    chosen.set(b, true);
    chosen.set(c, false);
    QCOMPARE(chosen.values(), (QStringList{a, b}));
}

VEL_TEST_GUILESS_MAIN(tst_ChosenValues)

#include "tst_ChosenValues.moc"
