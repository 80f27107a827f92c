// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/LanguageCode.h>
#include <desktopentry/LanguageNote.h>

/// Which codes are languages, whom they serve, and what is told of that.
class tst_LanguageCode : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void acceptsWellFormedCodesOnly_data();
    void acceptsWellFormedCodesOnly();
    void servesTheMoreExactFirst_data();
    void servesTheMoreExactFirst();
    void namesALanguageAsItsSpeakersDo_data();
    void namesALanguageAsItsSpeakersDo();
    void knowsManyLanguagesOnceEach();
    void tellsWhoSeesWhat_data();
    void tellsWhoSeesWhat();
};

void tst_LanguageCode::acceptsWellFormedCodesOnly_data()
{
    QTest::addColumn<QString>("code");
    QTest::addColumn<bool>("valid");

    for (const char *code : {"de", "nds", "pt_BR", "es_419", "sr@latin", "ca_ES@valencia", "tokipona"})
        QTest::newRow(code) << QString::fromLatin1(code) << true;
    for (const char *code : {"", "d", "DE", "de_", "de_at", "de-AT", "de_AT.UTF-8", "de]", "de=", "de@",
                             " de", "de\n", "C", "de AT"})
        QTest::newRow(QByteArray("not ").append(code).constData()) << QString::fromLatin1(code) << false;
}

void tst_LanguageCode::acceptsWellFormedCodesOnly()
{
    QFETCH(QString, code);
    QFETCH(bool, valid);
    QCOMPARE(LanguageCode::isValid(code), valid);
}

void tst_LanguageCode::servesTheMoreExactFirst_data()
{
    QTest::addColumn<QString>("code");
    QTest::addColumn<QString>("existing");
    QTest::addColumn<QString>("inForce");

    QTest::newRow("the country") << "de_AT"
                                 << "de de_AT"
                                 << "de_AT";
    QTest::newRow("the language") << "de_AT"
                                  << "de de_DE"
                                  << "de";
    QTest::newRow("the country before the script") << "sr_RS@latin"
                                                   << "sr sr@latin sr_RS"
                                                   << "sr_RS";
    QTest::newRow("the script before the language") << "sr_RS@latin"
                                                    << "sr sr@latin"
                                                    << "sr@latin";
    QTest::newRow("not another country") << "pt"
                                         << "pt_BR"
                                         << "";
    QTest::newRow("not another script") << "sr"
                                        << "sr@latin"
                                        << "";
    QTest::newRow("nothing") << "ja"
                             << ""
                             << "";
}

void tst_LanguageCode::servesTheMoreExactFirst()
{
    QFETCH(QString, code);
    QFETCH(QString, existing);
    QFETCH(QString, inForce);
    QCOMPARE(LanguageCode::inForce(code, existing.split(QLatin1Char(' '))), inForce);
}

void tst_LanguageCode::namesALanguageAsItsSpeakersDo_data()
{
    QTest::addColumn<QString>("code");
    QTest::addColumn<QString>("name");

    QTest::newRow("German") << "de"
                            << "Deutsch";
    QTest::newRow("French") << "fr"
                            << QString::fromUtf8("Fran\xC3\xA7"
                                                 "ais");
    QTest::newRow("Japanese") << "ja" << QString::fromUtf8("\xE6\x97\xA5\xE6\x9C\xAC\xE8\xAA\x9E");
    QTest::newRow("unknown") << "qqq"
                             << "";
    QTest::newRow("none") << ""
                          << "";
}

void tst_LanguageCode::namesALanguageAsItsSpeakersDo()
{
    QFETCH(QString, code);
    QFETCH(QString, name);
    QCOMPARE(LanguageCode::nativeName(code), name);
}

void tst_LanguageCode::knowsManyLanguagesOnceEach()
{
    QStringList known = LanguageCode::known();
    QVERIFY(known.size() > 50);
    QVERIFY(known.contains(QStringLiteral("ja")));
    QCOMPARE(known.removeDuplicates(), 0);
    for (const QString &code : qAsConst(known))
        QVERIFY2(LanguageCode::isValid(code), qPrintable(code));
}

void tst_LanguageCode::tellsWhoSeesWhat_data()
{
    QTest::addColumn<QString>("language");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("comment");
    QTest::addColumn<QString>("note");

    QTest::newRow("all of it") << "de"
                               << "de fr"
                               << "de"
                               << "Users of de see these texts.";
    QTest::newRow("a part")
        << "de"
        << "de fr"
        << "fr"
        << "Users of de see these texts, and those without a language where one is missing.";
    QTest::newRow("a part and the rest of another")
        << "de_AT"
        << "de_AT"
        << "de"
        << "Users of de_AT see these texts, and those of de where one is missing.";
    QTest::newRow("another") << "de_AT"
                             << "de"
                             << "de fr"
                             << "Users of de_AT see the texts of de.";
    QTest::newRow("none") << "ja"
                          << "de"
                          << ""
                          << "Users of ja see the texts without a language.";
    QTest::newRow("a country has its own") << "pt"
                                           << "pt pt_BR"
                                           << "pt"
                                           << "Users of pt see these texts. Texts of their own have: pt_BR.";
}

void tst_LanguageCode::tellsWhoSeesWhat()
{
    QFETCH(QString, language);
    QFETCH(QString, name);
    QFETCH(QString, comment);
    QFETCH(QString, note);
    QCOMPARE(LanguageNote::text(language,
                                {{QStringLiteral("Name"), name.split(QLatin1Char(' '))},
                                 {QStringLiteral("Comment"), comment.split(QLatin1Char(' '))}}),
             note);
}

VEL_TEST_MAIN(tst_LanguageCode)

#include "tst_LanguageCode.moc"
