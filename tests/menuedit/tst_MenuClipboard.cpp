// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/QtMajor.h>
#include <menuedit/MenuClipboard.h>

#include <QDir>

#include <memory>

#include <unistd.h>

using namespace MenuClipboard;

class tst_MenuClipboard : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void keepsTheBytesOfACopy();
    void keepsTheBytesOfACut();
    void offersTheFormatsOfOtherPrograms();
    void holdsSeveralItemsInTheirOrder();
    void tellsTheFormat();
    void givesTheExactPath_data() { oddNames(); }
    void givesTheExactPath();
    void findsThePathInBytesFromAnotherEditor_data() { oddNames(); }
    void findsThePathInBytesFromAnotherEditor();
    void findsThePathInProperUrls_data() { oddNames(); }
    void findsThePathInProperUrls();
    void prefersTheFormatThatIsClear();
    void findsALinkThatLeadsNowhere();
    void keepsTheOrderOfSeveralFiles();
    void tellsFilesThatAreNotLocal();
    void foldsSlashesAndDots();
    void splitsUrls_data();
    void splitsUrls();
    void complainsOfAMissingSeparator();

private:
    void oddNames();
};

namespace {

// What another process gets to see: formats and bytes, and the URLs that Qt makes of them.
class ForeignData : public QMimeData
{
public:
    explicit ForeignData(const QMimeData &original)
    {
        const QStringList formats = original.formats();
        for (const QString &format : formats)
            m_bytes.insert(format, original.data(format));
    }
    ForeignData(const QString &format, const QByteArray &bytes) { m_bytes.insert(format, bytes); }

    void drop(const QString &format) { m_bytes.remove(format); }
    QStringList formats() const override { return m_bytes.keys(); }
    bool hasFormat(const QString &format) const override { return m_bytes.contains(format); }

protected:
    QVariant retrieveData(const QString &format, QtMajor::MimeType type) const override
    {
        const QByteArray bytes = m_bytes.value(format);
        if (!QtMajor::isList(type))
            return bytes;
        QVariantList urls;
        const QList<QByteArray> lines = bytes.split('\n');
        for (const QByteArray &line : lines) {
            if (!line.trimmed().isEmpty())
                urls.append(QUrl::fromEncoded(line.trimmed()));
        }
        return urls;
    }

private:
    QMap<QString, QByteArray> m_bytes;
};

QStringList texts(const QList<QUrl> &urls)
{
    QStringList texts;
    for (const QUrl &url : urls)
        texts.append(url.toString());
    return texts;
}

} // namespace

void tst_MenuClipboard::oddNames()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"plain.desktop", "a b", "My Dir/x", "a#b", "q?x", "per%cent", "a%20b", "100%25",
                             "\xc3\x84rger \xd0\x96", "UPPER/x", "a:b/user@x", "semi;colon", "tab\tx", "'q\"",
                             "a&b", "[x]*", "back\\slash", " lead"})
        QTest::newRow(name) << QString::fromUtf8(name);
}

void tst_MenuClipboard::keepsTheBytesOfACopy()
{
    const ItemData data(QStringLiteral("/tmp/My \u0416/a b%#.desktop"), Qt::CopyAction);

    QCOMPARE(data.data(QStringLiteral("text/uri-list")),
             QByteArray("file://tmp/My \xd0\x96/a b%#.desktop\n"));
    QVERIFY(!data.hasFormat(QStringLiteral("text/uri-move-list")));
    QVERIFY(data.data(QStringLiteral("text/uri-move-list")).isEmpty());
    QVERIFY(data.hasUrls());
}

void tst_MenuClipboard::keepsTheBytesOfACut()
{
    const ItemData data(QStringLiteral("/tmp/x"), Qt::MoveAction);

    QCOMPARE(data.data(QStringLiteral("text/uri-move-list")), QByteArray("file://tmp/x\n"));
    QCOMPARE(data.data(QStringLiteral("text/uri-list")), QByteArray("file://tmp/x\n"));
}

void tst_MenuClipboard::offersTheFormatsOfOtherPrograms()
{
    const QString path = QStringLiteral("/tmp/a b%");
    const ItemData cut(path, Qt::MoveAction);
    const ItemData copied(path, Qt::CopyAction);
    const QString list = QStringLiteral("x-special/gnome-copied-files");
    const QString mark = QStringLiteral("application/x-kde-cutselection");

    QCOMPARE(cut.data(list), QByteArray("cut\nfile:///tmp/a%20b%25"));
    QCOMPARE(copied.data(list), QByteArray("copy\nfile:///tmp/a%20b%25"));
    QCOMPARE(cut.data(mark), QByteArray("1"));
    QVERIFY(!copied.hasFormat(mark));
}

