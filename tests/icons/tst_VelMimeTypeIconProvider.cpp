// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconProviderTestCase.h"
#include "IconThemeFolder.h"

#include <QDir>
#include <QFileSystemModel>
#include <QMimeDatabase>
#include <QSignalSpy>

#include <sys/stat.h>
#include <unistd.h>

/// Icons of places, folders, links and files.
class tst_VelMimeTypeIconProvider : public IconProviderTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void givesPlacesTheIconsOfTheTheme_data();
    void givesPlacesTheIconsOfTheTheme();
    void asksTheTrashInEveryCall();
    void takesTheIconsOfQtWhereTheThemeHasNone_data();
    void takesTheIconsOfQtWhereTheThemeHasNone();
    void marksWhatDoesNotExist_data();
    void marksWhatDoesNotExist();
    void isNullForWhatDoesNotExistWithoutAThemeIcon();
    void givesFoldersTheBuiltInPicture();
    void givesFoldersTheIconThatTheyName();
    void takesTheFoldersOwnDescription();
    void takesTheBuiltInFolderWhereNoIconIsNamed_data();
    void takesTheBuiltInFolderWhereNoIconIsNamed();
    void takesTheBuiltInFolderWhereTheThemeLacksTheIcon();
    void givesLinksTheIconOfTheirTargetWithAnEmblem_data();
    void givesLinksTheIconOfTheirTargetWithAnEmblem();
    void givesWhatIsNeitherFileNorFolderTheBuiltInPicture();
    void givesFilesTheIconOfTheirType_data();
    void givesFilesTheIconOfTheirType();
    void takesTheBuiltInFileWhereTheThemeLacksTheType();
    void namesTheTypeAsTheDatabaseDoes_data();
    void namesTheTypeAsTheDatabaseDoes();
    void servesAFileSystemModel();
};

void tst_VelMimeTypeIconProvider::givesPlacesTheIconsOfTheTheme_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QString>("name");
    QTest::newRow("computer") << int(QFileIconProvider::Computer) << QStringLiteral("computer");
    QTest::newRow("desktop") << int(QFileIconProvider::Desktop) << QStringLiteral("user-desktop");
    QTest::newRow("trash") << int(QFileIconProvider::Trashcan) << QStringLiteral("user-trash");
    QTest::newRow("network") << int(QFileIconProvider::Network) << QStringLiteral("network-wired");
    QTest::newRow("drive") << int(QFileIconProvider::Drive) << QStringLiteral("drive-harddisk");
    QTest::newRow("folder") << int(QFileIconProvider::Folder) << QStringLiteral("folder");
    QTest::newRow("file") << int(QFileIconProvider::File) << QStringLiteral("unknown");
    QTest::newRow("other") << 4711 << QStringLiteral("unknown");
}

void tst_VelMimeTypeIconProvider::givesPlacesTheIconsOfTheTheme()
{
    QFETCH(int, type);
    QFETCH(QString, name);
    m_theme->add(name, Qt::cyan);
    const QIcon icon = m_provider->icon(QFileIconProvider::IconType(type));
    QCOMPARE(icon.name(), name);
    QCOMPARE(middle(icon), QColor(Qt::cyan));
}

void tst_VelMimeTypeIconProvider::asksTheTrashInEveryCall()
{
    m_theme->add(QStringLiteral("user-trash"), Qt::cyan);
    m_theme->add(QStringLiteral("user-trash-full"), Qt::magenta);
    QCOMPARE(middle(m_provider->icon(QFileIconProvider::Trashcan)), QColor(Qt::cyan));
    const QString folder =
        VelTest::TestEnvironment::instance().home() + QStringLiteral("/.local/share/Trash/files/x");
    QVERIFY(QDir().mkpath(folder));
    QCOMPARE(middle(m_provider->icon(QFileIconProvider::Trashcan)), QColor(Qt::magenta));
    QVERIFY(QDir().rmdir(folder));
    QCOMPARE(middle(m_provider->icon(QFileIconProvider::Trashcan)), QColor(Qt::cyan));
}

