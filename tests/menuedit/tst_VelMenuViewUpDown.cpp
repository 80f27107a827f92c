// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"
#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QClipboard>
#include <QDateTime>
#include <QFileSystemModel>
#include <QMimeData>

/// Up and Down as they are offered while the menu changes, by hand.
class tst_VelMenuViewUpDown : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void followAPasteIntoAFolderThatWasNotOpened();
    void followANewEntryInAFolderThatWasNotOpened();
    void followAnEditThatMovesTheItem();
    void followRowsThatComeAndGo();
    void keepTheItemInSight_data();
    void keepTheItemInSight();
    void areNotOfferedWhereTheTimeDecides();

private:
    QString offered() const;
};

QString tst_VelMenuViewUpDown::offered() const
{
    const bool up = action(view(), QStringLiteral("upAction"))->isEnabled();
    const bool down = action(view(), QStringLiteral("downAction"))->isEnabled();
    return QLatin1String(up ? "up " : "") + QLatin1String(down ? "down" : "");
}

void tst_VelMenuViewUpDown::followAPasteIntoAFolderThatWasNotOpened()
{
    for (const char *name : {"m", "z"})
        writeEntry(QStringLiteral("sub/%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    const QString n = writeEntry(QStringLiteral("n.desktop"), QStringLiteral("n"));
    openDialog(menu(), 2);
    clickItem(n);
    XDoTool::press(QStringLiteral("ctrl+c"));
    QTRY_VERIFY(QGuiApplication::clipboard()->mimeData()->hasUrls());
    clickItem(menu() + QLatin1String("/sub"));
    QVERIFY(!view().isExpanded(shown(view(), menu() + QLatin1String("/sub"))));

    XDoTool::press(QStringLiteral("ctrl+v"));

    QTRY_COMPARE(view().selectedPath(), menu() + QLatin1String("/sub/n.desktop"));
    QTRY_COMPARE(names(view(), menu() + QLatin1String("/sub")).size(), 3);
    QTRY_COMPARE(offered(), QStringLiteral("up down"));
}

void tst_VelMenuViewUpDown::followANewEntryInAFolderThatWasNotOpened()
{
    for (const char *name : {"a", "z"})
        writeEntry(QStringLiteral("sub/%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    openDialog(menu(), 1);
    clickItem(menu() + QLatin1String("/sub"));
    ModalDriver modal;
    modal.handle([](QWidget *window) { EditTestCase::accept(window, QStringLiteral("m")); });
    XDoTool::press(QStringLiteral("ctrl+n"));
    QTRY_VERIFY(modal.finished());
    QTRY_COMPARE(names(view(), menu() + QLatin1String("/sub")).join(QLatin1Char(' ')),
                 QStringLiteral("a m z"));
    QTRY_COMPARE(offered(), QStringLiteral("up down"));
}

void tst_VelMenuViewUpDown::followAnEditThatMovesTheItem()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("a"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("b"));
    openDialog(menu(), 2);
    clickItem(a);
    QTRY_COMPARE(offered(), QStringLiteral("down"));
    ModalDriver modal;
    modal.handle([](QWidget *window) { EditTestCase::accept(window, QStringLiteral("y")); });
    XDoTool::press(QStringLiteral("space"));
    QTRY_VERIFY(modal.finished());
    QTRY_COMPARE(names(view(), menu()).join(QLatin1Char(' ')), QStringLiteral("b y"));
    QTRY_COMPARE(offered(), QStringLiteral("up "));
}

void tst_VelMenuViewUpDown::followRowsThatComeAndGo()
{
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("b"));
    openDialog(menu(), 1);
    clickItem(b);
    QTRY_COMPARE(offered(), QString());
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("a"));
    QTRY_COMPARE(offered(), QStringLiteral("up "));
    writeEntry(QStringLiteral("c.desktop"), QStringLiteral("c"));
    QTRY_COMPARE(offered(), QStringLiteral("up down"));
    QVERIFY(QFile::remove(a));
    QTRY_COMPARE(offered(), QStringLiteral("down"));
}

void tst_VelMenuViewUpDown::keepTheItemInSight_data()
{
    QTest::addColumn<QString>("button");
    QTest::addColumn<int>("start");
    QTest::newRow("up") << "upAction" << 39;
    QTest::newRow("down") << "downAction" << 0;
}

void tst_VelMenuViewUpDown::keepTheItemInSight()
{
    QFETCH(QString, button);
    QFETCH(int, start);
    const auto file = [this](int i) {
        return menu() + QStringLiteral("/e%1.desktop").arg(i, 2, 10, QLatin1Char('0'));
    };
    for (int i = 0; i < 40; ++i)
        writeEntry(file(i).mid(menu().size() + 1), QStringLiteral("e%1").arg(i, 2, 10, QLatin1Char('0')));
    openDialog(menu(), 40);
    dialog()->resize(400, 300);
    view().showAndSelect(file(start));
    const auto isInSight = [&] {
        return view().viewport()->rect().contains(view().visualRect(shown(view(), file(start))));
    };
    QTRY_VERIFY(isInSight());
    for (int i = 0; i < 20; ++i) {
        const int before = shown(view(), file(start)).row();
        clickAction(qPrintable(button));
        QTRY_VERIFY(shown(view(), file(start)).row() != before);
        QTRY_VERIFY(isInSight());
        QCOMPARE(view().selectedPath(), file(start));
    }
}

void tst_VelMenuViewUpDown::areNotOfferedWhereTheTimeDecides()
{
    const QDateTime now = QDateTime::currentDateTime();
    for (const char *name : {"a", "b", "c"}) {
        QFile file(
            writeEntry(QStringLiteral("recents/%1.desktop").arg(QLatin1String(name)), QLatin1String(name)));
        QVERIFY(file.open(QFile::ReadWrite));
        QVERIFY(file.setFileTime(now.addDays(-*name), QFile::FileModificationTime));
    }
    openDialog(menu(), 1);
    const QString folder = menu() + QLatin1String("/recents");
    QVERIFY(open(view(), folder, 3));
    view().expand(shown(view(), folder));
    QTRY_COMPARE(names(view(), folder).join(QString()), QStringLiteral("abc"));
    for (const char *name : {"a", "b", "c"}) {
        clickItem(folder + QStringLiteral("/%1.desktop").arg(QLatin1String(name)));
        QCOMPARE(offered(), QString());
        QVERIFY(action(view(), QStringLiteral("editAction"))->isEnabled());
    }
}

VEL_TEST_MAIN(tst_VelMenuViewUpDown)

#include "tst_VelMenuViewUpDown.moc"
