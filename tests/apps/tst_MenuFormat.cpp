// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconThemeFolder.h"
#include "TestCase.h"

#include <IconFiles.h>
#include <ListedMenu.h>
#include <MenuFormat.h>
#include <MenuLines.h>
#include <MenuTree.h>

#include <QDir>
#include <QIcon>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QXmlStreamReader>

namespace {

MenuItem item(MenuItem::Kind kind, const QString &name, const QString &path = QStringLiteral("/m/x.desktop"),
              const QString &icon = QString())
{
    MenuItem result;
    result.kind = kind;
    result.name = name;
    result.path = path;
    result.icon = icon;
    return result;
}

MenuItem menuFolder(const QString &name, const QVector<MenuItem> &children, const QString &icon = QString())
{
    MenuItem result = item(MenuItem::Folder, name, QStringLiteral("/m/") + name, icon);
    result.children = children;
    return result;
}

MenuItem entry(const QString &name, const QString &path = QStringLiteral("/m/x.desktop"))
{
    return item(MenuItem::Entry, name, path);
}

QStringList texts(const MenuItem &menu)
{
    QStringList result;
    const auto lines = MenuLines::of(menu);
    for (const MenuLines::Line &line : lines)
        result.append(line.text);
    return result;
}

QByteArray desktopEntry(const QByteArray &name, const QByteArray &more = QByteArray())
{
    return "[Desktop Entry]\nType=Application\nName=" + name + "\nExec=true\n" + more;
}

const QString Quoted = QStringLiteral("/m/it's $x \"y\" \\z}.desktop");

} // namespace

/// Menus for window managers and launchers.
class tst_MenuFormat : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void knowsItsFormats();
    void listsWhatCanBeStarted();
    void leavesOutFoldersWithNothingInThem();
    void namesAFolderWithoutNameAfterItsDirectory();
    void takesIconsFromTheTheme();
    void leavesDrawingsOutForFluxbox();
    void takesTheThemeThatTheUserChose_data();
    void takesTheThemeThatTheUserChose();
    void makesLinesUnique();
    void keepsLinesApartFromNamesWithNumbers();
    void writesOneLineForEachName();
    void printsLinesForDmenu();
    void printsLinesWithIconsForRofi();
    void printsAMenuForFluxbox();
    void printsAMenuForIcewm();
    void printsAMenuForJwm();
    void doublesAnUnderscoreOnlyWhereItMarksALetter();
    void leavesOutPathsOfSeveralLines();
    void printsATextInThePlaceOfAMenu_data();
    void printsATextInThePlaceOfAMenu();
    void printsJsonWithAllThatAnEntryTells();
    void tellsInJsonWhyAnEntryIsUnlisted_data();
    void tellsInJsonWhyAnEntryIsUnlisted();
    void quotesACommandForTheShell();

private:
    QByteArray m_paths;
};

void tst_MenuFormat::init()
{
    TestCase::init();
    m_paths = qgetenv("XDG_CURRENT_DESKTOP");
}

void tst_MenuFormat::cleanup()
{
    qputenv("XDG_CURRENT_DESKTOP", m_paths);
    QIcon::setThemeSearchPaths({});
    TestCase::cleanup();
}

void tst_MenuFormat::knowsItsFormats()
{
    QCOMPARE(MenuFormat::names().join(QLatin1Char(' ')),
             QStringLiteral("dmenu fluxbox icewm json jwm labwc openbox rofi text"));
    QVERIFY(!MenuFormat::find(QStringLiteral("yaml")));
    QVERIFY(MenuFormat::find(QStringLiteral("labwc"))->printText == MenuFormat::openboxText);
    for (const char *name : {"json", "text"})
        QVERIFY(!MenuFormat::find(QLatin1String(name))->isForStarting);
}

