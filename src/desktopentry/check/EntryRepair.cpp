// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryRepair.h"

#include <QHash>

#include <algorithm>
#include <functional>

namespace {

// The way to one key of a record.
struct Access
{
    std::function<QVariant(const VelUIDesktopEntry &)> get;
    std::function<void(VelUIDesktopEntry *, const QVariant &)> set;
};

struct ActionAccess
{
    QString (VelUIDesktopAction::*get)() const;
    void (VelUIDesktopAction::*set)(const QString &);
};

template <typename Value, typename Get, typename Set>
Access access(Get get, Set set)
{
    return {[get](const VelUIDesktopEntry &entry) { return QVariant((entry.*get)()); },
            [set](VelUIDesktopEntry *entry, const QVariant &value) { (entry->*set)(value.value<Value>()); }};
}

#define VEL_TEXT(Key) \
    { \
        QStringLiteral(#Key), access<QString>(&VelUIDesktopEntry::get##Key, &VelUIDesktopEntry::set##Key) \
    }
#define VEL_FLAG(Key) \
    { \
        QStringLiteral(#Key), access<bool>(&VelUIDesktopEntry::get##Key, &VelUIDesktopEntry::set##Key) \
    }
#define VEL_LIST(Key) \
    { \
        QStringLiteral(#Key), \
            access<QStringList>(&VelUIDesktopEntry::get##Key, &VelUIDesktopEntry::set##Key) \
    }

const QHash<QString, Access> &keys()
{
    static const QHash<QString, Access> all = {
        VEL_TEXT(Version),  VEL_TEXT(Name),           VEL_TEXT(GenericName), VEL_TEXT(Comment),
        VEL_TEXT(Icon),     VEL_TEXT(Exec),           VEL_TEXT(TryExec),     VEL_TEXT(Path),
        VEL_TEXT(URL),      VEL_TEXT(StartupWMClass), VEL_FLAG(Terminal),    VEL_FLAG(NoDisplay),
        VEL_FLAG(Hidden),   VEL_FLAG(StartupNotify),  VEL_LIST(OnlyShowIn),  VEL_LIST(NotShowIn),
        VEL_LIST(MimeType), VEL_LIST(Categories),     VEL_LIST(Keywords),
    };
    return all;
}

const QHash<QString, ActionAccess> &actionKeys()
{
    using Action = VelUIDesktopAction;
    static const QHash<QString, ActionAccess> all = {
        {QStringLiteral("Name"), {&Action::getName, &Action::setName}},
        {QStringLiteral("Icon"), {&Action::getIcon, &Action::setIcon}},
        {QStringLiteral("Exec"), {&Action::getExec, &Action::setExec}},
    };
    return all;
}

#undef VEL_TEXT
#undef VEL_FLAG
#undef VEL_LIST

} // namespace

void EntryRepair::applyTo(VelUIDesktopEntry *entry) const
{
    if (!action.isEmpty()) {
        applyToAction(entry);
        return;
    }
    const auto found = keys().constFind(key);
    if (found != keys().constEnd())
        found->set(entry, value);
}

void EntryRepair::applyToAction(VelUIDesktopEntry *entry) const
{
    const auto found = actionKeys().constFind(key);
    if (found == actionKeys().constEnd())
        return;
    QList<VelUIDesktopAction> actions = entry->getActions();
    for (VelUIDesktopAction &one : actions) {
        if (one.getId() == action)
            (one.*found->set)(value.toString());
    }
    entry->setActions(actions);
}

bool EntryRepair::changes(const VelUIDesktopEntry &entry) const
{
    if (!action.isEmpty())
        return changesAction(entry);
    const auto found = keys().constFind(key);
    return found != keys().constEnd() && found->get(entry) != value;
}

bool EntryRepair::changesAction(const VelUIDesktopEntry &entry) const
{
    const auto found = actionKeys().constFind(key);
    if (found == actionKeys().constEnd())
        return false;
    const QList<VelUIDesktopAction> actions = entry.getActions();
    return std::any_of(actions.cbegin(), actions.cend(), [&](const VelUIDesktopAction &one) {
        return one.getId() == action && (one.*found->get)() != value.toString();
    });
}
