// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"
#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QAction>
#include <QFileSystemModel>
#include <QMimeData>
#include <QSignalSpy>
#include <QSortFilterProxyModel>
#include <QUrl>

/// The tree while a filter is set.
class tst_VelMenuViewFilter : public EditTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void filtersNothingWithoutAssistance();
    void findsByEveryField_data();
    void findsByEveryField();
    void keepsTheFoldersOfARow();
    void showsWhatAFolderHoldsThatIsFound();
    void findsInFoldersThatWereNeverOpened();
    void readsNoFolderThatAnOutsideLinkLeadsTo();
    void showsEverythingAgainAndClosesFolders();
    void keepsTheSelectedItemInSightWhenItEnds();
    void unselectsWhatItLeavesOut();
    void goesThroughTheMatches();
    void tellsWhenNothingMatches();
    void losesNothingFromTheOrder_data();
    void losesNothingFromTheOrder();
    void placesADropAmongWhatIsShown();
    void showsWhatIsMadeMeanwhile();
    void keepsWhatWasEditedInSight();
    void findsWhatComesFromOutside();
    void endsWithAssistance();
    void survivesAnotherDirectory();

private:
    static QStringList rows(const VelMenuView &view, const QString &folder) { return names(view, folder); }
};

void tst_VelMenuViewFilter::filtersNothingWithoutAssistance()
{
    writeLetters("abc");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    view.setFilter(QStringLiteral("b"));
    QCOMPARE(rows(view, menu()).size(), 3);
}

void tst_VelMenuViewFilter::findsByEveryField_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("found");
    QTest::newRow("name") << QStringLiteral("fire") << QStringLiteral("Firefox");
    QTest::newRow("generic name") << QStringLiteral("web browser") << QStringLiteral("Firefox");
    QTest::newRow("comment") << QStringLiteral("world wide") << QStringLiteral("Firefox");
    QTest::newRow("command") << QStringLiteral("--new-window") << QStringLiteral("Firefox");
    QTest::newRow("keyword") << QStringLiteral("internet") << QStringLiteral("Firefox");
    QTest::newRow("file name") << QStringLiteral("ff.desk") << QStringLiteral("Firefox");
    QTest::newRow("words in any order, of several fields")
        << QStringLiteral("window BROWSER fire") << QStringLiteral("Firefox");
    QTest::newRow("accents typed") << QStringLiteral("fîrefôx") << QStringLiteral("Firefox");
    QTest::newRow("accents in the name") << QStringLiteral("editeur") << QStringLiteral("Éditeur");
    QTest::newRow("one word that is nowhere") << QStringLiteral("fire mail") << QString();
}

void tst_VelMenuViewFilter::findsByEveryField()
{
    QFETCH(QString, text);
    QFETCH(QString, found);
    writeEntry(QStringLiteral("ff.desktop"), QStringLiteral("Firefox"),
               "GenericName=Web Browser\nComment=Browse the World Wide Web\nExec=firefox --new-window %u\n"
               "Keywords=Internet;WWW;\n");
    writeEntry(QStringLiteral("ed.desktop"), QStringLiteral("Éditeur"), "Exec=gedit\n");
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setFilter(text);
    QTRY_COMPARE(rows(view, menu()).join(QLatin1Char(' ')), found);
    view.setFilter(QString());
    QCOMPARE(rows(view, menu()).size(), 2);
}

