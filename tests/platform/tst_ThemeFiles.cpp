// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <ThemeFiles.h>

#include <QDir>
#include <QDirIterator>
#include <QIcon>
#include <QImage>
#include <QPixmapCache>
#include <QProcess>
#include <QRandomGenerator>

/// The files of an icon, beside those that QIcon takes.
class tst_ThemeFiles : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void takesTheFilesThatQtTakes_data();
    void takesTheFilesThatQtTakes();
    void takesTheFilesThatQtTakesFromInstalledThemes_data();
    void takesTheFilesThatQtTakesFromInstalledThemes();
    void bearsADamagedCache();

private:
    QString makeFile(const QString &name, const QString &suffix);
    void makeTheme(const QString &root, const QString &name, const QString &parents);

    QRandomGenerator m_random;
    int m_color = 0;
};

namespace {

const QStringList Names = {QStringLiteral("a"),     QStringLiteral("a-b"), QStringLiteral("a-b-c"),
                           QStringLiteral("other"), QStringLiteral("x-y"), QStringLiteral("a-b-c-d")};

QRgb colorOf(int number)
{
    return qRgb(number >> 8 & 0xff, number & 0xff, 0x80);
}

QRgb shown(const QIcon &icon, int size)
{
    const QImage image = icon.pixmap(size).toImage();
    return image.isNull() ? 0 : image.pixel(image.width() / 2, image.height() / 2);
}

} // namespace

void tst_ThemeFiles::init()
{
    TestCase::init();
    QPixmapCache::clear();
    QIcon::setFallbackThemeName(QString());
    QIcon::setFallbackSearchPaths({});
}

// Each file has a color of its own.
QString tst_ThemeFiles::makeFile(const QString &name, const QString &suffix)
{
    const QRgb color = colorOf(++m_color);
    if (suffix == QLatin1String("svg")) {
        return write(
            name + QLatin1String(".svg"),
            "<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"16\" height=\"16\"><rect width=\"16\" "
            "height=\"16\" fill=\""
                + QColor(color).name().toLatin1() + "\"/></svg>");
    }
    QImage image(16, 16, QImage::Format_RGB32);
    image.fill(color);
    const QString path = write(name + QLatin1Char('.') + suffix, QByteArray());
    return image.save(path) ? path : QString();
}

void tst_ThemeFiles::makeTheme(const QString &root, const QString &name, const QString &parents)
{
    static const char *const kinds[] = {"Fixed", "Scalable", "Threshold", "", "Odd"};
    QByteArray description = "[Icon Theme]\nName=" + name.toUtf8() + "\nInherits=" + parents.toUtf8() + '\n';
    QStringList folders;
    const int count = 1 + m_random.bounded(6);
    for (int i = 0; i < count; ++i) {
        const QString folder = QStringLiteral("%1/%2").arg(m_random.bounded(100)).arg(i);
        const int size = 8 + 4 * m_random.bounded(12);
        description += "\n[" + folder.toUtf8() + "]\nSize=" + QByteArray::number(size) + '\n';
        const QByteArray kind = kinds[m_random.bounded(5)];
        if (!kind.isEmpty())
            description += "Type=" + kind + '\n';
        if (m_random.bounded(3) == 0)
            description += "MinSize=" + QByteArray::number(size / 2)
                + "\nMaxSize=" + QByteArray::number(size * 2) + '\n';
        if (m_random.bounded(3) == 0)
            description += "Threshold=" + QByteArray::number(m_random.bounded(6)) + '\n';
        if (m_random.bounded(4) == 0)
            description += "Scale=2\n";
        folders.append(folder);
    }
    const QString place = root + QLatin1Char('/') + name + QLatin1Char('/');
    if (m_random.bounded(8) != 0)
        write(place + QLatin1String("index.theme"), description);
    for (const QString &folder : qAsConst(folders)) {
        for (const QString &icon : Names) {
            if (m_random.bounded(6) == 0)
                makeFile(place + folder + QLatin1Char('/') + icon, QStringLiteral("png"));
            if (m_random.bounded(6) == 0)
                makeFile(place + folder + QLatin1Char('/') + icon, QStringLiteral("svg"));
        }
    }
}

void tst_ThemeFiles::takesTheFilesThatQtTakes_data()
{
    QTest::addColumn<quint32>("seed");
    for (quint32 seed = 1; seed <= 30; ++seed)
        QTest::addRow("%u", seed) << seed;
}

