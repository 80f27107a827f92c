// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuMirror.h"

#include "SortOrderWalk.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>

#include <unistd.h>

namespace {

QByteArray contents(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QByteArray bytes = file.readAll();
    return bytes.isNull() ? QByteArray("") : bytes;
}

QByteArray linkText(const QString &path)
{
    QByteArray text(4096, '\0');
    const auto size = readlink(QFile::encodeName(path).constData(), text.data(), size_t(text.size()));
    return size < 0 ? QByteArray() : text.left(int(size));
}

} // namespace

MenuMirror MenuMirror::ofDisk(const QString &directory)
{
    MenuMirror mirror;
    mirror.add(directory, QString());
    return mirror;
}

void MenuMirror::add(const QString &directory, const QString &path)
{
    const QString full = directory + QLatin1Char('/') + path;
    const QFileInfo info(path.isEmpty() ? directory : full);
    Item &item = m_items[path];
    if (info.isSymLink()) {
        item.kind = Kind::Link;
        item.bytes = linkText(full);
    } else if (info.isDir()) {
        item.kind = Kind::Folder;
        item.bytes = contents(full + QLatin1String("/.directory"));
        const QStringList names =
            QDir(full).entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot);
        for (const QString &name : names) {
            if (name != QLatin1String(".directory"))
                add(directory, join(path, name));
        }
    } else {
        item.bytes = contents(full);
    }
}

QString MenuMirror::difference(const MenuMirror &expected, const MenuMirror &found)
{
    QStringList lines;
    for (auto it = expected.m_items.cbegin(); it != expected.m_items.cend(); ++it) {
        if (!found.contains(it.key()))
            lines.append(QLatin1String("missing: ") + it.key());
        else if (!(found.m_items[it.key()] == *it))
            lines.append(QStringLiteral("%1 holds:\n%2\ninstead of:\n%3")
                             .arg(it.key(), QString::fromUtf8(found.m_items[it.key()].bytes),
                                  QString::fromUtf8(it->bytes)));
    }
    for (auto it = found.m_items.cbegin(); it != found.m_items.cend(); ++it) {
        if (!expected.contains(it.key()))
            lines.append(QLatin1String("not expected: ") + it.key());
    }
    return lines.join(QLatin1Char('\n'));
}

QString MenuMirror::join(const QString &folder, const QString &name)
{
    return folder.isEmpty() ? name : folder + QLatin1Char('/') + name;
}

QString MenuMirror::folderOf(const QString &path)
{
    return path.left(std::max(0, int(path.lastIndexOf(QLatin1Char('/')))));
}

QString MenuMirror::nameOf(const QString &path)
{
    return path.mid(path.lastIndexOf(QLatin1Char('/')) + 1);
}

bool MenuMirror::isBelow(const QString &path, const QString &folder)
{
    return folder.isEmpty() || path == folder || path.startsWith(folder + QLatin1Char('/'));
}

QStringList MenuMirror::childrenOf(const QString &folder) const
{
    QStringList names;
    for (auto it = m_items.cbegin(); it != m_items.cend(); ++it) {
        if (!it.key().isEmpty() && folderOf(it.key()) == folder)
            names.append(nameOf(it.key()));
    }
    return names;
}

void MenuMirror::copy(const QString &source, const QString &target)
{
    const QMap<QString, Item> before = m_items;
    for (auto it = before.cbegin(); it != before.cend(); ++it) {
        if (!isBelow(it.key(), source))
            continue;
        Item item = *it;
        item.shownFirst.clear();
        m_items.insert(target + it.key().mid(source.size()), item);
    }
    // A copied link to a file becomes a file; one to a folder stays a link.
    Item &item = m_items[target];
    const QString led = QFile::decodeName(item.bytes);
    if (item.kind == Kind::Link && !QFileInfo(led).isDir())
        item = Item{Kind::File, contents(led), QString()};
}

void MenuMirror::move(const QString &source, const QString &target)
{
    const QMap<QString, Item> before = m_items;
    remove(source);
    for (auto it = before.cbegin(); it != before.cend(); ++it) {
        if (!isBelow(it.key(), source))
            continue;
        Item item = *it;
        item.shownFirst.clear();
        m_items.insert(target + it.key().mid(source.size()), item);
    }
}

void MenuMirror::remove(const QString &path)
{
    for (auto it = m_items.begin(); it != m_items.end();)
        it = isBelow(it.key(), path) ? m_items.erase(it) : std::next(it);
}

