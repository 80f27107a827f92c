// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FindTestCase.h"
#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QElapsedTimer>
#include <QFileSystemModel>
#include <QInputDialog>
#include <QLineEdit>

/// Searching the tree.
class tst_VelMenuViewFind : public FindTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void doesNothingWithoutAText();
    void doesNothingAfterACanceledQuestion();
    void offersTheLastTextAgain();
    void findsAnywhereInShownNamesWithoutRegardToCase_data();
    void findsAnywhereInShownNamesWithoutRegardToCase();
    void findsSoonWhateverTheTextMeans();
    void findsInFoldersThatWereNeverOpened();
    void findsBeforeTheFirstFolderWasRead();
    void findsInTheOrderShown();
    void goesOnAndWrapsWithoutAMessage();
    void searchesAnewWhenTheMatchesWereDropped();
    void bringsTheMatchIntoSight();
    void tellsWhenNothingMatches();
    void findsNeitherTheMenuNorItsNeighbors();
    void doesNotFollowLinksInCircles();
    void passesOverFoldersThatCannotBeRead();
};

void tst_VelMenuViewFind::doesNothingWithoutAText()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, a);
    const ModalDriver modal;
    view.slotFindNext();
    QVERIFY(!view.findAndSelect(false));
    QVERIFY(!view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), a);
    QVERIFY(modal.finished());
}

void tst_VelMenuViewFind::doesNothingAfterACanceledQuestion()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    find(view, QStringLiteral("a"));
    QCOMPARE(view.selectedPath(), a);
    view.selectionModel()->clearSelection();
    ModalDriver modal;
    modal.handle([](QWidget *window) { qobject_cast<QDialog *>(window)->reject(); });
    view.slotFind();
    QVERIFY(modal.finished());
    QVERIFY(!view.selectedItem().isValid());
    // The text is gone, too.
    view.slotFindNext();
    QVERIFY(!view.selectedItem().isValid());
}

void tst_VelMenuViewFind::offersTheLastTextAgain()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("a"));
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        auto *dialog = qobject_cast<QInputDialog *>(window);
        QVERIFY(dialog);
        QCOMPARE(dialog->windowTitle(), QStringLiteral("Find"));
        QCOMPARE(dialog->labelText(), QStringLiteral("Find string:"));
        QCOMPARE(dialog->textEchoMode(), QLineEdit::Normal);
        QCOMPARE(dialog->textValue(), QStringLiteral("a"));
        dialog->reject();
    });
    view.slotFind();
    QVERIFY(modal.finished());
}

void tst_VelMenuViewFind::findsAnywhereInShownNamesWithoutRegardToCase_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("file");
    QTest::newRow("begin") << QStringLiteral("Text") << QStringLiteral("a.desktop");
    QTest::newRow("middle, other case") << QStringLiteral("EXT ED") << QStringLiteral("a.desktop");
    QTest::newRow("end") << QStringLiteral("player") << QStringLiteral("b.desktop");
    QTest::newRow("not the file name") << QStringLiteral("b.desk") << QString();
    QTest::newRow("no pattern") << QStringLiteral("T*r") << QString();
    QTest::newRow("file without a record") << QStringLiteral("notes.TXT") << QStringLiteral("notes.txt");
}

void tst_VelMenuViewFind::findsAnywhereInShownNamesWithoutRegardToCase()
{
    QFETCH(QString, text);
    QFETCH(QString, file);
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("Text Editor"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("Music Player"));
    write(QStringLiteral("menu/notes.txt"), "");
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    modal.handle([&text](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(text);
        qobject_cast<QDialog *>(window)->accept();
    });
    if (file.isEmpty())
        modal.handle([](QWidget *window) { window->close(); });
    view.slotFind();
    QVERIFY(modal.finished());
    QCOMPARE(QFileInfo(view.selectedPath()).fileName(), file);
}

// A text is no pattern, and no name is dear to search through.
void tst_VelMenuViewFind::findsSoonWhateverTheTextMeans()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("a").repeated(100000));
    VelMenuView view(menu(), -1, true);
    for (const QString &text : {QStringLiteral("(a*)*b"), QStringLiteral("*a").repeated(100),
                                QStringLiteral("a").repeated(5000) + QLatin1Char('b')}) {
        ModalDriver modal;
        modal.handle([&text](QWidget *window) {
            window->findChild<QLineEdit *>()->setText(text);
            qobject_cast<QDialog *>(window)->accept();
        });
        modal.handle([](QWidget *window) { window->close(); });
        QElapsedTimer timer;
        timer.start();
        view.slotFind();
        QVERIFY(modal.finished());
        QVERIFY2(timer.elapsed() < 10000, qPrintable(QString::number(timer.elapsed())));
        QVERIFY(view.selectedPath().isEmpty());
    }
}

