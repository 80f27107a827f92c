// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StderrCapture.h"
#include "TestCase.h"

#include <settings/ThemeRcFormat.h>

#include <QBuffer>

#if QT_VERSION_MAJOR < 6
#include <QTextCodec>
#endif

using Map = QSettings::SettingsMap;

namespace {

Map readBytes(QByteArray bytes)
{
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::ReadOnly);
    Map map;
    if (!ThemeRcFormat::read(buffer, map))
        QTest::qFail("reading failed", __FILE__, __LINE__);
    return map;
}

QByteArray writeMap(const Map &map)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    if (!ThemeRcFormat::write(buffer, map))
        QTest::qFail("writing failed", __FILE__, __LINE__);
    return buffer.data();
}

// Types count: 7 is not "7".
bool same(const Map &one, const Map &other)
{
    if (one.keys() != other.keys())
        return false;
    for (auto it = one.constBegin(); it != one.constEnd(); ++it) {
        if (it.value().userType() != other.value(it.key()).userType() || it.value() != other.value(it.key()))
            return false;
    }
    return true;
}

QByteArray text(const Map &map)
{
    QByteArray result;
    for (auto it = map.constBegin(); it != map.constEnd(); ++it)
        result +=
            it.key().toUtf8() + " = " + it.value().typeName() + ' ' + it.value().toString().toUtf8() + '\n';
    return result;
}

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

#if QT_VERSION_MAJOR >= 6
// The encoding of the locale is UTF-8 there, whatever the locale says.
using LocaleCodec = QByteArray;
constexpr bool HasOtherEncodings = false;
#else
constexpr bool HasOtherEncodings = true;

// Makes another encoding that of the locale while it lives.
class LocaleCodec
{
public:
    explicit LocaleCodec(const QByteArray &name)
        : m_before(QTextCodec::codecForLocale())
    {
        QTextCodec *codec = QTextCodec::codecForName(name);
        if (!codec)
            qFatal("no codec %s", name.constData());
        QTextCodec::setCodecForLocale(codec);
    }
    ~LocaleCodec() { QTextCodec::setCodecForLocale(m_before); }
    Q_DISABLE_COPY(LocaleCodec)

private:
    QTextCodec *const m_before;
};
#endif

// A device that fails in the middle, as a disk does that cannot be read any further.
class BrokenDevice : public QIODevice
{
public:
    bool atEnd() const override { return false; }

protected:
    qint64 readData(char *data, qint64 maxSize) override
    {
        if (m_given || maxSize < 4)
            return -1;
        m_given = true;
        memcpy(data, "a=1\n", 4);
        return 4;
    }
    qint64 writeData(const char *, qint64) override { return -1; }

private:
    bool m_given = false;
};

void addRowsOfHeaders()
{
    const QString section = s("SectionName");
    QTest::newRow("nothing") << QByteArray() << Map();
    QTest::newRow("blank lines") << QByteArray("\n \n\t\n\r\n") << Map();
    QTest::newRow("header with blanks") << QByteArray("[ Main ]\n") << Map{{section, s("Main")}};
    QTest::newRow("doubled brackets") << QByteArray("[[a]]\n") << Map{{section, s("a")}};
    QTest::newRow("inner bracket") << QByteArray("[a]b]\n") << Map{{section, s("ab")}};
    QTest::newRow("header with =") << QByteArray("[a=b]\n") << Map{{s("[a"), s("b]")}};
    QTest::newRow("empty header") << QByteArray("[]\n") << Map{{section, s("")}};
    QTest::newRow("lone [") << QByteArray("[\n") << Map();
    QTest::newRow("lone ]") << QByteArray("]\n") << Map();
    QTest::newRow("text after the header") << QByteArray("[a] b\n") << Map();
    QTest::newRow("text before the header") << QByteArray("b [a]\n") << Map();
    QTest::newRow("indented header") << QByteArray("  [a]  \n") << Map{{section, s("a")}};
    QTest::newRow("last header counts")
        << QByteArray("[a]\nx=1\n[b]\ny=2\n") << Map{{section, s("b")}, {s("x"), 1}, {s("y"), 2}};
    QTest::newRow("header as a key") << QByteArray("[a]\nSectionName=b\n") << Map{{section, s("b")}};
    QTest::newRow("key, then header") << QByteArray("SectionName=b\n[a]\n") << Map{{section, s("a")}};
    QTest::newRow("last key counts") << QByteArray("[a]\nx=1\n[b]\nx=two\n")
                                     << Map{{section, s("b")}, {s("x"), s("two")}};
}

