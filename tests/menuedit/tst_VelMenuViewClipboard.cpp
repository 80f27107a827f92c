// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"

#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QAction>
#include <QClipboard>
#include <QDragEnterEvent>
#include <QDropEvent>
#include <QFileSystemModel>
#include <QIcon>
#include <QMenu>
#include <QMimeData>
#include <QPushButton>
#include <QScrollBar>
#include <QSignalSpy>

#include <memory>

/// Cut, copy, paste and drops.
class tst_VelMenuViewClipboard : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void fillsTheClipboard_data();
    void fillsTheClipboard();
    void emptiesTheClipboardForNoItem();
    void cutsAndCopiesTheSelectedItem();
    void leavesTheClipboardWithoutASelection();
    void tellsTheFormat_data();
    void tellsTheFormat();
    void decodesLists_data();
    void decodesLists();
    void complainsAboutAMissingSeparator();
    void movesACutItemBesideTheSelectedFile();
    void movesACutItemIntoTheSelectedFolder();
    void movesACutItemWithinItsFolder();
    void copiesTwiceAndAsksTheSecondTime();
    void copiesAFolderWithEverythingInIt();
    void movesEveryNameThatAFileMayHave_data();
    void movesEveryNameThatAFileMayHave();
    void pastesWhatOtherProgramsCopied();
    void pastesNothing_data();
    void pastesNothing();
    void keepsEverythingWhenAPasteIsRefused_data();
    void keepsEverythingWhenAPasteIsRefused();
    void goesAwayWhileItAsksToOverwrite();
    void keepsPlaceInALargeFolder();
    void asksWhatToDoWithADrop_data();
    void asksWhatToDoWithADrop();
    void listsADropBetweenTwoRowsThere();
    void tellsTheSourceWhatWasDone();
    void keepsToWhatTheSourceAllows();
    void offersTheChoiceAtTheDrop();
    void goesAwayWhileItAsksWhatToDo();
    void removesNothingAfterADrag();

private:
    void dropAt(VelMenuView &view, const QString &source, const QPointF &at, const QString &choice,
                Qt::DropActions allowed);
    void dropOn(VelMenuView &view, const QString &source, const QString &target, const QString &choice,
                Qt::DropActions allowed = Qt::CopyAction | Qt::MoveAction | Qt::LinkAction);

    QString m_a;
    QString m_sub;
    Qt::DropAction m_told = Qt::IgnoreAction;
    bool m_isAccepted = false;
};

void tst_VelMenuViewClipboard::init()
{
    MenuTestCase::init();
    m_a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    m_sub = writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"));
    for (const char *letter : {"x", "y", "z"})
        writeEntry(QStringLiteral("sub/%1.desktop").arg(QLatin1String(letter)),
                   QString::fromLatin1(letter).toUpper());
}

void tst_VelMenuViewClipboard::cleanup()
{
    QGuiApplication::clipboard()->clear();
    MenuTestCase::cleanup();
}

void tst_VelMenuViewClipboard::fillsTheClipboard_data()
{
    QTest::addColumn<int>("action");
    QTest::addColumn<bool>("isCut");
    QTest::newRow("cut") << int(Qt::MoveAction) << true;
    QTest::newRow("copy") << int(Qt::CopyAction) << false;
    QTest::newRow("anything else") << int(Qt::LinkAction) << false;
}

