// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"

#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QAction>
#include <QContextMenuEvent>
#include <QFileSystemModel>
#include <QMenu>
#include <QMouseEvent>
#include <QPointer>
#include <QProcess>
#include <QPushButton>
#include <QScrollBar>
#include <QSignalSpy>
#include <QSortFilterProxyModel>
#include <QStandardPaths>

#include <fstream>
#include <memory>
#include <string>

/// Building, selecting, showing, running and rebuilding.
class tst_VelMenuView : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void showsNothingAndMakesNothingWhereThereIsNoDirectory();
    void showsNothingWhenTheDirectoryIsAFile();
    void staysEmptyWhenTheDirectoryVanishes();
    void showsAFolderThatCannotBeReadAsEmpty();
    void survivesOddFiles();
    void showsTheStartMenuByDefault();
    void showsTheDirectoryGiven();
    void looksAsAMenuDoes();
    void setsTheIconSize();
    void editsOnlyWhenTold();
    void beginsADragOfARowOnlyWhenEditable();
    void opensTheEditorOnADoubleClickOnlyWhenEditable();
    void sortsAsTheMenuDoes();
    void tellsWhatIsSelected();
    void showsAndSelectsAnItemInAFolderNeverOpened();
    void scrollsToAnItemThatArrivesLater();
    void selectsNothingThatIsNoItemOfTheMenu();
    void selectsAgainWhatAnOlderListingTookAway();
    void selectsNoNeighbourOfARowThatGoes();
    void goesAwayBeforeItScrolls();
    void sortsAnewWhenToldThatAnOrderChanged();
    void passesOnThatFilesWereDropped();
    void startsAfreshOnAnotherDirectory();
    void opensTheSelectedEntry();
    void tellsWhenItCannotOpenTheSelectedEntry();
    void opensNothingWithoutASelection();
    void leavesTheStartedProgramRunningWhenItGoesAway();
    void goesAwayWhileItTellsThatNothingStarted();
    void rebuildsTheStartMenuAfterAsking();
    void leavesTheStartMenuWhenToldSo();
    void leavesTheStartMenuWhenItCannotBeRebuilt();
    void goesAwayWhileItAsksToRebuild();
    void goesAwayWhileItLoads();

private:
    void installOpener(const QByteArray &script);
};

