// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/WebAddress.h>

#include <frame/DesktopEntryRecord.h>

#include <QFile>
#include <QFileInfo>

#include <utility>

namespace {

QByteArray utf16(const QString &text)
{
    return {reinterpret_cast<const char *>(text.utf16()), text.size() * 2};
}

} // namespace

/// Addresses in the web that are to become entries.
class tst_WebAddress : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsAddressesFromOtherUrls_data();
    void tellsAddressesFromOtherUrls();
    void readsWhatBrowsersHandOut_data();
    void readsWhatBrowsersHandOut();
    void givesUrlsTheirTitles();
    void namesAnEntry_data();
    void namesAnEntry();
    void callsItsFilePlainly_data();
    void callsItsFilePlainly();
    void savesAnEntry();
    void overwritesNothing();
};

void tst_WebAddress::tellsAddressesFromOtherUrls_data()
{
    QTest::addColumn<QString>("url");
    QTest::addColumn<bool>("expected");
    const auto row = [](const char *url, bool expected) {
        QTest::newRow(url) << QString::fromLatin1(url) << expected;
    };
    row("http://example.org", true);
    row("HTTPS://example.org/a?b=c#d", true);
    row("ftp://example.org/", true);
    row("mailto:me@example.org", true);
    row("mailto:", false);
    row("mailto:?subject=x", false);
    row("http:///nowhere", false);
    row("http://exa mple.org", false);
    row("file:///tmp/x", false);
    row("sftp://example.org/", false);
    row("javascript:alert(1)", false);
    row("data:text/html,x", false);
    row("/tmp/x", false);
    row("", false);
}

void tst_WebAddress::tellsAddressesFromOtherUrls()
{
    QFETCH(QString, url);
    QFETCH(bool, expected);
    QCOMPARE(WebAddress::isOne(QUrl(url)), expected);
}

void tst_WebAddress::readsWhatBrowsersHandOut_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<QString>("expected"); // addresses and titles
    const QString page = QStringLiteral("https://example.org/p\nDas B\u00fcch\u2026");
    const QString read = QStringLiteral("https://example.org/p=Das B\u00fcch\u2026");
    const QByteArray mark = utf16(QString(QChar(QChar::ByteOrderMark)));
    QByteArray swapped = utf16(QString(QChar(QChar::ByteOrderMark)) + page);
    for (int i = 0; i < swapped.size(); i += 2)
        std::swap(swapped.data()[i], swapped.data()[i + 1]);
    QTest::newRow("nothing") << QByteArray() << QString();
    QTest::newRow("zeros") << QByteArray(5, '\0') << QString();
    QTest::newRow("odd") << utf16(page) + 'x' << read;
    QTest::newRow("UTF-16") << utf16(page) << read;
    QTest::newRow("marked") << mark + utf16(page) << read;
    QTest::newRow("the other order") << swapped << read;
    QTest::newRow("UTF-8") << page.toUtf8() << read;
    QTest::newRow("ended by a zero") << utf16(page + QChar(QChar::Null)) << read;
    QTest::newRow("line ends of others")
        << QByteArray("http://a.org\r\nA\r\nftp://b.org\r\nB\r\n") << "http://a.org=A|ftp://b.org=B";
    QTest::newRow("no title") << QByteArray("http://a.org") << "http://a.org=";
    QTest::newRow("other URLs") << QByteArray("about:blank\nEmpty\nhttp://a.org\nA") << "http://a.org=A";
    QTest::newRow("no text") << QByteArray("\xff\xfe\xfd\n\x80") << QString();
}

void tst_WebAddress::readsWhatBrowsersHandOut()
{
    QFETCH(QByteArray, text);
    QFETCH(QString, expected);
    QStringList found;
    const QVector<WebAddress> addresses = WebAddress::parsed(text);
    for (const WebAddress &address : addresses)
        found.append(address.url.toString() + QLatin1Char('=') + address.title);
    QCOMPARE(found.join(QLatin1Char('|')), expected);
}

