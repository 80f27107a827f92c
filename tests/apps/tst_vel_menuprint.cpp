// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OddName.h"
#include "TestCase.h"

#include <MenuFormat.h>
#include <MenuTree.h>

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QXmlStreamReader>

#include <sys/stat.h>
#include <utime.h>

namespace {

struct Result
{
    int status;
    QByteArray out;
    QByteArray err;
};

Result print(const QStringList &arguments, const QByteArray &input = QByteArray())
{
    QProcess process;
    process.start(QStringLiteral(VEL_PROGRAM), arguments);
    process.write(input);
    process.closeWriteChannel();
    if (!process.waitForFinished())
        QTest::qFail("the program hangs", __FILE__, __LINE__);
    return {process.exitCode(), process.readAllStandardOutput(), process.readAllStandardError()};
}

QStringList names(const QVector<MenuItem> &items)
{
    QStringList result;
    for (const MenuItem &item : items)
        result.append(item.name);
    return result;
}

int itemCount(const MenuItem &item)
{
    int count = 1;
    for (const MenuItem &child : item.children)
        count += itemCount(child);
    return count;
}

// A home of its own, for as long as this object lives.
class Home
{
public:
    explicit Home(const QString &folder)
    {
        const QPair<const char *, const char *> places[] = {
            {"VEL_CONFIG_HOME", "/config"}, {"XDG_DATA_HOME", "/data"}, {"XDG_DATA_DIRS", "/none"}};
        for (const auto &place : places) {
            m_before.append({place.first, qgetenv(place.first)});
            qputenv(place.first, QFile::encodeName(folder) + place.second);
        }
    }
    ~Home()
    {
        for (const auto &[name, value] : m_before) {
            if (value.isEmpty())
                qunsetenv(name);
            else
                qputenv(name, value);
        }
    }
    Q_DISABLE_COPY_MOVE(Home)

private:
    QVector<QPair<const char *, QByteArray>> m_before;
};

QByteArray entry(const QByteArray &name, const QByteArray &more = QByteArray())
{
    return "[Desktop Entry]\nType=Application\nName=" + name + "\nExec=true\n" + more;
}

} // namespace

class tst_vel_menuprint : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void refusesWhatItCannotPrint_data();
    void refusesWhatItCannotPrint();
    void printsFoldersFirstThenNames();
    void followsTheSortOrder();
    void putsTheNewestFirstInRecents();
    void leavesOutWhatIsNotShown();
    void showsAllBesideANameThatIsNoText();
    void doesNotFollowALinkIntoItself();
    void endsWhereLinksMakeAMenuWithoutEnd();
    void endsWhereFoldersLieTooDeep();
    void tellsThatAMenuIsNotWhole();
    void namesFoldersAsTheirDirectoryFileSays();
    void printsTheStartMenuWithoutADirectory();
    void makesTheStartMenuOfAFreshHome_data();
    void makesTheStartMenuOfAFreshHome();
    void showsWhatWasInstalledSince();
    void saysWhyThereIsNoStartMenu_data();
    void saysWhyThereIsNoStartMenu();
    void saysThatTheStartMenuIsEmpty_data();
    void saysThatTheStartMenuIsEmpty();
    void changesNoOtherDirectory();
    void printsText();
    void printsNoControlCharacterAsText();
    void tellsNoControlCharacterOfAPath();
    void printsJson();
    void printsAnOpenboxPipeMenu();
    void printsNamesThatXmlCannotHold();
    void startsTheChosenLine();
    void startsNothingWhenNothingWasChosen();
    void tellsThatTheChosenLineIsNotInTheMenu();
    void tellsOfPathsThatAFormatCannotHold();
    void refusesIconSizesThatNobodyHas_data();
    void refusesIconSizesThatNobodyHas();
    void tellsThatItCannotWrite();
    void quotesPathsForTheShell_data();
    void quotesPathsForTheShell();

private:
    /// Makes folders "level1" and so on, each with two links to the next one.
    void doubleLevels(int count)
    {
        for (int i = 1; i <= count; ++i) {
            const QString level = path(QStringLiteral("level%1").arg(i));
            QVERIFY(QDir().mkpath(level));
            for (const QString &link : {QStringLiteral("/a"), QStringLiteral("/b")})
                QVERIFY(QFile::link(path(QStringLiteral("level%1").arg(i + 1)), level + link));
        }
        QVERIFY(QDir().mkpath(path(QStringLiteral("level%1").arg(count + 1))));
    }
};

