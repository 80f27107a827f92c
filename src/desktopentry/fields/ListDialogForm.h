// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class QDialog;
class QDialogButtonBox;
class QFrame;
class QVBoxLayout;
class QWidget;

namespace VelUI {

/// The form of a dialog around a list editor: the editor, a line, and Ok and Cancel.
class ListDialogForm
{
public:
    struct Names
    {
        const char *form; ///< object name of the dialog, and the context of its title
        const char *windowTitle;
    };

    /// Lays out \a dialog around \a listWidget and connects the buttons.
    void setupUi(QDialog *dialog, QWidget *listWidget, const Names &names);
    void setOkEnabled(bool enabled);

    QVBoxLayout *verticalLayout = nullptr;
    QFrame *line = nullptr;
    QDialogButtonBox *buttonBox = nullptr;
};

} // namespace VelUI
