// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QTemporaryDir>

namespace VelTest {

/**
 * A home of its own for a test program: HOME, the XDG directories and TMPDIR lie in a
 * temporary folder that goes with this object, and no setting of the user's is seen.
 *
 * Made before the application object; the VEL_TEST_MAIN macros do that.
 */
class TestEnvironment
{
public:
    TestEnvironment();
    ~TestEnvironment();

    /// The environment of the running test program.
    static TestEnvironment &instance();

    /// The folder that everything lies in, without links in its path.
    QString root() const;
    /// The private home folder.
    QString home() const;

private:
    QTemporaryDir m_root;
    static TestEnvironment *s_instance;
};

} // namespace VelTest
