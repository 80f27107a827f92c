// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"
#include <menuedit/EntryFields.h>

#include <QDir>

/// What the items of a menu can be found by.
class tst_EntryFields : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hasEveryField_data();
    void hasEveryField();
    void hasTheNamesOfAFolder();
    void hasTheNameOfAnyOtherFile();
    void tellsWhatTheMenuLeavesOut();
    void isReadAgainOnceTheFileChanged();
};

void tst_EntryFields::hasEveryField_data()
{
    QTest::addColumn<QString>("word");
    for (const char *word : {"one", "file", "eins", "generic", "gattung", "comment", "kommentar",
                             "command --flag", "key1", "key2", "wort", "file.desk"})
        QTest::newRow(word) << QString::fromLatin1(word);
}

void tst_EntryFields::hasEveryField()
{
    QFETCH(QString, word);
    qputenv("LC_ALL", "de_DE.UTF-8");
    const QString file =
        write(QStringLiteral("File.desktop"),
              "[Desktop Entry]\nType=Application\nName=One\nName[de]=Eins\nGenericName=Generic\n"
              "GenericName[de]=Gattung\nComment=Comment\nComment[de]=Kommentar\n"
              "Exec=command --flag\nKeywords=Key1;Key2;\nKeywords[de]=Wort;\n");
    EntryFields fields;
    const EntryFields::Fields all = fields.of(file, false);
    qunsetenv("LC_ALL");
    QVERIFY2(EntryFields::match(all, {word}), qPrintable(all.text));
    QVERIFY(!EntryFields::match(all, {word, QStringLiteral("nowhere")}));
    QVERIFY(!EntryFields::match(all, {QStringLiteral("desktop")}));
}

void tst_EntryFields::hasTheNamesOfAFolder()
{
    write(QStringLiteral("Folder/.directory"), "[Desktop Entry]\nType=Directory\nName=Spiele\n");
    QVERIFY(QDir().mkpath(path(QStringLiteral("Plain"))));
    EntryFields fields;
    QVERIFY(fields.of(path(QStringLiteral("Folder")), true).text.contains(QLatin1String("spiele")));
    QVERIFY(fields.of(path(QStringLiteral("Folder")), true).text.contains(QLatin1String("folder")));
    QCOMPARE(fields.of(path(QStringLiteral("Plain")), true).text, QStringLiteral("plain"));
}

void tst_EntryFields::hasTheNameOfAnyOtherFile()
{
    EntryFields fields;
    QCOMPARE(fields.of(write(QStringLiteral("Notes.txt"), "Name=x"), false).text,
             QStringLiteral("notes.txt"));
    QVERIFY(fields.of(path(QStringLiteral("gone.desktop")), false).text.contains(QLatin1String("gone")));
}

void tst_EntryFields::tellsWhatTheMenuLeavesOut()
{
    EntryFields fields;
    const QString hidden = write(QStringLiteral("h.desktop"),
                                 "[Desktop Entry]\nType=Application\nName=H\nExec=true\nHidden=true\n");
    const QString shown = write(QStringLiteral("s.desktop"),
                                "[Desktop Entry]\nType=Application\nName=S\nExec=true\nNoDisplay=true\n");
    QVERIFY(fields.of(hidden, false).isHidden);
    QVERIFY(!fields.of(shown, false).isHidden);
}

void tst_EntryFields::isReadAgainOnceTheFileChanged()
{
    const QString file = write(QStringLiteral("a.desktop"), "[Desktop Entry]\nName=One\n");
    EntryFields fields;
    QTest::qWait(100);
    QVERIFY(fields.of(file, false).text.contains(QLatin1String("one")));
    QVERIFY(fields.of(file, false).text.contains(QLatin1String("one")));
    write(QStringLiteral("a.desktop"), "[Desktop Entry]\nName=Two\n");
    QVERIFY(fields.of(file, false).text.contains(QLatin1String("two")));
    write(QStringLiteral("a.desktop"), "[Desktop Entry]\nName=Six\n");
    QVERIFY(fields.of(file, false).text.contains(QLatin1String("six")));
}

VEL_TEST_GUILESS_MAIN(tst_EntryFields)
#include "tst_EntryFields.moc"
