// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QFileInfo>

#include <sys/stat.h>

#include <functional>

using Change = std::function<void(VelUIDesktopEntry &)>;
Q_DECLARE_METATYPE(Change)

/// What a record reads, and which bytes it leaves behind when it is changed and saved.
class tst_VelUIDesktopEntry : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void isInvalidWithoutAnEntry_data();
    void isInvalidWithoutAnEntry();
    void loadsWhatCanBeReadAndNothingElse_data();
    void loadsWhatCanBeReadAndNothingElse();
    void readsBrokenLines_data();
    void readsBrokenLines();
    void readsValues_data();
    void readsValues();
    void readsLists_data();
    void readsLists();
    void readsFlags_data();
    void readsFlags();
    void readsTheVariantOfTheLocale_data();
    void readsTheVariantOfTheLocale();
    void neverGivesTheUnlocalisedValueForALocalOne();

    void givesBackEveryValueItWasGiven();
    void writesOnlyTheLinesOfChangedKeys_data();
    void writesOnlyTheLinesOfChangedKeys();
    void changesNothingWhenASetterGetsTheGettersValue_data();
    void changesNothingWhenASetterGetsTheGettersValue();
    void doesNotTouchTheFileWhenNothingChanged();
    void forgetsAChangeThatWasTakenBack();
    void startsANewFileWithItsGroupAndTheKeysInTheirOrder();
    void readsBackAnyTextItWrites_data();
    void readsBackAnyTextItWrites();
    void readsBackAnyListItWrites_data();
    void readsBackAnyListItWrites();
    void writesTheLocalVariantThatTheGetterFound_data();
    void writesTheLocalVariantThatTheGetterFound();

    void dropsWhatBelongsToTheOldTypeOnly();
    void keepsEverythingWhenTheTypeStays();

    void inheritsOnlyWhatItLacks();
    void inheritsActionsOnlyWithTheirList();
    void becomesValidByInheritingFromAValidRecord();

    void rebindsWithoutReading();
    void loadingDropsChanges();
    void becomesInvalidWhenLoadingFails();
    void isAValueWithSharedData();

private:
    // The bytes of a file that held `before`, after a change and a save.
    QByteArray changed(const QByteArray &before, const Change &change);
};

namespace {

const QByteArray Header = "[Desktop Entry]\n";

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

void tst_VelUIDesktopEntry::init()
{
    TestCase::init();
    qputenv("LANG", "de_DE.UTF-8");
    qunsetenv("LC_ALL");
    qunsetenv("LC_MESSAGES");
}

QByteArray tst_VelUIDesktopEntry::changed(const QByteArray &before, const Change &change)
{
    const QString file = write(QStringLiteral("x.desktop"), before);
    VelUIDesktopEntry record(file);
    change(record);
    if (!record.save())
        QTest::qFail("the record was not saved", __FILE__, __LINE__);
    return read(file);
}

void tst_VelUIDesktopEntry::isInvalidWithoutAnEntry_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("empty") << QByteArray();
    QTest::newRow("no group") << QByteArray("Name=A\n");
    QTest::newRow("another group") << QByteArray("[Other]\nName=A\n");
    QTest::newRow("header without end") << QByteArray("[Desktop Entry\nName=A\n");
    QTest::newRow("header with a tail") << QByteArray("[Desktop Entry] x\nName=A\n");
    QTest::newRow("two brackets") << QByteArray("[Desktop Entry]]\nName=A\n");
    QTest::newRow("commented out") << QByteArray("#[Desktop Entry]\nName=A\n");
    QTest::newRow("zero bytes") << QByteArray(4096, '\0');
    QTest::newRow("UTF-16") << QByteArray("\xFF\xFE[\0D\0", 6);
}

void tst_VelUIDesktopEntry::isInvalidWithoutAnEntry()
{
    QFETCH(QByteArray, bytes);
    VelUIDesktopEntry record(write(QStringLiteral("x.desktop"), bytes));
    QVERIFY(!record.isValid());
    QCOMPARE(record.getName(), QString());
    record.setName(QStringLiteral("B"));
    QVERIFY(!record.isValid());
}

void tst_VelUIDesktopEntry::loadsWhatCanBeReadAndNothingElse_data()
{
    QTest::addColumn<QString>("kind");
    QTest::addColumn<bool>("loads");
    QTest::newRow("nothing there") << QStringLiteral("missing") << false;
    QTest::newRow("a folder") << QStringLiteral("folder") << false;
    QTest::newRow("a named pipe") << QStringLiteral("pipe") << false;
    QTest::newRow("a device") << QStringLiteral("device") << false;
    QTest::newRow("a dangling link") << QStringLiteral("dangling") << false;
    QTest::newRow("a link in a circle") << QStringLiteral("circle") << false;
    QTest::newRow("no path") << QStringLiteral("unbound") << false;
    QTest::newRow("larger than 1 MiB") << QStringLiteral("large") << false;
    QTest::newRow("1 MiB") << QStringLiteral("full") << true;
    QTest::newRow("an empty file") << QStringLiteral("empty") << true;
    QTest::newRow("a link to a file") << QStringLiteral("link") << true;
}

