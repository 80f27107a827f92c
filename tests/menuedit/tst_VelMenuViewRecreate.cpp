// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "OrdinaryUser.h"
#include "VelMenuView.h"

#include <QAction>
#include <QFileSystemModel>
#include <QPushButton>
#include <QSignalSpy>

#include <memory>

/// Building the start menu anew.
class tst_VelMenuViewRecreate : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void leavesTheStartMenuWhenToldSo();
    void rebuildsTheStartMenuAfterAsking();
    void leavesTheStartMenuWhenItCannotBeRebuilt();
    void tellsWhyTheStartMenuCannotBeRebuilt_data();
    void tellsWhyTheStartMenuCannotBeRebuilt();
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

void tst_VelMenuViewRecreate::tellsWhyTheStartMenuCannotBeRebuilt_data()
{
    QTest::addColumn<QString>("obstacle");
    QTest::addColumn<bool>("assistance");
    QTest::addColumn<QString>("text");
    for (const bool assistance : {false, true}) {
        const auto row = [assistance](const char *obstacle, const char *text) {
            QTest::addRow("%s, %s", obstacle, assistance ? "assistance" : "plain")
                << QString::fromLatin1(obstacle) << assistance << QString::fromLatin1(text);
        };
        row("no application",
            "The default menu could not be built in %1, because no application is installed. The menu was "
            "left as it is.");
        row("a file",
            "The default menu could not be built in %1: Not a directory. The menu was left as it is.");
        row("no permission",
            "The default menu could not be built in %1: Permission denied. The menu was left as it is.");
    }
}

void tst_VelMenuViewRecreate::tellsWhyTheStartMenuCannotBeRebuilt()
{
    QFETCH(QString, obstacle);
    QFETCH(bool, assistance);
    QFETCH(QString, text);
    if (obstacle != QLatin1String("no application"))
        write(QStringLiteral("data/applications/x.desktop"), entryText(QStringLiteral("Xylophone")));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("data"))));
    if (obstacle == QLatin1String("a file"))
        write(QStringLiteral("config/startmenu"), "in the way");
    else
        write(QStringLiteral("config/startmenu/old.desktop"), entryText(QStringLiteral("Old")));
    VelMenuView view(QString(), -1, true);
    view.setAssistance(assistance);
    QSignalSpy told(&view, &VelMenuView::told);
    ModalDriver modal;
    modal.handle(
        [](QWidget *window) { qobject_cast<QMessageBox *>(window)->button(QMessageBox::Ok)->click(); });
    expectWarning(QStringLiteral("VelMenuView: can't create the start menu"));
    {
        const bool isClosed = obstacle == QLatin1String("no permission");
        if (isClosed)
            QVERIFY(
                QFile::setPermissions(path(QStringLiteral("config")), QFile::ReadOwner | QFile::ExeOwner));
        const std::unique_ptr<OrdinaryUser> user(isClosed ? new OrdinaryUser(folder()) : nullptr);
        view.slotRecreate();
    }
    QVERIFY(QFile::setPermissions(path(QStringLiteral("config")),
                                  QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QVERIFY(modal.finished());
    QCOMPARE(told.size(), 1);
    QCOMPARE(told.at(0).at(0).toString(), text.arg(startMenu()));
    QCOMPARE(told.at(0).at(1).toInt(), 2);
    qputenv("XDG_DATA_DIRS", "/usr/local/share:/usr/share");
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