void tst_VelMenuViewFind::findsInFoldersThatWereNeverOpened()
{
    const QString deep = writeEntry(QStringLiteral("one/two/three/x.desktop"), QStringLiteral("Needle"));
    writeEntry(QStringLiteral("other/y.desktop"), QStringLiteral("Hay"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    find(view, QStringLiteral("needle"));
    QCOMPARE(view.selectedPath(), deep);
}

void tst_VelMenuViewFind::findsBeforeTheFirstFolderWasRead()
{
    const QString deep = writeEntry(QStringLiteral("one/x.desktop"), QStringLiteral("Needle"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("needle"));
    QCOMPARE(view.selectedPath(), deep);
}

void tst_VelMenuViewFind::findsInTheOrderShown()
{
    writeFolder(QString(), QStringLiteral("Menu"), "z.desktop;sub;a.desktop;");
    const QString first = writeEntry(QStringLiteral("z.desktop"), QStringLiteral("hit z"));
    const QString second = writeFolder(QStringLiteral("sub"), QStringLiteral("hit sub"));
    const QString third = writeEntry(QStringLiteral("sub/m.desktop"), QStringLiteral("hit m"));
    const QString fourth = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("miss"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("hit"));
    for (const QString &path : {first, second, third, fourth}) {
        QCOMPARE(view.selectedPath(), path);
        QCOMPARE(view.selectionModel()->selectedIndexes().size(), 1);
        QVERIFY(view.findAndSelect(true));
    }
}

void tst_VelMenuViewFind::goesOnAndWrapsWithoutAMessage()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit b"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("hit"));
    QCOMPARE(view.selectedPath(), a);
    const ModalDriver modal;
    view.slotFindNext();
    QCOMPARE(view.selectedPath(), b);
    view.slotFindNext();
    QCOMPARE(view.selectedPath(), a);
    QVERIFY(modal.finished());
}

void tst_VelMenuViewFind::searchesAnewWhenTheMatchesWereDropped()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit b"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("hit"));
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), b);
    view.clearFindResults();
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), a);
    // A search that does not ask for the next match begins again as well.
    QVERIFY(view.findAndSelect(true));
    QVERIFY(view.findAndSelect(false));
    QCOMPARE(view.selectedPath(), a);
}

void tst_VelMenuViewFind::bringsTheMatchIntoSight()
{
    for (int i = 0; i < 100; ++i)
        writeEntry(QStringLiteral("sub/e%1.desktop").arg(i), QStringLiteral("E%1").arg(i));
    const QString needle = writeEntry(QStringLiteral("sub/n.desktop"), QStringLiteral("Needle"));
    VelMenuView view(menu(), -1, true);
    view.resize(200, 120);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    find(view, QStringLiteral("needle"));
    QCOMPARE(view.selectedPath(), needle);
    QVERIFY(view.isExpanded(shown(view, menu() + QLatin1String("/sub"))));
    QTRY_VERIFY(view.viewport()->rect().contains(view.visualRect(shown(view, needle))));
}

void tst_VelMenuViewFind::tellsWhenNothingMatches()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, a);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(QStringLiteral("%1 q"));
        qobject_cast<QDialog *>(window)->accept();
    });
    modal.answer({QMessageBox::Information, QStringLiteral("Find"), QStringLiteral("'%1 q' not found ."),
                  QMessageBox::Close},
                 QMessageBox::Close);
    view.slotFind();
    QVERIFY(modal.finished());
    QCOMPARE(view.selectedPath(), a);

    modal.answer({QMessageBox::Information, QStringLiteral("Find"), QStringLiteral("'%1 q' not found ."),
                  QMessageBox::Close},
                 QMessageBox::Close);
    QVERIFY(!view.findAndSelect(true));
    QVERIFY(modal.finished());
}

void tst_VelMenuViewFind::findsNeitherTheMenuNorItsNeighbors()
{
    write(QStringLiteral("needlemenu/.directory"), "[Desktop Entry]\nType=Directory\nName=Needle root\n");
    const QString inside =
        write(QStringLiteral("needlemenu/x.desktop"), entryText(QStringLiteral("Needle inside")));
    write(QStringLiteral("needleneighbor.desktop"), entryText(QStringLiteral("Needle outside")));
    VelMenuView view(path(QStringLiteral("needlemenu")), -1, true);
    // The neighbors are known to the model.
    files(view)->fetchMore(files(view)->index(folder()));
    QTRY_VERIFY(files(view)->rowCount(files(view)->index(folder())) > 1);
    find(view, QStringLiteral("needle"));
    for (int i = 0; i < 3; ++i) {
        QCOMPARE(view.selectedPath(), inside);
        QVERIFY(view.findAndSelect(true));
    }
}

void tst_VelMenuViewFind::doesNotFollowLinksInCircles()
{
    const QString needle = writeEntry(QStringLiteral("a/x.desktop"), QStringLiteral("Needle"));
    QDir().mkpath(menu() + QLatin1String("/b"));
    QVERIFY(QFile::link(QStringLiteral("."), menu() + QLatin1String("/a/self")));
    QVERIFY(QFile::link(QStringLiteral("../.."), menu() + QLatin1String("/a/above")));
    QVERIFY(QFile::link(QStringLiteral("/"), menu() + QLatin1String("/a/disk")));
    QVERIFY(QFile::link(QStringLiteral("../b"), menu() + QLatin1String("/a/tob")));
    QVERIFY(QFile::link(QStringLiteral("../a"), menu() + QLatin1String("/b/toa")));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("needle"));
    QCOMPARE(view.selectedPath(), needle);
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), menu() + QLatin1String("/b/toa/x.desktop"));
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), needle);
}

void tst_VelMenuViewFind::passesOverFoldersThatCannotBeRead()
{
    const QString needle = writeEntry(QStringLiteral("b/x.desktop"), QStringLiteral("Needle"));
    writeEntry(QStringLiteral("a/y.desktop"), QStringLiteral("Needle, too"));
    const QString closed = menu() + QLatin1String("/a");
    QVERIFY(QFile::setPermissions(closed, QFile::Permissions()));
    VelMenuView view(menu(), -1, true);
    const bool isRoot = QFileInfo(closed).isReadable();
    if (!isRoot)
        expectWarning(QRegularExpression(QStringLiteral("^inotify_add_watch\\(.*\\) failed: ")));
    find(view, QStringLiteral("needle"));
    QVERIFY(QFile::setPermissions(closed, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QCOMPARE(view.selectedPath(), isRoot ? closed + QLatin1String("/y.desktop") : needle);
}

VEL_TEST_MAIN(tst_VelMenuViewFind)
#include "tst_VelMenuViewFind.moc"