void tst_VelMenuViewClipboard::fillsTheClipboard()
{
    QFETCH(int, action);
    QFETCH(bool, isCut);
    const QString odd = writeEntry(QStringLiteral("My Ж 100%25#1?.desktop"), QStringLiteral("Odd"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    view.FillClipboard(files(view)->index(odd), Qt::DropAction(action));
    const QMimeData *data = QGuiApplication::clipboard()->mimeData();
    const QByteArray bytes = "file:/" + odd.toLocal8Bit() + '\n';
    QCOMPARE(data->data(QStringLiteral("text/uri-list")), bytes);
    QCOMPARE(data->formats().contains(QStringLiteral("text/uri-move-list")), isCut);
    QCOMPARE(data->data(QStringLiteral("text/uri-move-list")), isCut ? bytes : QByteArray());
    QCOMPARE(data->urls(), QList<QUrl>{QUrl::fromLocalFile(odd)});
}

void tst_VelMenuViewClipboard::emptiesTheClipboardForNoItem()
{
    VelMenuView view(menu(), -1, true);
    QGuiApplication::clipboard()->setText(QStringLiteral("text"));
    view.FillClipboard(QModelIndex(), Qt::CopyAction);
    QVERIFY(QGuiApplication::clipboard()->text().isEmpty());
    QCOMPARE(view.dndFormat(QGuiApplication::clipboard()->mimeData()), QString());
}

void tst_VelMenuViewClipboard::cutsAndCopiesTheSelectedItem()
{
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    select(view, m_a);
    QVERIFY(!action(view, QStringLiteral("pasteAction"))->isEnabled());
    view.slotCut();
    QCOMPARE(view.dndFormat(QGuiApplication::clipboard()->mimeData()), QStringLiteral("text/uri-move-list"));
    QVERIFY(action(view, QStringLiteral("pasteAction"))->isEnabled());
    // The item stays in sight until it is pasted.
    QVERIFY(QFile::exists(m_a));
    QCOMPARE(names(view, menu()).size(), 2);
    view.slotCopy();
    QCOMPARE(view.dndFormat(QGuiApplication::clipboard()->mimeData()), QStringLiteral("text/uri-list"));
}

void tst_VelMenuViewClipboard::leavesTheClipboardWithoutASelection()
{
    VelMenuView view(menu(), -1, true);
    QGuiApplication::clipboard()->setText(QStringLiteral("text"));
    view.slotCut();
    view.slotCopy();
    view.slotPaste();
    QCOMPARE(QGuiApplication::clipboard()->text(), QStringLiteral("text"));
}

void tst_VelMenuViewClipboard::tellsTheFormat_data()
{
    QTest::addColumn<QStringList>("formats");
    QTest::addColumn<QString>("format");
    const QString list = QStringLiteral("text/uri-list");
    const QString moveList = QStringLiteral("text/uri-move-list");
    QTest::newRow("none") << QStringList() << QString();
    QTest::newRow("list") << QStringList{list} << list;
    QTest::newRow("move list") << QStringList{moveList} << moveList;
    QTest::newRow("both") << QStringList{list, moveList} << moveList;
    QTest::newRow("another case") << QStringList{QStringLiteral("TEXT/URI-LIST")} << QString();
    QTest::newRow("longer") << QStringList{QStringLiteral("text/uri-list2")} << QString();
}

void tst_VelMenuViewClipboard::tellsTheFormat()
{
    QFETCH(QStringList, formats);
    QFETCH(QString, format);
    const VelMenuView view(menu(), -1, false);
    QMimeData data;
    for (const QString &name : formats)
        data.setData(name, "x");
    QCOMPARE(view.dndFormat(&data), format);
    QCOMPARE(view.dndFormat(nullptr), QString());
}

void tst_VelMenuViewClipboard::decodesLists_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QStringList>("urls");
    QTest::newRow("lines") << QByteArray("file:///a\nfile:///b\n")
                           << QStringList{QStringLiteral("file:///a"), QStringLiteral("file:///b")};
    QTest::newRow("CR LF between, line feed behind")
        << QByteArray("file:///a\r\nfile:///b\n")
        << QStringList{QStringLiteral("file:///a"), QStringLiteral("file:///b")};
    QTest::newRow("escaped") << QByteArray("file:///a%20%D0%96\n")
                             << QStringList{QStringLiteral("file:///a%20\u0416")};
    QTest::newRow("blanks around") << QByteArray("  file:///a  b \n\n\n")
                                   << QStringList{QStringLiteral("file:///a b")};
    QTest::newRow("nothing") << QByteArray("\n") << QStringList();
}

void tst_VelMenuViewClipboard::decodesLists()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QStringList, urls);
    const VelMenuView view(menu(), -1, false);
    QMimeData data;
    data.setData(QStringLiteral("text/uri-move-list"), bytes);
    QList<QUrl> expected;
    for (const QString &url : urls)
        expected.append(QUrl(url));
    QCOMPARE(view.dndUrls(&data, QStringLiteral("text/uri-move-list")), expected);
    QCOMPARE(view.dndUrls(nullptr, QStringLiteral("text/uri-list")), QList<QUrl>());
}

void tst_VelMenuViewClipboard::complainsAboutAMissingSeparator()
{
    const VelMenuView view(menu(), -1, false);
    QMimeData data;
    data.setData(QStringLiteral("text/uri-move-list"), "file:///a");
    // The complaint is tested with the format itself.
    QCOMPARE(view.dndUrls(&data, QStringLiteral("text/uri-move-list")),
             QList<QUrl>{QUrl(QStringLiteral("file:///a"))});
}

