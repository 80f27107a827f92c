// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconThemeFolder.h"
#include "TestCase.h"

#include <veluiaux/VelIcon.h>

#include <QDateTime>
#include <QImage>
#include <QPainter>
#include <QPalette>
#include <QPixmapCache>

#include <memory>

#include <sys/stat.h>

using Emblems = QMap<Qt::Corner, QString>;

class tst_VelIcon : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void showsTheIconOfThatName_data();
    void showsTheIconOfThatName();
    void prefersTheNameWithoutItsPictureSuffix();
    void showsThePictureFileOfThatPath();
    void takesTheFallbackForWhatIsNoPicture_data();
    void takesTheFallbackForWhatIsNoPicture();
    void isNullOnlyWithoutAnyPicture_data();
    void isNullOnlyWithoutAnyPicture();
    void laysEmblemsIntoTheirCorners_data();
    void laysEmblemsIntoTheirCorners();
    void laysAnEmblemIntoEveryCorner();
    void laysTheSingleEmblemIntoItsCorner();
    void laysEmblemsOnTheFallback();
    void laysEmblemsOnAGivenIcon();
    void givesTheIconItselfWithoutEmblems();
    void leavesAnEmblemOutThatTheThemeLacks();
    void greysEmblemsOutWithTheirIcon();
    void followsAChangeOfThePalette();
    void looksTheThemeUpWhenItIsPainted_data();
    void looksTheThemeUpWhenItIsPainted();
    void followsAChangeOfTheTheme();
    void showsAPictureFileAsItIsNow();
    void sharesWhatIsMadeOfTheSameParts();
    void tellsApartWhatIsMadeOfOtherParts();
    void livesWithoutTheCacheOfPixmaps();
    void tellsItsSizesAndItsName();
    void staysAnIconWhenItIsCopiedAndDetached();
    void centresASmallerPicture();
    void drawsForThePixelRatioOfTheDevice_data();
    void drawsForThePixelRatioOfTheDevice();
    void scalesUpForADeviceOfMorePixels();
    void paintsAsQtDoes_data();
    void paintsAsQtDoes();

private:
    static QIcon themeIcon(const QString &name) { return VelIcon::fromTheme(name, Emblems(), QIcon()); }
    static QImage painted(const QIcon &icon, int size, qreal ratio = 1,
                          Qt::LayoutDirection direction = Qt::LeftToRight);
    static QIcon plainIcon(const QColor &color);
    /// The size of what is not white.
    static QSize extent(const QImage &image);

    std::unique_ptr<IconThemeFolder> m_theme;
};

void tst_VelIcon::init()
{
    TestCase::init();
    m_theme = std::make_unique<IconThemeFolder>(folder() + QStringLiteral("/icons"), QStringLiteral("first"));
    m_theme->write();
    m_theme->add(QStringLiteral("red"), Qt::red);
    m_theme->add(QStringLiteral("emblem-blue"), Qt::blue);
    m_theme->add(QStringLiteral("emblem-green"), Qt::green);
    m_theme->use();
}

QImage tst_VelIcon::painted(const QIcon &icon, int size, qreal ratio, Qt::LayoutDirection direction)
{
    QImage image(qRound(size * ratio), qRound(size * ratio), QImage::Format_ARGB32_Premultiplied);
    image.setDevicePixelRatio(ratio);
    image.fill(Qt::white);
    QPainter painter(&image);
    painter.setLayoutDirection(direction);
    icon.paint(&painter, QRect(0, 0, size, size));
    return image;
}

QSize tst_VelIcon::extent(const QImage &image)
{
    QRect painted;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixelColor(x, y) != QColor(Qt::white))
                painted |= QRect(x, y, 1, 1);
        }
    }
    return painted.size();
}

QIcon tst_VelIcon::plainIcon(const QColor &color)
{
    QPixmap pixmap(32, 32);
    pixmap.fill(color);
    return QIcon(pixmap);
}