void tst_VelMimeTypeIconProvider::takesTheIconsOfQtWhereTheThemeHasNone_data()
{
    QTest::addColumn<int>("type");
    for (int type = QFileIconProvider::Computer; type <= QFileIconProvider::File; ++type)
        QTest::addRow("%d", type) << type;
}

void tst_VelMimeTypeIconProvider::takesTheIconsOfQtWhereTheThemeHasNone()
{
    QFETCH(int, type);
    const IconThemeFolder empty(path(QStringLiteral(".icons")), QStringLiteral("empty"));
    empty.write();
    empty.use();
    const QIcon expected = QFileIconProvider().icon(QFileIconProvider::IconType(type));
    const QIcon icon = m_provider->icon(QFileIconProvider::IconType(type));
    QCOMPARE(icon.isNull(), expected.isNull());
    QCOMPARE(painted(icon, 32), painted(expected, 32));
}

void tst_VelMimeTypeIconProvider::marksWhatDoesNotExist_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("isLink");
    QTest::newRow("nothing") << QStringLiteral("nothing") << false;
    QTest::newRow("no entry") << QStringLiteral("nothing.desktop") << false;
    QTest::newRow("dangling link") << QStringLiteral("dangling") << true;
    QTest::newRow("dangling link to an entry") << QStringLiteral("dangling.desktop") << true;
}

void tst_VelMimeTypeIconProvider::marksWhatDoesNotExist()
{
    QFETCH(QString, name);
    QFETCH(bool, isLink);
    if (isLink)
        QVERIFY(QFile::link(path(QStringLiteral("nowhere")), path(name)));
    const QIcon icon = iconOf(name);
    QCOMPARE(middle(icon), QColor(unreadableColor));
    QCOMPARE(topRight(icon), unreadableColor);
    QCOMPARE(bottomLeft(icon), unknownColor);
    QCOMPARE(painted(icon).pixelColor(0, 0), unknownColor);
}

void tst_VelMimeTypeIconProvider::isNullForWhatDoesNotExistWithoutAThemeIcon()
{
    QIcon::setThemeName(QStringLiteral("no such theme"));
    QVERIFY(iconOf(QStringLiteral("nothing")).isNull());
}

void tst_VelMimeTypeIconProvider::givesFoldersTheBuiltInPicture()
{
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("sub")));
    m_theme->add(QStringLiteral("folder"), Qt::cyan);
    m_theme->add(QStringLiteral("inode-directory"), Qt::cyan);
    const QIcon icon = iconOf(QStringLiteral("sub"));
    QCOMPARE(middle(icon), folderColor);
    QCOMPARE(icon.availableSizes(), (QList<QSize>{QSize(16, 16), QSize(32, 32)}));
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("sub.desktop")));
    QCOMPARE(middle(iconOf(QStringLiteral("sub.desktop"))), folderColor);
}

void tst_VelMimeTypeIconProvider::givesFoldersTheIconThatTheyName()
{
    write(QStringLiteral("sub/.directory"), entry("Type=Directory\nIcon=named\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("sub"))), namedColor);
    QCOMPARE(middle(iconOf(QStringLiteral("sub/"))), namedColor);
    QCOMPARE(middle(iconOf(QStringLiteral("sub/."))), namedColor);
    QCOMPARE(bottomLeft(iconOf(QStringLiteral("sub"))), namedColor);
    QCOMPARE(topRight(iconOf(QStringLiteral("sub"))), namedColor);
}

void tst_VelMimeTypeIconProvider::takesTheFoldersOwnDescription()
{
    write(QStringLiteral(".directory"), entry("Icon=named\n"));
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("sub")));
    QCOMPARE(middle(iconOf(QStringLiteral("sub"))), folderColor);
}

void tst_VelMimeTypeIconProvider::takesTheBuiltInFolderWhereNoIconIsNamed_data()
{
    QTest::addColumn<QByteArray>("contents");
    QTest::newRow("empty") << QByteArray();
    QTest::newRow("no icon") << entry("Type=Directory\nName=x\n");
    QTest::newRow("empty icon") << entry("Icon=\n");
    QTest::newRow("icon of a language only") << entry("Icon[de]=named\n");
    QTest::newRow("garbage") << QByteArray(100000, '\xff');
    QTest::newRow("no entry") << QByteArray("Icon=named\n");
}

