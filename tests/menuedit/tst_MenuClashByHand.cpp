// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExactTree.h"
#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QCheckBox>
#include <QClipboard>
#include <QLayout>
#include <QMessageBox>
#include <QMimeData>
#include <QSignalSpy>
#include <QWindow>

#include <sys/stat.h>

/// What is pasted or dropped where its name is taken, by hand.
class tst_MenuClashByHand : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void pastesWhereTheNameIsTaken_data();
    void pastesWhereTheNameIsTaken();
    void replacesAFolder();
    void asksAboutSeveral_data();
    void asksAboutSeveral();
    void leavesNoStepOfAReplacementThatFailed();
    void asksAfterADrag();
    void listsAllOfADropInTheirOrder();
    void keepsWhatIsThereWithoutAssistance();

private:
    void expectQuestion(ModalDriver &modal, const QString &keys, bool isForAll = false);
    void copyFiles(const QStringList &files);
    QString undoText() const { return view().undoAction()->text(); }
    QString in(const char *file) const { return menu() + QLatin1Char('/') + QLatin1String(file); }
    QString rows(const char *folder) { return names(view(), in(folder)).join(QLatin1Char(' ')); }
};

void tst_MenuClashByHand::init()
{
    HandsOnTestCase::init();
    writeFolder(QString(), QStringLiteral("Menu"), "games;a.desktop;b.desktop;");
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"), "x.desktop;a.desktop;sub;");
    writeFolder(QStringLiteral("games/sub"), QStringLiteral("Sub"), "");
    writeEntry(QStringLiteral("games/sub/old.desktop"), QStringLiteral("Old"));
    for (const char *name : {"a", "b"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    for (const char *name : {"x", "a"})
        writeEntry(QStringLiteral("games/%1.desktop").arg(QLatin1String(name)),
                   QLatin1String(name) + QLatin1String("1"));
    write(QStringLiteral("outside/sub/new.desktop"), entryText(QStringLiteral("New")));
    for (const char *name : {"a", "b", "x"})
        write(QStringLiteral("outside/%1.desktop").arg(QLatin1String(name)),
              entryText(QLatin1String(name) + QLatin1String("2")));
    openDialog(menu(), 3);
    QVERIFY(open(view(), in("games"), 3));
    QVERIFY(open(view(), in("games/sub"), 1));
    dialog()->setAssistance(true);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
}

// The keys are pressed in it.
void tst_MenuClashByHand::expectQuestion(ModalDriver &modal, const QString &keys, bool isForAll)
{
    modal.handle([this, keys, isForAll](QWidget *window) {
        auto *box = qobject_cast<QMessageBox *>(window);
        QVERIFY(box && box->windowTitle() == QLatin1String("Name already taken"));
        QVERIFY(QTest::qWaitForWindowActive(box));
        // The server may take another moment to give it the keyboard, and the key that opened it may still
        // be held.
        QTRY_COMPARE(XDoTool::ask(QStringLiteral("getwindowfocus")), QByteArray::number(box->winId()));
        QTRY_VERIFY(QGuiApplication::queryKeyboardModifiers() == Qt::NoModifier);
        QCOMPARE(box->windowHandle()->transientParent(), dialog()->windowHandle());
        if (isForAll) {
            XDoTool::press(QStringLiteral("alt+d"));
            QTRY_VERIFY(box->checkBox()->isChecked());
        }
        const QPointer<QMessageBox> guarded(box);
        XDoTool::press(keys);
        QTRY_VERIFY_WITH_TIMEOUT(!guarded || !guarded->isVisible(), 20000);
    });
}

void tst_MenuClashByHand::copyFiles(const QStringList &files)
{
    QList<QUrl> urls;
    for (const QString &file : files)
        urls.append(QUrl::fromLocalFile(path(file)));
    auto *data = new QMimeData;
    data->setUrls(urls);
    QGuiApplication::clipboard()->setMimeData(data);
}

void tst_MenuClashByHand::pastesWhereTheNameIsTaken_data()
{
    QTest::addColumn<QString>("keys");
    QTest::addColumn<QString>("games");
    QTest::addColumn<QByteArray>("order");
    QTest::addColumn<QString>("selected");
    QTest::newRow("keep both") << "alt+k"
                               << "a x1 a1 Sub" << QByteArray("*;a-2.desktop;x.desktop;a.desktop;sub;")
                               << "games/a-2.desktop";
    QTest::newRow("enter") << "Return"
                           << "a x1 a1 Sub" << QByteArray("*;a-2.desktop;x.desktop;a.desktop;sub;")
                           << "games/a-2.desktop";
    QTest::newRow("replace") << "alt+r"
                             << "a x1 Sub" << QByteArray("*;a.desktop;x.desktop;sub;") << "games/a.desktop";
    QTest::newRow("skip") << "alt+s"
                          << "x1 a1 Sub" << QByteArray("x.desktop;a.desktop;sub;") << "games/x.desktop";
    QTest::newRow("escape") << "Escape"
                            << "x1 a1 Sub" << QByteArray("x.desktop;a.desktop;sub;") << "games/x.desktop";
}

void tst_MenuClashByHand::pastesWhereTheNameIsTaken()
{
    QFETCH(QString, keys);
    QFETCH(QString, games);
    QFETCH(QByteArray, order);
    QFETCH(QString, selected);
    const bool isDone = selected != QLatin1String("games/x.desktop");
    const ExactTree before = ExactTree::of(menu());
    clickItem(in("a.desktop"));
    XDoTool::press(QStringLiteral("ctrl+x"));
    QTRY_VERIFY(!view().dndFormat(QGuiApplication::clipboard()->mimeData()).isEmpty());
    clickItem(in("games/x.desktop"));
    ModalDriver modal;
    expectQuestion(modal, keys);
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_VERIFY(modal.finished());
    QTRY_COMPARE(rows("games"), games);
    QCOMPARE(sortOrderOf(in("games")), order);
    QCOMPARE(QFile::exists(in("a.desktop")), !isDone);
    QTRY_COMPARE(view().selectedPath(), menu() + QLatin1Char('/') + selected);
    QCOMPARE(view().dndFormat(QGuiApplication::clipboard()->mimeData()).isEmpty(), isDone);
    QCOMPARE(view().undoAction()->isEnabled(), isDone);
    if (!isDone) {
        QCOMPARE(before.difference(ExactTree::of(menu())), QString());
        return;
    }
    QCOMPARE(undoText(), QStringLiteral("Undo moving of a to Games"));
    const ExactTree after = ExactTree::of(menu());

    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QCOMPARE(before.numbers().value(QFile::encodeName(in("games/a.desktop"))),
             ExactTree::of(menu()).numbers().value(QFile::encodeName(in("games/a.desktop"))));
    QTRY_COMPARE(rows("games"), QStringLiteral("x1 a1 Sub"));
    XDoTool::press(QStringLiteral("ctrl+shift+z"));
    QTRY_COMPARE(after.difference(ExactTree::of(menu()), {"*"}), QString());
    QTRY_COMPARE(rows("games"), games);
}

// What it holds goes and comes with it.
void tst_MenuClashByHand::replacesAFolder()
{
    const ExactTree before = ExactTree::of(menu());
    view().expand(shown(view(), in("games/sub")));
    copyFiles({QStringLiteral("outside/sub")});
    clickItem(in("games/x.desktop"));
    ModalDriver modal;
    expectQuestion(modal, QStringLiteral("alt+r"));
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_VERIFY(modal.finished());
    QTRY_COMPARE(rows("games"), QStringLiteral("sub x1 a1"));
    QTRY_COMPARE(rows("games/sub"), QStringLiteral("New"));
    QCOMPARE(everythingIn(in("games/sub")), QStringList{QStringLiteral("new.desktop")});
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QTRY_COMPARE(rows("games"), QStringLiteral("x1 a1 Sub"));
    QTRY_COMPARE(rows("games/sub"), QStringLiteral("Old"));
}

void tst_MenuClashByHand::asksAboutSeveral_data()
{
    QTest::addColumn<QStringList>("keys");
    QTest::addColumn<bool>("isForAll");
    QTest::addColumn<QString>("expected");
    const QString keepBoth = QStringLiteral("alt+k");
    const QString replace = QStringLiteral("alt+r");
    QTest::newRow("each") << QStringList{replace, keepBoth} << false << "x2 b2 a2 a1 Sub";
    QTest::newRow("all are kept") << QStringList{keepBoth} << true << "x2 b2 a2 x1 a1 Sub";
    QTest::newRow("all replace") << QStringList{replace} << true << "x2 b2 a2 Sub";
    QTest::newRow("canceled at the second")
        << QStringList{replace, QStringLiteral("Escape")} << false << "x1 a1 Sub";
}

void tst_MenuClashByHand::asksAboutSeveral()
{
    QFETCH(QStringList, keys);
    QFETCH(bool, isForAll);
    QFETCH(QString, expected);
    const ExactTree before = ExactTree::of(menu());
    copyFiles({QStringLiteral("outside/x.desktop"), QStringLiteral("outside/b.desktop"),
               QStringLiteral("outside/a.desktop")});
    clickItem(in("games/x.desktop"));
    ModalDriver modal;
    for (const QString &key : keys)
        expectQuestion(modal, key, isForAll);
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_VERIFY(modal.finished());
    QTRY_COMPARE(rows("games"), expected);
    if (!view().undoAction()->isEnabled()) {
        QCOMPARE(before.difference(ExactTree::of(menu())), QString());
        return;
    }
    QCOMPARE(undoText(), QStringLiteral("Undo copying of 3 items to Games"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QTRY_COMPARE(rows("games"), QStringLiteral("x1 a1 Sub"));
    QVERIFY(!view().undoAction()->isEnabled());
}

// Such a thing cannot be copied.
void tst_MenuClashByHand::leavesNoStepOfAReplacementThatFailed()
{
    QVERIFY(QFile::remove(path(QStringLiteral("outside/a.desktop"))));
    QVERIFY(mkfifo(QFile::encodeName(path(QStringLiteral("outside/a.desktop"))).constData(), 0600) == 0);
    const ExactTree before = ExactTree::of(menu());
    QSignalSpy told(&view(), &VelMenuView::told);
    copyFiles({QStringLiteral("outside/a.desktop")});
    clickItem(in("games/x.desktop"));
    ModalDriver modal;
    expectQuestion(modal, QStringLiteral("alt+r"));
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(told.size(), 1);
    QVERIFY(modal.finished());
    QVERIFY(told.at(0).at(0).toString().startsWith(QLatin1String("Can't copy ")));
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    QVERIFY(!view().undoAction()->isEnabled());
    QTRY_COMPARE(rows("games"), QStringLiteral("x1 a1 Sub"));
}

void tst_MenuClashByHand::asksAfterADrag()
{
    const ExactTree before = ExactTree::of(menu());
    ModalDriver modal;
    pickInDropMenu(modal, QStringLiteral("Move"));
    expectQuestion(modal, QStringLiteral("alt+r"));
    const QPoint from = placeOf(in("a.desktop"));
    const QPoint to = placeOf(in("games"));
    QString script = QStringLiteral("mousemove %1 sleep 0.3 mousedown 1 sleep 0.2")
                         .arg(XDoTool::at(view().viewport(), from));
    for (int i = 1; i <= 8; ++i)
        script += QStringLiteral(" mousemove %1 sleep 0.1")
                      .arg(XDoTool::at(view().viewport(), from + (to - from) * i / 8));
    XDoTool::run(script + QStringLiteral(" mouseup 1"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QTRY_COMPARE(rows("games"), QStringLiteral("x1 a Sub"));
    QVERIFY(!QFile::exists(in("a.desktop")));
    view().setFocus();
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
}

void tst_MenuClashByHand::listsAllOfADropInTheirOrder()
{
    for (const char *name : {"p", "q", "r"})
        write(QStringLiteral("outside/%1.desktop").arg(QLatin1String(name)), entryText(QLatin1String(name)));
    copyFiles({QStringLiteral("outside/r.desktop"), QStringLiteral("outside/p.desktop"),
               QStringLiteral("outside/q.desktop")});
    clickItem(in("games/a.desktop"));
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(rows("games"), QStringLiteral("x1 r p q a1 Sub"));
    QCOMPARE(sortOrderOf(in("games")),
             QByteArray("*;x.desktop;r.desktop;p.desktop;q.desktop;a.desktop;sub;"));
}

void tst_MenuClashByHand::keepsWhatIsThereWithoutAssistance()
{
    dialog()->setAssistance(false);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    const ExactTree before = ExactTree::of(menu());
    QSignalSpy told(&view(), &VelMenuView::told);
    copyFiles({QStringLiteral("outside/x.desktop")});
    clickItem(in("games/a.desktop"));
    ModalDriver modal;
    modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                  QStringLiteral("%1 already exists. Overwrite?").arg(in("games/x.desktop")),
                  QMessageBox::Yes, QMessageBox::NoButton},
                 QMessageBox::Yes);
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(told.size(), 1);
    QVERIFY(modal.finished());
    QCOMPARE(told.at(0).at(0).toString(),
             QStringLiteral("%1 exists and was left as it is.").arg(in("games/x.desktop")));
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

VEL_TEST_MAIN(tst_MenuClashByHand)
#include "tst_MenuClashByHand.moc"
