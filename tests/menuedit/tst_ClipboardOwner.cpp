// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Freeze.h"
#include "HandsOnTestCase.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QClipboard>
#include <QProcess>
#include <QSignalSpy>
#include <QTimer>

namespace {

const int Noticed = 400;
const int Often = 1000;

} // namespace

/// Another program that owns the clipboard, and answers or does not.
class tst_ClipboardOwner : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void asksASilentOwnerOnceAndAtNoSelection();
    void givesUpAPasteFromASilentOwner();
    void givesUpAPasteFromAnOwnerThatFallsSilent();
    void survivesItsViewWhileItWaits();
    void pastesFromAnOwnerThatAnswers();
    void looksAnewWhenAnotherTakesTheClipboard();
    void asksNobodyForWhatItOwnsItself();
    void leavesTheClipboardToItsOwnerWithoutASelection_data();
    void leavesTheClipboardToItsOwnerWithoutASelection();

private:
    void startOwner(int types, int data, const QString &text = QString());
    int questions();
    bool canPaste() const { return action(view(), QStringLiteral("pasteAction"))->isEnabled(); }

    std::unique_ptr<QProcess> m_owner;
    QByteArray m_asked;
    QString m_a;
    QString m_sub;
};

void tst_ClipboardOwner::init()
{
    MenuTestCase::init();
    m_asked.clear();
    m_a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    m_sub = writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"));
}

void tst_ClipboardOwner::cleanup()
{
    closeDialog();
    if (m_owner) {
        m_owner->kill();
        m_owner->waitForFinished();
    }
    m_owner.reset();
    HandsOnTestCase::cleanup();
}

void tst_ClipboardOwner::startOwner(int types, int data, const QString &text)
{
    m_owner = std::make_unique<QProcess>();
    m_owner->start(QStringLiteral(VEL_CLIPBOARD_OWNER),
                   {QString::number(types), QString::number(data), text});
    QTRY_VERIFY(m_owner->canReadLine());
    QCOMPARE(m_owner->readLine(), QByteArray("ready\n"));
}

// How often the owner was asked so far.
int tst_ClipboardOwner::questions()
{
    m_asked += m_owner->readAllStandardOutput();
    return m_asked.count("asked ");
}

void tst_ClipboardOwner::asksASilentOwnerOnceAndAtNoSelection()
{
    openDialog(menu(), 3);
    const Freeze freeze;
    startOwner(0, 0);
    QTRY_COMPARE(questions(), 1);
    for (const QString &file : {m_a, menu() + QLatin1String("/b.desktop"), m_sub, m_a})
        clickItem(file);
    XDoTool::press(QStringLiteral("Down"));
    QTest::qWait(700);
    QCOMPARE(questions(), 1);
    QVERIFY2(freeze.longest() < Noticed, qPrintable(QString::number(freeze.longest())));
}

void tst_ClipboardOwner::givesUpAPasteFromASilentOwner()
{
    openDialog(menu(), 3);
    startOwner(0, 0);
    clickItem(m_sub);
    QSignalSpy told(&view(), &VelMenuView::told);
    const QStringList before = everythingIn(menu());
    const Freeze freeze;
    // That nothing can be known of the clipboard is told when it is asked for.
    QTRY_VERIFY(canPaste());
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(told.count(), 1);
    QCOMPARE(told.constFirst().at(0).toString(),
             QStringLiteral("The program that holds the clipboard does not answer. Nothing was pasted."));
    QCOMPARE(told.constFirst().at(1).toInt(), 2);
    QCOMPARE(questions(), 1);
    QCOMPARE(everythingIn(menu()), before);
    QVERIFY2(freeze.longest() < Noticed, qPrintable(QString::number(freeze.longest())));
}

void tst_ClipboardOwner::givesUpAPasteFromAnOwnerThatFallsSilent()
{
    openDialog(menu(), 3);
    startOwner(1, 0);
    clickItem(m_sub);
    QTRY_VERIFY(canPaste());
    QSignalSpy told(&view(), &VelMenuView::told);
    const Freeze freeze;
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(told.count(), 1);
    QCOMPARE(told.constFirst().at(1).toInt(), 2);
    // It is not waited for again.
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(told.count(), 2);
    QCOMPARE(questions(), 2);
    QVERIFY2(freeze.longest() < Noticed, qPrintable(QString::number(freeze.longest())));
}

void tst_ClipboardOwner::survivesItsViewWhileItWaits()
{
    startOwner(1, 0);
    auto *view = new VelMenuView(menu(), -1, true);
    QVERIFY(open(*view, menu(), 3));
    select(*view, m_sub);
    QTRY_VERIFY(action(*view, QStringLiteral("pasteAction"))->isEnabled());
    QTimer::singleShot(200, view, [view] { delete view; });
    view->slotPaste();
    QVERIFY(!QGuiApplication::overrideCursor());
}