void tst_VelIcon::showsTheIconOfThatName_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"red", "red.png", "red.svg", "red.svgz", "red.xpm", "red.PNG", "red-and-more"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_VelIcon::showsTheIconOfThatName()
{
    QFETCH(QString, name);
    const QIcon icon = VelIcon::fromTheme(name, Emblems(), plainIcon(Qt::yellow));
    QVERIFY(!icon.isNull());
    for (const int size : {16, 22, 32}) {
        QImage expected(size, size, QImage::Format_ARGB32_Premultiplied);
        expected.fill(Qt::red);
        QCOMPARE(painted(icon, size), expected);
        QCOMPARE(icon.pixmap(size).toImage().convertToFormat(expected.format()), expected);
    }
}

void tst_VelIcon::prefersTheNameWithoutItsPictureSuffix()
{
    m_theme->add(QStringLiteral("red-app"), Qt::cyan);
    QCOMPARE(painted(themeIcon(QStringLiteral("red-app.png")), 16).pixelColor(8, 8), QColor(Qt::cyan));
}

void tst_VelIcon::showsThePictureFileOfThatPath()
{
    const QString path = this->path(QStringLiteral("a picture.png"));
    QVERIFY(plainIcon(Qt::magenta).pixmap(32).save(path));
    const QIcon icon = VelIcon::fromTheme(path, Emblems(), plainIcon(Qt::yellow));
    QCOMPARE(painted(icon, 22).pixelColor(11, 11), QColor(Qt::magenta));
    QVERIFY(icon.name().isEmpty());

    const QString drawing = write(QStringLiteral("drawing.svg"),
                                  "<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"8\" height=\"8\">"
                                  "<rect width=\"8\" height=\"8\" fill=\"#f0f\"/></svg>");
    QCOMPARE(painted(themeIcon(drawing), 48).pixelColor(40, 40), QColor(Qt::magenta));
}

void tst_VelIcon::takesTheFallbackForWhatIsNoPicture_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"", "missing", "missing.png", ".png", "/nowhere/a.png", "%1/garbage.png",
                             "%1/empty.png", "%1/garbage.svg", "%1", "%1/pipe.png", "icons/first/16/red.png"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_VelIcon::takesTheFallbackForWhatIsNoPicture()
{
    QFETCH(QString, name);
    name.replace(QStringLiteral("%1"), folder());
    write(QStringLiteral("garbage.png"), "no picture");
    write(QStringLiteral("empty.png"), "");
    write(QStringLiteral("garbage.svg"), "no picture");
    QCOMPARE(::mkfifo(QFile::encodeName(path(QStringLiteral("pipe.png"))).constData(), 0600), 0);
    if (name.endsWith(QStringLiteral("garbage.svg"))) {
        for (int time = 0; time < 2; ++time)
            expectWarning(QRegularExpression(QStringLiteral("Cannot read file .*garbage.svg")));
    }

    const QIcon icon = VelIcon::fromTheme(name, Emblems(), plainIcon(Qt::yellow));
    QVERIFY(!icon.isNull());
    QCOMPARE(painted(icon, 22).pixelColor(11, 11), QColor(Qt::yellow));
}

void tst_VelIcon::isNullOnlyWithoutAnyPicture_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("withFallback");
    QTest::addColumn<bool>("isNull");
    QTest::newRow("known") << QStringLiteral("red") << false << false;
    QTest::newRow("known, fallback") << QStringLiteral("red") << true << false;
    QTest::newRow("unknown") << QStringLiteral("missing") << false << true;
    QTest::newRow("unknown, fallback") << QStringLiteral("missing") << true << false;
    QTest::newRow("no name") << QString() << false << true;
    QTest::newRow("no file") << QStringLiteral("/nowhere/a.png") << false << true;
    QTest::newRow("file") << QStringLiteral("%1/icons/first/16/red.png") << false << false;
}

