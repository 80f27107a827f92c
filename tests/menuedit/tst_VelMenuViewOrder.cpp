// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"

#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QAction>
#include <QDir>
#include <QFileSystemModel>
#include <QScrollBar>
#include <QSignalSpy>

/// Reordering and the list that it rewrites.
class tst_VelMenuViewOrder : public EditTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void listsChildrenInTheOrderShownWithTheNewOneInItsPlace_data();
    void listsChildrenInTheOrderShownWithTheNewOneInItsPlace();
    void makesARecordForAFolderWithoutOne();
    void listsOnlyWhatIsShown();
    void listsNoChildThatIsGone_data();
    void listsNoChildThatIsGone();
    void listsALinkWhoseTargetIsGone();
    void keepsTheRestOfAFoldersRecord();
    void leavesARecordThatCannotBeRead_data();
    void leavesARecordThatCannotBeRead();
    void refusesToListInNoFolder();
    void movesAnItemUpAndDown_data();
    void movesAnItemUpAndDown();
    void movesNothingWithoutASelection();
    void movesInALargeFolderWithoutLosingSight();
};

void tst_VelMenuViewOrder::listsChildrenInTheOrderShownWithTheNewOneInItsPlace_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("before");
    QTest::addColumn<QByteArray>("order");
    // Shown are c, a, b.
    QTest::newRow("new, first") << "x.desktop"
                                << "c.desktop" << QByteArray("*;x.desktop;c.desktop;a.desktop;b.desktop;");
    QTest::newRow("new, between") << "x.desktop"
                                  << "b.desktop" << QByteArray("*;c.desktop;a.desktop;x.desktop;b.desktop;");
    QTest::newRow("new, last") << "x.desktop"
                               << "last" << QByteArray("*;c.desktop;a.desktop;b.desktop;x.desktop;");
    QTest::newRow("new, nowhere") << "x.desktop"
                                  << "nowhere" << QByteArray("*;c.desktop;a.desktop;b.desktop;");
    QTest::newRow("child, first") << "b.desktop"
                                  << "c.desktop" << QByteArray("*;b.desktop;c.desktop;a.desktop;");
    QTest::newRow("child, last") << "c.desktop"
                                 << "last" << QByteArray("*;a.desktop;b.desktop;c.desktop;");
    QTest::newRow("child, before itself") << "a.desktop"
                                          << "a.desktop" << QByteArray("*;c.desktop;a.desktop;b.desktop;");
    QTest::newRow("child, nowhere") << "a.desktop"
                                    << "nowhere" << QByteArray("*;c.desktop;b.desktop;");
}

void tst_VelMenuViewOrder::listsChildrenInTheOrderShownWithTheNewOneInItsPlace()
{
    QFETCH(QString, name);
    QFETCH(QString, before);
    QFETCH(QByteArray, order);
    writeFolder(QString(), QStringLiteral("Menu"), "c.desktop;a.desktop;b.desktop;");
    writeLetters("abc");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    const QModelIndex folder = files(view)->index(menu());
    int row = files(view)->index(menu() + QLatin1Char('/') + before).row();
    if (before == QLatin1String("last"))
        row = files(view)->rowCount(folder);
    if (before == QLatin1String("nowhere"))
        row = -1;
    QVERIFY(view.fixSortOrderForNew(name, row, folder));
    QCOMPARE(sortOrderOf(menu()), order);
}

void tst_VelMenuViewOrder::makesARecordForAFolderWithoutOne()
{
    writeLetters("ab");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    const QModelIndex folder = files(view)->index(menu());
    const int first = files(view)->index(menu() + QLatin1String("/a.desktop")).row();
    QVERIFY(view.fixSortOrderForNew(QStringLiteral("b.desktop"), first, folder));
    QCOMPARE(read(menu() + QLatin1String("/.directory")),
             QByteArray("[Desktop Entry]\nType=Directory\nName=Group\nName[en]=Group\n"
                        "SortOrder=*;b.desktop;a.desktop;\n"));
}

void tst_VelMenuViewOrder::listsOnlyWhatIsShown()
{
    writeFolder(QString(), QStringLiteral("Menu"), "gone.desktop;b.desktop;h.desktop;a.desktop;");
    writeLetters("ab");
    const QString hidden =
        writeEntry(QStringLiteral("h.desktop"), QStringLiteral("H"), "Exec=true\nHidden=true\n");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    const QModelIndex folder = files(view)->index(menu());
    QCOMPARE(files(view)->rowCount(folder), 3);
    // The end is told by the rows of the model, the hidden one included.
    QVERIFY(view.fixSortOrderForNew(QStringLiteral("x.desktop"), 3, folder));
    QCOMPARE(sortOrderOf(menu()), QByteArray("*;b.desktop;a.desktop;x.desktop;"));
    // Before a row that is not shown is nowhere.
    QVERIFY(view.fixSortOrderForNew(QStringLiteral("x.desktop"), files(view)->index(hidden).row(), folder));
    QCOMPARE(sortOrderOf(menu()), QByteArray("*;b.desktop;a.desktop;"));
}

