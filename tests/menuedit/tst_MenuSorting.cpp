// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FullDisk.h"
#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QDir>
#include <QFile>
#include <QLabel>
#include <QLayout>
#include <QMenu>
#include <QSignalSpy>

/// Sorting a folder by name, by hand.
class tst_MenuSorting : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void sortsTheFolderThatIsMeant_data();
    void sortsTheFolderThatIsMeant();
    void takesItBackAndDoesItAgain();
    void tellsThatItIsSortedAlready();
    void leavesOutWhatIsNotShown();
    void isDisabledWhereNobodyCanSort_data();
    void isDisabledWhereNobodyCanSort();
    void tellsThatTheOrderCannotBeSaved();
    void isThereWithAssistanceOnly();

private:
    void assist();
    void openMixed();
    void chooseSort();
    QAction *sortAction() const;
    QString told() const { return dialog()->findChild<QLabel *>(QStringLiteral("messageLabel"))->text(); }
    QString in(const char *file) const { return menu() + QLatin1Char('/') + QLatin1String(file); }
    QString rows(const QString &folder) { return names(view(), folder).join(QLatin1Char(' ')); }
};

void tst_MenuSorting::assist()
{
    dialog()->setAssistance(true);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    view().setFocus();
}

// The names are not those of the files, and the folders stand in an order of their own.
void tst_MenuSorting::openMixed()
{
    writeFolder(QString(), QStringLiteral("My menu"), "x.desktop;sub;y.desktop;apart;");
    writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"), "1.desktop;2.desktop;inner;3.desktop;");
    writeFolder(QStringLiteral("sub/inner"), QStringLiteral("Zoo"), "");
    writeFolder(QStringLiteral("apart"), QStringLiteral("Apart"), "");
    writeEntry(QStringLiteral("x.desktop"), QStringLiteral("beta"));
    writeEntry(QStringLiteral("y.desktop"), QStringLiteral("alpha"));
    writeEntry(QStringLiteral("sub/1.desktop"), QStringLiteral("two"));
    writeEntry(QStringLiteral("sub/2.desktop"), QStringLiteral("one"));
    writeEntry(QStringLiteral("sub/3.desktop"), QStringLiteral("apple"));
    openDialog(menu(), 4);
    assist();
    QCOMPARE(rows(menu()), QStringLiteral("beta Sub alpha Apart"));
}

QAction *tst_MenuSorting::sortAction() const
{
    const auto menus = view().findChildren<QMenu *>(QString(), Qt::FindDirectChildrenOnly);
    for (QMenu *menu : menus) {
        const QList<QAction *> actions = menu->actions();
        for (QAction *action : actions) {
            if (action->objectName() == QLatin1String("sortAction"))
                return action;
        }
    }
    return nullptr;
}

