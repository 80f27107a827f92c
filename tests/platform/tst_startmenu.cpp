// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "TestCase.h"

#include <velintegration/startmenu.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QDirIterator>
#include <QFileInfo>

#include <csignal>

#include <sys/resource.h>
#include <unistd.h>

class StartMenuTest : public TestCase
{
    Q_OBJECT

private:
    QString menu() const { return path(QStringLiteral("config/vel/startmenu")); }
    QString inMenu(const QString &name) const { return menu() + QLatin1Char('/') + name; }
    bool create() const { return CreateStartMenu(QFile::encodeName(menu()).constData(), nullptr); }
    QString install(const QString &name, const QByteArray &categories, const QByteArray &more = QByteArray())
    {
        return write(QStringLiteral("home/applications/") + name,
                     "[Desktop Entry]\nType=Application\nName=" + QFileInfo(name).completeBaseName().toUtf8()
                         + "\nExec=true\nCategories=" + categories + '\n' + more);
    }
    static QStringList names(const QString &folder)
    {
        return QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                                      QDir::Name);
    }
    static QMap<QString, QByteArray> tree(const QString &folder);
    QStringList sortOrder(const QString &folder) const
    {
        return VelUIDesktopEntry(folder + QStringLiteral("/.directory")).getSortOrder();
    }

private Q_SLOTS:
    void init();
    void cleanup();

    void refusesAnEmptyDirectory();
    void isTheBareRootWithoutApplications();
    void groupsByTheFirstMainCategory_data();
    void groupsByTheFirstMainCategory();
    void ordersTheFoldersAsTheStandardDoes();
    void makesNoFolderWithoutApplications();
    void namesEveryFolderInAllLanguages_data();
    void namesEveryFolderInAllLanguages();
    void givesEveryFolderAnIconOfItsOwn();
    void ordersTheEntriesByTheirShownNames();
    void ordersEntriesOfOneNameByTheirFiles();
    void listsOddFileNames();
    void leavesOutWhatIsNotDisplayable_data();
    void leavesOutWhatIsNotDisplayable();
    void hidesAnIdThatWasSeenEarlier();
    void hidesAnIdBehindWhatIsNoApplication_data();
    void hidesAnIdBehindWhatIsNoApplication();
    void findsApplicationsInSubfolders();
    void survivesLinksInACircle();
    void usesTheDefaultDirectories_data();
    void usesTheDefaultDirectories();
    void namesThatClashGetTheirIds();
    void namesThatClashWithAnIdGetTheirsToo();
    void entriesAreIndependentCopies();
    void copiesCanBeWritten();
    void theSameInputGivesTheSameTree();
    void replacesTheOldMenu();
    void missingParentsAreMade();
    void aLinkIsFollowed();
    void aDanglingLinkIsFollowed();
    void aCircleOfLinksIsRefused();
    void linksInTheOldMenuAreNotFollowed();
    void keepsThePermissionsOfTheOldMenu();
    void removesReadOnlyFoldersOfTheOldMenu();
    void aFullDiskLeavesTheOldMenuWhole();
    void aFileInTheWayStays();
    void madeParentsGoWhenItFails();
    void aTemplateIsCopiedInstead();
    void aTemplateIsCopiedWithoutLinks();
    void aTemplateMayHoldTheMenu();
    void aMissingTemplateLeavesTheOldMenuWhole();
    void theSampleMenuShowsAllItsEntries();
};

void StartMenuTest::init()
{
    TestCase::init();
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("home"))));
    qputenv(
        "XDG_DATA_DIRS",
        QFile::encodeName(path(QStringLiteral("local")) + QLatin1Char(':') + path(QStringLiteral("system"))));
    qputenv("LC_ALL", "C.UTF-8");
}

void StartMenuTest::cleanup()
{
    qunsetenv("LC_ALL");
    TestCase::cleanup();
}

