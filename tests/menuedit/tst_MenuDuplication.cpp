// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExactTree.h"
#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QLayout>
#include <QMenu>
#include <QSignalSpy>

/// Items of a menu that are copied beside themselves, by hand.
class tst_MenuDuplication : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void copiesWhatIsSelected_data();
    void copiesWhatIsSelected();
    void copiesAgainAndAgain();
    void copiesSeveralInOneStep();
    void keepsAllNamesToTheLastByte();
    void isOfferedInTheContextMenu();
    void worksWhileAFilterIsSet();
    void leavesTheOrderOfRecentItems();
    void tellsWhyItCannotBe();
    void tellsThatTheOrderWasNotSaved();
    void isGoneWithoutAssistance();

private:
    QString in(const char *file) const { return menu() + QLatin1Char('/') + QLatin1String(file); }
    QString rows(const char *folder) { return names(view(), in(folder)).join(QLatin1Char(' ')); }
    QAction *duplicateAction() const { return action(view(), QStringLiteral("duplicateAction")); }
    QString undoText() const { return view().undoAction()->text(); }
};

void tst_MenuDuplication::init()
{
    HandsOnTestCase::init();
    writeFolder(QString(), QStringLiteral("Menu"), "games;a.desktop;b.desktop;");
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"), "x.desktop;deep;y.desktop;");
    writeFolder(QStringLiteral("games/deep"), QStringLiteral("Deep"), "");
    write(QStringLiteral("menu/games/deep/.hidden"), "hidden");
    for (const char *name : {"a", "b", "games/x", "games/y", "games/deep/z"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)),
                   QString::fromLatin1(name).section(QLatin1Char('/'), -1));
    openDialog(menu(), 3);
    QVERIFY(open(view(), in("games"), 3));
    dialog()->setAssistance(true);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
}

void tst_MenuDuplication::copiesWhatIsSelected_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("copy");
    QTest::addColumn<QString>("rows");
    QTest::addColumn<QByteArray>("order");
    QTest::addColumn<QString>("name");
    QTest::newRow("entry") << "games/x.desktop"
                           << "games/x-2.desktop"
                           << "x x Deep y" << QByteArray("*;x.desktop;x-2.desktop;deep;y.desktop;") << "x";
    QTest::newRow("last entry") << "games/y.desktop"
                                << "games/y-2.desktop"
                                << "x Deep y y" << QByteArray("*;x.desktop;deep;y.desktop;y-2.desktop;")
                                << "y";
    QTest::newRow("folder") << "games/deep"
                            << "games/deep-2"
                            << "x Deep Deep y" << QByteArray("*;x.desktop;deep;deep-2;y.desktop;") << "Deep";
}

void tst_MenuDuplication::copiesWhatIsSelected()
{
    QFETCH(QString, file);
    QFETCH(QString, copy);
    QFETCH(QString, rows);
    QFETCH(QByteArray, order);
    QFETCH(QString, name);
    const QString source = menu() + QLatin1Char('/') + file;
    const QString target = menu() + QLatin1Char('/') + copy;
    const ExactTree before = ExactTree::of(menu());
    QSignalSpy changed(&view(), &VelMenuView::changed);
    QSignalSpy told(&view(), &VelMenuView::told);
    clickItem(source);
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(this->rows("games"), rows);
    QCOMPARE(sortOrderOf(in("games")), order);
    QCOMPARE(everythingIn(target), everythingIn(source));
    if (QFileInfo(source).isFile())
        QCOMPARE(read(target), read(source));
    QTRY_COMPARE(view().selectedPath(), target);
    QCOMPARE(shown(view(), target).row(), shown(view(), source).row() + 1);
    QCOMPARE(changed.size(), 1);
    QCOMPARE(told.size(), 1);
    QCOMPARE(told.at(0).at(0).toString(),
             QStringLiteral("%1 was duplicated. The copy is selected.").arg(name));
    QCOMPARE(undoText(), QStringLiteral("Undo duplication of %1").arg(name));
    const ExactTree after = ExactTree::of(menu());

    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QTRY_COMPARE(this->rows("games"), QStringLiteral("x Deep y"));
    XDoTool::press(QStringLiteral("ctrl+shift+z"));
    QTRY_COMPARE(after.difference(ExactTree::of(menu()), {"*"}), QString());
    QTRY_COMPARE(this->rows("games"), rows);
    QTRY_COMPARE(view().selectedPath(), target);
}

void tst_MenuDuplication::copiesAgainAndAgain()
{
    clickItem(in("a.desktop"));
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(view().selectedPath(), in("a-2.desktop"));
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(view().selectedPath(), in("a-2-2.desktop"));
    for (const char *above : {"a-2.desktop", "a.desktop"}) {
        XDoTool::press(QStringLiteral("Up"));
        QTRY_COMPARE(view().selectedPath(), in(above));
    }
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(view().selectedPath(), in("a-3.desktop"));
    QCOMPARE(sortOrderOf(menu()),
             QByteArray("*;games;a.desktop;a-3.desktop;a-2.desktop;a-2-2.desktop;b.desktop;"));
}