void addRowsOfKeys()
{
    QTest::newRow("more than one =") << QByteArray("path = one = two\n") << Map{{s("path"), s("one = two")}};
    QTest::newRow("== alone") << QByteArray("a==\n") << Map{{s("a"), s("=")}};
    QTest::newRow("blanks around") << QByteArray(" \t a\t =\t b c \t\n") << Map{{s("a"), s("b c")}};
    QTest::newRow("blanks inside the key") << QByteArray("a b=c\n") << Map{{s("a b"), s("c")}};
    QTest::newRow("no key") << QByteArray("=a\n =b\n") << Map();
    QTest::newRow("no value") << QByteArray("a=\nb= \n") << Map();
    QTest::newRow("no value keeps the earlier one") << QByteArray("a=1\na=\n") << Map{{s("a"), 1}};
    QTest::newRow("neither") << QByteArray("=\n") << Map();
    QTest::newRow("comments") << QByteArray("#a=1\n;b=2\n  #c=3\n\t;d=4\n#[e]\n") << Map();
    QTest::newRow("no comment") << QByteArray("a=1 #x\nb;=2\n") << Map{{s("a"), s("1 #x")}, {s("b;"), 2}};
    QTest::newRow("text") << QByteArray("just text\n") << Map();
    QTest::newRow("case of keys") << QByteArray("a=1\nA=2\n") << Map{{s("a"), 1}, {s("A"), 2}};
    QTest::newRow("slash in a key") << QByteArray("a/b=1\n") << Map{{s("a/b"), 1}};
}

void addRowsOfValues()
{
    QTest::newRow("booleans") << QByteArray("a=true\nb=True\nc=false\nd=False\n")
                              << Map{{s("a"), true}, {s("b"), true}, {s("c"), false}, {s("d"), false}};
    QTest::newRow("no booleans") << QByteArray("a=TRUE\nb=tRue\nc=truex\nd=xfalse\ne=True False\n")
                                 << Map{{s("a"), s("TRUE")},
                                        {s("b"), s("tRue")},
                                        {s("c"), s("truex")},
                                        {s("d"), s("xfalse")},
                                        {s("e"), s("True False")}};
    QTest::newRow("quoted boolean") << QByteArray("a=\"true\"\n") << Map{{s("a"), s("true")}};
    QTest::newRow("numbers") << QByteArray("a=0\nb=007\nc=2147483647\n")
                             << Map{{s("a"), 0}, {s("b"), 7}, {s("c"), 2147483647}};
    QTest::newRow("beyond the range") << QByteArray("a=2147483648\nb=99999999999\nc=4294967297\n"
                                                    "d=18446744073709551617\ne=00000000000000000000000001\n")
                                      << Map{{s("a"), 0}, {s("b"), 0}, {s("c"), 0}, {s("d"), 0}, {s("e"), 1}};
    QTest::newRow("no numbers") << QByteArray("a=-1\nb=+1\nc=1.5\nd=1 2\ne=0x1\nf=\xd9\xa1\n")
                                << Map{{s("a"), s("-1")},  {s("b"), s("+1")},  {s("c"), s("1.5")},
                                       {s("d"), s("1 2")}, {s("e"), s("0x1")}, {s("f"), s("\xd9\xa1")}};
    QTest::newRow("quoted number") << QByteArray("a=\"7\"\n") << Map{{s("a"), s("7")}};
    QTest::newRow("quotes") << QByteArray("a=\"v\"\nb=\"a b\"\nc=\"\"\nd=\"\"x\"\"\n")
                            << Map{{s("a"), s("v")},
                                   {s("b"), s("a b")},
                                   {s("c"), s("")},
                                   {s("d"), s("\"x\"")}};
    QTest::newRow("nothing unescaped") << QByteArray("a=\"x\\n\\\"y\"\n") << Map{{s("a"), s("x\\n\\\"y")}};
    QTest::newRow("unpaired quotes") << QByteArray("a=\"x\nb=x\"\nc='x'\n")
                                     << Map{{s("a"), s("\"x")}, {s("b"), s("x\"")}, {s("c"), s("'x'")}};
    QTest::newRow("one lone quote") << QByteArray("a=\"\n") << Map{{s("a"), s("\"")}};
    QTest::newRow("blanks inside quotes") << QByteArray("a=\" \"\n") << Map{{s("a"), s(" ")}};
}