void tst_VelUIDesktopEntry::loadsWhatCanBeReadAndNothingElse()
{
    QFETCH(QString, kind);
    QFETCH(bool, loads);
    const QString file = path(QStringLiteral("x.desktop"));
    const QByteArray start = Header + "Name=A\n#";
    if (kind == QLatin1String("folder"))
        QVERIFY(QDir().mkpath(file));
    else if (kind == QLatin1String("pipe"))
        QCOMPARE(::mkfifo(qPrintable(file), 0600), 0);
    else if (kind == QLatin1String("device"))
        QVERIFY(QFile::link(QStringLiteral("/dev/zero"), file));
    else if (kind == QLatin1String("dangling"))
        QVERIFY(QFile::link(QStringLiteral("nowhere"), file));
    else if (kind == QLatin1String("circle"))
        QVERIFY(QFile::link(QStringLiteral("x.desktop"), file));
    else if (kind == QLatin1String("large") || kind == QLatin1String("full"))
        write(QStringLiteral("x.desktop"),
              start + QByteArray(1024 * 1024 - start.size() + (loads ? 0 : 1), 'x'));
    else if (kind == QLatin1String("empty"))
        write(QStringLiteral("x.desktop"), {});
    else if (kind == QLatin1String("link"))
        QVERIFY(QFile::link(write(QStringLiteral("real"), start), file));

    VelUIDesktopEntry record;
    if (kind != QLatin1String("unbound"))
        record.setFilePath(file);
    QCOMPARE(record.load(), loads);
    QCOMPARE(record.isValid(), loads && kind != QLatin1String("empty"));
}

void tst_VelUIDesktopEntry::readsBrokenLines_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("name");
    QTest::newRow("garbage between") << Header + "garbage\n=\n=x\n;\nName=A\n" << text("A");
    QTest::newRow("key before any group") << "Name=B\n" + Header << QString();
    QTest::newRow("no line end") << Header + "Name=A" << text("A");
    QTest::newRow("carriage returns") << QByteArray("[Desktop Entry]\r\nName=A\r\n") << text("A");
    QTest::newRow("carriage return at the end") << Header + "Name=A\r" << text("A");
    QTest::newRow("byte order mark") << "\xEF\xBB\xBF" + Header + "Name=A\n" << text("A");
    QTest::newRow("blanks around") << QByteArray(" \t[Desktop Entry] \t\n \tName \t= \tA\n") << text("A");
    QTest::newRow("comment that looks like a key") << Header + "# Name=B\n  #Name=C\n" << QString();
    QTest::newRow("duplicate keys: the last") << Header + "Name=A\nName=B\n" << text("B");
    QTest::newRow("duplicate groups: the last") << Header + "Name=A\n" + Header + "Name=B\n" << text("B");
    QTest::newRow("duplicate groups: the last alone") << Header + "Name=A\n" + Header + "Icon=B\n"
                                                      << QString();
    QTest::newRow("not valid UTF-8") << Header + "Name=A\xFF\n" << QString();
    QTest::newRow("cut off UTF-8") << Header + "Name=A\xC3\n" << QString();
    QTest::newRow("overlong UTF-8") << Header + "Name=A\xC0\x80\n" << QString();
    QTest::newRow("surrogate in UTF-8") << Header + "Name=A\xED\xA0\x80\n" << QString();
    QTest::newRow("beyond Unicode") << Header + "Name=A\xF4\x90\x80\x80\n" << QString();
    QTest::newRow("other key not valid UTF-8") << Header + "Icon=\xFF\nName=A\n" << text("A");
    QTest::newRow("keys behind a broken header are not ours") << Header + "[Desktop Action a\nName=B\n"
                                                              << QString();
    QTest::newRow("empty language is another key") << Header + "Name[]=B\n" << QString();
    QTest::newRow("case counts") << Header + "NAME=B\n" << QString();
}

void tst_VelUIDesktopEntry::readsBrokenLines()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, name);
    const QString file = write(QStringLiteral("x.desktop"), bytes);
    VelUIDesktopEntry record(file);
    QVERIFY(record.isValid());
    QCOMPARE(record.getName(), name);

    record.setComment(QStringLiteral("new"));
    QVERIFY(record.save());
    QCOMPARE(VelUIDesktopEntry(file).getName(), name);
    QCOMPARE(VelUIDesktopEntry(file).getComment(), QStringLiteral("new"));
    for (const QByteArray &line : bytes.split('\n'))
        QVERIFY2(read(file).contains(line), line.constData());
}

void tst_VelUIDesktopEntry::readsValues_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("value");
    QTest::newRow("plain") << QByteArray("A b") << text("A b");
    QTest::newRow("trailing blanks stay") << QByteArray("A \t") << text("A \t");
    QTest::newRow("leading blanks go") << QByteArray(" \tA") << text("A");
    QTest::newRow("leading blank escaped") << QByteArray("\\sA") << text(" A");
    QTest::newRow("all escapes") << QByteArray("a\\sb\\nc\\td\\re\\\\f") << text("a b\nc\td\re\\f");
    QTest::newRow("unknown escapes stay") << QByteArray("\\a\\;\\x") << text("\\a\\;\\x");
    QTest::newRow("backslash at the end stays") << QByteArray("A\\") << text("A\\");
    QTest::newRow("escaped backslash first") << QByteArray("\\\\n") << text("\\n");
    QTest::newRow("equals sign") << QByteArray("a=b") << text("a=b");
    QTest::newRow("comment sign") << QByteArray("a # b") << text("a # b");
    QTest::newRow("two to four bytes")
        << QByteArray("\xC3\xA4\xE2\x82\xAC\xF0\x9F\x98\x80") << text("\xC3\xA4\xE2\x82\xAC\xF0\x9F\x98\x80");
    QTest::newRow("byte order mark inside")
        << QByteArray("\xEF\xBB\xBFx") << QString(QChar(0xFEFF)) + QLatin1Char('x');
    QTest::newRow("zero byte") << QByteArray("a\0b", 3) << QString::fromLatin1("a\0b", 3);
}

