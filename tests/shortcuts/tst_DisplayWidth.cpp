// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <shortcuts/DisplayWidth.h>

class tst_DisplayWidth : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void countsColumns_data();
    void countsColumns();
};

void tst_DisplayWidth::countsColumns_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<int>("width");
    QTest::newRow("empty") << QString() << 0;
    QTest::newRow("ASCII") << QStringLiteral("Save as") << 7;
    QTest::newRow("umlaut") << QStringLiteral(u"Men\u00fc") << 4;
    QTest::newRow("umlaut of two characters") << QStringLiteral(u"Menu\u0308") << 4;
    QTest::newRow("Cyrillic") << QStringLiteral(u"\u0424\u0430\u0439\u043b") << 4;
    QTest::newRow("kanji") << QStringLiteral(u"\u65e5\u672c\u8a9e") << 6;
    QTest::newRow("katakana") << QStringLiteral(u"\u30d5\u30a1\u30a4\u30eb") << 8;
    QTest::newRow("katakana of half width") << QStringLiteral(u"\uff8c\uff67") << 2;
    QTest::newRow("Latin of full width") << QStringLiteral(u"\uff21") << 2;
    QTest::newRow("the blank of kanji") << QStringLiteral(u"\u3000") << 2;
    QTest::newRow("Hangul") << QStringLiteral(u"\uac00") << 2;
    QTest::newRow("emoji") << QStringLiteral(u"\U0001f642") << 2;
    QTest::newRow("kanji beyond 16 bits") << QStringLiteral(u"\U00020000") << 2;
    QTest::newRow("first and last of a range") << QStringLiteral(u"\u10ff\u1100\u115f\u1160") << 6;
    QTest::newRow("zero width joiner") << QStringLiteral(u"a\u200db") << 2;
    QTest::newRow("soft hyphen") << QStringLiteral(u"\u00ad") << 1;
}

void tst_DisplayWidth::countsColumns()
{
    QFETCH(QString, text);
    QTEST(DisplayWidth::of(text), "width");
}

VEL_TEST_GUILESS_MAIN(tst_DisplayWidth)

#include "tst_DisplayWidth.moc"
