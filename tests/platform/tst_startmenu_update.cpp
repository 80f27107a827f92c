// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenuUpdateTestCase.h"

#include <velintegration/startmenu.h>

#include <QDir>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/wait.h>
#include <unistd.h>

/// How a start menu follows the applications that are installed, and leaves alone what was touched.
class tst_startmenu_update : public StartMenuUpdateTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void makesAMenuWhereThereIsNone();
    void fillsAnEmptyMenu();
    void changesNothingWithoutApplications_data();
    void changesNothingWithoutApplications();
    void addsWhatCame();
    void addsAFolderInItsPlace();
    void addsInTheirPlaces();
    void leavesTheOrderOfTheUser();
    void leavesAFolderWithoutAnOrder();
    void addsBesideAFileOfTheUser();
    void adoptsTheSameFile();
    void refreshesWhatChanged();
    void refreshesWhatWasWrittenInPlace();
    void keepsThePermissionsOfWhatItRefreshes();
    void leavesAnEditedEntry();
    void leavesAnEditedEntryWhoseApplicationWent();
    void removesWhatWent();
    void removesTheFolderThatCameEmpty();
    void leavesAFolderThatWasTouched_data();
    void leavesAFolderThatWasTouched();
    void leavesAFolderThatTheUserEmptied();
    void bringsBackWhatIsInstalledAgain();
    void doesNotBringBackWhatWasDeleted();
    void doesNotBringBackADeletedFolder();
    void doesNotMoveBackWhatWasMoved_data();
    void doesNotMoveBackWhatWasMoved();
    void doesNotDoubleWhatWasMovedWhenItIsInstalledAgain();
    void takesCareAgainOfWhatWasPutBack();
    void movesWhatChangedItsCategory();
    void leavesAMovedOneThatWasEdited();
    void anIdThatIsHiddenIsGone();
    void followsWhetherTheProgramIsThere();
    void readsOfATemplateOnlyWithoutAMenu();
    void leavesOutWhatATemplateLeavesOut();
    void addsToAMenuMadeByHandWhatComesLater();
    void losesNothingWithoutItsMemory();
    void losesNothingWithADamagedMemory_data();
    void losesNothingWithADamagedMemory();
    void remembersWhatWasMadeAnew();
    void writesNothingWhenNothingChanged();
    void followsALink();
    void severalUpdatesAtATime();
    void waitsForAnotherUpdate();
    void leavesWhatIsEditedMeanwhile();
};

void tst_startmenu_update::makesAMenuWhereThereIsNone()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(create());
    const auto made = tree(menu());
    QVERIFY(QDir(menu()).removeRecursively());
    QVERIFY(update());
    QCOMPARE(tree(menu()), made);
    QCOMPARE(names(path(QStringLiteral("config/vel"))),
             QStringList({QStringLiteral("startmenu"), QStringLiteral("startmenu.sources")}));
}

void tst_startmenu_update::fillsAnEmptyMenu()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    install(QStringLiteral("c.desktop"), "");
    QVERIFY(create());
    const auto made = tree(menu());
    QVERIFY(QDir(menu()).removeRecursively());
    QVERIFY(QDir().mkpath(menu()));
    QVERIFY(update());
    QCOMPARE(tree(menu()), made);
}

void tst_startmenu_update::changesNothingWithoutApplications_data()
{
    QTest::addColumn<bool>("hasMenu");
    QTest::newRow("no menu") << false;
    QTest::newRow("a menu") << true;
}

void tst_startmenu_update::changesNothingWithoutApplications()
{
    QFETCH(bool, hasMenu);
    install(QStringLiteral("a.desktop"), "Game;");
    if (hasMenu)
        QVERIFY(update());
    uninstall(QStringLiteral("a.desktop"));
    const auto before = tree(folder());
    QVERIFY(!update());
    QCOMPARE(tree(folder()), before);
    QVERIFY(!UpdateStartMenu(nullptr, nullptr));
    QVERIFY(!UpdateStartMenu("", nullptr));
}

