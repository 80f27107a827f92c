// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velcore/language.h>

class LanguageTest : public TestCase
{
    Q_OBJECT

private:
    static QString code() { return QString::fromStdString(velLanguageCode()); }

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        for (const char *name : {"LC_ALL", "LC_MESSAGES", "LANG", "LANGUAGE"})
            qunsetenv(name);
    }

    void isEnglishWhenNothingIsSet() { QCOMPARE(code(), QStringLiteral("en")); }

    void theFirstThatIsSetAndNotEmptyCounts()
    {
        qputenv("LANG", "de_DE.UTF-8");
        QCOMPARE(code(), QStringLiteral("de"));
        qputenv("LC_MESSAGES", "fr_FR.UTF-8");
        QCOMPARE(code(), QStringLiteral("fr"));
        qputenv("LC_ALL", "it_IT.UTF-8");
        QCOMPARE(code(), QStringLiteral("it"));
        qputenv("LC_ALL", "");
        QCOMPARE(code(), QStringLiteral("fr"));
        qputenv("LC_MESSAGES", "");
        QCOMPARE(code(), QStringLiteral("de"));
        // A "C" that is set comes before what stands behind it.
        qputenv("LC_ALL", "C");
        QCOMPARE(code(), QStringLiteral("en"));
    }

    void otherVariablesHaveNoSay()
    {
        qputenv("LANG", "de_DE.UTF-8");
        qputenv("LANGUAGE", "fr:es");
        qputenv("LC_CTYPE", "ru_RU.UTF-8");
        QCOMPARE(code(), QStringLiteral("de"));
        qunsetenv("LC_CTYPE");
    }

    void reducesTheLocaleToTheCustomaryCode_data()
    {
        QTest::addColumn<QByteArray>("locale");
        QTest::addColumn<QString>("expected");
        const QPair<const char *, const char *> rows[] = {
            {"/usr/share/locale", "en"},
            {"_DE.UTF-8", "en"},
            {"C", "en"},
            {"POSIX", "en"},
            {"C.UTF-8", "en"},
            {"POSIX.UTF-8", "en"},
            {"en_US.UTF-8", "en"},
            {"en_GB", "en_GB"},
            {"en_GB.ISO-8859-15", "en_GB"},
            {"de", "de"},
            {"de_AT", "de"},
            {"de_DE.UTF-8", "de"},
            {"de_DE@euro", "de"},
            {"de_DE.ISO-8859-15@euro", "de"},
            {"pt_PT.UTF-8", "pt"},
            {"pt_BR.UTF-8", "pt_BR"},
            {"zh_CN.GB18030", "zh_CN"},
            {"zh_TW.UTF-8", "zh_TW"},
            {"zh_HK", "zh_HK"},
            {"sr_RS.UTF-8", "sr"},
            {"sr_RS.UTF-8@latin", "sr@latin"},
            {"sr@latin", "sr@latin"},
            {"sr_RS@latin", "sr@latin"},
            {"ca_ES.UTF-8@valencia", "ca@valencia"},
            {"nds_DE.UTF-8", "nds"},
        };
        for (const auto &row : rows)
            QTest::newRow(row.first) << QByteArray(row.first) << QString::fromLatin1(row.second);
    }

    void reducesTheLocaleToTheCustomaryCode()
    {
        QFETCH(QByteArray, locale);
        QFETCH(QString, expected);
        qputenv("LANG", locale);
        QCOMPARE(code(), expected);
    }
};

VEL_TEST_GUILESS_MAIN(LanguageTest)
#include "tst_language.moc"