void tst_VelMenuViewOrder::listsNoChildThatIsGone_data()
{
    QTest::addColumn<QString>("gone");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("before");
    QTest::addColumn<QByteArray>("order");
    // Shown are c, a, b.
    const auto row = [](const char *title, const char *gone, const char *name, const char *before,
                        const char *order) {
        const auto entry = [](const char *letter) {
            return QLatin1String(letter) + QStringLiteral(".desktop");
        };
        QTest::newRow(title) << entry(gone) << entry(name) << entry(before) << QByteArray(order);
    };
    row("before one behind it", "a", "x", "b", "*;c.desktop;x.desktop;b.desktop;");
    row("before itself", "a", "x", "a", "*;c.desktop;x.desktop;b.desktop;");
    row("before itself, the last", "b", "x", "b", "*;c.desktop;a.desktop;x.desktop;");
    row("at the end", "a", "x", "end", "*;c.desktop;b.desktop;x.desktop;");
    row("a child upwards", "a", "b", "a", "*;c.desktop;b.desktop;");
    row("comes back", "a", "a", "c", "*;a.desktop;c.desktop;b.desktop;");
}

void tst_VelMenuViewOrder::listsNoChildThatIsGone()
{
    QFETCH(QString, gone);
    QFETCH(QString, name);
    QFETCH(QString, before);
    QFETCH(QByteArray, order);
    writeFolder(QString(), QStringLiteral("Menu"), "c.desktop;a.desktop;b.desktop;");
    writeLetters("abc");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    const QModelIndex folder = files(view)->index(menu());
    int row = files(view)->rowCount(folder);
    for (int i = 0; i < files(view)->rowCount(folder); ++i) {
        if (files(view)->index(i, 0, folder).data(QFileSystemModel::FileNameRole) == before)
            row = i;
    }

    QVERIFY(QFile::remove(menu() + QLatin1Char('/') + gone));
    QVERIFY(view.fixSortOrderForNew(name, row, folder));

    // Nobody has noticed yet.
    QCOMPARE(files(view)->rowCount(folder), 3);
    QCOMPARE(sortOrderOf(menu()), order);
}

void tst_VelMenuViewOrder::listsALinkWhoseTargetIsGone()
{
    const QString target = write(QStringLiteral("outside/t.desktop"), entryText(QStringLiteral("T")));
    QVERIFY(QFile::link(target, menu() + QLatin1String("/l.desktop")));
    writeLetters("a");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    QVERIFY(QFile::remove(target));
    QVERIFY(view.fixSortOrderForNew(QStringLiteral("x.desktop"), 2, files(view)->index(menu())));
    QCOMPARE(sortOrderOf(menu()), QByteArray("*;a.desktop;l.desktop;x.desktop;"));
}

void tst_VelMenuViewOrder::keepsTheRestOfAFoldersRecord()
{
    const QByteArray before = "# mine\n[Desktop Entry]\nType=Directory\nName=Games\nName[de]=Spiele\n";
    write(QStringLiteral("menu/.directory"), before + "SortOrder=old;\nX-Own=1\n");
    writeLetters("ab");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    QVERIFY(view.fixSortOrderForNew(QStringLiteral("a.desktop"), 2, files(view)->index(menu())));
    QCOMPARE(read(menu() + QLatin1String("/.directory")),
             before + "SortOrder=*;b.desktop;a.desktop;\nX-Own=1\n");
}

void tst_VelMenuViewOrder::leavesARecordThatCannotBeRead_data()
{
    QTest::addColumn<QByteArray>("contents");
    QTest::newRow("too large") << QByteArray(1024 * 1024 + 1, 'x');
    QTest::newRow("a directory") << QByteArray();
}

