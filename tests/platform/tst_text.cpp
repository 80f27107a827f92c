// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velcore/text.h>

#include <QVector>

class TextTest : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void refusesWhatIsNotEscapedUtf8_data();
    void refusesWhatIsNotEscapedUtf8();
    void unescapesTheText_data();
    void unescapesTheText();
    void neverWritesBehindTheBuffer();
    void acceptsNoPointerAtAll();
};

// A buffer of the size that is promised, no byte more: sanitizers see every overrun.
static bool unescaped(const QByteArray &text, QByteArray *result)
{
    QVector<unsigned char> buffer(text.size() + 1, 'x');
    const auto *bytes = reinterpret_cast<const unsigned char *>(text.constData());
    const bool good = Vel::isEscapedUtf8(bytes, buffer.data());
    if (good)
        *result = QByteArray(reinterpret_cast<const char *>(buffer.constData()));
    return good;
}

void TextTest::refusesWhatIsNotEscapedUtf8_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::newRow("empty") << QByteArray("");
    QTest::newRow("no escape") << QByteArray("file:///home/a");
    QTest::newRow("no escape, UTF-8") << QByteArray("\xc3\xa4");
    QTest::newRow("lone percent") << QByteArray("%");
    QTest::newRow("percent at the end") << QByteArray("a%20b%");
    QTest::newRow("one digit") << QByteArray("a%2");
    QTest::newRow("not hexadecimal, first") << QByteArray("a%g0");
    QTest::newRow("not hexadecimal, second") << QByteArray("a%0g");
    QTest::newRow("sign") << QByteArray("a%+1");
    QTest::newRow("one broken among good ones") << QByteArray("%20%zz%20");
    QTest::newRow("doubled percent") << QByteArray("100%%25");
    QTest::newRow("Latin-1") << QByteArray("%E4");
    QTest::newRow("bytes that are no UTF-8 beside an escape") << QByteArray("a%20\xe4");
    QTest::newRow("lone continuation") << QByteArray("%80");
    QTest::newRow("cut two-byte character") << QByteArray("%C3");
    QTest::newRow("cut three-byte character") << QByteArray("%E2%82");
    QTest::newRow("cut four-byte character") << QByteArray("%F0%9F%98");
    QTest::newRow("overlong slash") << QByteArray("%C0%AF");
    QTest::newRow("overlong, two bytes") << QByteArray("%C1%BF");
    QTest::newRow("overlong, three bytes") << QByteArray("%E0%9F%BF");
    QTest::newRow("overlong, four bytes") << QByteArray("%F0%8F%BF%BF");
    QTest::newRow("surrogate") << QByteArray("%ED%A0%80");
    QTest::newRow("behind U+10FFFF") << QByteArray("%F4%90%80%80");
    QTest::newRow("five bytes") << QByteArray("%F8%88%80%80%80");
    QTest::newRow("zero byte") << QByteArray("a%00b");
}

void TextTest::refusesWhatIsNotEscapedUtf8()
{
    QFETCH(QByteArray, text);
    QByteArray result;
    QVERIFY(!unescaped(text, &result));
}

void TextTest::unescapesTheText_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<QByteArray>("expected");
    QTest::newRow("blank") << QByteArray("a%20b") << QByteArray("a b");
    QTest::newRow("percent") << QByteArray("100%25") << QByteArray("100%");
    QTest::newRow("escaped escape is not unescaped twice") << QByteArray("%2541") << QByteArray("%41");
    QTest::newRow("both cases") << QByteArray("%c3%A4%C3%a4") << QByteArray("\xc3\xa4\xc3\xa4");
    QTest::newRow("beside plain UTF-8") << QByteArray("\xc3\xa4%20") << QByteArray("\xc3\xa4 ");
    QTest::newRow("two bytes, least and last")
        << QByteArray("%C2%80%DF%BF") << QByteArray("\xc2\x80\xdf\xbf");
    QTest::newRow("three bytes, least and last")
        << QByteArray("%E0%A0%80%EF%BF%BF") << QByteArray("\xe0\xa0\x80\xef\xbf\xbf");
    QTest::newRow("around the surrogates")
        << QByteArray("%ED%9F%BF%EE%80%80") << QByteArray("\xed\x9f\xbf\xee\x80\x80");
    QTest::newRow("four bytes, least and last")
        << QByteArray("%F0%90%80%80%F4%8F%BF%BF") << QByteArray("\xf0\x90\x80\x80\xf4\x8f\xbf\xbf");
    QTest::newRow("a character half plain, half escaped") << QByteArray("\xc3%A4") << QByteArray("\xc3\xa4");
    QTest::newRow("line feed") << QByteArray("%0A") << QByteArray("\n");
}

void TextTest::unescapesTheText()
{
    QFETCH(QByteArray, text);
    QFETCH(QByteArray, expected);
    QByteArray result;
    QVERIFY(unescaped(text, &result));
    QCOMPARE(result, expected);
}

void TextTest::neverWritesBehindTheBuffer()
{
    const unsigned char text[] = "plain%";
    unsigned char out[sizeof text + 1];
    std::fill(std::begin(out), std::end(out), static_cast<unsigned char>('#'));
    QVERIFY(!Vel::isEscapedUtf8(text, out));
    QCOMPARE(out[sizeof text], static_cast<unsigned char>('#'));
}

void TextTest::acceptsNoPointerAtAll()
{
    unsigned char out[4];
    QVERIFY(!Vel::isEscapedUtf8(nullptr, out));
    QVERIFY(!Vel::isEscapedUtf8(reinterpret_cast<const unsigned char *>("%20"), nullptr));
}

VEL_TEST_GUILESS_MAIN(TextTest)
#include "tst_text.moc"