QMap<QString, QByteArray> StartMenuTest::tree(const QString &folder)
{
    QMap<QString, QByteArray> files;
    QDirIterator it(folder, QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                    QDirIterator::Subdirectories);
    while (it.hasNext()) {
        const QString path = it.next();
        const QString name = path.mid(folder.size() + 1);
        files.insert(name,
                     it.fileInfo().isSymLink()   ? QByteArray("link")
                         : it.fileInfo().isDir() ? QByteArray("folder")
                                                 : read(path));
    }
    return files;
}

void StartMenuTest::refusesAnEmptyDirectory()
{
    QVERIFY(!CreateStartMenu(nullptr, nullptr));
    QVERIFY(!CreateStartMenu("", nullptr));
    QVERIFY(!CreateStartMenu("/", nullptr));
}

void StartMenuTest::isTheBareRootWithoutApplications()
{
    QVERIFY(create());
    QCOMPARE(names(menu()), QStringList(QStringLiteral(".directory")));
    const VelUIDesktopEntry root(inMenu(QStringLiteral(".directory")));
    QCOMPARE(root.getType(), QStringLiteral("Directory"));
    QCOMPARE(root.getName(), QStringLiteral("Start Menu"));
    QCOMPARE(root.getSortOrder(), QStringList());
}

void StartMenuTest::groupsByTheFirstMainCategory_data()
{
    QTest::addColumn<QByteArray>("categories");
    QTest::addColumn<QString>("folder");
    const QPair<const char *, const char *> rows[] = {
        {"", "Other"},
        {"WebBrowser;", "Other"},
        {"X-Own;Player;", "Other"},
        {"Other;", "Other"},
        {"Other;Game;", "Game"},
        {"office;", "Other"},
        {"Office;", "Office"},
        {"Office", "Office"},
        {"WebBrowser;Network;Office;", "Network"},
        {"Office;Network;", "Office"},
        {"Audio;AudioVideo;", "Audio"},
        {"Qt;AudioVideo;Audio;", "AudioVideo"},
        {"Video;", "Video"},
        {"Development;", "Development"},
        {"Education;", "Education"},
        {"Game;", "Game"},
        {"Graphics;", "Graphics"},
        {"Science;Education;", "Science"},
        {"Settings;", "Settings"},
        {"System;", "System"},
        {"Utility;", "Utility"},
    };
    for (const auto &row : rows)
        QTest::addRow("%s", *row.first ? row.first : "none")
            << QByteArray(row.first) << QString::fromLatin1(row.second);
}

void StartMenuTest::groupsByTheFirstMainCategory()
{
    QFETCH(QByteArray, categories);
    QFETCH(QString, folder);
    install(QStringLiteral("app.desktop"), categories);
    QVERIFY(create());
    QCOMPARE(names(menu()), QStringList({QStringLiteral(".directory"), folder}));
    QCOMPARE(names(inMenu(folder)),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop")}));
}

void StartMenuTest::ordersTheFoldersAsTheStandardDoes()
{
    const QByteArrayList categories = {"",        "Utility",   "System", "Settings",  "Science",     "Office",
                                       "Network", "Graphics",  "Game",   "Education", "Development", "Video",
                                       "Audio",   "AudioVideo"};
    for (const QByteArray &category : categories)
        install(QString::fromLatin1("app" + category.toLower() + ".desktop"), category + ';');
    QVERIFY(create());
    const QString expected = QStringLiteral("AudioVideo Audio Video Development Education Game Graphics "
                                            "Network Office Science Settings System Utility "
                                            "Other");
    QCOMPARE(sortOrder(menu()).join(QLatin1Char(' ')), expected);
    QCOMPARE(names(menu()).size(), 15);
}

void StartMenuTest::makesNoFolderWithoutApplications()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;", "NoDisplay=true\n");
    QVERIFY(create());
    QCOMPARE(names(menu()), QStringList({QStringLiteral(".directory"), QStringLiteral("Game")}));
    QCOMPARE(sortOrder(menu()), QStringList(QStringLiteral("Game")));
}

