// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryFile.h"

#include "FileDescriptor.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

namespace {

// Reads until the end, or until there is more than a desktop entry may have.
bool readAll(int file, int expected, QByteArray *bytes)
{
    // One byte more than expected: the read that fills less has met the end.
    *bytes = QByteArray(expected + 1, Qt::Uninitialized);
    int done = 0;
    for (;;) {
        const ssize_t count = ::read(file, bytes->data() + done, std::size_t(bytes->size() - done));
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return false;
        done += int(count);
        if (done < bytes->size())
            break;
        if (done > EntryFile::LargestSize)
            return false;
        bytes->resize(done + 4096);
    }
    bytes->truncate(done);
    return true;
}

} // namespace

int EntryFile::open(const QByteArray &path, int flags)
{
    if (path.isEmpty() || path.contains('\0'))
        return -1;
    // Without O_NONBLOCK a named pipe would wait for a writer.
    return ::open(path.constData(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY | flags);
}

std::optional<FileText> EntryFile::readOpen(int file)
{
    struct stat status;
    if (file < 0 || ::fstat(file, &status) != 0 || !S_ISREG(status.st_mode) || status.st_size > LargestSize)
        return std::nullopt;

    FileText result;
    result.stamp = FileStamp(status);
    result.settled = result.stamp.isSettled();
    QByteArray bytes;
    if (!readAll(file, int(status.st_size), &bytes) || bytes.size() > LargestSize)
        return std::nullopt;
    result.settled = result.settled && bytes.size() == result.stamp.size;
    result.text = std::make_shared<DesktopEntryText>(std::move(bytes));
    return result;
}

std::optional<FileText> EntryFile::read(const QByteArray &path)
{
    const FileDescriptor file(open(path));
    return readOpen(file.get());
}
