// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LibraryPlace.h"
#include "OwnIcon.h"
#include "TestCase.h"

#include <QDir>
#include <QFileInfo>
#include <QIcon>
#include <QImage>

namespace {

QString placeOfIcons;
int asked = 0;

} // namespace

// In place of the library's own place
QString LibraryPlace::icons()
{
    ++asked;
    return placeOfIcons;
}

class tst_OwnIcon : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void takesTheIconOfTheTheme();
    void looksForNoFileWhereTheThemeHasTheIcon();
    void takesTheInstalledIconInAllItsSizesElse();
    void isNullWhereThereIsNone();

private:
    /// A picture of one color at \a name below the test's folder.
    void paint(const QString &name, int size, const QColor &color);
    static QColor colorOf(const QIcon &icon, int size);
};

void tst_OwnIcon::init()
{
    TestCase::init();
    write(QStringLiteral("themes/own/index.theme"),
          "[Icon Theme]\nName=own\nDirectories=22\n[22]\nSize=22\n");
    paint(QStringLiteral("themes/own/22/ours.png"), 22, Qt::red);
    for (const int size : {16, 22, 48})
        paint(QStringLiteral("prefix/hicolor/%1x%1/apps/ours.png").arg(size), size, QColor(0, 0, size));
    placeOfIcons = path(QStringLiteral("prefix"));
    asked = 0;
    QIcon::setThemeSearchPaths({path(QStringLiteral("themes"))});
    QIcon::setThemeName(QStringLiteral("own"));
}

void tst_OwnIcon::paint(const QString &name, int size, const QColor &color)
{
    QImage image(size, size, QImage::Format_RGB32);
    image.fill(color);
    QVERIFY(QDir().mkpath(QFileInfo(path(name)).path()));
    QVERIFY(image.save(path(name)));
}

QColor tst_OwnIcon::colorOf(const QIcon &icon, int size)
{
    const QImage image = icon.pixmap(size).toImage();
    return image.width() == size ? image.pixelColor(size / 2, size / 2) : QColor();
}

void tst_OwnIcon::takesTheIconOfTheTheme()
{
    const QIcon icon = OwnIcon::named(QStringLiteral("ours"));
    QCOMPARE(icon.name(), QStringLiteral("ours"));
    QCOMPARE(colorOf(icon, 22), QColor(Qt::red));
}

void tst_OwnIcon::looksForNoFileWhereTheThemeHasTheIcon()
{
    OwnIcon::named(QStringLiteral("ours"));
    QCOMPARE(asked, 0);
}

void tst_OwnIcon::takesTheInstalledIconInAllItsSizesElse()
{
    QIcon::setThemeName(QStringLiteral("none"));
    const QIcon icon = OwnIcon::named(QStringLiteral("ours"));
    for (const int size : {16, 22, 48})
        QCOMPARE(colorOf(icon, size), QColor(0, 0, size));
}

void tst_OwnIcon::isNullWhereThereIsNone()
{
    for (const QString &place : {placeOfIcons, QStringLiteral("/nowhere"), QString()}) {
        placeOfIcons = place;
        QVERIFY(OwnIcon::named(QStringLiteral("others")).isNull());
    }
}

VEL_TEST_MAIN(tst_OwnIcon)

#include "tst_OwnIcon.moc"
