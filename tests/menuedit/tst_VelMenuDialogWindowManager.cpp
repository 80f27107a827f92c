// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "WindowManager.h"

#include <menuedit/MenuUpdateCommand.h>
#include <velcore/dirs.h>

#include <memory>

namespace {

const ModalDriver::Box noWindowManager{QMessageBox::Warning, QStringLiteral("Warning"),
                                       QStringLiteral("Can't send command to vel-wm"), QMessageBox::Ok};

} // namespace

/// What the dialog tells the window manager, with and without one of ours.
class tst_VelMenuDialogWindowManager : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void choosesTheCommandByTheDirectory_data();
    void choosesTheCommandByTheDirectory();
    void takesTheFirstKindThatADirectoryIs();
    void tellsTheWindowManagerWhenItGoes_data();
    void tellsTheWindowManagerWhenItGoes();
    void tellsTheWindowManagerNothingOfOtherDirectories();
    void warnsWhenThereIsNoWindowManager();
    void closesQuietlyWithAssistance();
    void leavesTheChannelToAWindowManagerThatComesLater();
    void tellsTheWindowManagerWhenApplied();
};

void tst_VelMenuDialogWindowManager::choosesTheCommandByTheDirectory_data()
{
    QTest::addColumn<QString>("dir");
    QTest::addColumn<int>("kind");
    QTest::addColumn<QByteArray>("command");
    QTest::newRow("start menu") << "startmenu" << 4 << QByteArray("VELWM_UPDATE_STARTMENU\n");
    QTest::newRow("desktop") << "desktop" << 6 << QByteArray("VELWM_UPDATE_SHORTCUT\n");
    QTest::newRow("tool bar") << "toolbar" << 17 << QByteArray("VELWM_UPDATE_TOOLBAR\n");
    QTest::newRow("start menu with a slash") << "startmenu/" << -1 << QByteArray();
    QTest::newRow("another") << "other" << -1 << QByteArray();
}

void tst_VelMenuDialogWindowManager::choosesTheCommandByTheDirectory()
{
    QFETCH(QString, dir);
    QFETCH(int, kind);
    QFETCH(QByteArray, command);
    QString asked = path(QStringLiteral("config/")) + dir;
    if (dir == QLatin1String("desktop"))
        asked = QString::fromStdString(GetVelDir(VelDir::Desktop));
    QCOMPARE(MenuUpdateCommand::kindOf(asked), kind);
    QCOMPARE(MenuUpdateCommand::forKind(kind), command);
}

void tst_VelMenuDialogWindowManager::takesTheFirstKindThatADirectoryIs()
{
    const QString config = QString::fromLocal8Bit(qgetenv("XDG_CONFIG_HOME"));
    QVERIFY(QDir().mkpath(config));
    const auto desktopAt = [&](const QString &dir) {
        QFile file(config + QLatin1String("/user-dirs.dirs"));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write("XDG_DESKTOP_DIR=\"" + QFile::encodeName(dir) + "\"\n");
    };
    desktopAt(startMenu());
    QCOMPARE(MenuUpdateCommand::kindOf(startMenu()), 4);
    const QString toolBar = path(QStringLiteral("config/toolbar"));
    desktopAt(toolBar);
    QCOMPARE(MenuUpdateCommand::kindOf(toolBar), 6);
    QVERIFY(QFile::remove(config + QLatin1String("/user-dirs.dirs")));
    QCOMPARE(MenuUpdateCommand::kindOf(toolBar), 17);
}

void tst_VelMenuDialogWindowManager::tellsTheWindowManagerWhenItGoes_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QByteArray>("line");
    QTest::newRow("start menu") << 4 << QByteArray("VELWM_UPDATE_STARTMENU");
    QTest::newRow("desktop") << 6 << QByteArray("VELWM_UPDATE_SHORTCUT");
    QTest::newRow("tool bar") << 17 << QByteArray("VELWM_UPDATE_TOOLBAR");
}

void tst_VelMenuDialogWindowManager::tellsTheWindowManagerWhenItGoes()
{
    QFETCH(int, kind);
    QFETCH(QByteArray, line);
    const QString dir = QString::fromStdString(GetVelDir(VelDir(kind)));
    QDir().mkpath(dir);
    WindowManager manager;
    QVERIFY(manager.owns());
    {
        const VelMenuDialog dialog(dir, -1, false, false);
        QVERIFY(manager.lines().isEmpty());
    }
    QTRY_COMPARE(manager.lines(), QList<QByteArray>{line});
}

void tst_VelMenuDialogWindowManager::tellsTheWindowManagerNothingOfOtherDirectories()
{
    QDir().mkpath(startMenu());
    WindowManager manager;
    for (const QString &dir : {menu(), startMenu() + QLatin1Char('/')}) {
        VelMenuDialog dialog(dir, -1, true, true);
        QVERIFY(!dialog.updateWM());
    }
    QVERIFY(manager.lines().isEmpty());
}

void tst_VelMenuDialogWindowManager::warnsWhenThereIsNoWindowManager()
{
    QDir().mkpath(startMenu());
    ModalDriver modal;
    modal.answer(noWindowManager, QMessageBox::Ok);
    auto dialog = std::make_unique<VelMenuDialog>(startMenu(), -1, true, true);
    dialog->show();
    QVERIFY(!dialog->updateWM());
    QVERIFY(modal.finished());
    // It is told on the way out as well.
    modal.answer(noWindowManager, QMessageBox::Ok);
    dialog.reset();
    QVERIFY(modal.finished());
}

void tst_VelMenuDialogWindowManager::closesQuietlyWithAssistance()
{
    QDir().mkpath(startMenu());
    QVERIFY(!MenuUpdateCommand::isHeard());
    ModalDriver modal;
    VelMenuDialog dialog(startMenu(), -1, true, true);
    dialog.setAssistance(true);
    QVERIFY(!dialog.updateWM());
    {
        WindowManager manager;
        QVERIFY(MenuUpdateCommand::isHeard());
        QVERIFY(dialog.updateWM());
        QTRY_COMPARE(manager.lines().size(), 1);
    }
    QVERIFY(!dialog.updateWM());
    dialog.setAssistance(false);
    modal.answer(noWindowManager, QMessageBox::Ok);
    QVERIFY(!dialog.updateWM());
    QVERIFY(modal.finished());
    dialog.setAssistance(true);
}

void tst_VelMenuDialogWindowManager::leavesTheChannelToAWindowManagerThatComesLater()
{
    QDir().mkpath(startMenu());
    auto dialog = std::make_unique<VelMenuDialog>(startMenu(), -1, true, true);
    dialog->setAssistance(true);
    dialog->show();
    QVERIFY(!dialog->updateWM());
    // One that takes the channel from nobody.
    WindowManager manager;
    QVERIFY(manager.owns());
    dialog.reset();
    QTRY_COMPARE(manager.lines(), QList<QByteArray>{"VELWM_UPDATE_STARTMENU"});
}

void tst_VelMenuDialogWindowManager::tellsTheWindowManagerWhenApplied()
{
    QDir().mkpath(startMenu());
    WindowManager manager;
    VelMenuDialog dialog(startMenu(), -1, true, true);
    QVERIFY(dialog.updateWM());
    QTRY_COMPARE(manager.lines().size(), 1);
    dialog.applySlot();
    QTRY_COMPARE(manager.lines().size(), 2);
    QCOMPARE(manager.lines().constLast(), QByteArray("VELWM_UPDATE_STARTMENU"));
}

VEL_TEST_MAIN(tst_VelMenuDialogWindowManager)
#include "tst_VelMenuDialogWindowManager.moc"
