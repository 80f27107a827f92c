// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <DesktopEntryValue.h>

#include <random>

/// Bytes of values and what they mean.
class tst_DesktopEntryValue : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void decodesWhatIsValidAndNothingElse_data();
    void decodesWhatIsValidAndNothingElse();
    void decodesAsQtDoes();
    void readsEscapes_data();
    void readsEscapes();
    void readsLists_data();
    void readsLists();
    void readsFlags();
    void readsBackWhatItWrites();
};

namespace {

std::string_view view(const QByteArray &bytes)
{
    return {bytes.constData(), std::size_t(bytes.size())};
}

} // namespace

void tst_DesktopEntryValue::decodesWhatIsValidAndNothingElse_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<bool>("valid");
    QTest::newRow("nothing") << QByteArray() << true;
    QTest::newRow("seven letters") << QByteArray("abcdefg") << true;
    QTest::newRow("eight letters") << QByteArray("abcdefgh") << true;
    QTest::newRow("a byte behind eight letters") << QByteArray("abcdefgh\xFF") << false;
    QTest::newRow("a byte among eight letters") << QByteArray("abcdef\xFFh") << false;
    QTest::newRow("two bytes") << QByteArray("\xC3\xBC") << true;
    QTest::newRow("three bytes") << QByteArray("\xE2\x82\xAC") << true;
    QTest::newRow("four bytes") << QByteArray("\xF0\x9F\x98\x80") << true;
    QTest::newRow("cut off") << QByteArray("\xE2\x82") << false;
    QTest::newRow("overlong") << QByteArray("\xC0\xAF") << false;
    QTest::newRow("overlong, three bytes") << QByteArray("\xE0\x80\xAF") << false;
    QTest::newRow("a surrogate") << QByteArray("\xED\xA0\x80") << false;
    QTest::newRow("too large") << QByteArray("\xF4\x90\x80\x80") << false;
    QTest::newRow("a lone trailing byte") << QByteArray("\x80") << false;
}

void tst_DesktopEntryValue::decodesWhatIsValidAndNothingElse()
{
    QFETCH(QByteArray, bytes);
    QFETCH(bool, valid);
    const auto text = DesktopEntryValue::decodeUtf8(view(bytes));
    QCOMPARE(text.has_value(), valid);
    if (valid)
        QCOMPARE(*text, QString::fromUtf8(bytes));
}

void tst_DesktopEntryValue::decodesAsQtDoes()
{
    std::mt19937 random(3);
    const QStringList pieces = {QStringLiteral("a"), QStringLiteral("plain text"), QString(QChar(0xfc)),
                                QString(QChar(0x20ac)), QString::fromUtf8("\xF0\x9F\x98\x80")};
    for (int round = 0; round < 500; ++round) {
        QString text;
        for (unsigned i = random() % 12; i > 0; --i)
            text += pieces.at(int(random() % unsigned(pieces.size())));
        QCOMPARE(DesktopEntryValue::decodeUtf8(view(text.toUtf8())).value_or(QStringLiteral("none")), text);
    }
}

void tst_DesktopEntryValue::readsEscapes_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("text");
    QTest::newRow("all") << QByteArray("\\s\\n\\t\\r\\\\") << QStringLiteral(" \n\t\r\\");
    QTest::newRow("unknown") << QByteArray("\\x\\;") << QStringLiteral("\\x\\;");
    QTest::newRow("at the end") << QByteArray("a\\") << QStringLiteral("a\\");
    QTest::newRow("escaped escape") << QByteArray("\\\\n") << QStringLiteral("\\n");
}

void tst_DesktopEntryValue::readsEscapes()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, text);
    QCOMPARE(DesktopEntryValue::toText(view(bytes)).value_or(QString()), text);
    QCOMPARE(DesktopEntryValue::decode<QString>(view(bytes)).value_or(QString()), text);
}

void tst_DesktopEntryValue::readsLists_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QStringList>("items");
    const auto list = [](const char *items) { return QString::fromLatin1(items).split(QLatin1Char('|')); };
    QTest::newRow("closed") << QByteArray("a;b;") << list("a|b");
    QTest::newRow("open") << QByteArray("a;b") << list("a|b");
    QTest::newRow("empty items") << QByteArray(";a;;b;;") << list("a|b");
    QTest::newRow("a semicolon in an item") << QByteArray("a\\;b;c") << list("a;b|c");
    QTest::newRow("a backslash before a semicolon") << QByteArray("a\\\\;b") << list("a\\|b");
    QTest::newRow("nothing") << QByteArray(";;") << QStringList();
}

void tst_DesktopEntryValue::readsLists()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QStringList, items);
    const auto list = DesktopEntryValue::toList(view(bytes));
    QVERIFY(list.has_value());
    QCOMPARE(*list, items);
    QCOMPARE(*DesktopEntryValue::decode<QStringList>(view(bytes)), items);
    QVERIFY(!DesktopEntryValue::toList(view("x;\xFF;" + bytes)));
}

void tst_DesktopEntryValue::readsFlags()
{
    for (const char *yes : {"true", "1", "true \t"})
        QVERIFY2(DesktopEntryValue::toFlag(yes), yes);
    for (const char *no : {"false", "0", "", "True", "yes", "true x"})
        QVERIFY2(!DesktopEntryValue::toFlag(no), no);
}

void tst_DesktopEntryValue::readsBackWhatItWrites()
{
    const QStringList texts = {QStringLiteral(" a "), QStringLiteral("\n\r\t\\"), QStringLiteral("a;b\\;"),
                               QStringLiteral("\\s"), QString(QChar(0xfc))};
    for (const QString &text : texts) {
        const std::string bytes = DesktopEntryValue::fromText(text);
        QCOMPARE(bytes.find('\n'), std::string::npos);
        QVERIFY(bytes.front() != ' ');
        QCOMPARE(DesktopEntryValue::toText(bytes).value_or(QString()), text);
    }
    QCOMPARE(DesktopEntryValue::toList(DesktopEntryValue::fromList(texts)).value_or(QStringList()), texts);
    QCOMPARE(DesktopEntryValue::fromList({QStringLiteral("a"), QString(), QStringLiteral("b")}),
             std::string("a;b;"));
}

VEL_TEST_GUILESS_MAIN(tst_DesktopEntryValue)

#include "tst_DesktopEntryValue.moc"
