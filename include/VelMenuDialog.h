// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QDialog>
#include <QItemSelection>
#include <QString>
#include <QStringList>

#include <memory>

class VelMenuDialogPrivate;

/**
 * A dialog around a VelMenuView, to pick an entry of a menu or to edit the menu.
 *
 * As a picker it has Ok and Cancel, and Ok is enabled while a desktop entry is selected; the
 * caller then asks for selectedItemPath() or selectedItemExec(). As an editor it has a tool
 * bar, and usually only a Close button, which accepts the dialog.
 *
 * Return, Enter and a double click on an entry pick it, or edit it in an editor, which they never
 * close; Return and Enter on a folder open or close it.
 *
 * The dialog remembers its size in the application's default QSettings, and is cut to the screen
 * when it is shown. When it is destroyed
 * it tells the window manager to read the menu again, if its directory is the start menu, the
 * desktop folder or the tool bar; a message box appears when nobody takes the command, see updateWM().
 *
 * \code
 * VelMenuDialog dialog(QString(), 22, false, false, this);
 * if (dialog.exec() == QDialog::Accepted)
 *     run(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr));
 * \endcode
 *
 * For the GUI thread alone.
 *
 * \image html vel-menuedit.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT VelMenuDialog : public QDialog
{
    Q_OBJECT
    /// See setAssistance().
    Q_PROPERTY(bool assistance READ assistance WRITE setAssistance)

public:
    /**
     * Builds a dialog over a menu directory.
     *
     * @param dir the directory; empty for the start menu. The window manager is told of the
     *        standard directories only, which have no trailing "/"
     * @param iconSize the edge of the item icons in pixels; -1 leaves it to the style
     * @param editable whether the user can change the menu; also shows the tool bar
     * @param closeOnly whether there is a Close button instead of Ok and Cancel
     * @param parent the widget that owns the dialog, or null
     * @param f window flags
     */
    VelMenuDialog(const QString &dir, int iconSize, bool editable, bool closeOnly, QWidget *parent = nullptr,
                  Qt::WindowFlags f = Qt::WindowFlags());

    /**
     * Builds a picker over the start menu.
     *
     * @param parent the widget that owns the dialog, or null
     */
    explicit VelMenuDialog(QWidget *parent = nullptr);

    /// Remembers the size and, with assistance(), which folders are open, and tells the window manager; see
    /// updateWM().
    ~VelMenuDialog() override;

    /// The menu directory shown.
    QString menuDir() const;

    /// Whether the dialog helps its users beyond the plain one; see setAssistance().
    bool assistance() const;

    /**
     * Switches on what helps users beyond the plain dialog, in its view too
     * (VelMenuView::setAssistance()). The folders that were open in the menu directory when a dialog with
     * assistance was destroyed last are opened again, a few at a time; not those behind links that lead
     * out of it, and no more than 200 with 5,000 items. Off, as it is at first, the dialog has nothing of
     * that.
     *
     * @param assistance whether the dialog is to help
     */
    void setAssistance(bool assistance);

    /// The path of the first selected item; empty when nothing is selected.
    QString selectedItemPath() const;

    /**
     * The command line of the selected entry.
     *
     * @param filePath the file that the command is to open; may be empty
     * @param url the URL that the command is to open; may be empty
     * @param filePathList the files that the command is to open; null for none
     * @param urlList the URLs that the command is to open; null for none
     * @return the command line for a shell; for a function of the window manager the call of
     *         "vel-wmfunc", ending in a line feed; empty when nothing is selected
     */
    QString selectedItemExec(const QString &filePath, const QString &url, const QStringList *filePathList,
                             const QStringList *urlList) const;

    /**
     * Tells the window manager to read the menu of this dialog again.
     *
     * A message box appears when the command does not arrive; with assistance() not where there is no
     * window manager that takes commands, as nobody shows the menu then.
     *
     * @return whether the command arrived; false, without a message, for a directory that the
     *         window manager does not know
     */
    bool updateWM();

public Q_SLOTS:
    /**
     * Enables Ok when a desktop entry is among what was selected first.
     *
     * @param selected what is selected now and was not before
     * @param deselected not looked at
     */
    void selChanged(QItemSelection selected, QItemSelection deselected);
    /// Enables the Apply button, where there is one.
    void changed();
    /// Tells the window manager and disables the Apply button, where there is one.
    void applySlot();
    /// Opens the help.
    void helpSlot();

private:
    const std::unique_ptr<VelMenuDialogPrivate> d;
};
