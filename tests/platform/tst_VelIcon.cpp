// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconTestCase.h"

#include <QImage>
#include <QPixmapCache>

#include <sys/stat.h>

/// Icons by a name, a file or a fallback.
class tst_VelIcon : public IconTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void showsTheIconOfThatName_data();
    void showsTheIconOfThatName();
    void prefersTheNameWithoutItsPictureSuffix();
    void showsThePictureFileOfThatPath();
    void takesTheFallbackForWhatIsNoPicture_data();
    void takesTheFallbackForWhatIsNoPicture();
    void isNullOnlyWithoutAnyPicture_data();
    void isNullOnlyWithoutAnyPicture();
    void sharesWhatIsMadeOfTheSameParts();
    void tellsApartWhatIsMadeOfOtherParts();
    void livesWithoutTheCacheOfPixmaps();
    void tellsItsSizesAndItsName();
    void staysAnIconWhenItIsCopiedAndDetached();
};

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

VEL_TEST_MAIN(tst_VelIcon)
#include "tst_VelIcon.moc"
