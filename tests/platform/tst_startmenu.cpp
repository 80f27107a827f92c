// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenuTestCase.h"

#include <velintegration/startmenu.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QElapsedTimer>

#include <unistd.h>

#include <cerrno>
#include <ctime>

/// Which applications stand in a start menu, in which folders, and in which order.
class tst_startmenu : public StartMenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void refusesAnEmptyDirectory();
    void refusesAMenuWithoutApplications_data();
    void refusesAMenuWithoutApplications();
    void groupsByTheFirstMainCategory_data();
    void groupsByTheFirstMainCategory();
    void ordersTheFoldersAsTheStandardDoes();
    void makesNoFolderWithoutApplications();
    void namesEveryFolderInAllLanguages_data();
    void namesEveryFolderInAllLanguages();
    void givesEveryFolderAnIconOfItsOwn();
    void ordersTheEntriesByTheirShownNames();
    void ordersEntriesOfOneNameByTheirFiles();
    void ordersEntriesSoonWhoseNamesAreDear();
    void listsOddFileNames();
    void leavesOutWhatIsNotDisplayable_data();
    void leavesOutWhatIsNotDisplayable();
    void hidesAnIdThatWasSeenEarlier();
    void hidesAnIdBehindWhatIsNoApplication_data();
    void hidesAnIdBehindWhatIsNoApplication();
    void findsApplicationsInSubfolders();
    void survivesLinksInACircle();
    void survivesLinksThatMakeFoldersWithoutEnd();
    void usesTheDefaultDirectories_data();
    void usesTheDefaultDirectories();
    void namesThatClashGetTheirIds();
    void namesThatClashWithAnIdGetTheirsToo();
};

void tst_startmenu::refusesAnEmptyDirectory()
{
    QVERIFY(!CreateStartMenu(nullptr, nullptr));
    QVERIFY(!CreateStartMenu("", nullptr));
    QVERIFY(!CreateStartMenu("/", nullptr));
}

void tst_startmenu::refusesAMenuWithoutApplications_data()
{
    QTest::addColumn<bool>("hasOld");
    QTest::addColumn<bool>("hasHidden");
    QTest::newRow("no menu") << false << false;
    QTest::newRow("a menu") << true << false;
    QTest::newRow("only what is not shown") << true << true;
}

void tst_startmenu::refusesAMenuWithoutApplications()
{
    QFETCH(bool, hasOld);
    QFETCH(bool, hasHidden);
    if (hasHidden)
        install(QStringLiteral("a.desktop"), "Game;", "NoDisplay=true\n");
    if (hasOld) {
        write(QStringLiteral("config/vel/startmenu/mine.desktop"), "mine");
        write(QStringLiteral("config/vel/startmenu.previous/older.desktop"), "older");
    }
    const QMap<QString, QByteArray> before = tree(folder());
    QVERIFY(!create());
    QCOMPARE(errno, ENODATA);
    QCOMPARE(tree(folder()), before);
}

void tst_startmenu::groupsByTheFirstMainCategory_data()
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

void tst_startmenu::groupsByTheFirstMainCategory()
{
    QFETCH(QByteArray, categories);
    QFETCH(QString, folder);
    install(QStringLiteral("app.desktop"), categories);
    QVERIFY(create());
    QCOMPARE(names(menu()), QStringList({QStringLiteral(".directory"), folder}));
    QCOMPARE(names(inMenu(folder)),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop")}));
}

void tst_startmenu::ordersTheFoldersAsTheStandardDoes()
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

void tst_startmenu::makesNoFolderWithoutApplications()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Office;", "NoDisplay=true\n");
    QVERIFY(create());
    QCOMPARE(names(menu()), QStringList({QStringLiteral(".directory"), QStringLiteral("Game")}));
    QCOMPARE(sortOrder(menu()), QStringList(QStringLiteral("Game")));
}

void tst_startmenu::namesEveryFolderInAllLanguages_data()
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

void tst_startmenu::namesEveryFolderInAllLanguages()
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
    const QStringList catalogs =
        QDir(QStringLiteral(VEL_SOURCE_DIR "/translations")).entryList({prefix + QStringLiteral("*.ts")});
    QVERIFY(!catalogs.isEmpty());
    for (const QString &catalog : catalogs) {
        const QByteArray language = catalog.mid(prefix.size()).chopped(3).toUtf8();
        QVERIFY2(bytes.count("\nName[" + language + "]=") == 1, language.constData());
    }
    QCOMPARE(bytes.count("\nName["), catalogs.size());
}

void tst_startmenu::givesEveryFolderAnIconOfItsOwn()
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

void tst_startmenu::ordersTheEntriesByTheirShownNames()
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

void tst_startmenu::ordersEntriesOfOneNameByTheirFiles()
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