void tst_VelMenuViewClipboard::movesACutItemBesideTheSelectedFile()
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

void tst_VelMenuViewClipboard::movesACutItemIntoTheSelectedFolder()
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

void tst_VelMenuViewClipboard::movesACutItemWithinItsFolder()
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

void tst_VelMenuViewClipboard::copiesTwiceAndAsksTheSecondTime()
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

void tst_VelMenuViewClipboard::copiesAFolderWithEverythingInIt()
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

void tst_VelMenuViewClipboard::movesEveryNameThatAFileMayHave_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"with blank", "per%cent", "a%20b", "ha#sh", "que?stion", "umläut", "CAPITALS",
                             "new\nline", "quo\"te'", "-dash", "[*]", "a;b", "tab\tbed"})
        QTest::newRow(name) << QString::fromUtf8(name) + QLatin1String(".desktop");
}

void tst_VelMenuViewClipboard::movesEveryNameThatAFileMayHave()
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

void tst_VelMenuViewClipboard::pastesWhatOtherProgramsCopied()
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

void tst_VelMenuViewClipboard::pastesNothing_data()
{
    QTest::addColumn<QString>("format");
    QTest::newRow("empty clipboard") << QString();
    QTest::newRow("text") << QStringLiteral("text/plain");
}

void tst_VelMenuViewClipboard::pastesNothing()
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

void tst_VelMenuViewClipboard::keepsEverythingWhenAPasteIsRefused_data()
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

void tst_VelMenuViewClipboard::keepsEverythingWhenAPasteIsRefused()
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

void tst_VelMenuViewClipboard::goesAwayWhileItAsksToOverwrite()
{
    write(QStringLiteral("menu/sub/a.desktop"), "mine");
    auto *view = new VelMenuView(menu(), -1, true);
    QVERIFY(open(*view, menu(), 2));
    select(*view, m_a);
    view->slotCut();
    select(*view, m_sub);
    ModalDriver modal;
    // The box belongs to nobody, so it is still there.
    modal.handle([view](QWidget *window) {
        delete view;
        qobject_cast<QMessageBox *>(window)->button(QMessageBox::Yes)->click();
    });
    view->slotPaste();
    QVERIFY(modal.finished());
    QVERIFY(QFile::exists(m_a));
    QCOMPARE(read(m_sub + QLatin1String("/a.desktop")), QByteArray("mine"));
}

void tst_VelMenuViewClipboard::keepsPlaceInALargeFolder()
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

void tst_VelMenuViewClipboard::dropOn(VelMenuView &view, const QString &source, const QString &target,
                                      const QString &choice, Qt::DropActions allowed)
{
    dropAt(view, source, view.visualRect(shown(view, target)).center(), choice, allowed);
}

void tst_VelMenuViewClipboard::dropAt(VelMenuView &view, const QString &source, const QPointF &at,
                                      const QString &choice, Qt::DropActions allowed)
{
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(source)});
    QDragEnterEvent enter(at.toPoint(), allowed, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(view.viewport(), &enter);
    QDragMoveEvent move(at.toPoint(), allowed, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(view.viewport(), &move);
    ModalDriver modal;
    modal.handle([&choice](QWidget *window) {
        auto *choices = qobject_cast<QMenu *>(window);
        QVERIFY(choices);
        const QList<QAction *> actions = choices->actions();
        for (QAction *one : actions) {
            if (!choice.isEmpty() && one->text() == choice) {
                choices->setActiveAction(one);
                QTest::keyClick(choices, Qt::Key_Return);
                return;
            }
        }
        QTest::keyClick(choices, Qt::Key_Escape);
    });
    QDropEvent event(at, allowed, &data, Qt::LeftButton, Qt::NoModifier);
    event.setDropAction(Qt::MoveAction);
    event.ignore();
    QCoreApplication::sendEvent(view.viewport(), &event);
    QVERIFY(modal.finished());
    m_told = event.dropAction();
    m_isAccepted = event.isAccepted();
}

void tst_VelMenuViewClipboard::asksWhatToDoWithADrop_data()
{
    QTest::addColumn<QString>("choice");
    QTest::addColumn<bool>("isThere");
    QTest::addColumn<bool>("isHere");
    QTest::newRow("move") << "Move" << true << false;
    QTest::newRow("copy") << "Copy" << true << true;
    QTest::newRow("cancel") << "Cancel" << false << true;
    QTest::newRow("dismiss") << "" << false << true;
}

void tst_VelMenuViewClipboard::asksWhatToDoWithADrop()
{
    QFETCH(QString, choice);
    QFETCH(bool, isThere);
    QFETCH(bool, isHere);
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(open(view, menu(), 2));
    QSignalSpy changes(&view, &VelMenuView::changed);
    dropOn(view, m_a, m_sub, choice);
    QCOMPARE(QFile::exists(m_sub + QLatin1String("/a.desktop")), isThere);
    QCOMPARE(QFile::exists(m_a), isHere);
    QCOMPARE(m_isAccepted, isThere);
    QCOMPARE(changes.count(), isThere ? 1 : 0);
    if (!isThere)
        QCOMPARE(m_told, Qt::IgnoreAction);
}

void tst_VelMenuViewClipboard::listsADropBetweenTwoRowsThere()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(open(view, menu(), 2));
    QVERIFY(open(view, m_sub, 3));
    QTRY_COMPARE(names(view, m_sub).join(QString()), QStringLiteral("XYZ"));
    const QRect y = view.visualRect(shown(view, m_sub + QLatin1String("/y.desktop")));
    dropAt(view, m_a, QPointF(y.center().x(), y.top()), QStringLiteral("Copy"),
           Qt::MoveAction | Qt::CopyAction);
    QCOMPARE(sortOrderOf(m_sub), QByteArray("*;x.desktop;a.desktop;y.desktop;z.desktop;"));
    QTRY_COMPARE(names(view, m_sub).join(QString()), QStringLiteral("XAYZ"));
}