void tst_VelUIDesktopEntry::readsValues()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, value);
    const VelUIDesktopEntry record(write(QStringLiteral("x.desktop"), Header + "Name=" + bytes + "\n"));
    QCOMPARE(record.getName(), value);
}

void tst_VelUIDesktopEntry::readsLists_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QStringList>("items");
    const auto row = [](const char *name, const QByteArray &bytes, const QStringList &items) {
        QTest::newRow(name) << bytes << items;
    };
    row("empty", "", {});
    row("separators alone", ";;;", {});
    row("with a last separator", "a;b;", {text("a"), text("b")});
    row("without a last separator", "a;b", {text("a"), text("b")});
    row("empty items are dropped", ";a;;b;;", {text("a"), text("b")});
    row("escaped separator", "a\\;b;c;", {text("a;b"), text("c")});
    row("escaped backslash before a separator", "a\\\\;b;", {text("a\\"), text("b")});
    row("blanks inside stay", "a; b ;", {text("a"), text(" b ")});
    row("other escapes", "\\sa\\n;\\q;", {text(" a\n"), text("\\q")});
    row("one item not valid UTF-8 spoils the key", "a;\xFF;", {});
}

void tst_VelUIDesktopEntry::readsLists()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QStringList, items);
    const VelUIDesktopEntry record(write(QStringLiteral("x.desktop"), Header + "Keywords=" + bytes + "\n"));
    QCOMPARE(record.getKeywords(), items);
}

void tst_VelUIDesktopEntry::readsFlags_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<bool>("value");
    QTest::newRow("absent") << QByteArray() << false;
    QTest::newRow("true") << QByteArray("Terminal=true\n") << true;
    QTest::newRow("false") << QByteArray("Terminal=false\n") << false;
    QTest::newRow("1, as entries once had it") << QByteArray("Terminal=1\n") << true;
    QTest::newRow("0") << QByteArray("Terminal=0\n") << false;
    QTest::newRow("a blank behind") << QByteArray("Terminal=true \n") << true;
    QTest::newRow("other case") << QByteArray("Terminal=True\n") << false;
    QTest::newRow("garbage") << QByteArray("Terminal=truely\n") << false;
}

void tst_VelUIDesktopEntry::readsFlags()
{
    QFETCH(QByteArray, bytes);
    QFETCH(bool, value);
    QCOMPARE(VelUIDesktopEntry(write(QStringLiteral("x.desktop"), Header + bytes)).getTerminal(), value);
}

void tst_VelUIDesktopEntry::readsTheVariantOfTheLocale_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArray>("variants");
    QTest::addColumn<QString>("found");
    const auto row = [](const char *locale, const QByteArray &variants, const char *found) {
        QTest::addRow("%s in %s", locale, variants.constData())
            << QByteArray(locale) << variants << text(found);
    };
    row("sr_RS.UTF-8@latin", "sr sr@latin sr_RS sr_RS@latin", "sr_RS@latin");
    row("sr_RS.UTF-8@latin", "sr sr@latin sr_RS", "sr_RS");
    row("sr_RS.UTF-8@latin", "sr sr@latin", "sr@latin");
    row("sr_RS.UTF-8@latin", "sr", "sr");
    row("sr_RS.UTF-8@latin", "sr_ME sr@cyrillic en", "");
    row("sr@latin", "sr sr@latin sr_RS sr_RS@latin", "sr@latin");
    row("sr@latin", "sr_RS sr", "sr");
    row("de_DE.UTF-8", "de_AT de_DE de", "de_DE");
    row("de_DE", "de_DE@euro de_AT de", "de");
    row("de_AT.UTF-8", "de_DE", "");
    row("de", "de_DE den d", "");
    row("de", "de_DE de", "de");
    row("C", "en_GB en de", "en");
    row("C.UTF-8", "en de", "en");
    row("POSIX", "en de", "en");
    row("POSIX", "en_US C POSIX", "");
    row("", "en de", "en");
    row("en_US.UTF-8", "en de", "en");
}

void tst_VelUIDesktopEntry::readsTheVariantOfTheLocale()
{
    QFETCH(QByteArray, locale);
    QFETCH(QByteArray, variants);
    QFETCH(QString, found);
    QByteArray lines = Header + "Name=base\n";
    for (const QByteArray &variant : variants.split(' '))
        lines += "Name[" + variant + "]=" + variant + "\nKeywords[" + variant + "]=" + variant + ";\n";
    qputenv("LANG", "fr_FR.UTF-8");
    qputenv("LC_MESSAGES", locale);
    if (locale.isEmpty())
        qputenv("LANG", "");
    const VelUIDesktopEntry record(write(QStringLiteral("x.desktop"), lines));
    QCOMPARE(record.getLocalName(), found);
    QCOMPARE(record.getLocalKeywords(), found.isEmpty() ? QStringList() : QStringList(found));
    QCOMPARE(record.getName(), QStringLiteral("base"));

    qputenv("LC_ALL", "xx");
    QCOMPARE(record.getLocalName(), QString());
}

void tst_VelUIDesktopEntry::neverGivesTheUnlocalisedValueForALocalOne()
{
    const VelUIDesktopEntry record(write(
        QStringLiteral("x.desktop"),
        Header + "Name=a\nGenericName=a\nComment=a\nIcon=a\nKeywords=a;\nName[fr]=b\nComment[de]=\xFF\n"));
    QCOMPARE(record.getLocalName() + record.getLocalGenericName() + record.getLocalComment()
                 + record.getLocalIcon(),
             QString());
    QVERIFY(record.getLocalKeywords().isEmpty());
}

