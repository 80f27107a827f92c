// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velcore/dirs.h>

#include <QDir>

#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

class DirsTest : public TestCase
{
    Q_OBJECT

private:
    static QString dir(VelDir kind) { return QString::fromStdString(GetVelDir(kind)); }
    static void setPath(const char *name, const QString &path) { qputenv(name, QFile::encodeName(path)); }

private Q_SLOTS:
    void init();
    void ownVariableIsTheConfigurationRoot();
    void xdgVariableComesBeforeTheHome();
    void homeIsTheLastResort();
    void variablesThatHoldNoAbsolutePathCountAsNotSet();
    void menuAndToolBarLieBelowTheRoot();
    void everyCallReadsTheEnvironmentAnew();
    void theHomeMayBeTheRoot();
    void trailingSlashesAreDropped();
    void nothingIsCreatedByAsking();
    void unknownKindsAreEmpty_data();
    void unknownKindsAreEmpty();
    void theNumbersAreThoseOfTheDesktop();
    void desktopIsInTheHomeWithoutUserDirs();
    void desktopIsTheOneOfUserDirs_data();
    void desktopIsTheOneOfUserDirs();
    void userDirsAreASmallFile_data();
    void userDirsAreASmallFile();
    void userDirsLieInTheConfigurationOfTheUser();
    void theUserDataBaseKnowsTheHomeWhenNothingElseDoes();
    void picturesLieInTheDataDirectory();
    void picturesAreTheInstalledOnesOtherwise();
};

void DirsTest::init()
{
    TestCase::init();
    for (const char *name : {"VEL_CONFIG_HOME", "XDG_CONFIG_HOME", "VEL_DATA_DIR"})
        qunsetenv(name);
    setPath("HOME", folder());
}

void DirsTest::ownVariableIsTheConfigurationRoot()
{
    setPath("XDG_CONFIG_HOME", path(QStringLiteral("xdg")));
    setPath("VEL_CONFIG_HOME", path(QStringLiteral("own")));
    QCOMPARE(dir(VelDir::WindowManagerConfig), path(QStringLiteral("own")));
}

void DirsTest::xdgVariableComesBeforeTheHome()
{
    setPath("XDG_CONFIG_HOME", path(QStringLiteral("xdg")));
    QCOMPARE(dir(VelDir::WindowManagerConfig), path(QStringLiteral("xdg/vel")));
    qputenv("VEL_CONFIG_HOME", "");
    QCOMPARE(dir(VelDir::WindowManagerConfig), path(QStringLiteral("xdg/vel")));
}

void DirsTest::homeIsTheLastResort()
{
    QCOMPARE(dir(VelDir::WindowManagerConfig), path(QStringLiteral(".config/vel")));
    qputenv("XDG_CONFIG_HOME", "");
    QCOMPARE(dir(VelDir::WindowManagerConfig), path(QStringLiteral(".config/vel")));
}

void DirsTest::variablesThatHoldNoAbsolutePathCountAsNotSet()
{
    qputenv("VEL_CONFIG_HOME", "own");
    qputenv("XDG_CONFIG_HOME", "xdg");
    QCOMPARE(dir(VelDir::WindowManagerConfig), path(QStringLiteral(".config/vel")));
}

void DirsTest::menuAndToolBarLieBelowTheRoot()
{
    setPath("VEL_CONFIG_HOME", path(QStringLiteral("own")));
    QCOMPARE(dir(VelDir::StartMenu), path(QStringLiteral("own/startmenu")));
    QCOMPARE(dir(VelDir::ToolBar), path(QStringLiteral("own/toolbar")));
    qputenv("VEL_CONFIG_HOME", "/");
    QCOMPARE(dir(VelDir::StartMenu), QStringLiteral("/startmenu"));
}

void DirsTest::everyCallReadsTheEnvironmentAnew()
{
    setPath("VEL_CONFIG_HOME", path(QStringLiteral("one")));
    QCOMPARE(dir(VelDir::StartMenu), path(QStringLiteral("one/startmenu")));
    setPath("VEL_CONFIG_HOME", path(QStringLiteral("two")));
    QCOMPARE(dir(VelDir::StartMenu), path(QStringLiteral("two/startmenu")));
}

