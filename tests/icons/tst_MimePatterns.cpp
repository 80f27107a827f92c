// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <icons/MimeCacheReader.h>
#include <icons/MimePatterns.h>

#include <QElapsedTimer>
#include <QSet>
#include <QtEndian>

#include <algorithm>

namespace {

/// Writes a cache as update-mime-database does, but only its patterns.
class CacheWriter
{
public:
    CacheWriter()
        : m_bytes(40, '\0')
    {
        put(0, 0x10002);
    }

    void setLists(const QByteArrayList &literals, const QByteArrayList &globs)
    {
        put(12, list(literals));
        put(20, list(globs));
    }

    /// The tree of one end, given backwards.
    void setEnd(const QByteArray &backwards)
    {
        const quint32 header = append(8);
        put(16, header);
        quint32 parent = header;
        for (const char character : backwards) {
            const quint32 node = append(12);
            put(node, quint32(uchar(character)));
            put(parent, 1);
            put(parent + 4, node);
            parent = node + 4;
        }
        const quint32 leaf = append(12);
        put(parent, 1);
        put(parent + 4, leaf);
    }

    void put(quint32 offset, quint32 number) { qToBigEndian(number, m_bytes.data() + offset); }
    quint32 append(int size)
    {
        m_bytes.append(QByteArray(size, '\0'));
        return quint32(m_bytes.size() - size);
    }
    QByteArray bytes() const { return m_bytes; }

private:
    quint32 list(const QByteArrayList &texts)
    {
        const quint32 start = append(4 + 12 * texts.size());
        put(start, quint32(texts.size()));
        for (int i = 0; i < texts.size(); ++i) {
            put(start + 4 + 12 * quint32(i), quint32(m_bytes.size()));
            m_bytes += texts.at(i) + '\0';
        }
        return start;
    }

    QByteArray m_bytes;
};

QByteArray sampleCache()
{
    CacheWriter writer;
    writer.setLists({"makefile", "core"},
                    {"readme*", "sc*on*", "*.so.[0-9]*", "[0-9][0-9].vdr", "*xx.deskto[o-q]",
                     "*yy.deskto[n-o]", "[]b]zz*", "*vv.d?sktop", "*ww.deskto?", "*uu.deskto[!a-o]"});
    writer.setEnd("potksed.");
    return writer.bytes();
}

QByteArray installedCache()
{
    QFile file(QStringLiteral("/usr/share/mime/mime.cache"));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

} // namespace

class tst_MimePatterns : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void refusesWhatIsNoCache_data();
    void refusesWhatIsNoCache();
    void survivesACacheThatIsCutOff();
    void survivesBrokenNumbers();
    void survivesATreeThatBitesItsTail();
    void survivesEntriesThatNameOneLongText();
    void readsTheSamePatternsAsTheTextFile();
    void findsTheEndThatDecides_data();
    void findsTheEndThatDecides();
    void takesTheLongestEnd();
    void answersSoonForADearPattern_data();
    void answersSoonForADearPattern();
    void joinsSeveralCaches();
};

void tst_MimePatterns::refusesWhatIsNoCache_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("nothing") << QByteArray();
    QTest::newRow("short") << QByteArray("\0\1\0\2", 4);
    QTest::newRow("text") << QByteArray(1000, 'x');
    QTest::newRow("zeros") << QByteArray(1000, '\0');
    QByteArray newer = sampleCache();
    newer[1] = 2;
    QTest::newRow("another version") << newer;
}

void tst_MimePatterns::refusesWhatIsNoCache()
{
    QFETCH(QByteArray, bytes);
    QVERIFY(!MimePatterns().addCache(bytes));
}

void tst_MimePatterns::survivesACacheThatIsCutOff()
{
    const QByteArray whole = sampleCache();
    QVERIFY(MimePatterns().addCache(whole));
    for (int size = 0; size < whole.size(); ++size)
        QVERIFY2(!MimePatterns().addCache(whole.left(size)), qPrintable(QString::number(size)));
}

