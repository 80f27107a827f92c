// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QDir>
#include <QImage>
#include <QLabel>
#include <QLayout>
#include <QScopeGuard>
#include <QToolBar>

/// What makes the work with a menu easier while there is assistance, by hand.
class tst_MenuComfortByHand : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void movesItemsByKeys();
    void leavesTheKeysAloneWithoutAssistance();
    void readsTheMenuAnew();
    void dimsWhatWasCut();
    void opensTheFolderUnderADrag_data();
    void opensTheFolderUnderADrag();
    void reachesTheToolBarByTheTabKey();
    void isNamedPlainly_data();
    void isNamedPlainly();
    void tellsHowToBeginAnEmptyMenu();
    void tellsWhyTheStartMenuIsEmpty_data();
    void tellsWhyTheStartMenuIsEmpty();
    void choosesFromTheMenuByLetters();

private:
    void openAssisted(int count);
    QImage imageOf(const QModelIndex &row) const;
    QString in(const char *file) const { return menu() + QLatin1Char('/') + QLatin1String(file); }
    QString rows(const QString &folder) { return names(view(), folder).join(QLatin1Char(' ')); }
};

void tst_MenuComfortByHand::openAssisted(int count)
{
    openDialog(menu(), count);
    dialog()->setAssistance(true);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    view().setFocus();
}