namespace {

// Every text, list and flag of a record under its own name, to run over all of them.
struct TextField
{
    const char *key;
    QString (VelUIDesktopEntry::*get)() const;
    void (VelUIDesktopEntry::*set)(const QString &);
};

struct ListField
{
    const char *key;
    QStringList (VelUIDesktopEntry::*get)() const;
    void (VelUIDesktopEntry::*set)(const QStringList &);
};

struct FlagField
{
    const char *key;
    bool (VelUIDesktopEntry::*get)() const;
    void (VelUIDesktopEntry::*set)(bool);
};

#define FIELD(key, Name) \
    { \
        key, &VelUIDesktopEntry::get##Name, &VelUIDesktopEntry::set##Name \
    }

const TextField Texts[] = {
    FIELD("Type", Type),
    FIELD("Name", Name),
    FIELD("Name[de]", LocalName),
    FIELD("GenericName", GenericName),
    FIELD("GenericName[de]", LocalGenericName),
    FIELD("Comment", Comment),
    FIELD("Comment[de]", LocalComment),
    FIELD("Icon", Icon),
    FIELD("Icon[de]", LocalIcon),
    FIELD("Exec", Exec),
    FIELD("TryExec", TryExec),
    FIELD("Path", Path),
    FIELD("URL", URL),
    FIELD("StartupWMClass", StartupWMClass),
    FIELD("Version", Version),
};

const ListField Lists[] = {
    FIELD("OnlyShowIn", OnlyShowIn), FIELD("NotShowIn", NotShowIn), FIELD("MimeType", MimeType),
    FIELD("Categories", Categories), FIELD("Keywords", Keywords),   FIELD("Keywords[de]", LocalKeywords),
    FIELD("SortOrder", SortOrder),
};

const FlagField Flags[] = {
    FIELD("Terminal", Terminal),
    FIELD("NoDisplay", NoDisplay),
    FIELD("Hidden", Hidden),
    FIELD("StartupNotify", StartupNotify),
};

#undef FIELD

} // namespace

void tst_VelUIDesktopEntry::givesBackEveryValueItWasGiven()
{
    const QString file = path(QStringLiteral("new.desktop"));
    VelUIDesktopEntry record(file);
    for (const TextField &field : Texts)
        (record.*field.set)(QLatin1String("text of ") + QLatin1String(field.key));
    for (const ListField &field : Lists)
        (record.*field.set)({QLatin1String(field.key), QStringLiteral("x;y")});
    for (const FlagField &field : Flags)
        (record.*field.set)(true);
    QVERIFY(record.save());

    const QByteArray bytes = read(file);
    const VelUIDesktopEntry again(file);
    for (const VelUIDesktopEntry &each : {record, again}) {
        for (const TextField &field : Texts)
            QCOMPARE((each.*field.get)(), QLatin1String("text of ") + QLatin1String(field.key));
        for (const ListField &field : Lists)
            QCOMPARE((each.*field.get)(), (QStringList{QLatin1String(field.key), QStringLiteral("x;y")}));
        for (const FlagField &field : Flags)
            QVERIFY((each.*field.get)());
    }
    for (const TextField &field : Texts)
        QVERIFY(bytes.contains(QByteArray("\n") + field.key + "=text of " + field.key + "\n"));
    for (const ListField &field : Lists)
        QVERIFY(bytes.contains(QByteArray("\n") + field.key + "=" + field.key + ";x\\;y;\n"));
    for (const FlagField &field : Flags)
        QVERIFY(bytes.contains(QByteArray("\n") + field.key + "=true\n"));
}

