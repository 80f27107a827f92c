// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileChange.h"
#include "TreeState.h"

#include <memory>

class KeptThing;

/**
 * A folder that was built anew, where the one before it stays beside it under another name, in place of an
 * older one that was kept so.
 */
class MenuReplacement : public FileChange
{
public:
    /// \a folder is new and what it was is at \a previous by now; what was there before is \a older, null for
    /// nothing.
    MenuReplacement(const QString &folder, const QString &previous, std::unique_ptr<KeptThing> older);
    ~MenuReplacement() override;

    QStringList paths() const override { return {m_folder, m_previous}; }
    void note() override;
    Refusal check() const override;
    // Nothing of it takes long: all of it lies in one folder or in the trash.
    Refusal undo(FileProgress &progress) override;
    Refusal redo(FileProgress &progress) override;

private:
    std::error_code exchange() const;
    bool putBack(std::unique_ptr<KeptThing> &kept);

    const QString m_folder;
    const QString m_previous;
    std::unique_ptr<KeptThing> m_older; // kept while the folder is the new one
    std::unique_ptr<KeptThing> m_newer; // kept while the folder is the old one
    bool m_isReplaced = true;
    TreeState m_stateOfFolder;
    TreeState m_stateOfPrevious;
};
