// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "QtMajor.h"
#include "TestCase.h"
#include "VelKeyServer.h"

#include <frame/QtMajor.h>
#include <shortcuts/KeyNames.h>

#include <QDir>
#include <QKeySequence>
#include <QMetaEnum>

#include <X11/Xlib.h>
#include <sys/stat.h>

namespace {

const QVector<int> modifierBits = {int(Qt::ShiftModifier),  int(Qt::ControlModifier),
                                   int(Qt::AltModifier),    int(Qt::MetaModifier),
                                   int(Qt::KeypadModifier), int(Qt::GroupSwitchModifier)};

int modifiers(int combination)
{
    int bits = 0;
    for (int i = 0; i < modifierBits.size(); ++i)
        bits |= (combination & (1 << i)) ? modifierBits.at(i) : 0;
    return bits;
}

// The code that a key string is expected to lead back to; 0 where no answer makes sense.
int codeReadBack(int code, const QString &keyString)
{
    // X knows no bit for the group switch.
    code &= ~int(Qt::GroupSwitchModifier);
    const int key = code & ~int(Qt::KeyboardModifierMask);
    // The conversion gives every code that has no name this number.
    if (key == Qt::Key_Hyper_L || key == Qt::Key_Hyper_R)
        return 0;
    // The symbols of Enter and Clear are those of the keypad. Other keys remember the keypad
    // only where it has a symbol of its own for them.
    const bool isKeypadSymbol = keyString.section(QLatin1Char('+'), -1).startsWith(QLatin1String("KP_"));
    return isKeypadSymbol ? code | int(Qt::KeypadModifier) : code & ~int(Qt::KeypadModifier);
}

// Whether a key symbol is one that does not lead back to itself, and why.
bool mayLeadElsewhere(unsigned long symbol)
{
    // A key has one code for the capital and the small letter.
    const bool isSmallLatinLetter = (symbol >= 'a' && symbol <= 'z') || (symbol >= 0xe0 && symbol <= 0xfe);
    // Other alphabets: the numbers of their symbols are taken for those of characters.
    const bool isOtherAlphabet = symbol >= 0x100 && symbol < 0x1000;
    // The keypad's equals sign has the code of the common one.
    const unsigned long keypadEqual = 0xffbd;
    // The maker's key Clear has the code of the common one, whose symbol is the keypad's.
    const unsigned long makersClear = 0x1008ff55;
    // KDE Frameworks 6 has two symbols for the keys of a calculator and of media.
    const bool isOfTwo = QT_VERSION_MAJOR >= 6 && (symbol == 0x1008ff54 || symbol == 0x1008ff33);
    return isSmallLatinLetter || isOtherAlphabet || isOfTwo || symbol == keypadEqual || symbol == makersClear;
}

} // namespace

class tst_VelKeyServer : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void writesKeyStrings_data();
    void writesKeyStrings();
    void tellsAnUnknownCodeFromANamelessSymbol();
    void readsKeyStrings_data();
    void readsKeyStrings();
    void agreesWithItselfOnEveryQtKey();
    void agreesWithItselfOnEveryKeySymbol();
    void knowsWhichCodesReadBackUnchanged();

    void findsTheGlobalAction_data();
    void findsTheGlobalAction();
    void findsNothing_data();
    void findsNothing();
    void findsEveryConvertibleKeyOfAFile();
    void takesTheKeyThatSortsFirst();
    void comparesWholeSequences();
    void readsTheFileAnewAtEveryCall();
    void readsTheFileOfTheSession();
    void findsNothingWithoutAUsableFile_data();
    void findsNothingWithoutAUsableFile();
};

void tst_VelKeyServer::init()
{
    TestCase::init();
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
}

void tst_VelKeyServer::cleanup()
{
    qunsetenv("VEL_CONFIG_HOME");
    qunsetenv("VEL_SESSION");
    TestCase::cleanup();
}

