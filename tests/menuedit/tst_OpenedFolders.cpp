// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HandsOnTestCase.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <menuedit/OpenedFolders.h>
#include <menuedit/OpenedMenus.h>

#include <QDateTime>
#include <QDir>
#include <QFileSystemModel>
#include <QLayout>
#include <QLineEdit>
#include <QSettings>

#include <algorithm>

/// The folders that stay opened from one dialog to the next.
class tst_OpenedFolders : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void opensWhatWasOpen();
    void opensWhatLiesInAClosedFolderWithThat();
    void remembersEachMenuByItself();
    void opensNothingWithoutAssistance();
    void remembersWhatWasOpenBeforeAFilter();
    void writesNothingWhereNothingChanged();
    void forgetsWhatIsGone();
    void opensNoFolderOutsideTheMenu();
    void opensNoMoreThanIsWaitedFor();
    void survivesWhateverTheSettingsHold_data();
    void survivesWhateverTheSettingsHold();
    void remembersFewMenus();

private:
    void openAssisted(const QString &directory, int count);
    void openByHand(const QString &folder, int count);
    void closeByHand(const QString &folder);
    bool isOpen(const char *folder) { return view().isExpanded(shown(view(), in(folder))); }
    QString in(const char *file) const { return menu() + QLatin1Char('/') + QLatin1String(file); }
    QStringList remembered() const { return OpenedMenus::foldersOf(menu()); }
};

void tst_OpenedFolders::init()
{
    HandsOnTestCase::init();
    for (const char *file : {"a/b/c/x.desktop", "a/y.desktop", "d/z.desktop"})
        writeEntry(QLatin1String(file), QStringLiteral("x"));
}

void tst_OpenedFolders::openAssisted(const QString &directory, int count)
{
    closeDialog();
    openDialog(directory, count);
    dialog()->setAssistance(true);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    view().setFocus();
}

void tst_OpenedFolders::openByHand(const QString &folder, int count)
{
    clickItem(folder);
    XDoTool::press(QStringLiteral("Right"));
    QTRY_VERIFY_WITH_TIMEOUT(view().isExpanded(shown(view(), folder)), 20000);
    QVERIFY(open(view(), folder, count));
}

void tst_OpenedFolders::closeByHand(const QString &folder)
{
    clickItem(folder);
    XDoTool::press(QStringLiteral("Left"));
    QTRY_VERIFY_WITH_TIMEOUT(!view().isExpanded(shown(view(), folder)), 20000);
}

void tst_OpenedFolders::opensWhatWasOpen()
{
    openAssisted(menu(), 2);
    openByHand(in("a"), 2);
    openByHand(in("a/b"), 1);
    openAssisted(menu(), 2);
    QTRY_VERIFY_WITH_TIMEOUT(isOpen("a/b"), 20000);
    QVERIFY(isOpen("a") && !isOpen("d"));
    QTRY_COMPARE_WITH_TIMEOUT(names(view(), in("a/b")), QStringList{QStringLiteral("c")}, 20000);
    // What is closed stays closed.
    closeByHand(in("a"));
    QTest::qWait(200);
    QVERIFY(!isOpen("a"));
    openAssisted(menu(), 2);
    QTest::qWait(500);
    QVERIFY(!isOpen("a"));
}

void tst_OpenedFolders::opensWhatLiesInAClosedFolderWithThat()
{
    openAssisted(menu(), 2);
    openByHand(in("a"), 2);
    openByHand(in("a/b"), 1);
    closeByHand(in("a"));
    for (int i = 0; i < 2; ++i) {
        openAssisted(menu(), 2);
        QTest::qWait(300);
        QCOMPARE(remembered(), QStringList{QStringLiteral("a/b")});
        QVERIFY(!isOpen("a"));
    }
    QFileSystemModel *model = files(view());
    QVERIFY(model->canFetchMore(model->index(in("a"))));
    openByHand(in("a"), 2);
    QTRY_VERIFY_WITH_TIMEOUT(isOpen("a/b"), 20000);
}

