// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <functional>

class QDialog;
class QDialogButtonBox;
class QFrame;
class QString;
class QVBoxLayout;
class QWidget;

namespace VelUI {

class ListMessage;

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

    /// Says \a text below the list, with a button for repair() that \a repairText names. An empty
    /// \a text says nothing, an empty \a repairText offers nothing.
    void tell(const QString &text, const QString &repairText);
    /// Leads whoever overlooked what was said to it.
    void insist();
    std::function<void()> repair; ///< what the button does

    QVBoxLayout *verticalLayout = nullptr;
    QFrame *line = nullptr;
    QDialogButtonBox *buttonBox = nullptr;

private:
    void makeMessage();

    ListMessage *m_message = nullptr; ///< made when there is something to say
};

} // namespace VelUI
