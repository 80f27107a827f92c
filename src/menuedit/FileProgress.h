// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

/**
 * Follows an operation on files, which tells how far it is and asks again and again whether it is
 * to go on. This one follows nothing and lets all go on.
 */
class FileProgress
{
public:
    FileProgress() = default;
    virtual ~FileProgress() = default;
    FileProgress(const FileProgress &) = delete;
    FileProgress &operator=(const FileProgress &) = delete;

    /// So many more files and folders are to be done than was known until now.
    void expect(int items) { m_expected += items; }
    /// One of them is done.
    void advance() { ++m_done; }

    /// How many are to be done, as far as that is known.
    int expected() const { return m_expected; }
    int done() const { return m_done; }

    /// Asked before each item, each piece of a large file, and while items are counted. After a
    /// no the operation takes back what it did, and goes on asking while it does so.
    virtual bool goOn() { return true; }

private:
    int m_expected = 0;
    int m_done = 0;
};

/**
 * Follows what has to be done to its end, whatever the \a other one says.
 */
class UnstoppableProgress : public FileProgress
{
public:
    explicit UnstoppableProgress(FileProgress &other)
        : m_other(other)
    {
    }

    bool goOn() override
    {
        m_other.goOn();
        return true;
    }

private:
    FileProgress &m_other;
};
