// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"

#include "ModalDriver.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuView.h"

#include <QAction>
#include <QFileSystemModel>
#include <QLineEdit>
#include <QPointer>
#include <QScrollBar>
#include <QSignalSpy>

#include <csignal>

#include <sys/resource.h>

namespace {

/// Lets no file grow while it lives, as a full disk does.
class FullDisk
{
public:
    FullDisk()
    {
        m_handler = std::signal(SIGXFSZ, SIG_IGN);
        getrlimit(RLIMIT_FSIZE, &m_limit);
        const rlimit none{0, m_limit.rlim_max};
        setrlimit(RLIMIT_FSIZE, &none);
    }
    ~FullDisk()
    {
        setrlimit(RLIMIT_FSIZE, &m_limit);
        std::signal(SIGXFSZ, m_handler);
    }
    Q_DISABLE_COPY_MOVE(FullDisk)

private:
    rlimit m_limit{};
    void (*m_handler)(int) = SIG_DFL;
};

} // namespace

/// Creating, editing, deleting and reordering.
class tst_VelMenuViewEdit : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void listsChildrenInTheOrderShownWithTheNewOneInItsPlace_data();
    void listsChildrenInTheOrderShownWithTheNewOneInItsPlace();
    void makesARecordForAFolderWithoutOne();
    void listsOnlyWhatIsShown();
    void keepsTheRestOfAFoldersRecord();
    void leavesARecordThatCannotBeRead_data();
    void leavesARecordThatCannotBeRead();
    void refusesToListInNoFolder();
    void movesAnItemUpAndDown_data();
    void movesAnItemUpAndDown();
    void movesNothingWithoutASelection();
    void movesInALargeFolderWithoutLosingSight();
    void namesNewItemsByTheFirstFreeNumber();
    void makesNothingInAMenuThatIsNotThere();
    void showsANewEntryByItsNameWhateverWasThereBefore();
    void writesTheRecordOfANewEntry();
    void writesTheRecordOfANewFolder();
    void putsANewItemIntoTheSelectedFolderOrBesideTheSelectedFile();
    void showsANewEntryAsItWasEdited();
    void doesNotListANewItem();
    void leavesNothingOfACancelledItem_data();
    void leavesNothingOfACancelledItem();
    void leavesWhatOthersPutIntoACancelledFolder();
    void selectsNothingAfterACancelledCreation();
    void keepsAFolderWhoseRecordCannotBeWritten();
    void goesAwayWhileANewItemIsEdited();
    void editsTheSelectedEntry();
    void editsTheRecordOfAFolder();
    void makesTheRecordOfAFolderOnlyWhenSaved();
    void editsNothingElse();
    void editsNothingWithoutASelection();
    void editsNothingThatCannotBeRead();
    void makesAnEntryThatIsGone();
    void putsAnEditedEntryIntoItsPlace();
    void hidesAnEntryThatWasEditedToBeHidden();
    void goesAwayWhileItEdits();
    void deletesAfterAsking_data();
    void deletesAfterAsking();
    void deletesALinkAndNotWhatItLeadsTo_data();
    void forgetsWhatItDeletes();
    void leavesADeletedNameInTheListUntilItIsRewritten();
    void deletesALinkAndNotWhatItLeadsTo();
    void selectsNothingWhenTheDeletedRowGoes_data();
    void selectsNothingWhenTheDeletedRowGoes();
    void goesAwayWhileItAsksToDelete();
    void forgetsMatchesWhenTheMenuChanges_data();
    void forgetsMatchesWhenTheMenuChanges();

private:
    static void fill(QWidget *dialog, const char *field, const QString &text);
    static void accept(QWidget *dialog, const QString &name = QString());
    static void reject(QWidget *dialog);
    void announceDeleteQuestion(ModalDriver &modal, QMessageBox::StandardButton answer);
    QStringList writeLetters(const char *letters, const QString &folder = QString());
};

void tst_VelMenuViewEdit::fill(QWidget *dialog, const char *field, const QString &text)
{
    auto *widget = dialog->findChild<QWidget *>(QLatin1String(field));
    QVERIFY(widget);
    auto *line = qobject_cast<QLineEdit *>(widget);
    if (!line)
        line = widget->findChild<QLineEdit *>();
    QVERIFY(line);
    line->setText(text);
}

