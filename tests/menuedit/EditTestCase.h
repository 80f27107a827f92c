// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuTestCase.h"

#include <QMessageBox>

class ModalDriver;
class QWidget;

/// The fixture of the tests that edit the menu by the view's own slots.
class EditTestCase : public MenuTestCase
{
    Q_OBJECT

public:
    using MenuTestCase::MenuTestCase;

    /// Fills the named field of the entry editor, or of any dialog.
    static void fill(QWidget *dialog, const char *field, const QString &text);
    /// Accepts the entry editor, with \a name for the entry unless that is empty.
    static void accept(QWidget *dialog, const QString &name = QString());
    static void reject(QWidget *dialog);
    /// Expects the question before a deletion and gives the \a answer.
    static void announceDeleteQuestion(ModalDriver &modal, QMessageBox::StandardButton answer);
    /// Writes an entry for each letter, named by it and shown as its capital.
    QStringList writeLetters(const char *letters, const QString &folder = QString());
};