void DirsTest::theHomeMayBeTheRoot()
{
    qputenv("HOME", "/");
    qunsetenv("XDG_CONFIG_HOME");
    QCOMPARE(dir(VelDir::Desktop), QStringLiteral("/Desktop"));
    QCOMPARE(dir(VelDir::StartMenu), QStringLiteral("/.config/vel/startmenu"));
}

void DirsTest::trailingSlashesAreDropped()
{
    setPath("VEL_CONFIG_HOME", path(QStringLiteral("own//")));
    QCOMPARE(dir(VelDir::WindowManagerConfig), path(QStringLiteral("own")));
    QCOMPARE(dir(VelDir::StartMenu), path(QStringLiteral("own/startmenu")));
    setPath("VEL_DATA_DIR", path(QStringLiteral("data/")));
    QCOMPARE(dir(VelDir::Pictures), path(QStringLiteral("data/pixmaps")));
    setPath("HOME", folder() + QLatin1Char('/'));
    QCOMPARE(dir(VelDir::Desktop), path(QStringLiteral("Desktop")));
}

void DirsTest::nothingIsCreatedByAsking()
{
    for (VelDir kind :
         {VelDir::WindowManagerConfig, VelDir::StartMenu, VelDir::Desktop, VelDir::Pictures, VelDir::ToolBar})
        QVERIFY(!dir(kind).isEmpty());
    QVERIFY(QDir(folder()).isEmpty());
}

void DirsTest::unknownKindsAreEmpty_data()
{
    QTest::addColumn<int>("kind");
    for (int kind : {-1, 0, 1, 3, 5, 7, 14, 16, 18, 1000})
        QTest::addRow("%d", kind) << kind;
}

void DirsTest::unknownKindsAreEmpty()
{
    QFETCH(int, kind);
    QCOMPARE(dir(static_cast<VelDir>(kind)), QString());
}

void DirsTest::theNumbersAreThoseOfTheDesktop()
{
    QCOMPARE(static_cast<int>(VelDir::WindowManagerConfig), 2);
    QCOMPARE(static_cast<int>(VelDir::StartMenu), 4);
    QCOMPARE(static_cast<int>(VelDir::Desktop), 6);
    QCOMPARE(static_cast<int>(VelDir::Pictures), 15);
    QCOMPARE(static_cast<int>(VelDir::ToolBar), 17);
}

void DirsTest::desktopIsInTheHomeWithoutUserDirs()
{
    QCOMPARE(dir(VelDir::Desktop), path(QStringLiteral("Desktop")));
}

void DirsTest::desktopIsTheOneOfUserDirs_data()
{
    QTest::addColumn<QByteArray>("file");
    QTest::addColumn<QString>("expected");

    QTest::newRow("empty file") << QByteArray() << "~/Desktop";
    QTest::newRow("relative is no form of the file")
        << QByteArray("XDG_DESKTOP_DIR=\"Tisch\"\n") << "~/Desktop";
    QTest::newRow("without quotes") << QByteArray("XDG_DESKTOP_DIR=/Tisch\n") << "~/Desktop";
    QTest::newRow("comment") << QByteArray("#XDG_DESKTOP_DIR=\"$HOME/Tisch\"\n") << "~/Desktop";
    QTest::newRow("another variable of the same end")
        << QByteArray("MY_XDG_DESKTOP_DIR=\"$HOME/Tisch\"\n") << "~/Desktop";
    QTest::newRow("another home") << QByteArray("XDG_DESKTOP_DIR=\"$HOMER/Tisch\"\n") << "~/Desktop";
    QTest::newRow("in the home") << QByteArray("XDG_DESKTOP_DIR=\"$HOME/Schreibtisch\"\n")
                                 << "~/Schreibtisch";
    QTest::newRow("absolute") << QByteArray("XDG_DESKTOP_DIR=\"/srv/desk\"\n") << "/srv/desk";
    QTest::newRow("trailing slash") << QByteArray("XDG_DESKTOP_DIR=\"/srv/desk/\"\n") << "/srv/desk";
    QTest::newRow("the home itself") << QByteArray("XDG_DESKTOP_DIR=\"$HOME/\"\n") << "~";
    QTest::newRow("escaped") << QByteArray("XDG_DESKTOP_DIR=\"$HOME/a\\\"b\\\\c\"\n") << "~/a\"b\\c";
    QTest::newRow("blanks") << QByteArray("  XDG_DESKTOP_DIR = \"$HOME/a b\"  \r\n") << "~/a b";
    QTest::newRow("UTF-8") << QByteArray("XDG_DESKTOP_DIR=\"$HOME/Bür\xc3\xb6\"\n")
                           << QStringLiteral("~/Bürö");
    QTest::newRow("the last counts") << QByteArray(
        "XDG_DESKTOP_DIR=\"/one\"\nXDG_MUSIC_DIR=\"/m\"\nXDG_DESKTOP_DIR=\"/two\"")
                                     << "/two";
}