void tst_VelIcon::isNullOnlyWithoutAnyPicture()
{
    QFETCH(QString, name);
    QFETCH(bool, withFallback);
    QFETCH(bool, isNull);
    name.replace(QStringLiteral("%1"), folder());
    const QIcon fallback = withFallback ? plainIcon(Qt::yellow) : QIcon();
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    for (const QIcon &icon :
         {VelIcon::fromTheme(name, Emblems(), fallback), VelIcon::fromTheme(name, emblems, fallback),
          VelIcon::withEmblems(VelIcon::fromTheme(name, Emblems(), fallback), emblems)}) {
        QCOMPARE(icon.isNull(), isNull);
        QCOMPARE(icon.isNull(), isNull); // what is remembered is the same
        QCOMPARE(icon.pixmap(16).isNull(), isNull);
        QCOMPARE(icon.availableSizes().isEmpty(), isNull);
    }
}

void tst_VelIcon::laysEmblemsIntoTheirCorners_data()
{
    QTest::addColumn<Qt::Corner>("corner");
    QTest::addColumn<int>("size");
    QTest::addColumn<qreal>("ratio");
    QTest::addColumn<Qt::LayoutDirection>("direction");
    for (const Qt::Corner corner :
         {Qt::TopLeftCorner, Qt::TopRightCorner, Qt::BottomLeftCorner, Qt::BottomRightCorner}) {
        for (const int size : {16, 22, 32}) {
            for (const qreal ratio : {1.0, 2.0}) {
                for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
                    QTest::addRow("corner %d, %d pixels, ratio %g, direction %d", corner, size, ratio,
                                  direction)
                        << corner << size << ratio << direction;
                }
            }
        }
    }
}

void tst_VelIcon::laysEmblemsIntoTheirCorners()
{
    QFETCH(Qt::Corner, corner);
    QFETCH(int, size);
    QFETCH(qreal, ratio);
    QFETCH(Qt::LayoutDirection, direction);
    const IconThemeFolder large(folder() + QStringLiteral("/icons"), QStringLiteral("large"),
                                {8, 16, 22, 32, 44, 64});
    large.write();
    large.add(QStringLiteral("red"), Qt::red);
    large.add(QStringLiteral("emblem-blue"), Qt::blue);
    large.use();

    QGuiApplication::setLayoutDirection(direction);
    const QIcon icon =
        VelIcon::fromTheme(QStringLiteral("red"), Emblems{{corner, QStringLiteral("emblem-blue")}}, QIcon());
    const QImage image = painted(icon, size, ratio, direction);
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);

    const int edge = int((size == 32 ? 16 : 8) * ratio);
    const int away = image.width() - edge;
    const bool right = corner == Qt::TopRightCorner || corner == Qt::BottomRightCorner;
    const bool bottom = corner == Qt::BottomLeftCorner || corner == Qt::BottomRightCorner;
    const QRect square(right ? away : 0, bottom ? away : 0, edge, edge);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QColor expected = square.contains(x, y) ? Qt::blue : Qt::red;
            if (image.pixelColor(x, y) != expected)
                QFAIL(qPrintable(QStringLiteral("wrong colour at %1, %2").arg(x).arg(y)));
        }
    }
}

void tst_VelIcon::laysAnEmblemIntoEveryCorner()
{
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")},
                          {Qt::TopRightCorner, QStringLiteral("emblem-green")},
                          {Qt::BottomLeftCorner, QStringLiteral("emblem-green")},
                          {Qt::BottomRightCorner, QStringLiteral("emblem-blue")}};
    const QImage image = painted(VelIcon::fromTheme(QStringLiteral("red"), emblems, QIcon()), 22);
    QCOMPARE(image.pixelColor(0, 0), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(21, 0), QColor(Qt::green));
    QCOMPARE(image.pixelColor(0, 21), QColor(Qt::green));
    QCOMPARE(image.pixelColor(21, 21), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(11, 11), QColor(Qt::red));
}

void tst_VelIcon::laysTheSingleEmblemIntoItsCorner()
{
    const QIcon icon = VelIcon::fromTheme(
        QStringLiteral("red"), qMakePair(Qt::TopRightCorner, QStringLiteral("emblem-blue")), QIcon());
    const QImage image = painted(icon, 16);
    QCOMPARE(image.pixelColor(15, 0), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(8, 7), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(7, 8), QColor(Qt::red));
    QCOMPARE(image.pixelColor(0, 0), QColor(Qt::red));
}