void tst_MenuFormat::listsWhatCanBeStarted()
{
    write(QStringLiteral("menu/a.desktop"), desktopEntry("A"));
    write(QStringLiteral("menu/b.desktop"), desktopEntry("B", "NoDisplay=true\n"));
    write(QStringLiteral("menu/c.desktop"), desktopEntry("C", "Hidden=true\n"));
    write(QStringLiteral("menu/d.desktop"), "[Desktop Entry]\nType=Application\nExec=true\nGenericName=D\n");
    write(QStringLiteral("menu/e.desktop"), "no entry");
    write(QStringLiteral("menu/f.desktop"), desktopEntry("F", "TryExec=/nowhere/at/all\n"));
    write(QStringLiteral("menu/g.desktop"), desktopEntry("G", "OnlyShowIn=OTHER;\n"));
    write(QStringLiteral("menu/h.txt"), "text");
    write(QStringLiteral("menu/i/.directory"), "[Desktop Entry]\nType=Directory\nName=I\nNoDisplay=true\n");
    write(QStringLiteral("menu/i/a.desktop"), desktopEntry("In it"));

    const MenuItem menu = MenuTree::read(path(QStringLiteral("menu")));
    QCOMPARE(texts(ListedMenu::of(menu, nullptr)),
             QStringList({QStringLiteral("A"), QStringLiteral("h.txt")}));
    QVERIFY(texts(menu).contains(QStringLiteral("B")));
}

void tst_MenuFormat::leavesOutFoldersWithNothingInThem()
{
    MenuItem hidden = entry(QStringLiteral("hidden"));
    hidden.isListed = false;
    const MenuItem line = item(MenuItem::Separator, QStringLiteral("line"));
    const MenuItem menu =
        menuFolder(QStringLiteral("menu"),
                   {menuFolder(QStringLiteral("empty"), {}), menuFolder(QStringLiteral("hiding"), {hidden}),
                    menuFolder(QStringLiteral("deep"), {menuFolder(QStringLiteral("empty"), {line})}),
                    menuFolder(QStringLiteral("full"), {line, entry(QStringLiteral("a"))})});
    const MenuItem listed = ListedMenu::of(menu, nullptr);
    QCOMPARE(listed.children.size(), 1);
    QCOMPARE(listed.children.constFirst().name, QStringLiteral("full"));
    QCOMPARE(listed.children.constFirst().children.size(), 2);
}

void tst_MenuFormat::namesAFolderWithoutNameAfterItsDirectory()
{
    write(QStringLiteral("menu/tools/.directory"), "[Desktop Entry]\nType=Directory\n");
    write(QStringLiteral("menu/tools/a.desktop"), desktopEntry("A"));
    QCOMPARE(texts(ListedMenu::of(MenuTree::read(path(QStringLiteral("menu"))), nullptr)),
             QStringList(QStringLiteral("tools > A")));
}

void tst_MenuFormat::takesIconsFromTheTheme()
{
    const IconThemeFolder icons(TestCase::folder(), QStringLiteral("pictures"));
    icons.write();
    icons.add(QStringLiteral("editor"), Qt::red);
    icons.use();
    const QString file = IconFiles::find(QStringLiteral("editor"), 22, false);
    QCOMPARE(file, path(QStringLiteral("pictures/22/editor.png")));
    QCOMPARE(IconFiles::find(QStringLiteral("browser"), 22, false), QString());
    QCOMPARE(IconFiles::find(QStringLiteral("/of/its/own.png"), 22, false),
             QStringLiteral("/of/its/own.png"));

    MenuItem withIcon = entry(QStringLiteral("A"));
    withIcon.icon = QStringLiteral("editor");
    const MenuItem menu = menuFolder(QStringLiteral("menu"), {withIcon}, QStringLiteral("browser"));
    const MenuItem listed =
        ListedMenu::of(menu, [](const QString &name) { return IconFiles::find(name, 22, false); });
    QCOMPARE(listed.icon, QString());
    QCOMPARE(listed.children.constFirst().icon, file);
}

void tst_MenuFormat::leavesDrawingsOutForFluxbox()
{
    const QString drawing = write(QStringLiteral("own.svg"), "<svg/>");
    QCOMPARE(IconFiles::find(drawing, 22, false), drawing);
    QCOMPARE(IconFiles::find(drawing, 22, true), QString());
    QVERIFY(MenuFormat::find(QStringLiteral("fluxbox"))->hasPicturesOnly);
}

void tst_MenuFormat::takesTheThemeThatTheUserChose_data()
{
    QTest::addColumn<QByteArray>("desktop");
    QTest::addColumn<QString>("theme");
    QTest::newRow("GTK's settings") << QByteArray("openbox") << QStringLiteral("of-gtk");
    QTest::newRow("KDE's settings") << QByteArray("KDE") << QStringLiteral("of-kde");
}

