// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"
#include "ExactTree.h"
#include "ModalDriver.h"
#include "OrdinaryUser.h"
#include "VelMenuView.h"

#include <menuedit/StepText.h>

#include <QAction>
#include <QDir>
#include <QFileSystemModel>
#include <QMenu>
#include <QSignalSpy>

#include <memory>

/// What a view remembers, refuses and asks.
class tst_VelMenuViewHistory : public EditTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void hasNoneWithoutAssistance();
    void hasNoneToLookAtOnly();
    void offersItsCommandsInTheContextMenu();
    void forgetsEverythingWhenItShowsAnotherMenu();
    void asksOnlyWhereThereIsNoTrash_data();
    void asksOnlyWhereThereIsNoTrash();
    void asksNothingAboutAFolderThatMayNotBeWritten();
    void keepsWhatStandsInTheTrashAlready();
    void tellsWhyItRefuses();
    void dropsWhatCanNeverBeUndone();
    void forgetsWhatWasUndoneWhenSomethingElseIsDone();
    void remembersNothingOfACanceledEditor();
    void countsWhatAFolderHolds_data();
    void countsWhatAFolderHolds();
    void opensTheFolderOfWhatIsBack();
    void worksWhileAFilterIsSet();
    void deletesALinkAndNotWhatItLeadsTo();
    void leavesTheDefaultMenuWhereNothingWasBuilt();
    void bringsTheMenuBackThatALinkLeadsTo();
    void keepsFoldersOpenWhenTheMenuIsAnotherOne();
    void takesAMenuAwayThatWasTheFirst();
    void deletesSeveralInOneStep();
    void namesEveryStep_data();
    void namesEveryStep();

private:
    std::unique_ptr<VelMenuView> make();
    static void remove(VelMenuView &view, const QString &path);
    static void rebuild(VelMenuView &view);
    QString trash() const { return path(QStringLiteral("data/Trash")); }

    QByteArray m_dataHome;
    QString m_a;
};

void tst_VelMenuViewHistory::init()
{
    EditTestCase::init();
    m_dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
    m_a = writeLetters("abc").constFirst();
    writeFolder(QString(), QStringLiteral("Menu"), "c.desktop;b.desktop;a.desktop;");
}

void tst_VelMenuViewHistory::cleanup()
{
    qputenv("XDG_DATA_HOME", m_dataHome);
    EditTestCase::cleanup();
}

std::unique_ptr<VelMenuView> tst_VelMenuViewHistory::make()
{
    auto view = std::make_unique<VelMenuView>(menu(), -1, true);
    view->setAssistance(true);
    view->resize(300, 300);
    view->show();
    open(*view, menu(), QDir(menu()).entryList(QDir::AllEntries | QDir::NoDotAndDotDot).size());
    return view;
}

void tst_VelMenuViewHistory::remove(VelMenuView &view, const QString &path)
{
    select(view, path);
    view.slotDel();
}

void tst_VelMenuViewHistory::rebuild(VelMenuView &view)
{
    ModalDriver modal;
    modal.answer({QMessageBox::Question, QStringLiteral("Warning"),
                  QStringLiteral("All previous shortcuts\nwill be lost. Are you sure?"),
                  QMessageBox::Ok | QMessageBox::Cancel, QMessageBox::Ok},
                 QMessageBox::Ok);
    view.slotRecreate();
    QVERIFY(modal.finished());
}

void tst_VelMenuViewHistory::hasNoneWithoutAssistance()
{
    const auto view = make();
    const int actions = view->actions().size();
    remove(*view, m_a);
    view->setAssistance(false);
    QVERIFY(!view->undoAction() && !view->redoAction());
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::No);
    remove(*view, menu() + QStringLiteral("/b.desktop"));
    QVERIFY(modal.finished());

    view->setAssistance(true);
    QVERIFY(!view->undoAction()->isEnabled());
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo"));
    QCOMPARE(view->redoAction()->text(), QStringLiteral("Redo"));
    QCOMPARE(view->actions().size(), actions);
    QVERIFY(!view->actions().contains(view->undoAction()));
}

void tst_VelMenuViewHistory::hasNoneToLookAtOnly()
{
    VelMenuView view(menu(), -1, false);
    view.setAssistance(true);
    QVERIFY(!view.undoAction() && !view.redoAction());
}

void tst_VelMenuViewHistory::offersItsCommandsInTheContextMenu()
{
    const auto view = make();
    const auto *menuOfView = view->findChild<QMenu *>();
    QCOMPARE(menuOfView->actions().value(0), view->undoAction());
    QCOMPARE(menuOfView->actions().value(1), view->redoAction());
    view->setAssistance(false);
    QCOMPARE(menuOfView->actions().value(0)->objectName(), QStringLiteral("dirNewAction"));
}

