// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "QtMajor.h"
#include "WindowManager.h"

#include <EditShortcutsDialog.h>
#include <ShortcutsModel.h>
#include <VelDesktopEntryEditDialog.h>
#include <VelKeyServer.h>
#include <VelMenuDialog.h>
#include <frame/QtMajor.h>
#include <menuedit/MenuUpdateCommand.h>
#include <shortcuts/KeyboardLayout.h>

#include <QAction>
#include <QProcess>
#include <QtPlugin>
#include <qpa/qplatformnativeinterface.h>

#include <memory>

Q_IMPORT_PLUGIN(OtherPlatform)

/// A platform that has a display which is none of X11's.
class tst_OtherPlatform : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hasADisplayThatIsNoneOfX11();
    void sendsNoCommandThere();
    void warnsThatNoWindowManagerIsToldThere();
    void tellsTheWindowManagerOverTheBus();
    void namesKeysThere();
    void opensAndClosesEachDialogThere();
};

void tst_OtherPlatform::hasADisplayThatIsNoneOfX11()
{
    QCOMPARE(QGuiApplication::platformName(), QStringLiteral("other"));
    QVERIFY(QGuiApplication::platformNativeInterface()->nativeResourceForIntegration("display"));
    QVERIFY(!QtMajor::x11Display());
}

void tst_OtherPlatform::sendsNoCommandThere()
{
    QVERIFY(!MenuUpdateCommand::send("VELWM_UPDATE_STARTMENU\n"));
}

void tst_OtherPlatform::warnsThatNoWindowManagerIsToldThere()
{
    QDir().mkpath(startMenu());
    ModalDriver modal;
    modal.answer({QMessageBox::Warning, QStringLiteral("Warning"),
                  QStringLiteral("Can't send command to vel-wm"), QMessageBox::Ok},
                 QMessageBox::Ok);
    auto dialog = std::make_unique<VelMenuDialog>(startMenu(), -1, true, true);
    dialog->show();
    dialog.reset();
    QVERIFY(modal.finished());
}

void tst_OtherPlatform::tellsTheWindowManagerOverTheBus()
{
    qunsetenv("DISPLAY");
    QProcess bus;
    bus.start(QStringLiteral("dbus-daemon"),
              {QStringLiteral("--session"), QStringLiteral("--nofork"), QStringLiteral("--print-address=1")});
    QVERIFY(bus.waitForReadyRead(20000));
    qputenv("DBUS_SESSION_BUS_ADDRESS", bus.readLine().trimmed());
    QDir().mkpath(startMenu());
    VelMenuDialog dialog(startMenu(), -1, true, true);
    dialog.setAssistance(true);
    QVERIFY(!dialog.updateWM());
    WindowManager manager;
    QVERIFY(manager.owns());
    QVERIFY(dialog.updateWM());
    QTRY_COMPARE(manager.lines(), QList<QByteArray>{"VELWM_UPDATE_STARTMENU"});
    bus.terminate();
    QVERIFY(bus.waitForFinished(20000));
    qunsetenv("DBUS_SESSION_BUS_ADDRESS");
    QVERIFY(!dialog.updateWM());
}

void tst_OtherPlatform::namesKeysThere()
{
    QCOMPARE(VelKeyServer::KeyQtToKeyStringX(VelTest::keyNumber(Qt::CTRL | Qt::Key_A)),
             QStringLiteral("Ctrl+A"));
    QCOMPARE(VelKeyServer::KeyStringXToQt(QStringLiteral("Ctrl+A")), QStringLiteral("Ctrl+A"));
    const int all = int(Qt::META) | Qt::ALT | Qt::SHIFT | Qt::CTRL;
    QCOMPARE(VelKeyServer::KeyQtToKeyStringX(all | Qt::Key_F2), QStringLiteral("Ctrl+Shift+Alt+Mod4+F2"));
    QCOMPARE(VelKeyServer::KeyStringXToQt(QStringLiteral("Ctrl+Shift+Alt+Mod4+F2")),
             QKeySequence(all | Qt::Key_F2).toString(QKeySequence::PortableText));
    QCOMPARE(VelKeyServer::KeyQtToKeyStringX(VelTest::keyNumber(Qt::KeypadModifier | Qt::Key_5)),
             QStringLiteral("KP_5"));
    QVERIFY(KeyboardLayout::produces(Qt::Key_A));
}

void tst_OtherPlatform::opensAndClosesEachDialogThere()
{
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelDesktopEntryEditDialog editor;
    QVERIFY(editor.setDesktopEntryPath(entry));
    editor.show();
    editor.reject();
    ShortcutsModel model(nullptr, QString());
    QAction action(QStringLiteral("A"));
    model.registerAction(QStringLiteral("a"), &action);
    EditShortcutsDialog shortcuts(&model);
    shortcuts.show();
    shortcuts.accept();
    VelMenuDialog menu(folder(), 16, true, true);
    menu.show();
    menu.accept();
}

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "other");
    VelTest::TestEnvironment environment;
    QApplication application(argc, argv);
    tst_OtherPlatform test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_OtherPlatform.moc"