void tst_MenuClipboard::holdsSeveralItemsInTheirOrder()
{
    const QStringList paths{write(QStringLiteral("z a%"), "x"), write(QStringLiteral("b\u0416"), "x"),
                            write(QStringLiteral("a"), "x")};
    const ItemData cut(paths, Qt::MoveAction);
    QByteArray lines;
    QByteArray urls;
    for (const QString &path : paths) {
        lines += "file:/" + path.toLocal8Bit() + '\n';
        urls += '\n' + QUrl::fromLocalFile(path).toEncoded(QUrl::FullyEncoded);
    }

    QCOMPARE(cut.data(QStringLiteral("text/uri-list")), lines);
    QCOMPARE(cut.data(QStringLiteral("text/uri-move-list")), lines);
    QCOMPARE(cut.data(QStringLiteral("x-special/gnome-copied-files")), "cut" + urls);
    QCOMPARE(cut.data(QStringLiteral("application/x-kde-cutselection")), QByteArray("1"));
    QCOMPARE(cut.urls().size(), 3);
    QCOMPARE(localPaths(&cut), paths);
    QCOMPARE(localPaths(std::make_unique<ForeignData>(cut).get()), paths);
    // And where a program knows our own lines alone.
    ForeignData plain(ItemData(paths, Qt::CopyAction));
    plain.drop(QStringLiteral("x-special/gnome-copied-files"));
    QCOMPARE(localPaths(&plain), paths);
}

void tst_MenuClipboard::tellsTheFormat()
{
    QMimeData text;
    text.setText(QStringLiteral("file:///tmp"));
    QMimeData list;
    list.setUrls({QUrl::fromLocalFile(QStringLiteral("/tmp"))});

    QCOMPARE(format(nullptr), QString());
    QCOMPARE(format(&text), QString());
    QCOMPARE(format(&list), QStringLiteral("text/uri-list"));
    QCOMPARE(format(std::make_unique<ItemData>(QStringLiteral("/a"), Qt::CopyAction).get()),
             QStringLiteral("text/uri-list"));
    QCOMPARE(format(std::make_unique<ItemData>(QStringLiteral("/a"), Qt::MoveAction).get()),
             QStringLiteral("text/uri-move-list"));
    QMimeData upper;
    upper.setData(QStringLiteral("TEXT/URI-LIST"), "x");
    QCOMPARE(format(&upper), QString());
}

void tst_MenuClipboard::givesTheExactPath()
{
    QFETCH(QString, name);
    const QString file = path(name);

    const ItemData data(file, Qt::MoveAction);

    QCOMPARE(data.urls(), QList<QUrl>{QUrl::fromLocalFile(file)});
    QCOMPARE(localPaths(&data), QStringList{file});
}

void tst_MenuClipboard::findsThePathInBytesFromAnotherEditor()
{
    QFETCH(QString, name);
    const QString file = write(name, "x");
    ForeignData data(ItemData(file, Qt::CopyAction));
    data.drop(QStringLiteral("x-special/gnome-copied-files"));

    QCOMPARE(localPaths(&data), QStringList{file});
}

void tst_MenuClipboard::findsThePathInProperUrls()
{
    QFETCH(QString, name);
    const QString file = write(name, "x");
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(file)});

    QCOMPARE(localPaths(&data), QStringList{file});
    QCOMPARE(localPaths(std::make_unique<ForeignData>(data).get()), QStringList{file});
}

void tst_MenuClipboard::prefersTheFormatThatIsClear()
{
    // Read as a plain list, the second would be taken for the first.
    write(QStringLiteral("a b"), "x");
    const QString file = write(QStringLiteral("a%20b"), "x");
    const QString twoLines = write(QStringLiteral("two\nlines"), "x");

    QCOMPARE(localPaths(std::make_unique<ForeignData>(ItemData(file, Qt::CopyAction)).get()),
             QStringList{file});
    QCOMPARE(localPaths(std::make_unique<ForeignData>(ItemData(twoLines, Qt::MoveAction)).get()),
             QStringList{twoLines});
}

