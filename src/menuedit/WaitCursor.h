// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QCursor>
#include <QGuiApplication>

/**
 * Shows the wait cursor while it lives.
 */
class WaitCursor
{
public:
    /// Shows the cursor at once; what the user does meanwhile has to wait.
    WaitCursor()
    {
        QGuiApplication::setOverrideCursor(Qt::WaitCursor);
        QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
    }
    ~WaitCursor() { QGuiApplication::restoreOverrideCursor(); }
    Q_DISABLE_COPY_MOVE(WaitCursor)
};
