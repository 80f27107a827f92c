// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QList>
#include <QModelIndex>
#include <QString>
#include <QTreeView>
#include <QUrl>

#include <memory>

class QAction;
class QMimeData;
class VelMenuViewPrivate;

/**
 * A tree of a menu directory: the start menu, the tool bar, the desktop folder or any other
 * folder of desktop entries.
 *
 * Folders and entries are shown under the names and in the order that the desktop's own menu
 * gives them. A view made for editing offers a context menu, shortcuts, drag and drop and the
 * clipboard to create, edit, delete, move and run entries, and writes every change to disk at
 * once; a view that is not made for editing is a read-only browser to select from.
 *
 * The edit actions are also the view's own actions(), for hosts that show them in a tool bar.
 * Their object names are "dirNewAction", "fileNewAction", "editAction", "deleteAction",
 * "executeAction", "findAction", "findNextAction", "cutAction", "copyAction", "pasteAction",
 * "recreateAction" (only in a view of the start menu), "upAction" and "downAction".
 *
 * Indices that the operations take and return belong to the file-system model under the
 * sorting model, unless said otherwise.
 *
 * A menu directory that does not exist gives an empty tree until it appears; looking creates
 * nothing.
 *
 * For the GUI thread alone.
 *
 * \image html gallery-menu-view.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT VelMenuView : public QTreeView
{
    Q_OBJECT
    /// See setAssistance().
    Q_PROPERTY(bool assistance READ assistance WRITE setAssistance)
    /// The menu directory; empty, when it is set, for the start menu. See setMenuDir().
    Q_PROPERTY(QString menuDir READ menuDir WRITE setMenuDir)
    /// The edge of the item icons in pixels, -1 while the style decides. See setItemIconSize().
    Q_PROPERTY(int itemIconSize READ itemIconSize WRITE setItemIconSize)
    /// Whether the user can change the menu. See setEditable().
    Q_PROPERTY(bool editable READ isEditable WRITE setEditable)

public:
    /**
     * Builds a read-only view of the start menu with icons of the style's size.
     *
     * @param parent the widget that owns the view, or null
     */
    explicit VelMenuView(QWidget *parent = nullptr);

    /**
     * Builds a view of a menu directory.
     *
     * @param menuDir the directory; empty for the start menu
     * @param iconSize the edge of the item icons in pixels; -1 leaves it to the style
     * @param editable whether the user can change the menu
     * @param parent the widget that owns the view, or null
     */
    VelMenuView(const QString &menuDir, int iconSize, bool editable, QWidget *parent = nullptr);

    /// Takes the models and the menu along. A program that was started from the view lives on.
    ~VelMenuView() override;

    /**
     * Shows a menu directory; the constructors end here.
     *
     * A second call starts afresh on another directory: models, actions and find state are
     * replaced, connections to the former selection model end.
     *
     * @param menuDir the directory; empty for the start menu
     * @param iconSize the edge of the item icons in pixels; -1 leaves it to the style
     * @param editable whether the user can change the menu
     * @param parent the widget that the view belongs to; null leaves it where it is
     */
    void init(const QString &menuDir, int iconSize, bool editable, QWidget *parent);

    /// Whether the view helps its users beyond the plain tree; see setAssistance().
    bool assistance() const;

    /**
     * Switches on what helps users beyond the plain tree: a filter (setFilter()), gray rows for
     * entries that the menu does not show, with the reason as their tool tips (setHiddenShown()),
     * "Hide", "Show again", "Duplicate", "Sort by name" and "Open containing folder" in the context menu, the
     * names of files for entries that have none, a question for each dropped file whose name is taken, and
     * entries for dropped web addresses. Off, as it is at first, the view has nothing of that. A further
     * init() keeps it as it is.
     *
     * In a view that can be edited several rows can be selected, by Ctrl, Shift and Ctrl+A. Delete, Cut,
     * Copy, a drag, "Hide" and "Show again" are done to all of them, as one step; what lies in a selected
     * folder goes along with it. Up and Down move those that lie in one folder together, and are disabled for
     * others. New items, what is pasted and other commands go by the item that the keyboard is on. What can
     * only be done to one item, Edit and Execute, is disabled, and its slot does nothing. A view whose
     * selectionMode() a host has set to another one than QAbstractItemView::SingleSelection keeps that.
     *
     * @param assistance whether the view is to help
     */
    void setAssistance(bool assistance);

    /**
     * Shows only those items that a text finds, and the folders that lead to them, opened.
     *
     * An item is found when every word of the text stands in its name, generic name, comment,
     * command, keywords or file name, in any order, whatever the case and the accents. Of a
     * folder that is found everything can be seen. Folders that were never opened are searched in
     * the background, so that rows may come a moment later. While a filter is set, Find Next goes
     * through what it found. Without assistance() nothing is filtered.
     *
     * What is edited, moved or made stays in sight until another text is given. No order of a
     * folder loses what the filter leaves out.
     *
     * @param text the words, apart by blanks; empty to show everything again
     */
    void setFilter(const QString &text);

    /**
     * The command that takes back what was done to the menu last: new items, edits, deletions,
     * moves, copies, drops, another order, a new default menu.
     *
     * It belongs to the view, works with Ctrl+Z while the view has the keyboard, and is none of
     * its actions(). Its text says what it takes back, for instance "Undo deletion of folder Games
     * (12 entries)". Where the menu is not as it was left any more, nothing is taken back, and
     * told() says why. A further init() forgets what was done.
     *
     * @return null while the view is without assistance() or cannot be edited
     */
    QAction *undoAction() const;

    /// The command that does again what was taken back last, with Ctrl+Shift+Z; see undoAction().
    QAction *redoAction() const;

    /**
     * Shows the entries, too, that the menu leaves out because they are marked as deleted or are
     * meant for other desktops.
     *
     * Everything that the menu does not show is gray and has a tool tip that says why. Without
     * assistance() nothing more is shown.
     *
     * @param shown whether to show them
     */
    void setHiddenShown(bool shown);

    /// The menu directory that the view was built on, as it was given; the start menu's for an empty one.
    QString menuDir() const;

    /**
     * Shows another menu directory, as init() does, and keeps all else. Nothing happens when the view
     * shows that directory already.
     *
     * @param menuDir the directory; empty for the start menu
     */
    void setMenuDir(const QString &menuDir);

    /// The edge of the item icons in pixels; -1 while the style decides.
    int itemIconSize() const;

    /**
     * Sets the size of the item icons.
     *
     * @param size the edge in pixels; -1 leaves it to the style
     */
    void setItemIconSize(int size);

    /// Whether the user can change the menu.
    bool isEditable() const;

    /**
     * Lets the user change the menu, or no longer. Starts afresh on the directory, as init() does, when
     * that is another choice.
     *
     * @param editable whether the user can change the menu
     */
    void setEditable(bool editable);

    /**
     * The selected item in the file-system model; invalid when nothing is selected.
     *
     * Of several (setAssistance()) it is the one that the keyboard is on or, where that is not
     * selected, the first from the top. All of them are in selectionModel()->selectedIndexes(), which
     * belong to the sorting model.
     */
    QModelIndex selectedItem() const;

    /// The path of selectedItem(); empty when nothing is selected.
    QString selectedPath() const;

    /**
     * Selects the item of a file alone, opens the folder that holds it and scrolls to it.
     *
     * The scrolling is done once the event loop runs, so that rows which the model adds
     * meanwhile do not push the item out of sight.
     *
     * @param path the absolute path of a file or folder below the menu directory
     */
    void showAndSelect(const QString &path);

    /**
     * Forgets the order that was read for a folder and sorts the tree anew.
     *
     * @param sourceIndex the folder
     */
    void invalidateSortOrder(const QModelIndex &sourceIndex);

    /// Drops the matches of the last search; the next Find Next searches again.
    void clearFindResults();

    /**
     * Searches the names of the whole menu for the text asked for last and selects a match.
     *
     * Folders that were never opened are searched too, but not what a link leads to outside the
     * menu. A search that takes more than half a second shows a small window; its button and
     * Escape end it. It ends by itself after 20,000 folders or ten seconds. Nothing happens
     * when no text was given yet; when nothing matches, a message box says so.
     *
     * @param next whether to go on to the next match of the last search instead
     * @return whether a match was selected
     */
    bool findAndSelect(bool next);

    /**
     * Puts an item on the clipboard.
     *
     * The clipboard gets "text/uri-list" and, for Qt::MoveAction, "text/uri-move-list", which
     * marks the item as cut.
     *
     * @param item the item; an invalid one leaves the clipboard empty
     * @param action Qt::MoveAction for a cut, anything else for a copy
     */
    void FillClipboard(QModelIndex item, Qt::DropAction action);

    /**
     * Tells in which format clipboard or drag data holds files.
     *
     * @param mimeData the data; null is allowed
     * @return "text/uri-move-list" when that is there, else "text/uri-list" when that is
     *         there, else an empty text
     */
    QString dndFormat(const QMimeData *mimeData) const;

    /**
     * Decodes a list of files of clipboard or drag data.
     *
     * @param mimeData the data; null gives an empty list
     * @param format the format to read, as dndFormat() tells it
     * @return one URL for each line; percent-escaped and plain local text are both understood
     */
    QList<QUrl> dndUrls(const QMimeData *mimeData, const QString &format) const;

    /**
     * Creates a folder or an entry beside or in the selected item and opens the editor on it.
     *
     * When the editor is canceled, what was created is taken away again.
     *
     * @param folder whether to create a folder instead of an entry
     * @return whether the item was made and kept
     */
    bool createNew(bool folder);

    /**
     * Writes a name into the order of a folder.
     *
     * The folder's list then names all its children in the order shown. A ".directory" file
     * is made where the folder has none.
     *
     * @param name the file name of the item
     * @param row the row in the file-system model of the child that is to follow the item; the
     *        folder's row count puts it last, any other row without a child does not list it
     * @param folder the folder
     * @return false when \a folder is invalid or has no path; of a list that cannot be
     *         saved told() tells
     */
    bool fixSortOrderForNew(const QString &name, int row, const QModelIndex &folder);

    /**
     * Moves an item by one place in the order of its folder.
     *
     * @param item the item
     * @param up whether to move it up; else it moves down
     */
    void fixSortOrderInDir(const QModelIndex &item, bool up);

    /// Shows the edit menu where the view is editable.
    void contextMenuEvent(QContextMenuEvent *event) override;

    /**
     * Return and Enter open or close a folder and, where the view is editable, edit an entry; F2
     * edits both. Where the view is not editable, an entry leaves the keys to the window, whose
     * default button may pick it.
     */
    void keyPressEvent(QKeyEvent *event) override;

    /// Asks what is to be done with the dropped files and does it.
    void dropEvent(QDropEvent *event) override;