QByteArray MenuMirror::valueOf(const QByteArray &record, const QByteArray &key)
{
    const QList<QByteArray> lines = record.split('\n');
    for (const QByteArray &line : lines) {
        if (line.startsWith(key + '='))
            return line.mid(key.size() + 1);
    }
    return {};
}

QStringList MenuMirror::sortOrderOf(const QString &folder) const
{
    return QString::fromUtf8(valueOf(m_items.value(folder).bytes, "SortOrder"))
        .split(QLatin1Char(';'), Qt::SkipEmptyParts);
}

void MenuMirror::list(const QString &folder, const QStringList &shown, const QStringList &names,
                      const QString &following)
{
    QStringList list{QStringLiteral("*")};
    for (const QString &child : shown) {
        if (!following.isNull() && child == following)
            list += names;
        if (!names.contains(child))
            list.append(child);
    }
    if (!following.isNull() && following.isEmpty())
        list += names;
    const QByteArray line = "SortOrder=" + list.join(QLatin1Char(';')).toUtf8() + ';';

    QByteArray &record = m_items[folder].bytes;
    if (record.isNull())
        record = "[Desktop Entry]\nType=Directory\nName=Group\nName[en]=Group\n";
    QList<QByteArray> lines = record.split('\n');
    const auto old = std::find_if(lines.begin(), lines.end(),
                                  [](const QByteArray &text) { return text.startsWith("SortOrder="); });
    if (old != lines.end())
        *old = line;
    else
        lines.insert(lines.size() - 1, line);
    record = lines.join('\n');
}

QByteArray MenuMirror::recordOf(const QString &path) const
{
    const Item item = m_items.value(path);
    if (item.kind != Kind::Link)
        return item.bytes;
    const QString led = QFile::decodeName(item.bytes);
    return contents(QFileInfo(led).isDir() ? led + QLatin1String("/.directory") : led);
}

bool MenuMirror::isShownAsFolder(const QString &path) const
{
    const Item item = m_items.value(path);
    return item.kind == Kind::Folder
        || (item.kind == Kind::Link && QFileInfo(QFile::decodeName(item.bytes)).isDir());
}

bool MenuMirror::isHidden(const QString &path) const
{
    return !isShownAsFolder(path) && path.endsWith(QLatin1String(".desktop"))
        && valueOf(recordOf(path), "Hidden") == "true";
}

QString MenuMirror::shownName(const QString &path) const
{
    const QString kept = m_items.value(path).shownFirst;
    if (!kept.isNull())
        return kept;
    const QByteArray record = recordOf(path);
    if (!isShownAsFolder(path) && !path.endsWith(QLatin1String(".desktop")))
        return nameOf(path);
    if (record.isNull())
        return nameOf(path);
    const QByteArray local = valueOf(record, "Name[en]");
    return QString::fromUtf8(local.isEmpty() ? valueOf(record, "Name") : local);
}

void MenuMirror::keepFolderNames()
{
    for (auto it = m_items.begin(); it != m_items.end(); ++it) {
        if (it->kind == Kind::Folder && it->shownFirst.isNull() && !it->bytes.isNull())
            it->shownFirst = shownName(it.key());
    }
}

bool MenuMirror::standsBefore(const QString &folder, const QString &left, const QString &right) const
{
    const SortOrderWalk walk(sortOrderOf(folder), left, right);
    if (walk.leftPlace() != walk.rightPlace())
        return walk.leftPlace() < walk.rightPlace();
    const bool leftIsFolder = isShownAsFolder(join(folder, left));
    if (leftIsFolder != isShownAsFolder(join(folder, right)))
        return leftIsFolder;
    return shownName(join(folder, left)) < shownName(join(folder, right));
}

QString MenuMirror::faultOf(const QString &folder, const QStringList &names) const
{
    QStringList expected;
    const QStringList children = childrenOf(folder);
    for (const QString &name : children) {
        if (!isHidden(join(folder, name)))
            expected.append(name);
    }
    QStringList found = names;
    expected.sort();
    found.sort();
    if (found != expected)
        return QStringLiteral("\"%1\" shows %2 instead of %3")
            .arg(folder, found.join(QLatin1Char(',')), expected.join(QLatin1Char(',')));
    for (int i = 1; i < names.size(); ++i) {
        if (standsBefore(folder, names.at(i), names.at(i - 1)))
            return QStringLiteral("\"%1\" shows %2 before %3, the list is %4")
                .arg(folder, names.at(i - 1), names.at(i), sortOrderOf(folder).join(QLatin1Char(';')));
    }
    return {};
}