void tst_VelKeyServer::writesKeyStrings_data()
{
    QTest::addColumn<int>("code");
    QTest::addColumn<QString>("text");
    QTest::newRow("plain") << int(Qt::Key_F5) << QStringLiteral("F5");
    QTest::newRow("one modifier") << VelTest::keyNumber(Qt::ALT | Qt::Key_F4) << QStringLiteral("Alt+F4");
    QTest::newRow("order") << VelTest::keyNumber(Qt::META | Qt::ALT | Qt::SHIFT | Qt::CTRL | Qt::Key_F3)
                           << QStringLiteral("Ctrl+Shift+Alt+Mod4+F3");
    QTest::newRow("two") << VelTest::keyNumber(Qt::META | Qt::SHIFT | Qt::Key_F3)
                         << QStringLiteral("Shift+Mod4+F3");
    QTest::newRow("letter") << int(Qt::Key_A) << QStringLiteral("A");
    QTest::newRow("shifted letter") << VelTest::keyNumber(Qt::SHIFT | Qt::Key_A) << QStringLiteral("Shift+A");
    QTest::newRow("symbol name") << VelTest::keyNumber(Qt::CTRL | Qt::Key_Plus)
                                 << QStringLiteral("Ctrl+plus");
    QTest::newRow("page up") << int(Qt::Key_PageUp) << QStringLiteral("Prior");
    QTest::newRow("keypad") << (int(Qt::KeypadModifier) | int(Qt::Key_5)) << QStringLiteral("KP_5");
}

void tst_VelKeyServer::writesKeyStrings()
{
    QFETCH(int, code);
    QTEST(VelKeyServer::KeyQtToKeyStringX(code), "text");
}

void tst_VelKeyServer::tellsAnUnknownCodeFromANamelessSymbol()
{
    QVERIFY(VelKeyServer::KeyQtToKeyStringX(-1).isNull());
    QVERIFY(VelKeyServer::KeyQtToKeyStringX(Qt::Key_unknown).isNull());
    QVERIFY(VelKeyServer::KeyQtToKeyStringX(VelTest::keyNumber(Qt::CTRL | Qt::Key_Shift)).isNull());

    // The modifiers that were gathered go, too.
    const QString nameless = VelKeyServer::KeyQtToKeyStringX(int(Qt::CTRL) | 0xb5);
    QVERIFY(nameless.isEmpty());
    QVERIFY(!nameless.isNull());
    QVERIFY(!VelKeyServer::KeyQtToKeyStringX(0).isNull());
    QVERIFY(VelKeyServer::KeyQtToKeyStringX(Qt::CTRL).isEmpty());
}

void tst_VelKeyServer::readsKeyStrings_data()
{
    QTest::addColumn<QString>("keyString");
    QTest::addColumn<QString>("text");
    const auto row = [](const char *keyString, const char *text) {
        QTest::newRow(*keyString ? keyString : "(empty)")
            << QString::fromLatin1(keyString) << (text ? QString::fromLatin1(text) : QString());
    };
    row("", nullptr);
    row("+", nullptr);
    row("Ctrl+", nullptr);
    row("Ctrl++", nullptr);
    row("Super_L", nullptr);
    row("Mod4+Super_L", nullptr);
    row("Super_Anything", nullptr);
    row("#23", nullptr);
    row("Ctrl+#a", nullptr);
    row("f5", nullptr);
    row("RETURN", nullptr);
    row("NoSuchKey", nullptr);
    row("Ctrl+Alt+F2", "Ctrl+Alt+F2");
    row("Control+alt+F2", "Ctrl+Alt+F2");
    row("CONTROL+ALT+F2", "Ctrl+Alt+F2");
    row("mod4+F1", "Meta+F1");
    row("Meta+F1", "Meta+F1");
    row("sHIFT+F1", "Shift+F1");
    row("Mod4+Alt+Shift+Ctrl+a", "Meta+Ctrl+Alt+Shift+A");
    row("Ctrl+Ctrl+a", "Ctrl+A");
    row("a", "A");
    row("Foo+a", "A");
    row("++a", "A");
    row("Ctrl+Foo++Alt+a", "Ctrl+Alt+A");
    row("Ctr+a", "A");
    row("Ctrl2+a", "A");
    row("Mod2+a", "A");
    row("Ctrl+plus", "Ctrl++");
    row("Ctrl+comma", "Ctrl+,");
    row("Return", "Return");
    row("space", "Space");
    row("Next", "PgDown");
    row("super_L", nullptr);
}

void tst_VelKeyServer::readsKeyStrings()
{
    QFETCH(QString, keyString);
    QFETCH(QString, text);
    const QString result = VelKeyServer::KeyStringXToQt(keyString);
    QCOMPARE(result, text);
    QCOMPARE(result.isNull(), text.isNull());
}