void tst_VelMenuViewFilter::keepsTheFoldersOfARow()
{
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"));
    writeEntry(QStringLiteral("games/chess.desktop"), QStringLiteral("Chess"));
    writeEntry(QStringLiteral("games/go.desktop"), QStringLiteral("Go"));
    writeFolder(QStringLiteral("office"), QStringLiteral("Office"));
    writeEntry(QStringLiteral("office/calc.desktop"), QStringLiteral("Calc"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    const QString games = menu() + QLatin1String("/games");
    QVERIFY(open(view, games, 2));
    view.collapse(shown(view, games));
    view.setFilter(QStringLiteral("chess"));
    QTRY_COMPARE(rows(view, menu()), QStringList{QStringLiteral("Games")});
    QTRY_COMPARE(rows(view, games), QStringList{QStringLiteral("Chess")});
    QVERIFY(view.isExpanded(shown(view, games)));
}

void tst_VelMenuViewFilter::showsWhatAFolderHoldsThatIsFound()
{
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"));
    writeEntry(QStringLiteral("games/chess.desktop"), QStringLiteral("Chess"));
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setFilter(QStringLiteral("GAMES"));
    QTRY_COMPARE(rows(view, menu()), QStringList{QStringLiteral("Games")});
    const QString games = menu() + QLatin1String("/games");
    QVERIFY(!view.isExpanded(shown(view, games)));
    QVERIFY(open(view, games, 1));
}

void tst_VelMenuViewFilter::findsInFoldersThatWereNeverOpened()
{
    writeEntry(QStringLiteral("one/two/three/x.desktop"), QStringLiteral("Needle"));
    writeEntry(QStringLiteral("other/y.desktop"), QStringLiteral("Hay"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    view.setFilter(QStringLiteral("needle"));
    const QString deep = menu() + QLatin1String("/one/two/three");
    QTRY_COMPARE(rows(view, deep), QStringList{QStringLiteral("Needle")});
    QCOMPARE(rows(view, menu()), QStringList{QStringLiteral("one")});
    QVERIFY(view.isExpanded(shown(view, deep)));
    QVERIFY(files(view)->canFetchMore(files(view)->index(menu() + QLatin1String("/other"))));
}

void tst_VelMenuViewFilter::readsNoFolderThatAnOutsideLinkLeadsTo()
{
    write(QStringLiteral("outside/x.desktop"), entryText(QStringLiteral("Needle")));
    const QString link = menu() + QLatin1String("/link");
    QVERIFY(QFile::link(path(QStringLiteral("outside")), link));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 1));
    const QSignalSpy told(&view, &VelMenuView::told);
    view.setFilter(QStringLiteral("needle"));
    QTRY_COMPARE(told.count(), 1);
    QVERIFY(rows(view, menu()).isEmpty());
    view.setFilter(QStringLiteral("link"));
    QTRY_COMPARE(rows(view, menu()), QStringList{QStringLiteral("link")});
    QVERIFY(files(view)->canFetchMore(files(view)->index(link)));
}

void tst_VelMenuViewFilter::showsEverythingAgainAndClosesFolders()
{
    writeEntry(QStringLiteral("a/x.desktop"), QStringLiteral("hit"));
    writeEntry(QStringLiteral("b/y.desktop"), QStringLiteral("hit"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    const QString a = menu() + QLatin1String("/a");
    const QString b = menu() + QLatin1String("/b");
    QVERIFY(open(view, b, 1));
    view.setFilter(QStringLiteral("hit"));
    QTRY_COMPARE(rows(view, a).size(), 1);
    QVERIFY(view.isExpanded(shown(view, a)) && view.isExpanded(shown(view, b)));
    view.setFilter(QStringLiteral("nowhere"));
    QTRY_COMPARE(rows(view, menu()).size(), 0);
    view.setFilter(QString());
    QCOMPARE(rows(view, menu()).size(), 2);
    QVERIFY(!view.isExpanded(shown(view, a)));
    QVERIFY(view.isExpanded(shown(view, b)));
}

void tst_VelMenuViewFilter::keepsTheSelectedItemInSightWhenItEnds()
{
    for (int i = 0; i < 50; ++i)
        writeEntry(QStringLiteral("a/e%1.desktop").arg(i), QStringLiteral("E%1").arg(i));
    const QString needle = writeEntry(QStringLiteral("a/n.desktop"), QStringLiteral("Needle"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    view.resize(200, 120);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    view.setFilter(QStringLiteral("needle"));
    QTRY_COMPARE(rows(view, menu() + QLatin1String("/a")).size(), 1);
    view.slotFindNext();
    QCOMPARE(view.selectedPath(), needle);
    view.setFilter(QString());
    QCOMPARE(view.selectedPath(), needle);
    QTRY_COMPARE(rows(view, menu() + QLatin1String("/a")).size(), 51);
    QTRY_VERIFY(view.viewport()->rect().contains(view.visualRect(shown(view, needle)).center()));
}

void tst_VelMenuViewFilter::unselectsWhatItLeavesOut()
{
    const QStringList letters = writeLetters("abc");
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 3));
    select(view, letters.at(0));
    QSignalSpy selections(&view, qOverload<const QString &>(&VelMenuView::selectionChanged));
    view.setFilter(QStringLiteral("b.desktop"));
    QTRY_COMPARE(rows(view, menu()).size(), 1);
    QVERIFY(view.selectedPath().isEmpty());
    QCOMPARE(selections.count(), 1);
    QVERIFY(!action(view, QStringLiteral("deleteAction"))->isEnabled());
    select(view, letters.at(1));
    view.setFilter(QStringLiteral("b.desk"));
    QCOMPARE(view.selectedPath(), letters.at(1));
}

void tst_VelMenuViewFilter::goesThroughTheMatches()
{
    const QString first = writeEntry(QStringLiteral("a/x.desktop"), QStringLiteral("hit 1"));
    const QString second = writeEntry(QStringLiteral("b/y.desktop"), QStringLiteral("hit 2"));
    const QString third = writeEntry(QStringLiteral("z.desktop"), QStringLiteral("hit 3"));
    writeEntry(QStringLiteral("q.desktop"), QStringLiteral("miss"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 4));
    view.setFilter(QStringLiteral("hit"));
    QTRY_COMPARE(rows(view, menu() + QLatin1String("/b")).size(), 1);
    QTRY_COMPARE(rows(view, menu() + QLatin1String("/a")).size(), 1);
    for (const QString &path : {first, second, third, first}) {
        action(view, QStringLiteral("findNextAction"))->trigger();
        QCOMPARE(view.selectedPath(), path);
    }
}

void tst_VelMenuViewFilter::tellsWhenNothingMatches()
{
    writeLetters("ab");
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    const QSignalSpy told(&view, &VelMenuView::told);
    view.setFilter(QStringLiteral("no such <b>thing</b>"));
    QTRY_COMPARE(told.count(), 1);
    QCOMPARE(told.constFirst().constFirst().toString(),
             QStringLiteral("Nothing in this menu matches 'no such <b>thing</b>'."));
    QCOMPARE(told.constFirst().constLast().toInt(), 0);
    view.slotFindNext();
    QVERIFY(view.selectedPath().isEmpty());
}

void tst_VelMenuViewFilter::losesNothingFromTheOrder_data()
{
    QTest::addColumn<QString>("selected");
    QTest::addColumn<bool>("up");
    QTest::addColumn<QByteArray>("order");
    QTest::newRow("up") << QStringLiteral("e") << true
                        << QByteArray("*;a.desktop;b.desktop;e.desktop;c.desktop;d.desktop;f.desktop;");
    QTest::newRow("down") << QStringLiteral("a") << false
                          << QByteArray("*;b.desktop;c.desktop;a.desktop;d.desktop;e.desktop;f.desktop;");
    QTest::newRow("down to the last")
        << QStringLiteral("c") << false
        << QByteArray("*;a.desktop;b.desktop;d.desktop;e.desktop;c.desktop;f.desktop;");
}

void tst_VelMenuViewFilter::losesNothingFromTheOrder()
{
    QFETCH(QString, selected);
    QFETCH(bool, up);
    QFETCH(QByteArray, order);
    writeFolder(QString(), QStringLiteral("Menu"),
                "a.desktop;b.desktop;c.desktop;d.desktop;e.desktop;f.desktop;");
    for (const char *letter : {"a", "b", "c", "d", "e", "f"})
        writeEntry(QLatin1String(letter) + QLatin1String(".desktop"), QString::fromLatin1(letter).toUpper(),
                   strchr("ace", *letter) ? "Exec=hit\n" : "Exec=miss\n");
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 6));
    view.setFilter(QStringLiteral("hit"));
    QTRY_COMPARE(rows(view, menu()).join(QString()), QStringLiteral("ACE"));
    select(view, menu() + QLatin1Char('/') + selected + QLatin1String(".desktop"));
    up ? view.slotUp() : view.slotDown();
    QCOMPARE(sortOrderOf(menu()), order);
    view.setFilter(QString());
    QCOMPARE(rows(view, menu()).size(), 6);
}

void tst_VelMenuViewFilter::placesADropAmongWhatIsShown()
{
    writeFolder(QString(), QStringLiteral("Menu"), "a.desktop;b.desktop;c.desktop;sub;");
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"), "Exec=hit\n");
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"), "Exec=miss\n");
    const QString c = writeEntry(QStringLiteral("c.desktop"), QStringLiteral("C"), "Exec=hit\n");
    const QString x = writeEntry(QStringLiteral("sub/x.desktop"), QStringLiteral("X"), "Exec=other\n");
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 4));
    view.setFilter(QStringLiteral("hit"));
    QTRY_COMPARE(rows(view, menu()).join(QString()), QStringLiteral("AC"));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(x)});
    QVERIFY(view.model()->dropMimeData(&data, Qt::MoveAction, shown(view, c).row(), 0, shown(view, menu())));
    QCOMPARE(sortOrderOf(menu()), QByteArray("*;a.desktop;b.desktop;x.desktop;c.desktop;sub;"));
    // What was moved is in sight although no word matches.
    QTRY_COMPARE(rows(view, menu()).join(QString()), QStringLiteral("AXC"));
    QCOMPARE(view.selectedPath(), menu() + QLatin1String("/x.desktop"));
}