void tst_VelMenuViewEdit::accept(QWidget *dialog, const QString &name)
{
    if (!name.isEmpty()) {
        fill(dialog, "nameEdit", name);
        fill(dialog, "localNameEdit", name);
    }
    auto *editor = qobject_cast<VelDesktopEntryEditDialog *>(dialog);
    QVERIFY(editor);
    if (!editor->windowTitle().endsWith(QLatin1String("/.directory")))
        fill(dialog, "execEdit", QStringLiteral("true"));
    editor->accept();
    QCOMPARE(editor->result(), int(QDialog::Accepted));
}

void tst_VelMenuViewEdit::reject(QWidget *dialog)
{
    qobject_cast<QDialog *>(dialog)->reject();
}

void tst_VelMenuViewEdit::announceDeleteQuestion(ModalDriver &modal, QMessageBox::StandardButton answer)
{
    modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                  QStringLiteral("Are you sure to delete it?"), QMessageBox::Yes | QMessageBox::No,
                  QMessageBox::Yes},
                 answer);
}

QStringList tst_VelMenuViewEdit::writeLetters(const char *letters, const QString &folder)
{
    QStringList paths;
    for (const char *letter = letters; *letter; ++letter)
        paths.append(writeEntry(folder + QLatin1Char(*letter) + QLatin1String(".desktop"),
                                QString(QLatin1Char(*letter)).toUpper()));
    return paths;
}

void tst_VelMenuViewEdit::listsChildrenInTheOrderShownWithTheNewOneInItsPlace_data()
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

void tst_VelMenuViewEdit::listsChildrenInTheOrderShownWithTheNewOneInItsPlace()
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

void tst_VelMenuViewEdit::listsOnlyWhatIsShown()
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

void tst_VelMenuViewEdit::makesARecordForAFolderWithoutOne()
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

void tst_VelMenuViewEdit::keepsTheRestOfAFoldersRecord()
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

void tst_VelMenuViewEdit::leavesARecordThatCannotBeRead_data()
{
    QTest::addColumn<QByteArray>("contents");
    QTest::newRow("too large") << QByteArray(1024 * 1024 + 1, 'x');
    QTest::newRow("a directory") << QByteArray();
}

void tst_VelMenuViewEdit::leavesARecordThatCannotBeRead()
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

void tst_VelMenuViewEdit::refusesToListInNoFolder()
{
    VelMenuView view(menu(), -1, true);
    QVERIFY(!view.fixSortOrderForNew(QStringLiteral("a.desktop"), 0, QModelIndex()));
    view.fixSortOrderInDir(QModelIndex(), true);
    QCOMPARE(everythingIn(menu()), QStringList());
}

void tst_VelMenuViewEdit::movesAnItemUpAndDown_data()
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

void tst_VelMenuViewEdit::movesAnItemUpAndDown()
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

void tst_VelMenuViewEdit::movesNothingWithoutASelection()
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

void tst_VelMenuViewEdit::movesInALargeFolderWithoutLosingSight()
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

void tst_VelMenuViewEdit::namesNewItemsByTheFirstFreeNumber()
{
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    for (int i = 0; i < 4; ++i)
        modal.handle([](QWidget *dialog) { accept(dialog); });
    QVERIFY(view.createNew(false));
    view.selectionModel()->clearSelection();
    QVERIFY(view.createNew(false));
    view.selectionModel()->clearSelection();
    QVERIFY(view.createNew(true));
    view.selectionModel()->clearSelection();
    QVERIFY(view.createNew(true));
    QVERIFY(modal.finished());
    QCOMPARE(
        everythingIn(menu()).join(QLatin1Char(' ')),
        QStringLiteral("group group/.directory group1 group1/.directory shortcut.desktop shortcut1.desktop"));
}

