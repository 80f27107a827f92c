// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

#include <sys/stat.h>

#include <memory>
#include <optional>

/**
 * What a file allows to whom, and the attributes that users attached to it: for the file that is
 * to take its place.
 *
 * Nobody may do more with the new file than with the old one. Owner, group, permissions, access
 * list and user attributes are the old ones where this process may give them; where group or
 * access list are not, group and others may do what everybody but the owner could.
 */
class FileRights
{
public:
    /// The rights of the file at \a path, whose status is \a status.
    FileRights(QByteArray path, const struct stat &status);

    /// The permissions for the new file as long as it has not got these rights.
    mode_t firstBits() const;

    /// Gives the rights to an open file; false if it may not be used in the old one's place.
    bool giveTo(int file) const;

private:
    struct AccessList;

    void look();
    void readAccessList(int file);
    mode_t leastBits() const;
    bool giveAccessList(int file) const;
    void giveAttributes(int file) const;

    QByteArray m_path;
    struct stat m_status;
    bool m_hasAccessList = false;
    bool m_hasAttributes = false;
    std::shared_ptr<AccessList> m_accessList; ///< null when there is none or it could not be read
};
