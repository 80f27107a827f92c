// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconTestCase.h"

#include <QBuffer>
#include <QDir>
#include <QDirIterator>

#include <QtEndian>

#include <sys/resource.h>
#include <sys/stat.h>
#include <zlib.h>

namespace {

const char Start[] = "<svg xmlns=\"http://www.w3.org/2000/svg\" "
                     "xmlns:xlink=\"http://www.w3.org/1999/xlink\" width=\"8\" height=\"8\">"
                     "<rect width=\"8\" height=\"8\" fill=\"#f0f\"/>";

QByteArray picture(int width, int height, const char *format = "png")
{
    QImage image(width, height, QImage::Format_Mono);
    image.setColorTable({qRgb(255, 0, 255), qRgb(0, 0, 0)});
    image.fill(0);
    QBuffer buffer;
    image.save(&buffer, format);
    return buffer.data();
}

QByteArray chunk(const QByteArray &named)
{
    const auto bigEndian = [](quint32 value) {
        value = qToBigEndian(value);
        return QByteArray(reinterpret_cast<const char *>(&value), 4);
    };
    const auto sum = crc32(0, reinterpret_cast<const Bytef *>(named.constData()), uInt(named.size()));
    return bigEndian(quint32(named.size()) - 4) + named + bigEndian(quint32(sum));
}

/// A black square; made without ever having all of it in memory.
QByteArray hugePicture(int edge)
{
    QByteArray packed(1024 * 1024, Qt::Uninitialized);
    QByteArray row(edge / 8 + 2, '\0');
    z_stream stream = {};
    stream.next_out = reinterpret_cast<Bytef *>(packed.data());
    stream.avail_out = uInt(packed.size());
    if (deflateInit(&stream, 9) != Z_OK)
        return {};
    for (int i = 0; i < edge; ++i) {
        stream.next_in = reinterpret_cast<Bytef *>(row.data());
        stream.avail_in = uInt(row.size() - (edge % 8 == 0 ? 1 : 0));
        deflate(&stream, i + 1 == edge ? Z_FINISH : Z_NO_FLUSH);
    }
    packed.truncate(int(stream.total_out));
    deflateEnd(&stream);
    QByteArray size(8, '\0');
    qToBigEndian<quint32>(quint32(edge), size.data());
    qToBigEndian<quint32>(quint32(edge), size.data() + 4);
    return "\x89PNG\r\n\x1a\n" + chunk("IHDR" + size + QByteArray("\1\0\0\0\0", 5)) + chunk("IDAT" + packed)
        + chunk("IEND");
}

QByteArray image(const QByteArray &reference)
{
    return "<image width=\"8\" height=\"8\" xlink:href=\"" + reference + "\"/>";
}

QByteArray drawing(const QByteArray &contents)
{
    return Start + contents + "</svg>";
}

QByteArray embedded(const QByteArray &bytes)
{
    return "data:image/png;base64," + bytes.toBase64();
}

QByteArray number(quint32 value, int bytes)
{
    QByteArray result;
    for (; bytes > 0; --bytes, value >>= 8)
        result.append(char(value & 0xff));
    return result;
}

/// An icon for Windows whose directory tells that \a edge (0 for 256), whatever the picture has.
QByteArray windowsIcon(const QByteArray &picture, char edge = 32)
{
    return number(0, 2) + number(1, 2) + number(1, 2) + QByteArray(2, edge) + QByteArray("\0\0\1\0\x20\0", 6)
        + number(quint32(picture.size()), 4) + number(22, 4) + picture;
}

QByteArray bitmap(quint32 width, quint32 height)
{
    return number(40, 4) + number(width, 4) + number(2 * height, 4) + number(1, 2) + number(32, 2)
        + QByteArray(24, '\0') + QByteArray(256 * 1024, '\x40');
}

QByteArray animation(quint32 edge, int frames)
{
    QByteArray bytes = "GIF89a" + number(edge, 2) + number(edge, 2) + QByteArray("\x80\0\0", 3)
        + "\xff\xff\xff" + QByteArray(3, '\0');
    for (int i = 0; i < frames; ++i)
        bytes += QByteArray("\x2c\0\0\0\0\1\0\1\0\0\2\2\x44\1\0", 15);
    return bytes + ';';
}

void compress(const QString &path, const QByteArray &bytes, int times = 1)
{
    const gzFile file = gzopen(QFile::encodeName(path).constData(), "wb9");
    for (int i = 0; i < times; ++i)
        QCOMPARE(gzwrite(file, bytes.constData(), unsigned(bytes.size())), bytes.size());
    QCOMPARE(gzclose(file), Z_OK);
}

} // namespace

