// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/EntryTypeRules.h>

using namespace EntryTypeRules;

class tst_EntryTypeRules : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void showsTheRowsOfTheType_data();
    void showsTheRowsOfTheType();
    void choosesAmongAllTypesUnlessToldOtherwise();
    void leavesNoChoiceToAFolderAlone_data();
    void leavesNoChoiceToAFolderAlone();
    void tellsTheTypeOfANewEntryByItsPath_data();
    void tellsTheTypeOfANewEntryByItsPath();
};

void tst_EntryTypeRules::showsTheRowsOfTheType_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<bool>("applications");
    QTest::addColumn<bool>("links");
    QTest::newRow("application") << "Application" << true << false;
    QTest::newRow("link") << "Link" << false << true;
    QTest::newRow("directory") << "Directory" << false << false;
    QTest::newRow("in other letters") << "application" << false << false;
    QTest::newRow("none") << "" << false << false;
}

void tst_EntryTypeRules::showsTheRowsOfTheType()
{
    QFETCH(QString, type);
    QTEST(isShown(ShownFor::Applications, type), "applications");
    QTEST(isShown(ShownFor::Links, type), "links");
    QVERIFY(isShown(ShownFor::All, type));
}

void tst_EntryTypeRules::choosesAmongAllTypesUnlessToldOtherwise()
{
    QCOMPARE(choices({}), QStringList({Application, Link, Directory}));
    const QStringList some{Link, QStringLiteral("X-Own")};
    QCOMPARE(choices(some), some);
}

void tst_EntryTypeRules::leavesNoChoiceToAFolderAlone_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QStringList>("allowed");
    QTest::addColumn<bool>("choice");
    QTest::newRow("directory alone") << "Directory" << QStringList{Directory} << false;
    QTest::newRow("directory or link") << "Directory" << QStringList{Directory, Link} << true;
    QTest::newRow("application alone") << "Application" << QStringList{Application} << true;
    QTest::newRow("link alone") << "Link" << QStringList{Link} << true;
}

void tst_EntryTypeRules::leavesNoChoiceToAFolderAlone()
{
    QFETCH(QString, type);
    QFETCH(QStringList, allowed);
    QTEST(hasChoice(type, allowed), "choice");
}

void tst_EntryTypeRules::tellsTheTypeOfANewEntryByItsPath_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("type");
    QTest::addColumn<QStringList>("allowed");
    QTest::newRow("record file") << "/menu/.directory"
                                 << "Directory" << QStringList{Directory};
    QTest::newRow("entry") << "/menu/a.desktop"
                           << "Application" << QStringList{Application, Link};
    QTest::newRow("other file") << "/menu/a.directory"
                                << "" << QStringList();
    QTest::newRow("entry in other letters") << "/menu/a.DESKTOP"
                                            << "" << QStringList();
}

void tst_EntryTypeRules::tellsTheTypeOfANewEntryByItsPath()
{
    QFETCH(QString, path);
    const NewEntry entry = newEntryAt(path);
    QTEST(entry.type, "type");
    QTEST(entry.allowed, "allowed");
}

VEL_TEST_GUILESS_MAIN(tst_EntryTypeRules)

#include "tst_EntryTypeRules.moc"
