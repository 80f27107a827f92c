// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"

#include <QAction>
#include <QClipboard>
#include <QContextMenuEvent>
#include <QDialogButtonBox>
#include <QMenu>
#include <QMimeData>
#include <QPointer>
#include <QProcess>
#include <QPushButton>

/// Keys and the edit menu in the dialog, on a real display.
class tst_VelMenuDialogKeys : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void takesKeysInTheTree();
    void leavesSpaceToTheButtons();
    void showsTheEditMenu();
    void startsProgramsThatOutliveIt();
};

void tst_VelMenuDialogKeys::takesKeysInTheTree()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, true, true);
    auto *view = dialog.findChild<VelMenuView *>();
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QVERIFY(open(*view, menu(), 1));
    view->setFocus();
    select(*view, a);

    ModalDriver modal;
    // A window that was closed may be gone before the window manager has seen it, and nobody has the
    // keyboard.
    const auto press = [&](Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier) {
        const auto hasKeyboard = [&] {
            dialog.activateWindow();
            return view->hasFocus() && !QApplication::activeModalWidget();
        };
        QTRY_VERIFY(hasKeyboard());
        QTest::keyClick(view, key, modifiers);
    };
    const auto expectEditor = [](QWidget *window) {
        QVERIFY(window->windowTitle().startsWith(QLatin1String("Desktop Entry ")));
        qobject_cast<QDialog *>(window)->reject();
    };
    modal.handle(expectEditor);
    press(Qt::Key_Space);
    QTRY_VERIFY(modal.finished());
    modal.handle(expectEditor);
    press(Qt::Key_N, Qt::ControlModifier);
    QTRY_VERIFY(modal.finished());
    QTRY_COMPARE(names(*view, menu()).size(), 1);
    select(*view, a);
    modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                  QStringLiteral("Are you sure to delete it?"), QMessageBox::Yes | QMessageBox::No,
                  QMessageBox::Yes},
                 QMessageBox::No);
    press(Qt::Key_Delete);
    QTRY_VERIFY(modal.finished());
    modal.handle([](QWidget *window) {
        QCOMPARE(window->windowTitle(), QStringLiteral("Find"));
        qobject_cast<QDialog *>(window)->reject();
    });
    press(Qt::Key_F, Qt::ControlModifier);
    QTRY_VERIFY(modal.finished());
    press(Qt::Key_X, Qt::ControlModifier);
    QTRY_VERIFY(QGuiApplication::clipboard()->mimeData()->hasFormat(QStringLiteral("text/uri-move-list")));
    press(Qt::Key_C, Qt::ControlModifier);
    QTRY_VERIFY(!QGuiApplication::clipboard()->mimeData()->hasFormat(QStringLiteral("text/uri-move-list")));
    QGuiApplication::clipboard()->clear();
    QVERIFY(QFile::exists(a));
}

void tst_VelMenuDialogKeys::leavesSpaceToTheButtons()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, true, true);
    auto *view = dialog.findChild<VelMenuView *>();
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QVERIFY(open(*view, menu(), 1));
    select(*view, a);
    auto *close = dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Close);
    close->setFocus();
    QTRY_VERIFY(close->hasFocus());
    const ModalDriver modal;
    QTest::keyClick(close, Qt::Key_Space);
    QVERIFY(!dialog.isVisible());
    QCOMPARE(dialog.result(), int(QDialog::Accepted));
    QVERIFY(modal.finished());
}

void tst_VelMenuDialogKeys::showsTheEditMenu()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, true, true);
    auto *view = dialog.findChild<VelMenuView *>();
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QVERIFY(open(*view, menu(), 1));
    QGuiApplication::clipboard()->clear();
    const QPoint place = view->viewport()->mapToGlobal(QPoint(20, 60));
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        auto *shownMenu = qobject_cast<QMenu *>(window);
        QVERIFY(shownMenu);
        QCOMPARE(shownMenu->title(), QStringLiteral("Edit"));
        QCOMPARE(shownMenu->pos(), place);
        QVERIFY(!action(*view, QStringLiteral("editAction"))->isEnabled());
        shownMenu->close();
    });
    // Stale until the menu is asked for.
    action(*view, QStringLiteral("editAction"))->setEnabled(true);
    QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(20, 60), place);
    QCoreApplication::sendEvent(view->viewport(), &event);
    QVERIFY(modal.finished());
}

void tst_VelMenuDialogKeys::startsProgramsThatOutliveIt()
{
    const QString go = path(QStringLiteral("go"));
    const QString log = path(QStringLiteral("log"));
    const QString opener =
        write(QStringLiteral("bin/vel-open"),
              "#!/bin/sh\nwhile [ ! -e '" + QFile::encodeName(go) + "' ]; do sleep 0.05; done\necho \"$@\" >'"
                  + QFile::encodeName(log) + "'\n");
    QVERIFY(QFile::setPermissions(opener, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    const QByteArray searchPath = qgetenv("PATH");
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))) + ':' + searchPath);
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    QPointer<QProcess> started;
    {
        VelMenuDialog dialog(menu(), -1, true, true);
        auto *view = dialog.findChild<VelMenuView *>();
        dialog.show();
        QVERIFY(QTest::qWaitForWindowActive(&dialog));
        QVERIFY(open(*view, menu(), 1));
        view->setFocus();
        select(*view, a);
        QTest::keyClick(view, Qt::Key_E, Qt::ControlModifier);
        started = view->findChild<QProcess *>();
        QVERIFY(started);
    }
    QVERIFY(started);
    write(QStringLiteral("go"), "");
    QTRY_COMPARE(QFileInfo(log).size(), qint64(QFile::encodeName(a).size()) + 8);
    QTRY_VERIFY(!started);
    qputenv("PATH", searchPath);
}

VEL_TEST_MAIN(tst_VelMenuDialogKeys)
#include "tst_VelMenuDialogKeys.moc"
