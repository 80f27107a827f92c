// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "QtMajor.h"
#include "TestCase.h"

#include <shortcuts/KeyNames.h>

class tst_KeyNames : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void knowsModifiersByAllTheirNames_data();
    void knowsModifiersByAllTheirNames();
    void readsNoFurtherThanTheLength();
    void writesTheModifiersInOneOrder();
    void readsWhatItWrites();
    void tellsAnUnknownKeyFromANamelessSymbol();
    void rejectsWhatIsNoKey_data();
    void rejectsWhatIsNoKey();
};

void tst_KeyNames::knowsModifiersByAllTheirNames_data()
{
    QTest::addColumn<unsigned int>("bit");
    for (const char *name : {"", "Super", "Alt ", "Strg", "Mod", "Mod3", "Controls", "Shif"})
        QTest::newRow(name) << 0u;
    for (const char *name : {"Ctrl", "ctrl", "Control", "CONTROL"})
        QTest::newRow(name) << 0x04u;
    for (const char *name : {"Shift", "sHIFT"})
        QTest::newRow(name) << 0x01u;
    for (const char *name : {"Alt", "alt"})
        QTest::newRow(name) << 0x08u;
    for (const char *name : {"Mod4", "mod4", "Meta", "META"})
        QTest::newRow(name) << 0x40u;
}

void tst_KeyNames::knowsModifiersByAllTheirNames()
{
    const char *name = QTest::currentDataTag();
    QTEST(KeyNames::modifierBit(name, qstrlen(name)), "bit");
}

void tst_KeyNames::readsNoFurtherThanTheLength()
{
    QCOMPARE(KeyNames::modifierBit("Ctrl+Alt", 4), 0x04u);
    QCOMPARE(KeyNames::modifierBit("Ctrl+Alt", 3), 0u);
    QCOMPARE(KeyNames::modifierBit("Ctrl+Alt", 8), 0u);
}

void tst_KeyNames::writesTheModifiersInOneOrder()
{
    QCOMPARE(
        KeyNames::toKeyString(VelTest::keyNumber(Qt::META | Qt::ALT | Qt::SHIFT | Qt::CTRL | Qt::Key_F3)),
        QStringLiteral("Ctrl+Shift+Alt+Mod4+F3"));
}

void tst_KeyNames::readsWhatItWrites()
{
    const int code = VelTest::keyNumber(Qt::META | Qt::SHIFT | Qt::Key_F3);
    QVERIFY(KeyNames::roundTrips(code));
    QCOMPARE(KeyNames::fromKeyString(KeyNames::toKeyString(code)), KeyNames::portableText(code));
    QCOMPARE(*KeyNames::codeFromKeyString(KeyNames::toKeyString(code).toLocal8Bit()), code);
}

void tst_KeyNames::tellsAnUnknownKeyFromANamelessSymbol()
{
    QVERIFY(KeyNames::toKeyString(-1).isNull());
    QVERIFY(!KeyNames::toKeyString(0).isNull());
    QVERIFY(KeyNames::toKeyString(0).isEmpty());
}

void tst_KeyNames::rejectsWhatIsNoKey_data()
{
    QTest::addColumn<QString>("text");
    for (const char *text : {"", "Ctrl+", "#23", "Mod4+Super_L", "f5", "Gibberish"})
        QTest::newRow(*text ? text : "(nothing)") << QString::fromLatin1(text);
}

void tst_KeyNames::rejectsWhatIsNoKey()
{
    QFETCH(QString, text);
    QVERIFY(KeyNames::fromKeyString(text).isNull());
    QVERIFY(!KeyNames::codeFromKeyString(text.toLatin1()));
}

VEL_TEST_MAIN(tst_KeyNames)

#include "tst_KeyNames.moc"
