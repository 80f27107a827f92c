// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"

#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"

#include <menuedit/WmCommand.h>
#include <velcore/dirs.h>
#include <velintegration/wmcommandreceiver.h>

#include <QAction>
#include <QClipboard>
#include <QContextMenuEvent>
#include <QDialogButtonBox>
#include <QFileSystemModel>
#include <QMenu>
#include <QMimeData>
#include <QPointer>
#include <QProcess>
#include <QPushButton>
#include <QSettings>
#include <QSignalSpy>
#include <QSocketNotifier>
#include <QToolBar>
#include <QVBoxLayout>

#include <memory>

namespace {

/// Takes the place of the window manager and collects what it is told.
class WindowManager : public QObject
{
public:
    WindowManager()
        : m_receiver([this](const std::string &line) { m_lines.append(QByteArray::fromStdString(line)); })
        , m_owns(m_receiver.acquire())
        , m_notifier(m_receiver.connectionFd(), QSocketNotifier::Read)
    {
        connect(&m_notifier, &QSocketNotifier::activated, this, [this] { m_receiver.processEvents(); });
    }

    bool owns() const { return m_owns; }
    /// Every line that came until now.
    QList<QByteArray> lines()
    {
        m_receiver.processEvents();
        return m_lines;
    }

private:
    QList<QByteArray> m_lines;
    WmCommandReceiver m_receiver;
    bool m_owns;
    QSocketNotifier m_notifier;
};

const ModalDriver::Box noWindowManager{QMessageBox::Warning, QStringLiteral("Warning"),
                                       QStringLiteral("Can't send command to vel-wm"), QMessageBox::Ok};

} // namespace

/// The dialog around the view, on a real display with and without a window manager of ours.
class tst_VelMenuDialog : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void choosesTheCommandByTheDirectory_data();
    void choosesTheCommandByTheDirectory();
    void takesTheFirstKindThatADirectoryIs();
    void picksFromTheStartMenuByDefault();
    void showsTheDirectoryGiven();
    void hasTheButtonsAskedFor_data();
    void hasTheButtonsAskedFor();
    void acceptsAndRejects_data();
    void acceptsAndRejects();
    void hasAToolBarOnlyToEdit_data();
    void hasAToolBarOnlyToEdit();
    void namesTheMenuInItsTitle_data();
    void namesTheMenuInItsTitle();
    void hasTheEditorsIcon();
    void remembersItsSize_data();
    void remembersItsSize();
    void allowsOkOnlyForEntries_data();
    void allowsOkOnlyForEntries();
    void looksOnlyAtWhatWasSelectedNow();
    void canBeAskedWithoutAButton();
    void tellsTheSelectedPath();
    void makesTheCommandLine_data();
    void makesTheCommandLine();
    void readsAFolderAsAnEntry();
    void tellsTheWindowManagerWhenItGoes_data();
    void tellsTheWindowManagerWhenItGoes();
    void tellsTheWindowManagerNothingOfOtherDirectories();
    void warnsWhenThereIsNoWindowManager();
    void tellsTheWindowManagerWhenApplied();
    void opensTheHelp();
    void hasPublicSlotsInOrder();
    void takesKeysInTheTree();
    void leavesSpaceToTheButtons();
    void showsTheEditMenu();
    void startsProgramsThatOutliveIt();
};

void tst_VelMenuDialog::choosesTheCommandByTheDirectory_data()
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

void tst_VelMenuDialog::choosesTheCommandByTheDirectory()
{
    QFETCH(QString, dir);
    QFETCH(int, kind);
    QFETCH(QByteArray, command);
    QString asked = path(QStringLiteral("config/")) + dir;
    if (dir == QLatin1String("desktop"))
        asked = QString::fromStdString(GetVelDir(VelDir::Desktop));
    QCOMPARE(WmCommand::kindOf(asked), kind);
    QCOMPARE(WmCommand::forKind(kind), command);
}

void tst_VelMenuDialog::takesTheFirstKindThatADirectoryIs()
{
    const QString config = QString::fromLocal8Bit(qgetenv("XDG_CONFIG_HOME"));
    QVERIFY(QDir().mkpath(config));
    const auto desktopAt = [&](const QString &dir) {
        QFile file(config + QLatin1String("/user-dirs.dirs"));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write("XDG_DESKTOP_DIR=\"" + QFile::encodeName(dir) + "\"\n");
    };
    desktopAt(startMenu());
    QCOMPARE(WmCommand::kindOf(startMenu()), 4);
    const QString toolBar = path(QStringLiteral("config/toolbar"));
    desktopAt(toolBar);
    QCOMPARE(WmCommand::kindOf(toolBar), 6);
    QVERIFY(QFile::remove(config + QLatin1String("/user-dirs.dirs")));
    QCOMPARE(WmCommand::kindOf(toolBar), 17);
}

