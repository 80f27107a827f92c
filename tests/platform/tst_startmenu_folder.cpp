// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "StartMenuTestCase.h"

#include <velintegration/startmenu.h>

#include <QDir>
#include <QFileInfo>

#include <cerrno>
#include <csignal>

#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

/// How a start menu takes the place of the old one, and the copy of a template.
class tst_startmenu_folder : public StartMenuTestCase
{
    Q_OBJECT

private:
    static uint modeOf(const QString &file)
    {
        struct stat status = {};
        return stat(QFile::encodeName(file).constData(), &status) == 0 ? status.st_mode & 07777 : 0;
    }

private Q_SLOTS:
    void entriesAreIndependentCopies();
    void copiesCanBeWritten();
    void copiesFollowTheUmask();
    void copiesOfATemplateFollowTheUmask();
    void theSameInputGivesTheSameTree();
    void replacesTheOldMenu();
    void keepsTheMenuThatWasReplacedLast();
    void keepsThePreviousMenuWhereThereIsNoOldOne();
    void replacesWhateverStandsInThePlaceOfThePreviousMenu_data();
    void replacesWhateverStandsInThePlaceOfThePreviousMenu();
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
    void aTemplateWithoutEndLeavesTheOldMenuWhole();
    void aMissingTemplateLeavesTheOldMenuWhole();
    void theSampleMenuShowsAllItsEntries();
};

void tst_startmenu_folder::entriesAreIndependentCopies()
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

void tst_startmenu_folder::copiesCanBeWritten()
{
    const QString original = install(QStringLiteral("a.desktop"), "Game;");
    QVERIFY(QFile::setPermissions(original, QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther));
    QVERIFY(create());
    QVERIFY(QFileInfo(inMenu(QStringLiteral("Game/a.desktop"))).permissions() & QFile::WriteOwner);
    QVERIFY(!(QFileInfo(original).permissions() & QFile::WriteOwner));
}

void tst_startmenu_folder::copiesFollowTheUmask()
{
    const QByteArray original = QFile::encodeName(install(QStringLiteral("a.desktop"), "Game;"));
    QCOMPARE(chmod(original.constData(), 06777), 0);
    const mode_t previous = umask(022);
    const bool created = create();
    umask(previous);
    QVERIFY(created);
    QCOMPARE(modeOf(inMenu(QStringLiteral("Game/a.desktop"))), 0755U);
}

void tst_startmenu_folder::copiesOfATemplateFollowTheUmask()
{
    write(QStringLiteral("template/open/a.desktop"), "a");
    write(QStringLiteral("template/closed/b.desktop"), "b");
    const auto set = [this](const char *name, mode_t mode) {
        return chmod(qPrintable(path(QStringLiteral("template/") + QLatin1String(name))), mode) == 0;
    };
    QVERIFY(set("open", 07777) && set("open/a.desktop", 0666) && set("closed", 0700)
            && set("closed/b.desktop", 04600));
    const mode_t previous = umask(022);
    const bool created =
        CreateStartMenu(QFile::encodeName(menu()).constData(), qPrintable(path(QStringLiteral("template"))));
    umask(previous);
    QVERIFY(created);
    QCOMPARE(modeOf(inMenu(QStringLiteral("open"))), 0755U);
    QCOMPARE(modeOf(inMenu(QStringLiteral("open/a.desktop"))), 0644U);
    QCOMPARE(modeOf(inMenu(QStringLiteral("closed"))), 0700U);
    QCOMPARE(modeOf(inMenu(QStringLiteral("closed/b.desktop"))), 0600U);
}

void tst_startmenu_folder::theSameInputGivesTheSameTree()
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

void tst_startmenu_folder::replacesTheOldMenu()
{
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("config/vel/startmenu/Game/mine.desktop"), "[Desktop Entry]\n");
    write(QStringLiteral("config/vel/startmenu/Mine/.directory"), "[Desktop Entry]\n");
    QVERIFY(create());
    QCOMPARE(tree(menu()).keys(),
             QStringList({QStringLiteral(".directory"), QStringLiteral("Game"),
                          QStringLiteral("Game/.directory"), QStringLiteral("Game/a.desktop")}));
    QCOMPARE(names(path(QStringLiteral("config/vel"))),
             QStringList({QStringLiteral("startmenu"), QStringLiteral("startmenu.previous")}));
}

void tst_startmenu_folder::keepsTheMenuThatWasReplacedLast()
{
    install(QStringLiteral("a.desktop"), "Game;");
    const QString previous = menu() + QStringLiteral(".previous");
    for (const char *name : {"first", "second", "third"}) {
        write(QStringLiteral("config/vel/startmenu/sub/%1.desktop").arg(QLatin1String(name)), name);
        QCOMPARE(chmod(qPrintable(inMenu(QStringLiteral("sub"))), 0711), 0);
        const QMap<QString, QByteArray> old = tree(menu());
        QVERIFY(create());
        QCOMPARE(tree(previous), old);
        QCOMPARE(modeOf(previous + QStringLiteral("/sub")), 0711U);
        QVERIFY(!QFile::exists(inMenu(QStringLiteral("sub"))));
        QCOMPARE(names(path(QStringLiteral("config/vel"))),
                 QStringList({QStringLiteral("startmenu"), QStringLiteral("startmenu.previous")}));
    }
}