void tst_VelMenuViewHistory::forgetsEverythingWhenItShowsAnotherMenu()
{
    const auto view = make();
    remove(*view, m_a);
    QVERIFY(view->undoAction()->isEnabled());
    view->init(menu(), -1, true, nullptr);
    QVERIFY(view->assistance());
    QVERIFY(!view->undoAction()->isEnabled());
}

void tst_VelMenuViewHistory::asksOnlyWhereThereIsNoTrash_data()
{
    QTest::addColumn<bool>("isSure");
    QTest::newRow("yes") << true;
    QTest::newRow("no") << false;
}

void tst_VelMenuViewHistory::asksOnlyWhereThereIsNoTrash()
{
    QFETCH(bool, isSure);
    const auto view = make();
    remove(*view, menu() + QStringLiteral("/b.desktop"));
    QVERIFY(!QFile::exists(menu() + QStringLiteral("/b.desktop")));
    QVERIFY(QDir(trash()).removeRecursively());
    write(QStringLiteral("data/Trash"), "no folder");

    QSignalSpy changes(view.get(), &VelMenuView::changed);
    ModalDriver modal;
    modal.answer({QMessageBox::Warning, QStringLiteral("Attention"),
                  QStringLiteral("There is no trash for A. It would be deleted for good: this cannot be "
                                 "undone. Delete it?"),
                  QMessageBox::Yes | QMessageBox::No, QMessageBox::No},
                 isSure ? QMessageBox::Yes : QMessageBox::No);
    remove(*view, m_a);
    QVERIFY(modal.finished());

    QCOMPARE(QFile::exists(m_a), !isSure);
    QCOMPARE(changes.count(), isSure ? 1 : 0);
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo deletion of B"));
}

