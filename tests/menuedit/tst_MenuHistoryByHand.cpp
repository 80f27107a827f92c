// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExactTree.h"
#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QDialogButtonBox>
#include <QLayout>
#include <QLineEdit>
#include <QMessageBox>
#include <QPushButton>
#include <QSignalSpy>

#include <functional>
#include <memory>

// Last: the macros of Xlib's header hide names of Qt.
#include "CommandChannel.h"

using Deed = std::function<void()>;
Q_DECLARE_METATYPE(Deed)

/// What a person does to a menu with mouse and keyboard, takes back and does again.
class tst_MenuHistoryByHand : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void takesEverythingBack_data();
    void takesEverythingBack();
    void takesOneStepAfterTheOtherBack();

private:
    void drag(const QPoint &from, const QPoint &to, const QString &choice);
    void pressAt(const char *file, const QString &keys);
    static void fillIn(QWidget *editor, const char *field, const QString &text);
    static void confirmEditor(ModalDriver &modal, const QString &name);
    QString in(const char *file) const { return startMenu() + QLatin1Char('/') + QLatin1String(file); }
    ExactTree tree() const { return ExactTree::of(path(QStringLiteral("config"))); }
    QMap<QString, QStringList> rows() const;
    QString undoText() const { return view().undoAction()->text(); }

    std::unique_ptr<CommandChannel> m_channel;
};

