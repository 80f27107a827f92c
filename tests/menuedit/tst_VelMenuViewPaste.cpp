// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModalDriver.h"
#include "TransferTestCase.h"
#include "VelMenuView.h"

#include <QAction>
#include <QClipboard>
#include <QFileSystemModel>
#include <QMimeData>
#include <QPushButton>
#include <QScrollBar>
#include <QSignalSpy>

/// Pasting.
class tst_VelMenuViewPaste : public TransferTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void movesACutItemBesideTheSelectedFile();
    void movesACutItemIntoTheSelectedFolder();
    void movesACutItemWithinItsFolder();
    void copiesTwiceAndAsksTheSecondTime();
    void copiesAFolderWithEverythingInIt();
    void movesEveryNameThatAFileMayHave_data();
    void movesEveryNameThatAFileMayHave();
    void pastesWhatOtherProgramsCopied();
    void movesAllThatWereCutBesideOneOfThem();
    void keepsACutOfWhichOneIsRefused();
    void pastesNothing_data();
    void pastesNothing();
    void keepsEverythingWhenAPasteIsRefused_data();
    void keepsEverythingWhenAPasteIsRefused();
    void goesAwayWhileItAsksToOverwrite();
    void keepsPlaceInALargeFolder();

private:
    static void cut(const QStringList &paths);
};

void tst_VelMenuViewPaste::cut(const QStringList &paths)
{
    QList<QUrl> urls;
    for (const QString &path : paths)
        urls.append(QUrl::fromLocalFile(path));
    auto *data = new QMimeData;
    data->setUrls(urls);
    data->setData(QStringLiteral("text/uri-move-list"), data->data(QStringLiteral("text/uri-list")));
    QGuiApplication::clipboard()->setMimeData(data);
}

void tst_VelMenuViewPaste::movesACutItemBesideTheSelectedFile()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 2));
    QVERIFY(open(view, m_sub, 3));
    QTRY_COMPARE(names(view, m_sub).join(QString()), QStringLiteral("XYZ"));
    QSignalSpy changes(&view, &VelMenuView::changed);
    select(view, m_a);
    view.slotCut();
    select(view, m_sub + QLatin1String("/y.desktop"));
    view.slotPaste();
    const QString moved = m_sub + QLatin1String("/a.desktop");
    QVERIFY(!QFile::exists(m_a));
    QCOMPARE(read(moved), entryText(QStringLiteral("A")));
    QCOMPARE(sortOrderOf(m_sub), QByteArray("*;x.desktop;a.desktop;y.desktop;z.desktop;"));
    QTRY_COMPARE(names(view, m_sub).join(QString()), QStringLiteral("XAYZ"));
    QCOMPARE(view.selectedPath(), moved);
    QCOMPARE(changes.count(), 1);
    QCOMPARE(view.dndFormat(QGuiApplication::clipboard()->mimeData()), QString());
    QVERIFY(!action(view, QStringLiteral("pasteAction"))->isEnabled());
}

void tst_VelMenuViewPaste::movesACutItemIntoTheSelectedFolder()
{
    const QByteArray before = read(m_sub + QLatin1String("/.directory"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 2));
    select(view, m_a);
    view.slotCut();
    select(view, m_sub);
    view.slotPaste();
    QVERIFY(!QFile::exists(m_a));
    QVERIFY(QFile::exists(m_sub + QLatin1String("/a.desktop")));
    QTRY_COMPARE(names(view, m_sub).join(QString()), QStringLiteral("AXYZ"));
    QTRY_COMPARE(view.selectedPath(), m_sub + QLatin1String("/a.desktop"));
    QCOMPARE(read(m_sub + QLatin1String("/.directory")), before);
}

void tst_VelMenuViewPaste::movesACutItemWithinItsFolder()
{
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    QVERIFY(open(view, m_sub, 3));
    select(view, m_sub + QLatin1String("/z.desktop"));
    view.slotCut();
    select(view, m_sub + QLatin1String("/x.desktop"));
    view.slotPaste();
    QCOMPARE(sortOrderOf(m_sub), QByteArray("*;z.desktop;x.desktop;y.desktop;"));
    QCOMPARE(names(view, m_sub).join(QString()), QStringLiteral("ZXY"));
    QCOMPARE(everythingIn(m_sub).size(), 4);
}

