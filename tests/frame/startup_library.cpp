// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The library's start-up routine alone, on the directories that the build names.
#include "LibraryPlace.cpp"
#include "TranslationCatalog.cpp"
