// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPages.h"

// Each stands in the source file of its name; those of desktop entries share one.
GalleryPage desktopEntryFieldsPage();
GalleryPage desktopEntryFormPage();
GalleryPage radioGroupBoxPage();
GalleryPage settingsPage();
GalleryPage shortcutsPage();

QVector<GalleryPage> galleryPages()
{
    return {
        radioGroupBoxPage(),
        settingsPage(),
        desktopEntryFormPage(),
        desktopEntryFieldsPage(),
        shortcutsPage(),
    };
}
