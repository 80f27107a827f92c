// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StderrCapture.h"

#include <cstdio>

#include <unistd.h>

StderrCapture::StderrCapture()
{
    if (!m_file.open())
        qFatal("StderrCapture: no temporary file");
    std::fflush(stderr);
    m_saved = dup(STDERR_FILENO);
    dup2(m_file.handle(), STDERR_FILENO);
}

StderrCapture::~StderrCapture()
{
    restore();
}

QByteArray StderrCapture::take()
{
    restore();
    m_file.seek(0);
    return m_file.readAll();
}

void StderrCapture::restore()
{
    if (m_saved < 0)
        return;
    std::fflush(stderr);
    dup2(m_saved, STDERR_FILENO);
    close(m_saved);
    m_saved = -1;
}