void addRowsOfLineEnds()
{
    const QString section = s("SectionName");
    QTest::newRow("CR LF") << QByteArray("[a]\r\nx=1\r\ny=true\r\n")
                           << Map{{section, s("a")}, {s("x"), 1}, {s("y"), true}};
    QTest::newRow("CR alone ends no line") << QByteArray("x=1\ry=2\r") << Map{{s("x"), s("1\ry=2")}};
    QTest::newRow("no last line end") << QByteArray("[a]\nx=1") << Map{{section, s("a")}, {s("x"), 1}};
    QTest::newRow("NUL ends the line's text")
        << QByteArray("x=1\0y=2\nz=3\n", 12) << Map{{s("x"), 1}, {s("z"), 3}};
    QTest::newRow("NUL before =") << QByteArray("x\0=1\n", 5) << Map();
    QTest::newRow("NUL first") << QByteArray("\0x=1\n", 5) << Map();
    // The blank is stripped with the bytes, before the text ends at the NUL; then with the value.
    QTest::newRow("blank before NUL") << QByteArray("[a] \0\nx=1 \0\n", 12) << Map{{s("x"), 1}};
    QTest::newRow("wide blanks") << QByteArray("\xc2\xa0k\xc2\xa0=\xe2\x80\x83v\xc2\xa0\n[\xc2\xa0n ]")
                                 << Map{{s("k"), s("v")}, {section, s("n")}};
    QTest::newRow("broken UTF-8") << QByteArray("a=x\xff\n")
                                  << Map{{s("a"), QString(s("x") + QChar(0xfffd))}};
}

} // namespace

class tst_ThemeRcFormat : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void refusesToReadFromAClosedDevice();
    void refusesToWriteToAClosedDevice();
    void refusesToWriteAnEmptyMap();
    void refusesToWriteToAReadOnlyDevice();
    void failsWhenTheDeviceFailsBeforeItsEnd();
    void failsWhenTheDeviceDoesNotTakeTheText();
    void readsLines_data();
    void readsLines();
    void emptiesTheMapBeforeReading();
    void readsALineOfOneMebibyte();
    void readsManyLinesOfBothOrders();
    void writesKeys_data();
    void writesKeys();
    void writesLineBreaksAsBlanks_data();
    void writesLineBreaksAsBlanks();
    void namesTheFileWhoseLineBreaksBecomeBlanks();
    void losesOnReadingAndWritingWhatTheFormatDoesNotKeep_data();
    void losesOnReadingAndWritingWhatTheFormatDoesNotKeep();
    void readsAndWritesInTheEncodingOfTheLocale_data();
    void readsAndWritesInTheEncodingOfTheLocale();
    void readsAByteOrderMarkAsTheEncodingOfTheLocaleDoes();
    void writesCharactersThatTheEncodingLacksAsTheCodecDoes();
};

void tst_ThemeRcFormat::refusesToReadFromAClosedDevice()
{
    QBuffer closed;
    Map map{{s("kept"), 1}};
    StderrCapture capture;
    const bool result = ThemeRcFormat::read(closed, map);
    QCOMPARE(capture.take(), QByteArray("VelSettings: file isn't open - can't read from\n"));
    QVERIFY(!result);
    QCOMPARE(map.size(), 1);
}

void tst_ThemeRcFormat::refusesToWriteToAClosedDevice()
{
    QBuffer closed;
    StderrCapture capture;
    const bool result = ThemeRcFormat::write(closed, {{s("a"), 1}});
    QCOMPARE(capture.take(), QByteArray("VelSettings: file isn't open or settings are empty\n"));
    QVERIFY(!result);
    QVERIFY(closed.data().isEmpty());
}

void tst_ThemeRcFormat::refusesToWriteAnEmptyMap()
{
    QBuffer buffer;
    buffer.open(QIODevice::ReadOnly); // the emptiness is told first
    StderrCapture capture;
    const bool result = ThemeRcFormat::write(buffer, {});
    QCOMPARE(capture.take(), QByteArray("VelSettings: file isn't open or settings are empty\n"));
    QVERIFY(!result);
}