// In processor time, of which a quadratic way takes minutes.
void tst_startmenu::ordersEntriesSoonWhoseNamesAreDear()
{
    const QByteArray marks = QByteArray("\u0301").repeated(100000) + QByteArray("\u0316").repeated(100000);
    for (const char *name : {"a", "A"})
        write(QStringLiteral("home/applications/%1.desktop").arg(QLatin1String(name)),
              "[Desktop Entry]\nType=Application\nName=" + QByteArray(name) + marks + name
                  + "\nExec=true\nCategories=Game;\n");
    qputenv("LC_ALL", "de_DE.UTF-8");
    const std::clock_t start = std::clock();
    QVERIFY(create());
    QVERIFY((std::clock() - start) / CLOCKS_PER_SEC < 10);
    QCOMPARE(sortOrder(inMenu(QStringLiteral("Game"))).size(), 2);
}

void tst_startmenu::listsOddFileNames()
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

void tst_startmenu::leavesOutWhatIsNotDisplayable_data()
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

void tst_startmenu::leavesOutWhatIsNotDisplayable()
{
    QFETCH(QByteArray, entry);
    write(QStringLiteral("home/applications/x.desktop"), entry);
    install(QStringLiteral("shown.desktop"), "Game;", "OnlyShowIn=VEL;\n");
    QVERIFY(create());
    QCOMPARE(names(menu()), QStringList({QStringLiteral(".directory"), QStringLiteral("Game")}));
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("shown.desktop")}));
}

void tst_startmenu::hidesAnIdThatWasSeenEarlier()
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

void tst_startmenu::hidesAnIdBehindWhatIsNoApplication_data()
{
    QTest::addColumn<QString>("kind");
    for (const char *kind : {"hidden entry", "garbage", "link to /dev/null", "link to nowhere"})
        QTest::newRow(kind) << QString::fromLatin1(kind);
}

void tst_startmenu::hidesAnIdBehindWhatIsNoApplication()
{
    QFETCH(QString, kind);
    const QByteArray entry = "[Desktop Entry]\nType=Application\nExec=true\nCategories=Game;\nName=x\n";
    write(QStringLiteral("system/applications/a.desktop"), entry);
    write(QStringLiteral("system/applications/other.desktop"), entry);
    QDir().mkpath(path(QStringLiteral("home/applications")));
    const QString hiding = path(QStringLiteral("home/applications/a.desktop"));
    if (kind == QLatin1String("hidden entry"))
        write(QStringLiteral("home/applications/a.desktop"), entry + "Hidden=true\n");
    else if (kind == QLatin1String("garbage"))
        write(QStringLiteral("home/applications/a.desktop"), "garbage");
    else
        QVERIFY(QFile::link(kind.mid(8), hiding));
    QVERIFY(create());
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("other.desktop")}));
}

void tst_startmenu::findsApplicationsInSubfolders()
{
    install(QStringLiteral("one/two/app.desktop"), "Game;");
    install(QStringLiteral(".hidden.desktop"), "Game;");
    write(QStringLiteral("home/applications/one/notes.txt"), "no entry");
    QVERIFY(create());
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop")}));
}

void tst_startmenu::survivesLinksInACircle()
{
    install(QStringLiteral("sub/app.desktop"), "Game;");
    QVERIFY(QFile::link(path(QStringLiteral("home/applications")),
                        path(QStringLiteral("home/applications/sub/up"))));
    QVERIFY(QFile::link(QStringLiteral("self"), path(QStringLiteral("home/applications/self"))));
    QVERIFY(create());
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop")}));
}

void tst_startmenu::survivesLinksThatMakeFoldersWithoutEnd()
{
    install(QStringLiteral("0.desktop"), "Utility;");
    for (int i = 1; i <= 20; ++i) {
        for (const QString &link : {QStringLiteral("/1a"), QStringLiteral("/1b")}) {
            const QString level =
                path(i == 1 ? QStringLiteral("home/applications") : QStringLiteral("level%1").arg(i));
            QVERIFY(QDir().mkpath(level));
            QVERIFY(QFile::link(path(QStringLiteral("level%1").arg(i + 1)), level + link));
        }
    }
    write(QStringLiteral("level21/x.desktop"), "[Desktop Entry]\nType=Application\nName=x\nExec=true\n");
    QElapsedTimer timer;
    timer.start();
    QVERIFY(create());
    QVERIFY2(timer.elapsed() < 20000, qPrintable(QString::number(timer.elapsed())));
    QVERIFY(QFileInfo::exists(inMenu(QStringLiteral("Utility/0.desktop"))));
}

void tst_startmenu::usesTheDefaultDirectories_data()
{
    QTest::addColumn<QByteArray>("dataHome");
    QTest::newRow("none set") << QByteArray();
    QTest::newRow("no absolute path") << QByteArray("relative");
}

void tst_startmenu::usesTheDefaultDirectories()
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

void tst_startmenu::namesThatClashGetTheirIds()
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

void tst_startmenu::namesThatClashWithAnIdGetTheirsToo()
{
    install(QStringLiteral("app.desktop"), "Game;");
    install(QStringLiteral("one/app.desktop"), "Game;");
    install(QStringLiteral("sub/one-app.desktop"), "Game;");
    QVERIFY(create());
    QCOMPARE(names(inMenu(QStringLiteral("Game"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("app.desktop"),
                          QStringLiteral("one-app.desktop"), QStringLiteral("sub-one-app.desktop")}));
}

VEL_TEST_GUILESS_MAIN(tst_startmenu)
#include "tst_startmenu.moc"