void tst_VelKeyServer::agreesWithItselfOnEveryQtKey()
{
    const auto keys = QMetaEnum::fromType<Qt::Key>();
    int compared = 0;
    for (int i = 0; i < keys.keyCount(); ++i) {
        for (int combination = 0; combination < (1 << modifierBits.size()); ++combination) {
            const int code = keys.value(i) | modifiers(combination);
            const QString keyString = VelKeyServer::KeyQtToKeyStringX(code);
            const QString text = keyString.isEmpty() ? QString() : VelKeyServer::KeyStringXToQt(keyString);
            const int expected = text.isEmpty() ? 0 : codeReadBack(code, keyString);
            if (expected == 0)
                continue;
            const QKeySequence sequence(text, QKeySequence::PortableText);
            QVERIFY2(
                sequence == QKeySequence(expected),
                qPrintable(QStringLiteral("%1: %2: %3").arg(QLatin1String(keys.key(i)), keyString, text)));
            ++compared;
        }
    }
    QVERIFY(compared > 10000);
}

void tst_VelKeyServer::agreesWithItselfOnEveryKeySymbol()
{
    // All blocks that have names: the alphabets, function keys, Unicode, the makers' own.
    const QVector<QPair<unsigned long, unsigned long>> blocks = {
        {0, 0x10000}, {0x1000000, 0x1010000}, {0x1000fe00, 0x10010000}, {0x10080000, 0x10090000}};
    int compared = 0;
    for (const auto &block : blocks) {
        for (unsigned long symbol = block.first; symbol < block.second; ++symbol) {
            const char *name = XKeysymToString(symbol);
            if (!name)
                continue;
            const QString text = VelKeyServer::KeyStringXToQt(QString::fromLatin1(name));
            for (int combination = 0; combination < 16; ++combination) {
                const QString prefix = QStringLiteral("%1%2%3%4")
                                           .arg(QLatin1String(combination & 1 ? "Ctrl+" : ""),
                                                QLatin1String(combination & 2 ? "Shift+" : ""),
                                                QLatin1String(combination & 4 ? "Alt+" : ""),
                                                QLatin1String(combination & 8 ? "Mod4+" : ""));
                const QString modified = VelKeyServer::KeyStringXToQt(prefix + QLatin1String(name));
                QCOMPARE(modified.isEmpty(), text.isEmpty());
                if (modified.isEmpty())
                    continue;
                const QKeySequence sequence(modified, QKeySequence::PortableText);
                const QString back = VelKeyServer::KeyQtToKeyStringX(QtMajor::chord(sequence, 0));
                if (back.isEmpty() || mayLeadElsewhere(symbol))
                    continue;
                QVERIFY2(back.startsWith(prefix), name);
                QVERIFY2(XStringToKeysym(qPrintable(back.mid(prefix.size()))) == symbol, name);
                ++compared;
            }
        }
    }
    QVERIFY(compared > 5000);
}

void tst_VelKeyServer::knowsWhichCodesReadBackUnchanged()
{
    int unchanged = 0;
    for (int key = 0; key < 0x2000; ++key) {
        for (const int base : {0, 0x01000000}) {
            for (int combination = 0; combination < 32; ++combination) {
                const int code = (base + key) | modifiers(combination);
                if (!KeyNames::roundTrips(code))
                    continue;
                const QKeySequence sequence(KeyNames::portableText(code), QKeySequence::NativeText);
                QVERIFY2(sequence == QKeySequence(code), qPrintable(QString::number(code, 16)));
                ++unchanged;
            }
        }
    }
    QVERIFY(unchanged > 3900);
}