void tst_ClipboardOwner::pastesFromAnOwnerThatAnswers()
{
    const QString other = write(QStringLiteral("outside/o.desktop"), entryText(QStringLiteral("O")));
    openDialog(menu(), 3);
    startOwner(Often, Often, QUrl::fromLocalFile(other).toString() + QStringLiteral("\r\n"));
    clickItem(m_sub);
    QTRY_VERIFY(canPaste());
    QSignalSpy told(&view(), &VelMenuView::told);
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_VERIFY(QFile::exists(m_sub + QLatin1String("/o.desktop")));
    QCOMPARE(told.count(), 0);
}

void tst_ClipboardOwner::looksAnewWhenAnotherTakesTheClipboard()
{
    openDialog(menu(), 3);
    clickItem(m_sub);
    startOwner(0, 0);
    QTRY_VERIFY(canPaste());
    // Another one takes the clipboard from the silent one.
    const std::unique_ptr<QProcess> former = std::move(m_owner);
    startOwner(Often, Often, QStringLiteral("file:///none\r\n"));
    QTRY_COMPARE(questions(), 1);
    QTRY_VERIFY(canPaste());
    QTRY_COMPARE(former->state(), QProcess::NotRunning);
    m_owner->kill();
    QTRY_VERIFY(!canPaste());
}

void tst_ClipboardOwner::asksNobodyForWhatItOwnsItself()
{
    openDialog(menu(), 3);
    startOwner(0, 0);
    clickItem(m_a);
    XDoTool::press(QStringLiteral("ctrl+c"));
    clickItem(m_sub);
    QVERIFY(canPaste());
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_VERIFY(QFile::exists(m_sub + QLatin1String("/a.desktop")));
}

void tst_ClipboardOwner::leavesTheClipboardToItsOwnerWithoutASelection_data()
{
    QTest::addColumn<bool>("isEditable");
    QTest::addColumn<bool>("assistance");
    QTest::addColumn<QString>("keys");
    for (const bool assistance : {false, true}) {
        for (const char *keys : {"ctrl+c", "ctrl+x"})
            QTest::addRow("editor, %s, %s", keys, assistance ? "assistance" : "plain")
                << true << assistance << QString::fromLatin1(keys);
        QTest::addRow("picker, ctrl+c, %s", assistance ? "assistance" : "plain")
            << false << assistance << QStringLiteral("ctrl+c");
    }
}

// The owner ends when another takes the clipboard. The keyboard stays on the item that was selected.
void tst_ClipboardOwner::leavesTheClipboardToItsOwnerWithoutASelection()
{
    QFETCH(bool, isEditable);
    QFETCH(bool, assistance);
    QFETCH(QString, keys);
    VelMenuDialog dialog(menu(), 22, isEditable, isEditable, nullptr, Qt::Window);
    dialog.setAssistance(assistance);
    auto *tree = dialog.findChild<VelMenuView *>();
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QVERIFY(open(*tree, menu(), 3));
    startOwner(Often, Often, QStringLiteral("file:///none\r\n"));
    QPoint place = tree->visualRect(shown(*tree, m_a)).center();
    XDoTool::click(tree->viewport(), place);
    QTRY_COMPARE_WITH_TIMEOUT(tree->selectedPath(), m_a, 20000);
    // Elsewhere: two clicks in one place would be a double click, which opens the entry.
    place.rx() += 60;
    XDoTool::run(QStringLiteral("mousemove %1 sleep 0.1 keydown ctrl click 1 keyup ctrl")
                     .arg(XDoTool::at(tree->viewport(), place)));
    QTRY_VERIFY_WITH_TIMEOUT(!tree->selectedItem().isValid(), 20000);
    QVERIFY(tree->currentIndex().isValid() && tree->hasFocus());

    XDoTool::press(keys);
    // A key behind it tells that it was taken.
    XDoTool::press(QStringLiteral("Down"));
    QTRY_VERIFY_WITH_TIMEOUT(tree->selectedItem().isValid(), 20000);
    QVERIFY(!QGuiApplication::clipboard()->ownsClipboard());
    QCOMPARE(m_owner->state(), QProcess::Running);
    // With a selection it is taken.
    if (isEditable) {
        XDoTool::press(keys);
        QTRY_VERIFY_WITH_TIMEOUT(m_owner->state() == QProcess::NotRunning, 20000);
    }
}

VEL_TEST_MAIN(tst_ClipboardOwner)
#include "tst_ClipboardOwner.moc"
