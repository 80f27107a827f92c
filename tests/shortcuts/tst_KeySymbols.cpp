// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "QtMajor.h"
#include "TestCase.h"

#include <frame/QtMajor.h>
#include <shortcuts/KeySymbols.h>

#include <KKeyServer>

// Last: the macros of Xlib's header hide names of Qt.
#include <X11/Xlib.h>

/// What keys are where there is no X server: the same as on a usual one.
class tst_KeySymbols : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void asksNoXServer();
    void knowsEverySymbolAsOnX11();
    void knowsTheUsualModifiers();
};

void tst_KeySymbols::asksNoXServer()
{
    QVERIFY(!QtMajor::x11Display());
    // A word of KKeyServer's about it would fail the test.
    QCOMPARE(KeySymbols::ofKey(VelTest::keyNumber(Qt::META | Qt::Key_F3))->mask, 0x40u);
    QCOMPARE(*KeySymbols::keyOf(0xffc0), int(Qt::Key_F3));
    QCOMPARE(KeySymbols::modifiersOf(0x40), int(Qt::META));
    QVERIFY(!KeySymbols::ofKey(Qt::Key_Shift));
    QVERIFY(!KeySymbols::keyOf(0xffe1));
}

void tst_KeySymbols::knowsEverySymbolAsOnX11()
{
    expectWarning(QRegularExpression(QStringLiteral("KKeyServer accessed from non-X11 platform")));
    int named = 0;
    for (unsigned int symbol = 1; symbol < 0x10090000; symbol = symbol == 0xffff ? 0x10080000 : symbol + 1) {
        if (!XKeysymToString(symbol))
            continue;
        ++named;
        int key = 0;
        // A modifier is no key by itself, also where KKeyServer has one for it.
        const bool isKnown = KKeyServer::symXModXToKeyQt(symbol, 0, &key)
            && (key < Qt::Key_Shift || key > Qt::Key_Alt);
        const std::optional<int> ours = KeySymbols::keyOf(symbol);
        QVERIFY2(isKnown == ours.has_value() && (!isKnown || key == *ours), XKeysymToString(symbol));
    }
    QVERIFY2(named > 1000, qPrintable(QString::number(named)));
}

void tst_KeySymbols::knowsTheUsualModifiers()
{
    const int modifiers[] = {Qt::SHIFT, Qt::CTRL, Qt::ALT, Qt::META};
    const unsigned int masks[] = {ShiftMask, ControlMask, Mod1Mask, Mod4Mask};
    for (int set = 0; set < 16; ++set) {
        int code = Qt::Key_F1;
        unsigned int mask = 0;
        for (int i = 0; i < 4; ++i) {
            if (set & (1 << i)) {
                code |= modifiers[i];
                mask |= masks[i];
            }
        }
        QCOMPARE(KeySymbols::ofKey(code)->mask, mask);
        QCOMPARE(KeySymbols::modifiersOf(mask) | Qt::Key_F1, code);
    }
    QCOMPARE(KeySymbols::modifiersOf(LockMask | Mod2Mask | Mod3Mask | Mod5Mask), 0);
}

VEL_TEST_MAIN(tst_KeySymbols)
#include "tst_KeySymbols.moc"
