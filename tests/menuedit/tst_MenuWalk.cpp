// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OddName.h"
#include "TestCase.h"
#include <menuedit/MenuWalk.h>

#include <QDir>

/// What belongs to a menu.
class tst_MenuWalk : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void meetsNothingWithoutADirectory();
    void meetsFoldersBeforeWhatTheyHold();
    void leavesOutDotFilesAndDanglingLinks();
    void meetsAllBesideANameThatIsNoText();
    void followsLinksWithinButNotInCircles();
    void goesWhereTheUserWentBehindALink();
    void endsAtItsLimit();
    void goesThroughADirectoryGivenAsALink();

private:
    static QStringList all(MenuWalk &walk, const QString &root);
    static QStringList all(const QString &root);
};

QStringList tst_MenuWalk::all(MenuWalk &walk, const QString &root)
{
    QStringList paths;
    while (const std::optional<MenuWalk::Item> item = walk.next())
        paths.append(item->path.mid(root.size() + 1) + (item->isFolder ? QStringLiteral("/") : QString()));
    paths.sort();
    return paths;
}

QStringList tst_MenuWalk::all(const QString &root)
{
    MenuWalk walk(root, [](const QString &) { return false; });
    return all(walk, root);
}

void tst_MenuWalk::meetsNothingWithoutADirectory()
{
    const QString file = write(QStringLiteral("file"), "");
    for (const QString &root : {QString(), path(QStringLiteral("none")), file})
        QCOMPARE(all(root), QStringList());
}

void tst_MenuWalk::meetsFoldersBeforeWhatTheyHold()
{
    write(QStringLiteral("a/b/c.desktop"), "");
    write(QStringLiteral("a/notes.txt"), "");
    MenuWalk walk(folder(), [](const QString &) { return false; });
    QStringList paths;
    while (const std::optional<MenuWalk::Item> item = walk.next())
        paths.append(item->path);
    QCOMPARE(paths.size(), 4);
    QCOMPARE(paths.constFirst(), path(QStringLiteral("a")));
    QCOMPARE(paths.constLast(), path(QStringLiteral("a/b/c.desktop")));
    QVERIFY(walk.isWhole());
}

void tst_MenuWalk::leavesOutDotFilesAndDanglingLinks()
{
    write(QStringLiteral(".directory"), "");
    write(QStringLiteral(".hidden/x.desktop"), "");
    QVERIFY(QFile::link(QStringLiteral("nowhere"), path(QStringLiteral("dangling"))));
    write(QStringLiteral("a.desktop"), "");
    QCOMPARE(all(folder()), QStringList{QStringLiteral("a.desktop")});
}

void tst_MenuWalk::meetsAllBesideANameThatIsNoText()
{
    QStringList expected;
    for (int i = 0; i < 8; ++i) {
        write(QStringLiteral("f%1/x.desktop").arg(i), "");
        writeOddName(folder(), i);
        writeOddName(path(QStringLiteral("f%1").arg(i)), i);
        expected << QStringLiteral("f%1/").arg(i) << QStringLiteral("f%1/x.desktop").arg(i);
    }
    QCOMPARE(all(folder()), expected);
}

void tst_MenuWalk::followsLinksWithinButNotInCircles()
{
    write(QStringLiteral("menu/a/x.desktop"), "");
    write(QStringLiteral("outside/y.desktop"), "");
    const QString menu = path(QStringLiteral("menu"));
    QVERIFY(QFile::link(QStringLiteral("."), menu + QLatin1String("/a/self")));
    QVERIFY(QFile::link(QStringLiteral(".."), menu + QLatin1String("/a/up")));
    QVERIFY(QFile::link(QStringLiteral("/"), menu + QLatin1String("/disk")));
    QVERIFY(QFile::link(QStringLiteral("../outside"), menu + QLatin1String("/out")));
    QVERIFY(QFile::link(QStringLiteral("a"), menu + QLatin1String("/b")));
    QCOMPARE(all(menu).join(QLatin1Char(' ')),
             QStringLiteral("a/ a/self/ a/up/ a/x.desktop b/ b/self/ b/up/ b/x.desktop disk/ out/"));
}

void tst_MenuWalk::goesWhereTheUserWentBehindALink()
{
    write(QStringLiteral("outside/open/x.desktop"), "");
    write(QStringLiteral("outside/closed/y.desktop"), "");
    write(QStringLiteral("menu/a.desktop"), "");
    const QString menu = path(QStringLiteral("menu"));
    const QString link = menu + QLatin1String("/link");
    QVERIFY(QFile::link(QStringLiteral("../outside"), link));
    const QStringList opened{link, link + QLatin1String("/open")};
    MenuWalk walk(menu, [&](const QString &folder) { return opened.contains(folder); });
    QCOMPARE(all(walk, menu).join(QLatin1Char(' ')),
             QStringLiteral("a.desktop link/ link/closed/ link/open/ link/open/x.desktop"));
}

void tst_MenuWalk::endsAtItsLimit()
{
    for (int i = 0; i < 20; ++i)
        write(QStringLiteral("f%1/x.desktop").arg(i), "");
    MenuWalk walk(
        folder(), [](const QString &) { return false; }, 5);
    QCOMPARE(all(walk, folder()).size(), 20 + 4);
    QVERIFY(!walk.isWhole());
    MenuWalk other(
        folder(), [](const QString &) { return false; }, 21);
    QCOMPARE(all(other, folder()).size(), 40);
    QVERIFY(other.isWhole());
}

void tst_MenuWalk::goesThroughADirectoryGivenAsALink()
{
    write(QStringLiteral("real/a/x.desktop"), "");
    QVERIFY(QFile::link(QStringLiteral("real"), path(QStringLiteral("link"))));
    QVERIFY(QFile::link(QStringLiteral("a"), path(QStringLiteral("real/b"))));
    QCOMPARE(all(path(QStringLiteral("link"))).join(QLatin1Char(' ')),
             QStringLiteral("a/ a/x.desktop b/ b/x.desktop"));
}

VEL_TEST_GUILESS_MAIN(tst_MenuWalk)
#include "tst_MenuWalk.moc"