void tst_OpenedFolders::remembersEachMenuByItself()
{
    const QString other = path(QStringLiteral("other"));
    write(QStringLiteral("other/a/y.desktop"), entryText(QStringLiteral("y")));
    write(QStringLiteral("other/d/y.desktop"), entryText(QStringLiteral("y")));
    openAssisted(menu(), 2);
    openByHand(in("a"), 2);
    openAssisted(other + QLatin1Char('/'), 2);
    QTest::qWait(300);
    QVERIFY(!view().isExpanded(shown(view(), other + QLatin1String("/a"))));
    openByHand(other + QLatin1String("/d"), 1);
    openAssisted(menu(), 2);
    QTRY_VERIFY_WITH_TIMEOUT(isOpen("a"), 20000);
    QVERIFY(!isOpen("d"));
    openAssisted(other, 2);
    QTRY_VERIFY_WITH_TIMEOUT(view().isExpanded(shown(view(), other + QLatin1String("/d"))), 20000);
}

void tst_OpenedFolders::opensNothingWithoutAssistance()
{
    openAssisted(menu(), 2);
    openByHand(in("a"), 2);
    closeDialog();
    openDialog(menu(), 2);
    QTest::qWait(300);
    QVERIFY(!isOpen("a"));
    openByHand(in("d"), 1);
    closeDialog();
    QCOMPARE(remembered(), QStringList{QStringLiteral("a")});
}

void tst_OpenedFolders::remembersWhatWasOpenBeforeAFilter()
{
    openAssisted(menu(), 2);
    openByHand(in("d"), 1);
    dialog()->findChild<QLineEdit *>(QStringLiteral("filterEdit"))->setText(QStringLiteral("x.desktop"));
    QTRY_VERIFY_WITH_TIMEOUT(isOpen("a/b/c"), 20000);
    closeDialog();
    QCOMPARE(remembered(), QStringList{QStringLiteral("d")});
}

void tst_OpenedFolders::writesNothingWhereNothingChanged()
{
    openAssisted(menu(), 2);
    QTest::qWait(100);
    closeDialog();
    QVERIFY(!QSettings().childGroups().join(QString()).contains(QLatin1String("Menus")));
    openAssisted(menu(), 2);
    openByHand(in("a"), 2);
    closeDialog();
    const QString file = QSettings().fileName();
    QVERIFY(QFile::exists(file));
    QVERIFY(QFile::setPermissions(file, QFile::ReadOwner));
    QFile handle(file);
    QVERIFY(handle.open(QFile::ReadOnly));
    const QDateTime past = QDateTime::fromSecsSinceEpoch(1000);
    QVERIFY(handle.setFileTime(past, QFile::FileModificationTime));
    openAssisted(menu(), 2);
    QTRY_VERIFY_WITH_TIMEOUT(isOpen("a"), 20000);
    closeDialog();
    // Closed before anything could be opened.
    openDialog(menu(), 2);
    dialog()->setAssistance(true);
    closeDialog();
    QSettings().sync();
    QCOMPARE(QFileInfo(file).lastModified(), past);
}

void tst_OpenedFolders::forgetsWhatIsGone()
{
    OpenedMenus::keep(menu(), {QStringLiteral("a"), QStringLiteral("gone"), QStringLiteral("gone/x")});
    openAssisted(menu(), 2);
    QTRY_VERIFY_WITH_TIMEOUT(isOpen("a"), 20000);
    closeDialog();
    QCOMPARE(remembered(), QStringList{QStringLiteral("a")});
}

void tst_OpenedFolders::opensNoFolderOutsideTheMenu()
{
    write(QStringLiteral("outside/sub/x.desktop"), entryText(QStringLiteral("x")));
    QVERIFY(QFile::link(path(QStringLiteral("outside")), in("link")));
    QVERIFY(QFile::link(in("d"), in("inner")));
    openAssisted(menu(), 4);
    openByHand(in("link"), 1);
    openByHand(in("inner"), 1);
    closeDialog();
    QCOMPARE(remembered(), QStringList{QStringLiteral("inner")});
    const QStringList asked{QStringLiteral("a"), QStringLiteral("link"), QStringLiteral("link/sub"),
                            QStringLiteral("../outside"), QStringLiteral("/")};
    OpenedMenus::keep(menu(), asked);
    openAssisted(menu(), 4);
    QTRY_VERIFY_WITH_TIMEOUT(isOpen("a"), 20000);
    QTest::qWait(300);
    QVERIFY(!isOpen("link"));
    QFileSystemModel *model = files(view());
    QVERIFY(model->canFetchMore(model->index(in("link"))));
}