void StartMenuTest::namesEveryFolderInAllLanguages_data()
{
    QTest::addColumn<QString>("folder");
    QTest::addColumn<QString>("english");
    QTest::addColumn<QString>("german");
    QTest::addColumn<QString>("chinese");
    QTest::newRow("root") << ""
                          << "Start Menu" << QStringLiteral("Startmenü") << QStringLiteral("开始菜单");
    QTest::newRow("Game") << "Game"
                          << "Games"
                          << "Spiele" << QStringLiteral("游戏");
    QTest::newRow("Network") << "Network"
                             << "Internet"
                             << "Internet" << QStringLiteral("互联网");
    QTest::newRow("Office") << "Office"
                            << "Office" << QStringLiteral("Büro") << QStringLiteral("办公");
    QTest::newRow("Other") << "Other"
                           << "Other"
                           << "Sonstiges" << QStringLiteral("其他");
}

void StartMenuTest::namesEveryFolderInAllLanguages()
{
    QFETCH(QString, folder);
    QFETCH(QString, english);
    QFETCH(QString, german);
    QFETCH(QString, chinese);
    for (const char *category : {"Game", "Network", "Office", ""})
        install(QString::fromLatin1(category) + QStringLiteral("app.desktop"), category);
    QVERIFY(create());
    const QString file = inMenu(folder) + QStringLiteral("/.directory");
    QCOMPARE(VelUIDesktopEntry(file).getName(), english);
    qputenv("LC_ALL", "de_AT.UTF-8");
    QCOMPARE(VelUIDesktopEntry(file).getLocalName(), german);
    qputenv("LC_ALL", "zh_CN.UTF-8");
    QCOMPARE(VelUIDesktopEntry(file).getLocalName(), chinese);
    const QByteArray bytes = read(file);
    const QString prefix = QStringLiteral("libveluiextra_");
    const QStringList catalogues =
        QDir(QStringLiteral(VEL_SOURCE_DIR "/translations")).entryList({prefix + QStringLiteral("*.ts")});
    QVERIFY(!catalogues.isEmpty());
    for (const QString &catalogue : catalogues) {
        const QByteArray language = catalogue.mid(prefix.size()).chopped(3).toUtf8();
        QVERIFY2(bytes.count("\nName[" + language + "]=") == 1, language.constData());
    }
    QCOMPARE(bytes.count("\nName["), catalogues.size());
}

void StartMenuTest::givesEveryFolderAnIconOfItsOwn()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Settings;");
    install(QStringLiteral("c.desktop"), "");
    QVERIFY(create());
    const auto icon = [this](const char *folder) {
        return VelUIDesktopEntry(inMenu(QString::fromLatin1(folder) + QStringLiteral("/.directory")))
            .getIcon();
    };
    QCOMPARE(icon("Game"), QStringLiteral("applications-games"));
    QCOMPARE(icon("Settings"), QStringLiteral("preferences-desktop"));
    QCOMPARE(icon("Other"), QStringLiteral("applications-other"));
    QCOMPARE(icon("."), QStringLiteral("start-here"));
}

void StartMenuTest::ordersTheEntriesByTheirShownNames()
{
    install(QStringLiteral("1.desktop"), "Game;", "Name[de]=Zebra\n");
    write(QStringLiteral("home/applications/2.desktop"),
          "[Desktop Entry]\nType=Application\nName=apple\nName[de]=Äpfel\nExec=true\nCategories=Game;\n");
    write(QStringLiteral("home/applications/3.desktop"),
          "[Desktop Entry]\nType=Application\nName=Banana\nExec=true\nCategories=Game;\n");
    QVERIFY(create());
    const auto list = [](const char *names) { return QString::fromLatin1(names).split(QLatin1Char(' ')); };
    QCOMPARE(sortOrder(inMenu(QStringLiteral("Game"))), list("1.desktop 2.desktop 3.desktop"));
    qputenv("LC_ALL", "de_DE.UTF-8");
    QVERIFY(create());
    QCOMPARE(sortOrder(inMenu(QStringLiteral("Game"))), list("2.desktop 3.desktop 1.desktop"));
}