void tst_VelMenuViewClipboard::tellsTheSourceWhatWasDone()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(open(view, menu(), 2));
    // A source that is told of a move takes its file away.
    dropOn(view, m_a, m_sub, QStringLiteral("Copy"));
    QCOMPARE(m_told, Qt::CopyAction);
    QVERIFY(QFile::remove(m_sub + QLatin1String("/a.desktop")));
    dropOn(view, m_a, m_sub, QStringLiteral("Move"));
    QCOMPARE(m_told, Qt::MoveAction);
}

void tst_VelMenuViewClipboard::keepsToWhatTheSourceAllows()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(open(view, menu(), 2));
    dropOn(view, m_a, m_sub, QStringLiteral("Move"), Qt::CopyAction);
    QVERIFY(QFile::exists(m_a));
    QCOMPARE(m_told, Qt::CopyAction);
}

void tst_VelMenuViewClipboard::offersTheChoiceAtTheDrop()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(m_a)});
    QDropEvent event(QPointF(10.6, 20.4), Qt::MoveAction | Qt::CopyAction, &data, Qt::LeftButton,
                     Qt::NoModifier);
    const QPoint expected = view.viewport()->mapToGlobal(QPoint(11, 20));
    ModalDriver modal;
    modal.handle([expected](QWidget *window) {
        auto *choices = qobject_cast<QMenu *>(window);
        QVERIFY(choices);
        QCOMPARE(choices->pos(), expected);
        const QList<QAction *> actions = choices->actions();
        QStringList texts;
        for (const QAction *one : actions)
            texts.append(one->isSeparator() ? QStringLiteral("-") : one->text());
        QCOMPARE(texts.join(QLatin1Char('|')), QStringLiteral("Move|Copy|-|Cancel"));
        QCOMPARE(actions.constLast()->icon().name(), QStringLiteral("dialog-cancel"));
        choices->close();
    });
    view.dropEvent(&event);
    QVERIFY(modal.finished());
    QVERIFY(!event.isAccepted() || event.dropAction() == Qt::IgnoreAction);
}

void tst_VelMenuViewClipboard::goesAwayWhileItAsksWhatToDo()
{
    auto *view = new VelMenuView(menu(), -1, true);
    view->show();
    QVERIFY(QTest::qWaitForWindowExposed(view));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(m_a)});
    QDropEvent event(QPointF(10, 20), Qt::MoveAction | Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    view->dropEvent(&event);
    QVERIFY(modal.finished());
    QVERIFY(QFile::exists(m_a));
}

void tst_VelMenuViewClipboard::removesNothingAfterADrag()
{
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    // What the base class calls for the source of a move.
    QVERIFY(!view.model()->removeRows(0, 1, view.rootIndex()));
    QVERIFY(QFile::exists(m_a));
    QVERIFY(QFile::exists(m_sub));
}

VEL_TEST_MAIN(tst_VelMenuViewClipboard)
#include "tst_VelMenuViewClipboard.moc"
