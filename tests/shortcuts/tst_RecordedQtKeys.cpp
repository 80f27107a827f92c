// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Every key that Qt has a name for, with every combination of modifiers, in the key field of the
// dialog: what is recorded is still there after the next start, whatever the language. With
// VEL_TEST_LAYOUTS there are more modifiers and every character is tried.

#include "KeyTakingTestCase.h"
#include "QtMajor.h"

#include <QLibraryInfo>
#include <QMetaEnum>
#include <QTranslator>

namespace {

QVector<Qt::KeyboardModifiers> combinations(bool isFull)
{
    QVector<Qt::KeyboardModifiers> all;
    for (int i = 0; i < (isFull ? 64 : 16); ++i) {
        Qt::KeyboardModifiers modifiers;
        modifiers.setFlag(Qt::ShiftModifier, i & 1);
        modifiers.setFlag(Qt::ControlModifier, i & 2);
        modifiers.setFlag(Qt::AltModifier, i & 4);
        modifiers.setFlag(Qt::MetaModifier, i & 8);
        modifiers.setFlag(Qt::KeypadModifier, i & 16);
        modifiers.setFlag(Qt::GroupSwitchModifier, i & 32);
        all.append(modifiers);
    }
    return all;
}

QVector<int> keys()
{
    QVector<int> all;
    const QMetaEnum names = QMetaEnum::fromType<Qt::Key>();
    for (int i = 0; i < names.keyCount(); ++i) {
        if (!all.contains(names.value(i)))
            all.append(names.value(i));
    }
    return all;
}

} // namespace

class tst_RecordedQtKeys : public KeyTakingTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void losesNoKeyOfQt_data();
    void losesNoKeyOfQt();
    void losesNoKeyOfQtBesideAnother_data();
    void losesNoKeyOfQtBesideAnother();
    void losesNoCharacter();

private:
    void press(int key, Qt::KeyboardModifiers modifiers);
};

void tst_RecordedQtKeys::press(int key, Qt::KeyboardModifiers modifiers)
{
    for (const QEvent::Type type : {QEvent::KeyPress, QEvent::KeyRelease}) {
        QKeyEvent event(type, key, modifiers);
        QCoreApplication::sendEvent(keyWidget(), &event);
    }
}

// Keys are read by their names in the user's language, too: in Hungarian two have one name.
void tst_RecordedQtKeys::losesNoKeyOfQt_data()
{
    QTest::addColumn<QString>("language");
    QTest::newRow("English") << str("en");
    QTest::newRow("German") << str("de");
    QTest::newRow("Hungarian") << str("hu");
}

void tst_RecordedQtKeys::losesNoKeyOfQt()
{
    QFETCH(QString, language);
    QTranslator translator;
    QVERIFY(translator.load(str("qtbase_") + language, VelTest::translationsPath()));
    QCoreApplication::installTranslator(&translator);
    const QVector<int> all = keys();
    for (const Qt::KeyboardModifiers modifiers : combinations(isFull())) {
        for (int key : all) {
            prepare();
            press(key, modifiers);
            QVERIFY(take().count() <= 1);
        }
    }
    compareSaved(str("keys of Qt, ") + language);
    QVERIFY(m_takenPresses > m_presses / 2);
}

void tst_RecordedQtKeys::losesNoKeyOfQtBesideAnother_data()
{
    QTest::addColumn<bool>("isFirst");
    QTest::newRow("before another") << true;
    QTest::newRow("after another") << false;
}

void tst_RecordedQtKeys::losesNoKeyOfQtBesideAnother()
{
    QFETCH(bool, isFirst);
    const QVector<int> all = keys();
    const QVector<Qt::KeyboardModifiers> modifiers = {Qt::NoModifier, Qt::ShiftModifier,
                                                      Qt::ControlModifier | Qt::MetaModifier};
    for (const Qt::KeyboardModifiers held : modifiers) {
        for (int key : all) {
            for (int other : {Qt::Key_Comma, Qt::Key_A}) {
                prepare();
                press(isFirst ? key : other, held);
                press(isFirst ? other : key, held);
                QVERIFY(take().count() <= 2);
            }
        }
    }
    compareSaved(str("pairs of keys"));
    QVERIFY(m_takenPresses > m_presses / 2);
}

// A layout may give any character: its upper case is the key.
void tst_RecordedQtKeys::losesNoCharacter()
{
    const int step = isFull() ? 1 : 31;
    for (int character = 0x20; character <= 0xffff; character += step) {
        for (const Qt::KeyboardModifier modifier : {Qt::NoModifier, Qt::ControlModifier}) {
            prepare();
            press(character, modifier);
            QVERIFY(take().count() <= 1);
        }
    }
    compareSaved(str("characters"));
    QVERIFY(m_takenPresses > m_presses / 2);
}

VEL_TEST_MAIN(tst_RecordedQtKeys)

#include "tst_RecordedQtKeys.moc"