/// Pictures that cost whoever reads them too much, or lead them elsewhere.
class tst_VelIconHostile : public IconTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void takesTheFallbackForTooLargeAPicture_data();
    void takesTheFallbackForTooLargeAPicture();
    void takesTheFallbackForACompressedDrawing();
    void readsNoFileThatADrawingNames_data();
    void readsNoFileThatADrawingNames();
    void waitsForNoFileThatADrawingNames_data();
    void waitsForNoFileThatADrawingNames();
    void showsWhatIsLargeButNotTooLarge_data();
    void showsWhatIsLargeButNotTooLarge();
    void aNameLeadsNowhereOutsideTheTheme();
    void takesTheFallbackForATruncatedPicture();
    void takesTheFallbackForATruncatedPictureOfTheTheme();
    void takesTheFallbackForTooLargeAFileOfTheTheme_data();
    void takesTheFallbackForTooLargeAFileOfTheTheme();
    void takesTheFallbackForTooLargeAFileOfNoTheme();
    void takesTheFallbackForAPipeInTheTheme();
    void takesNoMemoryForAPictureOfTheTheme();

private:
    static QString inTheme(int size, const QString &file)
    {
        return QStringLiteral("icons/first/%1/%2").arg(QString::number(size), file);
    }
    QColor shown(const QString &name)
    {
        return painted(VelIcon::fromTheme(name, Emblems(), plainIcon(Qt::yellow)), 22).pixelColor(11, 11);
    }
};

void tst_VelIconHostile::takesTheFallbackForTooLargeAPicture_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("bytes");
    const auto row = [](const char *name, const QByteArray &bytes) {
        QTest::newRow(name) << QString::fromLatin1(name) << bytes;
    };
    const QByteArray large = picture(4096, 4096);
    row("wide.png", picture(4097, 8));
    row("high.png", picture(8, 4097));
    row("wide.bmp", picture(4097, 8, "bmp"));
    row("wide.xpm", picture(4097, 8, "xpm"));
    row("wide, without a suffix", picture(4097, 8));
    row("wide, another suffix.svg.jpeg", picture(4097, 8));
    row("many.gif", animation(4096, 2));
    row("wide.gif", animation(4097, 1));
    row("animation in a drawing.svg", drawing(image(embedded(animation(4096, 2)))));
    row("picture.ico", windowsIcon(picture(4097, 8)));
    row("bitmap.ico", windowsIcon(bitmap(4097, 8), 0));
    row("large.svg", drawing(image(embedded(picture(4097, 8)))));
    row("many.svg", drawing(image(embedded(large)) + image(embedded(large))));
    row("drawing in a drawing.svg", drawing(image(embedded(drawing(image(embedded(large)))))));
    row("icon in a drawing.svg", drawing(image(embedded(windowsIcon(picture(4097, 8))))));
    row("entity.svg",
        "<!DOCTYPE svg [<!ENTITY a \"" + embedded(picture(4097, 8)) + "\">]>" + drawing(image("&a;")));
    row("drawing.png", drawing(image(embedded(picture(4097, 8)))));
    row("wide drawing.png", "<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"9999\" height=\"9\"/>");
    row("drawing without a suffix", drawing(image(embedded(picture(4097, 8)))));
}

void tst_VelIconHostile::takesTheFallbackForTooLargeAPicture()
{
    QFETCH(QString, name);
    QFETCH(QByteArray, bytes);
    QCOMPARE(shown(write(name, bytes)), QColor(Qt::yellow));
}

void tst_VelIconHostile::takesTheFallbackForACompressedDrawing()
{
    const QString large = path(QStringLiteral("large.svgz"));
    compress(large, drawing(image(embedded(picture(4097, 8)))));
    QCOMPARE(shown(large), QColor(Qt::yellow));

    // A few kilobytes that are many megabytes.
    const QString blown = path(QStringLiteral("blown.svgz"));
    compress(blown, Start + QByteArray(1024 * 1024, ' '), 20);
    QVERIFY(QFileInfo(blown).size() < 64 * 1024);
    QCOMPARE(shown(blown), QColor(Qt::yellow));

    const QString plain = path(QStringLiteral("plain.svgz"));
    compress(plain, drawing(QByteArray()));
    QCOMPARE(shown(plain), QColor(Qt::magenta));
}

