// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExactTree.h"
#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <frame/DesktopEntryRecord.h>

#include <QAction>
#include <QLayout>
#include <QProcess>
#include <QSignalSpy>

/// Web addresses that are dragged and pasted into a menu.
class tst_MenuAddressesByHand : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void takesAnAddressFromAPage();
    void takesTheRestOfAPage();
    void pastesAnAddressOfABrowser();
    void pastesAListOfAddresses();
    void refusesWhatIsNeither();
    void takesNoneWithoutAssistance();

private:
    void start(const char *program, const QStringList &arguments);
    void drag(const QPoint &to);
    QString in(const char *file) const { return menu() + QLatin1Char('/') + QLatin1String(file); }
    QString rows(const char *folder) { return names(view(), in(folder)).join(QLatin1Char(' ')); }
    static QString textOf(const QString &file);

    std::unique_ptr<QProcess> m_other;
};

void tst_MenuAddressesByHand::init()
{
    HandsOnTestCase::init();
    writeFolder(QString(), QStringLiteral("Menu"), "games;a.desktop;b.desktop;");
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"), "x.desktop;y.desktop;");
    for (const char *name : {"a", "b", "games/x", "games/y"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)),
                   QString::fromLatin1(name).section(QLatin1Char('/'), -1));
    openDialog(menu(), 3);
    QVERIFY(open(view(), in("games"), 2));
    dialog()->setAssistance(true);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
}

void tst_MenuAddressesByHand::cleanup()
{
    closeDialog();
    if (m_other) {
        m_other->kill();
        m_other->waitForFinished();
    }
    m_other.reset();
    HandsOnTestCase::cleanup();
}

void tst_MenuAddressesByHand::start(const char *program, const QStringList &arguments)
{
    m_other = std::make_unique<QProcess>();
    m_other->setProcessChannelMode(QProcess::ForwardedErrorChannel);
    m_other->start(QLatin1String(program), arguments);
    QTRY_VERIFY_WITH_TIMEOUT(m_other->canReadLine(), 20000);
    QCOMPARE(m_other->readLine(), QByteArray("ready\n"));
}

// From the window of the other program.
void tst_MenuAddressesByHand::drag(const QPoint &to)
{
    QString script = QStringLiteral("mousemove 1000 200 sleep 0.3 mousedown 1 sleep 0.2 mousemove 990 205 "
                                    "sleep 0.2 mousemove 970 210 sleep 0.2");
    for (int i = 8; i >= 0; --i)
        script += QStringLiteral(" mousemove %1 sleep 0.1")
                      .arg(XDoTool::at(view().viewport(), to + QPoint(i * 3, 0)));
    XDoTool::run(script + QStringLiteral(" sleep 0.3 mouseup 1"));
}

QString tst_MenuAddressesByHand::textOf(const QString &file)
{
    const VelUIDesktopEntry entry(file);
    return QStringLiteral("%1 %2 %3").arg(entry.getType(), entry.getName(), entry.getURL());
}

void tst_MenuAddressesByHand::takesAnAddressFromAPage()
{
    const ExactTree before = ExactTree::of(menu());
    start(VEL_LINK_SOURCE,
          {QString::fromUtf8("Das B\u00fcch"), QStringLiteral("https://www.example.org/page?a=1")});
    const QPoint upperEdge(placeOf(in("games/y.desktop")).x(),
                           view().visualRect(shown(view(), in("games/y.desktop"))).top() + 1);
    // Nobody is asked whether to copy or to move it.
    const ModalDriver modal;
    drag(upperEdge);
    QTRY_COMPARE(rows("games"), QString::fromUtf8("x Das B\u00fcch y"));
    QVERIFY(modal.finished());
    const QString made = in("games/example.org.desktop");
    QCOMPARE(textOf(made), QString::fromUtf8("Link Das B\u00fcch https://www.example.org/page?a=1"));
    QCOMPARE(sortOrderOf(in("games")), QByteArray("*;x.desktop;example.org.desktop;y.desktop;"));
    QTRY_COMPARE(view().selectedPath(), made);
    QTRY_VERIFY(m_other->canReadLine());
    QCOMPARE(m_other->readLine().trimmed().toInt(), int(Qt::LinkAction));
    QCOMPARE(view().undoAction()->text(), QString::fromUtf8("Undo creation of Das B\u00fcch"));
    XDoTool::click(dialog(), {5, dialog()->height() - 5});
    view().setFocus();
    QTRY_VERIFY(dialog()->isActiveWindow());
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QTRY_COMPARE(rows("games"), QStringLiteral("x y"));
    XDoTool::press(QStringLiteral("ctrl+shift+z"));
    QTRY_COMPARE(rows("games"), QString::fromUtf8("x Das B\u00fcch y"));
}