void tst_VelMenuViewOrder::leavesARecordThatCannotBeRead()
{
    QFETCH(QByteArray, contents);
    const QString record = menu() + QLatin1String("/.directory");
    if (contents.isEmpty())
        QDir().mkpath(record + QLatin1String("/mine"));
    else
        write(QStringLiteral("menu/.directory"), contents);
    const QString b = writeLetters("ab").constLast();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    select(view, b);
    view.slotUp();
    if (contents.isEmpty())
        QVERIFY(QFileInfo(record + QLatin1String("/mine")).isDir());
    else
        QCOMPARE(read(record), contents);
}

void tst_VelMenuViewOrder::refusesToListInNoFolder()
{
    VelMenuView view(menu(), -1, true);
    QVERIFY(!view.fixSortOrderForNew(QStringLiteral("a.desktop"), 0, QModelIndex()));
    view.fixSortOrderInDir(QModelIndex(), true);
    QCOMPARE(everythingIn(menu()), QStringList());
}

void tst_VelMenuViewOrder::movesAnItemUpAndDown_data()
{
    QTest::addColumn<QString>("item");
    QTest::addColumn<bool>("up");
    QTest::addColumn<QString>("order");
    QTest::newRow("first up") << "a" << true << "ABC";
    QTest::newRow("middle up") << "b" << true << "BAC";
    QTest::newRow("last up") << "c" << true << "ACB";
    QTest::newRow("first down") << "a" << false << "BAC";
    QTest::newRow("middle down") << "b" << false << "ACB";
    QTest::newRow("last down") << "c" << false << "ABC";
}

void tst_VelMenuViewOrder::movesAnItemUpAndDown()
{
    QFETCH(QString, item);
    QFETCH(bool, up);
    QFETCH(QString, order);
    writeLetters("abc", QStringLiteral("sub/"));
    const QString sub = menu() + QLatin1String("/sub");
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 1));
    QVERIFY(open(view, sub, 3));
    const QString path = sub + QLatin1Char('/') + item + QLatin1String(".desktop");
    select(view, path);
    QSignalSpy changes(&view, &VelMenuView::changed);
    if (up)
        view.slotUp();
    else
        view.slotDown();
    QCOMPARE(names(view, sub).join(QString()), order);
    QByteArray expected = "*;";
    for (const QChar letter : order.toLower())
        expected += QString(letter).toLatin1() + ".desktop;";
    QCOMPARE(sortOrderOf(sub), expected);
    QCOMPARE(changes.count(), 1);
    QCOMPARE(view.selectedPath(), path);
    QVERIFY(view.isExpanded(shown(view, sub)));
    QCOMPARE(action(view, QStringLiteral("upAction"))->isEnabled(), order.indexOf(item.toUpper()) != 0);
    QCOMPARE(action(view, QStringLiteral("downAction"))->isEnabled(), order.indexOf(item.toUpper()) != 2);
    // The same is shown by a view that reads it all anew.
    VelMenuView other(menu(), -1, true);
    QVERIFY(open(other, menu(), 1));
    QVERIFY(open(other, sub, 3));
    QTRY_COMPARE(names(other, sub).join(QString()), order);
}

void tst_VelMenuViewOrder::movesNothingWithoutASelection()
{
    writeLetters("ab");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    QSignalSpy changes(&view, &VelMenuView::changed);
    view.slotUp();
    view.slotDown();
    QCOMPARE(changes.count(), 0);
    QVERIFY(!QFile::exists(menu() + QLatin1String("/.directory")));
}

void tst_VelMenuViewOrder::movesInALargeFolderWithoutLosingSight()
{
    writeLetters("abc", QStringLiteral("zsub/"));
    for (int i = 0; i < 500; ++i)
        writeEntry(QStringLiteral("e%1.desktop").arg(i, 3, 10, QLatin1Char('0')),
                   QStringLiteral("E%1").arg(i));
    VelMenuView view(menu(), -1, true);
    view.resize(300, 300);
    view.show();
    QVERIFY(open(view, menu(), 501));
    QVERIFY(open(view, menu() + QLatin1String("/zsub"), 3));
    const QString path = menu() + QLatin1String("/e250.desktop");
    view.showAndSelect(path);
    QTRY_VERIFY(view.viewport()->rect().contains(view.visualRect(shown(view, path))));
    const int scrolled = view.verticalScrollBar()->value();
    QVERIFY(scrolled > 0);
    view.slotUp();
    view.slotDown();
    QTest::qWait(0);
    QCOMPARE(view.selectedPath(), path);
    QCOMPARE(view.verticalScrollBar()->value(), scrolled);
    QVERIFY(view.isExpanded(shown(view, menu() + QLatin1String("/zsub"))));
}

VEL_TEST_MAIN(tst_VelMenuViewOrder)
#include "tst_VelMenuViewOrder.moc"