void tst_VelIconHostile::readsNoFileThatADrawingNames_data()
{
    QTest::addColumn<QByteArray>("contents"); // "~" for the folder
    QTest::newRow("beside it") << drawing(image("other.png"));
    QTest::newRow("by its path") << drawing(image("~/other.png"));
    QTest::newRow("behind blanks") << drawing(image(" ~/other.png"));
    QTest::newRow("no data") << drawing(image("data.png"));
    QTest::newRow("a style sheet")
        << "<?xml version=\"1.0\"?><?xml-stylesheet type=\"text/css\" href=\"~/style.css\"?>"
            + drawing(QByteArray());
}

void tst_VelIconHostile::readsNoFileThatADrawingNames()
{
    QFETCH(QByteArray, contents);
    for (const char *name : {"other.png", "data.png"})
        write(QLatin1String(name), picture(16, 16));
    write(QStringLiteral("style.css"), "rect { fill: #0ff; }");
    contents.replace('~', QFile::encodeName(folder()));
    QCOMPARE(shown(write(QStringLiteral("a.svg"), contents)), QColor(Qt::yellow));
}

void tst_VelIconHostile::waitsForNoFileThatADrawingNames_data()
{
    readsNoFileThatADrawingNames_data();
}

void tst_VelIconHostile::waitsForNoFileThatADrawingNames()
{
    QFETCH(QByteArray, contents);
    for (const char *name : {"other.png", "data.png", "style.css"})
        QCOMPARE(::mkfifo(QFile::encodeName(path(QLatin1String(name))).constData(), 0600), 0);
    contents.replace('~', QFile::encodeName(folder()));
    QCOMPARE(shown(write(QStringLiteral("a.svg"), contents)), QColor(Qt::yellow));
}

void tst_VelIconHostile::showsWhatIsLargeButNotTooLarge_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("bytes");
    const auto row = [](const char *name, const QByteArray &bytes) {
        QTest::newRow(name) << QString::fromLatin1(name) << bytes;
    };
    row("large.png", picture(4096, 4096));
    row("without a suffix", picture(64, 64));
    row("small.ico", windowsIcon(picture(64, 64)));
    row("saved.ico", picture(64, 64, "ico"));
    row("embedded.svg",
        "<svg xmlns=\"http://www.w3.org/2000/svg\" xmlns:xlink=\"http://www.w3.org/1999/xlink\" width=\"8\" "
        "height=\"8\">"
            + image(embedded(picture(4096, 8))) + "</svg>");
    row("undeclared.svg", drawing("<editor:note editor:x=\"y\"/>"));
    row("drawing without a suffix", drawing(QByteArray()));
}

void tst_VelIconHostile::showsWhatIsLargeButNotTooLarge()
{
    QFETCH(QString, name);
    QFETCH(QByteArray, bytes);
    QCOMPARE(shown(write(name, bytes)), QColor(Qt::magenta));
}

void tst_VelIconHostile::aNameLeadsNowhereOutsideTheTheme()
{
    write(QStringLiteral("outside.png"), picture(16, 16));
    for (const char *name : {"../../../outside", "../../../outside.png", "../16x16/red", "./red"})
        QCOMPARE(shown(QLatin1String(name)), QColor(Qt::yellow));
}

void tst_VelIconHostile::takesTheFallbackForATruncatedPicture()
{
    QByteArray bytes = picture(640, 640);
    bytes.chop(20);
    QCOMPARE(shown(write(QStringLiteral("cut.png"), bytes)), QColor(Qt::yellow));
}

