// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// load_libraries LIBRARY...
//
// Loads one library after the other into one process, and says so when all are there.

#include <dlfcn.h>

#include <cstdio>

int main(int argc, char **argv)
{
    for (int i = 1; i < argc; ++i) {
        if (!dlopen(argv[i], RTLD_NOW)) {
            std::fprintf(stderr, "%s\n", dlerror());
            return 2;
        }
    }
    std::puts("all are loaded");
    return 0;
}