void tst_VelKeyServer::findsTheGlobalAction_data()
{
    QTest::addColumn<QByteArray>("line");
    QTest::addColumn<QString>("sequence");
    QTest::addColumn<QString>("action");
    const auto row = [](const char *line, const char *sequence, const char *action) {
        QTest::newRow(line) << QByteArray(line) << QString::fromUtf8(sequence) << QString::fromUtf8(action);
    };
    row("Ctrl+Alt+F2=act", "Ctrl+Alt+F2", "act");
    row("\"None|Mod4|F1\"=\"VELWM_MENU\"", "Meta+F1", "VELWM_MENU");
    row("\"None|Mod4|F1\" = \"VELWM_MENU\"", "Meta+F1", "VELWM_MENU");
    row("None|F1=act", "F1", "act");
    row("None+None+F1=act", "F1", "act");
    row("None|Control|alt|a=two words", "Ctrl+Alt+A", "two words");
    row("Foo|a=act", "A", "act");
    row("Ctrl|plus=act", "Ctrl++", "act");
    // What is no key string is read as Qt's own text.
    row("Ctrl+PgUp=act", "Ctrl+PgUp", "act");
    row("Ctrl|Del=act", "Ctrl+Del", "act");
    row("Meta+Esc=act", "Meta+Esc", "act");
    row("None|Ctrl|Esc=act", "Ctrl+Esc", "act");
    row("Ctrl+K, Ctrl+Del=act", "Ctrl+K, Ctrl+Del", "act");
    row("\"Ctrl|K, Ctrl|Del\"=act", "Ctrl+K, Ctrl+Del", "act");
    // One that ends in the name of a symbol is a key string with a part that names no modifier.
    row("Ctrl+K, Ctrl+C=act", "Ctrl+C", "act");
    // A key whose text reads back as another code than its symbol's.
    row("Ctrl+adiaeresis=act", "Ctrl+\xc3\x84", "act");
    row("Ctrl+\xc3\x84=act", "Ctrl+\xc3\x84", "act");
    row("Ctrl+KP_Enter=act", "Ctrl+Num+Enter", "act");
    row("F1=\xc3\xa4\xd0\xb6", "F1", "\xc3\xa4\xd0\xb6");
    // Only a leading quote counts.
    row("F1=a \"b\"", "F1", "a \"b\"");
    row("F1=\"abc", "F1", "ab");
}

void tst_VelKeyServer::findsTheGlobalAction()
{
    QFETCH(QByteArray, line);
    QFETCH(QString, sequence);
    write(QStringLiteral("keyshortcutrc"),
          "; comment\n[Other]\nF12=other\n[ShortCutKeys]\nF11=before\n" + line + "\nzz=last\n");
    const QKeySequence wanted(sequence, QKeySequence::PortableText);
    QTEST(VelKeyServer::checkForGlobalShortcut(wanted), "action");
}

void tst_VelKeyServer::findsNothing_data()
{
    QTest::addColumn<QByteArray>("line");
    QTest::addColumn<QString>("sequence");
    QTest::newRow("other section") << QByteArray("[Else]\nF1=act") << QStringLiteral("F1");
    QTest::newRow("other key") << QByteArray("F2=act") << QStringLiteral("F1");
    QTest::newRow("fewer modifiers") << QByteArray("Ctrl|F1=act") << QStringLiteral("Ctrl+Alt+F1");
    QTest::newRow("lower-case none") << QByteArray("none|Ctrl|Esc=act") << QStringLiteral("Ctrl+Esc");
    QTest::newRow("unparsable") << QByteArray("Gibberish=act") << QStringLiteral("F1");
    QTest::newRow("unparsable on both sides") << QByteArray("Gibberish=act") << QStringLiteral("Nonsense");
    QTest::newRow("a lone quote") << QByteArray("\"=act") << QStringLiteral("F1");
    QTest::newRow("super key") << QByteArray("Mod4+Super_L=act") << QStringLiteral("Meta+L");
}

void tst_VelKeyServer::findsNothing()
{
    QFETCH(QByteArray, line);
    QFETCH(QString, sequence);
    write(QStringLiteral("keyshortcutrc"), "[ShortCutKeys]\n" + line + "\n");
    const QKeySequence wanted(sequence, QKeySequence::PortableText);
    QVERIFY(VelKeyServer::checkForGlobalShortcut(wanted).isNull());
}

void tst_VelKeyServer::findsEveryConvertibleKeyOfAFile()
{
    // Every key by itself, since the first of two equal ones hides the other.
    for (const char *name : {"a",
                             "Z",
                             "0",
                             "F1",
                             "F35",
                             "Return",
                             "KP_Enter",
                             "KP_5",
                             "space",
                             "Escape",
                             "Tab",
                             "ISO_Left_Tab",
                             "Delete",
                             "Prior",
                             "exclam",
                             "asciitilde",
                             "comma",
                             "plus",
                             "minus",
                             "adiaeresis",
                             "Adiaeresis",
                             "ssharp",
                             "XF86AudioPlay",
                             "XF86Back",
                             "Menu",
                             "Print",
                             "Cyrillic_zhe",
                             "EuroSign",
                             "U20ac",
                             "dead_acute"}) {
        for (const char *prefix : {"", "Ctrl|", "None|Shift|", "Alt|Mod4|", "Ctrl|Shift|Alt|Mod4|"}) {
            write(QStringLiteral("keyshortcutrc"),
                  QByteArray("[ShortCutKeys]\n") + prefix + name + QByteArray("=act\n"));
            QString keyString = QLatin1String(prefix) + QLatin1String(name);
            keyString.replace(QLatin1Char('|'), QLatin1Char('+')).remove(QStringLiteral("None+"));
            const QString converted = VelKeyServer::KeyStringXToQt(keyString);
            const QKeySequence wanted(converted.isEmpty() ? keyString : converted, QKeySequence::NativeText);
            const bool isKnown = wanted.count() == 1 && QtMajor::chord(wanted, 0) != Qt::Key_unknown;
            QCOMPARE(VelKeyServer::checkForGlobalShortcut(wanted),
                     isKnown ? QStringLiteral("act") : QString());
        }
    }
}

