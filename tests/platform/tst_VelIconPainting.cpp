// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconTestCase.h"
#include "IconThemeFolder.h"

#include <QDateTime>
#include <QImage>
#include <QPalette>

/// When an icon is painted: what has changed until then, sizes and pixel ratios.
class tst_VelIconPainting : public IconTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void followsAChangeOfThePalette();
    void looksTheThemeUpWhenItIsPainted_data();
    void looksTheThemeUpWhenItIsPainted();
    void followsAChangeOfTheTheme();
    void showsAPictureFileAsItIsNow();
    void centersASmallerPixmap();
    void drawsForThePixelRatioOfTheDevice_data();
    void drawsForThePixelRatioOfTheDevice();
    void scalesUpForADeviceOfMorePixels();
    void paintsAsQtDoes_data();
    void paintsAsQtDoes();

private:
    /// The size of what is not white.
    static QSize extent(const QImage &image);
};

QSize tst_VelIconPainting::extent(const QImage &image)
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

void tst_VelIconPainting::followsAChangeOfThePalette()
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

void tst_VelIconPainting::looksTheThemeUpWhenItIsPainted_data()
{
    QTest::addColumn<bool>("asFile");
    QTest::newRow("theme") << false;
    QTest::newRow("file") << true;
}

void tst_VelIconPainting::looksTheThemeUpWhenItIsPainted()
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

void tst_VelIconPainting::followsAChangeOfTheTheme()
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

void tst_VelIconPainting::showsAPictureFileAsItIsNow()
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

void tst_VelIconPainting::centersASmallerPixmap()
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

void tst_VelIconPainting::drawsForThePixelRatioOfTheDevice_data()
{
    QTest::addColumn<qreal>("ratio");
    QTest::addColumn<QColor>("color");
    QTest::newRow("1") << 1.0 << QColor(Qt::red);
    QTest::newRow("1.5") << 1.5 << QColor(Qt::yellow);
    QTest::newRow("2") << 2.0 << QColor(Qt::cyan);
}

void tst_VelIconPainting::drawsForThePixelRatioOfTheDevice()
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

void tst_VelIconPainting::scalesUpForADeviceOfMorePixels()
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

void tst_VelIconPainting::paintsAsQtDoes_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name :
         {"folder", "text-plain", "system-file-manager", "user-trash", "applications-internet", "edit-copy"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_VelIconPainting::paintsAsQtDoes()
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

VEL_TEST_MAIN(tst_VelIconPainting)
#include "tst_VelIconPainting.moc"