void tst_ThemeRcFormat::refusesToWriteToAReadOnlyDevice()
{
    QByteArray bytes("old");
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::ReadOnly);
    StderrCapture capture;
    const bool result = ThemeRcFormat::write(buffer, {{s("a"), 1}});
    QCOMPARE(capture.take(), QByteArray("VelSettings: file isn't writable\n"));
    QVERIFY(!result);
    QCOMPARE(bytes, QByteArray("old"));
}

void tst_ThemeRcFormat::failsWhenTheDeviceFailsBeforeItsEnd()
{
    BrokenDevice device;
    device.open(QIODevice::ReadOnly);
    Map map;
    QVERIFY(!ThemeRcFormat::read(device, map));
}

void tst_ThemeRcFormat::failsWhenTheDeviceDoesNotTakeTheText()
{
    BrokenDevice device;
    device.open(QIODevice::WriteOnly);
    QVERIFY(!ThemeRcFormat::write(device, {{s("a"), 1}}));
}

void tst_ThemeRcFormat::readsLines_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<Map>("expected");
    addRowsOfHeaders();
    addRowsOfKeys();
    addRowsOfValues();
    addRowsOfLineEnds();
}

void tst_ThemeRcFormat::readsLines()
{
    QFETCH(QByteArray, bytes);
    QFETCH(Map, expected);
    const Map map = readBytes(bytes);
    QVERIFY2(same(map, expected), text(map).constData());
}

void tst_ThemeRcFormat::emptiesTheMapBeforeReading()
{
    QByteArray bytes("b=2\n");
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::ReadOnly);
    Map map{{s("a"), 1}};
    QVERIFY(ThemeRcFormat::read(buffer, map));
    QVERIFY(same(map, {{s("b"), 2}}));
}

void tst_ThemeRcFormat::readsALineOfOneMebibyte()
{
    const QByteArray value(1 << 20, 'v');
    const QByteArray key(1 << 20, 'k');
    const QByteArray digits(1 << 20, '9');
    const Map map = readBytes("a=" + value + '\n' + key + "=1\nn=" + digits + "\n[" + value + "]\nz=2\n");
    QCOMPARE(map.size(), 5);
    QCOMPARE(map.value(s("a")).toString().size(), 1 << 20);
    QCOMPARE(map.value(QString::fromLatin1(key)), QVariant(1));
    QCOMPARE(map.value(s("n")), QVariant(0));
    QCOMPARE(map.value(s("SectionName")).toString().size(), 1 << 20);
    QCOMPARE(map.value(s("z")), QVariant(2));
    QVERIFY(same(readBytes(writeMap(map)), map));
}

void tst_ThemeRcFormat::readsManyLinesOfBothOrders()
{
    QByteArray rising;
    QByteArray falling;
    Map expected;
    for (int i = 0; i < 2000; ++i) {
        const QByteArray key = "key" + QByteArray::number(i).rightJustified(4, '0');
        rising += key + '=' + QByteArray::number(i) + '\n';
        falling.prepend(key + '=' + QByteArray::number(i) + '\n');
        expected.insert(QString::fromLatin1(key), i);
    }
    QVERIFY(same(readBytes(rising), expected));
    QVERIFY(same(readBytes(falling), expected));
    QCOMPARE(writeMap(expected), rising);
}