void tst_VelUIDesktopEntry::writesOnlyTheLinesOfChangedKeys_data()
{
    QTest::addColumn<QByteArray>("before");
    QTest::addColumn<Change>("change");
    QTest::addColumn<QByteArray>("after");
    const auto row = [](const char *name, const QByteArray &before, const Change &change,
                        const QByteArray &after) { QTest::newRow(name) << before << change << after; };
    const Change name = [](auto &record) { record.setName(QStringLiteral("New")); };
    const Change noName = [](auto &record) { record.setName(QString()); };
    const Change icon = [](auto &record) { record.setIcon(QStringLiteral("i")); };
    const Change local = [](auto &record) { record.setLocalName(QStringLiteral("Neu")); };
    const Change noTerminal = [](auto &record) { record.setTerminal(false); };

    row("value", Header + "#c\n\nName=A\nX-a = 1\nName[fr]=F\n", name,
        Header + "#c\n\nName=New\nX-a = 1\nName[fr]=F\n");
    row("value with blanks before it", Header + " Name \t=  A\n", name, Header + " Name \t=  New\n");
    row("value in the last line", Header + "Name=A", name, Header + "Name=New");
    row("value with carriage return", "[Desktop Entry]\r\nName=A\r\nIcon=x\r\n", name,
        "[Desktop Entry]\r\nName=New\r\nIcon=x\r\n");
    row("byte order mark", "\xEF\xBB\xBF" + Header + "Name=A\n", name,
        "\xEF\xBB\xBF" + Header + "Name=New\n");
    row("value that was spoiled", Header + "Name=\xFF\n", name, Header + "Name=New\n");
    row("empty value", Header + "Name=\nIcon=i\n", name, Header + "Name=New\nIcon=i\n");
    row("the last of duplicates", Header + "Name=A\nName=B\n", name, Header + "Name=A\nName=New\n");
    row("the last of duplicate groups", Header + "Name=A\n" + Header + "Name=B\n", name,
        Header + "Name=A\n" + Header + "Name=New\n");
    row("spoiled lines elsewhere stay", Header + "Icon=\xFF\nName=A\n", name,
        Header + "Icon=\xFF\nName=New\n");

    row("removal", Header + "Icon=i\nName=A\nName[de]=B\n#end\n", noName,
        Header + "Icon=i\nName[de]=B\n#end\n");
    row("removal of the last line", Header + "Icon=i\nName=A", noName, Header + "Icon=i\n");
    row("removal of all duplicates", Header + "Name=A\nIcon=i\nName=B\n" + Header + "Name=C\n", noName,
        Header + "Icon=i\n" + Header);

    row("new key", Header + "Name=A\n", icon, Header + "Name=A\nIcon=i\n");
    row("new key before trailing blanks and comments", Header + "Name=A\n\n# end\n\n[Other]\nx=y\n", icon,
        Header + "Name=A\nIcon=i\n\n# end\n\n[Other]\nx=y\n");
    row("new key in an empty group", Header + "# only\n", icon, Header + "Icon=i\n# only\n");
    row("new key behind a line without end", Header + "Name=A", icon, Header + "Name=A\nIcon=i\n");
    row("new key behind a header without end", "[Desktop Entry]", icon, Header + "Icon=i\n");
    row("new key with carriage returns", "[Desktop Entry]\r\nName=A\r\n", icon,
        "[Desktop Entry]\r\nName=A\r\nIcon=i\r\n");
    row("new key with carriage returns but at the end", "[Desktop Entry]\r\nName=A", icon,
        "[Desktop Entry]\r\nName=A\r\nIcon=i\r\n");
    row("new key in a file without the group", "# mine\n", icon, "# mine\n\n" + Header + "Icon=i\n");
    row("new key in a file of other groups", "# mine\n\n# other\n[Other]\nx=y\n", icon,
        "# mine\n\n" + Header + "Icon=i\n\n# other\n[Other]\nx=y\n");
    row("new key in an empty file", "", icon, Header + "Icon=i\n");
    row("new key in a file with a mark only", "\xEF\xBB\xBF", icon, "\xEF\xBB\xBF" + Header + "Icon=i\n");

    row("new variant behind its key", Header + "Name=A\nIcon=i\n", local,
        Header + "Name=A\nName[de]=Neu\nIcon=i\n");
    row("new variant behind the other variants", Header + "Name=A\nName[fr]=F\nIcon=i\n#c\n", local,
        Header + "Name=A\nName[fr]=F\nName[de]=Neu\nIcon=i\n#c\n");
    row("new variant without its key", Header + "Icon=i\n", local, Header + "Icon=i\nName[de]=Neu\n");
    row(
        "new variant and new key", Header + "Name=A\n",
        [](auto &record) {
            record.setIcon(QStringLiteral("i"));
            record.setComment(QStringLiteral("c"));
            record.setLocalIcon(QStringLiteral("l"));
            record.setLocalName(QStringLiteral("Neu"));
        },
        Header + "Name=A\nName[de]=Neu\nIcon=i\nIcon[de]=l\nComment=c\n");

    row("false where true stands", Header + "Terminal=true\n", noTerminal, Header + "Terminal=false\n");
    row(
        "list", Header + "Keywords=a;;b\n",
        [](auto &record) {
            record.setKeywords({text("a"), text(""), text("c")});
        },
        Header + "Keywords=a;c;\n");
    row(
        "list that became empty", Header + "Keywords=a;\nName=A\n",
        [](auto &record) { record.setKeywords({QString()}); }, Header + "Name=A\n");
    row(
        "removal and new key", Header + "Name=A\n\n[Other]\n",
        [](auto &record) {
            record.setName({});
            record.setIcon(QStringLiteral("i"));
        },
        Header + "Icon=i\n\n[Other]\n");
}

void tst_VelUIDesktopEntry::writesOnlyTheLinesOfChangedKeys()
{
    QFETCH(QByteArray, before);
    QFETCH(Change, change);
    QFETCH(QByteArray, after);
    QCOMPARE(changed(before, change), after);
}

void tst_VelUIDesktopEntry::changesNothingWhenASetterGetsTheGettersValue_data()
{
    QTest::addColumn<QByteArray>("value");
    QTest::newRow("absent") << QByteArray();
    QTest::newRow("empty") << QByteArray("@=\n");
    QTest::newRow("blank") << QByteArray("@ =  \n");
    QTest::newRow("text") << QByteArray("@=true\n");
    QTest::newRow("escapes written in another way") << QByteArray("@=a\\sb\\q\tc\n");
    QTest::newRow("list with empty items and no end") << QByteArray("@=a;;b\n");
    QTest::newRow("list of nothing") << QByteArray("@=;;\n");
    QTest::newRow("spoiled") << QByteArray("@=\xFF\n");
    QTest::newRow("no flag") << QByteArray("@=0\n");
    QTest::newRow("duplicates") << QByteArray("@=x\n@=y\n");
}

