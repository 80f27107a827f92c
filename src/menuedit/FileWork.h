// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileProgress.h"
#include "LongWork.h"

#include <QElapsedTimer>
#include <QPointer>
#include <QString>

#include <memory>

/**
 * Follows an operation on files for a user, who sees how far it is when it takes long, and can end
 * it. What is taken back after that is seen as well, but not ended.
 */
class FileWork : public FileProgress
{
public:
    /// For an operation that begins now on behalf of \a owner, which may go away; see LongWork.
    FileWork(QWidget *owner, const QString &title, const QString &text);
    ~FileWork() override;

    bool goOn() override;

private:
    const QPointer<QWidget> m_owner;
    const QString m_title;
    const QString m_text;
    QElapsedTimer m_sinceBegun;
    std::unique_ptr<LongWork> m_work;
    bool m_isEnded = false;
};