void tst_ThemeRcFormat::writesKeys_data()
{
    QTest::addColumn<Map>("map");
    QTest::addColumn<QByteArray>("expected");

    QTest::newRow("header first") << Map{{s("A"), 1}, {s("SectionName"), s("Main")}, {s("z"), 2}}
                                  << QByteArray("[Main]\nA=1\nz=2\n");
    QTest::newRow("header alone") << Map{{s("SectionName"), s("Main")}} << QByteArray("[Main]\n");
    QTest::newRow("header is no string") << Map{{s("SectionName"), 5}} << QByteArray("[5]\n");
    QTest::newRow("header with blanks") << Map{{s("SectionName"), s("a b")}} << QByteArray("[a b]\n");
    QTest::newRow("no header") << Map{{s("a"), 1}} << QByteArray("a=1\n");
    QTest::newRow("sorted by case") << Map{{s("b"), 1}, {s("B"), 2}, {s("a"), 3}, {s("_"), 4}}
                                    << QByteArray("B=2\n_=4\na=3\nb=1\n");
    QTest::newRow("booleans") << Map{{s("a"), true},
                                     {s("b"), false},
                                     {s("c"), s("true")},
                                     {s("d"), s("false")}}
                              << QByteArray("a=true\nb=false\nc=true\nd=false\n");
    QTest::newRow("words that are no booleans")
        << Map{{s("a"), s("True")}, {s("b"), s("FALSE")}} << QByteArray("a=True\nb=FALSE\n");
    QTest::newRow("numbers") << Map{{s("a"), -7}, {s("b"), 1.5}, {s("c"), 5000000000LL}}
                             << QByteArray("a=-7\nb=1.5\nc=5000000000\n");
    QTest::newRow("blank") << Map{{s("a"), s("x y")}} << QByteArray("a=\"x y\"\n");
    QTest::newRow("tab") << Map{{s("a"), s("x\ty")}} << QByteArray("a=\"x\ty\"\n");
    QTest::newRow("no other white space") << Map{{s("a"), s("x\u00a0y")}} << QByteArray("a=x\xc2\xa0y\n");
    QTest::newRow("already quoted") << Map{{s("a"), s("\"x y\"")}} << QByteArray("a=\"x y\"\n");
    QTest::newRow("quoted at one end") << Map{{s("a"), s("\"x y")}} << QByteArray("a=\"\"x y\"\n");
    QTest::newRow("one lone quote") << Map{{s("a"), s("\"")}} << QByteArray("a=\"\n");
    QTest::newRow("quotes without blanks") << Map{{s("a"), s("\"x\"")}} << QByteArray("a=\"x\"\n");
    QTest::newRow("empty") << Map{{s("a"), s("")}} << QByteArray("a=\n");
    QTest::newRow("invalid") << Map{{s("a"), QVariant()}} << QByteArray("a=\n");
    QTest::newRow("percent signs") << Map{{s("%2"), s("%1 %2")}, {s("%1"), s("%2")}}
                                   << QByteArray("%1=%2\n%2=\"%1 %2\"\n");
    QTest::newRow("list of one") << Map{{s("a"), QStringList{s("x y")}}} << QByteArray("a=\"x y\"\n");
    QTest::newRow("list of two") << Map{{s("a"), QStringList{s("x"), s("y")}}} << QByteArray("a=\n");
    QTest::newRow("binary data") << Map{{s("a"), QByteArray("xy")}} << QByteArray("a=xy\n");
    const QString half(QChar(0xd83d)); // of a character
    QTest::newRow("half a character") << Map{{s("a"), half}, {s("b"), half}}
                                      << QByteArray("a=" + half.toUtf8() + "\nb=" + half.toUtf8() + '\n');
    QTest::newRow("key with blanks") << Map{{s("a b"), 1}} << QByteArray("a b=1\n");
}

void tst_ThemeRcFormat::writesKeys()
{
    QFETCH(Map, map);
    QFETCH(QByteArray, expected);
    QCOMPARE(writeMap(map), expected);
}

