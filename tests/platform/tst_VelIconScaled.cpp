// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconPixels.h"
#include "IconThemeFolder.h"
#include "QtMajor.h"
#include "TestCase.h"

#include <veluiaux/VelIcon.h>

#include <QDir>
#include <QImage>
#include <QLoggingCategory>
#include <QPainter>

/// Icons in an application on a screen of two pixels for one, with AA_UseHighDpiPixmaps.
class tst_VelIconScaled : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void makesPixmapsForTheScreen();
    void laysEmblemsInTheirLogicalSize();
    void paintsOnADeviceOfAnotherRatio();
    void tellsTheSizesThatQtTells();
    void tellsTheSizesOfFilesForOtherRatios();
    void paintsTheFileThatQtPaints();
    void looksAtTheFileForTheScreen();
    void drawsEveryPixelAsQtDoes_data();
    void drawsEveryPixelAsQtDoes();

private:
    /// A theme of few sizes, some of them for two pixels for one, with the icons "far" and "twice".
    void makeOddSizes();
    static QImage painted(const QIcon &icon, int size, qreal ratio);
    QIcon icon() const
    {
        return VelIcon::fromTheme(QStringLiteral("by-size"),
                                  qMakePair(Qt::TopLeftCorner, QStringLiteral("emblem")), QIcon());
    }
};

void tst_VelIconScaled::init()
{
    TestCase::init();
    const IconThemeFolder theme(folder(), QStringLiteral("sizes"), {8, 16, 32});
    theme.write();
    theme.add(QStringLiteral("by-size"), Qt::red, 16);
    theme.add(QStringLiteral("by-size"), Qt::cyan, 32);
    theme.add(QStringLiteral("emblem"), Qt::blue);
    theme.use();
    QCOMPARE(qApp->devicePixelRatio(), 2.0);
}

void tst_VelIconScaled::makeOddSizes()
{
    write(QStringLiteral("odd/index.theme"),
          "[Icon Theme]\nName=Odd\n[8]\nSize=8\nType=Fixed\n[48]\nSize=48\nType=Fixed\n"
          "[16@2]\nSize=16\nScale=2\nType=Fixed\n[24]\nSize=24\nType=Threshold\n");
    int color = 0;
    for (const char *name : {"8/far", "48/far", "16@2/twice", "24/twice"}) {
        QImage image(24, 24, QImage::Format_RGB32);
        image.fill(QColor::fromHsv(++color * 60, 255, 255));
        QVERIFY(image.save(write(QStringLiteral("odd/%1.png").arg(QLatin1String(name)), QByteArray())));
    }
    QIcon::setThemeName(QStringLiteral("odd"));
}

QImage tst_VelIconScaled::painted(const QIcon &icon, int size, qreal ratio)
{
    QImage image(QSize(size, size) * ratio, QImage::Format_ARGB32_Premultiplied);
    image.setDevicePixelRatio(ratio);
    image.fill(Qt::white);
    QPainter painter(&image);
    icon.paint(&painter, QRect(0, 0, size, size));
    return image;
}

void tst_VelIconScaled::makesPixmapsForTheScreen()
{
    for (int round = 0; round < 2; ++round) {
        const QPixmap pixmap = icon().pixmap(16);
        QCOMPARE(pixmap.devicePixelRatio(), 2.0);
        QCOMPARE(pixmap.size(), QSize(32, 32));
        QCOMPARE(pixmap.toImage().pixelColor(20, 20), QColor(Qt::cyan));
    }
}

void tst_VelIconScaled::laysEmblemsInTheirLogicalSize()
{
    const QImage image = icon().pixmap(16).toImage();
    QCOMPARE(image.pixelColor(15, 15), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(16, 15), QColor(Qt::cyan));
    QCOMPARE(image.pixelColor(15, 16), QColor(Qt::cyan));
}