void tst_MenuFormat::takesTheThemeThatTheUserChose()
{
    QFETCH(QByteArray, desktop);
    QFETCH(QString, theme);
    const QDir config(qEnvironmentVariable("XDG_CONFIG_HOME"));
    const QDir data(qEnvironmentVariable("XDG_DATA_HOME"));
    const auto put = [](const QString &file, const QByteArray &bytes) {
        QDir().mkpath(QFileInfo(file).path());
        QFile out(file);
        QVERIFY(out.open(QIODevice::WriteOnly));
        out.write(bytes);
    };
    put(config.filePath(QStringLiteral("gtk-3.0/settings.ini")), "[Settings]\ngtk-icon-theme-name=of-gtk\n");
    put(config.filePath(QStringLiteral("kdeglobals")), "[Icons]\nTheme=of-kde\n");
    for (const char *name : {"of-gtk", "of-kde"})
        put(data.filePath(QStringLiteral("icons/%1/index.theme").arg(QLatin1String(name))), "[Icon Theme]\n");
    qputenv("XDG_CURRENT_DESKTOP", desktop);
    QCOMPARE(IconFiles::userTheme(), theme);
}

void tst_MenuFormat::makesLinesUnique()
{
    const MenuItem menu =
        menuFolder(QStringLiteral("menu"),
                   {entry(QStringLiteral("A")), menuFolder(QStringLiteral("F"), {entry(QStringLiteral("A"))}),
                    entry(QStringLiteral("A")), entry(QStringLiteral("A")),
                    item(MenuItem::Separator, QStringLiteral("-"))});
    QCOMPARE(texts(menu),
             QStringList({QStringLiteral("A"), QStringLiteral("F > A"), QStringLiteral("A (2)"),
                          QStringLiteral("A (3)")}));
}

void tst_MenuFormat::keepsLinesApartFromNamesWithNumbers()
{
    const MenuItem menu = menuFolder(QStringLiteral("menu"),
                                     {entry(QStringLiteral("A")), entry(QStringLiteral("A")),
                                      entry(QStringLiteral("A (2)")), entry(QStringLiteral("A (2)"))});
    const QStringList lines = texts(menu);
    QCOMPARE(lines,
             QStringList({QStringLiteral("A"), QStringLiteral("A (3)"), QStringLiteral("A (2)"),
                          QStringLiteral("A (2) (2)")}));
}

void tst_MenuFormat::writesOneLineForEachName()
{
    const MenuItem menu = menuFolder(QStringLiteral("menu"),
                                     {entry(QStringLiteral("A\nB\r\x1f"
                                                           "C"))});
    QCOMPARE(texts(menu), QStringList(QStringLiteral("A B ?C")));
}

void tst_MenuFormat::printsLinesForDmenu()
{
    const MenuItem menu = menuFolder(QStringLiteral("menu"),
                                     {menuFolder(QStringLiteral("F"), {entry(QStringLiteral("\u00c4"))})});
    QCOMPARE(MenuFormat::dmenu(menu), QByteArray("F > \xc3\x84\n"));
}

void tst_MenuFormat::printsLinesWithIconsForRofi()
{
    MenuItem withIcon = entry(QStringLiteral("A"));
    withIcon.icon = QStringLiteral("/icons/a.png");
    const MenuItem menu = menuFolder(QStringLiteral("menu"), {withIcon, entry(QStringLiteral("B"))});
    QCOMPARE(MenuFormat::rofi(menu), QByteArray("A\0icon\x1f/icons/a.png\nB\n", 22));
}

void tst_MenuFormat::printsAMenuForFluxbox()
{
    MenuItem withIcon = entry(QStringLiteral("One (1) \\"), Quoted);
    withIcon.icon = QStringLiteral("/icons/a>b.png");
    const MenuItem menu = menuFolder(
        QStringLiteral("menu"),
        {menuFolder(QStringLiteral("F"), {withIcon}), item(MenuItem::Separator, QStringLiteral("-"))});
    QCOMPARE(
        QString::fromUtf8(MenuFormat::fluxbox(menu)),
        QStringLiteral("[encoding] {UTF-8}\n"
                       "[submenu] (F)\n"
                       "    [exec] (One (1\\) \\ ) {vel-open --exec '/m/it'\"'\"'s $x \"y\" \\z\\}.desktop'} "
                       "</icons/a\\>b.png>\n"
                       "[end]\n"
                       "[separator]\n"
                       "[endencoding]\n"));
}