void StartMenuTest::ordersEntriesOfOneNameByTheirFiles()
{
    const QByteArray entry = "[Desktop Entry]\nType=Application\nName=Same\nExec=true\nCategories=Game;\n";
    write(QStringLiteral("home/applications/z.desktop"), entry);
    write(QStringLiteral("system/applications/a.desktop"), entry);
    write(QStringLiteral("system/applications/b.desktop"), QByteArray(entry).replace("Same", "same"));
    QVERIFY(create());
    QCOMPARE(
        sortOrder(inMenu(QStringLiteral("Game"))),
        QStringList({QStringLiteral("a.desktop"), QStringLiteral("b.desktop"), QStringLiteral("z.desktop")}));
}

void StartMenuTest::listsOddFileNames()
{
    const QStringList names = {QStringLiteral(" a.desktop"), QStringLiteral("a;b.desktop"),
                               QStringLiteral("c\\d.desktop"), QStringLiteral("e f.desktop"),
                               QStringLiteral("g\nh.desktop")};
    for (int i = 0; i < names.size(); ++i)
        write(QStringLiteral("home/applications/") + names.at(i),
              "[Desktop Entry]\nType=Application\nName=" + QByteArray::number(i)
                  + "\nExec=true\nCategories=Game;\n");
    QVERIFY(create());
    QCOMPARE(sortOrder(inMenu(QStringLiteral("Game"))), names);
}

void StartMenuTest::leavesOutWhatIsNotDisplayable_data()
{
    QTest::addColumn<QByteArray>("entry");
    const QByteArray start = "[Desktop Entry]\nType=Application\nName=x\nExec=true\nCategories=Game;\n";
    QTest::newRow("hidden") << start + "Hidden=true\n";
    QTest::newRow("not for display") << start + "NoDisplay=true\n";
    QTest::newRow("only for another desktop") << start + "OnlyShowIn=ELSE;\n";
    QTest::newRow("not for this desktop") << start + "NotShowIn=VEL;\n";
    QTest::newRow("program not installed") << start + "TryExec=/no/such/program\n";
    QTest::newRow("link") << QByteArray("[Desktop Entry]\nType=Link\nName=x\nURL=http://localhost/\n");
    QTest::newRow("directory") << QByteArray("[Desktop Entry]\nType=Directory\nName=x\n");
    QTest::newRow("no entry") << QByteArray("garbage\n\0\xff", 10);
    QTest::newRow("empty") << QByteArray();
}

void StartMenuTest::leavesOutWhatIsNotDisplayable()
{
    QFETCH(QByteArray, entry);
    write(QStringLiteral("home/applications/x.desktop"), entry);
    install(QStringLiteral("shown.desktop"), "Game;", "OnlyShowIn=VEL;\n");
    QVERIFY(create());
    QCOMPARE(names(menu()), QStringList({QStringLiteral(".directory"), QStringLiteral("Game")}));
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("shown.desktop")}));
}

void StartMenuTest::hidesAnIdThatWasSeenEarlier()
{
    const QByteArray entry = "[Desktop Entry]\nType=Application\nExec=true\nCategories=Game;\nName=";
    write(QStringLiteral("system/applications/a.desktop"), entry + "system");
    write(QStringLiteral("local/applications/a.desktop"), entry + "local");
    write(QStringLiteral("system/applications/b.desktop"), entry + "system");
    write(QStringLiteral("home/applications/b.desktop"), entry + "home");
    write(QStringLiteral("system/applications/vendor/c.desktop"), entry + "system");
    write(QStringLiteral("local/applications/vendor-c.desktop"), entry + "local");
    QVERIFY(create());
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("a.desktop"),
                          QStringLiteral("b.desktop"), QStringLiteral("vendor-c.desktop")}));
    QCOMPARE(read(inMenu(QStringLiteral("Game/a.desktop"))), entry + "local");
    QCOMPARE(read(inMenu(QStringLiteral("Game/b.desktop"))), entry + "home");
}

