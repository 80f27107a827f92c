// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Where a library finds what is installed with it, for a test that installs it in many places.
#include "LibraryPlace.cpp"

#ifdef VELUIEXTRA_STATIC_DEFINE
// Linked into a program, the library has its catalogs there.
int qInitResources_veluiextra_catalogs()
{
    return 0;
}
#endif

extern "C" {

Q_DECL_EXPORT void placeOfProgram(const QString *name, QString *found)
{
    *found = LibraryPlace::program(*name);
}

Q_DECL_EXPORT void placeOfIcons(QString *found)
{
    *found = LibraryPlace::icons();
}

Q_DECL_EXPORT void placeOfCatalogs(QString *found)
{
    *found = LibraryPlace::catalogs();
}

} // extern "C"