void tst_VelMimeTypeIconProvider::takesTheBuiltInFolderWhereNoIconIsNamed()
{
    QFETCH(QByteArray, contents);
    write(QStringLiteral("sub/.directory"), contents);
    QCOMPARE(middle(iconOf(QStringLiteral("sub"))), folderColor);
    QVERIFY(QFile::remove(path(QStringLiteral("sub/.directory"))));
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("sub/.directory")));
    QCOMPARE(middle(iconOf(QStringLiteral("sub"))), folderColor);
}

void tst_VelMimeTypeIconProvider::takesTheBuiltInFolderWhereTheThemeLacksTheIcon()
{
    write(QStringLiteral("sub/.directory"), entry("Icon=missing\n"));
    QVERIFY(QFile::link(path(QStringLiteral("sub")), path(QStringLiteral("link"))));
    QCOMPARE(middle(iconOf(QStringLiteral("sub"))), folderColor);
    QCOMPARE(bottomLeft(iconOf(QStringLiteral("sub"))), folderColor);
    QCOMPARE(middle(iconOf(QStringLiteral("link"))), folderColor);
    QCOMPARE(bottomLeft(iconOf(QStringLiteral("link"))), linkColor);
}

void tst_VelMimeTypeIconProvider::givesLinksTheIconOfTheirTargetWithAnEmblem_data()
{
    QTest::addColumn<QString>("target");
    QTest::addColumn<QString>("link");
    QTest::addColumn<QColor>("color");
    const QString link = QStringLiteral("link"), entryLink = QStringLiteral("link.desktop");
    QTest::newRow("folder") << QStringLiteral("sub") << link << folderColor;
    QTest::newRow("folder with an icon") << QStringLiteral("described") << link << namedColor;
    QTest::newRow("folder, name of an entry") << QStringLiteral("sub") << entryLink << folderColor;
    QTest::newRow("pipe") << QStringLiteral("pipe") << link << fileColor;
    QTest::newRow("text") << QStringLiteral("a.txt") << QStringLiteral("link.txt") << textColor;
    QTest::newRow("file without a theme icon")
        << QStringLiteral("a.png") << QStringLiteral("link.png") << fileColor;
    QTest::newRow("entry") << QStringLiteral("named.desktop") << entryLink << namedColor;
    QTest::newRow("entry without an icon") << QStringLiteral("bare.desktop") << entryLink << fileColor;
    QTest::newRow("link entry") << QStringLiteral("web.desktop") << entryLink << htmlColor;
}

void tst_VelMimeTypeIconProvider::givesLinksTheIconOfTheirTargetWithAnEmblem()
{
    QFETCH(QString, target);
    QFETCH(QString, link);
    QFETCH(QColor, color);
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("sub")));
    write(QStringLiteral("described/.directory"), entry("Icon=named\n"));
    makePipe(QStringLiteral("pipe"));
    write(QStringLiteral("a.txt"), "text");
    write(QStringLiteral("a.png"), "");
    write(QStringLiteral("named.desktop"), entry("Type=Application\nIcon=named\n"));
    write(QStringLiteral("bare.desktop"), entry("Type=Application\n"));
    write(QStringLiteral("web.desktop"), entry("Type=Link\nURL=http://example.org\n"));
    QVERIFY(QFile::link(path(target), path(link)));

    QCOMPARE(middle(iconOf(target)), color);
    QCOMPARE(bottomLeft(iconOf(target)), color);
    const QIcon icon = iconOf(link);
    QCOMPARE(middle(icon), color);
    QCOMPARE(bottomLeft(icon), linkColor);
    QCOMPARE(topRight(icon), color);
    QCOMPARE(painted(icon).pixelColor(15, 15), color);
    QCOMPARE(painted(icon).pixelColor(0, 0), color);
}

void tst_VelMimeTypeIconProvider::givesWhatIsNeitherFileNorFolderTheBuiltInPicture()
{
    makePipe(QStringLiteral("pipe.desktop"));
    m_theme->add(QStringLiteral("inode-fifo"), Qt::cyan);
    m_theme->add(QStringLiteral("inode-chardevice"), Qt::cyan);
    QCOMPARE(middle(iconOf(QStringLiteral("pipe.desktop"))), fileColor);
    const QIcon device = m_provider->icon(QFileInfo(QStringLiteral("/dev/null")));
    QCOMPARE(middle(device), fileColor);
}

