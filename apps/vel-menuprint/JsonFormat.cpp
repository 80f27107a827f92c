// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFormat.h"

#include "MenuTree.h"
#include "OpenCommand.h"

#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace {

// What an item does not tell stands for nothing: it is left out.
class Members
{
public:
    explicit Members(const QJsonObject &object)
        : m_object(object)
    {
    }

    void add(const char *name, const QString &text)
    {
        if (!text.isEmpty())
            m_object.insert(QLatin1String(name), text);
    }
    void add(const char *name, const QStringList &list)
    {
        if (!list.isEmpty())
            m_object.insert(QLatin1String(name), QJsonArray::fromStringList(list));
    }
    void add(const char *name, bool flag)
    {
        if (flag)
            m_object.insert(QLatin1String(name), true);
    }
    void add(const char *name, const QJsonArray &array)
    {
        if (!array.isEmpty())
            m_object.insert(QLatin1String(name), array);
    }

    const QJsonObject &object() const { return m_object; }

private:
    QJsonObject m_object;
};

QJsonArray actionsOf(const MenuItemDetails &details)
{
    QJsonArray actions;
    for (const MenuItemAction &action : details.actions) {
        Members members({{QStringLiteral("id"), action.id}, {QStringLiteral("name"), action.name}});
        members.add("icon", action.icon);
        members.add("iconFile", action.iconFile);
        members.add("exec", action.exec);
        actions.append(members.object());
    }
    return actions;
}

void addDetails(Members *members, const MenuItemDetails &details)
{
    members->add("genericName", details.genericName);
    members->add("comment", details.comment);
    members->add("keywords", details.keywords);
    members->add("categories", details.categories);
    members->add("mimeTypes", details.mimeTypes);
    members->add("tryExec", details.tryExec);
    members->add("workingDirectory", details.workingDirectory);
    members->add("terminal", details.terminal);
    members->add("startupNotify", details.startupNotify);
    members->add("startupWMClass", details.startupWMClass);
    members->add("url", details.url);
    members->add("actions", actionsOf(details));
}

QJsonObject objectOf(const MenuItem &item)
{
    static const QString kinds[] = {QStringLiteral("folder"), QStringLiteral("entry"),
                                    QStringLiteral("separator"), QStringLiteral("file")};
    Members members({{QStringLiteral("kind"), kinds[item.kind]},
                     {QStringLiteral("name"), item.name},
                     {QStringLiteral("path"), item.path}});
    if (item.kind == MenuItem::Entry)
        members.add("id", QFileInfo(item.path).fileName());
    members.add("icon", item.icon);
    members.add("iconFile", item.iconFile);
    members.add("exec", item.exec);
    if (item.kind == MenuItem::Entry || item.kind == MenuItem::File)
        members.add("command", OpenCommand::of(item.path));
    members.add("unlisted", !item.isListed);
    members.add("whyUnlisted", item.whyUnlisted);
    addDetails(&members, item.details);
    QJsonObject object = members.object();
    if (item.kind == MenuItem::Folder) {
        QJsonArray children;
        for (const MenuItem &child : item.children)
            children.append(objectOf(child));
        object.insert(QStringLiteral("children"), children);
    }
    return object;
}

} // namespace

QByteArray MenuFormat::json(const MenuItem &menu)
{
    return QJsonDocument(objectOf(menu)).toJson();
}