void tst_startmenu_update::addsWhatCame()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    const QString source = install(QStringLiteral("sub/b.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(entries(), QStringList({QStringLiteral("Game/a.desktop"), QStringLiteral("Game/b.desktop")}));
    QCOMPARE(read(inMenu(QStringLiteral("Game/b.desktop"))), read(source));
}

void tst_startmenu_update::addsAFolderInItsPlace()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("c.desktop"), "");
    QVERIFY(update());
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    QCOMPARE(sortOrder(menu()).join(QLatin1Char(' ')), QStringLiteral("Game Office Other"));
    const auto followed = tree(menu());
    QVERIFY(create());
    QCOMPARE(followed, tree(menu()));
}

void tst_startmenu_update::addsInTheirPlaces()
{
    for (const char *name : {"b.desktop", "d.desktop"})
        install(QString::fromLatin1(name), "Game;");
    QVERIFY(update());
    for (const char *name : {"e.desktop", "c.desktop", "a.desktop"})
        install(QString::fromLatin1(name), "Game;");
    QVERIFY(update());
    const auto followed = tree(menu());
    QVERIFY(create());
    QCOMPARE(followed, tree(menu()));
}

void tst_startmenu_update::leavesTheOrderOfTheUser()
{
    for (const char *name : {"a.desktop", "c.desktop", "e.desktop"})
        install(QString::fromLatin1(name), "Game;");
    QVERIFY(update());
    order(QStringLiteral("Game"), "*;e.desktop;a.desktop;c.desktop;");
    install(QStringLiteral("d.desktop"), "Game;");
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QCOMPARE(sortOrder(inMenu(QStringLiteral("Game"))).join(QLatin1Char(' ')),
             QStringLiteral("* d.desktop e.desktop c.desktop"));
}

void tst_startmenu_update::leavesAFolderWithoutAnOrder()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    const QByteArray record = "[Desktop Entry]\nType=Directory\nName=Mine\n";
    write(QStringLiteral("config/vel/startmenu/Game/.directory"), record);
    install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(entries().size(), 2);
    QCOMPARE(read(inMenu(QStringLiteral("Game/.directory"))), record);
}

void tst_startmenu_update::addsBesideAFileOfTheUser()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    write(QStringLiteral("config/vel/startmenu/Game/b.desktop"), "mine");
    write(QStringLiteral("config/vel/startmenu/Game/c.desktop"), "mine too");
    install(QStringLiteral("b.desktop"), "Game;");
    install(QStringLiteral("sub/c.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(read(inMenu(QStringLiteral("Game/b.desktop"))), QByteArray("mine"));
    QCOMPARE(read(inMenu(QStringLiteral("Game/c.desktop"))), QByteArray("mine too"));
    QVERIFY(read(inMenu(QStringLiteral("Game/b-2.desktop"))).contains("Name=b\n"));
    QVERIFY(read(inMenu(QStringLiteral("Game/sub-c.desktop"))).contains("Name=c\n"));
}

void tst_startmenu_update::adoptsTheSameFile()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    const QString source = install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(QFile::copy(source, inMenu(QStringLiteral("Game/b.desktop"))));
    QVERIFY(update());
    QCOMPARE(entries().size(), 2);
}

void tst_startmenu_update::refreshesWhatChanged()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    uninstall(QStringLiteral("a.desktop"));
    const QString source = install(QStringLiteral("a.desktop"), "Game;", "Comment=new\n");
    QVERIFY(update());
    QCOMPARE(read(inMenu(QStringLiteral("Game/a.desktop"))), read(source));
}

void tst_startmenu_update::refreshesWhatWasWrittenInPlace()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    const QString source = install(QStringLiteral("a.desktop"), "Game;", "Comment=new\n");
    QVERIFY(update());
    QCOMPARE(read(inMenu(QStringLiteral("Game/a.desktop"))), read(source));
}

