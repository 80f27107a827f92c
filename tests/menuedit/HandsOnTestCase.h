// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuTestCase.h"

#include <memory>

class ModalDriver;
class VelMenuDialog;
class VelMenuView;

/// The fixture of the tests that work the menu editor with mouse and keyboard.
class HandsOnTestCase : public MenuTestCase
{
    Q_OBJECT

public:
    HandsOnTestCase();
    ~HandsOnTestCase() override;

    /// Shows the editor of \a directory, which has \a count items, and waits for all of them.
    void openDialog(const QString &directory, int count);
    /// Clicks the tool button of an action.
    void clickAction(const char *name);
    /// Clicks the item of \a file and waits until it is selected and has the keyboard.
    void clickItem(const QString &file);
    /// A place on the item of \a file, in the view's viewport; the item must be in sight.
    QPoint placeOf(const QString &file);
    /// The next modal window is the menu that a drop opens: clicks the entry \a text, whatever its
    /// mnemonic is.
    static void pickInDropMenu(ModalDriver &modal, const QString &text);

    VelMenuDialog *dialog() const { return m_dialog.get(); }
    VelMenuView &view() const { return *m_view; }

protected Q_SLOTS:
    void cleanup();

protected:
    void closeDialog();

private:
    std::unique_ptr<VelMenuDialog> m_dialog;
    VelMenuView *m_view = nullptr;
};
