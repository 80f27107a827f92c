// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QAction>
#include <QFileSystemModel>
#include <QPushButton>
#include <QSignalSpy>

/// Building the start menu anew.
class tst_VelMenuViewRecreate : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void leavesTheStartMenuWhenToldSo();
    void rebuildsTheStartMenuAfterAsking();
    void leavesTheStartMenuWhenItCannotBeRebuilt();
    void goesAwayWhileItAsksToRebuild();
};

void tst_VelMenuViewRecreate::leavesTheStartMenuWhenToldSo()
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

void tst_VelMenuViewRecreate::rebuildsTheStartMenuAfterAsking()
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

void tst_VelMenuViewRecreate::leavesTheStartMenuWhenItCannotBeRebuilt()
{
    write(QStringLiteral("config/startmenu"), "in the way");
    VelMenuView view(QString(), -1, true);
    QSignalSpy told(&view, &VelMenuView::told);
    QSignalSpy changes(&view, &VelMenuView::changed);
    ModalDriver modal;
    modal.handle(
        [](QWidget *window) { qobject_cast<QMessageBox *>(window)->button(QMessageBox::Ok)->click(); });
    expectWarning(QStringLiteral("VelMenuView: can't create the start menu"));
    view.slotRecreate();
    QVERIFY(modal.finished());
    QVERIFY(!QGuiApplication::overrideCursor());
    QCOMPARE(told.size(), 1);
    QVERIFY(told.at(0).at(0).toString().contains(startMenu()));
    QCOMPARE(told.at(0).at(1).toInt(), 2);
    QCOMPARE(changes.size(), 1);
    QCOMPARE(read(startMenu()), QByteArray("in the way"));
    QVERIFY(!view.selectedItem().isValid());
    QVERIFY(!view.rootIndex().isValid() || view.model()->rowCount(view.rootIndex()) == 0);
}

void tst_VelMenuViewRecreate::goesAwayWhileItAsksToRebuild()
{
    write(QStringLiteral("config/startmenu/old.desktop"), entryText(QStringLiteral("Old")));
    auto *view = new VelMenuView(QString(), -1, true);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    view->slotRecreate();
    QVERIFY(modal.finished());
    QVERIFY(QFile::exists(startMenu() + QLatin1String("/old.desktop")));
}

VEL_TEST_MAIN(tst_VelMenuViewRecreate)
#include "tst_VelMenuViewRecreate.moc"
