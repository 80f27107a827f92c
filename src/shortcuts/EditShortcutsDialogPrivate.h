// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QMessageBox>
#include <QPointer>

#include "ShortcutsModel.h"

class EditShortcutsDialog;
class QDialogButtonBox;
class QGridLayout;
class QGroupBox;
class QKeySequenceEdit;
class QLabel;
class QRadioButton;
class QVBoxLayout;
class ShortcutsTreeView;
struct ShortcutConflict;

/**
 * The form of the dialog, and the steps that its slots are made of.
 */
class EditShortcutsDialogPrivate
{
public:
    EditShortcutsDialogPrivate(EditShortcutsDialog *dialog, ShortcutsModel *shortcuts);

    void buildForm();
    void fillTree();
    void connectKeys();

    /// Whether there is something to apply: the Ok button is the one record of that.
    bool isChanged() const;
    /// Puts a key into the key editor without the editor announcing it; ends a recording.
    void showKey(const QKeySequence &key);
    /// Makes \a key the pending one of the current shortcut, as the user wished.
    void setPendingKey(const QKeySequence &key);
    /// The default key as the label shows it.
    QKeySequence shownDefaultKey() const;
    void reportConflict(const ShortcutConflict &conflict, const QKeySequence &key);
    /// What the user wants with the edits when the window is closed.
    QMessageBox::StandardButton askWhetherToApply();
    /// Takes the key recorded so far; when there is none, the editor shows the old one again.
    void endRecording();

    EditShortcutsDialog *const q;
    const QPointer<ShortcutsModel> model;
    QVBoxLayout *verticalLayout = nullptr;
    ShortcutsTreeView *treeView = nullptr;
    QGroupBox *groupBox = nullptr;
    QGridLayout *gridLayout = nullptr;
    QRadioButton *defaultKeyRB = nullptr;
    QLabel *defaultKeyLabel = nullptr;
    QRadioButton *customKeyRB = nullptr;
    QKeySequenceEdit *keyWidget = nullptr;
    QDialogButtonBox *buttonBox = nullptr;
    /// From a key press in the key editor until it is done. An empty key that it announces
    /// meanwhile is no key that the user chose.
    bool isRecording = false;

private:
    void buildKeyBox();
};
