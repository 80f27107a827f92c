// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"
#include "FullDisk.h"
#include "ModalDriver.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuView.h"

#include <QDir>
#include <QFileSystemModel>
#include <QLineEdit>
#include <QSignalSpy>

/// Creating and editing.
class tst_VelMenuViewEdit : public EditTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void namesNewItemsByTheFirstFreeNumber();
    void makesNothingInAMenuThatIsNotThere();
    void showsANewEntryByItsNameWhateverWasThereBefore();
    void writesTheRecordOfANewEntry();
    void writesTheRecordOfANewFolder();
    void putsANewItemIntoTheSelectedFolderOrBesideTheSelectedFile();
    void showsANewEntryAsItWasEdited();
    void showsANewFolderAsItWasNamed();
    void showsANewEntryWhereAHiddenOneWas();
    void doesNotListANewItem();
    void leavesNothingOfACanceledItem_data();
    void leavesNothingOfACanceledItem();
    void leavesWhatOthersPutIntoACanceledFolder();
    void selectsNothingAfterACanceledCreation();
    void keepsAFolderWhoseRecordCannotBeWritten();
    void goesAwayWhileANewItemIsEdited();
    void editsTheSelectedEntry();
    void passesItsAssistanceToTheEditor();
    void editsTheRecordOfAFolder();
    void makesTheRecordOfAFolderOnlyWhenSaved();
    void editsNothingElse();
    void editsNothingWithoutASelection();
    void editsNothingThatCannotBeRead();
    void makesAnEntryThatIsGone();
    void putsAnEditedEntryIntoItsPlace();
    void hidesAnEntryThatWasEditedToBeHidden();
    void goesAwayWhileItEdits();
    void forgetsMatchesWhenTheMenuChanges_data();
    void forgetsMatchesWhenTheMenuChanges();
};

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

void tst_VelMenuViewEdit::showsANewFolderAsItWasNamed()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    ModalDriver modal;
    modal.handle([](QWidget *dialog) { accept(dialog, QStringLiteral("Games")); });
    QVERIFY(view.createNew(true));
    QVERIFY(modal.finished());
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("Games")});
}

void tst_VelMenuViewEdit::showsANewEntryWhereAHiddenOneWas()
{
    const QString path =
        writeEntry(QStringLiteral("shortcut.desktop"), QStringLiteral("Old"), "Exec=true\nHidden=true\n");
    writeLetters("a");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QVERIFY(QFile::remove(path)); // behind the back of the model
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        QVERIFY(shown(view, path).isValid());
        QCOMPARE(view.selectedPath(), path);
        accept(dialog, QStringLiteral("New"));
    });
    QVERIFY(view.createNew(false));
    QVERIFY(modal.finished());
    QCOMPARE(names(view, menu()).join(QLatin1Char(' ')), QStringLiteral("A New"));
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

void tst_VelMenuViewEdit::leavesNothingOfACanceledItem_data()
{
    QTest::addColumn<bool>("folder");
    QTest::addColumn<bool>("editorSaved");
    QTest::newRow("entry") << false << false;
    QTest::newRow("folder") << true << false;
    QTest::newRow("entry that the editor wrote") << false << true;
    QTest::newRow("folder that the editor wrote") << true << true;
}

void tst_VelMenuViewEdit::leavesNothingOfACanceledItem()
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

void tst_VelMenuViewEdit::leavesWhatOthersPutIntoACanceledFolder()
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

void tst_VelMenuViewEdit::selectsNothingAfterACanceledCreation()
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

void tst_VelMenuViewEdit::passesItsAssistanceToTheEditor()
{
    const QString a = writeLetters("a").constFirst();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, a);
    ModalDriver modal;
    for (const bool isAssisted : {true, false}) {
        view.setAssistance(isAssisted);
        modal.handle([&](QWidget *dialog) {
            QCOMPARE(qobject_cast<VelDesktopEntryEditDialog *>(dialog)->assistance(), isAssisted);
            reject(dialog);
        });
        QVERIFY(!view.slotEdit());
    }
    QVERIFY(modal.finished());
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
    QCOMPARE(names(view, menu()), QStringList{QStringLiteral("Games")});
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