void tst_OpenedFolders::opensNoMoreThanIsWaitedFor()
{
    for (int i = 0; i < OpenedFolders::MostItems; ++i)
        QVERIFY(QFile::link(QStringLiteral("nowhere"), in("d") + QStringLiteral("/l%1").arg(i)));
    OpenedMenus::keep(menu(), {QStringLiteral("a"), QStringLiteral("d")});
    openAssisted(menu(), 2);
    QTRY_VERIFY_WITH_TIMEOUT(isOpen("a"), 20000);
    QTest::qWait(300);
    QVERIFY(!isOpen("d"));
    closeDialog();
    // It would be opened again if it were smaller then.
    QCOMPARE(remembered(), QStringList({QStringLiteral("a"), QStringLiteral("d")}));

    QStringList many;
    for (int i = 0; i < OpenedFolders::MostFolders + 50; ++i) {
        many.append(QStringLiteral("f%1").arg(i, 3, 10, QLatin1Char('0')));
        QVERIFY(QDir().mkpath(menu() + QLatin1Char('/') + many.constLast()));
    }
    OpenedMenus::keep(menu(), many);
    openAssisted(menu(), 2 + many.size());
    const auto count = [&] {
        return std::count_if(many.cbegin(), many.cend(), [this](const QString &name) {
            return view().isExpanded(shown(view(), menu() + QLatin1Char('/') + name));
        });
    };
    QTRY_COMPARE_WITH_TIMEOUT(int(count()), OpenedFolders::MostFolders, 20000);
    QTest::qWait(300);
    QCOMPARE(int(count()), OpenedFolders::MostFolders);
}

void tst_OpenedFolders::survivesWhateverTheSettingsHold_data()
{
    QTest::addColumn<QVariant>("folders");
    QTest::newRow("a number") << QVariant(5);
    QTest::newRow("empty texts") << QVariant(QStringList{QString(), QString()});
    QTest::newRow("odd paths") << QVariant(QStringList{
        QStringLiteral("/"), QStringLiteral("."), QStringLiteral(".."), QStringLiteral("../menu"),
        QStringLiteral("a/../../menu/d"), QStringLiteral("//a//"), QStringLiteral("a/y.desktop")});
}

void tst_OpenedFolders::survivesWhateverTheSettingsHold()
{
    QFETCH(QVariant, folders);
    QSettings settings;
    settings.beginWriteArray(QStringLiteral("VelMenuDialog/Menus"), 2000000000);
    settings.setArrayIndex(0);
    settings.setValue(QStringLiteral("Directory"), menu());
    settings.setValue(QStringLiteral("Opened"), folders);
    settings.endArray();
    settings.sync();
    openAssisted(menu(), 2);
    QTest::qWait(300);
    openByHand(in("d"), 1);
    closeDialog();
    QVERIFY(remembered().contains(QLatin1String("d")));
}

void tst_OpenedFolders::remembersFewMenus()
{
    for (int i = 0; i < OpenedMenus::MostMenus + 5; ++i)
        OpenedMenus::keep(QStringLiteral("/menu%1").arg(i), {QStringLiteral("a")});
    QVERIFY(OpenedMenus::foldersOf(QStringLiteral("/menu4")).isEmpty());
    QCOMPARE(OpenedMenus::foldersOf(QStringLiteral("/menu5")), QStringList{QStringLiteral("a")});
    OpenedMenus::keep(QStringLiteral("/menu5/"), {});
    QVERIFY(OpenedMenus::foldersOf(QStringLiteral("/menu5")).isEmpty());
    QCOMPARE(QSettings().value(QStringLiteral("VelMenuDialog/Menus/size")).toInt(),
             OpenedMenus::MostMenus - 1);
}

VEL_TEST_MAIN(tst_OpenedFolders)
#include "tst_OpenedFolders.moc"
