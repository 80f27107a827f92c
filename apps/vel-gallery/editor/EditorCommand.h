// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QString>
#include <QVector>

#include <functional>

class QPlainTextEdit;

/// One command of the small text editor.
struct EditorCommand
{
    /// The name under which its key is saved.
    QString name;
    /// The menu that it stands in: "File", "Edit", "Text" or "View", in the language of the desktop.
    QString menu;
    /// The text, with a mnemonic.
    QString text;
    /// The key that the editor gives it, as portable text; may be empty.
    QString key;
    std::function<void(QPlainTextEdit *)> run;
};

/// Where the translators find the texts of all commands.
struct EditorTexts
{
    Q_DECLARE_TR_FUNCTIONS(EditorCommands)
};