void StartMenuTest::hidesAnIdBehindWhatIsNoApplication_data()
{
    QTest::addColumn<QString>("kind");
    for (const char *kind : {"hidden entry", "garbage", "link to /dev/null", "link to nowhere"})
        QTest::newRow(kind) << QString::fromLatin1(kind);
}

void StartMenuTest::hidesAnIdBehindWhatIsNoApplication()
{
    QFETCH(QString, kind);
    const QByteArray entry = "[Desktop Entry]\nType=Application\nExec=true\nCategories=Game;\nName=x\n";
    write(QStringLiteral("system/applications/a.desktop"), entry);
    QDir().mkpath(path(QStringLiteral("home/applications")));
    const QString hiding = path(QStringLiteral("home/applications/a.desktop"));
    if (kind == QLatin1String("hidden entry"))
        write(QStringLiteral("home/applications/a.desktop"), entry + "Hidden=true\n");
    else if (kind == QLatin1String("garbage"))
        write(QStringLiteral("home/applications/a.desktop"), "garbage");
    else
        QVERIFY(QFile::link(kind.mid(8), hiding));
    QVERIFY(create());
    QCOMPARE(names(menu()), QStringList(QStringLiteral(".directory")));
}

void StartMenuTest::findsApplicationsInSubfolders()
{
    install(QStringLiteral("one/two/app.desktop"), "Game;");
    install(QStringLiteral(".hidden.desktop"), "Game;");
    write(QStringLiteral("home/applications/one/notes.txt"), "no entry");
    QVERIFY(create());
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop")}));
}

void StartMenuTest::survivesLinksInACircle()
{
    install(QStringLiteral("sub/app.desktop"), "Game;");
    QVERIFY(QFile::link(path(QStringLiteral("home/applications")),
                        path(QStringLiteral("home/applications/sub/up"))));
    QVERIFY(QFile::link(QStringLiteral("self"), path(QStringLiteral("home/applications/self"))));
    QVERIFY(create());
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop")}));
}

void StartMenuTest::usesTheDefaultDirectories_data()
{
    QTest::addColumn<QByteArray>("dataHome");
    QTest::newRow("none set") << QByteArray();
    QTest::newRow("no absolute path") << QByteArray("relative");
}

void StartMenuTest::usesTheDefaultDirectories()
{
    QFETCH(QByteArray, dataHome);
    const QByteArray home = qgetenv("HOME");
    qputenv("HOME", QFile::encodeName(folder()));
    if (dataHome.isEmpty())
        qunsetenv("XDG_DATA_HOME");
    else
        qputenv("XDG_DATA_HOME", dataHome);
    qputenv("XDG_DATA_DIRS", "relative");
    write(QStringLiteral(".local/share/applications/a.desktop"),
          "[Desktop Entry]\nType=Application\nExec=true\nCategories=Game;\nName=x\n");
    const bool created = create();
    qputenv("HOME", home);
    QVERIFY(created);
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("a.desktop")}));
}

void StartMenuTest::namesThatClashGetTheirIds()
{
    install(QStringLiteral("app.desktop"), "Game;");
    install(QStringLiteral("one/app.desktop"), "Game;");
    install(QStringLiteral("two/three/app.desktop"), "Game;");
    install(QStringLiteral("four/app.desktop"), "Office;");
    QVERIFY(create());
    const QStringList expected = {QStringLiteral("app.desktop"), QStringLiteral("one-app.desktop"),
                                  QStringLiteral("two-three-app.desktop")};
    QCOMPARE(names(inMenu(QStringLiteral("Game"))), QStringList(QStringLiteral(".directory")) + expected);
    QCOMPARE(sortOrder(inMenu(QStringLiteral("Game"))), expected);
    QCOMPARE(names(inMenu(QStringLiteral("Office"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop")}));
}

void StartMenuTest::namesThatClashWithAnIdGetTheirsToo()
{
    install(QStringLiteral("app.desktop"), "Game;");
    install(QStringLiteral("one/app.desktop"), "Game;");
    install(QStringLiteral("sub/one-app.desktop"), "Game;");
    QVERIFY(create());
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop"),
                          QStringLiteral("one-app.desktop"), QStringLiteral("sub-one-app.desktop")}));
}

void StartMenuTest::entriesAreIndependentCopies()
{
    const QString original = install(QStringLiteral("real.desktop"), "Game;", "# comment\nX-Own=1\n");
    QVERIFY(QFile::link(original, path(QStringLiteral("home/applications/linked.desktop"))));
    const QByteArray bytes = read(original);
    QVERIFY(create());
    for (const char *name : {"Game/real.desktop", "Game/linked.desktop"}) {
        const QString copy = inMenu(QString::fromLatin1(name));
        QVERIFY(!QFileInfo(copy).isSymLink());
        QCOMPARE(read(copy), bytes);
        QFile file(copy);
        QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Truncate));
    }
    QCOMPARE(read(original), bytes);
}