// The trash is not what is missing, and no answer would help.
void tst_VelMenuViewHistory::asksNothingAboutAFolderThatMayNotBeWritten()
{
    const QString fixed =
        QFileInfo(writeEntry(QStringLiteral("fixed/x.desktop"), QStringLiteral("X"))).path();
    const auto view = make();
    QSignalSpy told(view.get(), &VelMenuView::told);
    {
        const OrdinaryUser user(folder());
        QVERIFY(QFile::setPermissions(fixed, QFile::ReadOwner | QFile::ExeOwner));
        remove(*view, fixed);
        QVERIFY(QFile::setPermissions(fixed, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    }
    QCOMPARE(told.value(0),
             QVariantList({QStringLiteral("%1 cannot be deleted: Permission denied").arg(fixed), 2}));
    QVERIFY(QFile::exists(fixed + QStringLiteral("/x.desktop")));
    QVERIFY(!view->undoAction()->isEnabled());
}

void tst_VelMenuViewHistory::keepsWhatStandsInTheTrashAlready()
{
    const QString old = write(QStringLiteral("data/Trash/files/a.desktop"), "of another day");
    const QByteArray bytes = read(m_a);
    const auto view = make();
    remove(*view, m_a);
    QCOMPARE(everythingIn(trash() + QStringLiteral("/files")).size(), 2);
    view->undoAction()->trigger();
    QCOMPARE(read(m_a), bytes);
    QCOMPARE(read(old), QByteArray("of another day"));
    QCOMPARE(everythingIn(trash() + QStringLiteral("/files")).size(), 1);
    QTRY_COMPARE(names(*view, menu()),
                 QStringList({QStringLiteral("C"), QStringLiteral("B"), QStringLiteral("A")}));
    QCOMPARE(view->selectedPath(), m_a);
}

void tst_VelMenuViewHistory::tellsWhyItRefuses()
{
    const auto view = make();
    QSignalSpy told(view.get(), &VelMenuView::told);
    remove(*view, m_a);
    QCOMPARE(told.takeLast(), QVariantList({QStringLiteral("A was deleted."), 0}));
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("Theirs"));
    const ExactTree before = ExactTree::of(menu());
    QSignalSpy changes(view.get(), &VelMenuView::changed);

    view->undoAction()->trigger();

    QCOMPARE(told.takeLast(),
             QVariantList({QStringLiteral("Nothing was undone: There is another %1 by now.").arg(m_a), 2}));
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    QCOMPARE(changes.count(), 0);
    // It can be undone when the place is free again.
    QVERIFY(QFile::remove(m_a));
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo deletion of A"));
    view->undoAction()->trigger();
    QVERIFY(QFile::exists(m_a));
}

void tst_VelMenuViewHistory::dropsWhatCanNeverBeUndone()
{
    const auto view = make();
    QSignalSpy told(view.get(), &VelMenuView::told);
    remove(*view, menu() + QStringLiteral("/b.desktop"));
    remove(*view, m_a);
    QVERIFY(QFile::remove(trash() + QStringLiteral("/files/a.desktop")));

    view->undoAction()->trigger();

    QCOMPARE(
        told.takeLast(),
        QVariantList({QStringLiteral("Nothing was undone: a.desktop is not in the trash any more."), 2}));
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo deletion of B"));
    QVERIFY(!view->redoAction()->isEnabled());
    view->undoAction()->trigger();
    QVERIFY(QFile::exists(menu() + QStringLiteral("/b.desktop")));
}

void tst_VelMenuViewHistory::forgetsWhatWasUndoneWhenSomethingElseIsDone()
{
    const auto view = make();
    remove(*view, m_a);
    view->undoAction()->trigger();
    QCOMPARE(view->redoAction()->text(), QStringLiteral("Redo deletion of A"));
    remove(*view, menu() + QStringLiteral("/c.desktop"));
    QVERIFY(!view->redoAction()->isEnabled());
    QCOMPARE(view->redoAction()->text(), QStringLiteral("Redo"));
}

void tst_VelMenuViewHistory::remembersNothingOfACanceledEditor()
{
    const auto view = make();
    for (const bool isNew : {true, false}) {
        ModalDriver modal;
        modal.handle(reject);
        select(*view, m_a);
        if (isNew)
            view->slotFileNew();
        else
            view->slotEdit();
        QVERIFY(modal.finished());
        QVERIFY(!view->undoAction()->isEnabled());
    }
}

void tst_VelMenuViewHistory::countsWhatAFolderHolds_data()
{
    QTest::addColumn<int>("count");
    QTest::addColumn<QString>("text");
    QTest::newRow("none") << 0 << QStringLiteral("Undo deletion of folder Games (0 entries)");
    QTest::newRow("one") << 1 << QStringLiteral("Undo deletion of folder Games (1 entry)");
    QTest::newRow("twelve") << 12 << QStringLiteral("Undo deletion of folder Games (12 entries)");
}

void tst_VelMenuViewHistory::countsWhatAFolderHolds()
{
    QFETCH(int, count);
    QFETCH(QString, text);
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"));
    for (int i = 0; i < count; ++i)
        writeEntry(QStringLiteral("games/%1.desktop").arg(i), QStringLiteral("Game"));
    const auto view = make();
    remove(*view, menu() + QStringLiteral("/games"));
    QCOMPARE(view->undoAction()->text(), text);
}

void tst_VelMenuViewHistory::opensTheFolderOfWhatIsBack()
{
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"), "y.desktop;x.desktop;");
    writeLetters("xy", QStringLiteral("games/"));
    const QString x = menu() + QStringLiteral("/games/x.desktop");
    const auto view = make();
    QVERIFY(open(*view, menu() + QStringLiteral("/games"), 2));
    remove(*view, x);
    remove(*view, menu() + QStringLiteral("/games"));
    QTRY_COMPARE(names(*view, menu()).size(), 3);
    view->undoAction()->trigger();
    view->undoAction()->trigger();
    QCOMPARE(view->selectedPath(), x);
    QVERIFY(view->isExpanded(shown(*view, menu() + QStringLiteral("/games"))));
    QTRY_COMPARE(names(*view, menu() + QStringLiteral("/games")),
                 QStringList({QStringLiteral("Y"), QStringLiteral("X")}));
    // And the view goes on to see what happens there.
    writeEntry(QStringLiteral("games/z.desktop"), QStringLiteral("Z"));
    QTRY_COMPARE(names(*view, menu() + QStringLiteral("/games")).size(), 3);
}

void tst_VelMenuViewHistory::worksWhileAFilterIsSet()
{
    const auto view = make();
    remove(*view, m_a);
    view->setFilter(QStringLiteral("b"));
    QTRY_COMPARE(names(*view, menu()), QStringList{QStringLiteral("B")});
    view->undoAction()->trigger();
    QVERIFY(QFile::exists(m_a));
    QTRY_COMPARE(names(*view, menu()), QStringList({QStringLiteral("B"), QStringLiteral("A")}));
    QCOMPARE(view->selectedPath(), m_a);
    view->redoAction()->trigger();
    QTRY_COMPARE(names(*view, menu()), QStringList{QStringLiteral("B")});
}

void tst_VelMenuViewHistory::deletesALinkAndNotWhatItLeadsTo()
{
    write(QStringLiteral("outside/o.desktop"), entryText(QStringLiteral("O")));
    QVERIFY(QFile::link(path(QStringLiteral("outside")), menu() + QStringLiteral("/led")));
    const ExactTree before = ExactTree::of(menu());
    const auto view = make();
    remove(*view, menu() + QStringLiteral("/led"));
    QVERIFY(!QFileInfo(menu() + QStringLiteral("/led")).isSymLink());
    QVERIFY(QFile::exists(path(QStringLiteral("outside/o.desktop"))));
    view->undoAction()->trigger();
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

void tst_VelMenuViewHistory::leavesTheDefaultMenuWhereNothingWasBuilt()
{
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("none"))));
    write(QStringLiteral("config/startmenu/old.desktop"), entryText(QStringLiteral("Old")));
    write(QStringLiteral("config/startmenu.previous/older.desktop"), entryText(QStringLiteral("Older")));
    const ExactTree before = ExactTree::of(path(QStringLiteral("config")));
    VelMenuView view(QString(), -1, true);
    view.setAssistance(true);
    expectWarning(QStringLiteral("VelMenuView: can't create the start menu"));
    rebuild(view);
    QCOMPARE(before.difference(ExactTree::of(path(QStringLiteral("config")))), QString());
    QVERIFY(!view.undoAction()->isEnabled());
}

