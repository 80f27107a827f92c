// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryActions.h"

#include "records/DesktopEntryNames.h"
#include "records/EntryDocument.h"

#include <QHash>
#include <QSet>

#include <algorithm>

namespace Names = DesktopEntryNames;

namespace {

std::string groupOf(const QString &id)
{
    const QByteArray bytes = id.toUtf8();
    return Names::actionGroup({bytes.constData(), std::size_t(bytes.size())});
}

// Whether a group header can hold the id, so that it reads as it was written.
bool canBeWritten(const QString &id)
{
    return !id.isEmpty() && std::none_of(id.begin(), id.end(), [](QChar c) {
        return c == QLatin1Char('[') || c == QLatin1Char(']') || c.category() == QChar::Other_Control;
    });
}

QStringList idsOf(const EntryDocument &entry)
{
    QStringList ids = entry.list(Names::MainGroup, Names::Actions);
    ids.removeDuplicates();
    return ids;
}

// Each id once: where its first action stands, with the values of its last. An id that no
// header can hold stays only if the entry has it already.
QList<VelUIDesktopAction> writable(const QList<VelUIDesktopAction> &actions, const QStringList &known)
{
    QList<VelUIDesktopAction> result;
    QHash<QString, int> places;
    for (const VelUIDesktopAction &action : actions) {
        if (!canBeWritten(action.getId()) && !known.contains(action.getId()))
            continue;
        const auto place = places.constFind(action.getId());
        if (place != places.constEnd()) {
            result[*place] = action;
        } else {
            places.insert(action.getId(), result.size());
            result.append(action);
        }
    }
    return result;
}

VelUIDesktopAction read(const EntryDocument &entry, const QString &id)
{
    const std::string name = groupOf(id);
    const GroupValues group = entry.group(name);
    VelUIDesktopAction action(id);
    action.setName(group.text(Names::Name));
    action.setLocalName(group.localText(Names::Name));
    action.setIcon(group.text(Names::Icon));
    action.setLocalIcon(group.localText(Names::Icon));
    action.setExec(group.text(Names::Exec));
    action.setOnlyShowIn(group.list(Names::OnlyShowIn));
    action.setNotShowIn(group.list(Names::NotShowIn));
    return action;
}

QString valuesOf(const VelUIDesktopAction &action)
{
    const QStringList values = {action.getName(),
                                action.getLocalName(),
                                action.getIcon(),
                                action.getLocalIcon(),
                                action.getExec(),
                                action.getOnlyShowIn().join(QChar()),
                                action.getNotShowIn().join(QChar())};
    return values.join(QLatin1Char('\n'));
}

// Where only the id of an action is new, the action takes along what it has beside our keys: other
// languages, for one.
void copyRenamed(EntryDocument &entry, const QList<VelUIDesktopAction> &wanted, const QStringList &known)
{
    QSet<QString> gone(known.begin(), known.end());
    QHash<QString, QString> added; // ids by what else the actions have
    for (const VelUIDesktopAction &action : wanted) {
        if (!gone.remove(action.getId()))
            added.insert(valuesOf(action), action.getId());
    }
    std::unordered_map<std::string, std::string> names;
    for (const QString &id : known) {
        const bool isCandidate = !added.isEmpty() && gone.contains(id);
        const QString renamed = isCandidate ? added.take(valuesOf(read(entry, id))) : QString();
        if (!renamed.isEmpty())
            names.emplace(groupOf(id), groupOf(renamed));
    }
    entry.copyGroups(names);
}

void write(EntryDocument &entry, const VelUIDesktopAction &action)
{
    const std::string group = groupOf(action.getId());
    entry.setText(group, Names::Name, action.getName());
    entry.setLocalText(group, Names::Name, action.getLocalName());
    entry.setText(group, Names::Icon, action.getIcon());
    entry.setLocalText(group, Names::Icon, action.getLocalIcon());
    entry.setText(group, Names::Exec, action.getExec());
    entry.setList(group, Names::OnlyShowIn, action.getOnlyShowIn());
    entry.setList(group, Names::NotShowIn, action.getNotShowIn());
}

} // namespace

QList<VelUIDesktopAction> EntryActions::all(const EntryDocument &entry)
{
    QList<VelUIDesktopAction> actions;
    for (const QString &id : idsOf(entry))
        actions.append(read(entry, id));
    return actions;
}

void EntryActions::set(EntryDocument &entry, const QList<VelUIDesktopAction> &actions)
{
    const QStringList known = idsOf(entry);
    const QList<VelUIDesktopAction> wanted = writable(actions, known);
    for (const VelUIDesktopAction &action : wanted)
        entry.restoreGroup(groupOf(action.getId()));
    copyRenamed(entry, wanted, known);
    QStringList ids;
    std::unordered_set<std::string> gone;
    for (const QString &id : known)
        gone.insert(groupOf(id));
    for (const VelUIDesktopAction &action : wanted) {
        ids.append(action.getId());
        gone.erase(groupOf(action.getId()));
    }
    entry.removeGroups(gone);
    if (ids != known)
        entry.setList(Names::MainGroup, Names::Actions, ids);
    for (const VelUIDesktopAction &action : wanted) {
        if (canBeWritten(action.getId()))
            write(entry, action);
    }
}