void tst_VelIcon::laysEmblemsOnTheFallback()
{
    const Emblems emblems{{Qt::BottomLeftCorner, QStringLiteral("emblem-blue")}};
    const QImage image =
        painted(VelIcon::fromTheme(QStringLiteral("missing"), emblems, plainIcon(Qt::yellow)), 16);
    QCOMPARE(image.pixelColor(0, 15), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(15, 0), QColor(Qt::yellow));
}

void tst_VelIcon::laysEmblemsOnAGivenIcon()
{
    const QIcon given = plainIcon(Qt::yellow);
    const QIcon icon =
        VelIcon::withEmblems(given, Emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}});
    QCOMPARE(painted(icon, 32).pixelColor(0, 0), QColor(Qt::blue));
    QCOMPARE(painted(icon, 32).pixelColor(16, 16), QColor(Qt::yellow));
    QCOMPARE(painted(given, 32).pixelColor(0, 0), QColor(Qt::yellow));
    QVERIFY(
        VelIcon::withEmblems(QIcon(), Emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}}).isNull());
}

void tst_VelIcon::givesTheIconItselfWithoutEmblems()
{
    const QIcon given = plainIcon(Qt::yellow);
    QCOMPARE(VelIcon::withEmblems(given, Emblems()).cacheKey(), given.cacheKey());
    QCOMPARE(VelIcon::withEmblems(QIcon(), Emblems()).cacheKey(), QIcon().cacheKey());
}

void tst_VelIcon::leavesAnEmblemOutThatTheThemeLacks()
{
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-missing")},
                          {Qt::BottomRightCorner, QStringLiteral("emblem-blue")}};
    const QImage image = painted(VelIcon::fromTheme(QStringLiteral("red"), emblems, QIcon()), 16);
    QCOMPARE(image.pixelColor(0, 0), QColor(Qt::red));
    QCOMPARE(image.pixelColor(15, 15), QColor(Qt::blue));
}

void tst_VelIcon::greysEmblemsOutWithTheirIcon()
{
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const QImage image =
        VelIcon::fromTheme(QStringLiteral("red"), emblems, QIcon()).pixmap(16, QIcon::Disabled).toImage();
    QVERIFY(image.pixelColor(0, 0) != QColor(Qt::blue));
    QVERIFY(image.pixelColor(15, 15) != QColor(Qt::red));
    QCOMPARE(image.pixelColor(0, 0),
             themeIcon(QStringLiteral("emblem-blue")).pixmap(8, QIcon::Disabled).toImage().pixelColor(0, 0));
}

void tst_VelIcon::followsAChangeOfThePalette()
{
    const QPalette before = QGuiApplication::palette();
    QVector<QColor> colors;
    for (const Qt::GlobalColor highlight : {Qt::black, Qt::white}) {
        QPalette palette = before;
        palette.setColor(QPalette::Highlight, highlight);
        QApplication::setPalette(palette);
        const auto color = [](const QIcon &icon) {
            return icon.pixmap(16, QIcon::Selected).toImage().pixelColor(8, 8);
        };
        colors.append(color(themeIcon(QStringLiteral("red"))));
        QCOMPARE(colors.last(), color(QIcon::fromTheme(QStringLiteral("red"))));
    }
    QApplication::setPalette(before);
    QVERIFY(colors.first() != colors.last());
}

void tst_VelIcon::looksTheThemeUpWhenItIsPainted_data()
{
    QTest::addColumn<bool>("asFile");
    QTest::newRow("theme") << false;
    QTest::newRow("file") << true;
}

