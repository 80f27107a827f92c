// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// One application is of Qt 5 or of Qt 6, and nothing of the library for the other one would work there.
// A process that has both libraries ends before anything was done with either.

#include <QtGlobal>

#include <dlfcn.h>

namespace {

bool isLoaded(const char *library)
{
    void *const handle = dlopen(library, RTLD_LAZY | RTLD_NOLOAD);
    if (handle)
        dlclose(handle);
    return handle;
}

[[maybe_unused]] const bool isAlone = [] {
    if (isLoaded(VEL_OTHER_LIBRARY))
        qFatal("%s and %s cannot be in one process: the one is for Qt 5, the other for Qt 6.",
               VEL_THIS_LIBRARY, VEL_OTHER_LIBRARY);
    return true;
}();

} // namespace
