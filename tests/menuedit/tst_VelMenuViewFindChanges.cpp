// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FindTestCase.h"
#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QFileSystemModel>
#include <QLineEdit>
#include <QPointer>
#include <QTimer>

/// Searching a tree that changes, or whose view goes, between two matches and while it is searched.
class tst_VelMenuViewFindChanges : public FindTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void goesOnWhenMatchesVanished();
    void goesOnBehindTheMatchShownWhenOneBeforeItVanished();
    void searchesAnewAfterAnEditingOperation_data();
    void searchesAnewAfterAnEditingOperation();
    void searchesAnewWhenAllMatchesVanished();
    void followsMatchesThatMove();
    void findsWhatIsThereWhenAFolderVanishesMeanwhile();
    void refusesToSearchWhileItSearches();
    void goesAwayWhileItSearches_data();
    void goesAwayWhileItSearches();
    void changesItsDirectoryWhileItSearches();
    void goesAwayWhileItAsks();
    void goesAwayWhileItTellsThatNothingMatched();
};

void tst_VelMenuViewFindChanges::goesOnWhenMatchesVanished()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit b"));
    const QString c = writeEntry(QStringLiteral("c.desktop"), QStringLiteral("hit c"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("hit"));
    QCOMPARE(view.selectedPath(), a);
    QVERIFY(QFile::remove(b));
    QTRY_COMPARE(names(view, menu()).size(), 2);
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), c);
    QVERIFY(QFile::remove(c));
    QTRY_COMPARE(names(view, menu()).size(), 1);
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), a);
}

void tst_VelMenuViewFindChanges::goesOnBehindTheMatchShownWhenOneBeforeItVanished()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit b"));
    const QString c = writeEntry(QStringLiteral("c.desktop"), QStringLiteral("hit c"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("hit"));
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), b);
    QVERIFY(QFile::remove(a));
    QTRY_COMPARE(names(view, menu()).size(), 2);
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), c);
}

void tst_VelMenuViewFindChanges::searchesAnewAfterAnEditingOperation_data()
{
    QTest::addColumn<QString>("operation");
    for (const char *operation : {"up", "delete", "canceled creation"})
        QTest::newRow(operation) << QString::fromLatin1(operation);
}

void tst_VelMenuViewFindChanges::searchesAnewAfterAnEditingOperation()
{
    QFETCH(QString, operation);
    QStringList paths;
    for (const char *letter : {"a", "b", "c", "d"})
        paths.append(writeEntry(QLatin1String(letter) + QLatin1String(".desktop"),
                                QLatin1String("hit ") + QLatin1String(letter)));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("hit"));
    QVERIFY(view.findAndSelect(true));
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), paths.at(2));
    ModalDriver modal;
    if (operation == QLatin1String("up")) {
        view.slotUp();
    } else if (operation == QLatin1String("delete")) {
        modal.handle([](QWidget *box) { QTest::keyClick(box, Qt::Key_Return); });
        view.slotDel();
    } else {
        modal.handle([](QWidget *editor) { qobject_cast<QDialog *>(editor)->reject(); });
        QVERIFY(!view.createNew(false));
    }
    QVERIFY(modal.finished());

    QVERIFY(view.findAndSelect(true));

    QCOMPARE(view.selectedPath(), paths.constFirst());
}

void tst_VelMenuViewFindChanges::searchesAnewWhenAllMatchesVanished()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("hit"));
    QVERIFY(QFile::remove(a));
    QTRY_COMPARE(names(view, menu()).size(), 0);
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit b"));
    QTRY_COMPARE(names(view, menu()).size(), 1);
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), b);
}

void tst_VelMenuViewFindChanges::followsMatchesThatMove()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit b"));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("hit"));
    QCOMPARE(view.selectedPath(), a);
    writeFolder(QString(), QStringLiteral("Menu"), "b.desktop;a.desktop;");
    view.invalidateSortOrder(files(view)->index(menu()));
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), b);
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), a);
}

