// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/FolderOrder.h>

class tst_FolderOrder : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void makesARecordFile();
    void keepsTheRestOfARecordFile();
    void leavesARecordFileThatCannotBeSaved();
    void makesNoFolder();

private:
    QString recordFile() const { return path(QStringLiteral("menu/.directory")); }
    QString menu() const { return path(QStringLiteral("menu")); }
};

namespace {

const QStringList List{QStringLiteral("*"), QStringLiteral("b.desktop"), QStringLiteral("a")};

} // namespace

void tst_FolderOrder::makesARecordFile()
{
    QVERIFY(QDir().mkpath(menu()));

    QVERIFY(FolderOrder::write(menu(), List));

    QCOMPARE(read(recordFile()),
             QByteArray(
                 "[Desktop Entry]\nType=Directory\nName=Group\nName[en]=Group\nSortOrder=*;b.desktop;a;\n"));
}

void tst_FolderOrder::keepsTheRestOfARecordFile()
{
    const QByteArray before = "# mine\n[Desktop Entry]\nType=Directory\nName=Games\nName[de]=Spiele\n";
    write(QStringLiteral("menu/.directory"), before + "SortOrder=old;\nX-Own=1\n");

    QVERIFY(FolderOrder::write(menu(), List));

    QCOMPARE(read(recordFile()), before + "SortOrder=*;b.desktop;a;\nX-Own=1\n");
}

void tst_FolderOrder::leavesARecordFileThatCannotBeSaved()
{
    QVERIFY(QDir().mkpath(recordFile() + QStringLiteral("/mine")));

    QVERIFY(!FolderOrder::write(menu(), List));

    QVERIFY(QFileInfo(recordFile() + QStringLiteral("/mine")).isDir());
}

void tst_FolderOrder::makesNoFolder()
{
    QVERIFY(!FolderOrder::write(menu(), List));

    QVERIFY(!QFileInfo::exists(menu()));
}

VEL_TEST_GUILESS_MAIN(tst_FolderOrder)

#include "tst_FolderOrder.moc"