void tst_vel_menuprint::refusesWhatItCannotPrint_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<QByteArray>("message");

    QTest::newRow("no such directory") << QStringList{QStringLiteral("/nowhere/at/all")}
                                       << QByteArray("vel-menuprint: no such directory: /nowhere/at/all\n");
    QTest::newRow("a file") << QStringList{QStringLiteral("/etc/passwd")}
                            << QByteArray("vel-menuprint: no such directory: /etc/passwd\n");
    QTest::newRow("unknown format") << QStringList{QStringLiteral("--format"), QStringLiteral("yaml"),
                                                   QStringLiteral("/")}
                                    << QByteArray("vel-menuprint: unknown format: yaml\n");
    QTest::newRow("unknown option") << QStringList{QStringLiteral("--nonsense")}
                                    << QByteArray("vel-menuprint: Unknown option 'nonsense'.\n");
    QTest::newRow("two directories") << QStringList{QStringLiteral("/etc"), QStringLiteral("/usr")}
                                     << QByteArray("vel-menuprint: more than one directory\n");
}

void tst_vel_menuprint::refusesWhatItCannotPrint()
{
    QFETCH(QStringList, arguments);
    QFETCH(QByteArray, message);

    const Result result = print(arguments);
    QCOMPARE(result.status, 2);
    QCOMPARE(result.out, QByteArray());
    QCOMPARE(result.err, message);
}

void tst_vel_menuprint::printsFoldersFirstThenNames()
{
    write(QStringLiteral("menu/a.desktop"), entry("Zebra"));
    write(QStringLiteral("menu/z.desktop"), entry("Apple"));
    QVERIFY(QDir().mkpath(path(QStringLiteral("menu/tools"))));

    QCOMPARE(names(MenuTree::read(path(QStringLiteral("menu"))).children),
             QStringList({QStringLiteral("tools"), QStringLiteral("Apple"), QStringLiteral("Zebra")}));
}

void tst_vel_menuprint::followsTheSortOrder()
{
    write(QStringLiteral("menu/.directory"),
          "[Desktop Entry]\nType=Directory\nName=M\nSortOrder=c.desktop;x*;a.desktop;\n");
    write(QStringLiteral("menu/a.desktop"), entry("A"));
    write(QStringLiteral("menu/b.desktop"), entry("B"));
    write(QStringLiteral("menu/c.desktop"), entry("C"));
    write(QStringLiteral("menu/x1.desktop"), entry("X"));

    QCOMPARE(
        names(MenuTree::read(path(QStringLiteral("menu"))).children),
        QStringList({QStringLiteral("C"), QStringLiteral("X"), QStringLiteral("A"), QStringLiteral("B")}));
}

void tst_vel_menuprint::putsTheNewestFirstInRecents()
{
    const utimbuf old{1000, 1000};
    const utimbuf recent{2000, 2000};
    utime(QFile::encodeName(write(QStringLiteral("recents/a.desktop"), entry("Old"))), &old);
    utime(QFile::encodeName(write(QStringLiteral("recents/b.desktop"), entry("New"))), &recent);

    QCOMPARE(names(MenuTree::read(path(QStringLiteral("recents"))).children),
             QStringList({QStringLiteral("New"), QStringLiteral("Old")}));
}

void tst_vel_menuprint::leavesOutWhatIsNotShown()
{
    write(QStringLiteral("menu/hidden.desktop"), entry("Hidden", "Hidden=true\n"));
    write(QStringLiteral("menu/elsewhere.desktop"), entry("Elsewhere", "OnlyShowIn=OTHER;\n"));
    write(QStringLiteral("menu/nodisplay.desktop"), entry("No display", "NoDisplay=true\n"));
    write(QStringLiteral("menu/.dot.desktop"), entry("Dot"));
    QVERIFY(QFile::link(path(QStringLiteral("gone")), path(QStringLiteral("menu/dangling.desktop"))));

    QCOMPARE(names(MenuTree::read(path(QStringLiteral("menu"))).children),
             QStringList{QStringLiteral("No display")});
}