void tst_VelMenuViewFilter::showsWhatIsMadeMeanwhile()
{
    writeLetters("ab");
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setFilter(QStringLiteral("a.desktop"));
    QTRY_COMPARE(rows(view, menu()).size(), 1);
    ModalDriver modal;
    modal.handle([](QWidget *dialog) {
        fill(dialog, "execEdit", QStringLiteral("true"));
        accept(dialog, QStringLiteral("Zebra"));
    });
    QVERIFY(view.createNew(false));
    QVERIFY(modal.finished());
    QTRY_COMPARE(rows(view, menu()).join(QLatin1Char(' ')), QStringLiteral("A Zebra"));
    view.setFilter(QStringLiteral("a.deskto"));
    QTRY_COMPARE(rows(view, menu()).join(QLatin1Char(' ')), QStringLiteral("A"));
}

void tst_VelMenuViewFilter::keepsWhatWasEditedInSight()
{
    const QString a = writeEntry(QStringLiteral("x.desktop"), QStringLiteral("Alpha"));
    writeEntry(QStringLiteral("y.desktop"), QStringLiteral("Beta"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setFilter(QStringLiteral("alpha"));
    QTRY_COMPARE(rows(view, menu()).size(), 1);
    select(view, a);
    ModalDriver modal;
    modal.handle([](QWidget *dialog) { accept(dialog, QStringLiteral("Gamma")); });
    QVERIFY(view.slotEdit());
    QVERIFY(modal.finished());
    QTest::qWait(300);
    QCOMPARE(rows(view, menu()), QStringList{QStringLiteral("Gamma")});
    QCOMPARE(view.selectedPath(), a);
    view.setFilter(QStringLiteral("gam"));
    QTRY_COMPARE(rows(view, menu()), QStringList{QStringLiteral("Gamma")});
    view.setFilter(QStringLiteral("alpha"));
    QTRY_COMPARE(rows(view, menu()), QStringList());
}

void tst_VelMenuViewFilter::findsWhatComesFromOutside()
{
    writeLetters("ab");
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setFilter(QStringLiteral("needle"));
    QTRY_COMPARE(rows(view, menu()).size(), 0);
    writeEntry(QStringLiteral("n.desktop"), QStringLiteral("Needle"));
    QTRY_COMPARE(rows(view, menu()), QStringList{QStringLiteral("Needle")});
}

void tst_VelMenuViewFilter::endsWithAssistance()
{
    writeLetters("abc");
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 3));
    view.setFilter(QStringLiteral("b.desktop"));
    QTRY_COMPARE(rows(view, menu()).size(), 1);
    view.setAssistance(false);
    QCOMPARE(rows(view, menu()).size(), 3);
}

void tst_VelMenuViewFilter::survivesAnotherDirectory()
{
    writeLetters("abc");
    const QString other =
        QFileInfo(write(QStringLiteral("other/x.desktop"), entryText(QStringLiteral("X")))).path();
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    view.setFilter(QStringLiteral("b"));
    view.init(other, -1, true, nullptr);
    QVERIFY(open(view, other, 1));
    view.setFilter(QStringLiteral("y"));
    QTRY_COMPARE(rows(view, other).size(), 0);
    view.setFilter(QStringLiteral("x"));
    QTRY_COMPARE(rows(view, other).size(), 1);
}

VEL_TEST_MAIN(tst_VelMenuViewFilter)
#include "tst_VelMenuViewFilter.moc"