void tst_VelMenuViewFindChanges::findsWhatIsThereWhenAFolderVanishesMeanwhile()
{
    for (int i = 0; i < 30; ++i)
        writeEntry(QStringLiteral("gone%1/deep/x.desktop").arg(i), QStringLiteral("X"));
    const QString needle = writeEntry(QStringLiteral("stays/x.desktop"), QStringLiteral("Needle"));
    VelMenuView view(menu(), -1, true);
    QTimer::singleShot(0, this, [this] {
        for (int i = 0; i < 30; ++i)
            QDir(menu() + QStringLiteral("/gone%1").arg(i)).removeRecursively();
    });
    find(view, QStringLiteral("needle"));
    QCOMPARE(view.selectedPath(), needle);
}

void tst_VelMenuViewFindChanges::refusesToSearchWhileItSearches()
{
    for (int i = 0; i < 30; ++i)
        writeEntry(QStringLiteral("f%1/x.desktop").arg(i), QStringLiteral("X%1").arg(i));
    VelMenuView view(menu(), -1, true);
    int asked = 0;
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(QStringLiteral("x"));
        qobject_cast<QDialog *>(window)->accept();
        QTimer::singleShot(0, &view, [&] {
            ++asked;
            QVERIFY(!view.findAndSelect(false));
        });
    });
    view.slotFind();
    QVERIFY(modal.finished());
    QCOMPARE(asked, 1);
    QVERIFY(!view.selectedPath().isEmpty());
}

void tst_VelMenuViewFindChanges::goesAwayWhileItSearches_data()
{
    QTest::addColumn<int>("milliseconds");
    // Before and after the search tells that it takes long.
    for (const int milliseconds : {0, 20, 100, 300, 700})
        QTest::newRow(qPrintable(QString::number(milliseconds))) << milliseconds;
}

void tst_VelMenuViewFindChanges::goesAwayWhileItSearches()
{
    QFETCH(int, milliseconds);
    writeMaze();
    auto *view = new VelMenuView(menu(), -1, true);
    QPointer<VelMenuView> guard(view);
    ModalDriver modal;
    modal.handle([view, milliseconds](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(QStringLiteral("x"));
        qobject_cast<QDialog *>(window)->accept();
        QTimer::singleShot(milliseconds, view, [view] { delete view; });
    });
    view->slotFind();
    QVERIFY(!guard);
    QVERIFY(modal.finished());
    QVERIFY(!QGuiApplication::overrideCursor());
}

void tst_VelMenuViewFindChanges::changesItsDirectoryWhileItSearches()
{
    for (int i = 0; i < 50; ++i)
        writeEntry(QStringLiteral("f%1/x.desktop").arg(i), QStringLiteral("X"));
    const QString other =
        QFileInfo(write(QStringLiteral("other/x.desktop"), entryText(QStringLiteral("X")))).path();
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(QStringLiteral("x"));
        qobject_cast<QDialog *>(window)->accept();
        QTimer::singleShot(0, &view, [&] { view.init(other, -1, true, nullptr); });
    });
    view.slotFind();
    QTRY_COMPARE(view.menuDir(), other);
    QVERIFY(modal.finished());
    QVERIFY(!QGuiApplication::overrideCursor());
}

void tst_VelMenuViewFindChanges::goesAwayWhileItAsks()
{
    auto *view = new VelMenuView(menu(), -1, true);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    view->slotFind();
    QVERIFY(modal.finished());
}

void tst_VelMenuViewFindChanges::goesAwayWhileItTellsThatNothingMatched()
{
    auto *view = new VelMenuView(menu(), -1, true);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(QStringLiteral("x"));
        qobject_cast<QDialog *>(window)->accept();
    });
    modal.handle([view](QWidget *) { delete view; });
    view->slotFind();
    QVERIFY(modal.finished());
}

VEL_TEST_MAIN(tst_VelMenuViewFindChanges)
#include "tst_VelMenuViewFindChanges.moc"