void tst_VelMenuView::showsNothingAndMakesNothingWhereThereIsNoDirectory()
{
    const QString missing = path(QStringLiteral("config/none/deeper"));
    VelMenuView view(missing, -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    // Looked at from above, the directory would bring in the whole file system.
    view.doItemsLayout();
    QVERIFY(!view.indexAt(QPoint(5, 5)).isValid());
    QCOMPARE(view.menuDir(), missing);
    QVERIFY(!view.createNew(false));
    QVERIFY(!view.createNew(true));
    QVERIFY(!view.findAndSelect(false));
    QVERIFY(!QFileInfo::exists(path(QStringLiteral("config"))));
}

void tst_VelMenuView::showsNothingWhenTheDirectoryIsAFile()
{
    const QString file = write(QStringLiteral("plain"), "text");
    VelMenuView view(file, -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(!view.indexAt(QPoint(5, 5)).isValid());
    QCOMPARE(read(file), QByteArray("text"));
}

void tst_VelMenuView::staysEmptyWhenTheDirectoryVanishes()
{
    const QString entry = writeEntry(QStringLiteral("sub/a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 1));
    QVERIFY(open(view, menu() + QLatin1String("/sub"), 1));
    // Somebody watches the directory above, too, so that the menu's own row goes away.
    files(view)->fetchMore(files(view)->index(folder()));
    QTRY_VERIFY(files(view)->rowCount(files(view)->index(folder())) > 0);
    select(view, entry);
    QVERIFY(QDir(menu()).removeRecursively());
    QTRY_VERIFY(!files(view)->index(menu()).isValid());
    QTRY_VERIFY(!view.indexAt(QPoint(5, 5)).isValid());
    view.setActionsEnabled();
    QVERIFY(!view.findAndSelect(false));
    QVERIFY(!view.createNew(false));
    QVERIFY(!QFileInfo::exists(menu()));
}

void tst_VelMenuView::showsAFolderThatCannotBeReadAsEmpty()
{
    writeEntry(QStringLiteral("closed/a.desktop"), QStringLiteral("A"));
    const QString closed = menu() + QLatin1String("/closed");
    QVERIFY(QFile::setPermissions(closed, QFile::Permissions()));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    view.expand(shown(view, closed));
    QTRY_COMPARE(names(view, menu()), QStringList{QStringLiteral("closed")});
    QVERIFY(QFile::setPermissions(closed, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
}

void tst_VelMenuView::survivesOddFiles()
{
    QDir().mkpath(menu() + QLatin1String("/folder.desktop"));
    QDir().mkpath(menu() + QLatin1String("/odd/.directory"));
    QVERIFY(QFile::link(QStringLiteral("nowhere"), menu() + QLatin1String("/dangling.desktop")));
    QVERIFY(QFile::link(QStringLiteral("."), menu() + QLatin1String("/loop")));
    writeEntry(QStringLiteral("garbage.desktop"), QStringLiteral("x"));
    write(QStringLiteral("menu/garbage.desktop"), QByteArray(1024 * 1024 + 1, '\xff'));
    writeEntry(QStringLiteral("new\nline.desktop"), QStringLiteral("Line"));
    // Made without Qt, which cannot name it.
    const std::string raw = menu().toStdString() + "/raw\xff.desktop";
    std::ofstream(raw) << "[Desktop Entry]\nType=Application\nName=Raw\nExec=true\n";
    QVERIFY(std::ifstream(raw).is_open());
    VelMenuView view(menu(), -1, true);
    view.resize(300, 300);
    view.show();
    QVERIFY(open(view, menu(), 5));
    view.expandAll();
    QTest::qWait(0);
    view.grab();
    QVERIFY(!view.selectedItem().isValid());
    QVERIFY(std::ifstream(raw).is_open());
}

void tst_VelMenuView::showsTheStartMenuByDefault()
{
    const VelMenuView view;
    QCOMPARE(view.menuDir(), startMenu());
    QVERIFY(view.actions().isEmpty());

    QDir().mkpath(startMenu());
    VelMenuView editable(QString(), -1, true);
    QCOMPARE(editable.menuDir(), startMenu());
    QVERIFY(action(editable, QStringLiteral("recreateAction")));
    QCOMPARE(files(editable)->filePath(proxy(editable)->mapToSource(editable.rootIndex())), startMenu());

    QWidget parent;
    const auto *child = new VelMenuView(&parent);
    QCOMPARE(child->parentWidget(), &parent);
    QCOMPARE(child->menuDir(), startMenu());
}

void tst_VelMenuView::showsTheDirectoryGiven()
{
    QDir().mkpath(startMenu());
    const VelMenuView view(menu(), -1, true);
    QCOMPARE(view.menuDir(), menu());
    QVERIFY(!action(view, QStringLiteral("recreateAction")));
    QCOMPARE(files(view)->filePath(proxy(view)->mapToSource(view.rootIndex())), menu());
    // A path that is written in another way is another directory.
    const VelMenuView other(startMenu() + QLatin1Char('/'), -1, true);
    QVERIFY(!action(other, QStringLiteral("recreateAction")));
}

void tst_VelMenuView::looksAsAMenuDoes()
{
    const VelMenuView view(menu(), -1, false);
    QVERIFY(view.isHeaderHidden());
    QVERIFY(view.uniformRowHeights());
    QCOMPARE(view.defaultDropAction(), Qt::MoveAction);
    QVERIFY(view.isSortingEnabled());
    QCOMPARE(proxy(view)->sortColumn(), 0);
    QCOMPARE(proxy(view)->sortOrder(), Qt::DescendingOrder);
    QCOMPARE(view.model()->parent(), &view);
    QCOMPARE(files(view)->parent(), nullptr);
}

void tst_VelMenuView::setsTheIconSize()
{
    const VelMenuView large(menu(), 48, false);
    QCOMPARE(large.iconSize(), QSize(48, 48));
    const VelMenuView plain(menu(), -1, false);
    QCOMPARE(plain.iconSize(), QTreeView().iconSize());
}

void tst_VelMenuView::editsOnlyWhenTold()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView browser(menu(), -1, false);
    QVERIFY(open(browser, menu(), 1));
    QVERIFY(browser.actions().isEmpty());
    QVERIFY(!browser.findChild<QMenu *>());
    QVERIFY(files(browser)->isReadOnly());
    QVERIFY(!browser.dragEnabled());
    QCOMPARE(browser.dragDropMode(), QAbstractItemView::NoDragDrop);
    QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(2, 2), browser.mapToGlobal(QPoint(2, 2)));
    browser.contextMenuEvent(&event);
    QVERIFY(!event.isAccepted());
    QSignalSpy selections(&browser, QOverload<const QString &>::of(&VelMenuView::selectionChanged));
    select(browser, menu() + QLatin1String("/a.desktop"));
    QCOMPARE(selections.count(), 1);
    browser.setActionsEnabled();

    const VelMenuView editor(menu(), -1, true);
    QVERIFY(!files(editor)->isReadOnly());
    QVERIFY(editor.dragEnabled());
    QVERIFY(editor.acceptDrops());
    QVERIFY(editor.showDropIndicator());
    QCOMPARE(editor.dragDropMode(), QAbstractItemView::DragDrop);
    QVERIFY(!(files(editor)->index(menu() + QLatin1String("/a.desktop")).flags() & Qt::ItemIsEditable));
}

void tst_VelMenuView::beginsADragOfARowOnlyWhenEditable()
{
    class CountingView : public VelMenuView
    {
    public:
        using VelMenuView::VelMenuView;
        int drags = 0;

    protected:
        void startDrag(Qt::DropActions) override { ++drags; }
    };
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    for (const bool editable : {true, false}) {
        CountingView view(menu(), -1, editable);
        view.resize(300, 300);
        view.show();
        QVERIFY(open(view, menu(), 1));
        const QPoint from = view.visualRect(shown(view, a)).center();
        QTest::mousePress(view.viewport(), Qt::LeftButton, Qt::NoModifier, from);
        for (int step = 1; step <= 3; ++step) {
            const QPoint to = from + QPoint(0, step * QApplication::startDragDistance());
            QMouseEvent move(QEvent::MouseMove, to, view.viewport()->mapToGlobal(to), Qt::NoButton,
                             Qt::LeftButton, Qt::NoModifier);
            QApplication::sendEvent(view.viewport(), &move);
        }
        QTest::mouseRelease(view.viewport(), Qt::LeftButton, Qt::NoModifier, from);
        QCOMPARE(view.drags, editable ? 1 : 0);
    }
}

void tst_VelMenuView::opensTheEditorOnADoubleClickOnlyWhenEditable()
{
    const QString plain = write(QStringLiteral("menu/notes.txt"), "text");
    for (const bool editable : {false, true}) {
        VelMenuView view(menu(), -1, editable);
        view.show();
        QVERIFY(open(view, menu(), 1));
        select(view, plain);
        ModalDriver modal;
        if (editable)
            modal.answer({QMessageBox::Warning, QStringLiteral("Warning"),
                          QStringLiteral("Can't edit non desktop file"), QMessageBox::Ok},
                         QMessageBox::Ok);
        Q_EMIT view.doubleClicked(shown(view, plain));
        QVERIFY(modal.finished());
    }
}

void tst_VelMenuView::sortsAsTheMenuDoes()
{
    writeFolder(QString(), QStringLiteral("Menu"), "c.desktop;*;a.desktop;");
    for (const char *name : {"a", "b", "c"})
        writeEntry(QLatin1String(name) + QLatin1String(".desktop"), QString::fromLatin1(name).toUpper());
    writeFolder(QStringLiteral("z"), QStringLiteral("Zoo"));
    VelMenuView view(menu(), -1, false);
    QVERIFY(open(view, menu(), 4));
    QTRY_COMPARE(
        names(view, menu()),
        (QStringList{QStringLiteral("C"), QStringLiteral("Zoo"), QStringLiteral("B"), QStringLiteral("A")}));
}

void tst_VelMenuView::tellsWhatIsSelected()
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

void tst_VelMenuView::showsAndSelectsAnItemInAFolderNeverOpened()
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

void tst_VelMenuView::scrollsToAnItemThatArrivesLater()
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

void tst_VelMenuView::selectsNothingThatIsNoItemOfTheMenu()
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

void tst_VelMenuView::selectsAgainWhatAnOlderListingTookAway()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 2));
    view.showAndSelect(b);
    // What the model does with a listing made before the item.
    QVERIFY(QMetaObject::invokeMethod(files(view), "_q_directoryChanged", Q_ARG(QString, menu()),
                                      Q_ARG(QStringList, QStringList{QStringLiteral("a.desktop")})));
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("A")});
    QVERIFY(!view.selectedItem().isValid());
    writeEntry(QStringLiteral("c.desktop"), QStringLiteral("C"));
    QTRY_COMPARE(view.selectedPath(), b);
}

