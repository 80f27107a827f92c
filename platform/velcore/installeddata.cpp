// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/dirs.h>

#include <cstdlib>

#include <dlfcn.h>
#include <sys/auxv.h>
#include <sys/stat.h>

namespace {

const char ofThisLibrary = 0;

// The path with all links followed; empty when there is no such file.
std::string resolved(const std::string &path)
{
    char *const absolute = realpath(path.c_str(), nullptr);
    const std::string result = absolute ? absolute : "";
    std::free(absolute);
    return result;
}

// The folder that VEL_..._DATA_FROM_... leads to from the file that this code is in. The name that the
// linker has for a program is but what it was called by.
std::string besideThisFile()
{
    Dl_info own;
    Dl_info program;
    if (!dladdr(&ofThisLibrary, &own))
        return {};
    const auto *programHeaders = reinterpret_cast<const void *>(getauxval(AT_PHDR));
    const bool isProgram = dladdr(programHeaders, &program) && program.dli_fbase == own.dli_fbase;
    const std::string file = resolved(isProgram ? "/proc/self/exe" : own.dli_fname);
    const char *const relative = isProgram ? VEL_DATA_FROM_PROGRAM : VEL_DATA_FROM_LIBRARY;
    return file.empty() ? std::string() : resolved(file.substr(0, file.rfind('/') + 1) + relative);
}

bool isFolder(const std::string &path)
{
    struct stat status = {};
    return stat(path.c_str(), &status) == 0 && S_ISDIR(status.st_mode);
}

// A folder without pictures is that of a build tree, say.
std::string findInstalledData()
{
    const std::string beside = besideThisFile();
    return !beside.empty() && isFolder(beside + "/pixmaps") ? beside : VEL_INSTALLED_DATA_DIR;
}

} // namespace

std::string velInstalledDataDir()
{
    static const std::string folder = findInstalledData();
    return folder;
}
