// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/check/EntryCheck.h>

#include <QDir>
#include <QSet>

using P = EntryProblem;
Q_DECLARE_METATYPE(EntryProblem)
Q_DECLARE_METATYPE(EntryFinding::Severity)

namespace {

// A computer with two programs, an icon, a file and a MIME type.
class SmallComputer : public EntryLookups
{
public:
    Answer program(const QString &program, const QString &folder) const override
    {
        const bool isThere = program == QLatin1String("run") || program == QLatin1String("/opt/My App/run")
            || (program == QLatin1String("./run") && folder == QLatin1String("/opt"));
        return answer(isThere);
    }
    Answer icon(const QString &name) const override
    {
        return answer(name == QLatin1String("known") || name == QLatin1String("/known.png"));
    }
    Answer file(const QString &path) const override { return answer(path == QLatin1String("/opt")); }
    Answer mimeType(const QString &name) const override
    {
        return answer(name == QLatin1String("text/plain"));
    }

    bool knowsNothing = false;

private:
    Answer answer(bool isThere) const
    {
        return knowsNothing ? Answer::Unknown : isThere ? Answer::Yes : Answer::No;
    }
};

const QByteArray Application = "[Desktop Entry]\nType=Application\nName=Program\nExec=run\n";
const QByteArray Link = "[Desktop Entry]\nType=Link\nName=Place\nURL=";

QByteArray command(const char *exec)
{
    return QByteArray("[Desktop Entry]\nType=Application\nName=Program\nExec=") + exec + '\n';
}

} // namespace

/// What is wrong with an entry, row by row, and how it is mended.
class tst_EntryCheck : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void hasNothingToSayOfAGoodEntry_data();
    void hasNothingToSayOfAGoodEntry();
    void finds_data();
    void finds();
    void saysNothingOfWhatIsNotKnownYet();
    void tellsOfAHiddenNameInTheLanguageOfTheUser();
    void repairs_data();
    void repairs();
    void leavesUnrepairedWhatARecordCannotReach_data();
    void leavesUnrepairedWhatARecordCannotReach();
    void saysEverySentenceInFull();
    void looksThroughTheLargestEntries_data();
    void looksThroughTheLargestEntries();

private:
    EntryFindings check(const QByteArray &bytes, const QString &name = QStringLiteral("entry.desktop"));

    SmallComputer m_computer;
};

void tst_EntryCheck::init()
{
    TestCase::init();
    m_computer.knowsNothing = false;
}

EntryFindings tst_EntryCheck::check(const QByteArray &bytes, const QString &name)
{
    const VelUIDesktopEntry record(write(name, bytes));
    return EntryCheck::check(record, bytes, path(name), m_computer);
}

void tst_EntryCheck::hasNothingToSayOfAGoodEntry_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("name");
    const QString application = QStringLiteral("entry.desktop");
    QTest::newRow("application") << Application << application;
    QTest::newRow("all keys") << Application
            + "# A comment\nVersion=1.5\nGenericName=Thing\nComment=Does it\nComment[de]=Macht "
              "es\nIcon=known\n"
              "NoDisplay=false\nOnlyShowIn=GNOME;X-Own;\nTryExec=run\nPath=/opt\nTerminal=false\n"
              "MimeType=text/"
              "plain;\nCategories=Utility;TextEditor;X-Own;\nKeywords=a;b;\nStartupNotify=true\n"
              "StartupWMClass=Thing\nSingleMainWindow=true\nActions=new;\nX-Own=x\nX-Own[de]=y\n\n"
              "[Desktop Action new]\nName=New\nName[de]=Neu\nIcon=known\nExec=run --new "
              "%F\n\n[X-Group]\nAny=thing\n"
                              << application;
    QTest::newRow("link") << Link + "https://www.freedesktop.org\n" << application;
    QTest::newRow("folder") << QByteArray("[Desktop Entry]\nType=Directory\nName=Games\nIcon=known\n")
                            << QStringLiteral("x/.directory");
    QTest::newRow("path of an icon") << Application + "Icon=/known.png\n" << application;
    QTest::newRow("program of a folder") << command("./run") + "Path=/opt\n" << application;
    QTest::newRow("program in quotes") << command("\"/opt/My App/run\" %U") << application;
    QTest::newRow("started by D-Bus")
        << QByteArray("[Desktop Entry]\nType=Application\nName=Program\nDBusActivatable=true\n")
        << QStringLiteral("org.example.Program.desktop");
    QTest::newRow("window manager's own") << command("VELWM_SEPARATOR") << application;
}

