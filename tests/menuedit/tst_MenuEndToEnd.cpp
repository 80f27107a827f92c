// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"

#include <QAction>
#include <QClipboard>
#include <QDialogButtonBox>
#include <QLineEdit>
#include <QMenu>
#include <QMessageBox>
#include <QMimeData>
#include <QProcess>
#include <QPushButton>
#include <QToolBar>

#include <memory>

// Last: the macros of Xlib's header hide names of Qt.
#include "CommandChannel.h"

namespace {

/// A place for xdotool, from the window's corner: Qt may not have heard yet where that is.
QString at(const QWidget *widget, const QPoint &place)
{
    const QWidget *window = widget->window();
    const QPoint inside = widget->mapTo(window, place);
    return QStringLiteral("--window %1 %2 %3").arg(window->winId()).arg(inside.x()).arg(inside.y());
}

} // namespace

/// The menu editor as a person uses it, with mouse and keyboard.
class tst_MenuEndToEnd : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void editsTheStartMenu();

private:
    static void xdotool(const QString &script);
    static void click(const QWidget *widget, const QPoint &place)
    {
        xdotool(QStringLiteral("mousemove %1 sleep 0.1 click 1").arg(at(widget, place)));
    }
    static void click(const QWidget *widget) { click(widget, widget->rect().center()); }
    static void press(const QString &keys) { xdotool(QStringLiteral("key --clearmodifiers %1").arg(keys)); }
    void clickAction(const char *name);
    QPoint placeOf(const QString &file);
    static void fillIn(QWidget *editor, const char *field, const QString &text);
    void openDialog();
    void createEntry();
    void dragIntoGames();
    static void deleteSelected();
    QString inMenu(const char *file) const { return startMenu() + QLatin1Char('/') + QLatin1String(file); }

    std::unique_ptr<CommandChannel> m_channel;
    std::unique_ptr<VelMenuDialog> m_dialog;
    VelMenuView *m_view = nullptr;
};

void tst_MenuEndToEnd::init()
{
    MenuTestCase::init();
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
    QGuiApplication::clipboard()->clear();
    m_dialog.reset();
    m_channel.reset();
    MenuTestCase::cleanup();
}

// Events go on while it works, also those of a drag.
void tst_MenuEndToEnd::xdotool(const QString &script)
{
    QProcess process;
    process.start(QStringLiteral("xdotool"), script.split(QLatin1Char(' '), Qt::SkipEmptyParts));
    QVERIFY(QTest::qWaitFor([&] { return process.state() == QProcess::NotRunning; }, 30000));
    QCOMPARE(process.exitCode(), 0);
}

void tst_MenuEndToEnd::openDialog()
{
    m_dialog = std::make_unique<VelMenuDialog>(startMenu(), 22, true, true, nullptr, Qt::Window);
    m_view = m_dialog->findChild<VelMenuView *>();
    m_dialog->show();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    QVERIFY(open(*m_view, startMenu(), 4));
}

void tst_MenuEndToEnd::clickAction(const char *name)
{
    auto *bar = m_dialog->findChild<QToolBar *>();
    QWidget *button = bar->widgetForAction(action(*m_view, QLatin1String(name)));
    QVERIFY(button && button->isVisible() && button->isEnabled());
    click(button);
}

QPoint tst_MenuEndToEnd::placeOf(const QString &file)
{
    const QRect area = m_view->visualRect(shown(*m_view, file));
    if (!m_view->viewport()->rect().contains(area.center()))
        QTest::qFail(qPrintable(file + QLatin1String(" is out of sight")), __FILE__, __LINE__);
    return {area.left() + 40, area.center().y()};
}

void tst_MenuEndToEnd::fillIn(QWidget *editor, const char *field, const QString &text)
{
    auto *widget = editor->findChild<QWidget *>(QLatin1String(field));
    QVERIFY(widget);
    auto *line = qobject_cast<QLineEdit *>(widget);
    if (!line)
        line = widget->findChild<QLineEdit *>();
    click(line);
    QTRY_VERIFY(line->hasFocus());
    press(QStringLiteral("ctrl+a"));
    xdotool(QStringLiteral("type --delay 30 ") + text);
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
        click(
            editor->findChild<QDialogButtonBox *>(QStringLiteral("buttonBox"))->button(QDialogButtonBox::Ok));
    });
    clickAction("fileNewAction");
    QTRY_VERIFY(modal.finished());
    QTRY_VERIFY(!QApplication::activeModalWidget());
}