void tst_startmenu_update::keepsThePermissionsOfWhatItRefreshes()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    const auto permissions = QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner;
    QVERIFY(QFile::setPermissions(inMenu(QStringLiteral("Game/a.desktop")), permissions));
    install(QStringLiteral("a.desktop"), "Game;", "Comment=new\n");
    QVERIFY(update());
    QVERIFY(read(inMenu(QStringLiteral("Game/a.desktop"))).contains("new"));
    QVERIFY(!(QFileInfo(inMenu(QStringLiteral("Game/a.desktop"))).permissions() & QFile::ReadOther));
    QVERIFY(QFileInfo(inMenu(QStringLiteral("Game/a.desktop"))).permissions() & QFile::ExeOwner);
}

void tst_startmenu_update::leavesAnEditedEntry()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    const QByteArray edited = read(inMenu(QStringLiteral("Game/a.desktop"))) + '\n';
    write(QStringLiteral("config/vel/startmenu/Game/a.desktop"), edited);
    install(QStringLiteral("a.desktop"), "Office;", "Comment=new\n");
    QVERIFY(update());
    QCOMPARE(entries(), QStringList(QStringLiteral("Game/a.desktop")));
    QCOMPARE(read(inMenu(QStringLiteral("Game/a.desktop"))), edited);
}

void tst_startmenu_update::leavesAnEditedEntryWhoseApplicationWent()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(update());
    write(QStringLiteral("config/vel/startmenu/Game/a.desktop"), "edited");
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QCOMPARE(read(inMenu(QStringLiteral("Game/a.desktop"))), QByteArray("edited"));
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(entries().size(), 2);
    QCOMPARE(read(inMenu(QStringLiteral("Game/a.desktop"))), QByteArray("edited"));
}

void tst_startmenu_update::removesWhatWent()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(update());
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QCOMPARE(entries(), QStringList(QStringLiteral("Game/b.desktop")));
    QCOMPARE(sortOrder(inMenu(QStringLiteral("Game"))), QStringList(QStringLiteral("b.desktop")));
}

void tst_startmenu_update::removesTheFolderThatCameEmpty()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    order(QStringLiteral("Game"), "*;a.desktop;"); // an order does not make it touched
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QCOMPARE(names(menu()), QStringList({QStringLiteral(".directory"), QStringLiteral("Office")}));
    QCOMPARE(sortOrder(menu()), QStringList(QStringLiteral("Office")));
}

void tst_startmenu_update::leavesAFolderThatWasTouched_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("another name") << ".directory"
                                  << QByteArray("[Desktop Entry]\nType=Directory\nName=Mine\n");
    QTest::newRow("no record") << ".directory" << QByteArray();
    QTest::newRow("a file of the user") << "notes.txt" << QByteArray("notes");
    QTest::newRow("a hidden file of the user") << ".notes" << QByteArray("notes");
    QTest::newRow("a folder of the user") << "sub/x.desktop" << QByteArray("x");
}

void tst_startmenu_update::leavesAFolderThatWasTouched()
{
    QFETCH(QString, name);
    QFETCH(QByteArray, bytes);
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    const QString file = QStringLiteral("Game/") + name;
    if (bytes.isEmpty())
        QVERIFY(QFile::remove(inMenu(file)));
    else
        write(QStringLiteral("config/vel/startmenu/") + file, bytes);
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QVERIFY(QFileInfo(inMenu(QStringLiteral("Game"))).isDir());
    QVERIFY(!QFile::exists(inMenu(QStringLiteral("Game/a.desktop"))));
    if (!bytes.isEmpty())
        QCOMPARE(read(inMenu(file)), bytes);
}

void tst_startmenu_update::leavesAFolderThatTheUserEmptied()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    QVERIFY(QFile::remove(inMenu(QStringLiteral("Game/a.desktop"))));
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QVERIFY(QFileInfo(inMenu(QStringLiteral("Game"))).isDir());
}

void tst_startmenu_update::bringsBackWhatIsInstalledAgain()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    const auto before = tree(menu());
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(tree(menu()), before);
}