void tst_VelMenuViewPaste::copiesTwiceAndAsksTheSecondTime()
{
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    select(view, m_a);
    view.slotCopy();
    select(view, m_sub);
    view.slotPaste();
    const QString copied = m_sub + QLatin1String("/a.desktop");
    QVERIFY(QFile::exists(m_a));
    QCOMPARE(read(copied), entryText(QStringLiteral("A")));
    QVERIFY(!view.dndFormat(QGuiApplication::clipboard()->mimeData()).isEmpty());

    write(QStringLiteral("menu/sub/a.desktop"), "mine");
    select(view, m_sub);
    ModalDriver modal;
    modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                  copied + QStringLiteral(" already exists. Overwrite?"), QMessageBox::Yes},
                 QMessageBox::Yes);
    view.slotPaste();
    QVERIFY(modal.finished());
    // What is there is never overwritten.
    QCOMPARE(read(copied), QByteArray("mine"));
    QVERIFY(!view.dndFormat(QGuiApplication::clipboard()->mimeData()).isEmpty());
}

void tst_VelMenuViewPaste::copiesAFolderWithEverythingInIt()
{
    QDir().mkpath(menu() + QLatin1String("/other"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    select(view, m_sub);
    view.slotCopy();
    select(view, menu() + QLatin1String("/other"));
    view.slotPaste();
    QCOMPARE(everythingIn(menu() + QLatin1String("/other/sub")), everythingIn(m_sub));
    QCOMPARE(everythingIn(m_sub).size(), 4);
}

void tst_VelMenuViewPaste::movesEveryNameThatAFileMayHave_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"with blank", "per%cent", "a%20b", "ha#sh", "que?stion", "umläut", "CAPITALS",
                             "new\nline", "quo\"te'", "-dash", "[*]", "a;b", "tab\tbed"})
        QTest::newRow(name) << QString::fromUtf8(name) + QLatin1String(".desktop");
}

