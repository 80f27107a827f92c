// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <system_error>

/**
 * Why a change was not undone or done again.
 */
struct Refusal
{
    /// A whole sentence for the user; empty when nothing was refused.
    QString reason;
    /// Whether it can never be done any more, whatever becomes of the disk.
    bool isForGood = false;

    explicit operator bool() const { return !reason.isEmpty(); }

    static Refusal none() { return {}; }
    /// What is to be at \a path is not.
    static Refusal gone(const QString &path);
    /// Something else is at \a path by now.
    static Refusal taken(const QString &path);
    /// Somebody else changed what is at \a path.
    static Refusal changed(const QString &path);
    /// What was put away is not where it was put; \a path is where it was before.
    static Refusal lost(const QString &path);
    /// What is at \a path cannot be put into the trash.
    static Refusal notTrashed(const QString &path);
    /// The system said \a error about \a path; no refusal for no error.
    static Refusal failed(const QString &path, const std::error_code &error);
};