void tst_VelIconHostile::takesTheFallbackForATruncatedPictureOfTheTheme()
{
    m_theme->add(QStringLiteral("cut"), Qt::red);
    QDirIterator files(path(QStringLiteral("icons")), {QStringLiteral("cut.png")}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (files.hasNext()) {
        QFile file(files.next());
        QVERIFY(file.resize(file.size() - 20));
    }
    const QIcon icon = VelIcon::fromTheme(QStringLiteral("cut"), Emblems(), plainIcon(Qt::yellow));
    QCOMPARE(painted(icon, 22).pixelColor(11, 11), QColor(Qt::yellow));
    QCOMPARE(icon.pixmap(22).toImage().pixelColor(11, 11), QColor(Qt::yellow));
}

void tst_VelIconHostile::takesTheFallbackForTooLargeAFileOfTheTheme_data()
{
    QTest::addColumn<QString>("suffix");
    QTest::addColumn<QByteArray>("bytes");
    const auto row = [](const char *name, const char *suffix, const QByteArray &bytes) {
        QTest::newRow(name) << QString::fromLatin1(suffix) << bytes;
    };
    row("wide picture", ".png", picture(4097, 4096));
    row("high picture", ".png", picture(4096, 4097));
    row("picture of another kind", ".png", picture(4097, 4096, "bmp"));
    row("drawing with a picture", ".svg", drawing(image(embedded(picture(4097, 8)))));
    row("picture in another encoding", ".svg",
        "<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?>" + drawing(image(embedded(picture(4097, 8)))));
    row("entity in a drawing", ".svg",
        "<!DOCTYPE svg [<!ENTITY a \"" + embedded(picture(4097, 8)) + "\">]>" + drawing(image("&a;")));
    row("drawing with the name of a picture", ".png", drawing(image(embedded(picture(4097, 8)))));
}

void tst_VelIconHostile::takesTheFallbackForTooLargeAFileOfTheTheme()
{
    QFETCH(QString, suffix);
    QFETCH(QByteArray, bytes);
    const QString name = QStringLiteral("large");
    m_theme->add(name, Qt::red, 32);
    write(inTheme(22, name + suffix), bytes);
    const QIcon icon = VelIcon::fromTheme(name, Emblems(), plainIcon(Qt::yellow));
    QCOMPARE(painted(icon, 22).pixelColor(11, 11), QColor(Qt::yellow));
    QCOMPARE(icon.pixmap(22).toImage().pixelColor(11, 11), QColor(Qt::yellow));
    // The other file is as good as any.
    QCOMPARE(painted(icon, 32).pixelColor(11, 11), QColor(Qt::red));
}

void tst_VelIconHostile::takesTheFallbackForTooLargeAFileOfNoTheme()
{
    write(QStringLiteral("pixmaps/large.png"), picture(4097, 8));
    write(QStringLiteral("pixmaps/small.png"), picture(64, 64));
    const QStringList before = QIcon::fallbackSearchPaths();
    QIcon::setFallbackSearchPaths({path(QStringLiteral("pixmaps"))});
    const QColor large = shown(QStringLiteral("large"));
    const QColor small = shown(QStringLiteral("small"));
    QIcon::setFallbackSearchPaths(before);
    QCOMPARE(large, QColor(Qt::yellow));
    QCOMPARE(small, QColor(Qt::magenta));
}

// Whoever opens it would wait for ever.
void tst_VelIconHostile::takesTheFallbackForAPipeInTheTheme()
{
    for (const char *name : {"one.png", "two.svg"})
        QCOMPARE(::mkfifo(QFile::encodeName(path(inTheme(22, QLatin1String(name)))).constData(), 0600), 0);
    QCOMPARE(shown(QStringLiteral("one")), QColor(Qt::yellow));
    QCOMPARE(shown(QStringLiteral("two")), QColor(Qt::yellow));
}

void tst_VelIconHostile::takesNoMemoryForAPictureOfTheTheme()
{
    m_theme->add(QStringLiteral("huge"), Qt::red, 32);
    write(inTheme(22, QStringLiteral("huge.png")), hugePicture(30000));
    rusage before = {};
    rusage after = {};
    getrusage(RUSAGE_SELF, &before);
    QCOMPARE(shown(QStringLiteral("huge")), QColor(Qt::yellow));
    getrusage(RUSAGE_SELF, &after);
    QVERIFY2(after.ru_maxrss - before.ru_maxrss < 50 * 1024, // in KiB
             qPrintable(QString::number(after.ru_maxrss - before.ru_maxrss)));
}

VEL_TEST_MAIN(tst_VelIconHostile)
#include "tst_VelIconHostile.moc"