// Files stay files: of them the user is asked.
void tst_MenuAddressesByHand::takesTheRestOfAPage()
{
    const ExactTree before = ExactTree::of(menu());
    const QString file = write(QStringLiteral("outside/f.desktop"), entryText(QStringLiteral("f")));
    start(VEL_LINK_SOURCE,
          {QString(), QStringLiteral("http://b.org/"), QUrl::fromLocalFile(file).toString(),
           QStringLiteral("http://b.org/other")});
    const QPoint upperEdge(placeOf(in("games/y.desktop")).x(),
                           view().visualRect(shown(view(), in("games/y.desktop"))).top() + 1);
    ModalDriver modal;
    pickInDropMenu(modal, QStringLiteral("Copy"));
    drag(upperEdge);
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QTRY_COMPARE(rows("games"), QStringLiteral("x b.org f b.org y"));
    QCOMPARE(sortOrderOf(in("games")),
             QByteArray("*;x.desktop;b.org.desktop;f.desktop;b.org-2.desktop;y.desktop;"));
    QCOMPARE(textOf(in("games/b.org-2.desktop")), QStringLiteral("Link b.org http://b.org/other"));
    view().undoAction()->trigger();
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
    QVERIFY(!view().undoAction()->isEnabled());
}

// Qt gives the address away, but not the title.
void tst_MenuAddressesByHand::pastesAnAddressOfABrowser()
{
    const ExactTree before = ExactTree::of(menu());
    start(VEL_CLIPBOARD_OWNER,
          {QStringLiteral("1000"), QStringLiteral("1000"),
           QStringLiteral("http://www.example.org/page\nPage"), QStringLiteral("browser")});
    clickItem(in("games/y.desktop"));
    QTRY_VERIFY(action(view(), QStringLiteral("pasteAction"))->isEnabled());
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(rows("games"), QStringLiteral("x www.example.org y"));
    QCOMPARE(textOf(in("games/example.org.desktop")),
             QStringLiteral("Link www.example.org http://www.example.org/page"));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
}

void tst_MenuAddressesByHand::pastesAListOfAddresses()
{
    start(VEL_CLIPBOARD_OWNER,
          {QStringLiteral("1000"), QStringLiteral("1000"),
           QStringLiteral("# mine\r\nmailto:me@b.org\r\nftp://c.org/x\r\n")});
    clickItem(in("games"));
    QTRY_VERIFY(action(view(), QStringLiteral("pasteAction"))->isEnabled());
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(rows("games").split(QLatin1Char(' ')).size(), 4);
    QCOMPARE(textOf(in("games/me-b.org.desktop")), QStringLiteral("Link me@b.org mailto:me@b.org"));
    QCOMPARE(textOf(in("games/c.org.desktop")), QStringLiteral("Link c.org ftp://c.org/x"));
    QCOMPARE(sortOrderOf(in("games")), QByteArray("x.desktop;y.desktop;"));
    QTRY_COMPARE(view().selectedPath(), in("games/me-b.org.desktop"));
    QCOMPARE(view().undoAction()->text(), QStringLiteral("Undo copying of 2 items to Games"));
}

void tst_MenuAddressesByHand::refusesWhatIsNeither()
{
    const ExactTree before = ExactTree::of(menu());
    QSignalSpy told(&view(), &VelMenuView::told);
    start(VEL_CLIPBOARD_OWNER,
          {QStringLiteral("1000"), QStringLiteral("1000"),
           QStringLiteral("http://b.org/\r\nsmb://server/share\r\n")});
    clickItem(in("games"));
    QTRY_VERIFY(action(view(), QStringLiteral("pasteAction"))->isEnabled());
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_COMPARE(told.size(), 1);
    QCOMPARE(told.at(0).at(0).toString(),
             QStringLiteral("smb://server/share is no file on this computer. Nothing was moved or copied."));
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

void tst_MenuAddressesByHand::takesNoneWithoutAssistance()
{
    dialog()->setAssistance(false);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    const ExactTree before = ExactTree::of(menu());
    QSignalSpy told(&view(), &VelMenuView::told);
    start(VEL_LINK_SOURCE, {QString(), QStringLiteral("http://b.org/")});
    ModalDriver modal;
    pickInDropMenu(modal, QStringLiteral("Copy"));
    drag(placeOf(in("games")));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QTRY_COMPARE(told.size(), 1);
    QCOMPARE(told.at(0).at(0).toString(),
             QStringLiteral("http://b.org/ is no file on this computer. Nothing was moved or copied."));
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

VEL_TEST_MAIN(tst_MenuAddressesByHand)
#include "tst_MenuAddressesByHand.moc"