void tst_vel_menuprint::showsAllBesideANameThatIsNoText()
{
    QStringList expected;
    for (int i = 0; i < 8; ++i) {
        write(QStringLiteral("menu/e%1.desktop").arg(i), entry("E" + QByteArray::number(i)));
        writeOddName(path(QStringLiteral("menu")), i);
        expected << QStringLiteral("E%1").arg(i);
    }
    const Result result = print({QStringLiteral("--format=json"), path(QStringLiteral("menu"))});
    QCOMPARE(result.err, QByteArray());
    bool isWhole = false;
    const MenuItem menu = MenuTree::read(path(QStringLiteral("menu")), &isWhole);
    QVERIFY(isWhole);
    QCOMPARE(names(menu.children), expected);
    for (const QString &name : qAsConst(expected))
        QVERIFY2(result.out.contains('"' + name.toUtf8() + '"'), result.out.constData());
}

void tst_vel_menuprint::doesNotFollowALinkIntoItself()
{
    write(QStringLiteral("menu/folder/a.desktop"), entry("A"));
    QVERIFY(QFile::link(path(QStringLiteral("menu")), path(QStringLiteral("menu/folder/again"))));

    QVERIFY(QFile::link(path(QStringLiteral("menu")), path(QStringLiteral("another way"))));

    for (const QString &way : {QStringLiteral("menu"), QStringLiteral("another way")}) {
        const MenuItem menu = MenuTree::read(path(way));
        QCOMPARE(names(menu.children), QStringList{QStringLiteral("folder")});
        QCOMPARE(names(menu.children.constFirst().children), QStringList{QStringLiteral("A")});
    }
}

void tst_vel_menuprint::endsWhereLinksMakeAMenuWithoutEnd()
{
    doubleLevels(16);
    bool isWhole = true;
    const MenuItem menu = MenuTree::read(path(QStringLiteral("level1")), &isWhole);
    QCOMPARE(isWhole, false);
    QCOMPARE(itemCount(menu), MenuTree::MostItems + 1); // and the menu itself

    QVERIFY(QDir().mkpath(path(QStringLiteral("whole/folder"))));
    MenuTree::read(path(QStringLiteral("whole")), &isWhole);
    QCOMPARE(isWhole, true);
}

void tst_vel_menuprint::endsWhereFoldersLieTooDeep()
{
    QVERIFY(QDir().mkpath(
        path(QStringLiteral("menu") + QStringLiteral("/x").repeated(MenuTree::MostLevels - 1))));
    bool isWhole = false;
    MenuTree::read(path(QStringLiteral("menu")), &isWhole);
    QCOMPARE(isWhole, true);

    QVERIFY(QDir().mkpath(
        path(QStringLiteral("menu") + QStringLiteral("/x").repeated(MenuTree::MostLevels + 8))));
    const MenuItem menu = MenuTree::read(path(QStringLiteral("menu")), &isWhole);
    QCOMPARE(isWhole, false);
    QCOMPARE(itemCount(menu), MenuTree::MostLevels);
}

void tst_vel_menuprint::tellsThatAMenuIsNotWhole()
{
    doubleLevels(16);
    const Result result = print({path(QStringLiteral("level1"))});
    QCOMPARE(result.status, 0);
    QCOMPARE(result.out.count('\n'), MenuTree::MostItems + 1);
    QCOMPARE(result.err.count('\n'), 1);
    QVERIFY2(result.err.startsWith("vel-menuprint: The menu has more than 10000 items or 32 levels"),
             result.err.constData());
}

