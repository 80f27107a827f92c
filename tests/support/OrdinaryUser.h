// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QString>

/**
 * Gives up the rights of the superuser while it lives, for what this process does and for the
 * programs that it starts; does nothing for whoever has none.
 *
 * A folder of the test is handed over with everything in it, so that the ordinary user finds there
 * what the tester would find in a folder of their own. Programs get their runtime directory there.
 */
class OrdinaryUser
{
public:
    /// Hands \a folder over and becomes an ordinary user; fails the test function when it cannot.
    explicit OrdinaryUser(const QString &folder);
    ~OrdinaryUser();
    Q_DISABLE_COPY_MOVE(OrdinaryUser)

private:
    const bool m_wasSuperuser;
    const QByteArray m_runtimeDir;
};