void tst_MimePatterns::survivesBrokenNumbers()
{
    const QByteArray whole = sampleCache();
    const QString name = QStringLiteral("a.desktop");
    int refused = 0;
    for (int offset = 0; offset + 4 <= whole.size(); ++offset) {
        for (const quint32 number : {0x7fffffffU, 0xffffffffU, 0xfffffffcU, quint32(whole.size()), 12U, 1U}) {
            QByteArray broken = whole;
            qToBigEndian(number, broken.data() + offset);
            MimePatterns patterns;
            if (!patterns.addCache(broken)) {
                ++refused;
                continue;
            }
            patterns.finish();
            const int end = patterns.decidingSuffix(name);
            QVERIFY2(end >= 0 && end < name.size(), qPrintable(QString::number(offset)));
        }
    }
    QVERIFY(refused > 0);
}

void tst_MimePatterns::survivesATreeThatBitesItsTail()
{
    CacheWriter writer;
    writer.setLists({}, {});
    writer.setEnd("x");
    QByteArray bytes = writer.bytes();
    const int node = bytes.size() - 24;
    qToBigEndian(quint32(node), bytes.data() + node + 8);
    QVERIFY(!MimePatterns().addCache(bytes));
}

// A megabyte would become many gigabytes.
void tst_MimePatterns::survivesEntriesThatNameOneLongText()
{
    constexpr quint32 count = 40000;
    CacheWriter writer;
    writer.setEnd("x");
    writer.setLists({}, {});
    const quint32 list = writer.append(4 + 12 * int(count));
    const quint32 text = writer.append(500000);
    writer.put(12, list);
    writer.put(list, count);
    for (quint32 i = 0; i < count; ++i)
        writer.put(list + 4 + 12 * i, text);
    QByteArray bytes = writer.bytes();
    std::fill(bytes.begin() + int(text), bytes.end() - 1, 'a');

    int visited = 0;
    QVERIFY(!MimeCacheReader(bytes).visitPatterns([&visited](const QString &) { ++visited; }));
    QVERIFY2(visited < 5, qPrintable(QString::number(visited)));
}

void tst_MimePatterns::readsTheSamePatternsAsTheTextFile()
{
    QFile text(QStringLiteral("/usr/share/mime/globs2"));
    const QByteArray cache = installedCache();
    if (cache.isEmpty() || !text.open(QIODevice::ReadOnly))
        QSKIP("no MIME database is installed");
    QSet<QString> written;
    for (const QByteArray &line : text.readAll().split('\n')) {
        if (!line.isEmpty() && !line.startsWith('#'))
            written.insert(QString::fromUtf8(line.split(':').value(2)));
    }
    QSet<QString> read;
    QVERIFY(MimeCacheReader(cache).visitPatterns([&read](const QString &pattern) { read.insert(pattern); }));
    QVERIFY(read.size() > 500);
    QCOMPARE(read, written);
}

void tst_MimePatterns::findsTheEndThatDecides_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("length");
    QTest::newRow("plain") << QStringLiteral("a.desktop") << 8;
    QTest::newRow("upper case") << QStringLiteral("A.DESKTOP") << 8;
    QTest::newRow("only the end") << QStringLiteral(".desktop") << 0;
    QTest::newRow("no pattern") << QStringLiteral("a.foo") << 0;
    QTest::newRow("part of an end") << QStringLiteral("a.esktop") << 0;
    QTest::newRow("literal") << QStringLiteral("Makefile") << 0;
    QTest::newRow("prefix too") << QStringLiteral("README.desktop") << 0;
    QTest::newRow("pattern in the middle too") << QStringLiteral("a.so.1.desktop") << 0;
    QTest::newRow("not quite that pattern") << QStringLiteral("a.so.x.desktop") << 8;
    QTest::newRow("begin and middle too") << QStringLiteral("scion.desktop") << 0;
    QTest::newRow("begin only") << QStringLiteral("scio.desktop") << 8;
    QTest::newRow("pattern ending in a set") << QStringLiteral("axx.desktop") << 0;
    QTest::newRow("another set at the end") << QStringLiteral("ayy.desktop") << 8;
    QTest::newRow("bracket in a set") << QStringLiteral("bzz.desktop") << 0;
    QTest::newRow("not in that set") << QStringLiteral("czz.desktop") << 8;
    QTest::newRow("pattern ending in a letter") << QStringLiteral("avv.Desktop") << 0;
    QTest::newRow("pattern ending in any letter") << QStringLiteral("aww.desktop") << 0;
    QTest::newRow("pattern ending in an odd set") << QStringLiteral("auu.desktop") << 0;
    QTest::newRow("line feed") << QStringLiteral("a\nb.desktop") << 8;
    QTest::newRow("letter that grows when small") << QStringLiteral("\u0130.desktop") << 0;
    QTest::newRow("half a character") << QString(QChar(0xd800)) + QStringLiteral(".desktop") << 0;
    QTest::newRow("empty") << QString() << 0;
}