void tst_EntryCheck::hasNothingToSayOfAGoodEntry()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, name);
    QDir(folder()).mkpath(QStringLiteral("x"));
    QStringList sentences;
    for (const EntryFinding &finding : check(bytes, name))
        sentences.append(finding.sentence);
    QCOMPARE(sentences, QStringList());
}

void tst_EntryCheck::finds_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<EntryProblem>("problem");
    QTest::addColumn<EntryFinding::Severity>("severity");
    QTest::addColumn<QString>("key");
    const auto row = [](const char *name, const QByteArray &bytes, P problem, EntryFinding::Severity severity,
                        const char *key) {
        QTest::newRow(name) << bytes << problem << severity << QString::fromLatin1(key);
    };
    const auto error = EntryFinding::Error;
    const auto warning = EntryFinding::Warning;
    const auto hint = EntryFinding::Hint;

    row("empty", "", P::EmptyFile, error, "");
    row("carriage returns", Application + "Comment=x\r\n", P::CarriageReturn, error, "");
    row("stray line", Application + "stray\n", P::StrayLine, error, "");
    row("byte order mark", "\xef\xbb\xbf" + Application, P::StrayLine, error, "");
    row("key before the group", "Name=x\n" + Application, P::KeyBeforeGroup, error, "");
    row("leading blank", Application + " Comment=x\n", P::LeadingBlank, error, "");
    row("trailing blank", Application + "[X-Own] \n", P::TrailingBlank, error, "");
    row("other group first", "[X-Own]\n" + Application, P::FirstGroup, error, "");
    row("group twice", Application + "[X-Own]\n[X-Own]\n", P::RepeatedGroup, error, "");
    row("unknown group", Application + "[Own]\n", P::UnknownGroup, error, "");
    row("malformed group", Application + "[X-[Own]\n", P::MalformedGroup, error, "");
    row("old group of another type", Application + "[KDE Desktop Entry]\nType=Application\nName=x\nURL=y:z\n",
        P::KeyOfOtherType, error, "URL");
    row("type in the old group", "[Desktop Entry]\nName=x\nURL=y:z\n[KDE Desktop Entry]\nType=Application\n",
        P::KeyOfOtherType, error, "URL");
    row("old group", Application + "[KDE Desktop Entry]\nType=Link\nName=x\nURL=y:z\n", P::DeprecatedGroup,
        warning, "");
    row("malformed key", Application + "X_Own=x\n", P::MalformedKey, error, "X_Own");
    row("language that others read", Application + "Name[d|]=x\n", P::MalformedKey, warning, "Name");
    row("malformed language", Application + "Name[d e]=x\n", P::MalformedKey, error, "Name");
    row("unknown key", Application + "Own=x\n", P::UnknownKey, error, "Own");
    row("key twice", Application + "Exec=run\n", P::RepeatedKey, error, "Exec");
    row("language of brackets", Application + "Comment=x\nComment[t[]=x\n", P::MalformedKey, error,
        "Comment");
    row("not translatable", Application + "Exec[de]=run\n", P::NotTranslatable, error, "Exec");
    row("translation alone", Application + "Comment[de]=x\n", P::NoPlainValue, error, "Comment");
    row("no name", "[Desktop Entry]\nType=Application\nExec=run\n", P::MissingKey, error, "Name");
    row("no type", "[Desktop Entry]\nName=x\n", P::MissingKey, error, "Type");
    row("no command", "[Desktop Entry]\nType=Application\nName=x\n", P::MissingProgram, error, "Exec");
    row("old key", Application + "Encoding=UTF-8\n", P::DeprecatedKey, warning, "Encoding");
    row("key of a link", Application + "URL=x:y\n", P::KeyOfOtherType, error, "URL");
    row("key of an application", Link + "x:y\nTerminal=true\n", P::KeyOfOtherType, error, "Terminal");
    row("control character", command("run\x01"), P::InvalidCharacter, error, "Exec");
    row("not UTF-8", Application + "Comment=\xff\n", P::InvalidCharacter, error, "Comment");
    row("no flag", Application + "Terminal=yes\n", P::InvalidFlag, error, "Terminal");
    row("no flag for the main window", Application + "SingleMainWindow=yes\n", P::InvalidFlag, error,
        "SingleMainWindow");
    row("old flag", Application + "Terminal=1\n", P::DeprecatedFlag, warning, "Terminal");
    row("unknown type", "[Desktop Entry]\nType=application\nName=x\n", P::UnknownType, error, "Type");
    row("reserved type", "[Desktop Entry]\nType=FSDevice\nName=x\n", P::UnknownType, warning, "Type");
    row("version of the future", Application + "Version=2.0\n", P::UnknownVersion, error, "Version");
    row("encoding", Application + "Encoding=x\n", P::UnknownEncoding, error, "Encoding");
    row("suffix of an icon", Application + "Icon=known.png\n", P::IconSuffix, error, "Icon");
    row("relative icon", Application + "Icon=icons/known\n", P::RelativeIcon, error, "Icon");
    row("missing icon", Application + "Icon=unknown\n", P::MissingIcon, warning, "Icon");
    row("missing picture", Application + "Icon=/unknown.png\n", P::MissingIcon, warning, "Icon");
    row("folder of pictures", Application + "Icon=/pictures/\n", P::MissingIcon, error, "Icon");
    row("relative path", Application + "Path=opt\n", P::RelativePath, warning, "Path");
    row("missing folder", Application + "Path=/nowhere\n", P::MissingFolder, warning, "Path");
    row("no scheme", Link + "www.example.org\n", P::MissingScheme, warning, "URL");
    row("no target", Link + "\n", P::MissingTarget, error, "URL");
    row("missing file", Link + "file:///nowhere\n", P::MissingFile, error, "URL");
    row("name for D-Bus", Application + "DBusActivatable=true\n", P::UnusableBusName, error,
        "DBusActivatable");
    row("condition", Application + "AutostartCondition=sometimes\n", P::InvalidCondition, error,
        "AutostartCondition");
    row("comment like the name", Application + "Comment=program\n", P::SameText, hint, "Comment");
    row("open quote", command("run \""), P::OpenQuote, error, "Exec");
    row("reserved character", command("run 'a'"), P::ReservedCharacter, error, "Exec");
    row("backslash", command("run a\\\\ b"), P::ReservedCharacter, warning, "Exec");
    row("unescaped character", command("run \"$a\""), P::UnescapedCharacter, error, "Exec");
    row("open escape", command("run \\"), P::OpenEscape, error, "Exec");
    row("incomplete code", command("run %"), P::IncompleteFieldCode, error, "Exec");
    row("unknown code", command("run %x"), P::UnknownFieldCode, error, "Exec");
    row("old code", command("run %d"), P::DeprecatedFieldCode, warning, "Exec");
    row("several file codes", command("run %f %U"), P::SeveralFileCodes, error, "Exec");
    row("code twice", command("run %c %c"), P::DoubledFieldCode, warning, "Exec");
    row("code in quotes", command("run \"%f\""), P::MisplacedFieldCode, warning, "Exec");
    row("missing program", command("nowhere %f"), P::MissingProgram, error, "Exec");
    row("code as a program", command("%f"), P::MissingProgram, error, "Exec");
    row("blank in the program", command("/opt/My App/run %f"), P::BlankInProgram, error, "Exec");
    row("missing try exec", Application + "TryExec=nowhere\n", P::MissingTryExec, error, "TryExec");
    row("item twice", Application + "Categories=Game;Game;\n", P::RepeatedItem, warning, "Categories");
    row("unknown desktop", Application + "OnlyShowIn=gnome;\n", P::UnknownDesktop, error, "OnlyShowIn");
    row("both lists", Application + "OnlyShowIn=KDE;\nNotShowIn=GNOME;\n", P::BothShowInLists, error,
        "NotShowIn");
    row("malformed MIME type", Application + "MimeType=text;\n", P::MalformedMimeType, error, "MimeType");
    row("odd MIME type", Application + "MimeType=x-own/thing;\n", P::OddMimeType, warning, "MimeType");
    row("unknown MIME type", Application + "MimeType=text/nobody;\n", P::UnknownMimeType, hint, "MimeType");
    for (const char *name : {"a", ".a.b", "a..b", "a.b.", "a-b.c", "a.9b", "a.b;;c.d", "a.b c"})
        row(name, Application + "Implements=" + name + ";\n", P::InvalidInterface, error, "Implements");
    row("long interface", Application + "Implements=a." + QByteArray(254, 'b') + '\n', P::InvalidInterface,
        error, "Implements");
    row("unknown category", Application + "Categories=Game;Fun;\n", P::UnknownCategory, error, "Categories");
    row("old category", Application + "Categories=Game;Application;\n", P::DeprecatedCategory, warning,
        "Categories");
    row("reserved category", Application + "Categories=Game;TrayIcon;\n", P::ReservedCategory, error,
        "Categories");
    row("audio alone", Application + "Categories=Audio;\n", P::MissingRelatedCategory, error, "Categories");
    row("half a pair", Application + "Categories=Game;TextEditor;\n", P::MissingRelatedCategory, hint,
        "Categories");
    row("no main category", Application + "Categories=Java;\n", P::MissingMainCategory, hint, "Categories");
    row("several main categories", Application + "Categories=Game;Office;\n", P::SeveralMainCategories, hint,
        "Categories");
    row("invalid action", Application + "Actions=a b;\n", P::InvalidAction, error, "Actions");
    row("empty action", Application + "Actions=;\n", P::EmptyAction, error, "Actions");
    row("action without a group", Application + "Actions=new;\n", P::ActionWithoutGroup, error, "Actions");
    row("group without an action", Application + "[Desktop Action new]\nName=x\nExec=run\n",
        P::GroupWithoutAction, error, "");
    row("command of an action", Application + "Actions=new;\n[Desktop Action new]\nName=x\nExec=run %x\n",
        P::UnknownFieldCode, error, "Exec");
    row("program of an action", Application + "Actions=new;\n[Desktop Action new]\nName=x\nExec=nowhere\n",
        P::MissingProgram, error, "Exec");
}