void tst_VelMenuViewEdit::makesNothingInAMenuThatIsNotThere()
{
    VelMenuView view(menu() + QLatin1String("/missing"), -1, true);
    QVERIFY(!view.rootIndex().isValid());
    QSignalSpy changes(&view, &VelMenuView::changed);
    const ModalDriver modal;
    QVERIFY(!view.createNew(false));
    QVERIFY(!view.createNew(true));
    QVERIFY(modal.finished());
    QCOMPARE(changes.count(), 0);
    QCOMPARE(everythingIn(menu()), QStringList());
}

void tst_VelMenuViewEdit::showsANewEntryByItsNameWhateverWasThereBefore()
{
    const QString path = writeEntry(QStringLiteral("shortcut.desktop"), QStringLiteral("Old"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("Old")});
    QVERIFY(QFile::remove(path)); // behind the back of the model, which keeps the name
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        QCOMPARE(shown(view, path).data().toString(), QStringLiteral("Shortcut"));
        reject(dialog);
    });
    QVERIFY(!view.createNew(false));
    QVERIFY(modal.finished());
}

void tst_VelMenuViewEdit::writesTheRecordOfANewEntry()
{
    write(QStringLiteral("menu/shortcut.desktop"), "taken");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    const QString path = menu() + QLatin1String("/shortcut1.desktop");
    QSignalSpy changes(&view, &VelMenuView::changed);
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        QCOMPARE(read(path),
                 QByteArray("[Desktop Entry]\nType=Application\nName=Shortcut1\nName[en]=Shortcut1\n"
                            "Icon=application-x-executable\n"));
        QCOMPARE(dialog->windowTitle(), QLatin1String("Desktop Entry ") + path);
        QCOMPARE(dialog->parentWidget(), &view);
        QCOMPARE(view.selectedPath(), path);
        QCOMPARE(shown(view, path).data().toString(), QStringLiteral("Shortcut1"));
        accept(dialog);
    });
    view.slotFileNew();
    QVERIFY(modal.finished());
    QCOMPARE(changes.count(), 2); // by the edit and by the creation
    QCOMPARE(view.selectedPath(), path);
    QVERIFY(read(path).contains("\nExec=true\n"));
}

void tst_VelMenuViewEdit::writesTheRecordOfANewFolder()
{
    VelMenuView view(menu(), -1, true);
    const QString path = menu() + QLatin1String("/group");
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        QCOMPARE(read(path + QLatin1String("/.directory")),
                 QByteArray("[Desktop Entry]\nType=Directory\nName=Group\nName[en]=Group\nIcon=folder\n"));
        QCOMPARE(dialog->windowTitle(),
                 QLatin1String("Desktop Entry ") + path + QLatin1String("/.directory"));
        accept(dialog);
    });
    view.slotDirNew();
    QVERIFY(modal.finished());
    QTRY_COMPARE(view.selectedPath(), path);
}

void tst_VelMenuViewEdit::putsANewItemIntoTheSelectedFolderOrBesideTheSelectedFile()
{
    const QString file = writeEntry(QStringLiteral("sub/a.desktop"), QStringLiteral("A"));
    const QString sub = menu() + QLatin1String("/sub");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QVERIFY(open(view, sub, 1));
    ModalDriver modal;
    for (const QString &place : {sub, file}) {
        select(view, place);
        modal.handle([](QWidget *dialog) { accept(dialog); });
        QVERIFY(view.createNew(false));
    }
    QCOMPARE(everythingIn(menu()).join(QLatin1Char(' ')),
             QStringLiteral("sub sub/a.desktop sub/shortcut.desktop sub/shortcut1.desktop"));
}

void tst_VelMenuViewEdit::showsANewEntryAsItWasEdited()
{
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    modal.handle([](QWidget *dialog) { accept(dialog, QStringLiteral("Xylophone")); });
    QVERIFY(view.createNew(false));
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("Xylophone")});
}

void tst_VelMenuViewEdit::doesNotListANewItem()
{
    writeFolder(QString(), QStringLiteral("Menu"), "b.desktop;a.desktop;");
    const QByteArray before = read(menu() + QLatin1String("/.directory"));
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    modal.handle([](QWidget *dialog) { accept(dialog); });
    QVERIFY(view.createNew(false));
    QCOMPARE(read(menu() + QLatin1String("/.directory")), before);
}