public Q_SLOTS:
    /// Enables the edit actions that make sense for the selection and the clipboard.
    void setActionsEnabled();
    /// Creates a folder; see createNew().
    void slotDirNew();
    /// Creates an entry; see createNew().
    void slotFileNew();
    /**
     * Opens the editor on the selected entry or folder; nothing while several are selected.
     *
     * @return whether it was edited and saved
     */
    bool slotEdit();
    /// Deletes the selected item, a folder with everything in it, after asking. With assistance()
    /// all that is selected goes into the trash without a question, and only where there is none is asked.
    void slotDel();
    /**
     * Runs the selected entry with the desktop's program "vel-open", which lives on when the
     * view goes away. A message box tells when that cannot be started within two seconds; with
     * assistance() told() does, and gives the reason when "vel-open" could not start the entry.
     */
    void slotExe();
    /// Puts the selected item, or all of several, on the clipboard, to be moved where it is pasted.
    void slotCut();
    /// Puts the selected item, or all of several, on the clipboard, to be copied where it is pasted.
    void slotCopy();
    /// Moves or copies what is on the clipboard into the selected folder or beside the selected item.
    /// A program that holds the clipboard and does not answer is told of after two seconds at most.
    void slotPaste();
    /// Moves the selected item, or several of one folder, up by one place.
    void slotUp();
    /// Moves the selected item, or several of one folder, down by one place.
    void slotDown();
    /// Builds the default start menu anew, after asking; what was in it before is lost. When that
    /// fails, the old menu stays as it was.
    void slotRecreate();
    /// Asks for a text and selects the first item whose name contains it.
    void slotFind();
    /// Selects the next item whose name contains the text asked for last, or the next that the
    /// filter found; see setFilter().
    void slotFindNext();
    /// Emits selectionChanged(const QString &) with the path selected now.
    void selectionChangedSlot();

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

// The signal's name is that of a virtual function of the base, which is not overridden.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Woverloaded-virtual"
    /**
     * The selection has changed, or of several selected items the keyboard is on another one.
     *
     * @param path selectedPath() as it is now
     */
    void selectionChanged(const QString &path);
#pragma GCC diagnostic pop

    /**
     * The user should hear of something.
     *
     * While nothing is connected here, the view shows warnings and failures itself, as a tool tip
     * at the item that they are about. A host that is connected shows them in its own way.
     *
     * @param text one or more sentences in plain text, translated
     * @param kind 0 for a note, something that was done; 1 for a warning; 2 for a failure,
     *        something that was not done
     */
    void told(const QString &text, int kind);

private:
    friend class VelMenuViewPrivate;
    std::unique_ptr<VelMenuViewPrivate> d;
};