void tst_EntryCheck::finds()
{
    QFETCH(QByteArray, bytes);
    QFETCH(EntryProblem, problem);
    QFETCH(EntryFinding::Severity, severity);
    QFETCH(QString, key);
    QStringList others;
    bool isFound = false;
    for (const EntryFinding &finding : check(bytes)) {
        isFound =
            isFound || (finding.problem == problem && finding.severity == severity && finding.key == key);
        others.append(finding.key + QLatin1String(": ") + finding.sentence);
    }
    QVERIFY2(isFound, qPrintable(others.join(QLatin1Char('\n'))));
}

void tst_EntryCheck::saysNothingOfWhatIsNotKnownYet()
{
    m_computer.knowsNothing = true;
    const QByteArray bytes =
        "[Desktop Entry]\nType=Application\nName=Program\nExec=/opt/My App/run\nTryExec=nowhere\n"
        "Icon=unknown\nPath=/nowhere\nMimeType=text/nobody;\n";
    QVERIFY(check(bytes).isEmpty());
    m_computer.knowsNothing = false;
    QCOMPARE(check(bytes).size(), 5);
}

void tst_EntryCheck::tellsOfAHiddenNameInTheLanguageOfTheUser()
{
    const QByteArray bytes = Application + "Name[de]=Programm\n";
    QVERIFY(check(bytes).isEmpty());
    qputenv("LC_ALL", "de_DE.UTF-8");
    const EntryFindings findings = check(bytes);
    qunsetenv("LC_ALL");
    QCOMPARE(findings.size(), 1);
    QVERIFY(findings.constFirst().problem == P::HiddenName);
    QCOMPARE(findings.constFirst().key, QStringLiteral("Name"));
    QCOMPARE(findings.constFirst().sentence,
             QStringLiteral("In your language the entry is shown as 'Programm'."));
}

