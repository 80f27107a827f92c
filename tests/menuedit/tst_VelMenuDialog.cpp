// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "WindowManager.h"

#include <QAction>
#include <QDialogButtonBox>
#include <QPushButton>
#include <QSettings>
#include <QSignalSpy>
#include <QToolBar>
#include <QVBoxLayout>

/// The dialog around the view: what it consists of, its title, size and help.
class tst_VelMenuDialog : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
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
    void opensTheHelp();
    void hasPublicSlotsInOrder();
    void passesAssistanceOn();
};

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
    QCOMPARE(
        methods,
        (QList<QByteArray>{"changed()", "selectionChanged(QString)", "told(QString,int)",
                           "setActionsEnabled()", "slotDirNew()", "slotFileNew()", "slotEdit()", "slotDel()",
                           "slotExe()", "slotCut()", "slotCopy()", "slotPaste()", "slotUp()", "slotDown()",
                           "slotRecreate()", "slotFind()", "slotFindNext()", "selectionChangedSlot()"}));
}

void tst_VelMenuDialog::passesAssistanceOn()
{
    VelMenuDialog dialog(menu(), -1, true, true);
    const auto *view = dialog.findChild<VelMenuView *>();
    QCOMPARE(dialog.property("assistance"), QVariant(false));
    QVERIFY(!view->assistance());
    QVERIFY(dialog.setProperty("assistance", true));
    QVERIFY(dialog.assistance());
    QVERIFY(view->assistance());
}

VEL_TEST_MAIN(tst_VelMenuDialog)
#include "tst_VelMenuDialog.moc"