void tst_MenuFormat::printsAMenuForIcewm()
{
    MenuItem withIcon = entry(QStringLiteral("A_b \"c\" \\"), Quoted);
    withIcon.icon = QStringLiteral("/icons/a b.png");
    const MenuItem menu = menuFolder(
        QStringLiteral("menu"),
        {menuFolder(QStringLiteral("F"), {withIcon}), item(MenuItem::Separator, QStringLiteral("-"))});
    QCOMPARE(QString::fromUtf8(MenuFormat::icewm(menu)),
             QStringLiteral("menu \"F\" - {\n"
                            "    prog \"A__b \\\"c\\\" \\ \" \"/icons/a b.png\" "
                            "vel-open --exec '/m/it'\"'\"'s $x \"y\" \\z}.desktop'\n"
                            "}\n"
                            "separator\n"));
}

void tst_MenuFormat::printsAMenuForJwm()
{
    MenuItem withIcon = entry(QStringLiteral("A_b & <c>"), Quoted);
    withIcon.icon = QStringLiteral("/icons/a.png");
    const MenuItem menu = menuFolder(
        QStringLiteral("menu"),
        {menuFolder(QStringLiteral("F"), {withIcon}), item(MenuItem::Separator, QStringLiteral("-"))});
    QXmlStreamReader xml(MenuFormat::jwm(menu));
    QStringList seen;
    while (!xml.atEnd()) {
        if (xml.readNext() == QXmlStreamReader::StartElement)
            seen.append(xml.name().toString() + QLatin1Char('|')
                        + xml.attributes().value(QLatin1String("label")).toString() + QLatin1Char('|')
                        + xml.attributes().value(QLatin1String("icon")).toString());
        else if (xml.isCharacters() && !xml.isWhitespace())
            seen.append(xml.text().toString());
    }
    QVERIFY2(!xml.hasError(), qPrintable(xml.errorString()));
    QCOMPARE(seen,
             QStringList({QStringLiteral("JWM||"), QStringLiteral("Menu|F|"),
                          QStringLiteral("Program|A_b & <c>|/icons/a.png"),
                          QStringLiteral("vel-open --exec '/m/it'\"'\"'s $x \"y\" \\z}.desktop'"),
                          QStringLiteral("Separator||")}));
}

void tst_MenuFormat::doublesAnUnderscoreOnlyWhereItMarksALetter()
{
    const MenuItem menu = menuFolder(
        QStringLiteral("menu"), {menuFolder(QStringLiteral("F_g"), {entry(QStringLiteral("A_b"), Quoted)})});
    QByteArray openbox = MenuFormat::openbox(menu);
    QVERIFY(openbox.contains("label=\"F__g\""));
    QVERIFY(openbox.contains("label=\"A__b\""));
    QCOMPARE(MenuFormat::labwc(menu), openbox.replace("__", "_"));
}

void tst_MenuFormat::leavesOutPathsOfSeveralLines()
{
    const MenuItem menu = menuFolder(QStringLiteral("menu"),
                                     {entry(QStringLiteral("A"), QStringLiteral("/m/a\nb")),
                                      entry(QStringLiteral("B"), QStringLiteral("/m/b"))});
    for (const char *name : {"fluxbox", "icewm"}) {
        const MenuFormat::Format *const format = MenuFormat::find(QLatin1String(name));
        QVERIFY(format->hasLines);
        QVERIFY(!format->print(menu).contains("/m/a"));
        QVERIFY(format->print(menu).contains("/m/b"));
    }
}

void tst_MenuFormat::printsATextInThePlaceOfAMenu_data()
{
    QTest::addColumn<QByteArray>("expected");
    QTest::newRow("fluxbox") << QByteArray("[encoding] {UTF-8}\n[nop] (a (b\\) \"c\" d)\n[endencoding]\n");
    QTest::newRow("icewm") << QByteArray("prog \"a (b) \\\"c\\\" d\" - true\n");
    QTest::newRow("jwm") << QByteArray("<Program label=\"a (b) &quot;c&quot; d\">true</Program>");
    QTest::newRow("labwc") << QByteArray("<separator label=\"a (b) &quot;c&quot; d\"/>");
    QTest::newRow("openbox") << QByteArray("<separator label=\"a (b) &quot;c&quot; d\"/>");
    QTest::newRow("rofi") << QByteArray();
    QTest::newRow("dmenu") << QByteArray();
}

void tst_MenuFormat::printsATextInThePlaceOfAMenu()
{
    QFETCH(QByteArray, expected);
    const auto printText = MenuFormat::find(QString::fromLatin1(QTest::currentDataTag()))->printText;
    QCOMPARE(printText == nullptr, expected.isEmpty());
    if (printText)
        QVERIFY2(printText(QStringLiteral("a (b) \"c\"\nd")).contains(expected), expected.constData());
}

