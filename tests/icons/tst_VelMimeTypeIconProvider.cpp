// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconThemeFolder.h"
#include "TestCase.h"

#include "VelMimeTypeIconProvider.h"

#include <QDir>
#include <QFileSystemModel>
#include <QImage>
#include <QMimeDatabase>
#include <QPainter>
#include <QSignalSpy>

#include <memory>

#include <sys/stat.h>
#include <unistd.h>

class tst_VelMimeTypeIconProvider : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

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
    void givesEntriesTheIconThatTheyName();
    void takesTheBuiltInFileWhereTheThemeLacksTheIconOfAnEntry();
    void givesLinkEntriesTheIconOfTheirTarget_data();
    void givesLinkEntriesTheIconOfTheirTarget();
    void givesLinkEntriesNoBuiltInPicture();
    void drawsSeparators();
    void drawsSeparatorsInEverySize_data();
    void drawsSeparatorsInEverySize();
    void givesASeparatorWithAnIconThatIcon();
    void givesOtherEntriesTheBuiltInPicture_data();
    void givesOtherEntriesTheBuiltInPicture();
    void tellsEntriesByTheExactEndOfTheirName_data();
    void tellsEntriesByTheExactEndOfTheirName();
    void seesAChangedFileInTheNextCall();
    void looksTheThemeUpWhenTheIconIsPainted();

    void readsThePicturesFromTheDesktopsDirectory();
    void isNullWithoutPictures();
    void bringsPicturesThatQtCanRead_data();
    void bringsPicturesThatQtCanRead();

    void namesTheTypeAsTheDatabaseDoes_data();
    void namesTheTypeAsTheDatabaseDoes();
    void servesAFileSystemModel();

private:
    static QImage painted(const QIcon &icon, int size = 16);
    static QColor middle(const QIcon &icon) { return painted(icon).pixelColor(12, 4); }
    static QColor topRight(const QIcon &icon) { return painted(icon).pixelColor(15, 0); }
    static QColor bottomLeft(const QIcon &icon) { return painted(icon).pixelColor(0, 15); }

    QIcon iconOf(const QString &name) const { return m_provider->icon(QFileInfo(path(name))); }
    void writePicture(const QString &name, int size, const QColor &color);
    void makePipe(const QString &name);

    std::unique_ptr<IconThemeFolder> m_theme;
    std::unique_ptr<VelMimeTypeIconProvider> m_provider;
};

namespace {

// The colours of the pictures; each stands for one icon only.
const QColor folderColor(0x80, 0, 0);
const QColor fileColor(0, 0x80, 0);
const QColor namedColor(0, 0, 0x80);
const QColor textColor(0x80, 0x80, 0);
const QColor unknownColor(0x80, 0, 0x80);
const QColor htmlColor(0, 0x80, 0x80);
const QColor linkColor(0xff, 0, 0);
const QColor unreadableColor(0, 0xff, 0);

QByteArray entry(const QByteArray &lines)
{
    return "[Desktop Entry]\n" + lines;
}

} // namespace

void tst_VelMimeTypeIconProvider::init()
{
    TestCase::init();
    m_theme = std::make_unique<IconThemeFolder>(path(QStringLiteral(".icons")), QStringLiteral("test"));
    m_theme->write();
    m_theme->add(QStringLiteral("named"), namedColor);
    m_theme->add(QStringLiteral("text-plain"), textColor);
    m_theme->add(QStringLiteral("text-html"), htmlColor);
    m_theme->add(QStringLiteral("unknown"), unknownColor);
    m_theme->add(QStringLiteral("emblem-symbolic-link"), linkColor);
    m_theme->add(QStringLiteral("emblem-unreadable"), unreadableColor);
    m_theme->use();

    qputenv("VEL_DATA_DIR", QFile::encodeName(path(QStringLiteral(".data"))));
    QVERIFY(QDir().mkpath(path(QStringLiteral(".data/pixmaps"))));
    for (const int size : {16, 32}) {
        writePicture(QStringLiteral("folder%1.xpm").arg(size), size, folderColor);
        writePicture(QStringLiteral("icon%1.xpm").arg(size), size, fileColor);
    }
    m_provider = std::make_unique<VelMimeTypeIconProvider>();
}

void tst_VelMimeTypeIconProvider::writePicture(const QString &name, int size, const QColor &color)
{
    QImage image(size, size, QImage::Format_RGB32);
    image.fill(color);
    QVERIFY(image.save(path(QStringLiteral(".data/pixmaps/") + name), "XPM"));
}