void tst_VelMimeTypeIconProvider::givesFilesTheIconOfTheirType_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("contents");
    QTest::addColumn<QColor>("color");
    QTest::newRow("by name") << QStringLiteral("a.txt") << QByteArray("x") << textColor;
    QTest::newRow("by contents") << QStringLiteral("noname") << QByteArray("just text\n") << textColor;
    QTest::newRow("by contents, html")
        << QStringLiteral("page") << QByteArray("<!DOCTYPE HTML>\n<html></html>") << htmlColor;
    QTest::newRow("hidden") << QStringLiteral(".a.txt") << QByteArray("x") << textColor;
}

void tst_VelMimeTypeIconProvider::givesFilesTheIconOfTheirType()
{
    QFETCH(QString, name);
    QFETCH(QByteArray, contents);
    QFETCH(QColor, color);
    write(name, contents);
    QCOMPARE(middle(iconOf(name)), color);
    QCOMPARE(bottomLeft(iconOf(name)), color);
}

void tst_VelMimeTypeIconProvider::takesTheBuiltInFileWhereTheThemeLacksTheType()
{
    write(QStringLiteral("a.png"), "");
    QCOMPARE(middle(iconOf(QStringLiteral("a.png"))), fileColor);
    m_theme->add(QStringLiteral("image-png"), Qt::cyan);
    m_theme->add(QStringLiteral("image-x-generic"), Qt::magenta);
    write(QStringLiteral("a.jpg"), "");
    QCOMPARE(middle(iconOf(QStringLiteral("a.jpg"))), fileColor);
}

void tst_VelMimeTypeIconProvider::namesTheTypeAsTheDatabaseDoes_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name :
         {"a.desktop", "a.txt", "noname", "a.png", "sub", "sub.desktop", "pipe", "pipe.desktop",
          "link.desktop", "dangling.desktop", "nothing", "nothing.txt", ".directory"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_VelMimeTypeIconProvider::namesTheTypeAsTheDatabaseDoes()
{
    QFETCH(QString, name);
    for (const char *file : {"a.desktop", "a.txt", "noname", "a.png", ".directory"})
        write(QString::fromLatin1(file), "%PDF-1.4\n");
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("sub"))
            && QDir(folder()).mkdir(QStringLiteral("sub.desktop")));
    makePipe(QStringLiteral("pipe"));
    makePipe(QStringLiteral("pipe.desktop"));
    QVERIFY(QFile::link(path(QStringLiteral("noname")), path(QStringLiteral("link.desktop"))));
    QVERIFY(QFile::link(path(QStringLiteral("nowhere")), path(QStringLiteral("dangling.desktop"))));
    const QFileInfo info(path(name));
    QCOMPARE(m_provider->type(info), QMimeDatabase().mimeTypeForFile(info).name());
    QVERIFY(!m_provider->type(info).isEmpty());
}

void tst_VelMimeTypeIconProvider::servesAFileSystemModel()
{
    write(QStringLiteral("menu/sub/.directory"), entry("Icon=named\n"));
    write(QStringLiteral("menu/a.desktop"), entry("Icon=named\n"));
    write(QStringLiteral("menu/b.txt"), "text");
    QFileSystemModel model;
    model.setIconProvider(m_provider.get());
    QSignalSpy loaded(&model, &QFileSystemModel::directoryLoaded);
    const QModelIndex root = model.setRootPath(path(QStringLiteral("menu")));
    QTRY_COMPARE(model.rowCount(root), 3);
    const auto color = [&](const char *name) {
        return middle(model.fileIcon(model.index(path(QStringLiteral("menu/") + QString::fromLatin1(name)))));
    };
    QCOMPARE(color("sub"), namedColor);
    QCOMPARE(color("a.desktop"), namedColor);
    QCOMPARE(color("b.txt"), textColor);
}

VEL_TEST_MAIN(tst_VelMimeTypeIconProvider)
#include "tst_VelMimeTypeIconProvider.moc"