void tst_VelMenuDialog::picksFromTheStartMenuByDefault()
{
    write(QStringLiteral("config/startmenu/a.desktop"), entryText(QStringLiteral("A")));
    WindowManager manager;
    VelMenuDialog dialog;
    QCOMPARE(dialog.menuDir(), startMenu());
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(view->actions().isEmpty());
    QCOMPARE(view->iconSize(), QTreeView().iconSize());
    QVERIFY(!dialog.findChild<QToolBar *>());
    const auto *box = dialog.findChild<QDialogButtonBox *>();
    QCOMPARE(box->standardButtons(), QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    QVERIFY(!box->button(QDialogButtonBox::Ok)->isEnabled());
    QVERIFY(open(*view, startMenu(), 1));
    select(*view, startMenu() + QLatin1String("/a.desktop"));
    QVERIFY(box->button(QDialogButtonBox::Ok)->isEnabled());

    QWidget parent;
    const auto *child = new VelMenuDialog(&parent);
    QCOMPARE(child->parentWidget(), &parent);
}

void tst_VelMenuDialog::showsTheDirectoryGiven()
{
    const VelMenuDialog dialog(menu(), 48, true, false, nullptr, Qt::Tool);
    QCOMPARE(dialog.menuDir(), menu());
    QCOMPARE(dialog.windowType(), Qt::Tool);
    const auto *view = dialog.findChild<VelMenuView *>();
    QCOMPARE(view->menuDir(), menu());
    QCOMPARE(view->iconSize(), QSize(48, 48));
    QVERIFY(!view->actions().isEmpty());
}

void tst_VelMenuDialog::hasTheButtonsAskedFor_data()
{
    QTest::addColumn<bool>("editable");
    QTest::addColumn<bool>("closeOnly");
    QTest::newRow("pick") << false << false;
    QTest::newRow("look") << false << true;
    QTest::newRow("edit and pick") << true << false;
    QTest::newRow("edit") << true << true;
}

void tst_VelMenuDialog::hasTheButtonsAskedFor()
{
    QFETCH(bool, editable);
    QFETCH(bool, closeOnly);
    const VelMenuDialog dialog(menu(), -1, editable, closeOnly);
    const auto *box = dialog.findChild<QDialogButtonBox *>();
    QCOMPARE(box->standardButtons(),
             closeOnly ? QDialogButtonBox::StandardButtons(QDialogButtonBox::Close)
                       : QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    QCOMPARE(box->orientation(), Qt::Horizontal);
    const auto *layout = qobject_cast<QVBoxLayout *>(dialog.layout());
    QVERIFY(layout);
    QStringList order;
    for (int i = 0; i < layout->count(); ++i)
        order.append(QString::fromLatin1(layout->itemAt(i)->widget()->metaObject()->className()));
    QCOMPARE(order.join(QLatin1Char(' ')),
             (editable ? QStringLiteral("QToolBar ") : QString())
                 + QStringLiteral("VelMenuView QDialogButtonBox"));
}

void tst_VelMenuDialog::acceptsAndRejects_data()
{
    QTest::addColumn<int>("button");
    QTest::addColumn<int>("result");
    QTest::newRow("Ok") << int(QDialogButtonBox::Ok) << int(QDialog::Accepted);
    QTest::newRow("Cancel") << int(QDialogButtonBox::Cancel) << int(QDialog::Rejected);
    QTest::newRow("Close") << int(QDialogButtonBox::Close) << int(QDialog::Accepted);
}

void tst_VelMenuDialog::acceptsAndRejects()
{
    QFETCH(int, button);
    QFETCH(int, result);
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, false, button == QDialogButtonBox::Close);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    select(*view, a);
    QSignalSpy finishes(&dialog, &QDialog::finished);
    auto *pressed = dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::StandardButton(button));
    QVERIFY(pressed);
    dialog.show();
    pressed->click();
    QCOMPARE(finishes.count(), 1);
    QCOMPARE(dialog.result(), result);
}

