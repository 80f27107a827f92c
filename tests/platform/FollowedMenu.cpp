// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FollowedMenu.h"

#include <algorithm>

void FollowedMenu::update()
{
    if (installed.isEmpty())
        return;
    QSet<QString> emptied;
    const Files before = files;
    for (const QString &name : m_made.keys())
        follow(name, &emptied);
    for (const QString &name : installed.keys()) {
        if (!m_made.contains(name))
            add(name);
    }
    for (const QString &folder : qAsConst(emptied)) {
        const bool isEmpty = std::none_of(files.keyBegin(), files.keyEnd(), [&folder](const QString &path) {
            return path.startsWith(folder + QLatin1Char('/'));
        });
        if (isEmpty && !editedFolders.contains(folder))
            folders.remove(folder);
    }
}

void FollowedMenu::removeFolder(const QString &folder)
{
    for (const QString &path : files.keys()) {
        if (path.startsWith(folder + QLatin1Char('/')))
            files.remove(path);
    }
    folders.remove(folder);
    editedFolders.remove(folder);
}

QStringList FollowedMenu::untouchedIn(const QString &folder) const
{
    QStringList names;
    for (const Made &made : m_made) {
        if (isUntouched(made) && folderOf(made.path) == folder)
            names.append(made.path.section(QLatin1Char('/'), 1));
    }
    return names;
}

bool FollowedMenu::isUntouched(const Made &made) const
{
    return files.contains(made.path) && files.value(made.path) == made.bytes;
}

// A name that somebody's entry has or had is none that another one gets, and none that gets free only now.
QString FollowedMenu::freePath(const QString &name, const QString &category) const
{
    const auto isFree = [this](const QString &path) {
        return !files.contains(path) && std::none_of(m_made.begin(), m_made.end(), [&path](const Made &made) {
            return made.path == path;
        });
    };
    QString path = category + QLatin1Char('/') + name;
    for (int i = 2; !isFree(path); ++i)
        path = QStringLiteral("%1/%2-%3.desktop").arg(category, name.chopped(8)).arg(i);
    return path;
}

void FollowedMenu::follow(const QString &name, QSet<QString> *emptied)
{
    Made &made = m_made[name];
    const bool isInstalled = installed.contains(name);
    if (isInstalled && files.value(made.path) == installed.value(name).bytes)
        made.bytes = installed.value(name).bytes;
    if (!isUntouched(made))
        return;
    const Application application = installed.value(name);
    if (isInstalled && application.category == folderOf(made.path)) {
        made.bytes = application.bytes;
        files[made.path] = application.bytes;
        return;
    }
    const QString old = made.path;
    emptied->insert(folderOf(old));
    if (isInstalled) {
        made = {freePath(name, application.category), application.bytes};
        files[made.path] = made.bytes;
        folders.insert(application.category);
    } else {
        m_made.remove(name);
    }
    files.remove(old);
}

void FollowedMenu::add(const QString &name)
{
    const Application application = installed.value(name);
    QString path = application.category + QLatin1Char('/') + name;
    const bool isReserved =
        std::any_of(m_made.begin(), m_made.end(), [&path](const Made &made) { return made.path == path; });
    if (isReserved || files.value(path) != application.bytes)
        path = freePath(name, application.category);
    m_made[name] = {path, application.bytes};
    files[path] = application.bytes;
    folders.insert(application.category);
}
