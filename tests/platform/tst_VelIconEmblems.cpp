// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconTestCase.h"
#include "IconThemeFolder.h"

#include <QImage>

/// Emblems on icons.
class tst_VelIconEmblems : public IconTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void laysEmblemsIntoTheirCorners_data();
    void laysEmblemsIntoTheirCorners();
    void laysAnEmblemIntoEveryCorner();
    void laysTheSingleEmblemIntoItsCorner();
    void laysEmblemsOnTheFallback();
    void laysEmblemsOnAGivenIcon();
    void givesTheIconItselfWithoutEmblems();
    void leavesAnEmblemOutThatTheThemeLacks();
    void graysEmblemsOutWithTheirIcon();
};

void tst_VelIconEmblems::laysEmblemsIntoTheirCorners_data()
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

void tst_VelIconEmblems::laysEmblemsIntoTheirCorners()
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
                QFAIL(qPrintable(QStringLiteral("wrong color at %1, %2").arg(x).arg(y)));
        }
    }
}

void tst_VelIconEmblems::laysAnEmblemIntoEveryCorner()
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

void tst_VelIconEmblems::laysTheSingleEmblemIntoItsCorner()
{
    const QIcon icon = VelIcon::fromTheme(
        QStringLiteral("red"), qMakePair(Qt::TopRightCorner, QStringLiteral("emblem-blue")), QIcon());
    const QImage image = painted(icon, 16);
    QCOMPARE(image.pixelColor(15, 0), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(8, 7), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(7, 8), QColor(Qt::red));
    QCOMPARE(image.pixelColor(0, 0), QColor(Qt::red));
}

void tst_VelIconEmblems::laysEmblemsOnTheFallback()
{
    const Emblems emblems{{Qt::BottomLeftCorner, QStringLiteral("emblem-blue")}};
    const QImage image =
        painted(VelIcon::fromTheme(QStringLiteral("missing"), emblems, plainIcon(Qt::yellow)), 16);
    QCOMPARE(image.pixelColor(0, 15), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(15, 0), QColor(Qt::yellow));
}

void tst_VelIconEmblems::laysEmblemsOnAGivenIcon()
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

void tst_VelIconEmblems::givesTheIconItselfWithoutEmblems()
{
    const QIcon given = plainIcon(Qt::yellow);
    QCOMPARE(VelIcon::withEmblems(given, Emblems()).cacheKey(), given.cacheKey());
    QCOMPARE(VelIcon::withEmblems(QIcon(), Emblems()).cacheKey(), QIcon().cacheKey());
}

void tst_VelIconEmblems::leavesAnEmblemOutThatTheThemeLacks()
{
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-missing")},
                          {Qt::BottomRightCorner, QStringLiteral("emblem-blue")}};
    const QImage image = painted(VelIcon::fromTheme(QStringLiteral("red"), emblems, QIcon()), 16);
    QCOMPARE(image.pixelColor(0, 0), QColor(Qt::red));
    QCOMPARE(image.pixelColor(15, 15), QColor(Qt::blue));
}

void tst_VelIconEmblems::graysEmblemsOutWithTheirIcon()
{
    const Emblems emblems{{Qt::TopLeftCorner, QStringLiteral("emblem-blue")}};
    const QImage image =
        VelIcon::fromTheme(QStringLiteral("red"), emblems, QIcon()).pixmap(16, QIcon::Disabled).toImage();
    QVERIFY(image.pixelColor(0, 0) != QColor(Qt::blue));
    QVERIFY(image.pixelColor(15, 15) != QColor(Qt::red));
    QCOMPARE(image.pixelColor(0, 0),
             themeIcon(QStringLiteral("emblem-blue")).pixmap(8, QIcon::Disabled).toImage().pixelColor(0, 0));
}

VEL_TEST_MAIN(tst_VelIconEmblems)
#include "tst_VelIconEmblems.moc"
