// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryKeys.h"

#include <QHash>

namespace EntryKeys {

namespace {

struct Row
{
    const char *name;
    ValueType type;
    const char *onlyFor = "";
    bool isDeprecated = false;
};

constexpr Row Rows[] = {
    {"Type", ValueType::Text},
    {"Version", ValueType::Text},
    {"Name", ValueType::TranslatableText},
    {"GenericName", ValueType::TranslatableText},
    {"NoDisplay", ValueType::Flag},
    {"Comment", ValueType::TranslatableText},
    {"Icon", ValueType::TranslatableText},
    {"Hidden", ValueType::Flag},
    {"OnlyShowIn", ValueType::List},
    {"NotShowIn", ValueType::List},
    {"DBusActivatable", ValueType::Flag},
    {"TryExec", ValueType::Text, "Application"},
    {"Exec", ValueType::Text, "Application"},
    {"Path", ValueType::Text, "Application"},
    {"Terminal", ValueType::Flag, "Application"},
    {"Actions", ValueType::List, "Application"},
    {"MimeType", ValueType::List, "Application"},
    {"Categories", ValueType::List, "Application"},
    {"Implements", ValueType::List},
    {"Keywords", ValueType::TranslatableList},
    {"StartupNotify", ValueType::Flag, "Application"},
    {"StartupWMClass", ValueType::Text, "Application"},
    {"URL", ValueType::Text, "Link"},
    {"PrefersNonDefaultGPU", ValueType::Flag},
    {"SingleMainWindow", ValueType::Flag},
    // Of the autostart standard.
    {"AutostartCondition", ValueType::Text, "Application"},
    // Reserved for one desktop.
    {"ServiceTypes", ValueType::Text},
    {"DocPath", ValueType::Text},
    {"InitialPreference", ValueType::Text},
    {"Dev", ValueType::Text, "FSDevice"},
    {"FSType", ValueType::Text, "FSDevice"},
    {"MountPoint", ValueType::Text, "FSDevice"},
    {"ReadOnly", ValueType::Flag, "FSDevice"},
    {"UnmountIcon", ValueType::Text, "FSDevice"},
    // Of older versions. A menu folder still has its order in SortOrder.
    {"SortOrder", ValueType::List},
    {"Encoding", ValueType::Text, "", true},
    {"Patterns", ValueType::List, "MimeType", true},
    {"DefaultApp", ValueType::Text, "MimeType", true},
    {"MiniIcon", ValueType::Text, "", true},
    {"Protocols", ValueType::Text, "", true},
    {"Extensions", ValueType::Text, "", true},
    {"BinaryPattern", ValueType::Text, "", true},
    {"MapNotify", ValueType::Text, "", true},
    {"FilePattern", ValueType::List, "", true},
    {"SwallowTitle", ValueType::TranslatableText, "", true},
    {"SwallowExec", ValueType::Text, "", true},
    {"TerminalOptions", ValueType::Text, "", true},
};

QHash<QByteArray, Key> table()
{
    QHash<QByteArray, Key> keys;
    for (const Row &row : Rows)
        keys.insert(row.name, {row.name, row.type, row.onlyFor, row.isDeprecated});
    return keys;
}

} // namespace

const Key *find(const QByteArray &name)
{
    static const QHash<QByteArray, Key> keys = table();
    const auto found = keys.constFind(name);
    return found == keys.constEnd() ? nullptr : &*found;
}

bool isForActions(const QByteArray &name)
{
    return name == "Name" || name == "Icon" || name == "Exec" || name == "OnlyShowIn" || name == "NotShowIn";
}

bool isExtension(const QByteArray &name)
{
    return name.startsWith("X-");
}

} // namespace EntryKeys
