// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <MenuOrder.h>
#include <MenuSources.h>

/// What is remembered of a start menu, as text, and how the order of a folder is changed.
class tst_MenuSources : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void refusesDamagedText_data();
    void refusesDamagedText();
    void refusesPlacesOutsideOfTheMenu_data();
    void refusesPlacesOutsideOfTheMenu();
    void readsWhatItWrites();
    void isPlainText();
    void insertsBeforeWhatBelongsBehind_data();
    void insertsBeforeWhatBelongsBehind();
    void leavesOutTheOrderAlone();

private:
    static MenuSources sample();
};

MenuSources tst_MenuSources::sample()
{
    MenuSources sources;
    sources.environment = "0a";
    sources.stamps = {{"/a folder%", "1.2", "ab"}, {"/none", "", ""}, {"-", "3", ""}};
    sources.folders = {{"Game", "0b"}};
    sources.entries["a.desktop"] = {{"Game/a.desktop", "0c"}, {}, false};
    sources.entries["-"] = {{"Game/-", "0d"}, {}, false};
    sources.entries["b\n c\xff.desktop"] = {{"Game/b\n c\xff.desktop", "0e"}, {"Office/d", "0f"}, true};
    sources.entries["new.desktop"] = {{}, {"Game/new.desktop", "1a"}, true};
    sources.entries["old.desktop"] = {{"Game/old.desktop", "1b"}, {}, true};
    return sources;
}

void tst_MenuSources::refusesDamagedText_data()
{
    QTest::addColumn<QByteArray>("from");
    QTest::addColumn<QByteArray>("to");
    QTest::newRow("another version") << QByteArray("version 1") << QByteArray("version 2");
    QTest::newRow("no end") << QByteArray("new.desktop\n") << QByteArray("new.desktop");
    QTest::newRow("unknown line") << QByteArray("folder ") << QByteArray("folders ");
    QTest::newRow("a word too many") << QByteArray("0b Game") << QByteArray("0b Game x");
    QTest::newRow("a word too few") << QByteArray("0b Game") << QByteArray("0b");
    QTest::newRow("no digest") << QByteArray("Game/a.desktop 0c") << QByteArray("Game/a.desktop xyz");
    QTest::newRow("half an escape") << QByteArray("%20folder%25") << QByteArray("%20folder%2");
    QTest::newRow("an escaped zero") << QByteArray("%20folder%25") << QByteArray("%20folder%00");
    QTest::newRow("a zero") << QByteArray("0b Game") << QByteArray("0b Ga\0me", 8);
    QTest::newRow("a tab") << QByteArray("0b Game") << QByteArray("0b Ga\tme");
    QTest::newRow("two blanks") << QByteArray("0b Game") << QByteArray("0b  Game");
    QTest::newRow("an empty line") << QByteArray("folder ") << QByteArray("\nfolder ");
    QTest::newRow("an entry twice") << QByteArray("folder ")
                                    << QByteArray("entry Game/x 0c a.desktop\nfolder ");
}

void tst_MenuSources::refusesDamagedText()
{
    QFETCH(QByteArray, from);
    QFETCH(QByteArray, to);
    QByteArray text = QByteArray::fromStdString(sample().toText());
    QVERIFY(text.contains(from));
    // The entry of this name stands before those that end in it.
    text.replace(text.lastIndexOf(from), from.size(), to);
    if (to == "new.desktop")
        text.truncate(text.indexOf(to) + to.size());
    QVERIFY(!MenuSources::fromText(text.toStdString()));
    QVERIFY(!MenuSources::fromText(""));
}

void tst_MenuSources::refusesPlacesOutsideOfTheMenu_data()
{
    QTest::addColumn<QByteArray>("place");
    for (const char *place : {"a.desktop", "/a.desktop", "../a.desktop", "Game/../a.desktop", "Game/..",
                              "Game/.hidden", ".hidden/a.desktop", "Game/", "Game/sub/a.desktop", "/"})
        QTest::newRow(place) << QByteArray(place);
}

void tst_MenuSources::refusesPlacesOutsideOfTheMenu()
{
    QFETCH(QByteArray, place);
    QVERIFY(!MenuSources::isPlace(place.toStdString()));
    QByteArray text = QByteArray::fromStdString(sample().toText());
    QVERIFY(MenuSources::fromText(text.toStdString()));
    text.replace("entry Game/a.desktop", "entry " + place);
    QVERIFY(!MenuSources::fromText(text.toStdString()));
}

void tst_MenuSources::readsWhatItWrites()
{
    const MenuSources written = sample();
    const auto found = MenuSources::fromText(written.toText());
    QVERIFY(found);
    QVERIFY(found->entries == written.entries);
    QVERIFY(found->folders == written.folders);
    QVERIFY(found->stamps == written.stamps);
    QVERIFY(found->environment == written.environment && found->searchPath == written.searchPath);
}

void tst_MenuSources::isPlainText()
{
    const std::string text = sample().toText();
    for (const char c : text)
        QVERIFY(c == '\n' || (static_cast<unsigned char>(c) >= ' ' && c != 0x7f));
    QVERIFY(QByteArray::fromStdString(text).contains("\nentry Game/a.desktop 0c a.desktop\n"));
}

void tst_MenuSources::insertsBeforeWhatBelongsBehind_data()
{
    QTest::addColumn<QString>("order");
    QTest::addColumn<QString>("expected");
    QTest::newRow("sorted") << "a b d e"
                            << "a b c d e";
    QTest::newRow("first") << "d e"
                           << "c d e";
    QTest::newRow("last") << "a b"
                          << "a b c";
    QTest::newRow("in another order") << "e a d b"
                                      << "c e a d b";
    QTest::newRow("behind a pattern") << "* a d"
                                      << "* a c d";
    QTest::newRow("before a pattern") << "a d *"
                                      << "a c d *";
    QTest::newRow("patterns alone") << "x* *"
                                    << "x* *";
    QTest::newRow("none") << ""
                          << "";
}

void tst_MenuSources::insertsBeforeWhatBelongsBehind()
{
    QFETCH(QString, order);
    QFETCH(QString, expected);
    const auto list = [](const QString &text) { return text.split(QLatin1Char(' '), Qt::SkipEmptyParts); };
    const auto isBefore = [](const QString &name, const QString &other) { return name < other; };
    QCOMPARE(MenuOrder::inserted(list(order), QStringLiteral("c"), isBefore), list(expected));
}

void tst_MenuSources::leavesOutTheOrderAlone()
{
    QCOMPARE(MenuOrder::withoutOrder("[Desktop Entry]\nName=a\nSortOrder=a;b;\nIcon=x\n"),
             std::string("[Desktop Entry]\nName=a\nIcon=x\n"));
    QCOMPARE(MenuOrder::withoutOrder("SortOrder =a\nSortOrders=a\n# SortOrder=\n"),
             std::string("SortOrders=a\n# SortOrder=\n"));
}

VEL_TEST_GUILESS_MAIN(tst_MenuSources)
#include "tst_MenuSources.moc"