void tst_VelMimeTypeIconProvider::makePipe(const QString &name)
{
    QCOMPARE(::mkfifo(QFile::encodeName(path(name)).constData(), 0600), 0);
}

QImage tst_VelMimeTypeIconProvider::painted(const QIcon &icon, int size)
{
    QImage image(size, size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    QPainter painter(&image);
    icon.paint(&painter, image.rect());
    return image;
}

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

void tst_VelMimeTypeIconProvider::givesEntriesTheIconThatTheyName()
{
    m_theme->add(QStringLiteral("application-x-desktop"), Qt::cyan);
    write(QStringLiteral("a.desktop"), entry("Type=Application\nIcon=named\nExec=true\n"));
    write(QStringLiteral("b.desktop"), entry("Type=Link\nURL=http://example.org\nIcon=named\n"));
    write(QStringLiteral(".desktop"), entry("Icon=named.png\n"));
    for (const char *name : {"a.desktop", "b.desktop", ".desktop"})
        QCOMPARE(middle(iconOf(QString::fromLatin1(name))), namedColor);

    const QString picture = path(QStringLiteral("picture.png"));
    QPixmap pixmap(16, 16);
    pixmap.fill(Qt::magenta);
    QVERIFY(pixmap.save(picture));
    write(QStringLiteral("c.desktop"), entry("Icon=" + QFile::encodeName(picture) + '\n'));
    QCOMPARE(middle(iconOf(QStringLiteral("c.desktop"))), QColor(Qt::magenta));
}

void tst_VelMimeTypeIconProvider::takesTheBuiltInFileWhereTheThemeLacksTheIconOfAnEntry()
{
    write(QStringLiteral("a.desktop"), entry("Type=Application\nIcon=missing\nExec=VELWM_SEPARATOR\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), fileColor);
}

void tst_VelMimeTypeIconProvider::givesLinkEntriesTheIconOfTheirTarget_data()
{
    QTest::addColumn<QByteArray>("url");
    QTest::addColumn<QColor>("color");
    QTest::newRow("http") << QByteArray("http://example.org/") << htmlColor;
    QTest::newRow("text") << QByteArray("file://%1/a.txt") << textColor;
    QTest::newRow("path with letters beyond ASCII") << QByteArray("%1/\xd0\x96.txt") << textColor;
    QTest::newRow("no such file") << QByteArray("file://%1/b.txt") << unknownColor;
    QTest::newRow("empty") << QByteArray() << unknownColor;
}

void tst_VelMimeTypeIconProvider::givesLinkEntriesTheIconOfTheirTarget()
{
    QFETCH(QByteArray, url);
    QFETCH(QColor, color);
    write(QStringLiteral("a.txt"), "text");
    write(QStringLiteral("Ж.txt"), "text");
    url.replace("%1", QFile::encodeName(folder()));
    write(QStringLiteral("a.desktop"), entry("Type=Link\nURL=" + url + "\nExec=VELWM_SEPARATOR\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), color);
}

void tst_VelMimeTypeIconProvider::givesLinkEntriesNoBuiltInPicture()
{
    write(QStringLiteral("a.desktop"), entry("Type=Link\nURL=mailto:someone@example.org\n"));
    QVERIFY(iconOf(QStringLiteral("a.desktop")).isNull());
    m_theme->add(QStringLiteral("mail-message-new"), Qt::cyan);
    QIcon::setThemeName(QString());
    m_theme->use();
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), QColor(Qt::cyan));
}

void tst_VelMimeTypeIconProvider::drawsSeparators()
{
    write(QStringLiteral("a.desktop"), entry("Type=Application\nExec=VELWM_SEPARATOR\n"));
    QVERIFY(QFile::link(path(QStringLiteral("a.desktop")), path(QStringLiteral("link.desktop"))));
    const QIcon icon = iconOf(QStringLiteral("a.desktop"));
    const QIcon linked = iconOf(QStringLiteral("link.desktop"));
    QCOMPARE(linked.cacheKey(), icon.cacheKey());
    QCOMPARE(icon.availableSizes(),
             (QList<QSize>{QSize(16, 16), QSize(22, 22), QSize(32, 32), QSize(48, 48), QSize(64, 64),
                           QSize(128, 128)}));
}

void tst_VelMimeTypeIconProvider::drawsSeparatorsInEverySize_data()
{
    QTest::addColumn<int>("size");
    for (const int size : {16, 22, 32, 48, 64, 128})
        QTest::addRow("%d", size) << size;
}

void tst_VelMimeTypeIconProvider::drawsSeparatorsInEverySize()
{
    QFETCH(int, size);
    write(QStringLiteral("a.desktop"), entry("Exec=VELWM_SEPARATOR\n"));
    const QImage image = iconOf(QStringLiteral("a.desktop")).pixmap(size).toImage();
    QCOMPARE(image.size(), QSize(size, size));
    for (int y = 0; y < size; ++y) {
        const bool onRule = y == size / 2 - 1 || y == size / 2;
        for (int x = 0; x < size; ++x)
            QCOMPARE(image.pixelColor(x, y), onRule ? QColor(Qt::black) : QColor(Qt::transparent));
    }
}

void tst_VelMimeTypeIconProvider::givesASeparatorWithAnIconThatIcon()
{
    write(QStringLiteral("a.desktop"), entry("Type=Application\nExec=VELWM_SEPARATOR\nIcon=named\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), namedColor);
}

void tst_VelMimeTypeIconProvider::givesOtherEntriesTheBuiltInPicture_data()
{
    QTest::addColumn<QByteArray>("contents");
    QTest::newRow("empty") << QByteArray();
    QTest::newRow("garbage") << QByteArray(1 << 20, '\xfe');
    QTest::newRow("no group") << QByteArray("Icon=named\n");
    QTest::newRow("application") << entry("Type=Application\nExec=true\n");
    QTest::newRow("type in another case") << entry("Type=link\nURL=http://example.org\n");
    QTest::newRow("separator in another case") << entry("Type=Application\nExec=velwm_separator\n");
    QTest::newRow("separator with an argument") << entry("Type=Application\nExec=VELWM_SEPARATOR x\n");
}

void tst_VelMimeTypeIconProvider::givesOtherEntriesTheBuiltInPicture()
{
    QFETCH(QByteArray, contents);
    m_theme->add(QStringLiteral("application-x-desktop"), Qt::cyan);
    write(QStringLiteral("a.desktop"), contents);
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), fileColor);
}

void tst_VelMimeTypeIconProvider::tellsEntriesByTheExactEndOfTheirName_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"a.Desktop", "a.DESKTOP", "a.desktop.txt", "adesktop"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_VelMimeTypeIconProvider::tellsEntriesByTheExactEndOfTheirName()
{
    QFETCH(QString, name);
    write(name, entry("Type=Application\nIcon=named\n"));
    m_theme->add(QStringLiteral("application-x-desktop"), Qt::cyan);
    const QColor color = middle(iconOf(name));
    QVERIFY(color == QColor(Qt::cyan) || color == textColor);
}

void tst_VelMimeTypeIconProvider::seesAChangedFileInTheNextCall()
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

void tst_VelMimeTypeIconProvider::looksTheThemeUpWhenTheIconIsPainted()
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

void tst_VelMimeTypeIconProvider::readsThePicturesFromTheDesktopsDirectory()
{
    writePicture(QStringLiteral("icon32.xpm"), 32, Qt::magenta);
    const VelMimeTypeIconProvider provider;
    QVERIFY(QDir(path(QStringLiteral(".data"))).removeRecursively());
    makePipe(QStringLiteral("pipe"));
    const QIcon icon = provider.icon(QFileInfo(path(QStringLiteral("pipe"))));
    QCOMPARE(icon.actualSize(QSize(22, 22)), QSize(22, 22));
    QCOMPARE(painted(icon, 16).pixelColor(8, 8).alpha(), 255);
}

void tst_VelMimeTypeIconProvider::isNullWithoutPictures()
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

void tst_VelMimeTypeIconProvider::bringsPicturesThatQtCanRead_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("size");
    QTest::newRow("small folder") << QStringLiteral("folder16.xpm") << 16;
    QTest::newRow("large folder") << QStringLiteral("folder32.xpm") << 32;
    QTest::newRow("small file") << QStringLiteral("icon16.xpm") << 16;
    QTest::newRow("large file") << QStringLiteral("icon32.xpm") << 32;
}

void tst_VelMimeTypeIconProvider::bringsPicturesThatQtCanRead()
{
    QFETCH(QString, name);
    QFETCH(int, size);
    const QImage image(QStringLiteral(VEL_PICTURES_SOURCE "/") + name);
    QCOMPARE(image.size(), QSize(size, size));
    QCOMPARE(image.pixelColor(0, 0).alpha(), 0);
    QCOMPARE(image.pixelColor(size / 2, size / 2).alpha(), 255);
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
