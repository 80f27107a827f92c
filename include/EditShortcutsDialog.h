// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QDialog>
#include <QKeySequence>

#include <memory>

class EditShortcutsDialogPrivate;
class QAbstractButton;
class ShortcutsModel;

/**
 * A dialog in which the user gives the shortcuts of an application other keys.
 *
 * It shows the groups and shortcuts of a ShortcutsModel. For the current one the user keeps
 * the default key or records another one by pressing it, up to four chords long. A recorded
 * key is refused, with a message that names the holder, when a global shortcut of the desktop
 * has it (see VelKeyServer::checkForGlobalShortcut()) or another shortcut of the model. A key
 * press records nothing when the key only modifies, locks, composes or is dead, and when the key
 * could not be read again after it was saved.
 *
 * These checks see equal sequences, not prefixes: "Ctrl+K" is accepted beside
 * "Ctrl+K, Ctrl+C". Qt then waits for the second chord before it triggers the first.
 *
 * With assistance (see setAssistance()) the dialog explains clashes while a key is recorded, those
 * of the default key and those that are only advised against, too; see ShortcutClash. A key that
 * would be refused then waits in the field until the user has taken it over from the other
 * shortcut, has chosen another one, or leaves it: then it is refused.
 *
 * With assistance there is also a filter above the tree, by text, by keys that are pressed and by
 * what was changed, to which Ctrl+F leads; Escape takes it away before it closes the dialog. While
 * the filter hides the current shortcut none is current. The keys stay in view, those that were
 * changed stand out and can be taken back one by one, and all of them can be written to a file,
 * read from one and put on a sheet; see ShortcutScheme and ShortcutSheet. Size and columns are kept
 * in the application's QSettings, in the group "EditShortcutsDialog".
 *
 * The edits are pending in the model until the user confirms with Ok, which puts them into
 * force. Cancel, Escape and closing the window without applying throw them away. The dialog
 * saves nothing: call ShortcutsModel::saveKeys() after it was accepted.
 *
 * While something is changed the buttons Ok and Reset are enabled. A key counts as a change from
 * its first chord on; it is entered when the focus leaves, when the window is closed and with Ok,
 * and dropped with Cancel.
 *
 * For the GUI thread alone.
 *
 * \image html shortcuts-dialog.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT EditShortcutsDialog : public QDialog
{
    Q_OBJECT
    /// Whether the dialog helps beyond its plain form, see setAssistance().
    Q_PROPERTY(bool assistance READ assistance WRITE setAssistance)

public:
    /**
     * Makes the dialog for a model.
     *
     * @param model the model with everything registered; not owned; a dialog that outlives it
     *              shows nothing and changes nothing
     * @param parent the window that the dialog belongs to
     */
    explicit EditShortcutsDialog(ShortcutsModel *model, QWidget *parent = nullptr);
    ~EditShortcutsDialog() override;

    /**
     * States whether there is something to apply or to reset.
     *
     * @param changed whether the buttons Ok and Reset are enabled
     */
    void setChanged(bool changed);

    /// Tells whether the dialog helps beyond its plain form; not at first.
    bool assistance() const;
    /**
     * Switches on or off what the dialog has beyond its plain form, at any time.
     *
     * @param assistance false leaves exactly the plain form; edits stay pending
     */
    void setAssistance(bool assistance);

    /// Hides the dialog with the result Rejected; throws away what is changed.
    void reject() override;
    /**
     * Hides the dialog.
     *
     * @param result with Accepted a key that is being recorded is entered first, and the dialog
     *               stays when it is refused; with Rejected the edits are thrown away
     */
    void done(int result) override;
    /// Shows or hides the dialog; hiding it drops a key that is being recorded.
    void setVisible(bool visible) override;

public Q_SLOTS:
    /**
     * Shows the keys of the shortcut that is current now or whose key changed.
     *
     * @param defKS its default key
     * @param currentKS its pending key; the shortcut keeps its default when the two are equal
     */
    void checkCurrentShortcut(QKeySequence defKS, QKeySequence currentKS);
    /**
     * Takes a key that was entered for the current shortcut, or refuses it with a message.
     *
     * @param key the whole sequence. An empty one conflicts with nothing; one that the key
     *            editor announces when a recording begins or is given up changes nothing
     */
    void checkEnteredKeySequence(QKeySequence key);
    /// No shortcut is current: disables the choice of a key.
    void disableShortcutEdit();
    /**
     * Does what the buttons RestoreDefaults and Reset stand for; ignores any other button.
     *
     * @param button a button of the dialog's button box
     */
    void processButtonBox(QAbstractButton *button);
    /// Gives the current shortcut its default key, if "defaultKeyRB" is checked.
    void setDefaultShortcut();
    /// Puts the edits into force and accepts the dialog.
    void slotAccept();
    /// Throws the edits away and rejects the dialog.
    void slotReject();

protected:
    /// Asks what to do with edits; the dialog stays open when the answer is Cancel.
    void closeEvent(QCloseEvent *event) override;
    /// Makes Escape the same as Cancel.
    void keyPressEvent(QKeyEvent *event) override;
    /// Watches the recording of a key.
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    const std::unique_ptr<EditShortcutsDialogPrivate> d;
};
