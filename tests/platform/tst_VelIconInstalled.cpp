// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconPixels.h"
#include "TestCase.h"

#include <QDir>
#include <QIcon>
#include <QLoggingCategory>

/// The icons of installed themes, beside those of Qt. VEL_TEST_FULL looks at each of them.
class tst_VelIconInstalled : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void drawsEveryPixelAsQtDoes_data();
    void drawsEveryPixelAsQtDoes();

private:
    void makePictures(const QString &theme);

    const QString m_pictures = QStringLiteral("pictures");
};

void tst_VelIconInstalled::drawsEveryPixelAsQtDoes_data()
{
    QTest::addColumn<QString>("theme");
    for (const char *theme : {"breeze", "breeze-dark", "Adwaita", "hicolor"})
        QTest::newRow(theme) << QString::fromLatin1(theme);
    QTest::newRow("a theme of pictures") << m_pictures;
}

// Pictures of three fixed sizes, each icon in some of them, and the rest from another theme.
void tst_VelIconInstalled::makePictures(const QString &theme)
{
    QByteArray index = "[Icon Theme]\nName=Pictures\nInherits=breeze\nDirectories=16x16/a,22x22/a,48x48/a\n";
    int number = 0;
    for (const int size : {16, 22, 48}) {
        const QString folder = QStringLiteral("%1x%1/a").arg(size);
        index += "\n[" + folder.toLatin1() + "]\nSize=" + QByteArray::number(size) + "\nType=Fixed\n";
        QVERIFY(QDir().mkpath(theme + QLatin1Char('/') + folder));
        for (const char *name : {"edit-copy", "one", "one-more", "pictures-only", "folder"}) {
            if (++number % 4 == 0)
                continue;
            QImage picture(size, size, QImage::Format_ARGB32);
            picture.fill(QColor::fromHsv(number * 20, 200, 200, 128));
            QVERIFY(picture.save(QStringLiteral("%1/%2/%3.png").arg(theme, folder, QLatin1String(name))));
        }
    }
    QFile file(theme + QLatin1String("/index.theme"));
    QVERIFY(file.open(QIODevice::WriteOnly) && file.write(index) == index.size());
}

void tst_VelIconInstalled::drawsEveryPixelAsQtDoes()
{
    QFETCH(QString, theme);
    const QString installed = QStringLiteral("/usr/share/icons");
    const QString root = theme == m_pictures ? folder() : installed;
    if (theme == m_pictures)
        makePictures(root + QLatin1Char('/') + theme);
    if (!QDir(root + QLatin1Char('/') + theme).exists())
        QSKIP("this theme is not installed");
    // Not every drawing and picture is a good one.
    QLoggingCategory::setFilterRules(QStringLiteral("qt.svg=false\ndefault.warning=false"));
    QIcon::setThemeSearchPaths({root, installed});
    QIcon::setThemeName(theme);
    QStringList names = IconPixels::namesIn(root + QLatin1Char('/') + theme);
    names.append(
        {QStringLiteral("one-more-still"), QStringLiteral("edit-copy-as-none"), QStringLiteral("none")});
    QCOMPARE(IconPixels::firstDifference(names), QString());
}

VEL_TEST_MAIN(tst_VelIconInstalled)

#include "tst_VelIconInstalled.moc"