void tst_VelMenuViewEdit::leavesNothingOfACancelledItem_data()
{
    QTest::addColumn<bool>("folder");
    QTest::addColumn<bool>("editorSaved");
    QTest::newRow("entry") << false << false;
    QTest::newRow("folder") << true << false;
    QTest::newRow("entry that the editor wrote") << false << true;
    QTest::newRow("folder that the editor wrote") << true << true;
}

void tst_VelMenuViewEdit::leavesNothingOfACancelledItem()
{
    QFETCH(bool, folder);
    QFETCH(bool, editorSaved);
    VelMenuView view(menu(), -1, true);
    QSignalSpy changes(&view, &VelMenuView::changed);
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        if (editorSaved)
            write(folder ? QStringLiteral("menu/group/.directory") : QStringLiteral("menu/shortcut.desktop"),
                  "x");
        reject(dialog);
    });
    QVERIFY(!view.createNew(folder));
    QVERIFY(modal.finished());
    QCOMPARE(everythingIn(menu()), QStringList());
    QCOMPARE(changes.count(), 1);
}

void tst_VelMenuViewEdit::leavesWhatOthersPutIntoACancelledFolder()
{
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        writeEntry(QStringLiteral("group/mine.desktop"), QStringLiteral("Mine"));
        reject(dialog);
    });
    QVERIFY(!view.createNew(true));
    QCOMPARE(everythingIn(menu()).join(QLatin1Char(' ')), QStringLiteral("group group/mine.desktop"));
}

void tst_VelMenuViewEdit::selectsNothingAfterACancelledCreation()
{
    const QString a = writeLetters("ab").constFirst();
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 2));
    select(view, a);
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) { reject(dialog); });
    QVERIFY(!view.createNew(false));
    QVERIFY(!view.selectedItem().isValid());
    QTRY_COMPARE(names(view, menu()).size(), 2);
    QVERIFY(!view.selectedItem().isValid());
}

void tst_VelMenuViewEdit::keepsAFolderWhoseRecordCannotBeWritten()
{
    VelMenuView view(menu(), -1, true);
    QSignalSpy changes(&view, &VelMenuView::changed);
    const ModalDriver modal;
    const FullDisk full;
    QVERIFY(!view.createNew(true));
    QVERIFY(!view.createNew(false));
    QVERIFY(modal.finished());
    QCOMPARE(changes.count(), 2);
    QCOMPARE(everythingIn(menu()), QStringList{QStringLiteral("group")});
}

void tst_VelMenuViewEdit::goesAwayWhileANewItemIsEdited()
{
    auto *view = new VelMenuView(menu(), -1, true);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    QVERIFY(!view->createNew(false));
    QVERIFY(modal.finished());
    QCOMPARE(everythingIn(menu()), QStringList());
}

void tst_VelMenuViewEdit::editsTheSelectedEntry()
{
    const QString a = writeLetters("a").constFirst();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, a);
    QSignalSpy changes(&view, &VelMenuView::changed);
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        QVERIFY(qobject_cast<VelDesktopEntryEditDialog *>(dialog));
        QCOMPARE(dialog->windowTitle(), QLatin1String("Desktop Entry ") + a);
        reject(dialog);
    });
    QVERIFY(!view.slotEdit());
    QCOMPARE(changes.count(), 0);
    QCOMPARE(read(a), entryText(QStringLiteral("A")));

    modal.handle([](QWidget *dialog) { accept(dialog, QStringLiteral("New name")); });
    QVERIFY(view.slotEdit());
    QVERIFY(modal.finished());
    QCOMPARE(changes.count(), 1);
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("New name")});
    QVERIFY(view.findChildren<VelDesktopEntryEditDialog *>().isEmpty());
}