// Of two folders; what lies in a selected one goes along with it.
void tst_MenuDuplication::copiesSeveralInOneStep()
{
    const ExactTree before = ExactTree::of(menu());
    clickItem(in("games/x.desktop"));
    XDoTool::run(QStringLiteral("keydown ctrl"));
    for (const char *file : {"games/deep", "a.desktop", "b.desktop"})
        XDoTool::click(view().viewport(), placeOf(in(file)));
    XDoTool::run(QStringLiteral("keyup ctrl"));
    QTRY_COMPARE(view().selectionModel()->selectedIndexes().size(), 4);
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(rows("games"), QStringLiteral("x x Deep Deep y"));
    QTRY_COMPARE(names(view(), menu()).join(QLatin1Char(' ')), QStringLiteral("Games a a b b"));
    QTRY_COMPARE(view().selectionModel()->selectedIndexes().size(), 4);
    QVERIFY(view().selectionModel()->isSelected(shown(view(), in("games/deep-2"))));
    QVERIFY(!view().selectionModel()->isSelected(shown(view(), in("games/deep"))));
    QCOMPARE(undoText(), QStringLiteral("Undo duplication of 4 items"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QVERIFY(!view().undoAction()->isEnabled());
}

void tst_MenuDuplication::keepsAllNamesToTheLastByte()
{
    const QByteArray text =
        "# mine\r\n[Desktop Entry]\r\nType=Application\r\nName=b\r\nName[de]=B\xc3\xa4r\r\n"
        "Name[ar]=\xd8\xaf\xd8\xa8\r\nX-Other=1\r\n\r\n[Another]\r\nkey=value";
    write(QStringLiteral("menu/b.desktop"), text);
    clickItem(in("b.desktop"));
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_VERIFY(QFile::exists(in("b-2.desktop")));
    QCOMPARE(read(in("b-2.desktop")), text);
    QTRY_COMPARE(names(view(), menu()).join(QLatin1Char(' ')), QStringLiteral("Games a b b"));
}

void tst_MenuDuplication::isOfferedInTheContextMenu()
{
    clickItem(in("a.desktop"));
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        auto *menu = qobject_cast<QMenu *>(window);
        QVERIFY(menu);
        // After "Paste", by its letter.
        QStringList names;
        const QList<QAction *> actions = menu->actions();
        for (const QAction *action : actions)
            names.append(action->objectName());
        QCOMPARE(names.indexOf(QStringLiteral("duplicateAction")),
                 names.indexOf(QStringLiteral("pasteAction")) + 1);
        XDoTool::press(QStringLiteral("l"));
    });
    XDoTool::run(QStringLiteral("click 3"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QTRY_COMPARE(view().selectedPath(), in("a-2.desktop"));
}

void tst_MenuDuplication::worksWhileAFilterIsSet()
{
    view().setFilter(QStringLiteral("y"));
    QTRY_COMPARE(rows("games"), QStringLiteral("y"));
    clickItem(in("games/y.desktop"));
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(rows("games"), QStringLiteral("y y"));
    QCOMPARE(sortOrderOf(in("games")), QByteArray("*;x.desktop;deep;y.desktop;y-2.desktop;"));
    QTRY_COMPARE(view().selectedPath(), in("games/y-2.desktop"));
}

void tst_MenuDuplication::leavesTheOrderOfRecentItems()
{
    writeEntry(QStringLiteral("recents/r.desktop"), QStringLiteral("r"));
    QVERIFY(open(view(), menu(), 4));
    QVERIFY(open(view(), in("recents"), 1));
    view().expand(shown(view(), in("recents")));
    clickItem(in("recents/r.desktop"));
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(rows("recents"), QStringLiteral("r r"));
    QVERIFY(!QFile::exists(in("recents/.directory")));
}

void tst_MenuDuplication::tellsWhyItCannotBe()
{
    const ExactTree before = ExactTree::of(menu());
    QSignalSpy told(&view(), &VelMenuView::told);
    clickItem(in("games/x.desktop"));
    const WithoutPermission readOnly;
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(told.size(), 1);
    QCOMPARE(told.at(0).at(0).toString(), QStringLiteral("%1 cannot be written.").arg(in("games")));
    QCOMPARE(told.at(0).at(1).toInt(), 2);
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    // Nothing is lost when nothing is selected.
    view().clearSelection();
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTest::qWait(200);
    QCOMPARE(told.size(), 1);
}

void tst_MenuDuplication::tellsThatTheOrderWasNotSaved()
{
    QVERIFY(QFile::remove(in("games/.directory")) && QDir().mkdir(in("games/.directory")));
    QSignalSpy told(&view(), &VelMenuView::told);
    clickItem(in("games/x.desktop"));
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTRY_COMPARE(told.size(), 2);
    QVERIFY(told.at(1).at(0).toString().startsWith(
        QStringLiteral("The order of the folder %1 could not be saved.").arg(in("games"))));
    QVERIFY(QFile::exists(in("games/x-2.desktop")));
    QCOMPARE(undoText(), QStringLiteral("Undo duplication of x"));
}

void tst_MenuDuplication::isGoneWithoutAssistance()
{
    QVERIFY(duplicateAction());
    dialog()->setAssistance(false);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    QVERIFY(!duplicateAction());
    const ExactTree before = ExactTree::of(menu());
    clickItem(in("a.desktop"));
    XDoTool::press(QStringLiteral("ctrl+d"));
    QTest::qWait(300);
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

VEL_TEST_MAIN(tst_MenuDuplication)
#include "tst_MenuDuplication.moc"
