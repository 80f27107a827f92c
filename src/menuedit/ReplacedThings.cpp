// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ReplacedThings.h"

#include "FreeName.h"
#include "KeptThing.h"
#include "OnDisk.h"

#include <QDir>
#include <QFileInfo>

#include <utility>

namespace {

QString pathBeside(const QString &path, bool isFolder)
{
    const QDir folder = QFileInfo(path).dir();
    const auto isTaken = [&folder](const QString &name) { return OnDisk::exists(folder.filePath(name)); };
    return folder.filePath(FreeName::like(
        QFileInfo(path).fileName(), isFolder ? FreeName::Kind::Folder : FreeName::Kind::Entry, isTaken));
}

} // namespace

ReplacedThings::ReplacedThings() = default;

ReplacedThings::~ReplacedThings()
{
    FileProgress nobody;
    for (auto thing = m_things.rbegin(); thing != m_things.rend(); ++thing) {
        // Whatever came to its place meanwhile, what is kept beside would go.
        if (thing->kept->bringBack(thing->path, nobody))
            thing->kept->bringBack(pathBeside(thing->path, thing->kept->state().isFolder()), nobody);
    }
}

bool ReplacedThings::putAway(const QString &path)
{
    std::unique_ptr<KeptThing> kept = KeptThing::inTrash(path);
    if (!kept)
        kept = KeptThing::beside(path);
    if (!kept)
        return false;
    m_things.push_back({path, std::move(kept)});
    return true;
}

std::vector<ReplacedThings::Thing> ReplacedThings::take()
{
    return std::exchange(m_things, {});
}