void tst_ThemeFiles::takesTheFilesThatQtTakes()
{
    QFETCH(quint32, seed);
    m_random.seed(seed);
    const QString one = QStringLiteral("one");
    const QString two = QStringLiteral("two");
    for (const QString &root : {one, two}) {
        makeTheme(root, QStringLiteral("first"), QStringLiteral("second, third"));
        makeTheme(root, QStringLiteral("second"), QStringLiteral("first"));
        if (m_random.bounded(2) == 0)
            makeTheme(root, QStringLiteral("third"), QString());
        if (m_random.bounded(2) == 0)
            makeTheme(root, QStringLiteral("hicolor"), QString());
        makeTheme(root, QStringLiteral("fallback"), QString());
    }
    const char *const suffixes[] = {"png", "xpm", "svg"};
    for (const QString &name : Names) {
        if (m_random.bounded(2) == 0)
            makeFile(QStringLiteral("pixmaps/") + name, QLatin1String(suffixes[m_random.bounded(3)]));
    }
    QIcon::setFallbackSearchPaths({path(QStringLiteral("missing")), path(QStringLiteral("pixmaps"))});
    if (m_random.bounded(2) == 0)
        QIcon::setFallbackThemeName(QStringLiteral("fallback"));
    QIcon::setThemeSearchPaths({path(one), path(QStringLiteral("none")), path(two)});
    const QStringList themes = {QStringLiteral("first"), QStringLiteral("missing"), QStringLiteral("third")};
    QIcon::setThemeName(themes.at(m_random.bounded(3)));

    for (const QString &name : Names + QStringList{QStringLiteral("nothing"), QStringLiteral("other-far")}) {
        const QIcon icon = QIcon::fromTheme(name);
        const auto files = ThemeFiles::find(name);
        QCOMPARE(files.isEmpty(), icon.isNull());
        for (int size = 8; !icon.isNull() && size <= 64; size += 8) {
            const auto *const file = ThemeFiles::forSize(files, QSize(size, size));
            QVERIFY2(
                shown(icon, size) == shown(QIcon(file->path), size),
                qPrintable(name + QLatin1Char(' ') + QString::number(size) + QLatin1Char(' ') + file->path));
        }
    }
}

void tst_ThemeFiles::takesTheFilesThatQtTakesFromInstalledThemes_data()
{
    QTest::addColumn<QString>("theme");
    for (const char *theme : {"breeze", "breeze-dark", "Adwaita"})
        QTest::newRow(theme) << QString::fromLatin1(theme);
}

void tst_ThemeFiles::takesTheFilesThatQtTakesFromInstalledThemes()
{
    QFETCH(QString, theme);
    const QString root = QStringLiteral("/usr/share/icons/") + theme;
    if (!QDir(root).exists())
        QSKIP("this theme is not installed");
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setFallbackSearchPaths({QStringLiteral("/usr/share/pixmaps")});
    QIcon::setThemeName(theme);
    QStringList names;
    QDirIterator it(root, {QStringLiteral("*.png"), QStringLiteral("*.svg")}, QDir::Files,
                    QDirIterator::Subdirectories);
    while (it.hasNext()) {
        it.next();
        names.append(it.fileInfo().completeBaseName());
    }
    names.removeDuplicates();
    names.sort();
    const int step = qMax(1, int(names.size()) / 40);
    for (int i = 0; i < names.size(); i += step) {
        for (const QString &name : {names.at(i), names.at(i) + QStringLiteral("-more")}) {
            const QIcon icon = QIcon::fromTheme(name);
            const auto files = ThemeFiles::find(name);
            QVERIFY2(files.isEmpty() == icon.isNull(), qPrintable(name));
            // Qt 6 takes no shorter name for that of an application or of a kind of files.
            if (QT_VERSION_MAJOR >= 6 && files.isEmpty() && name.endsWith(QLatin1String("-more")))
                continue;
            for (const int size : {16, 22, 32, 48, 100}) {
                const auto *const file = ThemeFiles::forSize(files, QSize(size, size));
                QVERIFY2(file && icon.pixmap(size).toImage() == QIcon(file->path).pixmap(size).toImage(),
                         qPrintable(name));
            }
        }
    }
}

void tst_ThemeFiles::bearsADamagedCache()
{
    QFile good(QStringLiteral("/usr/share/icons/hicolor/icon-theme.cache"));
    if (!good.open(QIODevice::ReadOnly))
        QSKIP("there is no cache to damage");
    const QByteArray bytes = good.readAll();
    QRandomGenerator random(1);
    for (int i = 0; i < 2000; ++i) {
        QByteArray damaged = bytes.left(random.bounded(bytes.size() + 1));
        for (int n = random.bounded(20); n > 0 && !damaged.isEmpty(); --n)
            damaged[random.bounded(damaged.size())] = char(random.bounded(256));
        write(QStringLiteral("theme/icon-theme.cache"), damaged);
        const ThemeCache cache(path(QStringLiteral("theme")));
        for (const char *name : {"a", "application-x-executable", "utilities-terminal", ""})
            cache.foldersOf(QLatin1String(name));
    }
}

VEL_TEST_MAIN(tst_ThemeFiles)

#include "tst_ThemeFiles.moc"
