// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <VelDesktopEntryEditDialog.h>

#include <QCoreApplication>
#include <QString>

/// The window of the program: the entry editor, which is not left by mistake.
///
/// Escape and the window's own close button ask when something was changed; Cancel does not.
class EntryWindow : public VelDesktopEntryEditDialog
{
    Q_DECLARE_TR_FUNCTIONS(EntryWindow)

public:
    /// Makes a window for the entry \a file.
    explicit EntryWindow(const QString &file);

protected:
    void keyPressEvent(QKeyEvent *event) override;
    void closeEvent(QCloseEvent *event) override;

private:
    void showHelp();
    bool mayEnd();

    const QString m_file;
};