void tst_EntryCheck::repairs_data()
{
    QTest::addColumn<QByteArray>("line");
    QTest::addColumn<EntryProblem>("problem");
    QTest::addColumn<QByteArray>("repaired");
    const auto row = [](const char *line, P problem, const char *repaired) {
        QTest::newRow(line) << QByteArray(line) << problem << QByteArray(repaired);
    };
    row("Exec=run \"a b", P::OpenQuote, "Exec=run \"a b\"");
    row("Exec=run 'a b'", P::ReservedCharacter, "Exec=run \"a b\"");
    row("Exec=run a | b", P::ReservedCharacter, "Exec=sh -c \"run a | b\"");
    row("Exec=run \"5$\"", P::UnescapedCharacter, "Exec=run \"5\\\\$\"");
    row("Exec=/opt/My App/run %f", P::BlankInProgram, "Exec=\"/opt/My App/run\" %f");
    row("Exec=run 5%", P::IncompleteFieldCode, "Exec=run 5%%");
    row("Exec=run %x", P::UnknownFieldCode, "Exec=run %%x");
    row("Exec=run %d %f", P::DeprecatedFieldCode, "Exec=run %f");
    row("Exec=run %f %U", P::SeveralFileCodes, "Exec=run %f");
    row("Exec=run %c %c", P::DoubledFieldCode, "Exec=run %c");
    row("Exec=run\ta", P::InvalidCharacter, "Exec=run a");
    row("TryExec=run --help", P::MissingTryExec, "TryExec=run");
    row("Icon=known.svg", P::IconSuffix, "Icon=known");
    row("Terminal=True", P::InvalidFlag, "Terminal=true");
    row("Version=1.6", P::UnknownVersion, "Version=1.4");
    row("Categories=game;X-Own;", P::UnknownCategory, "Categories=Game;X-Own;");
    row("Categories=Game;Fun;", P::UnknownCategory, "Categories=Game;X-Fun;");
    row("Categories=Game;Application;", P::DeprecatedCategory, "Categories=Game;");
    row("Categories=TrayIcon;Game;", P::ReservedCategory, "Categories=Game;");
    row("Categories=Player;", P::MissingRelatedCategory, "Categories=Player;Audio;AudioVideo;");
    row("Categories=Video;Player;", P::MissingRelatedCategory, "Categories=Video;Player;AudioVideo;");
    row("Categories=Game;Game;", P::RepeatedItem, "Categories=Game;");
    row("MimeType=Text/Plain, image/png;", P::MalformedMimeType, "MimeType=text/plain;image/png;");
    row("MimeType=nonsense;text/plain;", P::MalformedMimeType, "MimeType=text/plain;");
    row("OnlyShowIn=gnome;", P::UnknownDesktop, "OnlyShowIn=GNOME;");
    row("URL=x:y", P::KeyOfOtherType, "");
    row("Actions=new;\n\n[Desktop Action new]\nName=x\nIcon=a.png\nExec=run", P::IconSuffix,
        "Actions=new;\n\n[Desktop Action new]\nName=x\nIcon=a\nExec=run");
    row("Actions=new;\n\n[Desktop Action new]\nName=x\nName[fr]=y\nExec=run %x", P::UnknownFieldCode,
        "Actions=new;\n\n[Desktop Action new]\nName=x\nName[fr]=y\nExec=run %%x");
    row("Comment[de]=x", P::NoPlainValue, "Comment=x\nComment[de]=x");
}

