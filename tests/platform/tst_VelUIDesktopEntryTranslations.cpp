// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RecordTestCase.h"

/// A record's values in languages that are not the user's, and the bytes that it would save.
class tst_VelUIDesktopEntryTranslations : public RecordTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void knowsTheLanguagesOfAKey();
    void tellsWhichLanguageIsInForce_data();
    void tellsWhichLanguageIsInForce();
    void readsExactlyTheLanguageAskedFor();
    void writesOnlyTheLineOfOneLanguage_data();
    void writesOnlyTheLineOfOneLanguage();
    void ignoresALanguageThatCannotStandInAKey_data();
    void ignoresALanguageThatCannotStandInAKey();
    void givesTheBytesThatASaveLeaves();

private:
    const QByteArray m_bytes = Header
        + "Type=Application\nName=a\nName[fr]=f\nName[de]=d\nName[pt_BR]=p\nName[fr]=g\n"
          "Keywords=k;\nKeywords[fr]=l;m;\nComment[de_DE]=c\nExec=e\n\n[X-Other]\nName[ja]=j\n";
    VelUIDesktopEntry entry() { return VelUIDesktopEntry(write(QStringLiteral("a.desktop"), m_bytes)); }
};

void tst_VelUIDesktopEntryTranslations::knowsTheLanguagesOfAKey()
{
    VelUIDesktopEntry record = entry();
    const QString name = QStringLiteral("Name");
    const QStringList inFile{QStringLiteral("fr"), QStringLiteral("de"), QStringLiteral("pt_BR")};
    QCOMPARE(record.getLanguages(name), inFile);
    QCOMPARE(record.getLanguages(QStringLiteral("Exec")), QStringList());
    record.setTranslation(name, QStringLiteral("ja"), QStringLiteral("x"));
    QCOMPARE(record.getLanguages(name), inFile + QStringList{QStringLiteral("ja")});
    record.setTranslation(name, QStringLiteral("fr"), QString());
    record.setTranslation(name, QStringLiteral("ja"), QString());
    QCOMPARE(record.getLanguages(name), inFile.mid(1));
}

void tst_VelUIDesktopEntryTranslations::tellsWhichLanguageIsInForce_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("language");

    const QString name = QStringLiteral("Name");
    QTest::newRow("itself") << QByteArray("fr_FR.UTF-8") << name << QStringLiteral("fr");
    QTest::newRow("the language of another country") << QByteArray("de_AT") << name << QStringLiteral("de");
    QTest::newRow("the country") << QByteArray("de_DE") << QStringLiteral("Comment")
                                 << QStringLiteral("de_DE");
    QTest::newRow("none of the country") << QByteArray("pt_PT") << name << QString();
    QTest::newRow("none") << QByteArray("ja") << name << QString();
}

void tst_VelUIDesktopEntryTranslations::tellsWhichLanguageIsInForce()
{
    QFETCH(QByteArray, locale);
    QFETCH(QString, key);
    QFETCH(QString, language);
    qputenv("LANG", locale);
    QCOMPARE(entry().getLanguageInForce(key), language);
}

void tst_VelUIDesktopEntryTranslations::readsExactlyTheLanguageAskedFor()
{
    const VelUIDesktopEntry record = entry();
    const QString name = QStringLiteral("Name");
    QCOMPARE(record.getTranslation(name, QStringLiteral("fr")), QStringLiteral("g")); // the later line
    QCOMPARE(record.getTranslation(name, QStringLiteral("pt")), QString());
    QCOMPARE(record.getTranslation(name, QStringLiteral("ja")), QString());
    QCOMPARE(record.getTranslatedList(QStringLiteral("Keywords"), QStringLiteral("fr")),
             QStringList({QStringLiteral("l"), QStringLiteral("m")}));
}

void tst_VelUIDesktopEntryTranslations::writesOnlyTheLineOfOneLanguage_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("language");
    QTest::addColumn<QString>("value");
    QTest::addColumn<QByteArray>("before");
    QTest::addColumn<QByteArray>("after");

    const QString name = QStringLiteral("Name");
    QTest::newRow("another text") << name << QStringLiteral("pt_BR") << QStringLiteral("q")
                                  << QByteArray("Name[pt_BR]=p") << QByteArray("Name[pt_BR]=q");
    QTest::newRow("the same text") << name << QStringLiteral("pt_BR") << QStringLiteral("p") << QByteArray()
                                   << QByteArray();
    QTest::newRow("a new language") << name << QStringLiteral("sr@latin") << QStringLiteral("s")
                                    << QByteArray("Name[fr]=g\n")
                                    << QByteArray("Name[fr]=g\nName[sr@latin]=s\n");
    QTest::newRow("none any more") << name << QStringLiteral("de") << QString() << QByteArray("Name[de]=d\n")
                                   << QByteArray();
    QTest::newRow("an umlaut") << QStringLiteral("Comment") << QStringLiteral("de") << text("\xC3\xA4")
                               << QByteArray("Comment[de_DE]=c\n")
                               << QByteArray("Comment[de_DE]=c\nComment[de]=\xC3\xA4\n");
}

void tst_VelUIDesktopEntryTranslations::writesOnlyTheLineOfOneLanguage()
{
    QFETCH(QString, key);
    QFETCH(QString, language);
    QFETCH(QString, value);
    QFETCH(QByteArray, before);
    QFETCH(QByteArray, after);
    QByteArray expected = m_bytes;
    if (!before.isEmpty())
        expected.replace(before, after);
    QCOMPARE(
        changed(m_bytes, [&](VelUIDesktopEntry &record) { record.setTranslation(key, language, value); }),
        expected);
}

void tst_VelUIDesktopEntryTranslations::ignoresALanguageThatCannotStandInAKey_data()
{
    QTest::addColumn<QString>("language");
    QTest::newRow("none") << QString();
    QTest::newRow("the end of the key") << QStringLiteral("de]=x");
    QTest::newRow("the end of the line") << QStringLiteral("de\nExec");
    QTest::newRow("a bracket") << QStringLiteral("[de");
}

void tst_VelUIDesktopEntryTranslations::ignoresALanguageThatCannotStandInAKey()
{
    QFETCH(QString, language);
    QCOMPARE(changed(m_bytes,
                     [&](VelUIDesktopEntry &record) {
                         record.setTranslation(QStringLiteral("Name"), language, QStringLiteral("x"));
                         record.setTranslatedList(QStringLiteral("Keywords"), language,
                                                  {QStringLiteral("x")});
                     }),
             m_bytes);
}

void tst_VelUIDesktopEntryTranslations::givesTheBytesThatASaveLeaves()
{
    VelUIDesktopEntry record = entry();
    QCOMPARE(record.contents(), m_bytes);
    record.setTranslatedList(QStringLiteral("Keywords"), QStringLiteral("fr"), {QStringLiteral("n")});
    record.setExec(QStringLiteral("other"));
    const QByteArray contents = record.contents();
    QCOMPARE(contents, QByteArray(m_bytes).replace("l;m;", "n;").replace("Exec=e", "Exec=other"));
    QCOMPARE(read(path(QStringLiteral("a.desktop"))), m_bytes);
    QVERIFY(record.save());
    QCOMPARE(read(path(QStringLiteral("a.desktop"))), contents);
}

VEL_TEST_MAIN(tst_VelUIDesktopEntryTranslations)

#include "tst_VelUIDesktopEntryTranslations.moc"
