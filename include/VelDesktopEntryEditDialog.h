// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QDialog>
#include <QString>

#include <memory>

class VelDesktopEntryEditDialogPrivate;

/**
 * Edits one desktop entry: a ".desktop" file or the ".directory" file of a folder.
 *
 * The dialog shows every key of the entry in a VelDesktopEntryPropsWidget, checks the result
 * on Ok and saves it. What the user did not touch stays in the file byte for byte, in every
 * language; so does what another program changed in the file meanwhile.
 *
 * \code
 * VelDesktopEntryEditDialog dialog(parent);
 * if (dialog.setDesktopEntryPath(path))
 *     dialog.exec();
 * \endcode
 *
 * The size is remembered in the application's default QSettings, so the application needs an
 * organization name and an application name.
 *
 * For the GUI thread alone.
 *
 * \image html vel-entryedit.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT VelDesktopEntryEditDialog : public QDialog
{
    Q_OBJECT
    /// See setAssistance().
    Q_PROPERTY(bool assistance READ assistance WRITE setAssistance)

public:
    /**
     * Makes a dialog with an empty form and the size that the last one had.
     *
     * @param parent the window that the dialog belongs to; owns the dialog
     */
    explicit VelDesktopEntryEditDialog(QWidget *parent = nullptr);

    /// Remembers the size of the dialog.
    ~VelDesktopEntryEditDialog() override;

    /// Whether the dialog helps its users beyond the plain one; see setAssistance().
    bool assistance() const;
    /**
     * Switches on what goes beyond the plain dialog: what is wrong with the entry is said under its
     * rows, values are chosen from lists, every language of the entry is shown, everything is taken
     * back and done again, and the entry is tried and its file looked at before it is saved. Off, as
     * it is at first, the dialog has nothing of that. It is passed on to the menu that "Copy from..." opens,
     * and that menu is brought up to date with the applications that are installed before.
     *
     * @param assistance whether the dialog is to help
     */
    void setAssistance(bool assistance);

public Q_SLOTS:
    /**
     * Fills the form from a file and makes it the one that Ok saves.
     *
     * A new entry at a path that ends in "/.directory" is a Directory; one that ends in
     * ".desktop" is an Application, which the user may turn into a Link. The window title
     * names the file. A file without a group "Desktop Entry" is no entry, which a message box says;
     * it may become one.
     *
     * @param path the absolute path of the entry
     * @param create whether the file may be missing; without it a file that cannot be read
     *               is reported in a message box
     * @param pattern the path of an entry that gives the values of the keys which the entry
     *                lacks; empty for none. One that cannot be read is reported in a message
     *                box and has no other effect
     * @return false when the file could not be read and create is false: the form is as it was
     */
    bool setDesktopEntryPath(const QString &path, bool create = false, const QString &pattern = QString());

    /**
     * Sets the position that the entry gets on the desktop when it is saved.
     *
     * It is recorded when the file stands in the desktop folder; for a file in any other
     * folder a message box says that it cannot be.
     *
     * @param xx the horizontal position in pixels
     * @param yy the vertical position in pixels
     */
    void setDesktopEntryCoords(int xx, int yy);

    /**
     * Checks and saves the entry, then closes the dialog.
     *
     * An entry that cannot be used (an Application without a command, say) and one that
     * cannot be saved are reported in a message box, and the dialog stays open with the file
     * as it was. An entry that will not be shown in menus is saved after a notice.
     */
    void accept() override;

private Q_SLOTS:
    void copyFrom();
    void helpSlot();

private:
    Q_DISABLE_COPY(VelDesktopEntryEditDialog)
    const std::unique_ptr<VelDesktopEntryEditDialogPrivate> d;
};
