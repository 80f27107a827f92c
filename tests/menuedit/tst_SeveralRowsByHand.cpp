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
#include <QClipboard>
#include <QLayout>
#include <QMenu>
#include <QMimeData>

/// What a person does to several items of a menu at once.
class tst_SeveralRowsByHand : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void selectsByMouseAndKeyboard();
    void selectsOneWithoutAssistance();
    void deletesAllInOneStep();
    void movesByCutAndPaste();
    void copiesFromTheTop();
    void dragsAll_data();
    void dragsAll();
    void movesABlockByKeys();
    void editsTheItemOfTheKeyboard();
    void meansNothingElseByTwoQuickClicks();
    void leavesAFolderThatIsClosed();
    void hidesAllFromTheContextMenu();

private:
    void click(const char *file, const char *key);
    void selectABC();
    void drag(const QPoint &from, const QPoint &to, const QString &choice);
    QString in(const char *file) const { return menu() + QLatin1Char('/') + QLatin1String(file); }
    QString rows(const QString &folder) { return names(view(), folder).join(QLatin1Char(' ')); }
    /// The shown names of all that is selected, sorted.
    QString selected();
    QString undoText() { return view().undoAction()->text(); }

    QByteArray m_dataHome;
};

void tst_SeveralRowsByHand::init()
{
    HandsOnTestCase::init();
    m_dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
    for (const char *name : {"a", "b", "c", "d", "games/x", "games/y"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)),
                   QString::fromLatin1(name).section(QLatin1Char('/'), -1));
    writeFolder(QString(), QStringLiteral("Menu"), "games;a.desktop;b.desktop;c.desktop;d.desktop;");
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"), "y.desktop;x.desktop;");
    openDialog(menu(), 5);
    QVERIFY(open(view(), in("games"), 2));
    dialog()->setAssistance(true);
    // The lines above and below the tree take their room from it before anything is clicked.
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games a b c d"));
    QTRY_COMPARE(rows(in("games")), QStringLiteral("y x"));
}

void tst_SeveralRowsByHand::cleanup()
{
    qputenv("XDG_DATA_HOME", m_dataHome);
    HandsOnTestCase::cleanup();
}

QString tst_SeveralRowsByHand::selected()
{
    QStringList names;
    const QModelIndexList rows = view().selectionModel()->selectedIndexes();
    for (const QModelIndex &row : rows)
        names.append(row.data().toString());
    names.sort();
    return names.join(QLatin1Char(' '));
}

// While a key is held.
void tst_SeveralRowsByHand::click(const char *file, const char *key)
{
    XDoTool::run(QStringLiteral("mousemove %1 keydown %2 click 1 keyup %2")
                     .arg(XDoTool::at(view().viewport(), placeOf(in(file))), QLatin1String(key)));
}

void tst_SeveralRowsByHand::selectABC()
{
    clickItem(in("a.desktop"));
    click("c.desktop", "shift");
    QTRY_COMPARE(selected(), QStringLiteral("a b c"));
}

void tst_SeveralRowsByHand::selectsByMouseAndKeyboard()
{
    clickItem(in("a.desktop"));
    click("c.desktop", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("a c"));
    click("games/x.desktop", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("a c x"));
    click("c.desktop", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("a x"));
    clickItem(in("b.desktop"));
    QTRY_COMPARE(selected(), QStringLiteral("b"));
    click("d.desktop", "shift");
    QTRY_COMPARE(selected(), QStringLiteral("b c d"));
    QCOMPARE(view().selectedPath(), in("d.desktop"));

    clickItem(in("games/y.desktop"));
    XDoTool::press(QStringLiteral("shift+Down"));
    QTRY_COMPARE(selected(), QStringLiteral("x y"));
    XDoTool::press(QStringLiteral("shift+Down"));
    QTRY_COMPARE(selected(), QStringLiteral("a x y"));
    XDoTool::press(QStringLiteral("ctrl+Down"));
    XDoTool::press(QStringLiteral("ctrl+Down"));
    QTRY_COMPARE(view().currentIndex().data().toString(), QStringLiteral("c"));
    QCOMPARE(selected(), QStringLiteral("a x y"));
    XDoTool::press(QStringLiteral("ctrl+space"));
    QTRY_COMPARE(selected(), QStringLiteral("a c x y"));
    XDoTool::press(QStringLiteral("ctrl+a"));
    QTRY_COMPARE(selected(), QStringLiteral("Games a b c d x y"));
    XDoTool::press(QStringLiteral("Up"));
    QTRY_COMPARE(selected(), QStringLiteral("b"));
}

