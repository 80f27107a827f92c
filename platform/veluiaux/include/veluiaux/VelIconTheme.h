// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/veluiaux_export.h>

#include <string>

/**
 * The icon theme in use, and the names of the icons that stand for things in it.
 *
 * For the GUI thread alone.
 *
 * \since 1.0
 */
class VELUIAUX_EXPORT VelIconTheme
{
public:
    /// Whether the theme is read anew from disk.
    enum ForceLoad {
        NoForceLoad = 0, ///< what is known of the theme may be used
        DoForceLoad = 1 ///< icons are looked up again, as after a change of the theme's files
    };

    VelIconTheme(const VelIconTheme &) = delete;
    VelIconTheme &operator=(const VelIconTheme &) = delete;

    /**
     * The current icon theme.
     *
     * With DoForceLoad the theme's search paths of this moment stay the search paths of the
     * process. GUI thread only.
     *
     * @param force whether icons have to be looked up again
     * @return a reference that stays good for the life of the process
     */
    static VelIconTheme &current(ForceLoad force);

    /**
     * The name of the icon for what a URL points to.
     *
     * A local file or folder, given as a file URL or as an absolute path, has the icon of its
     * MIME type. The other names are "text-html" for http and https, "mail-message-new" for
     * mailto, and "unknown" for all else, files that do not exist among them.
     *
     * @param url the URL in the encoding of the locale; null is taken as empty
     * @param mimeType where to put the MIME type, or null
     * @return the name, in UTF-8, to be looked up in the theme
     */
    std::string getURLIconName(const char *url, std::string *mimeType);

    /// Which files getIconFile() may give.
    enum IconFileKinds {
        AllIconFiles, ///< drawings (SVG) as well
        PictureFiles ///< PNG and XPM pictures alone
    };

    /**
     * The file from which an icon is painted, for programs that want files and not pixmaps.
     *
     * Finds what Qt would paint in the current theme. No application object is needed; then
     * QIcon has to be told the theme and its search paths first.
     *
     * @param name a name in the icon theme, such a name with the suffix of an image file
     *             ("editor.png"), or the absolute path of a file; in UTF-8
     * @param size the edge of the icon in pixels
     * @param kinds which files may be taken
     * @return the absolute path in UTF-8; empty where there is no such file
     */
    std::string getIconFile(const std::string &name, int size, IconFileKinds kinds) const;

private:
    VelIconTheme() = default;
    ~VelIconTheme() = default;
};