void tst_startmenu_folder::keepsThePreviousMenuWhereThereIsNoOldOne()
{
    install(QStringLiteral("a.desktop"), "Game;");
    const QString kept = write(QStringLiteral("config/vel/startmenu.previous/mine.desktop"), "mine");
    QVERIFY(create());
    QCOMPARE(read(kept), QByteArray("mine"));
}

void tst_startmenu_folder::replacesWhateverStandsInThePlaceOfThePreviousMenu_data()
{
    QTest::addColumn<QString>("kind");
    for (const char *kind : {"file", "link", "dangling link"})
        QTest::newRow(kind) << QString::fromLatin1(kind);
}

void tst_startmenu_folder::replacesWhateverStandsInThePlaceOfThePreviousMenu()
{
    QFETCH(QString, kind);
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("config/vel/startmenu/mine.desktop"), "mine");
    const QString precious = write(QStringLiteral("precious/file"), "x");
    const QString previous = menu() + QStringLiteral(".previous");
    if (kind == QLatin1String("file"))
        write(QStringLiteral("config/vel/startmenu.previous"), "a file");
    else
        QVERIFY(QFile::link(
            path(kind == QLatin1String("link") ? QStringLiteral("precious") : QStringLiteral("none")),
            previous));
    QVERIFY(create());
    QVERIFY(!QFileInfo(previous).isSymLink());
    QCOMPARE(names(previous), QStringList(QStringLiteral("mine.desktop")));
    QCOMPARE(read(precious), QByteArray("x"));
    QVERIFY(!QFile::exists(path(QStringLiteral("none"))));
    QCOMPARE(names(path(QStringLiteral("config/vel"))),
             QStringList({QStringLiteral("startmenu"), QStringLiteral("startmenu.previous")}));
}

void tst_startmenu_folder::missingParentsAreMade()
{
    install(QStringLiteral("a.desktop"), "Game;");
    const QString deep = path(QStringLiteral("one/two/three/menu/"));
    QVERIFY(CreateStartMenu(QFile::encodeName(deep).constData(), nullptr));
    QVERIFY(QFile::exists(path(QStringLiteral("one/two/three/menu/.directory"))));
    QCOMPARE(names(path(QStringLiteral("one/two/three"))), QStringList(QStringLiteral("menu")));
}

void tst_startmenu_folder::aLinkIsFollowed()
{
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("real/menu/old.desktop"), "[Desktop Entry]\n");
    QDir().mkpath(path(QStringLiteral("config/vel")));
    QVERIFY(QFile::link(path(QStringLiteral("real/menu")), menu()));
    QVERIFY(create());
    QVERIFY(QFileInfo(menu()).isSymLink());
    QCOMPARE(names(path(QStringLiteral("real/menu"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("Game")}));
    QCOMPARE(names(path(QStringLiteral("real"))),
             QStringList({QStringLiteral("menu"), QStringLiteral("menu.previous")}));
    QCOMPARE(names(path(QStringLiteral("real/menu.previous"))), QStringList(QStringLiteral("old.desktop")));
    QCOMPARE(names(path(QStringLiteral("config/vel"))), QStringList(QStringLiteral("startmenu")));
}

void tst_startmenu_folder::aDanglingLinkIsFollowed()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QDir().mkpath(path(QStringLiteral("config/vel")));
    QVERIFY(QFile::link(QStringLiteral("../../real/menu"), menu()));
    QVERIFY(create());
    QVERIFY(QFileInfo(menu()).isSymLink());
    QCOMPARE(names(path(QStringLiteral("real/menu"))),
             QStringList({QStringLiteral(".directory"), QStringLiteral("Game")}));
}

void tst_startmenu_folder::aCircleOfLinksIsRefused()
{
    QDir().mkpath(path(QStringLiteral("config/vel")));
    QVERIFY(QFile::link(QStringLiteral("startmenu"), menu()));
    QVERIFY(!create());
    QCOMPARE(errno, EPERM);
    QVERIFY(QFileInfo(menu()).isSymLink());
    QCOMPARE(names(path(QStringLiteral("config/vel"))), QStringList(QStringLiteral("startmenu")));
}

