// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <shortcuts/KeySequences.h>
#include <shortcuts/RecordedKey.h>

#include <QMetaEnum>

class tst_RecordedKey : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void makesNoChordOf_data();
    void makesNoChordOf();
    void makesAChordOf_data();
    void makesAChordOf();
    void makesOnlyChordsThatSurviveSaving();
};

void tst_RecordedKey::makesNoChordOf_data()
{
    QTest::addColumn<int>("key");
    const auto keys = QMetaEnum::fromType<Qt::Key>();
    for (const char *name :
         {"Key_unknown",     "Key_Control",     "Key_Shift",      "Key_Alt",        "Key_Meta",
          "Key_AltGr",       "Key_Super_L",     "Key_Super_R",    "Key_Hyper_L",    "Key_Hyper_R",
          "Key_CapsLock",    "Key_NumLock",     "Key_ScrollLock", "Key_Multi_key",  "Key_Codeinput",
          "Key_Mode_switch", "Key_Kana_Lock",   "Key_Kana_Shift", "Key_Eisu_Shift", "Key_Eisu_toggle",
          "Key_Direction_L", "Key_Direction_R", "Key_Dead_Grave", "Key_Dead_Acute", "Key_Dead_Circumflex"}) {
        bool isKnown = false;
        const int key = keys.keyToValue(name, &isKnown);
        QVERIFY2(isKnown, name);
        QTest::newRow(name) << key;
    }
    QTest::newRow("none") << 0;
    // Reads back as a capital letter.
    QTest::newRow("y with diaeresis") << 0xff;
}

void tst_RecordedKey::makesNoChordOf()
{
    QFETCH(int, key);
    QVERIFY(!RecordedKey::isChord(key, Qt::NoModifier));
    QVERIFY(!RecordedKey::isChord(key, Qt::ControlModifier));
}

void tst_RecordedKey::makesAChordOf_data()
{
    QTest::addColumn<int>("key");
    QTest::newRow("letter") << int(Qt::Key_J);
    QTest::newRow("comma") << int(Qt::Key_Comma);
    QTest::newRow("plus") << int(Qt::Key_Plus);
    QTest::newRow("function key") << int(Qt::Key_F35);
    QTest::newRow("Escape") << int(Qt::Key_Escape);
    QTest::newRow("Tab") << int(Qt::Key_Tab);
    QTest::newRow("umlaut") << int(Qt::Key_Odiaeresis);
    QTest::newRow("Euro") << 0x20ac;
    QTest::newRow("Cyrillic letter") << 0x0424;
    QTest::newRow("key with a name") << int(Qt::Key_VolumeUp);
}

void tst_RecordedKey::makesAChordOf()
{
    QFETCH(int, key);
    QVERIFY(RecordedKey::isChord(key, Qt::NoModifier));
    QVERIFY(RecordedKey::isChord(key, Qt::MetaModifier | Qt::ControlModifier | Qt::AltModifier));
    // Where the key lies on the keyboard does not matter.
    QVERIFY(RecordedKey::isChord(key, Qt::KeypadModifier | Qt::GroupSwitchModifier));
}

void tst_RecordedKey::makesOnlyChordsThatSurviveSaving()
{
    const auto keys = QMetaEnum::fromType<Qt::Key>();
    int chords = 0;
    for (int i = 0; i < keys.keyCount(); ++i) {
        for (int bits = 0; bits < 16; ++bits) {
            const auto modifiers = Qt::KeyboardModifiers(bits << 25);
            if (!RecordedKey::isChord(keys.value(i), modifiers))
                continue;
            ++chords;
            const QKeySequence sequence(keys.value(i) | int(modifiers));
            const QString text = sequence.toString(QKeySequence::PortableText);
            QVERIFY2(QKeySequence(text, QKeySequence::PortableText) == sequence, keys.key(i));
            QVERIFY2(KeySequences::fromSavedText(text) == sequence, keys.key(i));
        }
    }
    QVERIFY2(chords > 300 * 16, qPrintable(QString::number(chords)));
}

VEL_TEST_MAIN(tst_RecordedKey)

#include "tst_RecordedKey.moc"