void tst_VelMenuView::selectsNoNeighbourOfARowThatGoes()
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

void tst_VelMenuView::goesAwayBeforeItScrolls()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    auto view = std::make_unique<VelMenuView>(menu(), -1, true);
    QVERIFY(open(*view, menu(), 1));
    view->showAndSelect(a);
    view.reset();
    QTest::qWait(0);
}

void tst_VelMenuView::sortsAnewWhenToldThatAnOrderChanged()
{
    for (const char *name : {"a", "b"})
        writeEntry(QLatin1String(name) + QLatin1String(".desktop"), QString::fromLatin1(name).toUpper());
    VelMenuView view(menu(), -1, false);
    QVERIFY(open(view, menu(), 2));
    QTRY_COMPARE(names(view, menu()), (QStringList{QStringLiteral("A"), QStringLiteral("B")}));
    writeFolder(QString(), QStringLiteral("Menu"), "b.desktop;a.desktop;");
    view.invalidateSortOrder(files(view)->index(menu()));
    QCOMPARE(names(view, menu()), (QStringList{QStringLiteral("B"), QStringLiteral("A")}));
}

void tst_VelMenuView::passesOnThatFilesWereDropped()
{
    VelMenuView view(menu(), -1, true);
    QSignalSpy changes(&view, &VelMenuView::changed);
    QVERIFY(QMetaObject::invokeMethod(files(view), "changed"));
    QCOMPARE(changes.count(), 1);
}