void tst_startmenu_update::doesNotBringBackWhatWasDeleted()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(update());
    QVERIFY(QFile::remove(inMenu(QStringLiteral("Game/a.desktop"))));
    const QStringList expected(QStringLiteral("Game/b.desktop"));
    QVERIFY(update());
    QCOMPARE(entries(), expected);
    install(QStringLiteral("a.desktop"), "Office;", "Comment=new\n");
    QVERIFY(update());
    QCOMPARE(entries(), expected);
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(entries(), expected);
}

void tst_startmenu_update::doesNotBringBackADeletedFolder()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    QVERIFY(QDir(inMenu(QStringLiteral("Game"))).removeRecursively());
    QVERIFY(update());
    QVERIFY(!QFile::exists(inMenu(QStringLiteral("Game"))));
    install(QStringLiteral("c.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(entries(), QStringList({QStringLiteral("Game/c.desktop"), QStringLiteral("Office/b.desktop")}));
}

void tst_startmenu_update::doesNotMoveBackWhatWasMoved_data()
{
    QTest::addColumn<QString>("to");
    QTest::newRow("renamed") << "Game/other.desktop";
    QTest::newRow("into another category") << "Office/a.desktop";
    QTest::newRow("into a folder of the user") << "Mine/a.desktop";
    QTest::newRow("to the top") << "a.desktop";
}

void tst_startmenu_update::doesNotMoveBackWhatWasMoved()
{
    QFETCH(QString, to);
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    QDir().mkpath(inMenu(QStringLiteral("Mine")));
    QVERIFY(QFile::rename(inMenu(QStringLiteral("Game/a.desktop")), inMenu(to)));
    const auto before = tree(menu());
    QVERIFY(update());
    install(QStringLiteral("a.desktop"), "Science;", "Comment=new\n");
    QVERIFY(update());
    QCOMPARE(tree(menu()), before);
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QCOMPARE(tree(menu()), before);
}

void tst_startmenu_update::doesNotDoubleWhatWasMovedWhenItIsInstalledAgain()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    QVERIFY(QFile::rename(inMenu(QStringLiteral("Game/a.desktop")), inMenu(QStringLiteral("a.desktop"))));
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(entries(), QStringList({QStringLiteral("Office/b.desktop"), QStringLiteral("a.desktop")}));
}

void tst_startmenu_update::takesCareAgainOfWhatWasPutBack()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(update());
    const QString there = inMenu(QStringLiteral("Game/a.desktop"));
    QVERIFY(QFile::rename(there, path(QStringLiteral("away"))));
    QVERIFY(update());
    QVERIFY(QFile::rename(path(QStringLiteral("away")), there));
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QVERIFY(!QFile::exists(there));
}

void tst_startmenu_update::movesWhatChangedItsCategory()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;");
    install(QStringLiteral("0.desktop"), "Office;");
    QVERIFY(update());
    const QString source = install(QStringLiteral("a.desktop"), "Office;");
    QVERIFY(update());
    QCOMPARE(read(inMenu(QStringLiteral("Office/a.desktop"))), read(source));
    QVERIFY(!QFile::exists(inMenu(QStringLiteral("Game"))));
    QCOMPARE(sortOrder(inMenu(QStringLiteral("Office"))).join(QLatin1Char(' ')),
             QStringLiteral("0.desktop a.desktop b.desktop"));
    QCOMPARE(entries().size(), 3);
}

void tst_startmenu_update::leavesAMovedOneThatWasEdited()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    QVERIFY(QFile::rename(inMenu(QStringLiteral("Game/a.desktop")), inMenu(QStringLiteral("x.desktop"))));
    write(QStringLiteral("config/vel/startmenu/x.desktop"), "edited");
    install(QStringLiteral("a.desktop"), "Office;");
    QVERIFY(update());
    QCOMPARE(entries(), QStringList(QStringLiteral("x.desktop")));
}

void tst_startmenu_update::anIdThatIsHiddenIsGone()
{
    install(QStringLiteral("b.desktop"), "Game;");
    write(QStringLiteral("system/applications/a.desktop"),
          "[Desktop Entry]\nType=Application\nName=a\nExec=true\nCategories=Game;\n");
    QVERIFY(update());
    QCOMPARE(entries().size(), 2);
    install(QStringLiteral("a.desktop"), "Game;", "NoDisplay=true\n");
    QVERIFY(update());
    QCOMPARE(entries(), QStringList(QStringLiteral("Game/b.desktop")));
    uninstall(QStringLiteral("a.desktop"));
    QVERIFY(update());
    QCOMPARE(entries().size(), 2);
}