void tst_VelMenuViewPaste::movesEveryNameThatAFileMayHave()
{
    QFETCH(QString, name);
    const QString source = writeEntry(name, QStringLiteral("Odd"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    QVERIFY(open(view, m_sub, 3));
    select(view, source);
    view.slotCut();
    select(view, m_sub + QLatin1String("/y.desktop"));
    view.slotPaste();
    QVERIFY(!QFile::exists(source));
    QCOMPARE(read(m_sub + QLatin1Char('/') + name), entryText(QStringLiteral("Odd")));
    QTRY_COMPARE(names(view, m_sub).join(QLatin1Char(' ')), QStringLiteral("X Odd Y Z"));
}

void tst_VelMenuViewPaste::pastesWhatOtherProgramsCopied()
{
    const QString foreign = write(QStringLiteral("outside/f 1%.desktop"), entryText(QStringLiteral("F")));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    auto *data = new QMimeData;
    data->setUrls({QUrl::fromLocalFile(foreign)});
    QGuiApplication::clipboard()->setMimeData(data);
    select(view, m_sub);
    view.slotPaste();
    QVERIFY(QFile::exists(foreign));
    QVERIFY(QFile::exists(m_sub + QLatin1String("/f 1%.desktop")));
}

void tst_VelMenuViewPaste::movesAllThatWereCutBesideOneOfThem()
{
    const QString other = write(QStringLiteral("outside/o.desktop"), entryText(QStringLiteral("O")));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    cut({m_sub + QLatin1String("/y.desktop"), m_a, other});
    select(view, m_sub);
    view.slotPaste();
    QVERIFY(!QFile::exists(m_a) && !QFile::exists(other));
    QVERIFY(QFile::exists(m_sub + QLatin1String("/a.desktop")));
    QVERIFY(QFile::exists(m_sub + QLatin1String("/o.desktop")));
    QCOMPARE(view.dndFormat(QGuiApplication::clipboard()->mimeData()), QString());
}

void tst_VelMenuViewPaste::keepsACutOfWhichOneIsRefused()
{
    const QString other = write(QStringLiteral("outside/x.desktop"), entryText(QStringLiteral("O")));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    cut({m_sub + QLatin1String("/y.desktop"), m_a, other});
    select(view, m_sub);
    QSignalSpy changes(&view, &VelMenuView::changed);
    view.slotPaste();
    QVERIFY(QFile::exists(m_a) && QFile::exists(other));
    QVERIFY(!QFile::exists(m_sub + QLatin1String("/a.desktop")));
    QCOMPARE(changes.count(), 0);
    QCOMPARE(view.dndFormat(QGuiApplication::clipboard()->mimeData()), QStringLiteral("text/uri-move-list"));
}

void tst_VelMenuViewPaste::pastesNothing_data()
{
    QTest::addColumn<QString>("format");
    QTest::newRow("empty clipboard") << QString();
    QTest::newRow("text") << QStringLiteral("text/plain");
}

void tst_VelMenuViewPaste::pastesNothing()
{
    QFETCH(QString, format);
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    QGuiApplication::clipboard()->clear();
    if (!format.isEmpty()) {
        auto *data = new QMimeData;
        data->setData(format, m_a.toUtf8());
        QGuiApplication::clipboard()->setMimeData(data);
    }
    select(view, m_sub);
    QSignalSpy changes(&view, &VelMenuView::changed);
    const ModalDriver modal;
    view.slotPaste();
    QCOMPARE(changes.count(), 0);
    QCOMPARE(everythingIn(m_sub).size(), 4);
    QVERIFY(modal.finished());
}

void tst_VelMenuViewPaste::keepsEverythingWhenAPasteIsRefused_data()
{
    QTest::addColumn<QString>("source");
    QTest::addColumn<QString>("target");
    QTest::newRow("a folder into itself") << "sub"
                                          << "sub";
    QTest::newRow("a folder beside what is in it") << "sub"
                                                   << "sub/y.desktop";
    QTest::newRow("a source that is gone") << "gone.desktop"
                                           << "sub/y.desktop";
    QTest::newRow("a source that is gone, into a folder") << "gone.desktop"
                                                          << "sub";
}

void tst_VelMenuViewPaste::keepsEverythingWhenAPasteIsRefused()
{
    QFETCH(QString, source);
    QFETCH(QString, target);
    const QByteArray order = read(m_sub + QLatin1String("/.directory"));
    VelMenuView view(menu(), -1, true);
    const QString gone = writeEntry(QStringLiteral("gone.desktop"), QStringLiteral("Gone"));
    QVERIFY(open(view, menu(), 3));
    QVERIFY(open(view, m_sub, 3));
    view.FillClipboard(files(view)->index(menu() + QLatin1Char('/') + source), Qt::MoveAction);
    QVERIFY(QFile::remove(gone));
    const QStringList before = everythingIn(menu());
    select(view, menu() + QLatin1Char('/') + target);
    QSignalSpy changes(&view, &VelMenuView::changed);
    view.slotPaste();
    QCOMPARE(everythingIn(menu()), before);
    QCOMPARE(read(m_sub + QLatin1String("/.directory")), order);
    QCOMPARE(changes.count(), 0);
    QCOMPARE(view.dndFormat(QGuiApplication::clipboard()->mimeData()), QStringLiteral("text/uri-move-list"));
}

void tst_VelMenuViewPaste::goesAwayWhileItAsksToOverwrite()
{
    write(QStringLiteral("menu/sub/a.desktop"), "mine");
    auto *view = new VelMenuView(menu(), -1, true);
    QVERIFY(open(*view, menu(), 2));
    select(*view, m_a);
    view->slotCut();
    select(*view, m_sub);
    ModalDriver modal;
    modal.handle([view](QWidget *window) {
        const QPointer<QWidget> box(window);
        delete view;
        QVERIFY(!box);
    });
    view->slotPaste();
    QVERIFY(modal.finished());
    QVERIFY(QFile::exists(m_a));
    QCOMPARE(read(m_sub + QLatin1String("/a.desktop")), QByteArray("mine"));
}

void tst_VelMenuViewPaste::keepsPlaceInALargeFolder()
{
    for (int i = 0; i < 300; ++i)
        writeEntry(QStringLiteral("e%1.desktop").arg(i, 3, 10, QLatin1Char('0')),
                   QStringLiteral("E%1").arg(i));
    VelMenuView view(menu(), -1, true);
    view.resize(300, 200);
    view.show();
    QVERIFY(open(view, menu(), 302));
    QVERIFY(open(view, m_sub, 3));
    select(view, m_sub + QLatin1String("/x.desktop"));
    view.slotCopy();
    const QString at = menu() + QLatin1String("/e150.desktop");
    view.showAndSelect(at);
    QTRY_VERIFY(view.viewport()->rect().contains(view.visualRect(shown(view, at))));
    const int scrolled = view.verticalScrollBar()->value();
    view.slotPaste();
    const QString pasted = menu() + QLatin1String("/x.desktop");
    QTRY_COMPARE(view.selectedPath(), pasted);
    QTRY_VERIFY(view.viewport()->rect().contains(view.visualRect(shown(view, pasted))));
    QVERIFY(qAbs(view.verticalScrollBar()->value() - scrolled) <= 2);
    QVERIFY(view.isExpanded(shown(view, m_sub)));
}

VEL_TEST_MAIN(tst_VelMenuViewPaste)
#include "tst_VelMenuViewPaste.moc"
