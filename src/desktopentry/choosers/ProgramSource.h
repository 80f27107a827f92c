// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ChoiceSource.h"

#include <QCoreApplication>
#include <QDirIterator>
#include <QSet>
#include <QStringList>

#include <memory>

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
    std::unique_ptr<QDirIterator> m_files;
    QSet<QString> m_names; // that were read
};

} // namespace VelUI
