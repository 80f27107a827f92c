// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * What an operation of the user did, in words.
 */
class StepText
{
public:
    enum class Kind {
        Create, ///< the item
        Edit, ///< the item
        Delete, ///< the item
        DeleteFolder, ///< the item, with so many entries
        DeleteItems, ///< so many
        DeleteFolders, ///< so many, which the item says as a number, with so many entries
        Move, ///< the item into the folder
        MoveItems, ///< so many into the folder
        Copy, ///< the item into the folder
        CopyItems, ///< so many into the folder
        Reorder, ///< the item
        ReorderItems, ///< so many
        Rebuild, ///< the default menu
        Hide, ///< the item
        HideItems, ///< so many
        ShowAgain, ///< the item
        ShowItemsAgain, ///< so many
        Sort, ///< the folder
        Duplicate, ///< the item
        DuplicateItems, ///< so many
    };

    /// \a item and \a folder are shown names.
    explicit StepText(Kind kind, const QString &item = QString(), int count = 0,
                      const QString &folder = QString());

    /// What the command to take it back is called.
    QString undo() const;
    /// What the command to do it again is called.
    QString redo() const;
    /// A sentence that tells that it was done.
    QString done() const;

private:
    QString filledIn(const char *text) const;

    Kind m_kind;
    QString m_item;
    int m_count;
    QString m_folder;
};
