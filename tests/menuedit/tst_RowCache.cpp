// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/RowCache.h>

#include <QPixmap>

class tst_RowCache : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void knowsNothingAtFirst();
    void keepsHiddenWhatWasHidden();
    void dropsWhatWasPrefetchedWhenTheEventLoopTurns();
    void givesWhatWasPrefetchedOnce();
    void givesAnIconOnlyOfTheSameFile();
    void givesNoNewIconBeforeItsFileIsKnown();
    void sharesAnIconUntilTheEventLoopTurns();
    void takesTheListedIconOfAnEditedRow();
    void learnsThatAFolderHasARecordFile();
    void forgetsOneRow();
    void forgetsATree();

private:
    static QIcon icon();
    static void fill(RowCache &cache, const QString &path);
    static bool isEmpty(RowCache &cache, const QString &path);
};

namespace {

const QString Folder = QStringLiteral("/menu/games");
const QString Entry = QStringLiteral("/menu/games/a.desktop");
const QString Neighbor = QStringLiteral("/menu/games2");

} // namespace

QIcon tst_RowCache::icon()
{
    return QIcon(QPixmap(1, 1));
}

void tst_RowCache::fill(RowCache &cache, const QString &path)
{
    cache.setDisplay(path, {QStringLiteral("A"), true});
    cache.setIcon(path, FileIdentity(), icon());
    cache.setEditedIcon(path, icon());
    cache.setPlain(path);
}

bool tst_RowCache::isEmpty(RowCache &cache, const QString &path)
{
    return !cache.display(path) && !cache.takePrefetched(path) && !cache.icon(path, FileIdentity())
        && !cache.editedIcon(path) && !cache.isPlain(path);
}

void tst_RowCache::knowsNothingAtFirst()
{
    RowCache cache;
    QVERIFY(isEmpty(cache, Entry));
    QVERIFY(!cache.hasEditedIcons());
}

void tst_RowCache::keepsHiddenWhatWasHidden()
{
    RowCache cache;
    cache.setDisplay(Entry, {QString(), true});
    QVERIFY(cache.display(Entry)->isHidden);

    cache.setDisplay(Entry, {QStringLiteral("A"), false});
    QVERIFY(cache.display(Entry)->isHidden);
    QCOMPARE(cache.display(Entry)->name, QStringLiteral("A"));

    cache.forget(Entry);
    cache.setDisplay(Entry, {QStringLiteral("A"), false});
    QVERIFY(!cache.display(Entry)->isHidden);
}

void tst_RowCache::dropsWhatWasPrefetchedWhenTheEventLoopTurns()
{
    RowCache cache;
    for (int round = 0; round < 2; ++round) {
        cache.prefetch(Entry, {QStringLiteral("A"), false});
        cache.prefetch(Neighbor, {QStringLiteral("B"), false});
        QCOMPARE(cache.takePrefetched(Entry)->name, QStringLiteral("A"));
        QTRY_VERIFY(!cache.takePrefetched(Entry));
        QCoreApplication::processEvents();
        QVERIFY(!cache.takePrefetched(Neighbor));
    }
}

void tst_RowCache::givesWhatWasPrefetchedOnce()
{
    RowCache cache;
    cache.prefetch(Entry, {QStringLiteral("A"), true});
    QVERIFY(!cache.display(Entry));
    QVERIFY(cache.takePrefetched(Entry)->isHidden);
    QVERIFY(!cache.takePrefetched(Entry));
}

void tst_RowCache::givesAnIconOnlyOfTheSameFile()
{
    const QString file = write(QStringLiteral("a.desktop"), "a");
    const FileIdentity before(file);
    RowCache cache;
    const QIcon first = icon();
    cache.setIcon(file, before, first);
    QCOMPARE(cache.icon(file, FileIdentity(file))->cacheKey(), first.cacheKey());

    write(QStringLiteral("a.desktop"), "another");
    QVERIFY(!cache.icon(file, FileIdentity(file)));
    QVERIFY(cache.icon(file, before));
}

void tst_RowCache::givesNoNewIconBeforeItsFileIsKnown()
{
    RowCache cache;
    const QIcon first = icon();
    QVERIFY(!cache.hasIcon(Entry));
    cache.setNewIcon(Entry, first);
    QVERIFY(cache.hasIcon(Entry) && cache.hasNewIcon(Entry));
    QVERIFY(!cache.icon(Entry, FileIdentity()));

    cache.keepNewIcon(Entry, FileIdentity());
    QVERIFY(!cache.hasNewIcon(Entry));
    QCOMPARE(cache.icon(Entry, FileIdentity())->cacheKey(), first.cacheKey());

    cache.setDisplay(Entry, {QStringLiteral("A"), false});
    cache.setNewIcon(Entry, icon());
    cache.dropNewIcon(Entry);
    QVERIFY(!cache.hasIcon(Entry));
    QCOMPARE(cache.display(Entry)->name, QStringLiteral("A"));
}

void tst_RowCache::sharesAnIconUntilTheEventLoopTurns()
{
    RowCache cache;
    const QIcon shared = icon();
    QVERIFY(!cache.sharedIcon(QStringLiteral("editor")));
    cache.shareIcon(QStringLiteral("editor"), shared);
    QCOMPARE(cache.sharedIcon(QStringLiteral("editor"))->cacheKey(), shared.cacheKey());
    QVERIFY(!cache.sharedIcon(QStringLiteral("edit")));
    QTRY_VERIFY(!cache.sharedIcon(QStringLiteral("editor")));
}

void tst_RowCache::takesTheListedIconOfAnEditedRow()
{
    RowCache cache;
    cache.noteListed(Entry, icon());
    QVERIFY(!cache.editedIcon(Entry));

    cache.setEditedIcon(Entry, icon());
    const QIcon listed = icon();
    cache.noteListed(Entry, listed);
    QCOMPARE(cache.editedIcon(Entry)->cacheKey(), listed.cacheKey());

    cache.forgetEditedIcon(Entry);
    QVERIFY(!cache.hasEditedIcons());
}

void tst_RowCache::learnsThatAFolderHasARecordFile()
{
    RowCache cache;
    const QString recordFile = Folder + QStringLiteral("/.directory");
    for (const QString &looked : {Folder, recordFile}) {
        cache.setPlain(Folder);
        cache.noteListed(Entry, icon());
        QVERIFY(cache.isPlain(Folder));
        cache.noteListed(looked, icon());
        QVERIFY(!cache.isPlain(Folder));
    }
    cache.setPlain(Folder);
    cache.forget(recordFile);
    QVERIFY(!cache.isPlain(Folder));
}

void tst_RowCache::forgetsOneRow()
{
    RowCache cache;
    for (const QString &path : {Folder, Entry, Neighbor})
        fill(cache, path);
    cache.prefetch(Folder, {});

    cache.forget(Folder);

    QVERIFY(isEmpty(cache, Folder));
    QVERIFY(cache.display(Entry) && cache.editedIcon(Entry) && cache.isPlain(Entry));
    QVERIFY(cache.display(Neighbor));
}

void tst_RowCache::forgetsATree()
{
    RowCache cache;
    for (const QString &path : {Folder, Entry, Neighbor})
        fill(cache, path);

    cache.forgetTree(Folder);

    QVERIFY(isEmpty(cache, Folder));
    QVERIFY(isEmpty(cache, Entry));
    QVERIFY(cache.display(Neighbor) && cache.editedIcon(Neighbor) && cache.isPlain(Neighbor));
}

VEL_TEST_MAIN(tst_RowCache)

#include "tst_RowCache.moc"