void tst_EntryCheck::repairs()
{
    QFETCH(QByteArray, line);
    QFETCH(EntryProblem, problem);
    QFETCH(QByteArray, repaired);
    const QByteArray start = line.startsWith("Exec")
        ? QByteArray("[Desktop Entry]\nType=Application\nName=Program\n")
        : Application;
    const QByteArray end = "# The end\n\n[X-Own]\nExec=run\n";
    for (const EntryFinding &finding : check(start + line + '\n' + end)) {
        if (finding.problem != problem)
            continue;
        QVERIFY(finding.repair.has_value());
        QVERIFY(!finding.repair->label.isEmpty());
        VelUIDesktopEntry record(path(QStringLiteral("entry.desktop")));
        QVERIFY(finding.repair->changes(record));
        finding.repair->applyTo(&record);
        QVERIFY(!finding.repair->changes(record));
        QVERIFY(record.save());
        QCOMPARE(read(path(QStringLiteral("entry.desktop"))),
                 start + repaired + (repaired.isEmpty() ? "" : "\n") + end);
        return;
    }
    QFAIL("there is no such finding");
}

void tst_EntryCheck::leavesUnrepairedWhatARecordCannotReach_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("key twice") << Application + "Icon=a.png\nIcon=b.png\n";
    QTest::newRow("group twice") << Application + "Icon=a.png\n[Desktop Entry]\nComment=x\n";
    QTest::newRow("translation") << Application + "Icon=known\nIcon[de]=a.png\n";
    QTest::newRow("action that is not named")
        << Application + "Actions=old;\n[Desktop Action new]\nName=x\nIcon=a.png\nExec=run\n";
    QTest::newRow("action twice") << Application
            + "Actions=new;\n[Desktop Action new]\nName=x\nIcon=a.png\nExec=run\n[Desktop Action new]\n";
    QTest::newRow("half a group") << QByteArray(
        "[Desktop Entry]\nType=Application\nName=x\nExec=run\n[half\nIcon=a.png\n");
    QTest::newRow("empty item") << Application + "Categories=Game;;\n";
    QTest::newRow("false flag") << Application + "Terminal=no\n";
}