void tst_MenuHistoryByHand::init()
{
    HandsOnTestCase::init();
    m_channel = std::make_unique<CommandChannel>();
    write(QStringLiteral("data/applications/piano.desktop"),
          entryText(QStringLiteral("Piano"), "Exec=true\nCategories=Game;\n"));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("data"))));
    for (const char *name : {"a", "b", "c", "games/x", "games/y"})
        write(QStringLiteral("config/startmenu/%1.desktop").arg(QLatin1String(name)),
              entryText(QString::fromLatin1(name).toUpper()));
    write(QStringLiteral("config/startmenu/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Menu\nSortOrder=games;a.desktop;b.desktop;c.desktop;\n");
    write(QStringLiteral("config/startmenu/games/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Games\nSortOrder=y.desktop;x.desktop;\n");
    openDialog(startMenu(), 4);
    QVERIFY(open(view(), in("games"), 2));
    dialog()->setAssistance(true);
    // The lines above and below the tree take their room from it before anything is clicked.
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
}

void tst_MenuHistoryByHand::cleanup()
{
    closeDialog();
    m_channel.reset();
    HandsOnTestCase::cleanup();
}

QMap<QString, QStringList> tst_MenuHistoryByHand::rows() const
{
    return {{QString(), names(view(), startMenu())}, {QStringLiteral("games"), names(view(), in("games"))}};
}

void tst_MenuHistoryByHand::fillIn(QWidget *editor, const char *field, const QString &text)
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

void tst_MenuHistoryByHand::confirmEditor(ModalDriver &modal, const QString &name)
{
    modal.handle([name](QWidget *editor) {
        QVERIFY(qobject_cast<VelDesktopEntryEditDialog *>(editor));
        QVERIFY(QTest::qWaitForWindowActive(editor));
        fillIn(editor, "nameEdit", name);
        fillIn(editor, "localNameEdit", name);
        if (!editor->windowTitle().endsWith(QLatin1String("/.directory")))
            fillIn(editor, "execEdit", QStringLiteral("true"));
        XDoTool::click(
            editor->findChild<QDialogButtonBox *>(QStringLiteral("buttonBox"))->button(QDialogButtonBox::Ok));
    });
}

void tst_MenuHistoryByHand::pressAt(const char *file, const QString &keys)
{
    clickItem(in(file));
    XDoTool::press(keys);
}

void tst_MenuHistoryByHand::drag(const QPoint &from, const QPoint &to, const QString &choice)
{
    ModalDriver modal;
    pickInDropMenu(modal, choice);
    QString script = QStringLiteral("mousemove %1 sleep 0.3 mousedown 1 sleep 0.2")
                         .arg(XDoTool::at(view().viewport(), from));
    for (int i = 1; i <= 8; ++i)
        script += QStringLiteral(" mousemove %1 sleep 0.1")
                      .arg(XDoTool::at(view().viewport(), from + (to - from) * i / 8));
    XDoTool::run(script + QStringLiteral(" mouseup 1"));
    QTRY_VERIFY(modal.finished());
}

void tst_MenuHistoryByHand::takesEverythingBack_data()
{
    QTest::addColumn<Deed>("deed");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("back"); // what is selected when it was taken back
    const auto row = [](const char *name, const Deed &deed, const char *text, const char *back) {
        QTest::newRow(name) << deed << QString::fromLatin1(text) << QString::fromLatin1(back);
    };
    row(
        "new entry",
        [this] {
            ModalDriver modal;
            confirmEditor(modal, QStringLiteral("Zeta"));
            pressAt("games/x.desktop", QStringLiteral("ctrl+n"));
            QTRY_VERIFY(modal.finished());
        },
        "Undo creation of Zeta", "");
    row(
        "new folder",
        [this] {
            ModalDriver modal;
            confirmEditor(modal, QStringLiteral("Group"));
            clickItem(in("a.desktop"));
            clickAction("dirNewAction");
            QTRY_VERIFY(modal.finished());
        },
        "Undo creation of Group", "");
    row(
        "edit",
        [this] {
            ModalDriver modal;
            confirmEditor(modal, QStringLiteral("Other"));
            pressAt("games/y.desktop", QStringLiteral("F2"));
            QTRY_VERIFY(modal.finished());
        },
        "Undo change of Other", "games/y.desktop");
    row(
        "edit a folder",
        [this] {
            ModalDriver modal;
            confirmEditor(modal, QStringLiteral("Fun"));
            pressAt("games", QStringLiteral("F2"));
            QTRY_VERIFY(modal.finished());
        },
        "Undo change of", "games");
    row(
        "delete", [this] { pressAt("b.desktop", QStringLiteral("Delete")); }, "Undo deletion of B",
        "b.desktop");
    row(
        "delete a folder", [this] { pressAt("games", QStringLiteral("Delete")); },
        "Undo deletion of folder Games (2 entries)", "games");
    row(
        "cut and paste",
        [this] {
            pressAt("b.desktop", QStringLiteral("ctrl+x"));
            pressAt("games/x.desktop", QStringLiteral("ctrl+v"));
        },
        "Undo moving of B to Games", "b.desktop");
    row(
        "copy and paste",
        [this] {
            pressAt("games/x.desktop", QStringLiteral("ctrl+c"));
            pressAt("b.desktop", QStringLiteral("ctrl+v"));
        },
        "Undo copying of GAMES/X to Menu", "games/x.desktop");
    row(
        "drag into a folder",
        [this] { drag(placeOf(in("c.desktop")), placeOf(in("games")), QStringLiteral("Move")); },
        "Undo moving of C to Games", "c.desktop");
    row(
        "drag a copy",
        [this] { drag(placeOf(in("c.desktop")), placeOf(in("games")), QStringLiteral("Copy")); },
        "Undo copying of C to Games", "c.desktop");
    row(
        "drag to another place",
        [this] {
            const QRect area = view().visualRect(shown(view(), in("a.desktop")));
            drag(placeOf(in("c.desktop")), QPoint(area.left() + 40, area.top() + 1), QStringLiteral("Move"));
        },
        "Undo reordering of C", "c.desktop");
    row(
        "up",
        [this] {
            clickItem(in("games/x.desktop"));
            clickAction("upAction");
        },
        "Undo reordering of GAMES/X", "games/x.desktop");
    row(
        "default menu",
        [this] {
            ModalDriver modal;
            modal.handle([](QWidget *window) {
                QVERIFY(QTest::qWaitForWindowActive(window));
                XDoTool::press(QStringLiteral("Return"));
            });
            clickAction("recreateAction");
            QTRY_VERIFY(modal.finished());
        },
        "Undo default menu", "");
}

void tst_MenuHistoryByHand::takesEverythingBack()
{
    QFETCH(Deed, deed);
    QFETCH(QString, text);
    QFETCH(QString, back);
    const ExactTree before = tree();
    const auto rowsBefore = rows();
    QVERIFY(!view().undoAction()->isEnabled() && !view().redoAction()->isEnabled());
    deed();
    QTRY_VERIFY2(undoText().startsWith(text), qPrintable(undoText()));
    const ExactTree after = tree();
    QVERIFY(!before.difference(after).isEmpty());
    QSignalSpy changes(&view(), &VelMenuView::changed);
    view().setFocus();

    for (int i = 0; i < 2; ++i) {
        XDoTool::press(QStringLiteral("ctrl+z"));
        QTRY_VERIFY(!view().undoAction()->isEnabled() && view().redoAction()->isEnabled());
        QCOMPARE(before.difference(tree(), {"*"}), QString());
        open(view(), startMenu(), 4);
        open(view(), in("games"), 2);
        QTRY_COMPARE(rows(), rowsBefore);
        if (!back.isEmpty())
            QTRY_COMPARE(view().selectedPath(), startMenu() + QLatin1Char('/') + back);
        XDoTool::press(QStringLiteral("ctrl+shift+z"));
        QTRY_VERIFY(view().undoAction()->isEnabled() && !view().redoAction()->isEnabled());
        QCOMPARE(after.difference(tree(), {"*"}), QString());
    }
    QCOMPARE(changes.count(), 4);
}

void tst_MenuHistoryByHand::takesOneStepAfterTheOtherBack()
{
    QSignalSpy told(&view(), &VelMenuView::told);
    const ExactTree before = tree();
    pressAt("a.desktop", QStringLiteral("ctrl+x"));
    pressAt("games", QStringLiteral("ctrl+v"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo moving of A to Games"));
    QTRY_COMPARE(view().selectedPath(), in("games/a.desktop"));
    XDoTool::press(QStringLiteral("Left"));
    QTRY_COMPARE(view().selectedPath(), in("games"));
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo deletion of folder Games (3 entries)"));
    QCOMPARE(told.takeLast().constFirst().toString(),
             QStringLiteral("The folder Games was deleted (3 entries)."));
    QTRY_COMPARE(names(view(), startMenu()).size(), 2);
    pressAt("c.desktop", QStringLiteral("Delete"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo deletion of C"));

    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo deletion of folder Games (3 entries)"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo moving of A to Games"));
    QTRY_COMPARE(view().selectedPath(), in("games"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo"));
    QCOMPARE(before.difference(tree(), {"*"}), QString());
    QCOMPARE(told.takeLast().constFirst().toString(), QStringLiteral("Done: Undo moving of A to Games"));
}

VEL_TEST_MAIN(tst_MenuHistoryByHand)
#include "tst_MenuHistoryByHand.moc"