void tst_ThemeRcFormat::writesLineBreaksAsBlanks_data()
{
    QTest::addColumn<Map>("map");
    QTest::addColumn<QByteArray>("expected");
    QTest::addColumn<QByteArray>("told");
    const auto told = [](const QByteArray &place) {
        return "VelSettings: line breaks in " + place + " are written as blanks\n";
    };

    QTest::newRow("value that forges a key") << Map{{s("a"), s("x\nb=2")}, {s("c"), 3}}
                                             << QByteArray("a=\"x b=2\"\nc=3\n") << told("the line of 'a'");
    QTest::newRow("value that forges a section")
        << Map{{s("SectionName"), s("Main")}, {s("a"), s("x\n[Other]")}}
        << QByteArray("[Main]\na=\"x [Other]\"\n") << told("the line of 'a'");
    QTest::newRow("one blank for each")
        << Map{{s("a"), s("\nx\r\n\n\ry\r")}} << QByteArray("a=\" x    y \"\n") << told("the line of 'a'");
    QTest::newRow("quoted value") << Map{{s("a"), s("\"x\ny\"")}} << QByteArray("a=\"x y\"\n")
                                  << told("the line of 'a'");
    QTest::newRow("word with a line end")
        << Map{{s("a"), s("true\n")}} << QByteArray("a=\"true \"\n") << told("the line of 'a'");
    QTest::newRow("key") << Map{{s("a=1\n[x]\rb"), 2}, {s("c"), 3}} << QByteArray("a=1 [x] b=2\nc=3\n")
                         << told("the line of 'a=1\\x0a[x]\\x0db'");
    QTest::newRow("key and value") << Map{{s("a\nb"), s("c\nd")}} << QByteArray("a b=\"c d\"\n")
                                   << told("the line of 'a\\x0ab'");
    QTest::newRow("key that acts on a terminal")
        << Map{{s("\x1b[2J\x7f\u009bm"), s("\n")}} << QByteArray("\x1b[2J\x7f\xc2\x9bm=\" \"\n")
        << told("the line of '\\x1b[2J\\x7f\\x9bm'");
    QTest::newRow("section") << Map{{s("SectionName"), s("a]\nb=1\n[c")}, {s("d"), 1}}
                             << QByteArray("[a] b=1 [c]\nd=1\n") << told("the section's name");
    QTest::newRow("each is told") << Map{{s("SectionName"), s("\n")}, {s("a"), s("\n")}, {s("b"), s("\r\n")}}
                                  << QByteArray("[ ]\na=\" \"\nb=\"  \"\n")
                                  << told("the section's name") + told("the line of 'a'")
            + told("the line of 'b'");
}

void tst_ThemeRcFormat::writesLineBreaksAsBlanks()
{
    QFETCH(Map, map);
    QFETCH(QByteArray, expected);
    QFETCH(QByteArray, told);
    StderrCapture capture;
    const QByteArray written = writeMap(map);
    QCOMPARE(capture.take(), told);
    QCOMPARE(written, expected);
}

void tst_ThemeRcFormat::namesTheFileWhoseLineBreaksBecomeBlanks()
{
    QFile file(path(s("a\nrc")));
    QVERIFY(file.open(QIODevice::WriteOnly));
    StderrCapture capture;
    const bool result = ThemeRcFormat::write(file, {{s("a"), s("x\ny")}});
    QCOMPARE(capture.take(),
             "VelSettings: " + QFile::encodeName(folder())
                 + "/a\\x0arc: line breaks in the line of 'a' are written as blanks\n");
    QVERIFY(result);
}

void tst_ThemeRcFormat::losesOnReadingAndWritingWhatTheFormatDoesNotKeep_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QByteArray>("expected");

    QTest::newRow("nothing lost") << QByteArray("[Main]\na=1\nb=\"x y\"\nc=true\n")
                                  << QByteArray("[Main]\na=1\nb=\"x y\"\nc=true\n");
    QTest::newRow("comments and blank lines")
        << QByteArray("# one\n\n[a]\n; two\nx=1\n\n # three\n") << QByteArray("[a]\nx=1\n");
    QTest::newRow("order") << QByteArray("z=1\na=2\nM=3\n") << QByteArray("M=3\na=2\nz=1\n");
    QTest::newRow("all headers but the last")
        << QByteArray("[a]\nx=1\ny=2\n[b]\nx=3\n") << QByteArray("[b]\nx=3\ny=2\n");
    QTest::newRow("header moved to the front") << QByteArray("x=1\n[a]\n") << QByteArray("[a]\nx=1\n");
    QTest::newRow("empty keys and values") << QByteArray("=1\na=\nb=2\n") << QByteArray("b=2\n");
    QTest::newRow("spelling of booleans")
        << QByteArray("a=True\nb=False\nflag=TRUE\n") << QByteArray("a=true\nb=false\nflag=TRUE\n");
    QTest::newRow("leading zeros") << QByteArray("x=007\n") << QByteArray("x=7\n");
    QTest::newRow("numbers beyond the range") << QByteArray("x=99999999999\n") << QByteArray("x=0\n");
    QTest::newRow("needless quotes") << QByteArray("a=\"v\"\nb=\"a b\"\nc=\"7\"\n")
                                     << QByteArray("a=v\nb=\"a b\"\nc=7\n");
    QTest::newRow("empty quotes") << QByteArray("a=\"\"\nb=1\n") << QByteArray("a=\nb=1\n");
    QTest::newRow("a lone quote stays") << QByteArray("a=\"\n") << QByteArray("a=\"\n");
    QTest::newRow("blanks get quotes")
        << QByteArray("path = one = two\n") << QByteArray("path=\"one = two\"\n");
    QTest::newRow("blanks around") << QByteArray("  a  =  b  \n[  c  ]\n") << QByteArray("[c]\na=b\n");
    QTest::newRow("brackets in a header") << QByteArray("[[a]b]\nx=1\n") << QByteArray("[ab]\nx=1\n");
    QTest::newRow("no header stays none") << QByteArray("x=1\n") << QByteArray("x=1\n");
    QTest::newRow("line ends") << QByteArray("[a]\r\nx=1\r\n") << QByteArray("[a]\nx=1\n");
    QTest::newRow("other text") << QByteArray("text\nx=1\n") << QByteArray("x=1\n");
    QTest::newRow("after a NUL") << QByteArray("x=1\0more\n", 9) << QByteArray("x=1\n");
    QTest::newRow("byte order mark") << QByteArray("\xef\xbb\xbf[a]\nx=1\n") << QByteArray("[a]\nx=1\n");
}