void tst_VelUIDesktopEntry::changesNothingWhenASetterGetsTheGettersValue()
{
    QFETCH(QByteArray, value);
    QByteArray bytes = Header + "# comment\n";
    for (const TextField &field : Texts)
        bytes += QByteArray(value).replace('@', field.key);
    for (const ListField &field : Lists)
        bytes += QByteArray(value).replace('@', field.key);
    for (const FlagField &field : Flags)
        bytes += QByteArray(value).replace('@', field.key);
    QCOMPARE(changed(bytes,
                     [](VelUIDesktopEntry &record) {
                         for (const TextField &field : Texts)
                             (record.*field.set)((record.*field.get)());
                         for (const ListField &field : Lists)
                             (record.*field.set)((record.*field.get)());
                         for (const FlagField &field : Flags)
                             (record.*field.set)((record.*field.get)());
                         record.setActions(record.getActions());
                     }),
             bytes);
}

void tst_VelUIDesktopEntry::doesNotTouchTheFileWhenNothingChanged()
{
    const QString file = write(QStringLiteral("x.desktop"), Header + "Name=A");
    struct stat before;
    QCOMPARE(::stat(qPrintable(file), &before), 0);
    VelUIDesktopEntry record(file);
    record.setName(QStringLiteral("A"));
    QVERIFY(record.save());
    struct stat after;
    QCOMPARE(::stat(qPrintable(file), &after), 0);
    QCOMPARE(after.st_ino, before.st_ino);
    QCOMPARE(after.st_mtim.tv_nsec, before.st_mtim.tv_nsec);
    QCOMPARE(after.st_ctim.tv_nsec, before.st_ctim.tv_nsec);
}

void tst_VelUIDesktopEntry::forgetsAChangeThatWasTakenBack()
{
    const QByteArray bytes = Header + "Name=a\\sb\nKeywords=a;b\nTerminal=1\nName[de]=x\n";
    QCOMPARE(changed(bytes,
                     [](VelUIDesktopEntry &record) {
                         record.setName(QStringLiteral("x"));
                         record.setName(QStringLiteral("a b"));
                         record.setKeywords({});
                         record.setKeywords({QStringLiteral("a"), QStringLiteral("b")});
                         record.setTerminal(false);
                         record.setTerminal(true);
                         record.setLocalName({});
                         record.setLocalName(QStringLiteral("x"));
                         record.setIcon(QStringLiteral("new"));
                         record.setIcon({});
                         record.setHidden(true);
                         record.setHidden(false);
                     }),
             bytes);
}

void tst_VelUIDesktopEntry::startsANewFileWithItsGroupAndTheKeysInTheirOrder()
{
    const QString file = path(QStringLiteral("new.desktop"));
    VelUIDesktopEntry record;
    record.setFilePath(file);
    QVERIFY(!record.load());
    VelUIDesktopAction action(QStringLiteral("a"));
    action.setName(QStringLiteral("Do"));
    record.setActions({action});
    record.setType(QStringLiteral("Application"));
    record.setIcon(QStringLiteral("i"));
    record.setName(QStringLiteral("N"));
    record.setHidden(false);
    record.setIcon(QStringLiteral("j"));
    record.setComment({});
    record.setKeywords({QStringLiteral("a"), QStringLiteral("b")});
    QVERIFY(record.save());
    QCOMPARE(
        read(file),
        Header
            + "Actions=a;\nType=Application\nIcon=j\nName=N\nKeywords=a;b;\n\n[Desktop Action a]\nName=Do\n");
}

void tst_VelUIDesktopEntry::readsBackAnyTextItWrites_data()
{
    QTest::addColumn<QString>("value");
    for (const char *value :
         {" leading", "\tleading", "trailing ", " ", "  ", "\\", "\\n", "a\nb", "a\r", "\r\n", "a\tb", ";",
          "a;b", "\\;", "#x", "=x", "[x]", "\xC3\xA4\xF0\x9F\x98\x80"})
        QTest::newRow(value) << text(value);
    QTest::newRow("byte order mark") << QString(QChar(0xFEFF)) + QLatin1Char('x');
    QTest::newRow("zero") << QString(QChar(0)) + QLatin1Char('x');
    QTest::newRow("line separators") << QString(QChar(0x2028)) + QChar(0x85) + QChar(0x0B);
}

void tst_VelUIDesktopEntry::readsBackAnyTextItWrites()
{
    QFETCH(QString, value);
    const QString file = write(QStringLiteral("x.desktop"), Header + "Icon=i\n");
    VelUIDesktopEntry record(file);
    record.setName(value);
    record.setLocalName(value);
    QCOMPARE(record.getName(), value);
    QVERIFY(record.save());
    QCOMPARE(record.getName(), value);
    QCOMPARE(VelUIDesktopEntry(file).getName(), value);
    QCOMPARE(VelUIDesktopEntry(file).getLocalName(), value);
    QCOMPARE(read(file).count('\n'), 4);
}

void tst_VelUIDesktopEntry::readsBackAnyListItWrites_data()
{
    QTest::addColumn<QStringList>("value");
    QTest::newRow("separator") << QStringList{text("a;b"), text(";"), text("\\;"), text("\\")};
    QTest::newRow("blanks") << QStringList{text(" a"), text(" b "), text(" ")};
    QTest::newRow("line ends") << QStringList{text("\na"), text("b\r"), text("\t")};
}

void tst_VelUIDesktopEntry::readsBackAnyListItWrites()
{
    QFETCH(QStringList, value);
    const QString file = write(QStringLiteral("x.desktop"), Header);
    VelUIDesktopEntry record(file);
    record.setSortOrder(value);
    QCOMPARE(record.getSortOrder(), value);
    QVERIFY(record.save());
    QCOMPARE(VelUIDesktopEntry(file).getSortOrder(), value);
}

