// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

class QHBoxLayout;
class QLineEdit;
class QToolButton;
class QWidget;

namespace VelUI {

/// The form of a field that shows a list in one line and edits it behind a "..." button.
class ListLineForm
{
public:
    struct Names
    {
        const char *form; ///< object name of the widget, and the context of the texts
        const char *line;
        const char *button;
        const char *windowTitle;
        const char *buttonText;
    };

    void setupUi(QWidget *widget, const Names &names);

    /// Shows \a items as a desktop entry writes them: each with a ";" behind it.
    void show(const QStringList &items);
    void setReadOnly(bool readOnly);

    QHBoxLayout *horizontalLayout = nullptr;
    QLineEdit *line = nullptr;
    QToolButton *button = nullptr;
};

} // namespace VelUI