void tst_VelMenuViewHistory::bringsTheMenuBackThatALinkLeadsTo()
{
    write(QStringLiteral("apps/applications/p.desktop"),
          entryText(QStringLiteral("Piano"), "Exec=true\nCategories=Game;\n"));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("apps"))));
    write(QStringLiteral("real/old.desktop"), entryText(QStringLiteral("Old")));
    QDir().mkpath(path(QStringLiteral("config")));
    QVERIFY(QFile::link(path(QStringLiteral("real")), startMenu()));
    const ExactTree before = ExactTree::of(path(QStringLiteral("real")));
    VelMenuView view(QString(), -1, true);
    view.setAssistance(true);
    view.show();
    QVERIFY(open(view, startMenu(), 1));
    rebuild(view);
    QTRY_COMPARE(names(view, startMenu()), QStringList{QStringLiteral("Games")});
    QVERIFY(QFileInfo(startMenu()).isSymLink());

    view.undoAction()->trigger();

    QCOMPARE(before.difference(ExactTree::of(path(QStringLiteral("real")))), QString());
    QVERIFY(QFileInfo(startMenu()).isSymLink());
    QTRY_COMPARE(names(view, startMenu()), QStringList{QStringLiteral("Old")});
    view.redoAction()->trigger();
    QTRY_COMPARE(names(view, startMenu()), QStringList{QStringLiteral("Games")});
}

void tst_VelMenuViewHistory::keepsFoldersOpenWhenTheMenuIsAnotherOne()
{
    write(QStringLiteral("apps/applications/p.desktop"),
          entryText(QStringLiteral("Piano"), "Exec=true\nCategories=Game;\n"));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("apps"))));
    write(QStringLiteral("config/startmenu/Game/old.desktop"), entryText(QStringLiteral("Old")));
    write(QStringLiteral("config/startmenu/Other/o.desktop"), entryText(QStringLiteral("O")));
    const QString game = startMenu() + QStringLiteral("/Game");
    VelMenuView view(QString(), -1, true);
    view.setAssistance(true);
    view.show();
    QVERIFY(open(view, startMenu(), 2));
    QVERIFY(open(view, game, 1));
    rebuild(view);
    QTRY_COMPARE(names(view, game), QStringList{QStringLiteral("Piano")});
    QTRY_VERIFY(view.isExpanded(shown(view, game)));

    view.undoAction()->trigger();

    QTRY_COMPARE(names(view, game), QStringList{QStringLiteral("Old")});
    QTRY_VERIFY(view.isExpanded(shown(view, game)));
    QVERIFY(!view.isExpanded(shown(view, startMenu() + QStringLiteral("/Other"))));
}

void tst_VelMenuViewHistory::takesAMenuAwayThatWasTheFirst()
{
    write(QStringLiteral("apps/applications/p.desktop"),
          entryText(QStringLiteral("Piano"), "Exec=true\nCategories=Game;\n"));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("apps"))));
    VelMenuView view(QString(), -1, true);
    view.setAssistance(true);
    view.show();
    rebuild(view);
    QVERIFY(QFileInfo(startMenu()).isDir());
    view.undoAction()->trigger();
    QVERIFY(!QFileInfo::exists(startMenu()));
    QCOMPARE(view.undoAction()->text(), QStringLiteral("Undo"));
    view.redoAction()->trigger();
    QTRY_COMPARE(names(view, startMenu()), QStringList{QStringLiteral("Games")});
}