void tst_MimePatterns::findsTheEndThatDecides()
{
    QFETCH(QString, name);
    MimePatterns patterns;
    QVERIFY(patterns.addCache(sampleCache()));
    patterns.finish();
    QTEST(patterns.decidingSuffix(name), "length");
}

void tst_MimePatterns::takesTheLongestEnd()
{
    MimePatterns patterns;
    CacheWriter gz, tarGz;
    gz.setLists({}, {});
    gz.setEnd("zg.");
    tarGz.setLists({}, {});
    tarGz.setEnd("zg.rat.");
    QVERIFY(patterns.addCache(gz.bytes()));
    QVERIFY(patterns.addCache(tarGz.bytes()));
    patterns.finish();
    QCOMPARE(patterns.decidingSuffix(QStringLiteral("a.tar.gz")), 7);
    QCOMPARE(patterns.decidingSuffix(QStringLiteral("a.ar.gz")), 3);
    QCOMPARE(patterns.decidingSuffix(QStringLiteral("a.tar.GZ")), 7);
}

void tst_MimePatterns::answersSoonForADearPattern_data()
{
    QTest::addColumn<QByteArray>("pattern");
    QTest::newRow("stars") << QByteArray("*a").repeated(60) + "*b";
    QTest::newRow("stars and question marks") << QByteArray("*?").repeated(60) + "*b";
    QTest::newRow("stars and sets") << QByteArray("*[a-z]").repeated(60) + "*b";
    QTest::newRow("a regular expression") << QByteArray("(a*)*").repeated(20) + "$";
}

void tst_MimePatterns::answersSoonForADearPattern()
{
    QFETCH(QByteArray, pattern);
    CacheWriter writer;
    writer.setLists({}, {pattern});
    writer.setEnd("potksed.");
    MimePatterns patterns;
    QVERIFY(patterns.addCache(writer.bytes()));
    patterns.finish();
    const QString name = QStringLiteral("a").repeated(240) + QStringLiteral("c.desktop");
    QElapsedTimer timer;
    timer.start();
    for (int i = 0; i < 100; ++i)
        QVERIFY(patterns.decidingSuffix(name) >= 0);
    QVERIFY2(timer.elapsed() < 5000, qPrintable(QString::number(timer.elapsed())));
}

void tst_MimePatterns::joinsSeveralCaches()
{
    MimePatterns patterns;
    CacheWriter more;
    more.setLists({}, {"x-*"});
    more.setEnd("oof.");
    QVERIFY(patterns.addCache(sampleCache()));
    QVERIFY(patterns.addCache(more.bytes()));
    patterns.finish();
    QCOMPARE(patterns.decidingSuffix(QStringLiteral("a.foo")), 4);
    QCOMPARE(patterns.decidingSuffix(QStringLiteral("a.desktop")), 8);
    QCOMPARE(patterns.decidingSuffix(QStringLiteral("x-a.desktop")), 0);
}

VEL_TEST_GUILESS_MAIN(tst_MimePatterns)

#include "tst_MimePatterns.moc"