void tst_vel_menuprint::namesFoldersAsTheirDirectoryFileSays()
{
    write(QStringLiteral("menu/office/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Office work\nIcon=folder-office\n");

    const MenuItem office = MenuTree::read(path(QStringLiteral("menu"))).children.value(0);
    QCOMPARE(office.name, QStringLiteral("Office work"));
    QCOMPARE(office.icon, QStringLiteral("folder-office"));
    QCOMPARE(office.kind, MenuItem::Folder);
}

void tst_vel_menuprint::printsTheStartMenuWithoutADirectory()
{
    const QString menu = qEnvironmentVariable("XDG_CONFIG_HOME") + QStringLiteral("/vel/startmenu");
    QVERIFY(QDir().mkpath(menu));
    QFile file(menu + QStringLiteral("/a.desktop"));
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(entry("Start"));
    file.close();

    const Result result = print({});
    QCOMPARE(result.status, 0);
    QCOMPARE(result.out, QByteArray("startmenu/\n    Start\n"));
}

void tst_vel_menuprint::makesTheStartMenuOfAFreshHome_data()
{
    QTest::addColumn<QString>("format");
    QTest::addColumn<QByteArray>("expected");
    QTest::newRow("text") << "text" << QByteArray("    Games/\n        One\n");
    QTest::newRow("openbox") << "openbox" << QByteArray("<item label=\"One\"");
    QTest::newRow("json") << "json" << QByteArray("\"name\": \"One\"");
}

void tst_vel_menuprint::makesTheStartMenuOfAFreshHome()
{
    QFETCH(QString, format);
    QFETCH(QByteArray, expected);
    const Home home(folder());
    write(QStringLiteral("data/applications/one.desktop"), entry("One", "Categories=Game;\n"));
    const Result result = print({QStringLiteral("--format"), format});
    QCOMPARE(result.status, 0);
    QCOMPARE(result.err, QByteArray());
    QVERIFY2(result.out.contains(expected), result.out.constData());
}

void tst_vel_menuprint::showsWhatWasInstalledSince()
{
    const Home home(folder());
    write(QStringLiteral("data/applications/one.desktop"), entry("One", "Categories=Game;\n"));
    QCOMPARE(print({}).out, QByteArray("Start Menu/\n    Games/\n        One\n"));
    write(QStringLiteral("data/applications/two.desktop"), entry("Two", "Categories=Game;\n"));
    const QByteArray expected("Start Menu/\n    Games/\n        One\n        Two\n");
    QCOMPARE(print({}).out, expected);
    // Also when the directory is named.
    write(QStringLiteral("data/applications/three.desktop"), entry("Apple", "Categories=Game;\n"));
    QVERIFY(print({path(QStringLiteral("config/startmenu/"))}).out.contains("Apple"));
}

void tst_vel_menuprint::saysWhyThereIsNoStartMenu_data()
{
    QTest::addColumn<bool>("hasApplication");
    QTest::addColumn<QByteArray>("why");
    QTest::newRow("no application") << false
                                    << QByteArray("The start menu is empty: no application is installed.");
    QTest::newRow("no place") << true << QByteArray("The start menu @/config/startmenu cannot be made: ");
}

void tst_vel_menuprint::saysWhyThereIsNoStartMenu()
{
    QFETCH(bool, hasApplication);
    QFETCH(QByteArray, why);
    const Home home(folder());
    if (hasApplication) {
        write(QStringLiteral("data/applications/one.desktop"), entry("One"));
        write(QStringLiteral("config"), "a file in the way");
    }
    why.replace('@', QFile::encodeName(folder()));
    const Result plain = print({});
    QCOMPARE(plain.status, 2);
    QCOMPARE(plain.out, QByteArray());
    QVERIFY2(plain.err.startsWith("vel-menuprint: " + why), plain.err.constData());
    QCOMPARE(plain.err.count('\n'), 1);
    const Result pipe = print({QStringLiteral("--format"), QStringLiteral("openbox")});
    QCOMPARE(pipe.status, 2);
    QXmlStreamReader xml(pipe.out);
    QVERIFY(xml.readNextStartElement() && xml.readNextStartElement());
    QCOMPARE(xml.name().toString(), QStringLiteral("separator"));
    QVERIFY(xml.attributes().value(QLatin1String("label")).toUtf8().startsWith(why));
}

void tst_vel_menuprint::saysThatTheStartMenuIsEmpty_data()
{
    QTest::addColumn<bool>("hasApplication");
    QTest::addColumn<QByteArray>("why");
    QTest::newRow("no application") << false
                                    << QByteArray("The start menu is empty: no application is installed.");
    QTest::newRow("all deleted") << true << QByteArray("The start menu is empty: nothing in @ is shown.");
}

void tst_vel_menuprint::saysThatTheStartMenuIsEmpty()
{
    QFETCH(bool, hasApplication);
    QFETCH(QByteArray, why);
    const Home home(folder());
    const QString menu = path(QStringLiteral("config/startmenu"));
    if (hasApplication) {
        write(QStringLiteral("data/applications/one.desktop"), entry("One"));
        QCOMPARE(print({}).status, 0);
        QVERIFY(QDir(menu + QStringLiteral("/Other")).removeRecursively());
    } else {
        QVERIFY(QDir().mkpath(menu));
    }
    why.replace('@', QFile::encodeName(menu));
    const Result plain = print({});
    QCOMPARE(plain.status, 0);
    QCOMPARE(plain.out.count('\n'), 1);
    QCOMPARE(plain.err, "vel-menuprint: " + why + '\n');
    const Result pipe = print({QStringLiteral("--format"), QStringLiteral("openbox")});
    QVERIFY2(pipe.out.contains("label=\"" + why + '"'), pipe.out.constData());
}

void tst_vel_menuprint::changesNoOtherDirectory()
{
    const Home home(folder());
    write(QStringLiteral("data/applications/one.desktop"), entry("One"));
    QVERIFY(QDir().mkpath(path(QStringLiteral("other"))));
    print({path(QStringLiteral("other"))});
    QVERIFY(QDir(path(QStringLiteral("other"))).isEmpty());
    QVERIFY(!QFile::exists(path(QStringLiteral("other.sources"))));
    QVERIFY(!QFile::exists(path(QStringLiteral("config"))));
}

void tst_vel_menuprint::printsText()
{
    write(QStringLiteral("menu/folder/a.desktop"), entry("A"));
    write(QStringLiteral("menu/line.desktop"),
          "[Desktop Entry]\nType=Application\nName=Line\nExec=VELWM_SEPARATOR\n");

    const Result result =
        print({QStringLiteral("--format"), QStringLiteral("text"), path(QStringLiteral("menu"))});
    QCOMPARE(result.status, 0);
    QCOMPARE(result.out, QByteArray("menu/\n    folder/\n        A\n    --\n"));
}

void tst_vel_menuprint::printsNoControlCharacterAsText()
{
    write(QStringLiteral("menu/plain \x1b[2Jtext"), "text");
    write(QStringLiteral("menu/z.desktop"),
          entry("a\x1b]0;b\x07"
                "c\x7f"
                "d\xC2\x9B"
                "e\\tf\\rg\xC3\xB6"));

    const Result result = print({path(QStringLiteral("menu"))});
    QCOMPARE(result.status, 0);
    QCOMPARE(result.out, QByteArray("menu/\n    a?]0;b?c?d?e?f g\xC3\xB6\n    plain ?[2Jtext\n"));
    QCOMPARE(result.err, QByteArray());
}

void tst_vel_menuprint::tellsNoControlCharacterOfAPath()
{
    const Result result = print({QStringLiteral("/nowhere\x1b[2J\n")});
    QCOMPARE(result.status, 2);
    QCOMPARE(result.err, QByteArray("vel-menuprint: no such directory: /nowhere?[2J?\n"));
}

void tst_vel_menuprint::printsJson()
{
    const QString picture = write(QStringLiteral("x.png"), "x");
    const QString file =
        write(QStringLiteral("menu/a.desktop"), entry("Ä \"B\"", "Icon=" + picture.toUtf8() + '\n'));
    write(QStringLiteral("menu/notes.txt"), "text");

    const Result result =
        print({QStringLiteral("--format"), QStringLiteral("json"), path(QStringLiteral("menu"))});
    QCOMPARE(result.status, 0);
    const QJsonObject menu = QJsonDocument::fromJson(result.out).object();
    QCOMPARE(menu.value(QLatin1String("kind")).toString(), QStringLiteral("folder"));
    const QJsonArray children = menu.value(QLatin1String("children")).toArray();
    QCOMPARE(children.size(), 2);
    const QJsonObject expected{{QStringLiteral("kind"), QStringLiteral("entry")},
                               {QStringLiteral("name"), QStringLiteral("Ä \"B\"")},
                               {QStringLiteral("path"), file},
                               {QStringLiteral("id"), QStringLiteral("a.desktop")},
                               {QStringLiteral("icon"), picture},
                               {QStringLiteral("iconFile"), picture},
                               {QStringLiteral("exec"), QStringLiteral("true")},
                               {QStringLiteral("command"), QStringLiteral("vel-open --exec '%1'").arg(file)}};
    QVERIFY(children.contains(expected));
    QVERIFY(!children.at(1).toObject().contains(QLatin1String("exec"))
            || !children.at(0).toObject().contains(QLatin1String("exec")));
}

void tst_vel_menuprint::printsAnOpenboxPipeMenu()
{
    write(QStringLiteral("menu/folder/a.desktop"), entry("A & <B>_c", "Icon=by-name\n"));
    write(QStringLiteral("menu/folder/.directory"),
          "[Desktop Entry]\nType=Directory\nName=folder\nIcon=/pictures/a.png\n");
    write(QStringLiteral("menu/line.desktop"),
          "[Desktop Entry]\nType=Application\nName=Line\nExec=VELWM_SEPARATOR\n");

    const Result result =
        print({QStringLiteral("--format"), QStringLiteral("openbox"), path(QStringLiteral("menu"))});
    QCOMPARE(result.status, 0);
    QXmlStreamReader xml(result.out);
    QStringList seen;
    while (!xml.atEnd()) {
        if (xml.readNext() == QXmlStreamReader::StartElement)
            seen.append(xml.name().toString() + QLatin1Char(' ')
                        + xml.attributes().value(QLatin1String("label")).toString()
                        + xml.attributes().value(QLatin1String("icon")).toString());
    }
    QVERIFY2(!xml.hasError(), qPrintable(xml.errorString()));
    QCOMPARE(seen,
             QStringList({QStringLiteral("openbox_pipe_menu "), QStringLiteral("menu folder/pictures/a.png"),
                          QStringLiteral("item A & <B>__c"), QStringLiteral("action "),
                          QStringLiteral("command "), QStringLiteral("separator ")}));
    QVERIFY(result.out.contains("<command>vel-open --exec '"
                                + QFile::encodeName(path(QStringLiteral("menu/folder/a.desktop")))
                                + "'</command>"));
}

void tst_vel_menuprint::printsNamesThatXmlCannotHold()
{
    write(QStringLiteral("menu/folder\x02/a.desktop"), entry("A\x01\\nB", "Icon=/pictures/\x03.png\n"));

    const MenuItem menu = MenuTree::read(path(QStringLiteral("menu")));
    QXmlStreamReader xml(MenuFormat::openbox(menu));
    QStringList labels;
    while (!xml.atEnd()) {
        if (xml.readNext() == QXmlStreamReader::StartElement)
            labels.append(xml.attributes().value(QLatin1String("label")).toString());
    }
    QVERIFY2(!xml.hasError(), qPrintable(xml.errorString()));
    QVERIFY(labels.contains(QString::fromUtf8("A\xEF\xBF\xBD B")));
    QVERIFY(MenuFormat::text(menu).endsWith("        A? B\n"));
}

void tst_vel_menuprint::startsTheChosenLine()
{
    const QString sign = path(QStringLiteral("sign"));
    for (const char *name : {"a", "b"})
        write(QStringLiteral("menu/F/%1.desktop").arg(QLatin1String(name)),
              "[Desktop Entry]\nType=Application\nName=Same\nExec=touch " + sign.toUtf8() + name + "\n");
    const Result lines =
        print({QStringLiteral("--format"), QStringLiteral("dmenu"), path(QStringLiteral("menu"))});
    QCOMPARE(lines.out, QByteArray("F > Same\nF > Same (2)\n"));
    const Result result = print({QStringLiteral("--run"), path(QStringLiteral("menu"))}, "F > Same (2)\n");
    QCOMPARE(result.err, QByteArray());
    QCOMPARE(result.status, 0);
    QTRY_COMPARE_WITH_TIMEOUT(QDir(folder()).entryList({QStringLiteral("sign*")}).size(), 1, 20000);
    const MenuItem menu = MenuTree::read(path(QStringLiteral("menu")));
    QCOMPARE(QDir(folder()).entryList({QStringLiteral("sign*")}).constFirst(),
             QStringLiteral("sign") + QFileInfo(menu.children.at(0).children.at(1).path).baseName());
}

void tst_vel_menuprint::startsNothingWhenNothingWasChosen()
{
    QVERIFY(QDir().mkpath(path(QStringLiteral("menu"))));
    const Result result = print({QStringLiteral("--run"), path(QStringLiteral("menu"))}, "");
    QCOMPARE(result.status, 0);
    QCOMPARE(result.out + result.err, QByteArray());
}

void tst_vel_menuprint::tellsThatTheChosenLineIsNotInTheMenu()
{
    QVERIFY(QDir().mkpath(path(QStringLiteral("menu"))));
    const Result result = print({QStringLiteral("--run"), path(QStringLiteral("menu"))}, "F > A\n");
    QCOMPARE(result.status, 3);
    QCOMPARE(result.err, QByteArray("vel-menuprint: There is no \"F > A\" in the menu.\n"));
}

void tst_vel_menuprint::tellsOfPathsThatAFormatCannotHold()
{
    write(QStringLiteral("menu/a\nb.desktop"), entry("A"));
    const QStringList menu{path(QStringLiteral("menu"))};
    const Result lines = print(QStringList{QStringLiteral("--format"), QStringLiteral("icewm")} + menu);
    QCOMPARE(lines.status, 0);
    QVERIFY2(
        lines.err.startsWith("vel-menuprint: " + menu.constFirst().toUtf8() + "/a?b.desktop is left out"),
        lines.err);
    const Result xml = print(QStringList{QStringLiteral("--format"), QStringLiteral("jwm")} + menu);
    QCOMPARE(xml.err, QByteArray());
}

void tst_vel_menuprint::refusesIconSizesThatNobodyHas_data()
{
    QTest::addColumn<QString>("size");
    for (const char *size : {"0", "-1", "1025", "large", ""})
        QTest::newRow(*size ? size : "empty") << QString::fromLatin1(size);
}

void tst_vel_menuprint::refusesIconSizesThatNobodyHas()
{
    QFETCH(QString, size);
    const Result result = print({QStringLiteral("--icon-size"), size, QStringLiteral("/")});
    QCOMPARE(result.status, 2);
    QCOMPARE(result.err, QByteArray("vel-menuprint: the size of icons is not between 1 and 1024\n"));
}

void tst_vel_menuprint::tellsThatItCannotWrite()
{
    QVERIFY(QDir().mkpath(path(QStringLiteral("menu"))));
    QProcess process;
    process.setStandardOutputFile(QStringLiteral("/dev/full"));
    process.start(QStringLiteral(VEL_PROGRAM), {path(QStringLiteral("menu"))});
    QVERIFY(process.waitForFinished());
    QCOMPARE(process.exitCode(), 1);
    QCOMPARE(process.readAllStandardError(), QByteArray("vel-menuprint: No space left on device\n"));
}

void tst_vel_menuprint::quotesPathsForTheShell_data()
{
    QTest::addColumn<QString>("file");
    QTest::newRow("quote") << QStringLiteral("menu/it's $HOME.desktop");
    QTest::newRow("line feed") << QStringLiteral("menu/a\nb.desktop");
}

void tst_vel_menuprint::quotesPathsForTheShell()
{
    QFETCH(QString, file);
    write(file, entry("A"));

    const QByteArray menu = MenuFormat::openbox(MenuTree::read(path(QStringLiteral("menu"))));
    QXmlStreamReader xml(menu);
    QString command;
    while (!xml.atEnd()) {
        if (xml.readNext() == QXmlStreamReader::StartElement && xml.name() == QLatin1String("command"))
            command = xml.readElementText();
    }
    QProcess shell;
    shell.start(QStringLiteral("sh"),
                {QStringLiteral("-c"),
                 QString(command).replace(QLatin1String("vel-open --exec"), QLatin1String("printf %s"))});
    QVERIFY(shell.waitForFinished());
    QCOMPARE(QFile::decodeName(shell.readAllStandardOutput()), path(file));
}

VEL_TEST_GUILESS_MAIN(tst_vel_menuprint)

#include "tst_vel_menuprint.moc"
