// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <memory>

/**
 * The folders whose entries the platform reads ahead while the file model lists them. Where it
 * cannot do so, nothing happens.
 */
class ReadingAhead
{
public:
    ReadingAhead();
    /// Ends what was begun.
    ~ReadingAhead();

    /// The folder at \a path is about to be listed.
    void begin(const QString &path);
    /// It was listed, and all of its entries were asked for.
    void end(const QString &path);

private:
    Q_DISABLE_COPY(ReadingAhead)
    struct Private;
    std::unique_ptr<Private> d;
};