void tst_startmenu_update::followsWhetherTheProgramIsThere()
{
    const QByteArray pathBefore = qgetenv("PATH");
    QDir().mkpath(path(QStringLiteral("bin")));
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))));
    install(QStringLiteral("a.desktop"), "Game;", "TryExec=program\n");
    install(QStringLiteral("b.desktop"), "Game;",
            "TryExec=" + QFile::encodeName(path(QStringLiteral("opt/program"))) + '\n');
    install(QStringLiteral("c.desktop"), "Game;");
    const bool isMade = update();
    const QStringList first = entries();
    for (const char *program : {"bin/program", "opt/program"})
        QFile::setPermissions(write(QString::fromLatin1(program), "#!/bin/sh\n"),
                              QFile::ReadOwner | QFile::ExeOwner);
    const bool isUpdated = update();
    qputenv("PATH", pathBefore);
    QVERIFY(isMade && isUpdated);
    QCOMPARE(first, QStringList(QStringLiteral("Game/c.desktop")));
    QCOMPARE(entries().size(), 3);
}

void tst_startmenu_update::readsOfATemplateOnlyWithoutAMenu()
{
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("template/Mine/x.desktop"), "x");
    QVERIFY(update("template"));
    QCOMPARE(tree(menu()), tree(path(QStringLiteral("template"))));
    write(QStringLiteral("template/Mine/y.desktop"), "y");
    QVERIFY(update("template"));
    QCOMPARE(entries(), QStringList(QStringLiteral("Mine/x.desktop")));
}

void tst_startmenu_update::leavesOutWhatATemplateLeavesOut()
{
    install(QStringLiteral("a.desktop"), "Game;");
    const QString shown = install(QStringLiteral("b.desktop"), "Game;");
    write(QStringLiteral("template/Game/b.desktop"), read(shown));
    QVERIFY(update("template"));
    install(QStringLiteral("c.desktop"), "Game;");
    QVERIFY(update("template"));
    QCOMPARE(entries(), QStringList({QStringLiteral("Game/b.desktop"), QStringLiteral("Game/c.desktop")}));
    uninstall(QStringLiteral("b.desktop"));
    QVERIFY(update("template"));
    QCOMPARE(entries(), QStringList(QStringLiteral("Game/c.desktop")));
}

void tst_startmenu_update::addsToAMenuMadeByHandWhatComesLater()
{
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("config/vel/startmenu/mine.desktop"), "mine");
    QVERIFY(update());
    QCOMPARE(names(menu()), QStringList(QStringLiteral("mine.desktop")));
    install(QStringLiteral("b.desktop"), "Office;");
    QVERIFY(update());
    QCOMPARE(entries(), QStringList({QStringLiteral("Office/b.desktop"), QStringLiteral("mine.desktop")}));
}