void tst_VelMenuViewHistory::deletesSeveralInOneStep()
{
    const auto view = make();
    view->setSelectionMode(QAbstractItemView::ExtendedSelection);
    const ExactTree before = ExactTree::of(menu());
    const QStringList paths{menu() + QStringLiteral("/c.desktop"), m_a};
    select(*view, paths.constFirst());
    view->selectionModel()->select(shown(*view, m_a), QItemSelectionModel::Select);
    view->slotDel();
    QCOMPARE(everythingIn(menu()), QStringList({QStringLiteral(".directory"), QStringLiteral("b.desktop")}));
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo deletion of 2 items"));
    view->undoAction()->trigger();
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo"));
    QTRY_COMPARE(view->selectionModel()->selectedIndexes().size(), 2);
}

void tst_VelMenuViewHistory::namesEveryStep_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QStringList>("texts");
    using Kind = StepText::Kind;
    const auto row = [](Kind kind, const char *undo, const char *redo, const char *done) {
        QTest::newRow(undo) << int(kind)
                            << QStringList{QString::fromLatin1(undo), QString::fromLatin1(redo),
                                           QString::fromLatin1(done)};
    };
    row(Kind::Create, "Undo creation of 5%2 %1", "Redo creation of 5%2 %1", "5%2 %1 was created.");
    row(Kind::Edit, "Undo change of 5%2 %1", "Redo change of 5%2 %1", "5%2 %1 was changed.");
    row(Kind::Delete, "Undo deletion of 5%2 %1", "Redo deletion of 5%2 %1", "5%2 %1 was deleted.");
    row(Kind::DeleteFolder, "Undo deletion of folder 5%2 %1 (3 entries)",
        "Redo deletion of folder 5%2 %1 (3 entries)", "The folder 5%2 %1 was deleted (3 entries).");
    row(Kind::DeleteItems, "Undo deletion of 3 items", "Redo deletion of 3 items", "3 items were deleted.");
    row(Kind::DeleteFolders, "Undo deletion of 5%2 %1 items (3 entries)",
        "Redo deletion of 5%2 %1 items (3 entries)", "5%2 %1 items were deleted (3 entries).");
    row(Kind::ReorderItems, "Undo reordering of 3 items", "Redo reordering of 3 items",
        "3 items have other places.");
    row(Kind::HideItems, "Undo hiding of 3 items", "Redo hiding of 3 items",
        "3 items are hidden: the menu no longer shows them.");
    row(Kind::ShowItemsAgain, "Undo showing 3 items again", "Redo showing 3 items again",
        "The menu shows 3 items again.");
    row(Kind::Move, "Undo moving of 5%2 %1 to %1 B", "Redo moving of 5%2 %1 to %1 B",
        "5%2 %1 was moved to %1 B.");
    row(Kind::MoveItems, "Undo moving of 3 items to %1 B", "Redo moving of 3 items to %1 B",
        "3 items were moved to %1 B.");
    row(Kind::Copy, "Undo copying of 5%2 %1 to %1 B", "Redo copying of 5%2 %1 to %1 B",
        "5%2 %1 was copied to %1 B.");
    row(Kind::CopyItems, "Undo copying of 3 items to %1 B", "Redo copying of 3 items to %1 B",
        "3 items were copied to %1 B.");
    row(Kind::Reorder, "Undo reordering of 5%2 %1", "Redo reordering of 5%2 %1", "5%2 %1 has another place.");
    row(Kind::Rebuild, "Undo default menu", "Redo default menu", "The default menu was built.");
    row(Kind::Sort, "Undo sorting of folder 5%2 %1", "Redo sorting of folder 5%2 %1",
        "The folder 5%2 %1 was sorted by name.");
}

// Names are shown as they are, whatever they hold.
void tst_VelMenuViewHistory::namesEveryStep()
{
    QFETCH(int, kind);
    QFETCH(QStringList, texts);
    const StepText text(StepText::Kind(kind), QStringLiteral("5%2 %1"), 3, QStringLiteral("%1 B"));
    QCOMPARE(QStringList({text.undo(), text.redo(), text.done()}), texts);
}

VEL_TEST_MAIN(tst_VelMenuViewHistory)
#include "tst_VelMenuViewHistory.moc"
