// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <LineScan.h>

/// The lines of a text, as its writer asks for them.
class tst_LineScan : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void findsCommentsAboveALine();
    void findsTheEndOfWhatIsNotBlank();
    void takesTheNearestLineEnd_data();
    void takesTheNearestLineEnd();
};

namespace {

std::string_view view(const QByteArray &bytes)
{
    return {bytes.constData(), std::size_t(bytes.size())};
}

} // namespace

void tst_LineScan::findsCommentsAboveALine()
{
    const std::string_view text = "k=1\n\n# one\n  # two\n[G]\nk=2\n[H]\n";
    const LineScan lines(text);
    QCOMPARE(lines.commentsAbove(text.find("[G]")), text.find("# one"));
    QCOMPARE(lines.commentsAbove(text.find("[H]")), text.find("[H]"));
    QCOMPARE(LineScan("# one\n[G]").commentsAbove(6), std::size_t(0));
    const LineScan marked("\xEF\xBB\xBF# one\n[G]");
    QCOMPARE(marked.begin(), std::size_t(3));
    QCOMPARE(marked.commentsAbove(9), std::size_t(3));
}

void tst_LineScan::findsTheEndOfWhatIsNotBlank()
{
    QCOMPARE(LineScan("a\n\n \t\n\r\n").contentEnd(8), std::size_t(2));
    QCOMPARE(LineScan("a\nb").contentEnd(3), std::size_t(3));
    QCOMPARE(LineScan("\n\n").contentEnd(2), std::size_t(0));
}

void tst_LineScan::takesTheNearestLineEnd_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<int>("at");
    QTest::addColumn<QByteArray>("lineEnd");
    QTest::newRow("none at all") << QByteArray("a") << 1 << QByteArray("\n");
    QTest::newRow("the one above") << QByteArray("a\r\nb\n") << 3 << QByteArray("\r\n");
    QTest::newRow("the nearest above") << QByteArray("a\r\nb\n") << 5 << QByteArray("\n");
    QTest::newRow("none above") << QByteArray("a\r\nb\n") << 0 << QByteArray("\r\n");
}

void tst_LineScan::takesTheNearestLineEnd()
{
    QFETCH(QByteArray, text);
    QFETCH(int, at);
    QFETCH(QByteArray, lineEnd);
    QCOMPARE(QByteArray::fromStdString(LineScan(view(text)).lineEndAt(std::size_t(at))), lineEnd);
}

VEL_TEST_GUILESS_MAIN(tst_LineScan)

#include "tst_LineScan.moc"