void tst_VelUIDesktopEntry::writesTheLocalVariantThatTheGetterFound_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArray>("before");
    QTest::addColumn<QString>("value");
    QTest::addColumn<QByteArray>("after");
    const auto row = [](const char *name, const char *locale, const char *before, const char *value,
                        const char *after) {
        QTest::newRow(name) << QByteArray(locale) << QByteArray(before) << text(value) << QByteArray(after);
    };
    row("the exact one", "de_DE.UTF-8", "Name=a\nName[de]=b\nName[de_DE]=c\n", "X",
        "Name=a\nName[de]=b\nName[de_DE]=X\n");
    row("the less exact one", "de_DE.UTF-8", "Name=a\nName[de]=b\nName[de_AT]=c\n", "X",
        "Name=a\nName[de]=X\nName[de_AT]=c\n");
    row("a new one for the language", "de_DE.UTF-8", "Name=a\nName[de_AT]=c\n", "X",
        "Name=a\nName[de_AT]=c\nName[de]=X\n");
    row("a new one by country", "pt_BR.UTF-8", "Name=a\n", "X", "Name=a\nName[pt_BR]=X\n");
    row("a new one for no locale", "C", "Name=a\n", "X", "Name=a\nName[en]=X\n");
    row("the spoiled one", "de_DE.UTF-8", "Name=a\nName[de]=\xFF\n", "X", "Name=a\nName[de]=X\n");
    row("removal of the one found", "de_DE.UTF-8", "Name=a\nName[de]=b\nName[de_DE]=c\n", "",
        "Name=a\nName[de]=b\n");
    row("removal of duplicates", "de_DE.UTF-8", "Name[de]=a\nName=a\nName[de]=b\n", "", "Name=a\n");
    row("removal of nothing", "de_DE.UTF-8", "Name=a\nName[fr]=b\n", "", "Name=a\nName[fr]=b\n");
}

void tst_VelUIDesktopEntry::writesTheLocalVariantThatTheGetterFound()
{
    QFETCH(QByteArray, locale);
    QFETCH(QByteArray, before);
    QFETCH(QString, value);
    QFETCH(QByteArray, after);
    qputenv("LANG", locale);
    QCOMPARE(changed(Header + before, [value](auto &record) { record.setLocalName(value); }), Header + after);
}

void tst_VelUIDesktopEntry::dropsWhatBelongsToTheOldTypeOnly()
{
    const QByteArray common =
        "Name=A\nName[fr]=B\nIcon=i\nHidden=true\nOnlyShowIn=VEL;\nX-Own=1\nX-Own[de]=2\n";
    const QByteArray application =
        "Exec=e\nTryExec=t\nPath=p\nTerminal=true\nActions=a;\nMimeType=a/b;\nCategories=C;\n"
        "Keywords=k;\nKeywords[fr]=k;\nKeywords[de]=k;\nStartupNotify=true\n"
        "StartupWMClass=c\nPrefersNonDefaultGPU=true\nSingleMainWindow=true\n";
    const QByteArray groups =
        "\n[Desktop Action a]\nName=Do\n\n[Desktop Action nobody]\nName=Stay\n\n[X-Group]\nExec=e\n";
    const QByteArray nobody = "\n[Desktop Action nobody]\nName=Stay\n\n[X-Group]\nExec=e\n";

    const Change toLink = [](auto &record) { record.setType(QStringLiteral("Link")); };
    QCOMPARE(changed(Header + "Type=Application\n" + application + common + "URL=u\n" + groups, toLink),
             Header + "Type=Link\n" + common + "URL=u\n" + nobody);
    const Change toDirectory = [](auto &record) { record.setType(QStringLiteral("Directory")); };
    QCOMPARE(changed(Header + "Type=Link\n" + common + "URL=u\nSortOrder=a;\nExec=e\n", toDirectory),
             Header + "Type=Directory\n" + common + "SortOrder=a;\nExec=e\n");
    const Change toApplication = [](auto &record) { record.setType(QStringLiteral("Application")); };
    QCOMPARE(changed(Header + "Type=Directory\n" + common + "SortOrder=a;\n", toApplication),
             Header + "Type=Application\n" + common + "SortOrder=a;\n");
    QCOMPARE(changed(Header + "Exec=e\nURL=u\n", toApplication),
             Header + "Exec=e\nURL=u\nType=Application\n");
    QCOMPARE(changed(Header + "Type=Application\n",
                     [](auto &record) {
                         record.setExec(QStringLiteral("new"));
                         record.setLocalKeywords({QStringLiteral("new")});
                         record.setType(QStringLiteral("Link"));
                     }),
             Header + "Type=Link\n");
}

void tst_VelUIDesktopEntry::keepsEverythingWhenTheTypeStays()
{
    const QByteArray bytes = Header + "Type=Link\nURL=u\nExec=e\n";
    QCOMPARE(changed(bytes, [](auto &record) { record.setType(QStringLiteral("Link")); }), bytes);
}