void StartMenuTest::copiesCanBeWritten()
{
    const QString original = install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(QFile::setPermissions(original, QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther));
    QVERIFY(create());
    QVERIFY(QFileInfo(inMenu(QStringLiteral("Game/a.desktop"))).permissions() & QFile::WriteOwner);
    QVERIFY(!(QFileInfo(original).permissions() & QFile::WriteOwner));
}

void StartMenuTest::theSameInputGivesTheSameTree()
{
    for (int i = 0; i < 40; ++i)
        install(QStringLiteral("app%1.desktop").arg((i * 17) % 40), i % 2 ? "Game;" : "Office;");
    install(QStringLiteral("one/app1.desktop"), "Game;");
    QVERIFY(create());
    const QMap<QString, QByteArray> first = tree(menu());
    QVERIFY(first.size() > 41);
    QVERIFY(create());
    QCOMPARE(tree(menu()), first);
    const QString other = path(QStringLiteral("other"));
    QVERIFY(CreateStartMenu(QFile::encodeName(other).constData(), nullptr));
    QCOMPARE(tree(other), first);
}

void StartMenuTest::replacesTheOldMenu()
{
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("config/vel/startmenu/Game/mine.desktop"), "[Desktop Entry]\n");
    write(QStringLiteral("config/vel/startmenu/Mine/.directory"), "[Desktop Entry]\n");
    QVERIFY(create());
    QCOMPARE(tree(menu()).keys(),
             QStringList({QStringLiteral(".directory"), QStringLiteral("Game"),
                          QStringLiteral("Game/.directory"), QStringLiteral("Game/a.desktop")}));
    QCOMPARE(names(path(QStringLiteral("config/vel"))), QStringList(QStringLiteral("startmenu")));
}

void StartMenuTest::missingParentsAreMade()
{
    const QString deep = path(QStringLiteral("one/two/three/menu/"));
    QVERIFY(CreateStartMenu(QFile::encodeName(deep).constData(), nullptr));
    QVERIFY(QFile::exists(path(QStringLiteral("one/two/three/menu/.directory"))));
    QCOMPARE(names(path(QStringLiteral("one/two/three"))), QStringList(QStringLiteral("menu")));
}

void StartMenuTest::aLinkIsFollowed()
{
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("real/menu/old.desktop"), "[Desktop Entry]\n");
    QDir().mkpath(path(QStringLiteral("config/vel")));
    QVERIFY(QFile::link(path(QStringLiteral("real/menu")), menu()));
    QVERIFY(create());
    QVERIFY(QFileInfo(menu()).isSymLink());
    QCOMPARE(names(path(QStringLiteral("real/menu"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("Game")}));
    QCOMPARE(names(path(QStringLiteral("real"))), QStringList(QStringLiteral("menu")));
}

void StartMenuTest::aDanglingLinkIsFollowed()
{
    QDir().mkpath(path(QStringLiteral("config/vel")));
    QVERIFY(QFile::link(QStringLiteral("../../real/menu"), menu()));
    QVERIFY(create());
    QVERIFY(QFileInfo(menu()).isSymLink());
    QCOMPARE(names(path(QStringLiteral("real/menu"))), QStringList(QStringLiteral(".directory")));
}

