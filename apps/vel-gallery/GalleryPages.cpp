// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPages.h"

// Each stands in the source file of its name; those of desktop entries and of menus share one.
GalleryPage desktopEntryFieldsPage();
GalleryPage desktopEntryFormPage();
GalleryPage fileIconsPage();
GalleryPage keyNamesPage();
GalleryPage menuDialogsPage();
GalleryPage menuViewPage();
GalleryPage radioGroupBoxPage();
GalleryPage settingsPage();
GalleryPage shortcutsPage();

QVector<GalleryPage> galleryPages()
{
    return {
        menuViewPage(),           menuDialogsPage(), desktopEntryFormPage(),
        desktopEntryFieldsPage(), shortcutsPage(),   keyNamesPage(),
        radioGroupBoxPage(),      settingsPage(),    fileIconsPage(),
    };
}