void tst_VelMenuDialog::hasAToolBarOnlyToEdit_data()
{
    QTest::addColumn<bool>("isStartMenu");
    QTest::newRow("the start menu") << true;
    QTest::newRow("another directory") << false;
}

void tst_VelMenuDialog::hasAToolBarOnlyToEdit()
{
    QFETCH(bool, isStartMenu);
    QDir().mkpath(startMenu());
    WindowManager manager;
    const QString dir = isStartMenu ? startMenu() : menu();
    const VelMenuDialog dialog(dir, -1, true, true);
    const auto *bar = dialog.findChild<QToolBar *>();
    QVERIFY(bar);
    QCOMPARE(bar->windowTitle(), QStringLiteral("Edit"));
    QStringList shownActions;
    const QList<QAction *> actions = bar->actions();
    for (const QAction *action : actions)
        shownActions.append(action->isSeparator() ? QStringLiteral("-") : action->text());
    QCOMPARE(shownActions.join(QLatin1Char('|')),
             QStringLiteral("New entry|New folder|Edit|Delete|-|Cut|Copy|Paste|-|Up|Down")
                 + (isStartMenu ? QStringLiteral("|-|Default menu...") : QString()));
    const VelMenuDialog browser(dir, -1, false, true);
    QVERIFY(!browser.findChild<QToolBar *>());
}

void tst_VelMenuDialog::namesTheMenuInItsTitle_data()
{
    QTest::addColumn<QByteArray>("record");
    QTest::addColumn<QString>("title");
    QTest::newRow("no record") << QByteArray() << QStringLiteral(" %1");
    QTest::newRow("local name") << QByteArray("[Desktop Entry]\nType=Directory\nName=Start\nName[en]=Begin\n")
                                << QStringLiteral(" \"Begin\" %1");
    QTest::newRow("no local name") << QByteArray("[Desktop Entry]\nType=Directory\nName=Start\n")
                                   << QStringLiteral(" \"\" %1");
}

void tst_VelMenuDialog::namesTheMenuInItsTitle()
{
    QFETCH(QByteArray, record);
    QFETCH(QString, title);
    if (!record.isNull())
        write(QStringLiteral("menu/.directory"), record);
    const VelMenuDialog dialog(menu(), -1, false, false);
    QCOMPARE(dialog.windowTitle(), title.arg(menu()));
}

void tst_VelMenuDialog::hasTheEditorsIcon()
{
    const VelMenuDialog dialog(menu(), -1, false, false);
    QCOMPARE(dialog.windowIcon().name(), QStringLiteral("velmenuedit"));
}

void tst_VelMenuDialog::remembersItsSize_data()
{
    QTest::addColumn<QVariant>("width");
    QTest::addColumn<QVariant>("height");
    QTest::addColumn<QSize>("size");
    QTest::newRow("nothing stored") << QVariant() << QVariant() << QSize(400, 480);
    QTest::newRow("stored") << QVariant(640) << QVariant(500) << QSize(640, 500);
    QTest::newRow("stored as text") << QVariant(QStringLiteral("640")) << QVariant(QStringLiteral("500"))
                                    << QSize(640, 500);
    QTest::newRow("no numbers") << QVariant(QStringLiteral("wide")) << QVariant(QStringLiteral("high"))
                                << QSize(0, 0);
}

void tst_VelMenuDialog::remembersItsSize()
{
    QFETCH(QVariant, width);
    QFETCH(QVariant, height);
    QFETCH(QSize, size);
    QSettings settings;
    if (width.isValid()) {
        settings.setValue(QStringLiteral("VelMenuDialog/Width"), width);
        settings.setValue(QStringLiteral("VelMenuDialog/Height"), height);
    }
    {
        VelMenuDialog dialog(menu(), -1, false, false);
        // The layout may ask for more than nothing.
        QCOMPARE(dialog.size(), size.isNull() ? dialog.size().boundedTo(dialog.minimumSizeHint()) : size);
        dialog.resize(701, 602);
    }
    settings.sync();
    QCOMPARE(settings.value(QStringLiteral("VelMenuDialog/Width")).toInt(), 701);
    QCOMPARE(settings.value(QStringLiteral("VelMenuDialog/Height")).toInt(), 602);
}

void tst_VelMenuDialog::allowsOkOnlyForEntries_data()
{
    QTest::addColumn<QString>("item");
    QTest::addColumn<bool>("isAllowed");
    QTest::newRow("entry") << "a.desktop" << true;
    QTest::newRow("folder") << "sub" << false;
    QTest::newRow("other file") << "notes.txt" << false;
    QTest::newRow("another case") << "b.DESKTOP" << false;
}