void tst_MenuClipboard::findsALinkThatLeadsNowhere()
{
    const QString clear = path(QStringLiteral("a%20b"));
    QVERIFY(QFile::link(path(QStringLiteral("missing")), clear));
    write(QStringLiteral("a b"), "x");
    QCOMPARE(localPaths(std::make_unique<ForeignData>(ItemData(clear, Qt::CopyAction)).get()),
             QStringList{clear});

    const QString plain = path(QStringLiteral("c%20d"));
    QVERIFY(QFile::link(path(QStringLiteral("missing")), plain));
    ForeignData data(ItemData(plain, Qt::CopyAction));
    data.drop(QStringLiteral("x-special/gnome-copied-files"));
    QCOMPARE(localPaths(&data), QStringList{plain});
}

void tst_MenuClipboard::keepsTheOrderOfSeveralFiles()
{
    const QString a = write(QStringLiteral("z a"), "x");
    const QString b = write(QStringLiteral("b"), "x");
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(a), QUrl::fromLocalFile(b)});

    QCOMPARE(localPaths(&data), QStringList({a, b}));
    const QByteArray bytes = "# comment\r\n" + QUrl::fromLocalFile(a).toEncoded() + "\r\n"
        + QUrl::fromLocalFile(b).toEncoded() + "\r\n";
    QCOMPARE(localPaths(std::make_unique<ForeignData>(QStringLiteral("text/uri-list"), bytes).get()),
             QStringList({a, b}));
}

void tst_MenuClipboard::tellsFilesThatAreNotLocal()
{
    QMimeData data;
    data.setUrls({QUrl(QStringLiteral("http://example.org/x")), QUrl::fromLocalFile(folder())});

    QCOMPARE(localPaths(&data), QStringList({QString(), folder()}));
}

void tst_MenuClipboard::foldsSlashesAndDots()
{
    QMimeData data;
    data.setUrls({QUrl(QStringLiteral("file:///") + folder()),
                  QUrl(QStringLiteral("file://") + folder() + QLatin1Char('/')),
                  QUrl(QStringLiteral("file://") + folder() + QStringLiteral("/x/../"))});

    QCOMPARE(localPaths(&data), QStringList({folder(), folder(), folder()}));

    data.setUrls({QUrl(QStringLiteral("file:///..")), QUrl(QStringLiteral("file:///../..") + folder())});
    QCOMPARE(localPaths(&data), QStringList({QStringLiteral("/"), folder()}));
}

void tst_MenuClipboard::splitsUrls_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QStringList>("expected");
    const QStringList two{QStringLiteral("file:///a"), QStringLiteral("file:///b")};
    QTest::newRow("line feeds") << QByteArray("file:///a\nfile:///b\n") << two;
    QTest::newRow("one pair, then a line feed") << QByteArray("file:///a\r\nfile:///b\n") << two;
    QTest::newRow("pairs") << QByteArray("file:///a\r\nfile:///b\r\n") << two;
    QTest::newRow("empty parts") << QByteArray("\n\nfile:///a\n\n\nfile:///b") << two;
    QTest::newRow("blanks") << QByteArray("  file:///a \n\tfile:///b\n") << two;
    QTest::newRow("escaped") << QByteArray("file:///%C3%A4\n")
                             << QStringList{QStringLiteral("file:///\u00e4")};
    QTest::newRow("escaped, no UTF-8")
        << QByteArray("file:///%FF\n") << QStringList{QStringLiteral("file:///%FF")};
    QTest::newRow("not escaped") << QByteArray("file:///\xc3\xa4\n")
                                 << QStringList{QStringLiteral("file:///\u00e4")};
}

void tst_MenuClipboard::splitsUrls()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QStringList, expected);
    const ForeignData data(QStringLiteral("text/uri-move-list"), bytes);

    QCOMPARE(texts(urls(&data, QStringLiteral("text/uri-move-list"))), expected);
}

void tst_MenuClipboard::complainsOfAMissingSeparator()
{
    const ForeignData data(QStringLiteral("text/uri-move-list"), "file:///a");
    const QString log = path(QStringLiteral("stderr"));
    const int saved = dup(STDERR_FILENO);
    QVERIFY(freopen(QFile::encodeName(log).constData(), "w", stderr));
    const QStringList found = texts(urls(&data, QStringLiteral("text/uri-move-list")));
    fflush(stderr);
    dup2(saved, STDERR_FILENO);
    close(saved);

    QCOMPARE(found, QStringList{QStringLiteral("file:///a")});
    QCOMPARE(read(log), QByteArray("VelMenuModel: wrong separator in url list (mime data)\n"));
}

VEL_TEST_MAIN(tst_MenuClipboard)

#include "tst_MenuClipboard.moc"
