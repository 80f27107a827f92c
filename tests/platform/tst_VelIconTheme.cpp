// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconThemeFolder.h"
#include "TestCase.h"

#include <veluiaux/VelIcon.h>
#include <veluiaux/VelIconTheme.h>

#include <QDir>
#include <QFileInfo>
#include <QImage>
#include <QMimeDatabase>

class tst_VelIconTheme : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isOneForTheLifeOfTheProcess();
    void readsTheThemeAnewWhenForced();
    void namesTheIconOfAUrl_data();
    void namesTheIconOfAUrl();
    void givesAFileTheIconOfItsMimeType_data();
    void givesAFileTheIconOfItsMimeType();
    void takesAPathAsItStands();
    void knowsNoIconForAFileThatDoesNotExist();
    void leavesTheMimeTypeOutWhenNobodyAsks();
    void findsTheFileOfAnIcon();
    void leavesDrawingsOutForWhatCannotDraw();
    void findsNoFileOutsideTheTheme();

private:
    static VelIconTheme &theme() { return VelIconTheme::current(VelIconTheme::NoForceLoad); }
};

void tst_VelIconTheme::isOneForTheLifeOfTheProcess()
{
    VelIconTheme *const first = &theme();
    QCOMPARE(&VelIconTheme::current(VelIconTheme::DoForceLoad), first);
    IconThemeFolder(folder(), QStringLiteral("other")).use();
    QCOMPARE(&theme(), first);
    QCOMPARE(int(VelIconTheme::NoForceLoad), 0);
    QCOMPARE(int(VelIconTheme::DoForceLoad), 1);
}

void tst_VelIconTheme::readsTheThemeAnewWhenForced()
{
    const IconThemeFolder icons(folder(), QStringLiteral("first"));
    icons.write();
    icons.use();
    const QIcon icon = VelIcon::fromTheme(QStringLiteral("late"), QMap<Qt::Corner, QString>(), QIcon());
    QVERIFY(icon.isNull());

    icons.add(QStringLiteral("late"), Qt::red);
    theme();
    QVERIFY(icon.isNull());
    VelIconTheme::current(VelIconTheme::DoForceLoad);
    QVERIFY(!icon.isNull());
    QCOMPARE(QIcon::themeSearchPaths(), QStringList{folder()});
    QCOMPARE(QIcon::themeName(), QStringLiteral("first"));
}

void tst_VelIconTheme::namesTheIconOfAUrl_data()
{
    QTest::addColumn<QByteArray>("url");
    QTest::addColumn<QByteArray>("name");
    QTest::addColumn<QByteArray>("mimeType");

    const QByteArray unknown("unknown"), noType("application/octet-stream");
    const QByteArray html("text-html"), htmlType("text/html");
    QTest::newRow("http") << QByteArray("http://example.org/a.png") << html << htmlType;
    QTest::newRow("https") << QByteArray("https://example.org") << html << htmlType;
    QTest::newRow("upper case") << QByteArray("HTTPS://EXAMPLE.ORG") << html << htmlType;
    QTest::newRow("mailto") << QByteArray("mailto:someone@example.org") << QByteArray("mail-message-new")
                            << QByteArray("x-scheme-handler/mailto");
    QTest::newRow("other scheme") << QByteArray("ftp://example.org/") << unknown << noType;
    QTest::newRow("file of another host") << QByteArray("file://example.org/usr") << unknown << noType;
    QTest::newRow("no scheme") << QByteArray("example.org") << unknown << noType;
    QTest::newRow("relative path") << QByteArray("usr/bin") << unknown << noType;
    QTest::newRow("scheme alone") << QByteArray("file:") << unknown << noType;
    QTest::newRow("path like a scheme") << QByteArray("/http://example.org") << unknown << noType;
    QTest::newRow("no URL") << QByteArray("::%%") << unknown << noType;
    QTest::newRow("empty") << QByteArray("") << unknown << noType;
    QTest::newRow("null") << QByteArray() << unknown << noType;
}

void tst_VelIconTheme::namesTheIconOfAUrl()
{
    QFETCH(QByteArray, url);
    QFETCH(QByteArray, name);
    QFETCH(QByteArray, mimeType);
    std::string type = "left over";
    const std::string found = theme().getURLIconName(url.isNull() ? nullptr : url.constData(), &type);
    QCOMPARE(QByteArray::fromStdString(found), name);
    QCOMPARE(QByteArray::fromStdString(type), mimeType);
}

