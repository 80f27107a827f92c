// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderCopy.h"

#include "FolderLimits.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <system_error>
#include <utility>
#include <vector>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

constexpr mode_t PlainBits = 0777;

class Descriptor
{
public:
    explicit Descriptor(int descriptor)
        : m_descriptor(descriptor)
    {
    }
    ~Descriptor()
    {
        if (m_descriptor >= 0)
            ::close(m_descriptor);
    }
    Descriptor(const Descriptor &) = delete;
    Descriptor &operator=(const Descriptor &) = delete;

    int get() const { return m_descriptor; }
    bool close() { return ::close(std::exchange(m_descriptor, -1)) == 0; }

private:
    int m_descriptor;
};

bool writeAll(int file, const char *bytes, std::size_t size)
{
    while (size > 0) {
        const ssize_t count = ::write(file, bytes, size);
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return false;
        bytes += count;
        size -= std::size_t(count);
    }
    return true;
}

bool copyBytes(int from, int to)
{
    std::array<char, 1 << 16> buffer;
    for (;;) {
        const ssize_t count = ::read(from, buffer.data(), buffer.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return count == 0;
        if (!writeAll(to, buffer.data(), std::size_t(count)))
            return false;
    }
}

// The permissions of the other folder as far as the umask lets it, and the owner's to fill it.
bool makeFolder(const fs::path &like, const fs::path &path)
{
    struct stat status = {};
    return ::stat(like.c_str(), &status) == 0
        && ::mkdir(path.c_str(), (status.st_mode & PlainBits) | S_IRWXU) == 0;
}

class FolderCopy
{
public:
    explicit FolderCopy(const fs::path &target)
    {
        std::error_code error;
        m_open.push_back(fs::canonical(target, error));
    }

    bool copy(const fs::path &from, const fs::path &to)
    {
        std::error_code error;
        const fs::path real = fs::canonical(from, error);
        if (error)
            return false;
        m_open.push_back(real);
        const bool done = copyEach(from, to);
        m_open.pop_back();
        return done;
    }

private:
    bool copyEach(const fs::path &from, const fs::path &to)
    {
        std::error_code error;
        fs::directory_iterator it(from, error);
        for (; !error && it != fs::directory_iterator(); it.increment(error)) {
            const bool isTaken = m_limits.take(m_open.size() - 1, "template of the start menu");
            if (!isTaken || !copyOne(it->path(), to / it->path().filename()))
                return false;
        }
        return !error;
    }

    bool copyOne(const fs::path &from, const fs::path &to)
    {
        std::error_code error;
        const fs::file_status status = fs::status(from, error);
        if (fs::is_regular_file(status))
            return copyFile(from, to);
        if (!fs::is_directory(status) || isOpen(from))
            return true;
        return makeFolder(from, to) && copy(from, to);
    }

    bool isOpen(const fs::path &folder) const
    {
        std::error_code error;
        return std::find(m_open.begin(), m_open.end(), fs::canonical(folder, error)) != m_open.end();
    }

    FolderLimits m_limits;
    std::vector<fs::path> m_open; // the target, and the folders that are being copied
};

} // namespace

bool copyFile(const fs::path &from, const fs::path &to)
{
    // Without O_NONBLOCK a named pipe would wait for a writer.
    const Descriptor source(::open(from.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    struct stat status = {};
    if (source.get() < 0 || ::fstat(source.get(), &status) != 0)
        return false;
    if (!S_ISREG(status.st_mode)) {
        errno = EINVAL;
        return false;
    }
    const mode_t mode = (status.st_mode & PlainBits) | S_IRUSR | S_IWUSR;
    Descriptor target(::open(to.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode));
    return target.get() >= 0 && copyBytes(source.get(), target.get()) && target.close();
}

bool copyFolderContents(const fs::path &from, const fs::path &to)
{
    return FolderCopy(to).copy(from, to);
}
