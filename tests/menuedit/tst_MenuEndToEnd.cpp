// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QClipboard>
#include <QDialogButtonBox>
#include <QLineEdit>
#include <QMessageBox>
#include <QMimeData>
#include <QPushButton>

#include <memory>

// Last: the macros of Xlib's header hide names of Qt.
#include "CommandChannel.h"

/// The menu editor as a person uses it, with mouse and keyboard.
class tst_MenuEndToEnd : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void editsTheStartMenu();

private:
    static void fillIn(QWidget *editor, const char *field, const QString &text);
    void createEntry();
    void dragIntoGames();
    static void deleteSelected();
    QString inMenu(const char *file) const { return startMenu() + QLatin1Char('/') + QLatin1String(file); }

    std::unique_ptr<CommandChannel> m_channel;
};

void tst_MenuEndToEnd::init()
{
    HandsOnTestCase::init();
    m_channel = std::make_unique<CommandChannel>();
    for (const char *name : {"a", "b", "c", "games/x", "games/y"})
        write(QStringLiteral("config/startmenu/%1.desktop").arg(QLatin1String(name)),
              entryText(QString::fromLatin1(name).toUpper()));
    write(QStringLiteral("config/startmenu/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Menu\nSortOrder=games;a.desktop;b.desktop;c.desktop;\n");
    write(QStringLiteral("config/startmenu/games/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Games\nSortOrder=y.desktop;x.desktop;\n");
}

void tst_MenuEndToEnd::cleanup()
{
    closeDialog();
    m_channel.reset();
    HandsOnTestCase::cleanup();
}

void tst_MenuEndToEnd::fillIn(QWidget *editor, const char *field, const QString &text)
{
    auto *widget = editor->findChild<QWidget *>(QLatin1String(field));
    QVERIFY(widget);
    auto *line = qobject_cast<QLineEdit *>(widget);
    if (!line)
        line = widget->findChild<QLineEdit *>();
    XDoTool::click(line);
    QTRY_VERIFY(line->hasFocus());
    XDoTool::press(QStringLiteral("ctrl+a"));
    XDoTool::run(QStringLiteral("type --delay 30 ") + text);
    QTRY_COMPARE(line->text(), text);
}

void tst_MenuEndToEnd::createEntry()
{
    ModalDriver modal;
    modal.handle([](QWidget *editor) {
        QVERIFY(qobject_cast<VelDesktopEntryEditDialog *>(editor));
        QVERIFY(QTest::qWaitForWindowActive(editor));
        fillIn(editor, "nameEdit", QStringLiteral("Zeta"));
        fillIn(editor, "localNameEdit", QStringLiteral("Zeta"));
        fillIn(editor, "execEdit", QStringLiteral("true"));
        XDoTool::click(
            editor->findChild<QDialogButtonBox *>(QStringLiteral("buttonBox"))->button(QDialogButtonBox::Ok));
    });
    clickAction("fileNewAction");
    QTRY_VERIFY(modal.finished());
    QTRY_VERIFY(!QApplication::activeModalWidget());
}

void tst_MenuEndToEnd::dragIntoGames()
{
    ModalDriver modal;
    pickInDropMenu(modal, QStringLiteral("Move"));
    const QPoint from = placeOf(inMenu("shortcut.desktop"));
    const QPoint to = placeOf(inMenu("games"));
    QString script = QStringLiteral("mousemove %1 sleep 0.5 mousedown 1 sleep 0.3")
                         .arg(XDoTool::at(view().viewport(), from));
    for (int i = 1; i <= 8; ++i)
        script += QStringLiteral(" mousemove %1 sleep 0.15")
                      .arg(XDoTool::at(view().viewport(), from + (to - from) * i / 8));
    XDoTool::run(script + QStringLiteral(" mouseup 1"));
    QTRY_VERIFY(modal.finished());
}

void tst_MenuEndToEnd::deleteSelected()
{
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        auto *box = qobject_cast<QMessageBox *>(window);
        QVERIFY(box);
        QVERIFY(QTest::qWaitForWindowActive(box));
        XDoTool::click(box->button(QMessageBox::Yes));
    });
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_VERIFY(modal.finished());
}

void tst_MenuEndToEnd::editsTheStartMenu()
{
    openDialog(startMenu(), 4);
    const QByteArray first("games;a.desktop;b.desktop;c.desktop;");
    const QByteArray games("y.desktop;x.desktop;");

    createEntry();
    const QString made = inMenu("shortcut.desktop");
    QTRY_VERIFY(QFile::exists(made));
    const QByteArray record = read(made);
    QVERIFY2(record.contains("\nName=Zeta\n") && record.contains("\nExec=true\n"), record.constData());
    QCOMPARE(sortOrderOf(startMenu()), first);
    QTRY_COMPARE(names(view(), startMenu()).join(QLatin1Char(' ')), QStringLiteral("Games A B C Zeta"));
    QCOMPARE(view().selectedPath(), made);

    clickAction("upAction");
    clickAction("upAction");
    const QByteArray second("*;games;a.desktop;shortcut.desktop;b.desktop;c.desktop;");
    QTRY_COMPARE(sortOrderOf(startMenu()), second);
    QCOMPARE(names(view(), startMenu()).join(QLatin1Char(' ')), QStringLiteral("Games A Zeta B C"));

    dragIntoGames();
    const QString moved = inMenu("games/shortcut.desktop");
    QTRY_VERIFY(QFile::exists(moved));
    QCOMPARE(read(moved), record);
    QVERIFY(!QFile::exists(made));
    QCOMPARE(sortOrderOf(startMenu()), second);
    QCOMPARE(sortOrderOf(inMenu("games")), games);
    QTRY_COMPARE(view().selectedPath(), moved);

    XDoTool::press(QStringLiteral("ctrl+x"));
    QTRY_VERIFY(view().dndFormat(QGuiApplication::clipboard()->mimeData()).contains(QLatin1String("move")));
    clickItem(inMenu("b.desktop"));
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_VERIFY(QFile::exists(made));
    QCOMPARE(read(made), record);
    QVERIFY(!QFile::exists(moved));
    QCOMPARE(sortOrderOf(startMenu()), second);
    QCOMPARE(sortOrderOf(inMenu("games")), games);
    QTRY_COMPARE(view().selectedPath(), made);

    deleteSelected();
    QTRY_VERIFY(!QFile::exists(made));
    QCOMPARE(sortOrderOf(startMenu()), second);
    QTRY_COMPARE(names(view(), startMenu()).join(QLatin1Char(' ')), QStringLiteral("Games A B C"));
    QCOMPARE(everythingIn(startMenu()).join(QLatin1Char(' ')),
             QStringLiteral(".directory a.desktop b.desktop c.desktop games games/.directory games/x.desktop "
                            "games/y.desktop"));

    QCOMPARE(m_channel->bytes(), QByteArray());
    XDoTool::click(dialog()->findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Close));
    QTRY_VERIFY(!dialog()->isVisible());
    closeDialog();
    QCOMPARE(m_channel->bytes(), QByteArray("VELWM_UPDATE_STARTMENU\n"));
}

VEL_TEST_MAIN(tst_MenuEndToEnd)
#include "tst_MenuEndToEnd.moc"
