// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"
#include <frame/SearchText.h>

/// What is the same to somebody who looks for words.
class tst_SearchText : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void foldsCaseAndAccents_data();
    void foldsCaseAndAccents();
    void takesTextApartIntoWords();
};

void tst_SearchText::foldsCaseAndAccents_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("folded");
    QTest::newRow("nothing") << QString() << QString();
    QTest::newRow("case") << QStringLiteral("FireFox") << QStringLiteral("firefox");
    QTest::newRow("accents") << QStringLiteral("Éditeur à côté") << QStringLiteral("editeur a cote");
    QTest::newRow("accents apart") << QStringLiteral("E\u0301diteur") << QStringLiteral("editeur");
    QTest::newRow("sharp s") << QStringLiteral("Straße") << QStringLiteral("strasse");
    QTest::newRow("umlaut") << QStringLiteral("Bücher") << QStringLiteral("bucher");
    QTest::newRow("strokes") << QStringLiteral("Łódź Øre") << QStringLiteral("lodz ore");
    QTest::newRow("Turkish") << QStringLiteral("İstanbul ılık") << QStringLiteral("istanbul ilik");
    QTest::newRow("Greek") << QStringLiteral("Άλφα ΣΟΦΟΣ") << QStringLiteral("αλφα σοφοσ");
    QTest::newRow("Cyrillic") << QStringLiteral("Ёлка") << QStringLiteral("елка");
    QTest::newRow("wide") << QStringLiteral("ＡＢＣ") << QStringLiteral("abc");
    QTest::newRow("Japanese") << QStringLiteral("日本語") << QStringLiteral("日本語");
}

void tst_SearchText::foldsCaseAndAccents()
{
    QFETCH(QString, text);
    QFETCH(QString, folded);
    QCOMPARE(SearchText::folded(text), folded);
}

void tst_SearchText::takesTextApartIntoWords()
{
    QCOMPARE(SearchText::words(QStringLiteral(" \t")), QStringList());
    QCOMPARE(SearchText::words(QStringLiteral("  web É  Browser web")),
             (QStringList{QStringLiteral("browser"), QStringLiteral("web"), QStringLiteral("e")}));
}

VEL_TEST_GUILESS_MAIN(tst_SearchText)
#include "tst_SearchText.moc"