void tst_VelIconTheme::givesAFileTheIconOfItsMimeType_data()
{
    QTest::addColumn<QString>("prefix");
    QTest::addColumn<QString>("file");
    QTest::newRow("path") << QString() << QStringLiteral("a.png");
    QTest::newRow("URL") << QStringLiteral("file://") << QStringLiteral("a.png");
    QTest::newRow("URL without a host part") << QStringLiteral("file:") << QStringLiteral("a.png");
    QTest::newRow("URL of this host") << QStringLiteral("file://localhost") << QStringLiteral("a.png");
    QTest::newRow("scheme in upper case") << QStringLiteral("FILE://") << QStringLiteral("a.png");
    QTest::newRow("blank") << QStringLiteral("file://") << QStringLiteral("a b.txt");
    QTest::newRow("escaped blank") << QStringLiteral("file://") << QStringLiteral("a%20b.txt");
    QTest::newRow("letters beyond ASCII") << QStringLiteral("file://") << QStringLiteral("Ж.pdf");
    QTest::newRow("folder") << QString() << QString();
    QTest::newRow("URL of a folder") << QStringLiteral("file://") << QString();
}

void tst_VelIconTheme::givesAFileTheIconOfItsMimeType()
{
    QFETCH(QString, prefix);
    QFETCH(QString, file);
    QString path = folder();
    if (!file.isEmpty())
        path = write(QString(file).replace(QStringLiteral("%20"), QStringLiteral(" ")), "");
    const QString url = prefix + folder() + (file.isEmpty() ? QString() : QLatin1Char('/') + file);
    std::string type;
    const std::string name = theme().getURLIconName(url.toLocal8Bit().constData(), &type);
    const QMimeType expected = QMimeDatabase().mimeTypeForFile(path);
    QVERIFY(!expected.isDefault());
    QCOMPARE(QString::fromStdString(name), expected.iconName());
    QCOMPARE(QString::fromStdString(type), expected.name());
}

void tst_VelIconTheme::takesAPathAsItStands()
{
    const QString path = write(QStringLiteral("100%20#?.png"), "");
    QCOMPARE(theme().getURLIconName(path.toLocal8Bit().constData(), nullptr), std::string("image-png"));
}

void tst_VelIconTheme::knowsNoIconForAFileThatDoesNotExist()
{
    std::string type;
    const QByteArray path = this->path(QStringLiteral("gone.png")).toLocal8Bit();
    QCOMPARE(theme().getURLIconName(path.constData(), &type), std::string("unknown"));
    QCOMPARE(type, std::string("application/octet-stream"));
    QCOMPARE(theme().getURLIconName(("file://" + path).constData(), &type), std::string("unknown"));
}

void tst_VelIconTheme::leavesTheMimeTypeOutWhenNobodyAsks()
{
    QCOMPARE(theme().getURLIconName("http://example.org", nullptr), std::string("text-html"));
}

void tst_VelIconTheme::findsTheFileOfAnIcon()
{
    const IconThemeFolder icons(folder(), QStringLiteral("pictures"));
    icons.write();
    icons.add(QStringLiteral("editor"), Qt::red);
    icons.use();
    const auto file = [](const char *name, int size) {
        return QString::fromStdString(theme().getIconFile(name, size, VelIconTheme::AllIconFiles));
    };
    QCOMPARE(QFileInfo(file("editor", 22)).fileName(), QStringLiteral("editor.png"));
    QCOMPARE(QImage(file("editor", 22)).size(), QSize(22, 22));
    QCOMPARE(QImage(file("editor.svg", 8)).size(), QSize(8, 8));
    QCOMPARE(QImage(file("editor-special", 200)).size(), QSize(32, 32));
    QCOMPARE(file("browser", 22), QString());
    const QString own = write(QStringLiteral("own.svgz"), "x");
    QCOMPARE(file(own.toUtf8().constData(), 22), own);
}

void tst_VelIconTheme::leavesDrawingsOutForWhatCannotDraw()
{
    const IconThemeFolder icons(folder(), QStringLiteral("both"));
    icons.write();
    icons.add(QStringLiteral("editor"), Qt::red, 8);
    icons.use();
    const QString picture =
        QString::fromStdString(theme().getIconFile("editor", 8, VelIconTheme::PictureFiles));
    const QString drawing = QFileInfo(QFileInfo(picture).path()).path() + QStringLiteral("/32/editor.svg");
    write(QDir(folder()).relativeFilePath(drawing), "<svg/>");
    VelIconTheme::current(VelIconTheme::DoForceLoad);
    QCOMPARE(QString::fromStdString(theme().getIconFile("editor", 32, VelIconTheme::PictureFiles)), picture);
    const QString own = write(QStringLiteral("own.SVGZ"), "x");
    QCOMPARE(theme().getIconFile(own.toStdString(), 32, VelIconTheme::PictureFiles), std::string());
}

void tst_VelIconTheme::findsNoFileOutsideTheTheme()
{
    const IconThemeFolder icons(folder(), QStringLiteral("narrow"));
    icons.write();
    icons.use();
    write(QStringLiteral("secret.png"), "x");
    for (const char *name : {"../secret", "", "/nowhere/at/all.png", "/"})
        QCOMPARE(theme().getIconFile(name, 22, VelIconTheme::AllIconFiles), std::string());
}

VEL_TEST_MAIN(tst_VelIconTheme)

#include "tst_VelIconTheme.moc"
