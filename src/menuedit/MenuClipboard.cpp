// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuClipboard.h"

#include "OnDisk.h"

#include <velcore/text.h>

#include <QDir>

#include <algorithm>
#include <cstdio>
#include <iterator>

namespace MenuClipboard {

namespace {

const char UriPrefix[] = "file:/";

// What other programs look for: a list with proper URLs, and a mark that the item was cut.
QString copiedFilesFormat()
{
    return QStringLiteral("x-special/gnome-copied-files");
}

QString cutMarkFormat()
{
    return QStringLiteral("application/x-kde-cutselection");
}

// A clean absolute path, a leading double slash being the root; empty when \a path is not one.
QString cleaned(const QString &path)
{
    int slashes = 0;
    while (slashes < path.size() && path.at(slashes) == QLatin1Char('/'))
        ++slashes;
    if (slashes == 0)
        return QString();
    QString clean = QDir::cleanPath(path.mid(slashes - 1));
    // The root is its own parent, which Qt leaves as it is written.
    while (clean.startsWith(QLatin1String("/../")))
        clean.remove(0, 3);
    return clean == QLatin1String("/..") ? QStringLiteral("/") : clean;
}

// The path in a line of ours: whatever follows the prefix, read as it stands or, if there is
// no such file, with its percent escapes resolved.
QString pathInLine(const QByteArray &line)
{
    if (!line.startsWith(UriPrefix))
        return QString();
    const QByteArray rest = '/' + line.mid(int(sizeof UriPrefix) - 1);
    QString literal = cleaned(QString::fromLocal8Bit(rest));
    if (OnDisk::exists(literal))
        return literal;
    const QString decoded = cleaned(QString::fromLocal8Bit(QByteArray::fromPercentEncoding(rest)));
    return OnDisk::exists(decoded) ? decoded : QString();
}

QString pathOf(const QUrl &url, const QByteArray &line)
{
    QString path = cleaned(url.toLocalFile());
    if (url.isValid() && OnDisk::exists(path))
        return path;
    const QString fromLine = pathInLine(line);
    return fromLine.isEmpty() ? path : fromLine;
}

QList<QByteArray> linesOf(const QByteArray &text)
{
    QList<QByteArray> lines;
    const QList<QByteArray> parts = text.split('\n');
    for (QByteArray line : parts) {
        if (line.endsWith('\r'))
            line.chop(1);
        if (!line.isEmpty())
            lines.append(line);
    }
    return lines;
}

// The paths in the format of other programs, the only one that is clear about every name.
QStringList pathsOfCopiedFiles(const QMimeData *data)
{
    QStringList paths;
    QList<QByteArray> lines = linesOf(data->data(copiedFilesFormat()));
    if (lines.isEmpty() || (lines.constFirst() != "cut" && lines.constFirst() != "copy"))
        return paths;
    lines.removeFirst();
    for (const QByteArray &line : qAsConst(lines)) {
        const QString path = cleaned(QUrl::fromEncoded(line, QUrl::StrictMode).toLocalFile());
        if (!OnDisk::exists(path))
            return QStringList();
        paths.append(path);
    }
    return paths;
}

} // namespace

QString copyFormat()
{
    return QStringLiteral("text/uri-list");
}

QString moveFormat()
{
    return QStringLiteral("text/uri-move-list");
}

QByteArray encoded(const QString &path)
{
    return UriPrefix + path.toLocal8Bit() + '\n';
}

ItemData::ItemData(const QString &path, Qt::DropAction action)
    : ItemData(QStringList{path}, action)
{
}

ItemData::ItemData(const QStringList &paths, Qt::DropAction action)
    : m_paths(paths)
    , m_isCut(action == Qt::MoveAction)
{
}

QStringList ItemData::formats() const
{
    QStringList formats{copyFormat(), copiedFilesFormat()};
    if (m_isCut) {
        formats.prepend(moveFormat());
        formats.append(cutMarkFormat());
    }
    return formats;
}

bool ItemData::hasFormat(const QString &mimeType) const
{
    return formats().contains(mimeType);
}

QByteArray ItemData::bytesOf(const QString &mimeType) const
{
    if (!hasFormat(mimeType))
        return QByteArray();
    if (mimeType == cutMarkFormat())
        return QByteArrayLiteral("1");
    const bool isOurs = mimeType != copiedFilesFormat();
    QByteArray bytes = isOurs ? "" : m_isCut ? "cut" : "copy";
    for (const QString &path : m_paths)
        bytes += isOurs ? encoded(path) : '\n' + QUrl::fromLocalFile(path).toEncoded(QUrl::FullyEncoded);
    return bytes;
}

QVariant ItemData::retrieveData(const QString &mimeType, QtMajor::MimeType type) const
{
    if (mimeType == copyFormat() && QtMajor::isList(type)) {
        QVariantList urls;
        for (const QString &path : m_paths)
            urls.append(QUrl::fromLocalFile(path));
        return urls;
    }
    const QByteArray bytes = bytesOf(mimeType);
    return bytes.isNull() ? QVariant() : QVariant(bytes);
}

QString format(const QMimeData *data)
{
    if (!data)
        return QString();
    const QStringList formats = data->formats();
    for (const QString &ours : {moveFormat(), copyFormat()}) {
        if (formats.contains(ours))
            return ours;
    }
    return QString();
}

bool areFiles(const QByteArrayList &types)
{
    // The last one is what Qt makes a list of URLs of.
    const QByteArray ours[] = {moveFormat().toLatin1(), copyFormat().toLatin1(), "text/x-moz-url"};
    return std::any_of(std::begin(ours), std::end(ours),
                       [&types](const QByteArray &type) { return types.contains(type); });
}

QList<QUrl> urls(const QMimeData *data, const QString &format)
{
    QList<QUrl> urls;
    if (!data)
        return urls;
    const QByteArray bytes = data->data(format);
    QByteArray buffer(bytes.size() + 1, '\0');
    const bool isEscaped = Vel::isEscapedUtf8(reinterpret_cast<const unsigned char *>(bytes.constData()),
                                              reinterpret_cast<unsigned char *>(buffer.data()));
    const QString text = isEscaped ? QString::fromUtf8(buffer.constData()) : QString::fromLocal8Bit(bytes);

    const bool hasCrLf = text.contains(QLatin1String("\r\n"));
    if (!hasCrLf && !text.contains(QLatin1Char('\n')))
        std::fputs("VelMenuModel: wrong separator in url list (mime data)\n", stderr);
    const QStringList parts =
        text.split(hasCrLf ? QStringLiteral("\r\n") : QStringLiteral("\n"), Qt::SkipEmptyParts);
    for (const QString &part : parts)
        urls.append(QUrl(part.simplified(), QUrl::TolerantMode));
    return urls;
}

QStringList localPaths(const QMimeData *data)
{
    if (const auto *items = qobject_cast<const ItemData *>(data)) {
        QStringList paths = items->paths();
        std::transform(paths.begin(), paths.end(), paths.begin(), cleaned);
        return paths;
    }
    if (data->hasFormat(copiedFilesFormat())) {
        QStringList paths = pathsOfCopiedFiles(data);
        if (!paths.isEmpty())
            return paths;
    }
    const QList<QUrl> urls = data->urls();
    const QList<QByteArray> lines = linesOf(data->data(copyFormat()));
    QStringList paths;
    for (int i = 0; i < urls.size(); ++i) {
        const QByteArray line = lines.size() == urls.size() ? lines.at(i) : QByteArray();
        // A comment, which counts as a URL with Qt.
        if (!line.startsWith('#'))
            paths.append(pathOf(urls.at(i), line));
    }
    return paths;
}

// Qt gives the first one away under another name on X11; the other one says the same.
QList<QByteArray> titleTexts(const QMimeData *data)
{
    return {data->data(QStringLiteral("text/x-moz-url")), data->data(QStringLiteral("_NETSCAPE_URL"))};
}

QList<QUrl> foreignUrls(const QMimeData *data)
{
    QList<QUrl> foreign;
    if (!localPaths(data).contains(QString()))
        return foreign;
    const QList<QUrl> urls = data->urls();
    const QList<QByteArray> lines = linesOf(data->data(copyFormat()));
    for (int i = 0; i < urls.size(); ++i) {
        const QByteArray line = lines.size() == urls.size() ? lines.at(i) : QByteArray();
        if (!line.startsWith('#') && pathOf(urls.at(i), line).isEmpty())
            foreign.append(urls.at(i));
    }
    return foreign;
}

} // namespace MenuClipboard