void tst_VelMenuViewEdit::editsTheRecordOfAFolder()
{
    const QString sub = writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QTRY_COMPARE(names(view, menu()), QStringList{QStringLiteral("Sub")});
    select(view, sub);
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        QCOMPARE(dialog->windowTitle(), QLatin1String("Desktop Entry ") + sub + QLatin1String("/.directory"));
        accept(dialog, QStringLiteral("Games"));
    });
    QVERIFY(view.slotEdit());
    QVERIFY(read(sub + QLatin1String("/.directory")).contains("Name=Games\n"));
    // The name that is shown was read before, and is kept for folders.
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("Sub")});
}

void tst_VelMenuViewEdit::makesTheRecordOfAFolderOnlyWhenSaved()
{
    QDir().mkpath(menu() + QLatin1String("/sub"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, menu() + QLatin1String("/sub"));
    ModalDriver modal;
    modal.handle([](QWidget *dialog) { reject(dialog); });
    QVERIFY(!view.slotEdit());
    QCOMPARE(everythingIn(menu()), QStringList{QStringLiteral("sub")});
    modal.handle([](QWidget *dialog) { accept(dialog, QStringLiteral("Sub")); });
    QVERIFY(view.slotEdit());
    QVERIFY(modal.finished());
    QVERIFY(read(menu() + QLatin1String("/sub/.directory")).contains("Type=Directory\n"));
}

void tst_VelMenuViewEdit::editsNothingElse()
{
    for (const char *name : {"notes.txt", "x.DESKTOP", "desktop"}) {
        const QString file = write(QLatin1String("menu/") + QLatin1String(name), "text");
        VelMenuView view(menu(), -1, true);
        QTRY_VERIFY(shown(view, file).isValid());
        select(view, file);
        QSignalSpy changes(&view, &VelMenuView::changed);
        ModalDriver modal;
        modal.answer({QMessageBox::Warning, QStringLiteral("Warning"),
                      QStringLiteral("Can't edit non desktop file"), QMessageBox::Ok},
                     QMessageBox::Ok);
        QVERIFY(!view.slotEdit());
        QVERIFY(modal.finished());
        QCOMPARE(changes.count(), 0);
        QCOMPARE(read(file), QByteArray("text"));
    }
}

void tst_VelMenuViewEdit::editsNothingWithoutASelection()
{
    VelMenuView view(menu(), -1, true);
    const ModalDriver modal;
    QVERIFY(!view.slotEdit());
    view.slotDel();
    QVERIFY(modal.finished());
}

void tst_VelMenuViewEdit::editsNothingThatCannotBeRead()
{
    const QByteArray contents(1024 * 1024 + 1, 'x');
    const QString path = write(QStringLiteral("menu/large.desktop"), contents);
    VelMenuView view(menu(), -1, true);
    QTRY_VERIFY(shown(view, path).isValid());
    select(view, path);
    QSignalSpy changes(&view, &VelMenuView::changed);
    ModalDriver modal;
    modal.handle([](QWidget *box) {
        QCOMPARE(box->windowTitle(), QStringLiteral("Warning"));
        reject(box);
    });
    QVERIFY(!view.slotEdit());
    QVERIFY(modal.finished());
    QCOMPARE(changes.count(), 0);
    QCOMPARE(read(path), contents);
    QVERIFY(view.findChildren<VelDesktopEntryEditDialog *>().isEmpty());
}

void tst_VelMenuViewEdit::makesAnEntryThatIsGone()
{
    const QString path = writeLetters("a").constFirst();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, path);
    QVERIFY(QFile::remove(path));
    ModalDriver modal;
    modal.handle([](QWidget *dialog) { accept(dialog, QStringLiteral("Anew")); });
    QVERIFY(view.slotEdit());
    QVERIFY(modal.finished());
    QVERIFY(read(path).contains("\nName=Anew\n"));
}

void tst_VelMenuViewEdit::putsAnEditedEntryIntoItsPlace()
{
    const QString a = writeLetters("abc").constFirst();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    QTRY_COMPARE(names(view, menu()).join(QString()), QStringLiteral("ABC"));
    select(view, a);
    ModalDriver modal;
    modal.handle([](QWidget *dialog) { accept(dialog, QStringLiteral("Z")); });
    QVERIFY(view.slotEdit());
    QCOMPARE(names(view, menu()).join(QString()), QStringLiteral("BCZ"));
    QCOMPARE(view.selectedPath(), a);
}

