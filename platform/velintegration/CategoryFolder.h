// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

#include <filesystem>
#include <string>

/**
 * The folder of a main category in a menu that an update follows. It comes and goes in one step: at no
 * moment is there one without its record, or a record without its folder.
 */
class CategoryFolder
{
public:
    /// @param name of a main category
    CategoryFolder(const std::filesystem::path &menu, const std::string &name);

    /// Whether there is a folder, or a link to one.
    bool exists() const;

    /// Makes the folder with its record in it.
    bool make(const QStringList &order) const;

    /// A digest of its record without the order of its children; empty when there is no record.
    std::string digest() const;
    /// What the digest of a new folder is.
    std::string newDigest() const;

    /// Removes a folder that has that digest and nothing in it but its record.
    bool removeIfEmpty(const std::string &digest) const;

    /// Ends what killed updates left in a menu that nobody else is changing.
    static void removeLeftovers(const std::filesystem::path &menu);

private:
    static bool hasRecordOnly(const std::filesystem::path &folder);
    static void removeLeftover(const std::filesystem::path &menu, const std::filesystem::path &leftover);

    std::filesystem::path m_menu;
    std::filesystem::path m_path;
    std::string m_name;
};
