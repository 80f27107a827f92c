// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelTrash.h>

#include <velcore/home.h>

#include <filesystem>
#include <system_error>

bool VelTrash::isEmpty()
{
    // Hidden files and dangling links can be thrown away too, and names that are no text.
    namespace fs = std::filesystem;
    std::error_code error;
    return fs::directory_iterator(Vel::dataHome() + "/Trash/files", error) == fs::directory_iterator();
}