void tst_MenuComfortByHand::movesItemsByKeys()
{
    writeFolder(QString(), QStringLiteral("Menu"), "sub;");
    writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"), "a.desktop;b.desktop;c.desktop;");
    for (const char *name : {"a", "b", "c"})
        writeEntry(QStringLiteral("sub/%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    openAssisted(1);
    QVERIFY(open(view(), in("sub"), 3));
    view().expand(shown(view(), in("sub")));
    clickItem(in("sub/b.desktop"));
    XDoTool::press(QStringLiteral("alt+Up"));
    QTRY_COMPARE(rows(in("sub")), QStringLiteral("b a c"));
    // There it stays, and stays selected.
    XDoTool::press(QStringLiteral("alt+Up"));
    XDoTool::press(QStringLiteral("alt+Down"));
    QTRY_COMPARE(rows(in("sub")), QStringLiteral("a b c"));
    XDoTool::press(QStringLiteral("alt+Down"));
    QTRY_COMPARE(rows(in("sub")), QStringLiteral("a c b"));
    QCOMPARE(view().selectedPath(), in("sub/b.desktop"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(rows(in("sub")), QStringLiteral("a b c"));
}

void tst_MenuComfortByHand::leavesTheKeysAloneWithoutAssistance()
{
    for (const char *name : {"a", "b"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    openAssisted(2);
    dialog()->setAssistance(false);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    for (const char *name : {"upAction", "downAction"})
        QVERIFY(action(view(), QLatin1String(name))->shortcut().isEmpty());
    clickItem(in("b.desktop"));
    XDoTool::press(QStringLiteral("alt+Up"));
    QTRY_COMPARE(view().selectedPath(), in("a.desktop"));
    QCOMPARE(rows(menu()), QStringLiteral("a b"));
}

void tst_MenuComfortByHand::readsTheMenuAnew()
{
    writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"), "a.desktop;b.desktop;");
    writeFolder(QStringLiteral("sub/inner"), QStringLiteral("Inner"), "");
    writeEntry(QStringLiteral("sub/inner/x.desktop"), QStringLiteral("x"));
    for (const char *name : {"a", "b", "c"})
        writeEntry(QStringLiteral("sub/%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    openAssisted(1);
    for (const char *folder : {"sub", "sub/inner"})
        view().expand(shown(view(), in(folder)));
    QVERIFY(open(view(), in("sub"), 4));
    QVERIFY(open(view(), in("sub/inner"), 1));
    clickItem(in("sub/inner/x.desktop"));
    QCOMPARE(rows(in("sub")), QStringLiteral("a b Inner c"));
    // Written into the files that are there, which nobody is told of.
    writeFolder(QStringLiteral("sub"), QStringLiteral("Other"), "c.desktop;inner;");
    writeEntry(QStringLiteral("sub/a.desktop"), QStringLiteral("new"));
    writeEntry(QStringLiteral("sub/b.desktop"), QStringLiteral("b"), "Exec=true\nHidden=true\n");

    XDoTool::press(QStringLiteral("F5"));

    QTRY_COMPARE(rows(in("sub")), QStringLiteral("c Inner new"));
    QCOMPARE(rows(menu()), QStringLiteral("Other"));
    QTRY_COMPARE(rows(in("sub/inner")), QStringLiteral("x"));
    for (const char *folder : {"sub", "sub/inner"})
        QVERIFY(view().isExpanded(shown(view(), in(folder))));
    QCOMPARE(view().selectedPath(), in("sub/inner/x.desktop"));
    QCOMPARE(view().currentIndex(), shown(view(), in("sub/inner/x.desktop")));
    dialog()->setAssistance(false);
    QVERIFY(!action(view(), QStringLiteral("reloadAction")));
}

QImage tst_MenuComfortByHand::imageOf(const QModelIndex &row) const
{
    return view().viewport()->grab(view().visualRect(row)).toImage();
}

void tst_MenuComfortByHand::dimsWhatWasCut()
{
    for (const char *name : {"a", "b"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"), "");
    openAssisted(3);
    const auto isDimmed = [this] {
        return shown(view(), in("a.desktop")).data(Qt::ForegroundRole).isValid();
    };
    const auto image = [this] { return imageOf(shown(view(), in("a.desktop"))); };
    const QImage before = image();
    clickItem(in("a.desktop"));
    const QImage selected = image();
    XDoTool::press(QStringLiteral("ctrl+x"));
    QTRY_VERIFY(isDimmed());
    QVERIFY(!shown(view(), in("b.desktop")).data(Qt::ForegroundRole).isValid());
    // The icon says so also of what is selected.
    QVERIFY(image() != selected);
    XDoTool::press(QStringLiteral("F5"));
    QTRY_COMPARE(view().model()->rowCount(view().rootIndex()), 3);
    QTRY_VERIFY(isDimmed());
    clickItem(in("b.desktop"));
    XDoTool::press(QStringLiteral("ctrl+c"));
    QTRY_VERIFY(!isDimmed());
    QTRY_COMPARE(image(), before);

    clickItem(in("a.desktop"));
    XDoTool::press(QStringLiteral("ctrl+x"));
    QTRY_VERIFY(isDimmed());
    clickItem(in("sub"));
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(rows(in("sub")), QStringLiteral("a"));
    QTRY_COMPARE(view().selectedPath(), in("sub/a.desktop"));
    QCoreApplication::processEvents();
    QTRY_VERIFY(!shown(view(), in("sub/a.desktop")).data(Qt::ForegroundRole).isValid());
    clickItem(in("b.desktop"));
    XDoTool::press(QStringLiteral("ctrl+x"));
    QTRY_VERIFY(shown(view(), in("b.desktop")).data(Qt::ForegroundRole).isValid());
    dialog()->setAssistance(false);
    QVERIFY(!shown(view(), in("b.desktop")).data(Qt::ForegroundRole).isValid());
}

void tst_MenuComfortByHand::opensTheFolderUnderADrag_data()
{
    QTest::addColumn<bool>("assistance");
    QTest::addColumn<bool>("isOpen");
    QTest::addColumn<QString>("expected");
    QTest::newRow("closed folder") << true << false << "opened";
    QTest::newRow("open folder") << true << true << "";
    QTest::newRow("without assistance") << false << false << "";
}

void tst_MenuComfortByHand::opensTheFolderUnderADrag()
{
    QFETCH(bool, assistance);
    QFETCH(bool, isOpen);
    QFETCH(QString, expected);
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("a"));
    writeEntry(QStringLiteral("sub/x.desktop"), QStringLiteral("x"));
    openAssisted(2);
    dialog()->setAssistance(assistance);
    dialog()->layout()->activate();
    QVERIFY(open(view(), in("sub"), 1));
    view().setExpanded(shown(view(), in("sub")), isOpen);
    QTest::qWait(300);
    QString log;
    connect(&view(), &QTreeView::expanded, this, [&] { log += QLatin1String("opened"); });
    connect(&view(), &QTreeView::collapsed, this, [&] { log += QLatin1String("closed"); });
    const auto at = [this](const QPoint &place) {
        return QStringLiteral(" mousemove %1 sleep 0.2").arg(XDoTool::at(view().viewport(), place));
    };
    const QPoint from = placeOf(in("a.desktop"));
    const QPoint to = placeOf(in("sub"));
    XDoTool::run(at(from).trimmed() + QStringLiteral(" mousedown 1 sleep 0.2") + at((from + to) / 2) + at(to)
                 + at(to + QPoint(3, 0)) + QStringLiteral(" sleep 1") + at(to + QPoint(6, 0))
                 + QStringLiteral(" sleep 1 key Escape sleep 0.2 mouseup 1"));
    QCOMPARE(log, expected);
    QVERIFY(QFile::exists(in("a.desktop")));
    disconnect(&view(), nullptr, this, nullptr);
}

void tst_MenuComfortByHand::reachesTheToolBarByTheTabKey()
{
    for (const char *name : {"a", "b", "c"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    openAssisted(3);
    const auto *bar = dialog()->findChild<QToolBar *>();
    clickItem(in("a.desktop"));
    for (int i = 0; i < 3; ++i) {
        QTest::qWait(50);
        XDoTool::press(QStringLiteral("shift+Tab"));
    }
    const QWidget *down = bar->widgetForAction(action(view(), QStringLiteral("downAction")));
    QTRY_VERIFY(down->hasFocus());
    XDoTool::press(QStringLiteral("Return"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("b a c"));
    XDoTool::press(QStringLiteral("space"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("b c a"));
    QVERIFY(dialog()->isVisible());
    clickItem(in("b.desktop"));
    clickAction("downAction");
    QTRY_COMPARE(rows(menu()), QStringLiteral("c b a"));
    QVERIFY(view().hasFocus());
    dialog()->setAssistance(false);
    QCOMPARE(down->focusPolicy(), Qt::NoFocus);
}

void tst_MenuComfortByHand::isNamedPlainly_data()
{
    QTest::addColumn<QString>("directory");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("expected");
    QTest::newRow("folder") << "games/my menu" << QString() << "my menu";
    QTest::newRow("slash") << "games/my menu/" << QString() << "my menu";
    QTest::newRow("named folder") << "games"
                                  << "Fun"
                                  << "Fun";
}

void tst_MenuComfortByHand::isNamedPlainly()
{
    QFETCH(QString, directory);
    QFETCH(QString, name);
    QFETCH(QString, expected);
    directory.prepend(menu() + QLatin1Char('/'));
    QVERIFY(QDir().mkpath(directory));
    QFile record(directory + QLatin1String("/.directory"));
    if (!name.isEmpty()) {
        QVERIFY(record.open(QFile::WriteOnly));
        record.write("[Desktop Entry]\nType=Directory\nName=" + name.toUtf8() + '\n');
        record.close();
    }
    VelMenuDialog picker(directory, -1, false, false, nullptr, Qt::Window);
    const QString former = picker.windowTitle();
    QVERIFY(former.endsWith(QLatin1Char(' ') + directory));
    picker.setAssistance(true);
    QCOMPARE(picker.windowTitle(), expected);
    picker.setAssistance(false);
    QCOMPARE(picker.windowTitle(), former);
    picker.setWindowTitle(QStringLiteral("Own title"));
    picker.setAssistance(true);
    QCOMPARE(picker.windowTitle(), QStringLiteral("Own title"));
}

void tst_MenuComfortByHand::tellsHowToBeginAnEmptyMenu()
{
    openAssisted(0);
    const auto label = [this] { return view().findChild<QLabel *>(QStringLiteral("emptyMenuLabel")); };
    QTRY_VERIFY(label() && label()->isVisible());
    QCOMPARE(label()->text(),
             QStringLiteral("This menu is empty. Press Ctrl+N for a new entry, or right-click here for what "
                            "else can be added."));
    QCOMPARE(label()->geometry(), view().viewport()->rect());
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("a"));
    QTRY_VERIFY(!label()->isVisible());
    view().setFilter(QStringLiteral("nothing"));
    QTRY_COMPARE(rows(menu()), QString());
    QTest::qWait(500);
    QVERIFY(!label()->isVisible());
    view().setFilter(QString());
    clickItem(a);
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_VERIFY(label()->isVisible());
    dialog()->setAssistance(false);
    QVERIFY(!label());
}

void tst_MenuComfortByHand::tellsWhyTheStartMenuIsEmpty_data()
{
    QTest::addColumn<QByteArray>("keys"); // of the one application
    QTest::addColumn<QString>("text");
    const QString none = QStringLiteral("This menu is empty, because no application was found that is "
                                        "installed. Once there is one, right-click here and choose 'Default "
                                        "menu...'. Until then, press Ctrl+N for an entry of your own.");
    QTest::newRow("no application") << QByteArray() << none;
    QTest::newRow("one that no menu shows") << QByteArray("Exec=true\nNoDisplay=true\n") << none;
    QTest::newRow("an application")
        << QByteArray("Exec=true\n")
        << QStringLiteral("This menu is empty. Right-click here and choose 'Default menu...' to fill it with "
                          "the applications that are installed, or press Ctrl+N for a new entry.");
}

void tst_MenuComfortByHand::tellsWhyTheStartMenuIsEmpty()
{
    QFETCH(QByteArray, keys);
    QFETCH(QString, text);
    const QByteArray dataDirs = qgetenv("XDG_DATA_DIRS");
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("data"))));
    const auto restored = qScopeGuard([&] { qputenv("XDG_DATA_DIRS", dataDirs); });
    if (!keys.isEmpty())
        write(QStringLiteral("data/applications/far/piano.desktop"),
              entryText(QStringLiteral("Piano"), keys));
    QVERIFY(QDir().mkpath(startMenu()));
    openDialog(startMenu(), 0);
    dialog()->setAssistance(true);
    const auto *label = view().findChild<QLabel *>(QStringLiteral("emptyMenuLabel"));
    QTRY_VERIFY(label && label->isVisible());
    QCOMPARE(label->text(), text);
}

void tst_MenuComfortByHand::choosesFromTheMenuByLetters()
{
    writeFolder(QString(), QStringLiteral("Menu"), "b.desktop;a.desktop;c.desktop;");
    for (const char *name : {"a", "b", "c"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    openAssisted(3);
    const auto choose = [](const char *letter) {
        ModalDriver modal;
        modal.handle([letter](QWidget *menu) {
            QTRY_VERIFY_WITH_TIMEOUT(menu->isVisible(), 20000);
            XDoTool::press(QString::fromLatin1(letter));
        });
        XDoTool::press(QStringLiteral("Menu"));
        QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    };
    clickItem(in("a.desktop"));
    choose("u");
    QTRY_COMPARE(rows(menu()), QStringLiteral("a b c"));
    choose("o");
    QTRY_COMPARE(rows(menu()), QStringLiteral("b a c"));
    choose("s");
    QTRY_COMPARE(rows(menu()), QStringLiteral("a b c"));
    choose("d");
    QTRY_COMPARE(rows(menu()), QStringLiteral("b c"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(rows(menu()), QStringLiteral("a b c"));
    // The tool bar shows no letters, and takes none.
    const auto *bar = dialog()->findChild<QToolBar *>();
    QAction *down = action(view(), QStringLiteral("downAction"));
    QCOMPARE(down->toolTip().left(4), QStringLiteral("Down"));
    clickItem(in("a.desktop"));
    XDoTool::press(QStringLiteral("alt+o"));
    QTest::qWait(200);
    QCOMPARE(rows(menu()), QStringLiteral("a b c"));
    QVERIFY(bar->widgetForAction(down)->isEnabled());
}

VEL_TEST_MAIN(tst_MenuComfortByHand)
#include "tst_MenuComfortByHand.moc"
