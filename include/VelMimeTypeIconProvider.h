// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QFileIconProvider>
#include <QIcon>
#include <QMap>
#include <QString>

class VelUIDesktopEntry;

/**
 * Gives files and folders the desktop's own icons.
 *
 * Files get the theme's icon of their MIME type, desktop entries the icon that they name,
 * folders the one that their ".directory" file names, and separators of a menu a drawn rule.
 * A symbolic link carries an emblem at the bottom left; what does not exist carries one at the
 * top right.
 *
 * For use with QFileSystemModel::setIconProvider(), or by itself:
 * \code
 * VelMimeTypeIconProvider provider;
 * label->setPixmap(provider.icon(QFileInfo(path)).pixmap(32));
 * \endcode
 *
 * Every call looks at the file as it is now, so an icon is never older than its file. The
 * icons returned look up the theme when they are painted. For the GUI thread alone.
 *
 * \image html gallery-file-icons.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT VelMimeTypeIconProvider : public QFileIconProvider
{
public:
    /// Reads the built-in pixmaps of a folder and a file from the desktop's standard directory;
    /// where they are missing, the icons that fall back on them are null.
    VelMimeTypeIconProvider();
    ~VelMimeTypeIconProvider() override;

    /**
     * The theme's icon for a kind of place; the trash is asked whether it is empty.
     *
     * @param type the kind; what is not known gets the icon of an unknown file
     * @return the icon, that of QFileIconProvider where the theme has none
     */
    QIcon icon(IconType type) const override;

    /**
     * The icon of a file or folder.
     *
     * @param info tells the path and its kind, as far as it has remembered them
     * @return the icon; null when neither the theme nor the built-in pixmaps have one
     */
    QIcon icon(const QFileInfo &info) const override;

    /**
     * The name of the MIME type of a file or folder, "text/plain" for instance.
     *
     * @param info the file or folder; its contents are read where the name is not decisive
     * @return what QMimeDatabase().mimeTypeForFile(info).name() gives
     */
    QString type(const QFileInfo &info) const override;

protected:
    /// The names of the emblems to overlay an icon with.
    using Emblems = QMap<Qt::Corner, QString>;

    /**
     * The icon of a desktop entry that was read already, for providers that need more of it
     * than its icon and would read it twice.
     *
     * @param entry the record of a file whose name ends in ".desktop"
     * @param emblems overlaid on every icon but that of a separator
     * @return the same as icon() for that file
     */
    QIcon desktopEntryIcon(const VelUIDesktopEntry &entry, const Emblems &emblems) const;

    /**
     * The name of the MIME type of a file that the caller has just looked at.
     *
     * @param info a regular file, or a link to one
     * @return the same as type() for that file
     */
    QString regularFileType(const QFileInfo &info) const;

private:
    Q_DISABLE_COPY(VelMimeTypeIconProvider)

    QIcon directoryIcon(const QFileInfo &info, const Emblems &emblems) const;
    QIcon regularFileIcon(const QFileInfo &info, const Emblems &emblems) const;

    QIcon folderIcon;
    QIcon fileIcon;
    QIcon separatorIcon;
};