void tst_VelMenuDialog::allowsOkOnlyForEntries()
{
    QFETCH(QString, item);
    QFETCH(bool, isAllowed);
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("sub/c.desktop"), QStringLiteral("C"));
    writeEntry(QStringLiteral("b.DESKTOP"), QStringLiteral("B"));
    write(QStringLiteral("menu/notes.txt"), "");
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 4));
    const auto *ok = dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
    // From the other state each time.
    select(*view, menu() + (isAllowed ? QLatin1String("/sub") : QLatin1String("/a.desktop")));
    QCOMPARE(ok->isEnabled(), !isAllowed);
    select(*view, menu() + QLatin1Char('/') + item);
    QCOMPARE(ok->isEnabled(), isAllowed);
    view->selectionModel()->clearSelection();
    QVERIFY(!ok->isEnabled());
}

void tst_VelMenuDialog::looksOnlyAtWhatWasSelectedNow()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    const auto *ok = dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
    const QItemSelection entry(shown(*view, a), shown(*view, a));
    QVERIFY(QMetaObject::invokeMethod(&dialog, "selChanged", Q_ARG(QItemSelection, entry),
                                      Q_ARG(QItemSelection, entry)));
    QVERIFY(ok->isEnabled());
    dialog.selChanged(QItemSelection(), entry);
    QVERIFY(!ok->isEnabled());
}

void tst_VelMenuDialog::canBeAskedWithoutAButton()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, true, true);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    select(*view, a);
    dialog.selChanged(QItemSelection(), QItemSelection());
    dialog.changed();
    dialog.applySlot();
    QVERIFY(!dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Apply));
    QCOMPARE(dialog.selectedItemPath(), a);
}