void tst_VelIcon::looksTheThemeUpWhenItIsPainted()
{
    QFETCH(bool, asFile);
    // Nothing of this theme is there yet; whoever looked now would remember that.
    const IconThemeFolder late(folder() + QStringLiteral("/icons"), QStringLiteral("late"));
    late.use();
    const QString name =
        asFile ? folder() + QStringLiteral("/icons/late/16/green.png") : QStringLiteral("green");
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-late")}};
    const QIcon icon = VelIcon::fromTheme(name, emblems, plainIcon(Qt::yellow));
    const QIcon more = VelIcon::withEmblems(icon, {{Qt::BottomRightCorner, QStringLiteral("emblem-late")}});
    const QIcon copy = icon;

    late.write();
    late.add(QStringLiteral("green"), Qt::green);
    late.add(QStringLiteral("emblem-late"), Qt::blue);
    QCOMPARE(painted(copy, 16).pixelColor(15, 15), QColor(Qt::green));
    QCOMPARE(painted(more, 16).pixelColor(15, 15), QColor(Qt::blue));
    QCOMPARE(painted(more, 16).pixelColor(0, 0), QColor(Qt::blue));
    QCOMPARE(painted(more, 16).pixelColor(0, 15), QColor(Qt::green));
}

void tst_VelIcon::followsAChangeOfTheTheme()
{
    const QString searchPath = folder() + QStringLiteral("/icons");
    const IconThemeFolder second(searchPath, QStringLiteral("second"));
    second.write();
    second.add(QStringLiteral("red"), Qt::darkRed);
    second.add(QStringLiteral("other"), Qt::cyan);
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const QIcon icon = VelIcon::fromTheme(QStringLiteral("red"), emblems, QIcon());
    const QIcon other = themeIcon(QStringLiteral("other"));
    QCOMPARE(painted(icon, 16).pixelColor(15, 15), QColor(Qt::red));
    QVERIFY(other.isNull());

    QIcon::setThemeName(QStringLiteral("second"));
    QCOMPARE(painted(icon, 16).pixelColor(15, 15), QColor(Qt::darkRed));
    QCOMPARE(painted(icon, 16).pixelColor(0, 0), QColor(Qt::darkRed));
    QVERIFY(!other.isNull());
    QCOMPARE(painted(other, 16).pixelColor(0, 0), QColor(Qt::cyan));

    QIcon::setThemeName(QStringLiteral("first"));
    QCOMPARE(painted(icon, 16).pixelColor(0, 0), QColor(Qt::blue));
    QVERIFY(other.isNull());
    QIcon::setThemeSearchPaths({path(QStringLiteral("nothing"))});
    QVERIFY(icon.isNull());
    QIcon::setFallbackSearchPaths({searchPath + QStringLiteral("/second/16")});
    QVERIFY(!other.isNull());
    QIcon::setFallbackSearchPaths({});
}

void tst_VelIcon::showsAPictureFileAsItIsNow()
{
    const QString path = this->path(QStringLiteral("a.png"));
    QVERIFY(plainIcon(Qt::magenta).pixmap(32).save(path));
    QCOMPARE(painted(themeIcon(path), 16).pixelColor(0, 0), QColor(Qt::magenta));

    QVERIFY(plainIcon(Qt::cyan).pixmap(32).save(path));
    QFile file(path); // times of files may be coarse
    const QDateTime later = QDateTime::currentDateTime().addSecs(7);
    const auto setTime = [&file, &later] {
        return file.open(QIODevice::ReadWrite) && file.setFileTime(later, QFileDevice::FileModificationTime);
    };
    QVERIFY(setTime());
    file.close();
    QCOMPARE(painted(themeIcon(path), 16).pixelColor(0, 0), QColor(Qt::cyan));

    QVERIFY(plainIcon(Qt::green).pixmap(32).scaled(300, 300).save(path));
    QVERIFY(setTime());
    file.close();
    QCOMPARE(painted(themeIcon(path), 16).pixelColor(0, 0), QColor(Qt::green));
    QVERIFY(QFile::remove(path));
    QVERIFY(themeIcon(path).isNull());
}

