// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "WebAddress.h"

#include "OnDisk.h"

#include <frame/DesktopEntryRecord.h>

#include <QStringList>

#include <algorithm>

namespace {

constexpr int LongestName = 200;
constexpr int LongestStem = 60;

bool isMail(const QUrl &url)
{
    return url.scheme() == QLatin1String("mailto");
}

// Addresses are ASCII, so that UTF-16 shows by its zeros; its order is that of this machine where no
// mark says another.
QString decoded(const QByteArray &text)
{
    const auto *units = reinterpret_cast<const char16_t *>(text.constData());
    QString result = text.contains('\0') ? QString::fromUtf16(units, text.size() / int(sizeof *units))
                                         : QString::fromUtf8(text);
    return result.remove(QChar(QChar::Null));
}

bool isPlain(QChar character)
{
    const ushort code = character.unicode();
    return (code >= 'a' && code <= 'z') || (code >= '0' && code <= '9') || code == '.' || code == '_';
}

bool isMark(QChar character)
{
    return character == QLatin1Char('.') || character == QLatin1Char('_') || character == QLatin1Char('-');
}

} // namespace

bool WebAddress::isOne(const QUrl &url)
{
    if (!url.isValid())
        return false;
    if (isMail(url))
        return !url.path().isEmpty();
    const QString scheme = url.scheme();
    const bool isWeb =
        scheme == QLatin1String("http") || scheme == QLatin1String("https") || scheme == QLatin1String("ftp");
    return isWeb && !url.host().isEmpty();
}

// Browsers take the address for the title of a page that has none.
QString WebAddress::name() const
{
    const QString plain = title.simplified();
    const bool isTitled = !plain.isEmpty() && QUrl(plain) != url;
    const QString name = isTitled ? plain : isMail(url) ? url.path() : url.host();
    return name.size() > LongestName ? name.left(LongestName) + QStringLiteral("...") : name;
}

QString WebAddress::fileStem() const
{
    const QString whole = (isMail(url) ? url.path() : url.host(QUrl::FullyEncoded)).toLower();
    QString stem;
    for (const QChar character : whole) {
        const bool isEmptyOrMarked = stem.isEmpty() || isMark(stem.at(stem.size() - 1));
        const QChar next = isPlain(character) ? character : QLatin1Char('-');
        // A name with a dot in front would be hidden.
        if (!isMark(next) || !isEmptyOrMarked)
            stem.append(next);
    }
    if (stem.startsWith(QLatin1String("www.")))
        stem.remove(0, 4);
    stem.truncate(LongestStem);
    while (!stem.isEmpty() && isMark(stem.at(stem.size() - 1)))
        stem.chop(1);
    return stem.isEmpty() ? QStringLiteral("link") : stem;
}

bool WebAddress::save(const QString &path) const
{
    if (OnDisk::exists(path))
        return false;
    VelUIDesktopEntry entry(path);
    entry.setType(QStringLiteral("Link"));
    entry.setName(name());
    entry.setIcon(QStringLiteral("text-html"));
    entry.setURL(QString::fromLatin1(url.toEncoded()));
    return entry.save();
}

QVector<WebAddress> WebAddress::parsed(const QByteArray &text)
{
    const QStringList lines = decoded(text).split(QLatin1Char('\n'));
    QVector<WebAddress> addresses;
    for (int i = 0; i < lines.size(); i += 2) {
        const QUrl url(lines.at(i).trimmed());
        if (isOne(url))
            addresses.append({url, lines.value(i + 1).trimmed()});
    }
    return addresses;
}

QVector<WebAddress> WebAddress::withTitles(const QList<QUrl> &urls, const QList<QByteArray> &texts)
{
    QVector<WebAddress> titled;
    for (const QByteArray &text : texts)
        titled += parsed(text);
    QVector<WebAddress> addresses;
    for (const QUrl &url : urls) {
        const auto found = std::find_if(titled.begin(), titled.end(), [&url](const WebAddress &address) {
            return address.url == url && !address.title.isEmpty();
        });
        addresses.append({url, found == titled.end() ? QString() : found->title});
    }
    return addresses;
}