void tst_VelMenuView::startsAfreshOnAnotherDirectory()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    write(QStringLiteral("other/b.desktop"), entryText(QStringLiteral("B")));
    const QString other = path(QStringLiteral("other"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QPointer<QAbstractItemModel> former(view.model());
    const int actions = view.actions().size();

    view.init(other, 32, true, nullptr);
    QVERIFY(!former);
    QVERIFY(open(view, other, 1));
    QCOMPARE(names(view, other), QStringList{QStringLiteral("B")});
    QCOMPARE(view.actions().size(), actions);
    QCOMPARE(view.findChildren<QMenu *>(QString(), Qt::FindDirectChildrenOnly).size(), 1);
    QSignalSpy selections(&view, QOverload<const QString &>::of(&VelMenuView::selectionChanged));
    select(view, other + QLatin1String("/b.desktop"));
    QCOMPARE(selections.count(), 1);

    QWidget parent;
    view.init(other, 32, false, &parent);
    QCOMPARE(view.parentWidget(), &parent);
    QVERIFY(view.actions().isEmpty());
    QVERIFY(!view.dragEnabled());
    QVERIFY(!view.acceptDrops());
    QCOMPARE(view.dragDropMode(), QAbstractItemView::NoDragDrop);
    view.setParent(nullptr);
}

void tst_VelMenuView::installOpener(const QByteArray &script)
{
    const QString program = write(QStringLiteral("bin/vel-open"), "#!/bin/sh\n" + script);
    QVERIFY(QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))) + ":/usr/bin:/bin");
}