void tst_startmenu_update::losesNothingWithoutItsMemory()
{
    for (const char *name : {"deleted", "edited", "moved", "renamed", "same", "wrought"})
        install(QLatin1String(name) + QStringLiteral(".desktop"), "Game;",
                "X-Own=" + QByteArray(name) + '\n');
    QVERIFY(update());
    const auto entry = [this](const char *name) { return inMenu(QString::fromLatin1(name)); };
    QVERIFY(QFile::remove(entry("Game/deleted.desktop")));
    write(QStringLiteral("config/vel/startmenu/Game/edited.desktop"), "edited");
    QVERIFY(QFile::rename(entry("Game/moved.desktop"), entry("moved.desktop")));
    QVERIFY(QFile::rename(entry("Game/renamed.desktop"), entry("Game/x.desktop")));
    QVERIFY(QFile::rename(entry("Game/wrought.desktop"), entry("Game/y.desktop")));
    write(QStringLiteral("config/vel/startmenu/Game/y.desktop"),
          "[Desktop Entry]\nType=Application\nName=wrought\nExec=true\n");
    auto expected = tree(menu());
    QVERIFY(QFile::remove(menu() + QStringLiteral(".sources")));

    install(QStringLiteral("new.desktop"), "Office;");
    QVERIFY(update());
    QStringList found = entries();
    QVERIFY(found.removeOne(QStringLiteral("Office/new.desktop")));
    found.removeOne(QStringLiteral("Game/deleted.desktop")); // may come back
    QStringList kept = expected.keys().filter(QStringLiteral(".desktop"));
    QCOMPARE(found, kept);
    for (const QString &name : qAsConst(kept))
        QCOMPARE(read(inMenu(name)), expected.value(name));
    // Only once.
    QFile::remove(entry("Game/deleted.desktop"));
    QVERIFY(update());
    QVERIFY(!QFile::exists(entry("Game/deleted.desktop")));
    // What was not touched is still followed.
    uninstall(QStringLiteral("same.desktop"));
    uninstall(QStringLiteral("moved.desktop"));
    QVERIFY(update());
    QVERIFY(!QFile::exists(entry("Game/same.desktop")));
    QVERIFY(QFile::exists(entry("moved.desktop")));
}

void tst_startmenu_update::losesNothingWithADamagedMemory_data()
{
    QTest::addColumn<int>("length");
    QTest::addColumn<QByteArray>("more");
    QTest::newRow("empty") << 0 << QByteArray();
    QTest::newRow("half") << 600 << QByteArray();
    QTest::newRow("garbage") << 0 << QByteArray("\0\xff garbage", 10);
    QTest::newRow("a line too many") << -1 << QByteArray("entry ../../x ab x.desktop\n");
}

void tst_startmenu_update::losesNothingWithADamagedMemory()
{
    QFETCH(int, length);
    QFETCH(QByteArray, more);
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(update());
    const QByteArray memory = read(menu() + QStringLiteral(".sources"));
    write(QStringLiteral("config/vel/startmenu/Game/a.desktop"), "edited");
    const auto before = tree(menu());
    QVERIFY(memory.size() > length);
    write(QStringLiteral("config/vel/startmenu.sources"), memory.left(length) + more);
    QVERIFY(update());
    QCOMPARE(tree(menu()), before);
    uninstall(QStringLiteral("b.desktop"));
    QVERIFY(update());
    QCOMPARE(entries(), QStringList(QStringLiteral("Game/a.desktop")));
}

void tst_startmenu_update::remembersWhatWasMadeAnew()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    QVERIFY(QFile::remove(inMenu(QStringLiteral("Game/a.desktop"))));
    QVERIFY(update());
    install(QStringLiteral("a.desktop"), "Game;", "Comment=second\n");
    QVERIFY(create());
    QCOMPARE(entries(), QStringList(QStringLiteral("Game/a.desktop")));
    install(QStringLiteral("a.desktop"), "Game;", "Comment=third\n");
    QVERIFY(update());
    QVERIFY(read(inMenu(QStringLiteral("Game/a.desktop"))).contains("third"));
}

void tst_startmenu_update::writesNothingWhenNothingChanged()
{
    for (int i = 0; i < 20; ++i)
        install(QStringLiteral("a%1.desktop").arg(i), i % 2 ? "Game;" : "Office;");
    QVERIFY(update());
    QVERIFY(QFile::remove(inMenu(QStringLiteral("Game/a1.desktop"))));
    write(QStringLiteral("config/vel/startmenu/Game/a3.desktop"), "edited");
    QVERIFY(update());
    const auto before = times(path(QStringLiteral("config")));
    for (const auto look : {VelStartMenu::Look::Folders, VelStartMenu::Look::Files}) {
        QVERIFY(VelStartMenu::update(QFile::encodeName(menu()).constData(), nullptr, look)
                == VelStartMenu::Result::Unchanged);
        QCOMPARE(times(path(QStringLiteral("config"))), before);
    }
}