void tst_EntryCheck::leavesUnrepairedWhatARecordCannotReach()
{
    QFETCH(QByteArray, bytes);
    const EntryFindings findings = check(bytes);
    QVERIFY(!findings.isEmpty());
    for (const EntryFinding &finding : findings)
        QVERIFY2(!finding.repair, qPrintable(finding.sentence));
}

void tst_EntryCheck::saysEverySentenceInFull()
{
    for (const EntryFinding &finding :
         check("\xef\xbb\xbf[X-Own] \nx\n" + Application
               + "Icon=a.png\nVersion=9\nEncoding=x\nTerminal=yes\nURL=x\n"
                 "Categories=Fun;Audio;TrayIcon;\nMimeType=x;\nOnlyShowIn=x;\n")) {
        QVERIFY2(finding.sentence.endsWith(QLatin1Char('.'))
                     || finding.sentence.contains(QLatin1String(": ")),
                 qPrintable(finding.sentence));
        QVERIFY2(!finding.sentence.contains(QLatin1String("%1")), qPrintable(finding.sentence));
    }
}

void tst_EntryCheck::looksThroughTheLargestEntries_data()
{
    QTest::addColumn<QByteArray>("start");
    QTest::addColumn<QByteArray>("before");
    QTest::addColumn<QByteArray>("behind");
    QByteArray actions = Application + "Actions=";
    for (int i = 0; i < 60000; ++i)
        actions += QByteArray::number(i, 36) + ';';
    QTest::newRow("groups") << Application << QByteArray("[") << QByteArray("]\n");
    QTest::newRow("groups without a type") << QByteArray() << QByteArray("[") << QByteArray("]\nName=a\n");
    QTest::newRow("actions") << actions + '\n' << QByteArray("[Desktop Action ") << QByteArray("]\n");
    QTest::newRow("list") << Application + "Categories=" << QByteArray() << QByteArray(";");
    QTest::newRow("field codes") << Application + "Exec=run " << QByteArray("%x ") << QByteArray(" ");
    QTest::newRow("blanks in a path") << Application + "Exec=/run " << QByteArray("/") << QByteArray(" ");
}

// Whatever takes the square of their size does not come to an end here.
void tst_EntryCheck::looksThroughTheLargestEntries()
{
    QFETCH(QByteArray, start);
    QFETCH(QByteArray, before);
    QFETCH(QByteArray, behind);
    constexpr int largest = 1024 * 1024;
    QByteArray bytes = start;
    for (int i = 0; bytes.size() < largest - 100; ++i)
        bytes += before + QByteArray::number(i, 36) + behind;
    const EntryFindings findings = check(bytes + '\n');
    QVERIFY(!findings.isEmpty());
    for (const EntryFinding &finding : findings)
        QVERIFY2(!finding.repair, qPrintable(finding.sentence));
}

VEL_TEST_GUILESS_MAIN(tst_EntryCheck)

#include "tst_EntryCheck.moc"
