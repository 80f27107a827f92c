// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>

class QDialog;
class QDialogButtonBox;
class QGridLayout;
class QGroupBox;
class QKeySequenceEdit;
class QLabel;
class QRadioButton;
class QVBoxLayout;
class ShortcutsTreeView;

/**
 * The widgets of the shortcuts dialog: made, named and laid out, but neither filled nor followed.
 */
class EditShortcutsForm
{
    Q_DECLARE_TR_FUNCTIONS(EditShortcutsDialog)

public:
    /// Builds the form on \a dialog, which owns the widgets.
    explicit EditShortcutsForm(QDialog *dialog);

    ShortcutsTreeView *treeView = nullptr;
    QGroupBox *groupBox = nullptr;
    QRadioButton *defaultKeyRB = nullptr;
    QLabel *defaultKeyLabel = nullptr;
    QRadioButton *customKeyRB = nullptr;
    QKeySequenceEdit *keyWidget = nullptr;
    QDialogButtonBox *buttonBox = nullptr;

private:
    void addTree(QVBoxLayout *layout);
    void addKeyBox(QVBoxLayout *layout);
    void addDefaultKey(QGridLayout *grid);
    void addCustomKey(QGridLayout *grid);
    void addButtons(QVBoxLayout *layout);
};
