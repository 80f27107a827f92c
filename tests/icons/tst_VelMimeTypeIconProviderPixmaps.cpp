// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconProviderTestCase.h"
#include "IconThemeFolder.h"
#include "VelMimeTypeIconProvider.h"

#include <QDir>
#include <QImage>

#include <sys/stat.h>
#include <unistd.h>

/// Where the pixmaps of icons come from, and changes that are seen.
class tst_VelMimeTypeIconProviderPixmaps : public IconProviderTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void seesAChangedFileInTheNextCall();
    void looksTheThemeUpWhenTheIconIsPainted();
    void readsThePicturesFromTheDesktopsDirectory();
    void isNullWithoutPictures();
    void bringsPicturesThatQtCanRead_data();
    void bringsPicturesThatQtCanRead();
};

void tst_VelMimeTypeIconProviderPixmaps::seesAChangedFileInTheNextCall()
{
    m_theme->add(QStringLiteral("other"), Qt::cyan);
    write(QStringLiteral("a.desktop"), entry("Icon=named\n"));
    write(QStringLiteral("sub/.directory"), entry("Icon=named\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), namedColor);
    QCOMPARE(middle(iconOf(QStringLiteral("sub"))), namedColor);

    // The same size, and maybe the same time.
    write(QStringLiteral("a.desktop"), entry("Icon=other\n"));
    write(QStringLiteral("sub/.directory"), entry("Icon=other\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), QColor(Qt::cyan));
    QCOMPARE(middle(iconOf(QStringLiteral("sub"))), QColor(Qt::cyan));

    write(QStringLiteral("a.desktop"), entry("Exec=VELWM_SEPARATOR\n"));
    QVERIFY(QFile::remove(path(QStringLiteral("sub/.directory"))));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), QColor(Qt::white));
    QCOMPARE(middle(iconOf(QStringLiteral("sub"))), folderColor);
}

void tst_VelMimeTypeIconProviderPixmaps::looksTheThemeUpWhenTheIconIsPainted()
{
    // Whoever looks before the theme is there remembers that it has nothing.
    const IconThemeFolder late(path(QStringLiteral(".icons")), QStringLiteral("late"));
    late.use();
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("plain")));
    QVERIFY(QFile::link(path(QStringLiteral("plain")), path(QStringLiteral("plain-link"))));
    write(QStringLiteral("sub/.directory"), entry("Icon=late\n"));
    write(QStringLiteral("a.desktop"), entry("Icon=late\n"));
    write(QStringLiteral("b.desktop"), entry("Type=Link\nURL=http://example.org\n"));
    write(QStringLiteral("c.txt"), "text");
    QVERIFY(QFile::link(path(QStringLiteral("nowhere")), path(QStringLiteral("dangling"))));
    QVector<QIcon> icons;
    for (const char *name : {"sub", "a.desktop", "b.desktop", "c.txt", "dangling", "plain-link"})
        icons.append(iconOf(QString::fromLatin1(name)));

    late.write();
    for (const char *name : {"late", "text-html", "text-plain", "unknown", "emblem-symbolic-link"})
        late.add(QString::fromLatin1(name), Qt::cyan);
    for (const QIcon &icon : qAsConst(icons))
        QCOMPARE(bottomLeft(icon), QColor(Qt::cyan));
}

void tst_VelMimeTypeIconProviderPixmaps::readsThePicturesFromTheDesktopsDirectory()
{
    writePixmap(QStringLiteral("icon32.xpm"), 32, Qt::magenta);
    const VelMimeTypeIconProvider provider;
    QVERIFY(QDir(path(QStringLiteral(".data"))).removeRecursively());
    makePipe(QStringLiteral("pipe"));
    const QIcon icon = provider.icon(QFileInfo(path(QStringLiteral("pipe"))));
    QCOMPARE(icon.actualSize(QSize(22, 22)), QSize(22, 22));
    QCOMPARE(painted(icon, 16).pixelColor(8, 8).alpha(), 255);
}

void tst_VelMimeTypeIconProviderPixmaps::isNullWithoutPictures()
{
    QVERIFY(QDir(path(QStringLiteral(".data"))).removeRecursively());
    const VelMimeTypeIconProvider provider;
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("sub")));
    QVERIFY(QFile::link(path(QStringLiteral("sub")), path(QStringLiteral("link"))));
    makePipe(QStringLiteral("pipe"));
    write(QStringLiteral("a.desktop"), entry("Icon=missing\n"));
    write(QStringLiteral("b.desktop"), entry("Exec=VELWM_SEPARATOR\n"));
    for (const char *name : {"sub", "link", "pipe", "a.desktop"})
        QVERIFY2(provider.icon(QFileInfo(path(QString::fromLatin1(name)))).isNull(), name);
    QVERIFY(!provider.icon(QFileInfo(path(QStringLiteral("b.desktop")))).isNull());
}

void tst_VelMimeTypeIconProviderPixmaps::bringsPicturesThatQtCanRead_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("size");
    QTest::newRow("small folder") << QStringLiteral("folder16.xpm") << 16;
    QTest::newRow("large folder") << QStringLiteral("folder32.xpm") << 32;
    QTest::newRow("small file") << QStringLiteral("icon16.xpm") << 16;
    QTest::newRow("large file") << QStringLiteral("icon32.xpm") << 32;
}

void tst_VelMimeTypeIconProviderPixmaps::bringsPicturesThatQtCanRead()
{
    QFETCH(QString, name);
    QFETCH(int, size);
    const QImage image(QStringLiteral(VEL_PICTURES_SOURCE "/") + name);
    QCOMPARE(image.size(), QSize(size, size));
    QCOMPARE(image.pixelColor(0, 0).alpha(), 0);
    QCOMPARE(image.pixelColor(size / 2, size / 2).alpha(), 255);
}

VEL_TEST_MAIN(tst_VelMimeTypeIconProviderPixmaps)
#include "tst_VelMimeTypeIconProviderPixmaps.moc"