void tst_MenuEndToEnd::dragIntoGames()
{
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        auto *menu = qobject_cast<QMenu *>(window);
        QVERIFY(menu);
        QAction *move = menu->actions().constFirst();
        QCOMPARE(move->text(), QStringLiteral("Move"));
        click(menu, menu->actionGeometry(move).center());
    });
    const QPoint from = placeOf(inMenu("shortcut.desktop"));
    const QPoint to = placeOf(inMenu("games"));
    QString script =
        QStringLiteral("mousemove %1 sleep 0.5 mousedown 1 sleep 0.3").arg(at(m_view->viewport(), from));
    for (int i = 1; i <= 8; ++i)
        script += QStringLiteral(" mousemove %1 sleep 0.15")
                      .arg(at(m_view->viewport(), from + (to - from) * i / 8));
    xdotool(script + QStringLiteral(" mouseup 1"));
    QTRY_VERIFY(modal.finished());
}

void tst_MenuEndToEnd::deleteSelected()
{
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        auto *box = qobject_cast<QMessageBox *>(window);
        QVERIFY(box);
        QVERIFY(QTest::qWaitForWindowActive(box));
        click(box->button(QMessageBox::Yes));
    });
    press(QStringLiteral("Delete"));
    QTRY_VERIFY(modal.finished());
}

void tst_MenuEndToEnd::editsTheStartMenu()
{
    openDialog();
    const QByteArray first("games;a.desktop;b.desktop;c.desktop;");
    const QByteArray games("y.desktop;x.desktop;");

    createEntry();
    const QString made = inMenu("shortcut.desktop");
    QTRY_VERIFY(QFile::exists(made));
    const QByteArray record = read(made);
    QVERIFY2(record.contains("\nName=Zeta\n") && record.contains("\nExec=true\n"), record.constData());
    QCOMPARE(sortOrderOf(startMenu()), first);
    QTRY_COMPARE(names(*m_view, startMenu()).join(QLatin1Char(' ')), QStringLiteral("Games A B C Zeta"));
    QCOMPARE(m_view->selectedPath(), made);

    clickAction("upAction");
    clickAction("upAction");
    const QByteArray second("*;games;a.desktop;shortcut.desktop;b.desktop;c.desktop;");
    QTRY_COMPARE(sortOrderOf(startMenu()), second);
    QCOMPARE(names(*m_view, startMenu()).join(QLatin1Char(' ')), QStringLiteral("Games A Zeta B C"));

    dragIntoGames();
    const QString moved = inMenu("games/shortcut.desktop");
    QTRY_VERIFY(QFile::exists(moved));
    QCOMPARE(read(moved), record);
    QVERIFY(!QFile::exists(made));
    QCOMPARE(sortOrderOf(startMenu()), second);
    QCOMPARE(sortOrderOf(inMenu("games")), games);
    QTRY_COMPARE(m_view->selectedPath(), moved);

    press(QStringLiteral("ctrl+x"));
    QTRY_VERIFY(m_view->dndFormat(QGuiApplication::clipboard()->mimeData()).contains(QLatin1String("move")));
    click(m_view->viewport(), placeOf(inMenu("b.desktop")));
    QTRY_COMPARE(m_view->selectedPath(), inMenu("b.desktop"));
    press(QStringLiteral("ctrl+v"));
    QTRY_VERIFY(QFile::exists(made));
    QCOMPARE(read(made), record);
    QVERIFY(!QFile::exists(moved));
    QCOMPARE(sortOrderOf(startMenu()), second);
    QCOMPARE(sortOrderOf(inMenu("games")), games);
    QTRY_COMPARE(m_view->selectedPath(), made);

    deleteSelected();
    QTRY_VERIFY(!QFile::exists(made));
    QCOMPARE(sortOrderOf(startMenu()), second);
    QTRY_COMPARE(names(*m_view, startMenu()).join(QLatin1Char(' ')), QStringLiteral("Games A B C"));
    QCOMPARE(everythingIn(startMenu()).join(QLatin1Char(' ')),
             QStringLiteral(".directory a.desktop b.desktop c.desktop games games/.directory games/x.desktop "
                            "games/y.desktop"));

    QCOMPARE(m_channel->bytes(), QByteArray());
    click(m_dialog->findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Close));
    QTRY_VERIFY(!m_dialog->isVisible());
    m_dialog.reset();
    QCOMPARE(m_channel->bytes(), QByteArray("VELWM_UPDATE_STARTMENU\n"));
}

VEL_TEST_MAIN(tst_MenuEndToEnd)
#include "tst_MenuEndToEnd.moc"
