// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class QHBoxLayout;
class QListWidget;
class QPushButton;
class QVBoxLayout;
class QWidget;

namespace VelUI {

/// The form of a list with buttons that add, edit, delete and move its items, and the rules
/// that hold whatever an item is.
class ListEditorForm
{
public:
    struct Names
    {
        const char *form; ///< object name of the widget, and the context of the texts
        const char *windowTitle;
        const char *addText;
        const char *editText;
        const char *deleteText;
        const char *upText;
        const char *downText;
    };

    void setupUi(QWidget *widget, const Names &names);

    /// Makes the item in \a row the only selected one and shows it.
    void select(int row);
    void removeSelectedItems();
    /// Moves the current item by \a rows and keeps it current; without one nothing happens.
    bool moveCurrentItem(int rows);
    /// Enables the buttons that make sense for what is selected.
    void updateButtons();

    QHBoxLayout *horizontalLayout = nullptr;
    QListWidget *listWidget = nullptr;
    QVBoxLayout *verticalLayout = nullptr;
    QPushButton *addButton = nullptr;
    QPushButton *editButton = nullptr;
    QPushButton *deleteButton = nullptr;
    QPushButton *upButton = nullptr;
    QPushButton *downButton = nullptr;

private:
    void connectKeys();
    QPushButton *addPushButton(QWidget *widget, const char *name, const char *context, const char *text);
};

} // namespace VelUI
