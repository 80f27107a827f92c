// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ChoiceSource.h"

#include <frame/FolderListing.h>

#include <QCoreApplication>
#include <QSet>
#include <QStringList>

#include <optional>

namespace VelUI {

/// The programs in the folders of PATH, by name; one in an earlier folder hides later ones.
class ProgramSource : public ChoiceSource
{
    Q_DECLARE_TR_FUNCTIONS(VelUI::ProgramSource)

public:
    ProgramSource();

    static QStringList headers();

    bool read(ChoiceModel *model) override;

private:
    bool openNextFolder();

    QStringList m_folders; // that are to be read
    std::optional<FolderListing> m_files;
    QSet<QString> m_names; // that were read
};

} // namespace VelUI
