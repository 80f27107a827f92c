// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RebuildRecord.h"

#include "KeptThing.h"
#include "MenuReplacement.h"
#include "OnDisk.h"
#include "StepRecorder.h"

#include <QFileInfo>

namespace {

QString withoutLinks(const QString &directory)
{
    const QString canonical = QFileInfo(directory).canonicalFilePath();
    return canonical.isEmpty() ? directory : canonical;
}

} // namespace

// What the platform keeps beside a menu has the menu's name in front.
RebuildRecord::RebuildRecord(const QString &directory, StepRecorder &recorder)
    : m_recorder(recorder)
    , m_folder(withoutLinks(directory))
    , m_previous(m_folder + QStringLiteral(".previous"))
    , m_before(m_folder)
{
    recorder.mayMake(m_folder);
    recorder.mayWrite(m_folder + QStringLiteral(".sources"));
    if (m_before.exists() && OnDisk::exists(m_previous)) {
        m_older = KeptThing::inTrash(m_previous);
        if (!m_older)
            m_older = KeptThing::beside(m_previous);
    }
}

RebuildRecord::~RebuildRecord() = default;

void RebuildRecord::finish()
{
    FileProgress nobody;
    if (m_before.exists() && m_before.isAt(m_previous))
        m_recorder.changed(std::make_unique<MenuReplacement>(m_folder, m_previous, std::move(m_older)));
    else if (m_older && !OnDisk::exists(m_previous))
        m_older->bringBack(m_previous, nobody);
}
