// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <TestCase.h>

#include <frame/EntryPath.h>

class tst_EntryPath : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsEntriesByTheEndOfTheirName_data();
    void tellsEntriesByTheEndOfTheirName();
    void namesEntries();
    void tellsRecordFilesByTheirWholeName_data();
    void tellsRecordFilesByTheirWholeName();
    void leadsFromAFolderToItsRecordFileAndBack();
    void describesAnyOtherPathByItself();
};

void tst_EntryPath::tellsEntriesByTheEndOfTheirName_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("isEntry");
    QTest::newRow("empty") << QString() << false;
    QTest::newRow("other suffix") << QStringLiteral("/menu/a.desktop~") << false;
    QTest::newRow("other case") << QStringLiteral("/menu/a.Desktop") << false;
    QTest::newRow("suffix alone") << QStringLiteral("/menu/.desktop") << true;
    QTest::newRow("entry") << QStringLiteral("/menu/a.desktop") << true;
}

void tst_EntryPath::tellsEntriesByTheEndOfTheirName()
{
    QFETCH(QString, path);
    QTEST(EntryPath::isEntry(path), "isEntry");
}

void tst_EntryPath::namesEntries()
{
    QCOMPARE(EntryPath::entryNamed(QStringLiteral("editor")), QStringLiteral("editor.desktop"));
    QVERIFY(EntryPath::isEntry(EntryPath::entryNamed(QString())));
}

void tst_EntryPath::tellsRecordFilesByTheirWholeName_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("isRecordFile");
    QTest::newRow("empty") << QString() << false;
    QTest::newRow("end of another name") << QStringLiteral("/menu/games.directory") << false;
    QTest::newRow("folder of that name") << QStringLiteral("/menu/.directory/a") << false;
    QTest::newRow("record file") << QStringLiteral("/menu/.directory") << true;
}

void tst_EntryPath::tellsRecordFilesByTheirWholeName()
{
    QFETCH(QString, path);
    QTEST(EntryPath::isRecordFile(path), "isRecordFile");
}

void tst_EntryPath::leadsFromAFolderToItsRecordFileAndBack()
{
    const QString folder = QStringLiteral("/menu/games");
    const QString recordFile = EntryPath::recordFileOf(folder);
    QVERIFY(EntryPath::isRecordFile(recordFile));
    QCOMPARE(EntryPath::describedBy(recordFile), folder);
}

void tst_EntryPath::describesAnyOtherPathByItself()
{
    const QString entry = QStringLiteral("/menu/games.directory");
    QCOMPARE(EntryPath::describedBy(entry), entry);
}

VEL_TEST_MAIN(tst_EntryPath)
#include "tst_EntryPath.moc"