void tst_ThemeRcFormat::losesOnReadingAndWritingWhatTheFormatDoesNotKeep()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QByteArray, expected);
    QCOMPARE(writeMap(readBytes(bytes)), expected);
}

void tst_ThemeRcFormat::readsAndWritesInTheEncodingOfTheLocale_data()
{
    QTest::addColumn<QByteArray>("codec");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("value");

    QTest::newRow("UTF-8") << QByteArray("UTF-8")
                           << QByteArray("gr\xc3\xb6\xc3\x9f"
                                         "e=\xe2\x82\xac\n")
                           << s("größe") << s("€");
    QTest::newRow("Latin-1") << QByteArray("ISO-8859-1")
                             << QByteArray("gr\xf6\xdf"
                                           "e=\xa4\n")
                             << s("größe") << s("¤");
    QTest::newRow("Latin-9") << QByteArray("ISO-8859-15")
                             << QByteArray("gr\xf6\xdf"
                                           "e=\xa4\n")
                             << s("größe") << s("€");
    QTest::newRow("KOI8-R") << QByteArray("KOI8-R") << QByteArray("\xc4\xc1=\xce\xc5\xd4\n") << s("да")
                            << s("нет");
    QTest::newRow("EUC-JP") << QByteArray("EUC-JP") << QByteArray("\xc6\xfc=\xcb\xdc\n") << s("日")
                            << s("本");
}

void tst_ThemeRcFormat::readsAndWritesInTheEncodingOfTheLocale()
{
    QFETCH(QByteArray, codec);
    QFETCH(QByteArray, bytes);
    QFETCH(QString, key);
    QFETCH(QString, value);
    if (!HasOtherEncodings && codec != "UTF-8")
        QSKIP("The encoding of the locale is UTF-8.");
    const LocaleCodec locale(codec);
    const Map map = readBytes(bytes);
    QVERIFY2(same(map, {{key, value}}), text(map).constData());
    QCOMPARE(writeMap(map), bytes);
}

void tst_ThemeRcFormat::readsAByteOrderMarkAsTheEncodingOfTheLocaleDoes()
{
    QVERIFY(same(readBytes("\xef\xbb\xbf[a]\n"), {{s("SectionName"), s("a")}}));
    if (!HasOtherEncodings)
        QSKIP("The encoding of the locale is UTF-8.");
    const LocaleCodec locale("ISO-8859-1");
    // No header there: the line begins with three other characters.
    QVERIFY(same(readBytes("\xef\xbb\xbf[a]\nx=1\n"), {{s("x"), 1}}));
}

void tst_ThemeRcFormat::writesCharactersThatTheEncodingLacksAsTheCodecDoes()
{
    if (!HasOtherEncodings)
        QSKIP("The encoding of the locale is UTF-8.");
    const LocaleCodec locale("ISO-8859-1");
    QCOMPARE(writeMap({{s("a"), s("x€")}}), QByteArray("a=x?\n"));
}

VEL_TEST_GUILESS_MAIN(tst_ThemeRcFormat)

#include "tst_ThemeRcFormat.moc"