void StartMenuTest::aCircleOfLinksIsRefused()
{
    QDir().mkpath(path(QStringLiteral("config/vel")));
    QVERIFY(QFile::link(QStringLiteral("startmenu"), menu()));
    QVERIFY(!create());
    QVERIFY(QFileInfo(menu()).isSymLink());
    QCOMPARE(names(path(QStringLiteral("config/vel"))), QStringList(QStringLiteral("startmenu")));
}

void StartMenuTest::linksInTheOldMenuAreNotFollowed()
{
    const QString precious = write(QStringLiteral("precious/file"), "x");
    QDir().mkpath(menu());
    QVERIFY(QFile::link(path(QStringLiteral("precious")), inMenu(QStringLiteral("link"))));
    QVERIFY(create());
    QCOMPARE(read(precious), QByteArray("x"));
    QCOMPARE(names(menu()), QStringList(QStringLiteral(".directory")));
}

void StartMenuTest::keepsThePermissionsOfTheOldMenu()
{
    const auto permissions = QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner;
    QDir().mkpath(menu());
    QVERIFY(QFile::setPermissions(menu(), permissions));
    QVERIFY(create());
    QCOMPARE(QFileInfo(menu()).permissions() & (QFile::ReadGroup | QFile::ReadOther), QFile::Permissions());
}

void StartMenuTest::removesReadOnlyFoldersOfTheOldMenu()
{
    write(QStringLiteral("config/vel/startmenu/a/b/c.desktop"), "[Desktop Entry]\n");
    for (const char *name : {"a/b", "a"})
        QVERIFY(QFile::setPermissions(inMenu(QString::fromLatin1(name)), QFile::ReadOwner | QFile::ExeOwner));
    const OrdinaryUser user(folder());
    QVERIFY(create());
    QCOMPARE(names(path(QStringLiteral("config/vel"))), QStringList(QStringLiteral("startmenu")));
}

void StartMenuTest::aFullDiskLeavesTheOldMenuWhole()
{
    install(QStringLiteral("large.desktop"), "Game;", "# " + QByteArray(9000, 'x') + '\n');
    write(QStringLiteral("config/vel/startmenu/Mine/mine.desktop"), "[Desktop Entry]\n");
    const QMap<QString, QByteArray> before = tree(path(QStringLiteral("config")));
    rlimit limit;
    getrlimit(RLIMIT_FSIZE, &limit);
    const rlimit small = {5000, limit.rlim_max};
    const auto previous = std::signal(SIGXFSZ, SIG_IGN);
    setrlimit(RLIMIT_FSIZE, &small);
    const bool created = create();
    setrlimit(RLIMIT_FSIZE, &limit);
    std::signal(SIGXFSZ, previous);
    QVERIFY(!created);
    QCOMPARE(tree(path(QStringLiteral("config"))), before);
}

void StartMenuTest::aFileInTheWayStays()
{
    write(QStringLiteral("config/vel/startmenu"), "a file");
    QVERIFY(!create());
    QCOMPARE(read(menu()), QByteArray("a file"));
    QCOMPARE(names(path(QStringLiteral("config/vel"))), QStringList(QStringLiteral("startmenu")));
}

void StartMenuTest::madeParentsGoWhenItFails()
{
    install(QStringLiteral("large.desktop"), "Game;", "# " + QByteArray(9000, 'x') + '\n');
    rlimit limit;
    getrlimit(RLIMIT_FSIZE, &limit);
    const rlimit small = {5000, limit.rlim_max};
    const auto previous = std::signal(SIGXFSZ, SIG_IGN);
    setrlimit(RLIMIT_FSIZE, &small);
    const bool created = create();
    setrlimit(RLIMIT_FSIZE, &limit);
    std::signal(SIGXFSZ, previous);
    QVERIFY(!created);
    QCOMPARE(names(folder()), QStringList(QStringLiteral("home")));
}

