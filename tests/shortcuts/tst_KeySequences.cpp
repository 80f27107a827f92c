// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Keys as text, and what of that the model saves.

#include "KeyTestObject.h"
#include "QtMajor.h"
#include "ShortcutsModel.h"
#include "TestCase.h"

#include <shortcuts/KeySequences.h>

#include <QAction>
#include <QLibraryInfo>
#include <QSettings>
#include <QTranslator>

class tst_KeySequences : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void knowsWhatSurvivesSaving_data();
    void knowsWhatSurvivesSaving();
    void knowsWhatSurvivesSavingInTheUsersLanguage();
    void leavesTheSavedValueWhenAKeyWouldNotReadBack_data();
    void leavesTheSavedValueWhenAKeyWouldNotReadBack();
};

void tst_KeySequences::knowsWhatSurvivesSaving_data()
{
    QTest::addColumn<QKeySequence>("sequence");
    QTest::addColumn<bool>("survives");
    QTest::newRow("empty") << QKeySequence() << true;
    QTest::newRow("one") << QKeySequence(Qt::META | Qt::Key_J) << true;
    QTest::newRow("four") << VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::Key_F1, Qt::Key_Plus,
                                                  Qt::Key_Odiaeresis)
                          << true;
    QTest::newRow("Super") << QKeySequence(Qt::Key_Super_L) << false;
    QTest::newRow("Super and a letter")
        << VelTest::keySequence(Qt::Key_Super_L, Qt::META | Qt::Key_J) << false;
    QTest::newRow("Caps Lock in the middle")
        << VelTest::keySequence(Qt::Key_A, Qt::Key_unknown, Qt::CTRL | Qt::Key_A) << false;
    QTest::newRow("y with diaeresis") << QKeySequence(Qt::CTRL | 0xff) << false;
    QTest::newRow("half a character") << QKeySequence(0xd83d) << false;
    QTest::newRow("another level") << QKeySequence(int(Qt::GroupSwitchModifier) | Qt::Key_A) << false;
}

void tst_KeySequences::knowsWhatSurvivesSaving()
{
    QFETCH(QKeySequence, sequence);
    QFETCH(bool, survives);
    QCOMPARE(KeySequences::survivesSaving(sequence), survives);
    const QString text = sequence.toString(QKeySequence::PortableText);
    QCOMPARE(KeySequences::fromSavedText(text) == sequence, survives);
}

// Saved texts are read in it: in Hungarian, Enter is the name of Return.
void tst_KeySequences::knowsWhatSurvivesSavingInTheUsersLanguage()
{
    QVERIFY(KeySequences::survivesSaving(QKeySequence(Qt::CTRL | Qt::Key_Enter)));
    QTranslator translator;
    QVERIFY(translator.load(QStringLiteral("qtbase_hu"), VelTest::translationsPath()));
    QCoreApplication::installTranslator(&translator);
    QVERIFY(!KeySequences::survivesSaving(QKeySequence(Qt::CTRL | Qt::Key_Enter)));
    QVERIFY(KeySequences::survivesSaving(QKeySequence(Qt::CTRL | Qt::Key_Return)));
}

void tst_KeySequences::leavesTheSavedValueWhenAKeyWouldNotReadBack_data()
{
    QTest::addColumn<QKeySequence>("key");
    QTest::newRow("Super") << QKeySequence(Qt::Key_Super_L);
    QTest::newRow("Super and a letter") << VelTest::keySequence(Qt::Key_Super_L, Qt::META | Qt::Key_J);
    QTest::newRow("unknown") << QKeySequence(Qt::Key_unknown);
}

void tst_KeySequences::leavesTheSavedValueWhenAKeyWouldNotReadBack()
{
    QFETCH(QKeySequence, key);
    QSettings settings(path(QStringLiteral("keys.ini")), QSettings::IniFormat);
    settings.setValue(QStringLiteral("open"), QStringLiteral("Ctrl+O"));
    ShortcutsModel model(&settings, QString());
    model.registerShortcutObject(new KeyTestObject(QStringLiteral("open"), QString(), key));
    model.registerShortcutObject(
        new KeyTestObject(QStringLiteral("save"), QString(), QKeySequence(Qt::META | Qt::Key_S)));
    model.saveKeys(&settings, QString());
    QCOMPARE(settings.value(QStringLiteral("open")).toString(), QStringLiteral("Ctrl+O"));
    QCOMPARE(settings.value(QStringLiteral("save")).toString(), QStringLiteral("Meta+S"));

    // What is registered next under the name gets the key that was saved.
    QAction action;
    model.registerAction(QStringLiteral("open"), &action, QStringLiteral("Other"));
    QCOMPARE(action.shortcut(), QKeySequence(Qt::CTRL | Qt::Key_O));
}

VEL_TEST_MAIN(tst_KeySequences)

#include "tst_KeySequences.moc"
