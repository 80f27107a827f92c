// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Generated inputs against a plain second reader that follows the rules of the format word by
// word. VEL_TEST_ROUNDS sets how many (default 20000).

#include "StderrCapture.h"
#include "TestCase.h"

#include <settings/ThemeRcFormat.h>

#include <QBuffer>
#include <QRandomGenerator>
#include <QRegularExpression>

using Map = QSettings::SettingsMap;

namespace {

int rounds()
{
    bool isNumber = false;
    const int number = qEnvironmentVariableIntValue("VEL_TEST_ROUNDS", &isNumber);
    return isNumber && number > 0 ? number : 20000;
}

QRegularExpression whole(const QString &pattern)
{
    return QRegularExpression(QRegularExpression::anchoredPattern(pattern));
}

QVariant plainValue(const QString &value)
{
    static const QRegularExpression upper = whole(QStringLiteral("(True|False)"));
    static const QRegularExpression lower = whole(QStringLiteral("(true|false)"));
    static const QRegularExpression digits = whole(QStringLiteral("[0-9]+"));
    if (upper.match(value).hasMatch())
        return value.contains(QLatin1String("True"));
    if (lower.match(value).hasMatch())
        return value.contains(QLatin1String("true"));
    if (digits.match(value).hasMatch()) {
        bool fits = false;
        const qulonglong number = value.toULongLong(&fits);
        return fits && number <= 2147483647 ? int(number) : 0;
    }
    const QLatin1Char quote('"');
    if (value.size() > 1 && value.startsWith(quote) && value.endsWith(quote))
        return value.mid(1).chopped(1);
    return value;
}

Map plainRead(QIODevice &device)
{
    Map map;
    while (!device.atEnd()) {
        // Up to the first NUL byte.
        const QString line = QString::fromLocal8Bit(device.readLine().trimmed().constData());
        if (line.startsWith(QLatin1Char('#')) || line.startsWith(QLatin1Char(';')))
            continue;
        if (line.contains(QLatin1Char('='))) {
            const QString key = line.section(QLatin1Char('='), 0, 0).trimmed();
            const QString value = line.section(QLatin1Char('='), 1, -1).trimmed();
            if (!key.isEmpty() && !value.isEmpty())
                map.insert(key, plainValue(value));
        } else if (line.startsWith(QLatin1Char('[')) && line.endsWith(QLatin1Char(']'))) {
            QString name = line;
            name.remove(QLatin1Char('['));
            name.remove(QLatin1Char(']'));
            map.insert(QStringLiteral("SectionName"), name.trimmed());
        }
    }
    return map;
}

QString onOneLine(QString text)
{
    return text.replace(QLatin1Char('\n'), QLatin1Char(' ')).replace(QLatin1Char('\r'), QLatin1Char(' '));
}

QByteArray plainWrite(const Map &map)
{
    QByteArray bytes;
    if (map.contains(QStringLiteral("SectionName")))
        bytes += '[' + onOneLine(map.value(QStringLiteral("SectionName")).toString()).toLocal8Bit() + "]\n";
    for (auto it = map.constBegin(); it != map.constEnd(); ++it) {
        if (it.key() == QLatin1String("SectionName"))
            continue;
        QString text = onOneLine(it.value().toString());
        const bool quoted =
            text.size() > 1 && text.startsWith(QLatin1Char('"')) && text.endsWith(QLatin1Char('"'));
        if (!quoted && (text.contains(QLatin1Char(' ')) || text.contains(QLatin1Char('\t'))))
            text = QStringLiteral("\"%1\"").arg(text);
        bytes += QStringLiteral("%1=%2\n").arg(onOneLine(it.key()), text).toLocal8Bit();
    }
    return bytes;
}

bool same(const Map &one, const Map &other)
{
    if (one.size() != other.size())
        return false;
    for (auto i = one.constBegin(), j = other.constBegin(); i != one.constEnd(); ++i, ++j) {
        if (i.key() != j.key() || i.value().userType() != j.value().userType() || i.value() != j.value())
            return false;
    }
    return true;
}

// Pieces that the rules of the format turn on, glued at random, and bytes of all sorts.
class Generator
{
public:
    explicit Generator(quint32 seed)
        : m_random(seed)
    {
    }