void tst_VelIconScaled::paintsOnADeviceOfAnotherRatio()
{
    QImage image(16, 16, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    QPainter painter(&image);
    icon().paint(&painter, image.rect());
    painter.end();
    QCOMPARE(image.pixelColor(7, 7), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(8, 7), image.pixelColor(15, 15));
    QVERIFY(image.pixelColor(15, 15) != QColor(Qt::white));
}

void tst_VelIconScaled::tellsTheSizesThatQtTells()
{
    const QIcon qt = QIcon::fromTheme(QStringLiteral("by-size"));
    for (const int size : {8, 16, 22, 32, 64}) {
        QCOMPARE(icon().actualSize(QSize(size, size)), qt.actualSize(QSize(size, size)));
        QCOMPARE(icon().pixmap(size).size(), qt.pixmap(size).size());
        QCOMPARE(icon().pixmap(size).devicePixelRatio(), qt.pixmap(size).devicePixelRatio());
    }
}

// Where a size asked for twice as large would have another file.
void tst_VelIconScaled::tellsTheSizesOfFilesForOtherRatios()
{
    makeOddSizes();
    for (const char *name : {"far", "twice"}) {
        const QIcon ours = VelIcon::fromTheme(QLatin1String(name), QMap<Qt::Corner, QString>(), QIcon());
        const QIcon qt = QIcon::fromTheme(QLatin1String(name));
        for (int size = 4; size <= 128; size += 4)
            QCOMPARE(ours.actualSize(QSize(size, size)), qt.actualSize(QSize(size, size)));
    }
}

void tst_VelIconScaled::paintsTheFileThatQtPaints()
{
    if (QT_VERSION_MAJOR < 6)
        QSKIP("Qt 5 has no way to ask for the pixmap that it paints");
    makeOddSizes();
    for (const char *name : {"far", "twice"}) {
        const QIcon ours = VelIcon::fromTheme(QLatin1String(name), QMap<Qt::Corner, QString>(), QIcon());
        const QIcon qt = QIcon::fromTheme(QLatin1String(name));
        for (int size = 4; size <= 128; size += 4) {
            for (const qreal ratio : {1.0, 1.5, 2.0, 3.0})
                QCOMPARE(painted(ours, size, ratio), painted(qt, size, ratio));
        }
    }
}

// The file for this ratio is too large, the one for the other is not.
void tst_VelIconScaled::looksAtTheFileForTheScreen()
{
    write(QStringLiteral("two/index.theme"),
          "[Icon Theme]\nName=Two\n[16]\nSize=16\nType=Fixed\n[16@2]\nSize=16\nScale=2\nType=Fixed\n");
    QImage large(4097, 4096, QImage::Format_Mono);
    large.fill(0);
    QImage good(16, 16, QImage::Format_RGB32);
    good.fill(Qt::red);
    QImage twice(32, 32, QImage::Format_RGB32);
    twice.fill(Qt::green);
    for (const char *name : {"16/large.png", "16@2/large.png", "16/good.png", "16@2/good.png"}) {
        const QByteArray file(name);
        const QImage &image = file == "16@2/large.png" ? large : file.startsWith("16@") ? twice : good;
        QVERIFY(image.save(write(QStringLiteral("two/") + QLatin1String(name), QByteArray())));
    }
    QIcon::setThemeName(QStringLiteral("two"));
    QPixmap plain(32, 32);
    plain.fill(Qt::yellow);
    const auto shown = [&plain](const char *name) {
        const QIcon icon = VelIcon::fromTheme(QLatin1String(name), QMap<Qt::Corner, QString>(), QIcon(plain));
        return icon.pixmap(16).toImage().pixelColor(10, 10);
    };
    QCOMPARE(shown("good"), QColor(Qt::green));
    QCOMPARE(shown("large"), QColor(Qt::yellow));
}

void tst_VelIconScaled::drawsEveryPixelAsQtDoes_data()
{
    QTest::addColumn<QString>("theme");
    for (const char *theme : {"breeze", "Adwaita", "hicolor", "sizes"})
        QTest::newRow(theme) << QString::fromLatin1(theme);
}

void tst_VelIconScaled::drawsEveryPixelAsQtDoes()
{
    QFETCH(QString, theme);
    const QString installed = QStringLiteral("/usr/share/icons");
    const QString own = folder() + QLatin1Char('/') + theme;
    const QString place = QDir(own).exists() ? own : installed + QLatin1Char('/') + theme;
    if (!QDir(place).exists())
        QSKIP("this theme is not installed");
    // Not every drawing and picture is a good one.
    QLoggingCategory::setFilterRules(QStringLiteral("qt.svg=false\ndefault.warning=false"));
    QIcon::setThemeSearchPaths({folder(), installed});
    QIcon::setThemeName(theme);
    QCOMPARE(IconPixels::firstDifference(IconPixels::namesIn(place)), QString());
}

int main(int argc, char **argv)
{
    VelTest::TestEnvironment environment;
    qputenv("QT_SCALE_FACTOR", "2");
    VelTest::useHighDpiPixmaps();
    QApplication application(argc, argv);
    tst_VelIconScaled test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_VelIconScaled.moc"