void tst_startmenu_folder::linksInTheOldMenuAreNotFollowed()
{
    install(QStringLiteral("a.desktop"), "Game;");
    const QString precious = write(QStringLiteral("precious/file"), "x");
    QDir().mkpath(menu());
    QVERIFY(QFile::link(path(QStringLiteral("precious")), inMenu(QStringLiteral("link"))));
    // The first time it is kept, the second time it goes.
    QVERIFY(create());
    QCOMPARE(names(menu() + QStringLiteral(".previous")), QStringList(QStringLiteral("link")));
    QVERIFY(create());
    QCOMPARE(read(precious), QByteArray("x"));
    QCOMPARE(names(menu()), QStringList({QStringLiteral(".directory"), QStringLiteral("Game")}));
}

void tst_startmenu_folder::keepsThePermissionsOfTheOldMenu()
{
    const auto permissions = QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner;
    install(QStringLiteral("a.desktop"), "Game;");
    QDir().mkpath(menu());
    QVERIFY(QFile::setPermissions(menu(), permissions));
    QVERIFY(create());
    QCOMPARE(QFileInfo(menu()).permissions() & (QFile::ReadGroup | QFile::ReadOther), QFile::Permissions());
}

void tst_startmenu_folder::removesReadOnlyFoldersOfTheOldMenu()
{
    install(QStringLiteral("a.desktop"), "Game;");
    write(QStringLiteral("config/vel/startmenu/a/b/c.desktop"), "[Desktop Entry]\n");
    for (const char *name : {"a/b", "a"})
        QVERIFY(QFile::setPermissions(inMenu(QString::fromLatin1(name)), QFile::ReadOwner | QFile::ExeOwner));
    const OrdinaryUser user(folder());
    QVERIFY(create());
    QVERIFY(create());
    QVERIFY(!QFile::exists(menu() + QStringLiteral(".previous/a")));
    QCOMPARE(names(path(QStringLiteral("config/vel"))),
             QStringList({QStringLiteral("startmenu"), QStringLiteral("startmenu.previous")}));
}

void tst_startmenu_folder::aFullDiskLeavesTheOldMenuWhole()
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
    const int error = errno;
    setrlimit(RLIMIT_FSIZE, &limit);
    std::signal(SIGXFSZ, previous);
    QVERIFY(!created);
    QCOMPARE(error, EFBIG);
    QCOMPARE(tree(path(QStringLiteral("config"))), before);
}

void tst_startmenu_folder::aFileInTheWayStays()
{
    write(QStringLiteral("config/vel/startmenu"), "a file");
    QVERIFY(!create());
    QCOMPARE(errno, ENOTDIR);
    QCOMPARE(read(menu()), QByteArray("a file"));
    QCOMPARE(names(path(QStringLiteral("config/vel"))), QStringList(QStringLiteral("startmenu")));
}

void tst_startmenu_folder::madeParentsGoWhenItFails()
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

void tst_startmenu_folder::aTemplateIsCopiedInstead()
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

void tst_startmenu_folder::aTemplateIsCopiedWithoutLinks()
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

void tst_startmenu_folder::aTemplateWithoutEndLeavesTheOldMenuWhole()
{
    write(QStringLiteral("config/vel/startmenu/a.desktop"), "old");
    const auto before = tree(path(QStringLiteral("config")));
    for (int i = 1; i <= 16; ++i) {
        const QString level = path(QStringLiteral("level%1").arg(i));
        QVERIFY(QDir().mkpath(level));
        for (const QString &link : {QStringLiteral("/a"), QStringLiteral("/b")})
            QVERIFY(QFile::link(path(QStringLiteral("level%1").arg(i + 1)), level + link));
    }
    write(QStringLiteral("level17/x.desktop"), "x");
    const QByteArray from = QFile::encodeName(path(QStringLiteral("level1")));
    QVERIFY(!CreateStartMenu(QFile::encodeName(menu()).constData(), from.constData()));
    QCOMPARE(tree(path(QStringLiteral("config"))), before);
}

void tst_startmenu_folder::aTemplateMayHoldTheMenu()
{
    write(QStringLiteral("config/vel/x.desktop"), "x");
    const QByteArray from = QFile::encodeName(path(QStringLiteral("config")));
    QVERIFY(CreateStartMenu(QFile::encodeName(menu()).constData(), from.constData()));
    QCOMPARE(tree(menu()).keys(), QStringList({QStringLiteral("vel"), QStringLiteral("vel/x.desktop")}));
}

void tst_startmenu_folder::aMissingTemplateLeavesTheOldMenuWhole()
{
    write(QStringLiteral("config/vel/startmenu/old.desktop"), "[Desktop Entry]\n");
    const QMap<QString, QByteArray> before = tree(path(QStringLiteral("config")));
    const QByteArray from = QFile::encodeName(path(QStringLiteral("missing")));
    QVERIFY(!CreateStartMenu(QFile::encodeName(menu()).constData(), from.constData()));
    QCOMPARE(tree(path(QStringLiteral("config"))), before);
}

void tst_startmenu_folder::theSampleMenuShowsAllItsEntries()
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

VEL_TEST_GUILESS_MAIN(tst_startmenu_folder)
#include "tst_startmenu_folder.moc"
