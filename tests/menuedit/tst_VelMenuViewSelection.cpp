// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "OlderListing.h"
#include "VelMenuView.h"

#include <QFileSystemModel>
#include <QSignalSpy>

#include <memory>

/// Selecting items and bringing them into sight.
class tst_VelMenuViewSelection : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsWhatIsSelected();
    void showsAndSelectsAnItemInAFolderNeverOpened();
    void scrollsToAnItemThatArrivesLater();
    void selectsNothingThatIsNoItemOfTheMenu();
    void selectsAgainWhatAnOlderListingTookAway();
    void selectsNoNeighborOfARowThatGoes();
    void goesAwayBeforeItScrolls();
};

void tst_VelMenuViewSelection::tellsWhatIsSelected()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QVERIFY(!view.selectedItem().isValid());
    QCOMPARE(view.selectedPath(), QString());

    QSignalSpy selections(&view, QOverload<const QString &>::of(&VelMenuView::selectionChanged));
    select(view, a);
    QCOMPARE(view.selectedPath(), a);
    QCOMPARE(view.selectedItem(), files(view)->index(a));
    QCOMPARE(selections.takeLast().constFirst().toString(), a);
    view.selectionModel()->clearSelection();
    QCOMPARE(selections.takeLast().constFirst().toString(), QString());
    view.selectionChangedSlot();
    QCOMPARE(selections.count(), 1);
}

void tst_VelMenuViewSelection::showsAndSelectsAnItemInAFolderNeverOpened()
{
    const QString deep = writeEntry(QStringLiteral("one/two/a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 1));
    view.showAndSelect(deep);
    QCOMPARE(view.selectedPath(), deep);
    QVERIFY(view.isExpanded(shown(view, menu() + QLatin1String("/one/two"))));
    QTRY_VERIFY(view.visualRect(shown(view, deep)).isValid());
    QVERIFY(view.isExpanded(shown(view, menu() + QLatin1String("/one"))));
    QCOMPARE(view.selectionModel()->selectedIndexes().size(), 1);
    QCOMPARE(view.currentIndex(), shown(view, deep));
}

void tst_VelMenuViewSelection::scrollsToAnItemThatArrivesLater()
{
    for (int i = 0; i < 200; ++i)
        writeEntry(QStringLiteral("sub/e%1.desktop").arg(i, 3, 10, QLatin1Char('0')),
                   QStringLiteral("E%1").arg(i, 3, 10, QLatin1Char('0')));
    VelMenuView view(menu(), -1, true);
    view.resize(200, 150);
    // What becomes the current item would come into sight by itself.
    view.setAutoScroll(false);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    const QString last = menu() + QLatin1String("/sub/e150.desktop");
    QVERIFY(open(view, menu(), 1));
    QVERIFY(open(view, menu() + QLatin1String("/sub"), 200));
    view.showAndSelect(last);
    QTRY_VERIFY(view.viewport()->rect().contains(view.visualRect(shown(view, last))));
}

void tst_VelMenuViewSelection::selectsNothingThatIsNoItemOfTheMenu()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    const QString outside = write(QStringLiteral("outside.desktop"), entryText(QStringLiteral("O")));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    for (const QString &path : {outside, menu(), menu() + QLatin1String("/none"), QString()}) {
        select(view, a);
        view.showAndSelect(path);
        QVERIFY2(!view.selectedItem().isValid(), qPrintable(path));
    }
}

void tst_VelMenuViewSelection::selectsAgainWhatAnOlderListingTookAway()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 2));
    view.showAndSelect(b);
    // What the model does with a listing made before the item.
    QVERIFY(takeOlderListing(files(view), menu(), {QStringLiteral("a.desktop")}));
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("A")});
    QVERIFY(!view.selectedItem().isValid());
    writeEntry(QStringLiteral("c.desktop"), QStringLiteral("C"));
    QTRY_COMPARE(view.selectedPath(), b);
}

void tst_VelMenuViewSelection::selectsNoNeighborOfARowThatGoes()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    const QString c = writeEntry(QStringLiteral("c.desktop"), QStringLiteral("C"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 3));
    QTRY_COMPARE(names(view, menu()).constFirst(), QStringLiteral("A"));
    select(view, b);
    QVERIFY(QFile::remove(b));
    QTRY_COMPARE(names(view, menu()).size(), 2);
    QVERIFY(!view.selectedItem().isValid());
    QCOMPARE(view.currentIndex(), shown(view, c));
    // It is no longer waited for.
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    QTRY_COMPARE(names(view, menu()).size(), 3);
    QTest::qWait(0);
    QVERIFY(!view.selectedItem().isValid());
}

void tst_VelMenuViewSelection::goesAwayBeforeItScrolls()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    auto view = std::make_unique<VelMenuView>(menu(), -1, true);
    QVERIFY(open(*view, menu(), 1));
    view->showAndSelect(a);
    view.reset();
    QTest::qWait(0);
}

VEL_TEST_MAIN(tst_VelMenuViewSelection)
#include "tst_VelMenuViewSelection.moc"
