// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"

#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QAction>
#include <QMessageBox>
#include <QSignalSpy>

#include <sys/stat.h>
#include <unistd.h>

/// Deleting.
class tst_VelMenuViewDelete : public EditTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void deletesAfterAsking_data();
    void deletesAfterAsking();
    void forgetsWhatItDeletes();
    void leavesADeletedNameInTheListUntilItIsRewritten();
    void listsADeletedItemNoMoreWhileItsRowStands_data();
    void listsADeletedItemNoMoreWhileItsRowStands();
    void deletesALinkAndNotWhatItLeadsTo_data();
    void deletesALinkAndNotWhatItLeadsTo();
    void selectsNothingWhenTheDeletedRowGoes_data();
    void selectsNothingWhenTheDeletedRowGoes();
    void leavesTheKeyboardAtTheFolderOfAnOnlyChild_data();
    void leavesTheKeyboardAtTheFolderOfAnOnlyChild();
    void deletesNamesThatAreNoText();
    void goesAwayWhileItAsksToDelete();
};

void tst_VelMenuViewDelete::deletesAfterAsking_data()
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

void tst_VelMenuViewDelete::deletesAfterAsking()
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

void tst_VelMenuViewDelete::forgetsWhatItDeletes()
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

void tst_VelMenuViewDelete::leavesADeletedNameInTheListUntilItIsRewritten()
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

void tst_VelMenuViewDelete::listsADeletedItemNoMoreWhileItsRowStands_data()
{
    QTest::addColumn<QString>("item");
    QTest::newRow("file") << "b.desktop";
    QTest::newRow("folder") << "sub";
}

void tst_VelMenuViewDelete::listsADeletedItemNoMoreWhileItsRowStands()
{
    QFETCH(QString, item);
    writeFolder(QString(), QStringLiteral("Menu"), "c.desktop;b.desktop;sub;a.desktop;");
    writeLetters("abc");
    writeLetters("d", QStringLiteral("sub/"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 4));
    select(view, menu() + QLatin1Char('/') + item);
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::Yes);
    view.slotDel();
    QVERIFY(modal.finished());
    select(view, menu() + QLatin1String("/a.desktop"));
    view.slotUp();
    QCOMPARE(names(view, menu()).size(), 4);
    QVERIFY(!sortOrderOf(menu()).contains(item.toUtf8()));
    // What was selected meanwhile stays so when the row goes.
    QTRY_COMPARE(names(view, menu()).size(), 3);
    QCOMPARE(view.selectedPath(), menu() + QLatin1String("/a.desktop"));
}

void tst_VelMenuViewDelete::deletesALinkAndNotWhatItLeadsTo_data()
{
    QTest::addColumn<bool>("toFolder");
    QTest::newRow("to a file") << false;
    QTest::newRow("to a folder") << true;
}

void tst_VelMenuViewDelete::deletesALinkAndNotWhatItLeadsTo()
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

void tst_VelMenuViewDelete::selectsNothingWhenTheDeletedRowGoes_data()
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

void tst_VelMenuViewDelete::selectsNothingWhenTheDeletedRowGoes()
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

void tst_VelMenuViewDelete::leavesTheKeyboardAtTheFolderOfAnOnlyChild_data()
{
    QTest::addColumn<QString>("item");
    QTest::addColumn<QString>("keyboardAt");
    QTest::newRow("in a folder") << "sub/a.desktop"
                                 << "/sub";
    QTest::newRow("in the menu itself") << "sub" << QString();
}

void tst_VelMenuViewDelete::leavesTheKeyboardAtTheFolderOfAnOnlyChild()
{
    QFETCH(QString, item);
    QFETCH(QString, keyboardAt);
    writeLetters("a", QStringLiteral("sub/"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QVERIFY(open(view, menu() + QLatin1String("/sub"), 1));
    select(view, menu() + QLatin1Char('/') + item);
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::Yes);
    view.slotDel();
    QVERIFY(modal.finished());
    QVERIFY(!view.selectedItem().isValid());
    QCOMPARE(view.currentIndex(), keyboardAt.isEmpty() ? QModelIndex() : shown(view, menu() + keyboardAt));
    QVERIFY(view.currentIndex() != view.rootIndex());
}

void tst_VelMenuViewDelete::deletesNamesThatAreNoText()
{
    writeLetters("b", QStringLiteral("sub/"));
    const QByteArray sub = QFile::encodeName(menu() + QLatin1String("/sub"));
    QCOMPARE(mkdir((sub + "/bad\xff").constData(), 0777), 0);
    QCOMPARE(mknod((sub + "/bad\xff/no\xfe.desktop").constData(), S_IFREG | 0600, 0), 0);
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, menu() + QLatin1String("/sub"));
    ModalDriver modal;
    announceDeleteQuestion(modal, QMessageBox::Yes);
    view.slotDel();
    QVERIFY(modal.finished());
    QVERIFY(access(sub.constData(), F_OK) != 0);
    QTRY_COMPARE(names(view, menu()), QStringList());
}

void tst_VelMenuViewDelete::goesAwayWhileItAsksToDelete()
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

VEL_TEST_MAIN(tst_VelMenuViewDelete)
#include "tst_VelMenuViewDelete.moc"
