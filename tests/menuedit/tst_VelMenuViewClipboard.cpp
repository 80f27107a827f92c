// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TransferTestCase.h"
#include "VelMenuView.h"

#include <QAction>
#include <QClipboard>
#include <QFileSystemModel>
#include <QMimeData>

/// What cutting and copying leave on the clipboard, and what is read from it.
class tst_VelMenuViewClipboard : public TransferTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void fillsTheClipboard_data();
    void fillsTheClipboard();
    void emptiesTheClipboardForNoItem();
    void cutsAndCopiesTheSelectedItem();
    void leavesTheClipboardWithoutASelection();
    void leavesTheClipboardToAKeyWithoutASelection();
    void tellsTheFormat_data();
    void tellsTheFormat();
    void decodesLists_data();
    void decodesLists();
    void complainsAboutAMissingSeparator();
};

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

// The keyboard stays on the item that was selected last.
void tst_VelMenuViewClipboard::leavesTheClipboardToAKeyWithoutASelection()
{
    for (const bool isEditable : {true, false}) {
        VelMenuView view(menu(), -1, isEditable);
        view.show();
        QVERIFY(open(view, menu(), 2));
        select(view, m_a);
        view.clearSelection();
        QVERIFY(view.currentIndex().isValid());
        QGuiApplication::clipboard()->setText(QStringLiteral("text"));
        QTest::keyClick(&view, Qt::Key_C, Qt::ControlModifier);
        QCOMPARE(QGuiApplication::clipboard()->text(), QStringLiteral("text"));
    }
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

VEL_TEST_MAIN(tst_VelMenuViewClipboard)
#include "tst_VelMenuViewClipboard.moc"