void StartMenuTest::aTemplateIsCopiedInstead()
{
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("config/vel/startmenu/old.desktop"), "[Desktop Entry]\n");
    write(QStringLiteral("template/.directory"), "[Desktop Entry]\nSortOrder=b;a;\n");
    write(QStringLiteral("template/a/x.desktop"), "anything\0at all");
    QDir().mkpath(path(QStringLiteral("template/b")));
    const QByteArray from = QFile::encodeName(path(QStringLiteral("template")));
    QVERIFY(CreateStartMenu(QFile::encodeName(menu()).constData(), from.constData()));
    QCOMPARE(tree(menu()), tree(path(QStringLiteral("template"))));
    // An empty name is none.
    QVERIFY(CreateStartMenu(QFile::encodeName(menu()).constData(), ""));
    QVERIFY(QFile::exists(inMenu(QStringLiteral("Game/a.desktop"))));
}

void StartMenuTest::aTemplateIsCopiedWithoutLinks()
{
    const QString file = write(QStringLiteral("real/x.desktop"), "x");
    QDir().mkpath(path(QStringLiteral("template/sub")));
    QVERIFY(QFile::link(file, path(QStringLiteral("template/file.desktop"))));
    QVERIFY(QFile::link(path(QStringLiteral("real")), path(QStringLiteral("template/folder"))));
    QVERIFY(QFile::link(QStringLiteral("nowhere"), path(QStringLiteral("template/dangling"))));
    QVERIFY(QFile::link(path(QStringLiteral("template")), path(QStringLiteral("template/sub/up"))));
    const QByteArray from = QFile::encodeName(path(QStringLiteral("template")));
    QVERIFY(CreateStartMenu(QFile::encodeName(menu()).constData(), from.constData()));
    const QMap<QString, QByteArray> expected = {{QStringLiteral("file.desktop"), "x"},
                                                {QStringLiteral("folder"), "folder"},
                                                {QStringLiteral("folder/x.desktop"), "x"},
                                                {QStringLiteral("sub"), "folder"}};
    QCOMPARE(tree(menu()), expected);
}

void StartMenuTest::aTemplateMayHoldTheMenu()
{
    write(QStringLiteral("config/vel/x.desktop"), "x");
    const QByteArray from = QFile::encodeName(path(QStringLiteral("config")));
    QVERIFY(CreateStartMenu(QFile::encodeName(menu()).constData(), from.constData()));
    QCOMPARE(tree(menu()).keys(), QStringList({QStringLiteral("vel"), QStringLiteral("vel/x.desktop")}));
}

void StartMenuTest::aMissingTemplateLeavesTheOldMenuWhole()
{
    write(QStringLiteral("config/vel/startmenu/old.desktop"), "[Desktop Entry]\n");
    const QMap<QString, QByteArray> before = tree(path(QStringLiteral("config")));
    const QByteArray from = QFile::encodeName(path(QStringLiteral("missing")));
    QVERIFY(!CreateStartMenu(QFile::encodeName(menu()).constData(), from.constData()));
    QCOMPARE(tree(path(QStringLiteral("config"))), before);
}

void StartMenuTest::theSampleMenuShowsAllItsEntries()
{
    const QString sample = QStringLiteral(VEL_SOURCE_DIR "/data/sample");
    qputenv("XDG_DATA_DIRS", QFile::encodeName(sample));
    QVERIFY(create());
    QStringList shown;
    const QMap<QString, QByteArray> files = tree(menu());
    for (auto it = files.begin(); it != files.end(); ++it) {
        if (it.key().endsWith(QLatin1String(".desktop")))
            shown.append(QFileInfo(it.key()).fileName());
    }
    shown.sort();
    QCOMPARE(shown, names(sample + QStringLiteral("/applications")));
    QVERIFY(shown.size() >= 10);
    QVERIFY(!sortOrder(menu()).contains(QStringLiteral("Other")));
}

VEL_TEST_GUILESS_MAIN(StartMenuTest)
#include "tst_startmenu.moc"