void tst_WebAddress::givesUrlsTheirTitles()
{
    const QVector<WebAddress> addresses = WebAddress::withTitles(
        {QUrl(QStringLiteral("http://b.org")), QUrl(QStringLiteral("http://c.org"))},
        {QByteArray(), QByteArray("http://a.org\nA\nhttp://b.org\n\n"), QByteArray("http://b.org\nB")});
    QCOMPARE(addresses.size(), 2);
    QCOMPARE(addresses.at(0).title, QStringLiteral("B"));
    QCOMPARE(addresses.at(1).url, QUrl(QStringLiteral("http://c.org")));
    QCOMPARE(addresses.at(1).title, QString());
}

void tst_WebAddress::namesAnEntry_data()
{
    QTest::addColumn<QString>("url");
    QTest::addColumn<QString>("title");
    QTest::addColumn<QString>("expected");
    const QString url = QStringLiteral("http://example.org/page");
    QTest::newRow("title") << url << "The page"
                           << "The page";
    QTest::newRow("lines") << url << " The\n\tpage "
                           << "The page";
    QTest::newRow("no title") << url << ""
                              << "example.org";
    QTest::newRow("the address as title") << url << url << "example.org";
    QTest::newRow("mail") << "mailto:me@example.org?subject=Hello"
                          << ""
                          << "me@example.org";
    QTest::newRow("long") << url << QString(300, QLatin1Char('x'))
                          << QString(200, QLatin1Char('x')) + QStringLiteral("...");
}

void tst_WebAddress::namesAnEntry()
{
    QFETCH(QString, url);
    QFETCH(QString, title);
    QFETCH(QString, expected);
    QCOMPARE((WebAddress{QUrl(url), title}.name()), expected);
}

void tst_WebAddress::callsItsFilePlainly_data()
{
    QTest::addColumn<QString>("url");
    QTest::addColumn<QString>("expected");
    QTest::newRow("host") << "http://Example.org/page"
                          << "example.org";
    QTest::newRow("www") << "http://www.example.org"
                         << "example.org";
    QTest::newRow("port") << "http://localhost:8080/"
                          << "localhost";
    QTest::newRow("other letters") << QStringLiteral("http://b\u00fccher.example/") << "xn-bcher-kva.example";
    QTest::newRow("number") << "http://[::1]/"
                            << "1";
    QTest::newRow("mail") << "mailto:me+you@example.org"
                          << "me-you-example.org";
    QTest::newRow("dots") << "mailto:../../etc"
                          << "etc";
    QTest::newRow("nothing") << QStringLiteral("mailto:\u00e4") << "link";
    QTest::newRow("long") << QStringLiteral("mailto:") + QString(300, QLatin1Char('x'))
                          << QString(60, QLatin1Char('x'));
}

void tst_WebAddress::callsItsFilePlainly()
{
    QFETCH(QString, url);
    QFETCH(QString, expected);
    QCOMPARE((WebAddress{QUrl(url), QString()}.fileStem()), expected);
}

void tst_WebAddress::savesAnEntry()
{
    const QString file = path(QStringLiteral("x.desktop"));
    const QString title = QStringLiteral("B\u00fccher;\n\\ and %u");
    const QUrl url(QStringLiteral("https://example.org/\u00e4 b?c=%20\\n&d;e#f"));
    QVERIFY((WebAddress{url, title}.save(file)));
    const VelUIDesktopEntry entry(file);
    QCOMPARE(entry.getType(), QStringLiteral("Link"));
    QCOMPARE(entry.getName(), QStringLiteral("B\u00fccher; \\ and %u"));
    QCOMPARE(entry.getURL(), QString::fromLatin1(url.toEncoded()));
    QVERIFY(entry.isSuitable(nullptr) && entry.isDisplayable(nullptr));
    QVERIFY(!QFileInfo(file).isExecutable());
}

void tst_WebAddress::overwritesNothing()
{
    const QString file = write(QStringLiteral("x.desktop"), "mine");
    QVERIFY(!(WebAddress{QUrl(QStringLiteral("http://example.org")), QString()}.save(file)));
    QCOMPARE(read(file), QByteArray("mine"));
    const QString link = path(QStringLiteral("y.desktop"));
    QVERIFY(QFile::link(path(QStringLiteral("nowhere")), link));
    QVERIFY(!(WebAddress{QUrl(QStringLiteral("http://example.org")), QString()}.save(link)));
    QVERIFY(!QFile::exists(path(QStringLiteral("nowhere"))));
}

VEL_TEST_GUILESS_MAIN(tst_WebAddress)

#include "tst_WebAddress.moc"