void tst_VelMenuViewEdit::hidesAnEntryThatWasEditedToBeHidden()
{
    const QString a = writeLetters("ab").constFirst();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    select(view, a);
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        write(QStringLiteral("menu/a.desktop"), entryText(QStringLiteral("A"), "Exec=true\nHidden=true\n"));
        qobject_cast<QDialog *>(dialog)->done(QDialog::Accepted);
    });
    QVERIFY(view.slotEdit());
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("B")});
}

void tst_VelMenuViewEdit::goesAwayWhileItEdits()
{
    const QString a = writeLetters("a").constFirst();
    auto *view = new VelMenuView(menu(), -1, true);
    QVERIFY(open(*view, menu(), 1));
    select(*view, a);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    QVERIFY(!view->slotEdit());
    QVERIFY(modal.finished());
    QCOMPARE(read(a), entryText(QStringLiteral("A")));
}

void tst_VelMenuViewEdit::deletesAfterAsking_data()
{
    QTest::addColumn<QString>("item");
    QTest::addColumn<QString>("rest");
    QTest::newRow("entry") << "a.desktop"
                           << "notes.txt sub sub/.directory sub/b.desktop sub/deep sub/deep/c.desktop";
    QTest::newRow("other file") << "notes.txt"
                                << "a.desktop sub sub/.directory sub/b.desktop sub/deep sub/deep/c.desktop";
    QTest::newRow("folder") << "sub"
                            << "a.desktop notes.txt";
}

void tst_VelMenuViewEdit::deletesAfterAsking()
{
    QFETCH(QString, item);
    QFETCH(QString, rest);
    writeLetters("a");
    writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"));
    writeLetters("b", QStringLiteral("sub/"));
    writeLetters("c", QStringLiteral("sub/deep/"));
    write(QStringLiteral("menu/notes.txt"), "x");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    select(view, menu() + QLatin1Char('/') + item);
    QSignalSpy changes(&view, &VelMenuView::changed);
    const QStringList before = everythingIn(menu());
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::No);
    view.slotDel();
    QCOMPARE(everythingIn(menu()), before);
    QCOMPARE(changes.count(), 0);
    modal.handle([](QWidget *box) { QTest::keyClick(box, Qt::Key_Escape); });
    view.slotDel();
    QCOMPARE(everythingIn(menu()), before);

    announceDeleteQuestion(modal, QMessageBox::Yes);
    view.slotDel();
    QVERIFY(modal.finished());
    QCOMPARE(everythingIn(menu()).join(QLatin1Char(' ')), rest);
    QCOMPARE(changes.count(), 1);
    QVERIFY(!view.selectedItem().isValid());
    QTRY_COMPARE(names(view, menu()).size(), 2);
}

void tst_VelMenuViewEdit::forgetsWhatItDeletes()
{
    const QString a = writeLetters("a").constFirst();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("A")});
    select(view, a);
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::Yes);
    view.slotDel();
    QVERIFY(modal.finished());
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("Another"));
    QTRY_COMPARE(names(view, menu()), QStringList{QStringLiteral("Another")});
}

void tst_VelMenuViewEdit::leavesADeletedNameInTheListUntilItIsRewritten()
{
    writeFolder(QString(), QStringLiteral("Menu"), "c.desktop;b.desktop;a.desktop;");
    const QString b = writeLetters("abc").at(1);
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    select(view, b);
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::Yes);
    view.slotDel();
    QVERIFY(modal.finished());
    QCOMPARE(sortOrderOf(menu()), QByteArray("c.desktop;b.desktop;a.desktop;"));
    QTRY_COMPARE(names(view, menu()), QStringList({QStringLiteral("C"), QStringLiteral("A")}));
    select(view, menu() + QLatin1String("/a.desktop"));
    view.slotUp();
    QCOMPARE(sortOrderOf(menu()), QByteArray("*;a.desktop;c.desktop;"));
}

void tst_VelMenuViewEdit::deletesALinkAndNotWhatItLeadsTo_data()
{
    QTest::addColumn<bool>("toFolder");
    QTest::newRow("to a file") << false;
    QTest::newRow("to a folder") << true;
}

