// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Has nothing but the name of the library for the other major of Qt.
extern "C" __attribute__((visibility("default"))) int velOtherMajor()
{
    return 0;
}