void tst_MenuSorting::chooseSort()
{
    ModalDriver modal;
    pickInDropMenu(modal, QStringLiteral("Sort by name"));
    XDoTool::press(QStringLiteral("Menu"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
}

void tst_MenuSorting::sortsTheFolderThatIsMeant_data()
{
    QTest::addColumn<QString>("selected");
    QTest::addColumn<bool>("isOpened");
    QTest::addColumn<QByteArray>("ofMenu");
    QTest::addColumn<QByteArray>("ofSub");
    const QByteArray menuAsItWas("x.desktop;sub;y.desktop;apart;");
    const QByteArray subAsItWas("1.desktop;2.desktop;inner;3.desktop;");
    const QByteArray sortedMenu("*;apart;sub;y.desktop;x.desktop;");
    const QByteArray sortedSub("*;inner;3.desktop;2.desktop;1.desktop;");
    QTest::newRow("a folder") << "sub" << true << menuAsItWas << sortedSub;
    QTest::newRow("a folder that nobody opened") << "sub" << false << menuAsItWas << sortedSub;
    QTest::newRow("an entry in it") << "sub/1.desktop" << true << menuAsItWas << sortedSub;
    QTest::newRow("an entry of the menu") << "x.desktop" << false << sortedMenu << subAsItWas;
    QTest::newRow("nothing") << "" << false << sortedMenu << subAsItWas;
}

void tst_MenuSorting::sortsTheFolderThatIsMeant()
{
    QFETCH(QString, selected);
    QFETCH(bool, isOpened);
    QFETCH(QByteArray, ofMenu);
    QFETCH(QByteArray, ofSub);
    openMixed();
    if (isOpened) {
        view().expand(shown(view(), in("sub")));
        QVERIFY(open(view(), in("sub"), 4));
    }
    if (!selected.isEmpty())
        clickItem(menu() + QLatin1Char('/') + selected);
    QSignalSpy changes(&view(), &VelMenuView::changed);
    chooseSort();
    QTRY_COMPARE(changes.count(), 1);
    QCOMPARE(sortOrderOf(menu()), ofMenu);
    QCOMPARE(sortOrderOf(in("sub")), ofSub);
    QCOMPARE(rows(menu()),
             ofMenu.startsWith('*') ? QStringLiteral("Apart Sub alpha beta")
                                    : QStringLiteral("beta Sub alpha Apart"));
    QVERIFY(open(view(), in("sub"), 4));
    QTRY_COMPARE(rows(in("sub")),
                 ofSub.startsWith('*') ? QStringLiteral("Zoo apple one two")
                                       : QStringLiteral("two one Zoo apple"));
    QCOMPARE(view().selectedPath(), selected.isEmpty() ? QString() : menu() + QLatin1Char('/') + selected);
    QCOMPARE(told(),
             ofMenu.startsWith('*') ? QStringLiteral("The folder My menu was sorted by name.")
                                    : QStringLiteral("The folder Sub was sorted by name."));
}

void tst_MenuSorting::takesItBackAndDoesItAgain()
{
    openMixed();
    const QByteArray before = read(in("sub/.directory"));
    clickItem(in("sub"));
    chooseSort();
    const QByteArray after = read(in("sub/.directory"));
    QVERIFY(after != before);
    QCOMPARE(view().undoAction()->text(), QStringLiteral("Undo sorting of folder Sub"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(read(in("sub/.directory")), before);
    QCOMPARE(told(), QStringLiteral("Done: Undo sorting of folder Sub"));
    QVERIFY(open(view(), in("sub"), 4));
    QTRY_COMPARE(rows(in("sub")), QStringLiteral("two one Zoo apple"));
    QCOMPARE(view().redoAction()->text(), QStringLiteral("Redo sorting of folder Sub"));
    XDoTool::press(QStringLiteral("ctrl+shift+z"));
    QTRY_COMPARE(read(in("sub/.directory")), after);
    QTRY_COMPARE(rows(in("sub")), QStringLiteral("Zoo apple one two"));
}

void tst_MenuSorting::tellsThatItIsSortedAlready()
{
    openMixed();
    clickItem(in("sub"));
    chooseSort();
    const QByteArray sorted = read(in("sub/.directory"));
    QSignalSpy changes(&view(), &VelMenuView::changed);
    chooseSort();
    QTRY_COMPARE(told(), QStringLiteral("The folder Sub is sorted by name already."));
    QCOMPARE(changes.count(), 0);
    QCOMPARE(read(in("sub/.directory")), sorted);
    // And nothing to take back but the first.
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(sortOrderOf(in("sub")), QByteArray("1.desktop;2.desktop;inner;3.desktop;"));
    QVERIFY(!view().undoAction()->isEnabled());
    // One without an order that stands by name anyway is not given one.
    writeFolder(QStringLiteral("plain"), QStringLiteral("Plain"));
    for (const char *name : {"a", "b"})
        writeEntry(QStringLiteral("plain/%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    QTRY_VERIFY(shown(view(), in("plain")).isValid());
    QVERIFY(open(view(), menu(), 5));
    clickItem(in("plain"));
    chooseSort();
    QTRY_COMPARE(told(), QStringLiteral("The folder Plain is sorted by name already."));
    QVERIFY(sortOrderOf(in("plain")).isNull());
}

void tst_MenuSorting::leavesOutWhatIsNotShown()
{
    writeFolder(QString(), QStringLiteral("Menu"), "b.desktop;h.desktop;a.desktop;");
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("a"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("b"));
    writeEntry(QStringLiteral("h.desktop"), QStringLiteral("ba"), "Exec=true\nHidden=true\n");
    writeEntry(QStringLiteral(".dot.desktop"), QStringLiteral("dot"));
    openDialog(menu(), 2);
    assist();
    chooseSort();
    QTRY_COMPARE(sortOrderOf(menu()), QByteArray("*;a.desktop;b.desktop;"));
    view().setHiddenShown(true);
    QTRY_COMPARE(rows(menu()), QStringLiteral("ba a b"));
    chooseSort();
    QTRY_COMPARE(sortOrderOf(menu()), QByteArray("*;a.desktop;b.desktop;h.desktop;"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("a b ba"));
}

void tst_MenuSorting::isDisabledWhereNobodyCanSort_data()
{
    QTest::addColumn<QString>("selected");
    QTest::addColumn<bool>("isReadOnly");
    QTest::addColumn<bool>("expected");
    QTest::newRow("a folder") << "sub" << false << true;
    QTest::newRow("read-only") << "sub" << true << false;
    QTest::newRow("an entry in a read-only folder") << "sub/a.desktop" << true << false;
    QTest::newRow("ordered by time") << "recents" << false << false;
    QTest::newRow("an entry ordered by time") << "recents/a.desktop" << false << false;
}

void tst_MenuSorting::isDisabledWhereNobodyCanSort()
{
    QFETCH(QString, selected);
    QFETCH(bool, isReadOnly);
    QFETCH(bool, expected);
    for (const char *file : {"sub/a.desktop", "recents/a.desktop"})
        writeEntry(QLatin1String(file), QStringLiteral("x"));
    openDialog(menu(), 2);
    assist();
    for (const char *folder : {"sub", "recents"}) {
        view().expand(shown(view(), in(folder)));
        QVERIFY(open(view(), in(folder), 1));
    }
    clickItem(menu() + QLatin1Char('/') + selected);
    const std::unique_ptr<WithoutPermission> nobody(isReadOnly ? new WithoutPermission : nullptr);
    if (isReadOnly)
        QVERIFY(QFile::setPermissions(in("sub"), QFile::ReadOwner | QFile::ExeOwner));
    ModalDriver modal;
    bool isEnabled = !expected;
    modal.handle([&](QWidget *menu) {
        isEnabled = sortAction()->isEnabled();
        menu->close();
    });
    XDoTool::press(QStringLiteral("Menu"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QVERIFY(QFile::setPermissions(in("sub"), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QCOMPARE(isEnabled, expected);
}

void tst_MenuSorting::tellsThatTheOrderCannotBeSaved()
{
    openMixed();
    const QByteArray before = read(in("sub/.directory"));
    clickItem(in("sub"));
    {
        const FullDisk disk;
        chooseSort();
    }
    QTRY_COMPARE(
        told(),
        QStringLiteral("The order of the folder %1 could not be saved. Make sure that the folder may "
                       "be written and that the disk is not full, then try again.")
            .arg(in("sub")));
    QCOMPARE(read(in("sub/.directory")), before);
    QVERIFY(!view().undoAction()->isEnabled());
}

void tst_MenuSorting::isThereWithAssistanceOnly()
{
    openMixed();
    QVERIFY(sortAction());
    QVERIFY(!view().actions().contains(sortAction()));
    dialog()->setAssistance(false);
    QVERIFY(!sortAction());
}

VEL_TEST_MAIN(tst_MenuSorting)
#include "tst_MenuSorting.moc"