void tst_SeveralRowsByHand::selectsOneWithoutAssistance()
{
    selectABC();
    dialog()->setAssistance(false);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    // The one that the keyboard was on.
    QCOMPARE(selected(), QStringLiteral("c"));
    QCOMPARE(view().selectedPath(), in("c.desktop"));
    click("a.desktop", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("a"));
    XDoTool::press(QStringLiteral("shift+Down"));
    QTRY_COMPARE(selected(), QStringLiteral("b"));
    XDoTool::press(QStringLiteral("ctrl+a"));
    QTest::qWait(50);
    QCOMPARE(selected(), QStringLiteral("b"));
}

void tst_SeveralRowsByHand::deletesAllInOneStep()
{
    const ExactTree before = ExactTree::of(menu());
    clickItem(in("games/x.desktop"));
    for (const char *file : {"games", "a.desktop", "b.desktop"})
        click(file, "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("Games a b x"));
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo deletion of 3 items (4 entries)"));
    QCOMPARE(everythingIn(menu()),
             QStringList(
                 {QStringLiteral(".directory"), QStringLiteral("c.desktop"), QStringLiteral("d.desktop")}));
    QTRY_COMPARE(rows(menu()), QStringLiteral("c d"));
    QCOMPARE(selected(), QString());
    QCOMPARE(view().currentIndex().data().toString(), QStringLiteral("c"));

    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo"));
    QCOMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games a b c d"));
    QTRY_COMPARE(selected(), QStringLiteral("Games a b"));
    XDoTool::press(QStringLiteral("ctrl+shift+z"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("c d"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games a b c d"));
    QCOMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
}

void tst_SeveralRowsByHand::movesByCutAndPaste()
{
    const ExactTree before = ExactTree::of(menu());
    const auto dimmed = [this] {
        QString names;
        for (const char *file : {"a.desktop", "b.desktop", "c.desktop", "d.desktop"}) {
            if (shown(view(), in(file)).data(Qt::ForegroundRole).isValid())
                names += QLatin1Char(*file);
        }
        return names;
    };
    selectABC();
    XDoTool::press(QStringLiteral("ctrl+x"));
    QTRY_COMPARE(dimmed(), QStringLiteral("abc"));
    clickItem(in("games"));
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo moving of 3 items to Games"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games d"));
    QTRY_COMPARE(names(view(), in("games")).size(), 5);
    QTRY_COMPARE(selected(), QStringLiteral("a b c"));
    QCOMPARE(view().currentIndex().data().toString(), QStringLiteral("a"));

    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games a b c d"));
    QCOMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QTRY_COMPARE(selected(), QStringLiteral("a b c"));
}

void tst_SeveralRowsByHand::copiesFromTheTop()
{
    clickItem(in("d.desktop"));
    for (const char *file : {"games/x.desktop", "b.desktop", "games/y.desktop"})
        click(file, "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("b d x y"));
    XDoTool::press(QStringLiteral("ctrl+c"));
    const auto paths = [] {
        QStringList result;
        const QList<QUrl> urls = QGuiApplication::clipboard()->mimeData()->urls();
        for (const QUrl &url : urls)
            result.append(url.toLocalFile());
        return result;
    };
    QTRY_COMPARE(
        paths(),
        QStringList({in("games/y.desktop"), in("games/x.desktop"), in("b.desktop"), in("d.desktop")}));
    // What goes along with its folder is not named again.
    click("games", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("Games b d x y"));
    XDoTool::press(QStringLiteral("ctrl+x"));
    QTRY_COMPARE(paths(), QStringList({in("games"), in("b.desktop"), in("d.desktop")}));
}

void tst_SeveralRowsByHand::drag(const QPoint &from, const QPoint &to, const QString &choice)
{
    ModalDriver modal;
    pickInDropMenu(modal, choice);
    QString script = QStringLiteral("mousemove %1 sleep 0.3 mousedown 1 sleep 0.2")
                         .arg(XDoTool::at(view().viewport(), from));
    for (int i = 1; i <= 8; ++i)
        script += QStringLiteral(" mousemove %1 sleep 0.05")
                      .arg(XDoTool::at(view().viewport(), from + (to - from) * i / 8));
    XDoTool::run(script + QStringLiteral(" sleep 0.2 mouseup 1"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
}

void tst_SeveralRowsByHand::dragsAll_data()
{
    QTest::addColumn<QString>("choice");
    QTest::addColumn<QString>("left");
    QTest::addColumn<QString>("undo");
    QTest::newRow("move") << "Move"
                          << "Games d"
                          << "Undo moving of 3 items to Games";
    QTest::newRow("copy") << "Copy"
                          << "Games a b c d"
                          << "Undo copying of 3 items to Games";
}

void tst_SeveralRowsByHand::dragsAll()
{
    QFETCH(QString, choice);
    QFETCH(QString, left);
    QFETCH(QString, undo);
    const ExactTree before = ExactTree::of(menu());
    selectABC();
    drag(placeOf(in("b.desktop")), placeOf(in("games")), choice);
    QTRY_COMPARE(undoText(), undo);
    QTRY_COMPARE(rows(menu()), left);
    QTRY_COMPARE(names(view(), in("games")).size(), 5);
    QStringList inGames = names(view(), in("games"));
    inGames.sort();
    QCOMPARE(inGames.join(QLatin1Char(' ')), QStringLiteral("a b c x y"));
    QTRY_COMPARE(selected(), QStringLiteral("a b c"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games a b c d"));
    QCOMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
}

void tst_SeveralRowsByHand::movesABlockByKeys()
{
    const ExactTree before = ExactTree::of(menu());
    clickItem(in("b.desktop"));
    click("d.desktop", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("b d"));
    XDoTool::press(QStringLiteral("alt+Up"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games b a d c"));
    QCOMPARE(undoText(), QStringLiteral("Undo reordering of 2 items"));
    XDoTool::press(QStringLiteral("alt+Up"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("b Games d a c"));
    XDoTool::press(QStringLiteral("alt+Up"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("b d Games a c"));
    QTRY_VERIFY(!action(view(), QStringLiteral("upAction"))->isEnabled());
    XDoTool::press(QStringLiteral("alt+Up"));
    XDoTool::press(QStringLiteral("alt+Down"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games b d a c"));
    QCOMPARE(selected(), QStringLiteral("b d"));
    for (int i = 0; i < 4; ++i)
        XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("Games a b c d"));
    QCOMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QCOMPARE(selected(), QStringLiteral("b d"));
}

void tst_SeveralRowsByHand::editsTheItemOfTheKeyboard()
{
    selectABC();
    // That is what one cannot be done to three.
    for (const char *name : {"editAction", "executeAction"})
        QVERIFY(!action(view(), QLatin1String(name))->isEnabled());
    XDoTool::press(QStringLiteral("ctrl+Up"));
    QTRY_COMPARE(view().selectedPath(), in("b.desktop"));
    ModalDriver modal;
    QString title;
    modal.handle([&title](QWidget *window) {
        auto *editor = qobject_cast<VelDesktopEntryEditDialog *>(window);
        QVERIFY(editor);
        title = editor->windowTitle();
        editor->reject();
    });
    XDoTool::press(QStringLiteral("F2"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QVERIFY2(title.endsWith(in("b.desktop")), qPrintable(title));
    QCOMPARE(selected(), QStringLiteral("b"));
}

void tst_SeveralRowsByHand::meansNothingElseByTwoQuickClicks()
{
    clickItem(in("a.desktop"));
    const ModalDriver modal; // for whatever might open
    XDoTool::run(QStringLiteral("mousemove %1 keydown ctrl click --repeat 2 --delay 40 1 keyup ctrl")
                     .arg(XDoTool::at(view().viewport(), placeOf(in("games")))));
    QTRY_COMPARE(selected(), QStringLiteral("Games a"));
    QTest::qWait(200);
    QVERIFY(view().isExpanded(shown(view(), in("games"))));
    XDoTool::run(QStringLiteral("mousemove %1 keydown ctrl click --repeat 2 --delay 40 1 keyup ctrl")
                     .arg(XDoTool::at(view().viewport(), placeOf(in("games")))));
    QTRY_COMPARE(selected(), QStringLiteral("a"));
    QTest::qWait(200);
    QVERIFY(modal.finished());
    QVERIFY(view().isExpanded(shown(view(), in("games"))));
}

void tst_SeveralRowsByHand::leavesAFolderThatIsClosed()
{
    clickItem(in("games/x.desktop"));
    click("games/y.desktop", "ctrl");
    click("b.desktop", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("b x y"));
    const QRect area = view().visualRect(shown(view(), in("games")));
    const QPoint arrow(area.left() - view().indentation() / 2, area.center().y());
    XDoTool::click(view().viewport(), arrow);
    QTRY_VERIFY(!view().isExpanded(shown(view(), in("games"))));
    QCOMPARE(selected(), QStringLiteral("b"));
    QTest::qWait(QApplication::doubleClickInterval() + 100);
    XDoTool::click(view().viewport(), arrow);
    QTRY_VERIFY(view().isExpanded(shown(view(), in("games"))));
    QCOMPARE(selected(), QStringLiteral("b"));

    clickItem(in("games/x.desktop"));
    XDoTool::click(view().viewport(), arrow);
    QTRY_COMPARE(selected(), QStringLiteral("Games"));
}

void tst_SeveralRowsByHand::hidesAllFromTheContextMenu()
{
    const auto pick = [this](const char *name) {
        ModalDriver modal;
        modal.handle([name](QWidget *window) {
            auto *popup = qobject_cast<QMenu *>(window);
            QVERIFY(popup);
            const QList<QAction *> actions = popup->actions();
            for (QAction *action : actions) {
                if (action->objectName() == QLatin1String(name) && action->isVisible())
                    return XDoTool::click(popup, popup->actionGeometry(action).center());
            }
            QFAIL(name);
        });
        XDoTool::run(QStringLiteral("mousemove %1 click 3")
                         .arg(XDoTool::at(view().viewport(), placeOf(in("b.desktop")))));
        QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    };
    const ExactTree before = ExactTree::of(menu());
    selectABC();
    click("games", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("Games a b c"));
    pick("hideAction");
    QTRY_COMPARE(undoText(), QStringLiteral("Undo hiding of 3 items"));
    QCOMPARE(selected(), QStringLiteral("Games a b c"));
    for (const char *file : {"a.desktop", "b.desktop", "c.desktop"}) {
        QVERIFY(read(in(file)).contains("NoDisplay=true"));
        QVERIFY(shown(view(), in(file)).data(Qt::ForegroundRole).isValid());
    }
    click("b.desktop", "ctrl");
    click("d.desktop", "ctrl");
    click("b.desktop", "ctrl");
    QTRY_COMPARE(selected(), QStringLiteral("Games a b c d"));
    pick("showAgainAction");
    QTRY_COMPARE(undoText(), QStringLiteral("Undo showing 3 items again"));
    QVERIFY(!read(in("d.desktop")).contains("NoDisplay"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo hiding of 3 items"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(undoText(), QStringLiteral("Undo"));
    QCOMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
}

VEL_TEST_MAIN(tst_SeveralRowsByHand)
#include "tst_SeveralRowsByHand.moc"