void tst_startmenu_update::followsALink()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QDir().mkpath(path(QStringLiteral("config/vel")));
    QVERIFY(QFile::link(path(QStringLiteral("real/menu")), menu()));
    QVERIFY(update());
    install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(update());
    QVERIFY(QFileInfo(menu()).isSymLink());
    QCOMPARE(names(path(QStringLiteral("real"))),
             QStringList({QStringLiteral("menu"), QStringLiteral("menu.sources")}));
    QCOMPARE(names(path(QStringLiteral("real/menu/Game"))).size(), 3);
}

void tst_startmenu_update::severalUpdatesAtATime()
{
    for (int round = 0; round < 5; ++round) {
        for (int i = 0; i < 10; ++i)
            install(QStringLiteral("a%1-%2.desktop").arg(round).arg(i), i % 2 ? "Game;" : "Office;");
        if (round > 0)
            uninstall(QStringLiteral("a%1-0.desktop").arg(round - 1));
        const QByteArray directory = QFile::encodeName(menu());
        QVector<pid_t> children;
        for (int i = 0; i < 4; ++i) {
            const pid_t child = fork();
            if (child == 0)
                _exit(UpdateStartMenu(directory.constData(), nullptr) ? 0 : 1);
            children.append(child);
        }
        for (const pid_t child : qAsConst(children)) {
            int status = -1;
            QCOMPARE(waitpid(child, &status, 0), child);
            QCOMPARE(status, 0);
        }
        const auto followed = tree(menu());
        QDir(path(QStringLiteral("fresh"))).removeRecursively();
        QVERIFY(CreateStartMenu(QFile::encodeName(path(QStringLiteral("fresh"))).constData(), nullptr));
        QCOMPARE(followed, tree(path(QStringLiteral("fresh"))));
    }
}

// Nothing is done as long as another one is at work, and everything when it has ended.
void tst_startmenu_update::waitsForAnotherUpdate()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(update());
    const int other = open(QFile::encodeName(menu() + QStringLiteral(".sources")).constData(), O_RDWR);
    QVERIFY(other >= 0);
    QCOMPARE(flock(other, LOCK_EX), 0);
    install(QStringLiteral("b.desktop"), "Game;");
    const QByteArray directory = QFile::encodeName(menu());
    const pid_t child = fork();
    if (child == 0) {
        ::close(other);
        _exit(UpdateStartMenu(directory.constData(), nullptr) ? 0 : 1);
    }
    QTest::qWait(100);
    const QStringList meanwhile = entries();
    close(other);
    int status = -1;
    QCOMPARE(waitpid(child, &status, 0), child);
    QCOMPARE(status, 0);
    QCOMPARE(meanwhile, QStringList(QStringLiteral("Game/a.desktop")));
    QCOMPARE(entries().size(), 2);
}

// An editor saves an entry while an update replaces it: what was edited is never lost.
void tst_startmenu_update::leavesWhatIsEditedMeanwhile()
{
    for (int i = 0; i < 20; ++i)
        install(QStringLiteral("a%1.desktop").arg(i), "Game;");
    QVERIFY(update());
    for (int round = 0; round < 10; ++round) {
        const QString name = QStringLiteral("a%1.desktop").arg(round);
        install(name, "Game;", "Comment=new\n");
        const QByteArray directory = QFile::encodeName(menu());
        const pid_t child = fork();
        if (child == 0)
            _exit(UpdateStartMenu(directory.constData(), nullptr) ? 0 : 1);
        VelUIDesktopEntry entry(inMenu(QStringLiteral("Game/") + name));
        entry.setGenericName(QStringLiteral("mine"));
        QVERIFY(entry.save());
        int status = -1;
        QCOMPARE(waitpid(child, &status, 0), child);
        QVERIFY(read(inMenu(QStringLiteral("Game/") + name)).contains("GenericName=mine"));
        QVERIFY(update());
        QVERIFY(read(inMenu(QStringLiteral("Game/") + name)).contains("GenericName=mine"));
    }
}

VEL_TEST_GUILESS_MAIN(tst_startmenu_update)
#include "tst_startmenu_update.moc"