void tst_MenuFormat::printsJsonWithAllThatAnEntryTells()
{
    write(QStringLiteral("menu/a.desktop"),
          desktopEntry("A",
                       "GenericName=G\nComment=C\nKeywords=k;l;\nCategories=Utility;\nMimeType=text/plain;\n"
                       "TryExec=sh\nPath=/tmp\nTerminal=true\nStartupNotify=true\nStartupWMClass=W\nIcon=i\n"
                       "NoDisplay=true\nActions=new;\n\n[Desktop Action new]\nName=N\nExec=new\nIcon=n\n"));
    const QByteArray json = MenuFormat::json(MenuTree::read(path(QStringLiteral("menu"))));
    const QJsonObject found =
        QJsonDocument::fromJson(json).object().value(QLatin1String("children")).toArray().at(0).toObject();
    const QByteArray expected = R"({"kind": "entry", "name": "A", "icon": "i", "exec": "true",
        "id": "a.desktop", "unlisted": true, "whyUnlisted": "notDisplayed", "genericName": "G", "comment": "C", "keywords": ["k", "l"],
        "categories": ["Utility"], "mimeTypes": ["text/plain"], "tryExec": "sh",
        "workingDirectory": "/tmp", "terminal": true, "startupNotify": true, "startupWMClass": "W",
        "actions": [{"id": "new", "name": "N", "icon": "n", "exec": "new"}]})";
    QJsonObject wanted = QJsonDocument::fromJson(expected).object();
    wanted.insert(QStringLiteral("path"), path(QStringLiteral("menu/a.desktop")));
    wanted.insert(QStringLiteral("command"),
                  QStringLiteral("vel-open --exec '%1'").arg(path(QStringLiteral("menu/a.desktop"))));
    QCOMPARE(found, wanted);
}

void tst_MenuFormat::tellsInJsonWhyAnEntryIsUnlisted_data()
{
    QTest::addColumn<QByteArray>("contents");
    QTest::addColumn<bool>("isThere");
    QTest::newRow("") << desktopEntry("A") << true;
    QTest::newRow("notDisplayed") << desktopEntry("A", "NoDisplay=true\n") << true;
    QTest::newRow("notInstalled") << desktopEntry("A", "TryExec=/nowhere/at/all\n") << true;
    QTest::newRow("malformed") << QByteArray("no entry at all\n") << true;
    QTest::newRow("nameless") << QByteArray("[Desktop Entry]\nType=Application\nExec=true\n") << true;
    QTest::newRow("deleted") << desktopEntry("A", "Hidden=true\n") << false;
    QTest::newRow("other desktop") << desktopEntry("A", "OnlyShowIn=Nowhere;\n") << false;
}

void tst_MenuFormat::tellsInJsonWhyAnEntryIsUnlisted()
{
    QFETCH(QByteArray, contents);
    QFETCH(bool, isThere);
    write(QStringLiteral("menu/a.desktop"), contents);
    const QByteArray json = MenuFormat::json(MenuTree::read(path(QStringLiteral("menu"))));
    const QJsonArray found =
        QJsonDocument::fromJson(json).object().value(QLatin1String("children")).toArray();
    QCOMPARE(found.size(), int(isThere));
    const QString word = QString::fromLatin1(QTest::currentDataTag());
    if (isThere) {
        QCOMPARE(found.at(0).toObject().value(QLatin1String("whyUnlisted")).toString(), word);
        QCOMPARE(found.at(0).toObject().contains(QLatin1String("unlisted")), !word.isEmpty());
    }
}

void tst_MenuFormat::quotesACommandForTheShell()
{
    const MenuItem menu = menuFolder(QStringLiteral("menu"), {entry(QStringLiteral("A"), Quoted)});
    QXmlStreamReader xml(MenuFormat::openbox(menu));
    while (!xml.atEnd() && xml.name() != QLatin1String("command"))
        xml.readNext();
    QString command = xml.readElementText();
    QProcess shell;
    shell.start(QStringLiteral("sh"),
                {QStringLiteral("-c"),
                 command.replace(QLatin1String("vel-open --exec"), QLatin1String("printf %s"))});
    QVERIFY(shell.waitForFinished());
    QCOMPARE(QFile::decodeName(shell.readAllStandardOutput()), Quoted);
}

VEL_TEST_GUILESS_MAIN(tst_MenuFormat)

#include "tst_MenuFormat.moc"