void tst_VelIcon::sharesWhatIsMadeOfTheSameParts()
{
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const QIcon fallback = plainIcon(Qt::yellow);
    const QPixmap first = VelIcon::fromTheme(QStringLiteral("red"), emblems, fallback).pixmap(16);
    const QPixmap second = VelIcon::fromTheme(QStringLiteral("red"), emblems, fallback).pixmap(16);
    QCOMPARE(first.cacheKey(), second.cacheKey());
}

void tst_VelIcon::tellsApartWhatIsMadeOfOtherParts()
{
    const QIcon fallback = plainIcon(Qt::yellow);
    const auto color = [&fallback](const QString &name, const Emblems &emblems, const QIcon &other,
                                   QIcon::Mode mode) {
        return VelIcon::fromTheme(name, emblems, other).pixmap(16, mode).toImage().pixelColor(0, 0);
    };
    const QString red = QStringLiteral("red");
    const QString missing = QStringLiteral("missing");
    const Emblems blue{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const Emblems green{{Qt::TopLeftCorner, QStringLiteral("emblem-green")}};
    const Emblems away{{Qt::TopRightCorner, QStringLiteral("emblem-blue")}};
    for (int round = 0; round < 2; ++round) {
        QCOMPARE(color(red, Emblems(), fallback, QIcon::Normal), QColor(Qt::red));
        QCOMPARE(color(red, blue, fallback, QIcon::Normal), QColor(Qt::blue));
        QCOMPARE(color(red, green, fallback, QIcon::Normal), QColor(Qt::green));
        QCOMPARE(color(red, away, fallback, QIcon::Normal), QColor(Qt::red));
        QVERIFY(color(red, Emblems(), fallback, QIcon::Disabled) != QColor(Qt::red));
        QCOMPARE(color(missing, Emblems(), fallback, QIcon::Normal), QColor(Qt::yellow));
        QCOMPARE(color(missing, Emblems(), plainIcon(Qt::cyan), QIcon::Normal), QColor(Qt::cyan));
    }
}

void tst_VelIcon::livesWithoutTheCacheOfPixmaps()
{
    const int limit = QPixmapCache::cacheLimit();
    QPixmapCache::setCacheLimit(0);
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const QImage image = painted(VelIcon::fromTheme(QStringLiteral("red"), emblems, QIcon()), 16);
    QPixmapCache::setCacheLimit(limit);
    QCOMPARE(image.pixelColor(0, 0), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(15, 15), QColor(Qt::red));
}

void tst_VelIcon::tellsItsSizesAndItsName()
{
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const QIcon icon = VelIcon::fromTheme(QStringLiteral("red.png"), emblems, QIcon());
    const QIcon qt = QIcon::fromTheme(QStringLiteral("red"));
    QCOMPARE(icon.name(), QStringLiteral("red"));
    QCOMPARE(icon.availableSizes(), qt.availableSizes());
    for (const int size : {4, 8, 16, 20, 22, 30, 32, 100}) {
        QCOMPARE(icon.actualSize(QSize(size, size)), qt.actualSize(QSize(size, size)));
        QCOMPARE(icon.actualSize(QSize(size, size)), qt.actualSize(QSize(size, size)));
        QCOMPARE(icon.pixmap(size).size(), qt.pixmap(size).size());
    }
    QVERIFY(VelIcon::fromTheme(QStringLiteral("missing"), emblems, plainIcon(Qt::yellow)).name().isEmpty());
    QCOMPARE(VelIcon::fromTheme(QStringLiteral("missing"), emblems, qt).name(), QStringLiteral("red"));
    QVERIFY(themeIcon(QStringLiteral("missing")).name().isEmpty());
    QVERIFY(icon.pixmap(0).isNull());
}

void tst_VelIcon::staysAnIconWhenItIsCopiedAndDetached()
{
    const QIcon icon = themeIcon(QStringLiteral("red"));
    QIcon copy = icon;
    copy.setIsMask(true); // detaches
    QVERIFY(copy.cacheKey() != icon.cacheKey());
    QCOMPARE(painted(copy, 16), painted(icon, 16));
    QCOMPARE(painted(copy, 16).pixelColor(0, 0), QColor(Qt::red));
}

void tst_VelIcon::centresASmallerPicture()
{
    QPixmap small(8, 8);
    small.fill(Qt::yellow);
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const QImage image = painted(VelIcon::fromTheme(QStringLiteral("missing"), emblems, QIcon(small)), 16);
    QCOMPARE(image.pixelColor(3, 3), QColor(Qt::white));
    QCOMPARE(image.pixelColor(4, 4), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(11, 11), QColor(Qt::yellow));
    QCOMPARE(image.pixelColor(12, 12), QColor(Qt::white));
}

void tst_VelIcon::drawsForThePixelRatioOfTheDevice_data()
{
    QTest::addColumn<qreal>("ratio");
    QTest::addColumn<QColor>("color");
    QTest::newRow("1") << 1.0 << QColor(Qt::red);
    QTest::newRow("1.5") << 1.5 << QColor(Qt::yellow);
    QTest::newRow("2") << 2.0 << QColor(Qt::cyan);
}

void tst_VelIcon::drawsForThePixelRatioOfTheDevice()
{
    QFETCH(qreal, ratio);
    QFETCH(QColor, color);
    const IconThemeFolder sizes(folder() + QStringLiteral("/icons"), QStringLiteral("sizes"), {16, 24, 32});
    sizes.write();
    sizes.add(QStringLiteral("by-size"), Qt::red, 16);
    sizes.add(QStringLiteral("by-size"), Qt::yellow, 24);
    sizes.add(QStringLiteral("by-size"), Qt::cyan, 32);
    sizes.use();
    const QImage image = painted(themeIcon(QStringLiteral("by-size")), 16, ratio);
    QImage expected(image.size(), image.format());
    expected.fill(color);
    expected.setDevicePixelRatio(ratio);
    QCOMPARE(image, expected);
}

void tst_VelIcon::scalesUpForADeviceOfMorePixels()
{
    // The theme has nothing larger than 32 pixels.
    const QImage large = painted(themeIcon(QStringLiteral("red")), 32, 2);
    QCOMPARE(large.pixelColor(0, 0), QColor(Qt::red));
    QCOMPARE(large.pixelColor(63, 63), QColor(Qt::red));

    QPixmap small(8, 8);
    small.fill(Qt::yellow);
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const QImage image = painted(VelIcon::withEmblems(QIcon(small), emblems), 16, 2);
    QCOMPARE(image.pixelColor(7, 7), QColor(Qt::white));
    QCOMPARE(image.pixelColor(8, 8), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(15, 15), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(16, 16), QColor(Qt::yellow));
    QCOMPARE(image.pixelColor(23, 23), QColor(Qt::yellow));
    QCOMPARE(image.pixelColor(24, 24), QColor(Qt::white));
}

void tst_VelIcon::paintsAsQtDoes_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name :
         {"folder", "text-plain", "system-file-manager", "user-trash", "applications-internet", "edit-copy"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_VelIcon::paintsAsQtDoes()
{
    QFETCH(QString, name);
    if (!QFile::exists(QStringLiteral("/usr/share/icons/breeze/index.theme")))
        QSKIP("the Breeze theme is not installed");
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
    const QIcon icon = themeIcon(name);
    const QIcon qt = QIcon::fromTheme(name);
    QVERIFY(!qt.isNull());
    for (const int size : {16, 22, 32, 48, 64}) {
        for (const auto mode : {QIcon::Normal, QIcon::Disabled, QIcon::Selected}) {
            QCOMPARE(icon.pixmap(size, mode).toImage(), qt.pixmap(size, mode).toImage());
            QCOMPARE(painted(icon, size), painted(qt, size));
        }
        // Breeze says of some pictures for this ratio that they are smaller than they are.
        const QSizeF twice = extent(painted(icon, size, 2));
        QVERIFY(twice.width() / extent(painted(icon, size)).width() > 1.4);
        QVERIFY(twice.height() / extent(painted(icon, size)).height() > 1.4);
    }
}

VEL_TEST_MAIN(tst_VelIcon)

#include "tst_VelIcon.moc"
