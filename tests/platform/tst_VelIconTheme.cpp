// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconThemeFolder.h"
#include "TestCase.h"

#include <veluiaux/VelIcon.h>
#include <veluiaux/VelIconTheme.h>

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

VEL_TEST_MAIN(tst_VelIconTheme)

#include "tst_VelIconTheme.moc"
