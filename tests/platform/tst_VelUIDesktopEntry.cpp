// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RecordTestCase.h"

#include <QDir>

#include <sys/stat.h>

/// What a record reads.
class tst_VelUIDesktopEntry : public RecordTestCase
{
    Q_OBJECT

private Q_SLOTS:
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
    void neverGivesTheUnlocalizedValueForALocalOne();
    void readsBackAnyTextItWrites_data();
    void readsBackAnyTextItWrites();
    void readsBackAnyListItWrites_data();
    void readsBackAnyListItWrites();
};

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
    row("one item not valid UTF-8 makes the key malformed", "a;\xFF;", {});
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

void tst_VelUIDesktopEntry::neverGivesTheUnlocalizedValueForALocalOne()
{
    const VelUIDesktopEntry record(write(
        QStringLiteral("x.desktop"),
        Header + "Name=a\nGenericName=a\nComment=a\nIcon=a\nKeywords=a;\nName[fr]=b\nComment[de]=\xFF\n"));
    QCOMPARE(record.getLocalName() + record.getLocalGenericName() + record.getLocalComment()
                 + record.getLocalIcon(),
             QString());
    QVERIFY(record.getLocalKeywords().isEmpty());
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

VEL_TEST_GUILESS_MAIN(tst_VelUIDesktopEntry)
#include "tst_VelUIDesktopEntry.moc"
