// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <menuedit/MenuVoice.h>

#include <QElapsedTimer>
#include <QFileSystemModel>
#include <QMimeData>
#include <QProcess>
#include <QSignalSpy>
#include <QTextDocument>
#include <QToolTip>
#include <QTreeView>

/// What the user hears of a failure, in a window that a window manager activates.
class tst_MenuVoice : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();

    void tellsThoseWhoListenAlone();
    void showsATipWhereNobodyListens_data();
    void showsATipWhereNobodyListens();
    void showsATipAsItIsWritten();
    void keepsTheTipAfterAMessageBox();
    void keepsTheTipWhileThePointerRestsOnAnItem();
    void leavesTheTipAfterAClick();

private:
    bool dropOntoAnExistingOne();
};

namespace {

// What is announced when the user says Yes; there is nothing to be done then but to tell it.
void announceOverwrite(ModalDriver &modal, const QString &target)
{
    modal.answerWith({QMessageBox::Question, QStringLiteral("Attention"),
                      QStringLiteral("%1 already exists. Overwrite?").arg(target), QMessageBox::Yes},
                     [](QMessageBox *box) {
                         QVERIFY(QTest::qWaitForWindowActive(box));
                         // Not waited for: what follows the box is to run before its window is gone.
                         QVERIFY(QProcess::startDetached(QStringLiteral("xdotool"),
                                                         {QStringLiteral("sleep"), QStringLiteral("0.2"),
                                                          QStringLiteral("key"), QStringLiteral("Return")}));
                     });
}

bool staysFor(const QString &text, int milliseconds)
{
    QElapsedTimer clock;
    for (clock.start(); clock.elapsed() < milliseconds; QTest::qWait(10)) {
        if (!QToolTip::isVisible() || QToolTip::text() != text)
            return false;
    }
    return true;
}

} // namespace

void tst_MenuVoice::cleanup()
{
    QToolTip::hideText();
    HandsOnTestCase::cleanup();
}

bool tst_MenuVoice::dropOntoAnExistingOne()
{
    const QString source = writeEntry(QStringLiteral("from/x.desktop"), QStringLiteral("New"));
    const QString target = writeEntry(QStringLiteral("x.desktop"), QStringLiteral("Old"));
    openDialog(menu(), 2);
    if (QTest::currentTestFailed())
        return false;
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(source)});
    ModalDriver modal;
    announceOverwrite(modal, target);
    const bool isDone =
        files(view())->dropMimeData(&data, Qt::MoveAction, -1, -1, files(view())->index(menu()));
    return !isDone && modal.finished() && read(target).contains("Old");
}

void tst_MenuVoice::tellsThoseWhoListenAlone()
{
    VelMenuView view(menu(), -1, true);
    QSignalSpy told(&view, &VelMenuView::told);
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(path(QStringLiteral("none/x")))});
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    QVERIFY(open(view, menu(), 1));

    QVERIFY(!files(view)->dropMimeData(&data, Qt::MoveAction, -1, -1, files(view)->index(menu())));

    QCOMPARE(told.size(), 1);
    QCOMPARE(told.at(0).at(0).toString(),
             QStringLiteral("%1 does not exist.").arg(path(QStringLiteral("none/x"))));
    QCOMPARE(told.at(0).at(1).toInt(), 2);
    QVERIFY(!QToolTip::isVisible());
}

void tst_MenuVoice::showsATipWhereNobodyListens_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<bool>("isShown");
    QTest::newRow("note") << int(MenuVoice::Note) << false;
    QTest::newRow("warning") << int(MenuVoice::Warning) << true;
    QTest::newRow("failure") << int(MenuVoice::Failure) << true;
}

void tst_MenuVoice::showsATipWhereNobodyListens()
{
    QFETCH(int, kind);
    QFETCH(bool, isShown);
    QTreeView tree;
    tree.show();
    QVERIFY(QTest::qWaitForWindowActive(&tree));
    MenuVoice voice(&tree, [] { return false; });
    voice.tell(QStringLiteral("The roof is on fire."), MenuVoice::Kind(kind));
    QCOMPARE(QToolTip::isVisible(), isShown);
    QCOMPARE(QToolTip::text(), isShown ? QStringLiteral("The roof is on fire.") : QString());
}

void tst_MenuVoice::showsATipAsItIsWritten()
{
    QTreeView tree;
    tree.show();
    QVERIFY(QTest::qWaitForWindowActive(&tree));
    MenuVoice voice(&tree, [] { return false; });
    voice.tell(QStringLiteral("/a/<b>x</b> & \"y\" is in the way."), MenuVoice::Failure);
    QVERIFY(QToolTip::text().contains(QLatin1String("/a/&lt;b&gt;x&lt;/b&gt; &amp; &quot;y&quot; is in")));
    QVERIFY(Qt::mightBeRichText(QToolTip::text()));
}

void tst_MenuVoice::keepsTheTipAfterAMessageBox()
{
    QVERIFY(dropOntoAnExistingOne());
    const QString text =
        QStringLiteral("%1 exists and was left as it is.").arg(menu() + QLatin1String("/x.desktop"));
    QTRY_VERIFY(dialog()->isActiveWindow());
    QTRY_VERIFY(QToolTip::isVisible() && QToolTip::text() == text);
    // Whatever the window manager says late, it is there for the better part of the time after it.
    QTest::qWait(500);
    QVERIFY(staysFor(text, 2000));
}

void tst_MenuVoice::keepsTheTipWhileThePointerRestsOnAnItem()
{
    QVERIFY(dropOntoAnExistingOne());
    QTRY_VERIFY(QToolTip::isVisible());
    XDoTool::run(QLatin1String("mousemove ")
                 + XDoTool::at(view().viewport(), placeOf(menu() + QLatin1String("/from"))));
    XDoTool::run(QStringLiteral("mousemove_relative 5 0"));
    QTest::qWait(500);
    // The view asks for the tip of the item within 700 ms.
    QVERIFY(staysFor(QToolTip::text(), 1500) && !QToolTip::text().isEmpty());
}

void tst_MenuVoice::leavesTheTipAfterAClick()
{
    QVERIFY(dropOntoAnExistingOne());
    QTRY_VERIFY(QToolTip::isVisible());
    clickItem(menu() + QLatin1String("/from"));
    QTest::qWait(200);
    QVERIFY(!QToolTip::isVisible());
}

VEL_TEST_MAIN(tst_MenuVoice)

#include "tst_MenuVoice.moc"
