// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "QtMajor.h"
#include "TestCase.h"

#include <shortcuts/ShortcutFilter.h>

class tst_ShortcutFilter : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void foldsTexts_data();
    void foldsTexts();
    void findsAllWordsInAnyOrder_data();
    void findsAllWordsInAnyOrder();
    void findsKeysAndWhatTheyBegin_data();
    void findsKeysAndWhatTheyBegin();
    void findsAnyOfSeveralKeys();
    void findsChangedShortcuts();
    void wantsAllThatItIsTold();
    void asksForNothingAtFirst();
};

void tst_ShortcutFilter::foldsTexts_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("folded");
    QTest::newRow("nothing") << QString() << QString();
    QTest::newRow("a lone surrogate") << QString(QChar(0xd800)) << QString(QChar(0xd800));
    QTest::newRow("an accent alone") << QString(QChar(0x0301)) << QString();
    QTest::newRow("ASCII") << QStringLiteral("Ctrl+S") << QStringLiteral("ctrl+s");
    QTest::newRow("accents") << QStringLiteral("Ändern Façade Crème")
                             << QStringLiteral("andern facade creme");
    QTest::newRow("accents of their own") << QStringLiteral("A\u0308ndern") << QStringLiteral("andern");
    QTest::newRow("Cyrillic") << QStringLiteral("Файл Й") << QStringLiteral("фаил и");
    QTest::newRow("Greek") << QStringLiteral("Αρχείο") << QStringLiteral("αρχειο");
    QTest::newRow("Turkish") << QStringLiteral("İptal") << QStringLiteral("iptal");
    QTest::newRow("wide letters") << QStringLiteral("ＡＢ") << QStringLiteral("ab");
}

void tst_ShortcutFilter::foldsTexts()
{
    QFETCH(QString, text);
    QTEST(ShortcutFilter::folded(text), "folded");
}

void tst_ShortcutFilter::findsAllWordsInAnyOrder_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("found");
    QTest::newRow("blanks") << QStringLiteral(" \t ") << true;
    QTest::newRow("a word") << QStringLiteral("save") << true;
    QTest::newRow("a part of a word") << QStringLiteral("av") << true;
    QTest::newRow("the other case") << QStringLiteral("SAVE") << true;
    QTest::newRow("another order") << QStringLiteral("as file save") << true;
    QTest::newRow("a key") << QStringLiteral("ctrl+shift+s") << true;
    QTest::newRow("an accent too many") << QStringLiteral("sävé") << true;
    QTest::newRow("one word that is not there") << QStringLiteral("save none") << false;
    QTest::newRow("words run together") << QStringLiteral("saveas") << false;
    QTest::newRow("a pattern") << QStringLiteral("s.*e") << false;
}

void tst_ShortcutFilter::findsAllWordsInAnyOrder()
{
    QFETCH(QString, text);
    ShortcutFilter filter;
    filter.setText(text);
    const ShortcutFilter::Row row = {QStringLiteral("save as\nfile\nctrl+shift+s\n"), {}, false};
    QTEST(filter.matches(row), "found");
}

void tst_ShortcutFilter::findsKeysAndWhatTheyBegin_data()
{
    QTest::addColumn<QKeySequence>("pressed");
    QTest::addColumn<QKeySequence>("key");
    QTest::addColumn<bool>("found");
    const int k = VelTest::keyNumber(Qt::CTRL | Qt::Key_K);
    const int c = VelTest::keyNumber(Qt::CTRL | Qt::Key_C);
    QTest::newRow("no key") << QKeySequence(k) << QKeySequence() << false;
    QTest::newRow("the same") << QKeySequence(k) << QKeySequence(k) << true;
    QTest::newRow("another one") << QKeySequence(k) << QKeySequence(c) << false;
    QTest::newRow("the beginning") << QKeySequence(k) << QKeySequence(k, c) << true;
    QTest::newRow("the end") << QKeySequence(c) << QKeySequence(k, c) << false;
    QTest::newRow("a longer one") << QKeySequence(k, c) << QKeySequence(k) << false;
    QTest::newRow("without the modifier") << QKeySequence(Qt::Key_K) << QKeySequence(k) << false;
}

void tst_ShortcutFilter::findsKeysAndWhatTheyBegin()
{
    QFETCH(QKeySequence, pressed);
    QFETCH(QKeySequence, key);
    ShortcutFilter filter;
    filter.setKey(pressed);
    QVERIFY(filter.isActive());
    QTEST(filter.matches({QString(), {key}, false}), "found");
}

void tst_ShortcutFilter::findsAnyOfSeveralKeys()
{
    ShortcutFilter filter;
    filter.setKey(QKeySequence(Qt::Key_F2));
    const QKeySequence f1(Qt::Key_F1);
    QVERIFY(filter.matches({QString(), {f1, QKeySequence(Qt::Key_F2)}, false}));
    QVERIFY(!filter.matches({QString(), {f1}, false}));
    QVERIFY(!filter.matches({QString(), {}, false}));
}

void tst_ShortcutFilter::findsChangedShortcuts()
{
    ShortcutFilter filter;
    filter.setChangedOnly(true);
    QVERIFY(filter.matches({QString(), {}, true}));
    QVERIFY(!filter.matches({QString(), {}, false}));
}

void tst_ShortcutFilter::wantsAllThatItIsTold()
{
    ShortcutFilter filter;
    filter.setText(QStringLiteral("save"));
    filter.setKey(QKeySequence(Qt::Key_F2));
    filter.setChangedOnly(true);
    const QString text = QStringLiteral("save");
    const QVector<QKeySequence> keys{QKeySequence(Qt::Key_F2)};
    QVERIFY(filter.matches({text, keys, true}));
    QVERIFY(!filter.matches({text, keys, false}));
    QVERIFY(!filter.matches({text, {}, true}));
    QVERIFY(!filter.matches({QString(), keys, true}));
}

void tst_ShortcutFilter::asksForNothingAtFirst()
{
    ShortcutFilter filter;
    QVERIFY(!filter.isActive());
    QVERIFY(filter.matches({}));
    filter.setText(QStringLiteral("  "));
    QVERIFY(!filter.isActive());
}

VEL_TEST_GUILESS_MAIN(tst_ShortcutFilter)

#include "tst_ShortcutFilter.moc"
