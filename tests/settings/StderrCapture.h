// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QTemporaryFile>

/// Collects what this process writes to standard error while the object lives.
class StderrCapture
{
public:
    StderrCapture();
    ~StderrCapture();

    StderrCapture(const StderrCapture &) = delete;
    StderrCapture &operator=(const StderrCapture &) = delete;

    /// Ends the capture and returns what was written.
    QByteArray take();

private:
    void restore();

    QTemporaryFile m_file;
    int m_saved = -1;
};