void tst_VelMenuView::opensTheSelectedEntry()
{
    const QString log = path(QStringLiteral("log"));
    installOpener("printf '%s|' \"$@\" >'" + QFile::encodeName(log) + ".part'\nmv '" + QFile::encodeName(log)
                  + ".part' '" + QFile::encodeName(log) + "'\n");
    const QString entry = writeEntry(QStringLiteral("with blank %1.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, entry);
    view.slotExe();
    QTRY_VERIFY(QFile::exists(log));
    QCOMPARE(read(log), "--exec|" + QFile::encodeName(entry) + '|');
    QTRY_VERIFY(!view.findChild<QProcess *>());
}

void tst_VelMenuView::tellsWhenItCannotOpenTheSelectedEntry()
{
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("empty"))));
    const QString entry = writeEntry(QStringLiteral("a %1 %2.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, entry);
    ModalDriver modal;
    modal.answer({QMessageBox::Warning, QStringLiteral("Warning"),
                  QStringLiteral("Can't start:\nvel-open --exec ") + entry, QMessageBox::Ok},
                 QMessageBox::Ok);
    view.slotExe();
    QVERIFY(modal.finished());
    QVERIFY(!view.findChild<QProcess *>());
    QCOMPARE(view.selectedPath(), entry);
    qputenv("PATH", "/usr/bin:/bin");
}

void tst_VelMenuView::opensNothingWithoutASelection()
{
    const QString log = path(QStringLiteral("log"));
    installOpener(">'" + QFile::encodeName(log) + "'\n");
    VelMenuView view(menu(), -1, true);
    view.slotExe();
    QVERIFY(!view.findChild<QProcess *>());
}

void tst_VelMenuView::leavesTheStartedProgramRunningWhenItGoesAway()
{
    const QString go = path(QStringLiteral("go"));
    const QString log = path(QStringLiteral("log"));
    installOpener("while [ ! -e '" + QFile::encodeName(go)
                  + "' ]; do sleep 0.05; done\n"
                    "echo alive >'"
                  + QFile::encodeName(log) + "'\n");
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    QPointer<QProcess> started;
    {
        VelMenuView view(menu(), -1, true);
        QVERIFY(open(view, menu(), 1));
        select(view, entry);
        view.slotExe();
        started = view.findChild<QProcess *>();
    }
    QVERIFY(started);
    write(QStringLiteral("go"), "");
    QTRY_VERIFY(QFile::exists(log));
    // It has gone when the program had.
    QTRY_VERIFY(!started);
}

void tst_VelMenuView::goesAwayWhileItTellsThatNothingStarted()
{
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("empty"))));
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    auto *view = new VelMenuView(menu(), -1, true);
    QVERIFY(open(*view, menu(), 1));
    select(*view, entry);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    view->slotExe();
    QVERIFY(modal.finished());
    qputenv("PATH", "/usr/bin:/bin");
}