void tst_VelUIDesktopEntry::inheritsOnlyWhatItLacks()
{
    const VelUIDesktopEntry model(
        write(QStringLiteral("model.desktop"),
              "# not a key\n" + Header
                  + "Type=Application\nName=M\nName[fr]=MF\nComment=C\nComment[de]=CD\nComment[fr]="
                    "\xFF\nGenericName[fr]=G\n"
                    "Keywords=a;;b\nX-Own=\xFE\nIcon=mi\nIcon=mj\n\n[X-Group]\nx=y\nz=1\n"));
    QCOMPARE(changed(Header + "Name=A\nIcon=\nComment[de]=mine\n\n[X-Group]\nx=own\n",
                     [&model](auto &record) { record.inheritFrom(model); }),
             Header
                 + "Name=A\nIcon=\nComment[de]=mine\nComment[fr]=\xFF\nType=Application\nComment=C\nKeywords="
                   "a;;b\nX-Own=\xFE\n"
                   "\n[X-Group]\nx=own\nz=1\n");

    const QByteArray bytes = Header + "Name=A\n";
    QCOMPARE(changed(bytes, [](auto &record) { record.inheritFrom(record); }), bytes);
    QCOMPARE(changed(Header + "Name=A\n",
                     [](auto &record) {
                         VelUIDesktopEntry other;
                         other.setIcon(QStringLiteral("i"));
                         other.setLocalIcon(QStringLiteral("l"));
                         record.inheritFrom(other);
                     }),
             Header + "Name=A\nIcon=i\nIcon[de]=l\n");
}

void tst_VelUIDesktopEntry::inheritsActionsOnlyWithTheirList()
{
    const VelUIDesktopEntry model(write(
        QStringLiteral("model.desktop"),
        Header + "Actions=a;b\n\n[Desktop Action a]\nName=A\nX-a=1\n\n[Desktop Action other]\nName=O\n"));
    const Change inherit = [&model](auto &record) { record.inheritFrom(model); };
    QCOMPARE(changed(Header + "Name=N\n", inherit),
             Header + "Name=N\nActions=a;b\n\n[Desktop Action a]\nName=A\nX-a=1\n");
    QCOMPARE(changed(Header + "Actions=c;\n", inherit), Header + "Actions=c;\n");
    QCOMPARE(changed(Header + "Actions=\n", inherit), Header + "Actions=\n");
}

void tst_VelUIDesktopEntry::becomesValidByInheritingFromAValidRecord()
{
    const VelUIDesktopEntry model(write(QStringLiteral("model.desktop"), Header + "Name=A\n"));
    VelUIDesktopEntry record;
    record.inheritFrom(VelUIDesktopEntry());
    QVERIFY(!record.isValid());
    record.inheritFrom(VelUIDesktopEntry(write(QStringLiteral("bare.desktop"), Header)));
    QVERIFY(!record.isValid());
    record.inheritFrom(model);
    QVERIFY(record.isValid());
    QCOMPARE(record.getName(), QStringLiteral("A"));

    VelUIDesktopEntry unread;
    unread.setName(QStringLiteral("B"));
    VelUIDesktopEntry heir;
    heir.inheritFrom(unread);
    QCOMPARE(heir.getName(), QStringLiteral("B"));
    QVERIFY(!heir.isValid());
}

void tst_VelUIDesktopEntry::rebindsWithoutReading()
{
    const QString a = write(QStringLiteral("a.desktop"), Header + "Name=A\n# a\n");
    const QString b = write(QStringLiteral("b.desktop"), Header + "Name=B\nIcon=b\n");
    VelUIDesktopEntry record(a);
    record.setFilePath(b);
    QCOMPARE(record.getName(), QStringLiteral("A"));
    QVERIFY(record.isValid());
    QVERIFY(record.save());
    QCOMPARE(read(b), Header + "Name=A\n# a\n");
    QCOMPARE(read(a), Header + "Name=A\n# a\n");

    VelUIDesktopEntry unread;
    unread.setFilePath(b);
    QVERIFY(!unread.isValid());
    unread.setIcon(QStringLiteral("c"));
    QVERIFY(unread.save());
    QCOMPARE(read(b), Header + "Name=A\nIcon=c\n# a\n");
}

void tst_VelUIDesktopEntry::loadingDropsChanges()
{
    const QString file = write(QStringLiteral("x.desktop"), Header + "Name=A\n");
    VelUIDesktopEntry record(file);
    record.setName(QStringLiteral("B"));
    record.setIcon(QStringLiteral("i"));
    write(QStringLiteral("x.desktop"), Header + "Name=C\n");
    QVERIFY(record.load());
    QCOMPARE(record.getName(), QStringLiteral("C"));
    QCOMPARE(record.getIcon(), QString());
    QVERIFY(record.save());
    QCOMPARE(read(file), Header + "Name=C\n");
}

void tst_VelUIDesktopEntry::becomesInvalidWhenLoadingFails()
{
    const QString file = write(QStringLiteral("x.desktop"), Header + "Name=A\n");
    VelUIDesktopEntry record(file);
    QVERIFY(QFile::remove(file));
    QVERIFY(record.isValid());
    QVERIFY(!record.load());
    QVERIFY(!record.isValid());
    QCOMPARE(record.getName(), QString());
}

void tst_VelUIDesktopEntry::isAValueWithSharedData()
{
    const QString file = write(QStringLiteral("x.desktop"), Header + "Name=A\n");
    VelUIDesktopEntry record(file);
    VelUIDesktopEntry copy(record);
    copy.setName(QStringLiteral("B"));
    QCOMPARE(record.getName(), QStringLiteral("A"));
    record = copy;
    QCOMPARE(record.getName(), QStringLiteral("B"));
    const VelUIDesktopEntry moved(std::move(copy));
    QCOMPARE(moved.getName(), QStringLiteral("B"));
    copy = moved;
    QVERIFY(copy.save());
    QCOMPARE(read(file), Header + "Name=B\n");
}

VEL_TEST_GUILESS_MAIN(tst_VelUIDesktopEntry)

#include "tst_VelUIDesktopEntry.moc"