    QByteArray input()
    {
        QByteArray bytes;
        const int pieces = m_random.bounded(24);
        for (int i = 0; i < pieces; ++i)
            bytes += piece();
        return bytes;
    }

private:
    QByteArray piece()
    {
        static const QByteArray known[] = {
            "=",
            "=",
            "=",
            "\n",
            "\n",
            "\n",
            "\n",
            "[",
            "]",
            "[a]",
            "#",
            ";",
            "\"",
            "\"",
            " ",
            "\t",
            "\r\n",
            "true",
            "false",
            "True",
            "False",
            "TRUE",
            "key",
            "a",
            "7",
            "007",
            "-1",
            "1.5",
            "\\",
            "%1",
            "%2",
            "SectionName",
            "/",
            "\r",
            "\v",
            "\f",
            "\xc2\xa0",
            "\xef\xbb\xbf",
            "\xe2\x82\xac",
            "2147483648",
            "'",
            "x y",
            "\x1b",
            "\xd9\xa1",
        };
        if (m_random.bounded(12) == 0)
            return QByteArray(1, char(m_random.bounded(256)));
        if (m_random.bounded(200) == 0)
            return QByteArray(m_random.bounded(4096), char(m_random.bounded(256)));
        return known[m_random.bounded(int(std::size(known)))];
    }

    QRandomGenerator m_random;
};

} // namespace

class tst_ThemeRcFormatFuzz : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void readsAndWritesGeneratedInputsByTheRules();
    void typesGeneratedValuesAsTheExpressionsDo();
};

void tst_ThemeRcFormatFuzz::readsAndWritesGeneratedInputsByTheRules()
{
    for (int round = 0; round < rounds(); ++round) {
        QByteArray bytes = Generator(quint32(round)).input();
        QBuffer buffer(&bytes);
        buffer.open(QIODevice::ReadOnly);
        Map map;
        QVERIFY(ThemeRcFormat::read(buffer, map));
        buffer.seek(0);
        const bool asTheRules = same(map, plainRead(buffer));
        QVERIFY2(asTheRules, qPrintable(QStringLiteral("round %1").arg(round)));
        if (map.isEmpty())
            continue;

        QBuffer written;
        written.open(QIODevice::ReadWrite);
        StderrCapture capture; // some lose a carriage return
        const bool result = ThemeRcFormat::write(written, map);
        capture.take();
        QVERIFY(result);
        QVERIFY2(written.data() == plainWrite(map), qPrintable(QStringLiteral("round %1").arg(round)));
    }
}

void tst_ThemeRcFormatFuzz::typesGeneratedValuesAsTheExpressionsDo()
{
    static const char characters[] = "0123456789TrueFalsetruefalse\"+-. x";
    QRandomGenerator random(1);
    for (int round = 0; round < rounds(); ++round) {
        static const QByteArray words[] = {"true", "True", "false", "False", ""};
        QByteArray value = words[random.bounded(int(std::size(words)))];
        for (int i = random.bounded(12); i > 0; --i)
            value += characters[random.bounded(int(sizeof characters) - 1)];
        QByteArray bytes = "k=" + value;
        QBuffer buffer(&bytes);
        buffer.open(QIODevice::ReadOnly);
        Map map;
        QVERIFY(ThemeRcFormat::read(buffer, map));
        const QString text = QString::fromLatin1(value).trimmed();
        QCOMPARE(map.contains(QStringLiteral("k")), !text.isEmpty());
        if (text.isEmpty())
            continue;
        const QVariant expected = plainValue(text);
        QVERIFY2(map.value(QStringLiteral("k")).userType() == expected.userType(), value.constData());
        QCOMPARE(map.value(QStringLiteral("k")), expected);
    }
}

VEL_TEST_GUILESS_MAIN(tst_ThemeRcFormatFuzz)

#include "tst_ThemeRcFormatFuzz.moc"
