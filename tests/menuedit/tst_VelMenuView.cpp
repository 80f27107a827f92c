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
#include <QSignalSpy>
#include <QSortFilterProxyModel>

#include <fstream>
#include <memory>
#include <string>

/// What a view shows, and how.
class tst_VelMenuView : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void showsNothingAndMakesNothingWhereThereIsNoDirectory();
    void showsNothingWhenTheDirectoryIsAFile();
    void showsADirectoryThatAppearsLater_data();
    void showsADirectoryThatAppearsLater();
    void showsADirectoryThatComesBack();
    void showsADirectoryThatReplacedAnother();
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
    void sortsAnewWhenToldThatAnOrderChanged();
    void passesOnThatFilesWereDropped();
    void startsAfreshOnAnotherDirectory();
    void goesAwayWhileItLoads();
    void assistsWhenTold();
    void isNamedForThoseWhoCannotSeeIt();
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

void tst_VelMenuView::showsADirectoryThatAppearsLater_data()
{
    QTest::addColumn<QString>("directory");
    QTest::addColumn<bool>("isEditable");
    QTest::newRow("the last part is missing") << "menu/later" << true;
    QTest::newRow("several parts are missing") << "menu/none/of/it" << true;
    QTest::newRow("to pick from") << "menu/later" << false;
}

void tst_VelMenuView::showsADirectoryThatAppearsLater()
{
    QFETCH(QString, directory);
    QFETCH(bool, isEditable);
    QDir().mkpath(menu());
    VelMenuView view(path(directory), -1, isEditable);
    view.show();
    QVERIFY(!view.rootIndex().isValid());
    // One after the other, as a program would that makes them.
    const QStringList parts = directory.split(QLatin1Char('/'));
    for (int i = 2; i <= parts.size(); ++i) {
        QDir().mkpath(path(parts.mid(0, i).join(QLatin1Char('/'))));
        QTest::qWait(50);
    }
    write(directory + QLatin1String("/a.desktop"), entryText(QStringLiteral("A")));
    QTRY_COMPARE(names(view, path(directory)), QStringList{QStringLiteral("A")});
    QVERIFY(view.indexAt(QPoint(5, 5)).isValid());
    QDir().mkpath(path(directory) + QLatin1String("/sub"));
    QTRY_COMPARE(names(view, path(directory)).size(), 2);
}

void tst_VelMenuView::showsADirectoryThatComesBack()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 1));
    for (const char *name : {"B", "C"}) {
        QVERIFY(QDir(menu()).removeRecursively());
        QTRY_VERIFY(names(view, menu()).isEmpty());
        writeEntry(QStringLiteral("b.desktop"), QLatin1String(name));
        QTRY_COMPARE(names(view, menu()), QStringList{QLatin1String(name)});
    }
}

void tst_VelMenuView::showsADirectoryThatReplacedAnother()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    write(QStringLiteral("other/b.desktop"), entryText(QStringLiteral("B")));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 1));
    QVERIFY(QDir().rename(menu(), path(QStringLiteral("former"))));
    QVERIFY(QDir().rename(path(QStringLiteral("other")), menu()));
    QTRY_COMPARE(names(view, menu()), QStringList{QStringLiteral("B")});
    writeEntry(QStringLiteral("c.desktop"), QStringLiteral("C"));
    QTRY_COMPARE(names(view, menu()).size(), 2);
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

void tst_VelMenuView::goesAwayWhileItLoads()
{
    for (int i = 0; i < 300; ++i)
        writeEntry(QStringLiteral("e%1.desktop").arg(i), QStringLiteral("E"));
    for (int round = 0; round < 5; ++round) {
        auto view = std::make_unique<VelMenuView>(menu(), -1, true);
        view->show();
        const QPointer<QAbstractItemModel> rows = view->model();
        const QPointer<QFileSystemModel> entries = files(*view);
        // Further on in its loading each time.
        for (int i = 0; i < round; ++i)
            QCoreApplication::processEvents();
        view.reset();
        QVERIFY(!rows && !entries);
    }
    QCoreApplication::processEvents();
}

void tst_VelMenuView::assistsWhenTold()
{
    VelMenuView view(menu(), -1, true);
    QCOMPARE(view.property("assistance"), QVariant(false));
    QVERIFY(view.setProperty("assistance", true));
    QVERIFY(view.assistance());
    view.init(menu(), -1, true, nullptr);
    QVERIFY(view.assistance());
    view.setAssistance(false);
    QCOMPARE(view.property("assistance"), QVariant(false));
}

void tst_VelMenuView::isNamedForThoseWhoCannotSeeIt()
{
    VelMenuView view(menu(), -1, true);
    QCOMPARE(view.accessibleName(), QStringLiteral("Menu"));
    view.setAccessibleName(QStringLiteral("Start menu"));
    view.init(menu(), -1, true, nullptr);
    QCOMPARE(view.accessibleName(), QStringLiteral("Start menu"));
}

VEL_TEST_MAIN(tst_VelMenuView)
#include "tst_VelMenuView.moc"
