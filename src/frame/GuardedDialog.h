// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QDialog>
#include <QPointer>

#include <utility>

/// A modal dialog that lives in a scope and may lose its parent while it runs.
///
/// The parent takes the dialog with it then; nothing of the parent may be touched after run()
/// said false and isAlive() says the same.
template <typename Dialog>
class GuardedDialog
{
public:
    template <typename... Arguments>
    explicit GuardedDialog(Arguments &&...arguments)
        : m_dialog(new Dialog(std::forward<Arguments>(arguments)...))
    {
    }
    ~GuardedDialog() { delete m_dialog; }

    Dialog *operator->() const { return m_dialog; }

    bool isAlive() const { return !m_dialog.isNull(); }

    int exec() { return m_dialog->exec(); }

    /// Runs the dialog; whether it was accepted and is still there.
    bool run()
    {
        const int result = exec();
        return m_dialog && result == QDialog::Accepted;
    }

private:
    Q_DISABLE_COPY(GuardedDialog)
    QPointer<Dialog> m_dialog;
};