void tst_VelMenuView::rebuildsTheStartMenuAfterAsking()
{
    write(QStringLiteral("data/applications/x.desktop"),
          entryText(QStringLiteral("Xylophone"), "Exec=true\nCategories=Game;\n"));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("data"))));
    write(QStringLiteral("config/startmenu/old.desktop"), entryText(QStringLiteral("Old")));
    VelMenuView view(QString(), -1, true);
    view.show();
    QVERIFY(open(view, startMenu(), 1));
    select(view, startMenu() + QLatin1String("/old.desktop"));
    QSignalSpy changes(&view, &VelMenuView::changed);
    QSignalSpy selections(&view, QOverload<const QString &>::of(&VelMenuView::selectionChanged));

    ModalDriver modal;
    modal.answer({QMessageBox::Question, QStringLiteral("Warning"),
                  QStringLiteral("All previous shortcuts\nwill be lost. Are you sure?"),
                  QMessageBox::Ok | QMessageBox::Cancel, QMessageBox::Ok},
                 QMessageBox::Ok);
    view.slotRecreate();
    QVERIFY(modal.finished());
    QCOMPARE(changes.count(), 1);
    QVERIFY(!view.selectedItem().isValid());
    QCOMPARE(selections.takeLast().constFirst().toString(), QString());
    QVERIFY(!QGuiApplication::overrideCursor());
    QTRY_VERIFY(!names(view, startMenu()).isEmpty());
    QVERIFY(!names(view, startMenu()).contains(QStringLiteral("Old")));
    QVERIFY(!QFile::exists(startMenu() + QLatin1String("/old.desktop")));

    // What is made in the new directory shows, so it is the new one that is watched.
    write(QStringLiteral("config/startmenu/later.desktop"), entryText(QStringLiteral("Later")));
    QTRY_VERIFY(names(view, startMenu()).contains(QStringLiteral("Later")));
    select(view, startMenu() + QLatin1String("/later.desktop"));
    QVERIFY(action(view, QStringLiteral("editAction"))->isEnabled());
    QVERIFY(QMetaObject::invokeMethod(files(view), "changed"));
    QCOMPARE(changes.count(), 2);
    qputenv("XDG_DATA_DIRS", "/usr/local/share:/usr/share");
}

void tst_VelMenuView::leavesTheStartMenuWhenToldSo()
{
    write(QStringLiteral("config/startmenu/old.desktop"), entryText(QStringLiteral("Old")));
    VelMenuView view(QString(), -1, true);
    QVERIFY(open(view, startMenu(), 1));
    QSignalSpy changes(&view, &VelMenuView::changed);
    for (const bool escape : {false, true}) {
        ModalDriver modal;
        modal.handle([escape](QWidget *window) {
            if (escape)
                QTest::keyClick(window, Qt::Key_Escape);
            else
                qobject_cast<QMessageBox *>(window)->button(QMessageBox::Cancel)->click();
        });
        view.slotRecreate();
        QVERIFY(modal.finished());
    }
    QCOMPARE(changes.count(), 0);
    QCOMPARE(names(view, startMenu()), QStringList{QStringLiteral("Old")});
    QVERIFY(QFile::exists(startMenu() + QLatin1String("/old.desktop")));
}

void tst_VelMenuView::leavesTheStartMenuWhenItCannotBeRebuilt()
{
    write(QStringLiteral("config/startmenu"), "in the way");
    VelMenuView view(QString(), -1, true);
    ModalDriver modal;
    modal.handle(
        [](QWidget *window) { qobject_cast<QMessageBox *>(window)->button(QMessageBox::Ok)->click(); });
    expectWarning(QStringLiteral("VelMenuView: can't create the start menu"));
    view.slotRecreate();
    QVERIFY(modal.finished());
    QVERIFY(!QGuiApplication::overrideCursor());
    QCOMPARE(read(startMenu()), QByteArray("in the way"));
    QVERIFY(!view.selectedItem().isValid());
    QVERIFY(!view.rootIndex().isValid() || view.model()->rowCount(view.rootIndex()) == 0);
}

void tst_VelMenuView::goesAwayWhileItAsksToRebuild()
{
    write(QStringLiteral("config/startmenu/old.desktop"), entryText(QStringLiteral("Old")));
    auto *view = new VelMenuView(QString(), -1, true);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    view->slotRecreate();
    QVERIFY(modal.finished());
    QVERIFY(QFile::exists(startMenu() + QLatin1String("/old.desktop")));
}

void tst_VelMenuView::goesAwayWhileItLoads()
{
    for (int i = 0; i < 300; ++i)
        writeEntry(QStringLiteral("e%1.desktop").arg(i), QStringLiteral("E"));
    for (int round = 0; round < 5; ++round) {
        auto view = std::make_unique<VelMenuView>(menu(), -1, true);
        view->show();
        if (round > 0)
            QTest::qWait(round);
        view.reset();
    }
    QTest::qWait(0);
}

VEL_TEST_MAIN(tst_VelMenuView)
#include "tst_VelMenuView.moc"
