// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"
#include <menuedit/FoundOrder.h>

#include <QFileInfo>

/// The order of some items of a menu.
class tst_FoundOrder : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void listsNothing();
    void goesByTheListsOfTheFoldersOnTheWay();
    void goesByFoldersAndNamesWithoutAList();
    void listsAFolderAboveWhatItHolds();

private:
    QStringList sorted(const QStringList &names) const;
};

QStringList tst_FoundOrder::sorted(const QStringList &names) const
{
    QVector<MenuWalk::Item> items;
    for (const QString &name : names)
        items.append({path(name), QFileInfo(path(name)).isDir()});
    QStringList result;
    const QStringList paths = FoundOrder::sorted(
        folder(), items, [](const MenuWalk::Item &item) { return QFileInfo(item.path).fileName(); });
    for (const QString &path : paths)
        result.append(path.mid(folder().size() + 1));
    return result;
}

void tst_FoundOrder::listsNothing()
{
    QCOMPARE(sorted({}), QStringList());
}

void tst_FoundOrder::goesByTheListsOfTheFoldersOnTheWay()
{
    write(QStringLiteral(".directory"),
          "[Desktop Entry]\nType=Directory\nName=M\nSortOrder=z.desktop;b;a;\n");
    write(QStringLiteral("b/.directory"),
          "[Desktop Entry]\nType=Directory\nName=B\nSortOrder=y.desktop;*;\n");
    for (const char *name : {"a/x.desktop", "b/x.desktop", "b/y.desktop", "z.desktop"})
        write(QLatin1String(name), "");
    QCOMPARE(sorted({QStringLiteral("a/x.desktop"), QStringLiteral("b/x.desktop"),
                     QStringLiteral("z.desktop"), QStringLiteral("b/y.desktop")}),
             (QStringList{QStringLiteral("z.desktop"), QStringLiteral("b/y.desktop"),
                          QStringLiteral("b/x.desktop"), QStringLiteral("a/x.desktop")}));
}

void tst_FoundOrder::goesByFoldersAndNamesWithoutAList()
{
    for (const char *name : {"b.desktop", "a.desktop", "c/x.desktop"})
        write(QLatin1String(name), "");
    QCOMPARE(
        sorted({QStringLiteral("b.desktop"), QStringLiteral("a.desktop"), QStringLiteral("c/x.desktop")}),
        (QStringList{QStringLiteral("c/x.desktop"), QStringLiteral("a.desktop"),
                     QStringLiteral("b.desktop")}));
}

void tst_FoundOrder::listsAFolderAboveWhatItHolds()
{
    write(QStringLiteral("a/b/x.desktop"), "");
    write(QStringLiteral("c.desktop"), "");
    QCOMPARE(
        sorted({QStringLiteral("a/b/x.desktop"), QStringLiteral("c.desktop"), QStringLiteral("a")}),
        (QStringList{QStringLiteral("a"), QStringLiteral("a/b/x.desktop"), QStringLiteral("c.desktop")}));
}

VEL_TEST_GUILESS_MAIN(tst_FoundOrder)
#include "tst_FoundOrder.moc"