void tst_VelMenuDialog::tellsTheSelectedPath()
{
    const QString a = writeEntry(QStringLiteral("sub/a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QCOMPARE(dialog.selectedItemPath(), QString());
    QCOMPARE(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr), QString());
    QVERIFY(open(*view, menu(), 1));
    QVERIFY(open(*view, menu() + QLatin1String("/sub"), 1));
    select(*view, a);
    QCOMPARE(dialog.selectedItemPath(), a);
    select(*view, menu() + QLatin1String("/sub"));
    QCOMPARE(dialog.selectedItemPath(), menu() + QLatin1String("/sub"));

    view->setModel(nullptr);
    QCOMPARE(dialog.selectedItemPath(), QString());
}

void tst_VelMenuDialog::makesTheCommandLine_data()
{
    QTest::addColumn<QByteArray>("lines");
    QTest::addColumn<QString>("command");
    QTest::newRow("plain") << QByteArray("Exec=prog --flag\n") << "prog --flag";
    QTest::newRow("file") << QByteArray("Exec=prog %f\n") << "prog /f";
    QTest::newRow("url") << QByteArray("Exec=prog %u\n") << "prog http://u";
    QTest::newRow("files") << QByteArray("Exec=prog %F\n") << "prog /1 /2";
    QTest::newRow("urls") << QByteArray("Exec=prog %U\n") << "prog http://1 http://2";
    QTest::newRow("name") << QByteArray("Exec=prog %c\n") << "prog A";
    QTest::newRow("local name") << QByteArray("Name[en]=Local\nExec=prog %c\n") << "prog Local";
    QTest::newRow("icon") << QByteArray("Exec=prog %i\nIcon=pic\n") << "prog --icon pic";
    QTest::newRow("entry") << QByteArray("Exec=prog %k\n") << "prog @path@";
    QTest::newRow("window manager") << QByteArray("Exec=VELWM_QUIT %f now\n")
                                    << "vel-wmfunc VELWM_QUIT %f now\n";
    QTest::newRow("no function of it") << QByteArray("Exec=velwm_quit\n") << "velwm_quit";
    QTest::newRow("no command") << QByteArray() << "";
}

void tst_VelMenuDialog::makesTheCommandLine()
{
    QFETCH(QByteArray, lines);
    QFETCH(QString, command);
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"), lines);
    command.replace(QLatin1String("@path@"), a);
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    select(*view, a);
    const QStringList files{QStringLiteral("/1"), QStringLiteral("/2")};
    const QStringList urls{QStringLiteral("http://1"), QStringLiteral("http://2")};
    // Every argument stands as a word of its own in a shell, however it is quoted.
    QString made = dialog.selectedItemExec(QStringLiteral("/f"), QStringLiteral("http://u"), &files, &urls);
    made.remove(QLatin1Char('\'')).remove(QLatin1Char('"'));
    QCOMPARE(made, command);

    const QString bare = dialog.selectedItemExec(QString(), QString(), nullptr, nullptr);
    QVERIFY(!bare.contains(QLatin1String("http")) && !bare.contains(QLatin1String("/1")));
}

void tst_VelMenuDialog::readsAFolderAsAnEntry()
{
    writeEntry(QStringLiteral("sub/a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    select(*view, menu() + QLatin1String("/sub"));
    QCOMPARE(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr), QString());
}

void tst_VelMenuDialog::tellsTheWindowManagerWhenItGoes_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QByteArray>("line");
    QTest::newRow("start menu") << 4 << QByteArray("VELWM_UPDATE_STARTMENU");
    QTest::newRow("desktop") << 6 << QByteArray("VELWM_UPDATE_SHORTCUT");
    QTest::newRow("tool bar") << 17 << QByteArray("VELWM_UPDATE_TOOLBAR");
}

void tst_VelMenuDialog::tellsTheWindowManagerWhenItGoes()
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

void tst_VelMenuDialog::tellsTheWindowManagerNothingOfOtherDirectories()
{
    QDir().mkpath(startMenu());
    WindowManager manager;
    for (const QString &dir : {menu(), startMenu() + QLatin1Char('/')}) {
        VelMenuDialog dialog(dir, -1, true, true);
        QVERIFY(!dialog.updateWM());
    }
    QVERIFY(manager.lines().isEmpty());
}

void tst_VelMenuDialog::warnsWhenThereIsNoWindowManager()
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

void tst_VelMenuDialog::tellsTheWindowManagerWhenApplied()
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

void tst_VelMenuDialog::opensTheHelp()
{
    const QString log = path(QStringLiteral("log"));
    const QString opener = write(QStringLiteral("bin/xdg-open"),
                                 "#!/bin/sh\necho \"$1\" >'" + QFile::encodeName(log) + ".part'\nmv '"
                                     + QFile::encodeName(log) + ".part' '" + QFile::encodeName(log) + "'\n");
    QVERIFY(QFile::setPermissions(opener, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    write(QStringLiteral("data/doc/index.html"), "<html></html>");
    const QByteArray searchPath = qgetenv("PATH");
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))) + ':' + searchPath);
    qputenv("VEL_DATA_DIR", QFile::encodeName(path(QStringLiteral("data"))));
    VelMenuDialog dialog(menu(), -1, false, false);
    dialog.helpSlot();
    QTRY_VERIFY(QFile::exists(log));
    QVERIFY(read(log).contains("data/doc/index.html"));
    qunsetenv("VEL_DATA_DIR");
    qputenv("PATH", searchPath);
}

void tst_VelMenuDialog::hasPublicSlotsInOrder()
{
    const QMetaObject &meta = VelMenuDialog::staticMetaObject;
    QList<QByteArray> methods;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        QCOMPARE(meta.method(i).methodType(), QMetaMethod::Slot);
        QCOMPARE(meta.method(i).access(), QMetaMethod::Public);
        methods.append(meta.method(i).methodSignature());
    }
    QCOMPARE(methods,
             (QList<QByteArray>{"selChanged(QItemSelection,QItemSelection)", "changed()", "applySlot()",
                                "helpSlot()"}));

    const QMetaObject &view = VelMenuView::staticMetaObject;
    methods.clear();
    for (int i = view.methodOffset(); i < view.methodCount(); ++i)
        methods.append(view.method(i).methodSignature());
    QCOMPARE(methods,
             (QList<QByteArray>{"changed()", "selectionChanged(QString)", "setActionsEnabled()",
                                "slotDirNew()", "slotFileNew()", "slotEdit()", "slotDel()", "slotExe()",
                                "slotCut()", "slotCopy()", "slotPaste()", "slotUp()", "slotDown()",
                                "slotRecreate()", "slotFind()", "slotFindNext()", "selectionChangedSlot()"}));
}

void tst_VelMenuDialog::takesKeysInTheTree()
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

void tst_VelMenuDialog::leavesSpaceToTheButtons()
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

void tst_VelMenuDialog::showsTheEditMenu()
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

void tst_VelMenuDialog::startsProgramsThatOutliveIt()
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

VEL_TEST_MAIN(tst_VelMenuDialog)
#include "tst_VelMenuDialog.moc"
