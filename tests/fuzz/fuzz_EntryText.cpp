// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A record: read, changed, saved and read again. The first line of an input says what to set to
// which value, its first letter being that of the key; the rest is the file.

#include "FuzzTarget.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QStringList>

#include <algorithm>

namespace {

QStringList everythingOf(const VelUIDesktopEntry &record)
{
    const QChar separator(1);
    QStringList all{record.getType(),
                    record.getName(),
                    record.getLocalName(),
                    record.getGenericName(),
                    record.getLocalGenericName(),
                    record.getComment(),
                    record.getLocalComment(),
                    record.getIcon(),
                    record.getLocalIcon(),
                    record.getExec(),
                    record.getTryExec(),
                    record.getPath(),
                    record.getURL(),
                    record.getVersion(),
                    record.getStartupWMClass()};
    for (const QStringList &list :
         {record.getOnlyShowIn(), record.getNotShowIn(), record.getMimeType(), record.getCategories(),
          record.getKeywords(), record.getLocalKeywords(), record.getSortOrder()})
        all.append(list.join(separator));
    for (const bool flag :
         {record.getTerminal(), record.getNoDisplay(), record.getHidden(), record.getStartupNotify()})
        all.append(QString::number(int(flag)));
    const QList<VelUIDesktopAction> actions = record.getActions();
    for (const VelUIDesktopAction &action : actions)
        all << action.getId() << action.getName() << action.getLocalName() << action.getExec()
            << action.getOnlyShowIn().join(separator);
    return all;
}

// Sets something; the key if no line of any other may change, else nothing.
QByteArray change(VelUIDesktopEntry *record, const QByteArray &head)
{
    const QString value = QString::fromUtf8(head.mid(1));
    const QStringList list = value.split(QLatin1Char(','));
    QList<VelUIDesktopAction> actions = record->getActions();
    switch (head.isEmpty() ? 'C' : head.at(0)) {
    case 'N':
        record->setName(value);
        return "Name";
    case 'E':
        record->setExec(value);
        return "Exec";
    case 'T':
        record->setTerminal(!record->getTerminal());
        return "Terminal";
    case 'O':
        record->setOnlyShowIn(list);
        return "OnlyShowIn";
    case 'K':
        record->setLocalKeywords(list);
        return {};
    case 'L':
        record->setLocalName(value);
        return {};
    case 'A':
        actions.append(VelUIDesktopAction(QStringLiteral("id")));
        actions.last().setLocalName(value);
        record->setActions(actions);
        return {};
    default:
        record->setComment(value);
        return "Comment";
    }
}

// A save completes a last line that has no end, or only half of one.
QByteArray withLastLineEnd(const QByteArray &before, const QByteArray &after)
{
    if (before.isEmpty() || before.endsWith('\n') || !after.endsWith('\n'))
        return before;
    const bool addsBoth = !before.endsWith('\r') && after.mid(before.size(), 2) == "\r\n";
    return before + (addsBoth ? "\r\n" : "\n");
}

// Whether lines of the key are all that the two differ in.
bool differInKeyOnly(const QByteArray &before, const QByteArray &after, const QByteArray &key)
{
    QList<QByteArray> old = withLastLineEnd(before, after).split('\n');
    QList<QByteArray> fresh = after.split('\n');
    while (!old.isEmpty() && !fresh.isEmpty() && old.constFirst() == fresh.constFirst()) {
        old.removeFirst();
        fresh.removeFirst();
    }
    while (!old.isEmpty() && !fresh.isEmpty() && old.constLast() == fresh.constLast()) {
        old.removeLast();
        fresh.removeLast();
    }
    const auto isOfKey = [&key](const QByteArray &line) {
        return line.trimmed().startsWith(key) && line.contains('=');
    };
    old.erase(std::remove_if(old.begin(), old.end(), isOfKey), old.end());
    fresh.erase(std::remove_if(fresh.begin(), fresh.end(), isOfKey), fresh.end());
    return old == fresh;
}

// The same where the main group itself had to be made: every line is still there.
bool hasAllLines(QByteArray before, const QByteArray &after)
{
    if (before.startsWith("\xEF\xBB\xBF"))
        before.remove(0, 3);
    const QList<QByteArray> lines = before.split('\n');
    return std::all_of(lines.begin(), lines.end(),
                       [&after](const QByteArray &line) { return after.contains(line); });
}

} // namespace

void Fuzz::test(const QByteArray &input)
{
    const Parts parts = cut(input);
    const QString path = write("x.desktop", parts.rest);
    VelUIDesktopEntry record(path);
    const bool wasValid = record.isValid();
    record.isSuitable(nullptr);
    record.isDisplayable(nullptr);
    everythingOf(record);
    require(record.save() && read(path) == parts.rest, "a save without a change changes nothing");

    const QByteArray key = change(&record, parts.head);
    const QStringList expected = everythingOf(record);
    require(record.save(), "a change can be saved");
    const QByteArray saved = read(path);
    if (wasValid && !key.isEmpty())
        require(differInKeyOnly(parts.rest, saved, key), "a save changes no other line");
    else if (!wasValid)
        require(hasAllLines(parts.rest, saved), "a save keeps the lines of a file without a main group");
    require(everythingOf(record) == expected, "a save changes no value");
    require(everythingOf(VelUIDesktopEntry(path)) == expected, "what was saved reads back");
    require(record.save() && read(path) == saved, "a second save changes nothing");
}