void DirsTest::desktopIsTheOneOfUserDirs()
{
    QFETCH(QByteArray, file);
    QFETCH(QString, expected);
    // The file is the user's, not one of this desktop: the own root has no say.
    setPath("VEL_CONFIG_HOME", path(QStringLiteral("own")));
    write(QStringLiteral(".config/user-dirs.dirs"), file);
    if (expected.startsWith(QLatin1Char('~')))
        expected.replace(0, 1, folder());
    QCOMPARE(dir(VelDir::Desktop), expected);
}

void DirsTest::userDirsAreASmallFile_data()
{
    QTest::addColumn<QString>("kind");
    QTest::newRow("named pipe") << QStringLiteral("pipe");
    QTest::newRow("device") << QStringLiteral("device");
    QTest::newRow("folder") << QStringLiteral("folder");
    QTest::newRow("too large") << QStringLiteral("large");
}

void DirsTest::userDirsAreASmallFile()
{
    QFETCH(QString, kind);
    const QString file = path(QStringLiteral(".config/user-dirs.dirs"));
    QVERIFY(QDir().mkpath(path(QStringLiteral(".config"))));
    if (kind == QLatin1String("pipe"))
        QCOMPARE(mkfifo(QFile::encodeName(file).constData(), 0600), 0);
    else if (kind == QLatin1String("device"))
        QVERIFY(QFile::link(QStringLiteral("/dev/zero"), file));
    else if (kind == QLatin1String("folder"))
        QVERIFY(QDir().mkpath(file));
    else
        write(QStringLiteral(".config/user-dirs.dirs"),
              "XDG_DESKTOP_DIR=\"/srv/desk\"\n" + QByteArray(1024 * 1024, '#'));
    QCOMPARE(dir(VelDir::Desktop), path(QStringLiteral("Desktop")));
}

void DirsTest::userDirsLieInTheConfigurationOfTheUser()
{
    write(QStringLiteral(".config/user-dirs.dirs"), "XDG_DESKTOP_DIR=\"/home's\"\n");
    write(QStringLiteral("xdg/user-dirs.dirs"), "XDG_DESKTOP_DIR=\"/xdg's\"\n");
    QCOMPARE(dir(VelDir::Desktop), QStringLiteral("/home's"));
    setPath("XDG_CONFIG_HOME", path(QStringLiteral("xdg")));
    QCOMPARE(dir(VelDir::Desktop), QStringLiteral("/xdg's"));
}

void DirsTest::theUserDataBaseKnowsTheHomeWhenNothingElseDoes()
{
    const QByteArray home = qgetenv("HOME");
    qunsetenv("HOME");
    const QString root = dir(VelDir::WindowManagerConfig);
    qputenv("HOME", home);
    const passwd *user = getpwuid(getuid());
    QVERIFY(user);
    QCOMPARE(root, QDir::cleanPath(QFile::decodeName(user->pw_dir) + QStringLiteral("/.config/vel")));
}

void DirsTest::picturesLieInTheDataDirectory()
{
    setPath("VEL_DATA_DIR", path(QStringLiteral("data")));
    QCOMPARE(dir(VelDir::Pictures), path(QStringLiteral("data/pixmaps")));
}

void DirsTest::picturesAreTheInstalledOnesOtherwise()
{
    QCOMPARE(dir(VelDir::Pictures), QStringLiteral(VEL_INSTALLED_DATA_DIR "/pixmaps"));
}

VEL_TEST_GUILESS_MAIN(DirsTest)
#include "tst_dirs.moc"