void tst_VelMenuViewEdit::deletesALinkAndNotWhatItLeadsTo()
{
    QFETCH(bool, toFolder);
    const QString target = write(QStringLiteral("outside/precious.desktop"), entryText(QStringLiteral("P")));
    const QString link = menu() + (toFolder ? QLatin1String("/link") : QLatin1String("/link.desktop"));
    QVERIFY(QFile::link(toFolder ? path(QStringLiteral("outside")) : target, link));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, link);
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::Yes);
    view.slotDel();
    QVERIFY(modal.finished());
    QCOMPARE(everythingIn(menu()), QStringList());
    QCOMPARE(read(target), entryText(QStringLiteral("P")));
}

void tst_VelMenuViewEdit::selectsNothingWhenTheDeletedRowGoes_data()
{
    QTest::addColumn<QString>("item");
    QTest::addColumn<QString>("keyboardAt");
    QTest::newRow("first") << "a"
                           << "b.desktop";
    QTest::newRow("middle") << "b"
                            << "c.desktop";
    QTest::newRow("last") << "c"
                          << "b.desktop";
}

void tst_VelMenuViewEdit::selectsNothingWhenTheDeletedRowGoes()
{
    QFETCH(QString, item);
    QFETCH(QString, keyboardAt);
    writeLetters("abc");
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 3));
    QTRY_COMPARE(names(view, menu()).join(QString()), QStringLiteral("ABC"));
    select(view, menu() + QLatin1Char('/') + item + QLatin1String(".desktop"));
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::Yes);
    view.slotDel();
    QTRY_COMPARE(names(view, menu()).size(), 2);
    QVERIFY(!view.selectedItem().isValid());
    QVERIFY(!action(view, QStringLiteral("deleteAction"))->isEnabled());
    QCOMPARE(view.currentIndex(), shown(view, menu() + QLatin1Char('/') + keyboardAt));
    view.slotDel();
    QVERIFY(modal.finished());
    QCOMPARE(everythingIn(menu()).size(), 2);
}

void tst_VelMenuViewEdit::goesAwayWhileItAsksToDelete()
{
    const QString a = writeLetters("a").constFirst();
    auto *view = new VelMenuView(menu(), -1, true);
    QVERIFY(open(*view, menu(), 1));
    select(*view, a);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    view->slotDel();
    QVERIFY(modal.finished());
    QVERIFY(QFile::exists(a));
}

void tst_VelMenuViewEdit::forgetsMatchesWhenTheMenuChanges_data()
{
    QTest::addColumn<QString>("operation");
    for (const char *name : {"up", "down", "edit", "delete", "new"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_VelMenuViewEdit::forgetsMatchesWhenTheMenuChanges()
{
    QFETCH(QString, operation);
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit b"));
    writeEntry(QStringLiteral("c.desktop"), QStringLiteral("hit c"));
    const QString last = writeEntry(QStringLiteral("d.desktop"), QStringLiteral("other"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 4));
    ModalDriver modal;
    modal.handle([](QWidget *dialog) {
        dialog->findChild<QLineEdit *>()->setText(QStringLiteral("hit"));
        qobject_cast<QDialog *>(dialog)->accept();
    });
    view.slotFind();
    const QString first = view.selectedPath();
    QCOMPARE(first, menu() + QLatin1String("/a.desktop"));
    select(view, last);
    if (operation == QLatin1String("up"))
        view.slotUp();
    else if (operation == QLatin1String("down"))
        view.slotDown();
    else if (operation == QLatin1String("delete"))
        announceDeleteQuestion(modal, QMessageBox::Yes), view.slotDel();
    else
        modal.handle([](QWidget *dialog) { accept(dialog); });
    if (operation == QLatin1String("edit"))
        QVERIFY(view.slotEdit());
    if (operation == QLatin1String("new"))
        QVERIFY(view.createNew(false));
    // With the former matches kept, the second would come.
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), first);
}

VEL_TEST_MAIN(tst_VelMenuViewEdit)
#include "tst_VelMenuViewEdit.moc"