void tst_VelKeyServer::takesTheKeyThatSortsFirst()
{
    write(QStringLiteral("keyshortcutrc"),
          "[ShortCutKeys]\nNone|F1=third\nfoo|F1=second\nBar|F1=first\nZoo|F1=last\n");
    QCOMPARE(VelKeyServer::checkForGlobalShortcut(QKeySequence(Qt::Key_F1)), QStringLiteral("first"));
}

void tst_VelKeyServer::comparesWholeSequences()
{
    write(QStringLiteral("keyshortcutrc"), "[ShortCutKeys]\nCtrl|k=one\nCtrl+J, Ctrl+Del=two\n");
    const QKeySequence longer = VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C);
    QVERIFY(VelKeyServer::checkForGlobalShortcut(longer).isNull());
    QVERIFY(VelKeyServer::checkForGlobalShortcut(QKeySequence(Qt::CTRL | Qt::Key_J)).isNull());
}

void tst_VelKeyServer::readsTheFileAnewAtEveryCall()
{
    const QKeySequence key(Qt::Key_F1);
    write(QStringLiteral("keyshortcutrc"), "[shortcutkeys]\nF1=old\n");
    QCOMPARE(VelKeyServer::checkForGlobalShortcut(key), QStringLiteral("old"));
    write(QStringLiteral("keyshortcutrc"), "[SHORTCUTKEYS]\nF1=new\n");
    QCOMPARE(VelKeyServer::checkForGlobalShortcut(key), QStringLiteral("new"));
    QVERIFY(QFile::remove(path(QStringLiteral("keyshortcutrc"))));
    QVERIFY(VelKeyServer::checkForGlobalShortcut(key).isNull());
}

void tst_VelKeyServer::readsTheFileOfTheSession()
{
    qputenv("VEL_SESSION", "work");
    write(QStringLiteral("keyshortcutrc"), "[ShortCutKeys]\nF1=default\n");
    write(QStringLiteral("keyshortcutrc.work"), "[ShortCutKeys]\nF1=session\n");
    QCOMPARE(VelKeyServer::checkForGlobalShortcut(QKeySequence(Qt::Key_F1)), QStringLiteral("session"));
}

void tst_VelKeyServer::findsNothingWithoutAUsableFile_data()
{
    QTest::addColumn<QString>("kind");
    for (const char *kind : {"missing", "directory", "pipe", "too large", "empty", "no section", "garbage"})
        QTest::newRow(kind) << QString::fromLatin1(kind);
}

void tst_VelKeyServer::findsNothingWithoutAUsableFile()
{
    QFETCH(QString, kind);
    const QString name = QStringLiteral("keyshortcutrc");
    if (kind == QLatin1String("directory"))
        QVERIFY(QDir().mkpath(path(name)));
    else if (kind == QLatin1String("pipe"))
        QCOMPARE(mkfifo(QFile::encodeName(path(name)).constData(), 0600), 0);
    else if (kind == QLatin1String("too large"))
        QVERIFY(QFile::resize(write(name, "[ShortCutKeys]\nF1=act\n"), 16 * 1024 * 1024 + 1));
    else if (kind == QLatin1String("empty"))
        write(name, QByteArray());
    else if (kind == QLatin1String("no section"))
        write(name, "F1=act\n[Other]\nF1=act\n");
    else if (kind == QLatin1String("garbage"))
        write(name, QByteArray("[ShortCutKeys]\n\0\xff\xfe]]][[\n=\n==\n+=+\n|=|\n\"\"=\"\"\nNone+=\n", 42));
    QVERIFY(VelKeyServer::checkForGlobalShortcut(QKeySequence(Qt::Key_F1)).isNull());
}

VEL_TEST_MAIN(tst_VelKeyServer)

#include "tst_VelKeyServer.moc"
