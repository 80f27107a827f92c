// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/FolderListing.h>

#include <QDir>
#include <QFile>

#include <sys/stat.h>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

// "path name", and whether it is a folder and a link; in the order of the names.
QStringList itemsOf(FolderListing listing)
{
    QStringList items;
    while (const std::optional<FolderListing::Item> item = listing.next())
        items.append(item->path + s(item->isFolder ? " folder" : " file") + s(item->isLink ? " link" : ""));
    items.sort();
    return items;
}

} // namespace

class tst_FolderListing : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void listsFilesAndFoldersAndLinksThatLeadSomewhere();
    void listsDotFilesWhereTheyAreWanted();
    void leavesOutANameThatIsNoText();
    void keepsThePathAsItWasGiven();
    void listsNothingWhereItCannotLook();
    void endsForGood();
    void namesAllThatAFolderHolds();
    void namesWhatIsNoText();
    void namesNothingWhereItCannotLook();
    void tellsWhetherANameIsNoText();

private:
    QString below(const char *name) const { return path(s("folder/") + s(name)); }
};

void tst_FolderListing::init()
{
    TestCase::init();
    for (const char *name : {"folder/file", "folder/.hidden", "folder/sub/inner", "folder/\u00e4"})
        write(s(name), "");
    for (const char *target : {"file", "sub", "missing", "pipe"})
        QVERIFY(QFile::link(below(target), below("link to ") + s(target)));
    QCOMPARE(mkfifo(QFile::encodeName(below("pipe")).constData(), 0600), 0);
}

void tst_FolderListing::listsFilesAndFoldersAndLinksThatLeadSomewhere()
{
    QCOMPARE(itemsOf(FolderListing(path(s("folder")))),
             (QStringList{below("file") + s(" file"), below("link to file") + s(" file link"),
                          below("link to pipe") + s(" file link"), below("link to sub") + s(" folder link"),
                          below("sub") + s(" folder"), below("\u00e4") + s(" file")}));
}

void tst_FolderListing::listsDotFilesWhereTheyAreWanted()
{
    const QStringList items = itemsOf(FolderListing(path(s("folder")), FolderListing::With));
    QCOMPARE(items.size(), 7);
    QCOMPARE(items.constFirst(), below(".hidden") + s(" file"));
}

void tst_FolderListing::leavesOutANameThatIsNoText()
{
    const QStringList items = itemsOf(FolderListing(path(s("folder"))));
    QVERIFY(mknod((QFile::encodeName(below("bad")) + "\xff").constData(), S_IFREG | 0600, 0) == 0);
    QCOMPARE(itemsOf(FolderListing(path(s("folder")))), items);
}

void tst_FolderListing::keepsThePathAsItWasGiven()
{
    QVERIFY(QFile::link(path(s("folder/sub")), path(s("link"))));
    QCOMPARE(itemsOf(FolderListing(path(s("link/")))), QStringList{path(s("link/inner")) + s(" file")});
    const QString before = QDir::currentPath();
    QVERIFY(QDir::setCurrent(path(s("folder"))));
    const QStringList items = itemsOf(FolderListing(s("sub")));
    QVERIFY(QDir::setCurrent(before));
    QCOMPARE(items, QStringList{s("sub/inner file")});
}

void tst_FolderListing::listsNothingWhereItCannotLook()
{
    for (const char *name : {"missing", "file", "link to missing"})
        QVERIFY2(itemsOf(FolderListing(below(name))).isEmpty(), name);
    QVERIFY(itemsOf(FolderListing(QString())).isEmpty());
}

void tst_FolderListing::endsForGood()
{
    FolderListing listing(below("sub"));
    QVERIFY(listing.next());
    QVERIFY(!listing.next());
    QVERIFY(!listing.next());
}

void tst_FolderListing::namesAllThatAFolderHolds()
{
    QCOMPARE(FolderListing::namesIn(path(s("folder"))),
             (QSet<QString>{s("file"), s(".hidden"), s("sub"), s("pipe"), s("link to file"), s("link to sub"),
                            s("link to missing"), s("link to pipe"), s("\u00e4")}));
    QCOMPARE(FolderListing::namesIn(below("link to sub")), QSet<QString>{s("inner")});
    QVERIFY(QFile::remove(below("sub/inner")));
    QCOMPARE(FolderListing::namesIn(below("sub")), QSet<QString>());
}

void tst_FolderListing::namesWhatIsNoText()
{
    QVERIFY(mknod((QFile::encodeName(below("sub/bad")) + "\xff").constData(), S_IFREG | 0600, 0) == 0);
    QCOMPARE(FolderListing::namesIn(below("sub")), (QSet<QString>{s("inner"), s("bad\ufffd")}));
}

void tst_FolderListing::namesNothingWhereItCannotLook()
{
    for (const char *name : {"missing", "file", "link to missing"})
        QVERIFY2(!FolderListing::namesIn(below(name)), name);
    QVERIFY(!FolderListing::namesIn(QString()));
}

void tst_FolderListing::tellsWhetherANameIsNoText()
{
    QVERIFY(!FolderListing::holdsOddName(path(s("folder"))));
    QVERIFY(!FolderListing::holdsOddName(below("missing")));
    QVERIFY(mknod((QFile::encodeName(below("sub/bad")) + "\xff").constData(), S_IFREG | 0600, 0) == 0);
    QVERIFY(FolderListing::holdsOddName(below("sub")));
}

VEL_TEST_GUILESS_MAIN(tst_FolderListing)

#include "tst_FolderListing.moc"
