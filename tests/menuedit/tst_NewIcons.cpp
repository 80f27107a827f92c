// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileCalls.h"
#include "TestCase.h"

#include <menuedit/NewIcons.h>
#include <menuedit/RowCache.h>

#include <QDir>
#include <QPixmap>

#include <memory>

class tst_NewIcons : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void looksAtNoEntryAtFirst();
    void keepsIconsWhenTheRowsStand();
    void keepsIconsAtOnceWhenAsked();
    void keepsManyIcons();
    void dropsTheIconOfAChangedEntry();
    void dropsTheIconOfAReplacedEntry();
    void dropsTheIconsOfAnExchangedFolder();
    void dropsTheIconOfAnEntryThatWent();
    void makesNoRowAnew();
    void keepsTheOtherIconsOfAFolderThatChanged();
    void endsWithTheCache();

private:
    QString oldEntry(const QString &name);
    void give(const QString &file);
    bool isKept(const QString &file) const { return m_cache->icon(file, FileIdentity(file)).has_value(); }

    std::unique_ptr<RowCache> m_cache;
    NewIcons *m_icons = nullptr;
};

void tst_NewIcons::init()
{
    TestCase::init();
    m_cache = std::make_unique<RowCache>();
    m_icons = new NewIcons(m_cache.get());
}

void tst_NewIcons::cleanup()
{
    m_cache.reset();
    TestCase::cleanup();
}

// An entry that, as its folder, has not been changed for a while.
QString tst_NewIcons::oldEntry(const QString &name)
{
    const QString file = write(name, "a");
    const auto isOld = [&] {
        return FileIdentity(file).isSettled() && FileIdentity(QFileInfo(file).path()).isSettled();
    };
    return QTest::qWaitFor(isOld) ? file : QString();
}

void tst_NewIcons::give(const QString &file)
{
    m_icons->begin(file);
    m_icons->end(QIcon(QPixmap(1, 1)));
}

void tst_NewIcons::looksAtNoEntryAtFirst()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    const FileCalls calls;
    give(file);
    QVERIFY(!calls.all().join('\n').contains(QFile::encodeName(file)));
    QVERIFY(m_cache->hasNewIcon(file));
    QVERIFY(m_cache->hasIcon(file));
    QVERIFY(!isKept(file));
}

void tst_NewIcons::keepsIconsWhenTheRowsStand()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    give(file);
    QTRY_VERIFY(!m_cache->hasNewIcon(file));
    QVERIFY(isKept(file));
}

void tst_NewIcons::keepsIconsAtOnceWhenAsked()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    const QString other = oldEntry(QStringLiteral("other/a.desktop"));
    give(file);
    give(other);
    m_icons->finish(file);
    QVERIFY(isKept(file));
    QVERIFY(m_cache->hasNewIcon(other));
    m_icons->finish(path(QStringLiteral("unknown/a.desktop")));
    QTRY_VERIFY(isKept(other));
}

void tst_NewIcons::keepsManyIcons()
{
    QStringList files;
    for (int i = 0; i < 500; ++i)
        files.append(write(QStringLiteral("menu/%1.desktop").arg(i), "a"));
    QVERIFY(!oldEntry(QStringLiteral("menu/a.desktop")).isEmpty());
    for (const QString &file : qAsConst(files))
        give(file);
    for (const QString &file : qAsConst(files))
        QTRY_VERIFY2(isKept(file), qPrintable(file));
}

void tst_NewIcons::dropsTheIconOfAChangedEntry()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    m_icons->begin(file);
    write(QStringLiteral("menu/a.desktop"), "b");
    m_icons->end(QIcon(QPixmap(1, 1)));
    QTRY_VERIFY(!m_cache->hasIcon(file));
}

void tst_NewIcons::dropsTheIconOfAReplacedEntry()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    const QString other = oldEntry(QStringLiteral("other/a.desktop"));
    give(file);
    QVERIFY(QFile::remove(file));
    QVERIFY(QFile::rename(other, file));
    QTRY_VERIFY(!m_cache->hasIcon(file));
}

// Its files are as old as those that stood there.
void tst_NewIcons::dropsTheIconsOfAnExchangedFolder()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    QVERIFY(!oldEntry(QStringLiteral("other/a.desktop")).isEmpty());
    give(file);
    QVERIFY(QDir().rename(path(QStringLiteral("menu")), path(QStringLiteral("gone"))));
    QVERIFY(QDir().rename(path(QStringLiteral("other")), path(QStringLiteral("menu"))));
    QTRY_VERIFY(!m_cache->hasIcon(file));
}

void tst_NewIcons::dropsTheIconOfAnEntryThatWent()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    give(file);
    QVERIFY(QFile::remove(file));
    m_icons->finish(file);
    QVERIFY(!m_cache->hasIcon(file));
}

void tst_NewIcons::makesNoRowAnew()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    const QString other = oldEntry(QStringLiteral("menu/b.desktop"));
    give(file);
    give(other);
    m_cache->forget(file);
    QTRY_VERIFY(isKept(other));
    QVERIFY(!m_cache->hasIcon(file));
}

void tst_NewIcons::keepsTheOtherIconsOfAFolderThatChanged()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    give(file);
    const QString other = write(QStringLiteral("menu/b.desktop"), "b");
    give(other);
    m_icons->finish(file);
    QVERIFY(isKept(file));
    QVERIFY(!m_cache->hasIcon(other));
}

void tst_NewIcons::endsWithTheCache()
{
    const QString file = oldEntry(QStringLiteral("menu/a.desktop"));
    give(file);
    m_cache.reset();
    const FileCalls calls;
    QTest::qWait(200);
    QVERIFY(!calls.all().join('\n').contains(QFile::encodeName(file)));
}

VEL_TEST_MAIN(tst_NewIcons)

#include "tst_NewIcons.moc"
