// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TextsAhead.h"

#include "EntryFile.h"
#include "MessageLocale.h"

#include <RecordFile.h>

#include <dirent.h>
#include <sys/resource.h>
#include <sys/stat.h>

#include <algorithm>
#include <string_view>
#include <system_error>
#include <thread>
#include <utility>
#include <vector>

namespace {

constexpr std::string_view EntrySuffix = ".desktop";
constexpr std::size_t FilesForAThread = 32;
constexpr int Tries = 200;
// So many files have to be in memory, one after another, before those behind are taken to be.
constexpr int FilesInMemory = 32;

bool isEntry(std::string_view name)
{
    return name.size() >= EntrySuffix.size() && name.substr(name.size() - EntrySuffix.size()) == EntrySuffix;
}

/// The names of many files, in one piece.
class Names
{
public:
    std::size_t size() const { return m_begins.size(); }
    std::string_view at(std::size_t number) const
    {
        const std::size_t begin = m_begins[number];
        return std::string_view(m_text).substr(begin, m_text.find('\0', begin) - begin);
    }
    void add(std::string_view name, std::string_view rest = {})
    {
        m_begins.push_back(std::uint32_t(m_text.size()));
        m_text.append(name).append(rest).push_back('\0');
    }

private:
    std::string m_text;
    std::vector<std::uint32_t> m_begins;
};

// What a model of the folder asks for, in the order in which the disk gives it, which is that in
// which it is asked for.
Names filesOf(const std::string &folder)
{
    Names files;
    const std::unique_ptr<DIR, int (*)(DIR *)> directory(::opendir(folder.c_str()), &::closedir);
    if (!directory)
        return files;
    const std::string recordFile = std::string("/") + RecordFile;
    files.add(recordFile);
    while (const dirent *item = ::readdir(directory.get())) {
        const std::string name = std::string("/") + item->d_name;
        if (isEntry(name))
            files.add(name);
        else if (item->d_type == DT_DIR && name[1] != '.')
            files.add(name, recordFile);
        if (files.size() >= TextsAhead::MostFiles)
            break;
    }
    return files;
}

// It is held for a moment only, unless who holds it has to wait for a processor.
bool tryLock(std::unique_lock<std::mutex> &lock)
{
    for (int i = 0; i < Tries; ++i) {
        if (lock.owns_lock() || lock.try_lock())
            return true;
    }
    return lock.owns_lock();
}

void lockSoon(std::unique_lock<std::mutex> &lock)
{
    if (!tryLock(lock))
        lock.lock();
}

std::optional<FileText> readFile(const std::string &path)
{
    return EntryFile::read(QByteArray::fromRawData(path.data(), int(path.size())));
}

// Whether this thread had anything read from a disk since it asked last.
bool hasReadFromDisk()
{
    thread_local long before = 0;
    rusage usage = {};
    return ::getrusage(RUSAGE_THREAD, &usage) == 0
        && usage.ru_inblock != std::exchange(before, usage.ru_inblock);
}

bool isUnchanged(const std::string &path, const FileText &file)
{
    struct stat status;
    return file.settled && ::stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode)
        && FileStamp(status) == file.stamp;
}

} // namespace

/// The mutex of the texts guards all but the path and the language.
class TextsAhead::Folder
{
public:
    Folder(std::string folder, std::string_view userLanguage)
        : path(std::move(folder))
        , language(userLanguage)
    {
    }

    const std::string path;
    const std::string language;
    bool isListed = false;
    bool isGivenUp = false;
    bool isInList = true; // of those to be done, or of those that wait
    int working = 0; // threads that list it or read its files
    std::size_t next = 0; // of the files
    std::size_t later = 0; // the next one to be read for later, behind that
    Names files;

    std::string file(std::size_t number) const { return path + std::string(files.at(number)); }
    bool isDone() const { return isListed && next == files.size(); }
    bool hasWork(bool hasRoom, bool isOnDisk) const
    {
        if (isGivenUp || !isListed)
            return !isGivenUp && working == 0;
        return (hasRoom && next < files.size()) || (isOnDisk && std::max(next, later) < files.size());
    }
};

TextsAhead &TextsAhead::instance()
{
    // Never destroyed: a thread may still be at work when the process ends.
    static auto *const texts = new TextsAhead;
    return *texts;
}

TextsAhead::Ticket TextsAhead::read(std::string folder)
{
    while (!folder.empty() && folder.back() == '/')
        folder.pop_back();
    auto ticket = std::make_shared<Folder>(std::move(folder), MessageLocale::current().language());
    const Lock lock = locked();
    m_folders.push_back(ticket);
    startThread();
    return ticket;
}

TextsAhead::Lock TextsAhead::locked() const
{
    Lock lock(m_mutex, std::defer_lock);
    lockSoon(lock);
    return lock;
}

// Without threads everybody reads by himself.
void TextsAhead::startThread()
{
    if (m_threads >= threadsWanted())
        return;
    try {
        std::thread(&TextsAhead::work, this).detach();
        ++m_threads;
    } catch (const std::system_error &) {
        if (m_threads == 0)
            m_folders.clear();
    }
}

TextsAhead::Ticket TextsAhead::nextFolder() const
{
    const auto next = std::find_if(m_folders.begin(), m_folders.end(),
                                   [this](const Ticket &folder) { return hasWork(*folder); });
    return next == m_folders.end() ? nullptr : *next;
}

void TextsAhead::work()
{
    Lock lock = locked();
    while (const Ticket folder = m_threads <= threadsWanted() ? nextFolder() : nullptr) {
        ++folder->working;
        if (!folder->isListed)
            list(*folder, lock);
        else if (hasRoom())
            readNext(*folder, lock);
        else
            readForLater(*folder, lock);
        --folder->working;
        leave(folder);
        m_progress.notify_all();
    }
    --m_threads;
    freeMemory();
    m_progress.notify_all();
}

// So that nobody looks through folders in which there is nothing to be done.
void TextsAhead::leave(const Ticket &folder)
{
    if (folder->isGivenUp || !folder->isListed || hasWork(*folder))
        return;
    if (folder->isDone())
        return dismiss(folder);
    const auto place = std::find(m_folders.begin(), m_folders.end(), folder);
    if (place != m_folders.end())
        m_full.splice(m_full.end(), m_folders, place);
}

void TextsAhead::dismiss(const Ticket &folder)
{
    if (!std::exchange(folder->isInList, false))
        return;
    for (std::list<Ticket> *list : {&m_folders, &m_full}) {
        const auto place = std::find(list->begin(), list->end(), folder);
        if (place != list->end()) {
            list->erase(place);
            return;
        }
    }
}

void TextsAhead::goOnWhereRoomIs()
{
    const bool isWaiting = !m_full.empty() || (!m_folders.empty() && m_threads == 0);
    if (!isWaiting || m_cost > Limit / 2)
        return;
    m_folders.splice(m_folders.begin(), m_full);
    startThread();
}

void TextsAhead::list(Folder &folder, Lock &lock)
{
    lock.unlock();
    Names files = filesOf(folder.path);
    lockSoon(lock);
    folder.isListed = true;
    if (folder.isGivenUp)
        return;
    folder.files = std::move(files);
    for (std::size_t i = 0; i < folder.files.size(); ++i)
        add(folder, folder.file(i));
    const auto wanted = std::min(folder.files.size() / FilesForAThread, std::size_t(threadsWanted()));
    for (auto i = std::size_t(m_threads); i < wanted; ++i)
        startThread();
}

// Whoever else reads it ahead may keep it.
void TextsAhead::add(Folder &folder, std::string_view path)
{
    if (m_files.find(path) != m_files.end())
        return;
    auto *const key = static_cast<char *>(m_memory.allocate(path.size(), 1));
    path.copy(key, path.size());
    m_files.emplace(std::string_view(key, path.size()), File{&folder, {}});
    m_count.store(m_files.size(), std::memory_order_release);
}

void TextsAhead::readNext(Folder &folder, Lock &lock)
{
    const std::string path = folder.file(folder.next++);
    auto file = m_files.find(path);
    if (file == m_files.end() || file->second.folder != &folder)
        return; // It was asked for before its turn.
    lock.unlock();
    const auto text = readFile(path);
    const bool isKept = text && text->settled;
    if (isKept)
        text->text->makeIndex(folder.language);
    const bool wasOnDisk = hasReadFromDisk();
    lockSoon(lock);
    noteReading(wasOnDisk);
    file = m_files.find(path);
    if (file == m_files.end() || file->second.folder != &folder)
        return; // It was asked for meanwhile.
    const std::size_t cost = isKept ? PackedText::sizeOf(*text) : 0;
    if (!isKept || m_cost + cost > Limit || folder.isGivenUp)
        return forget(file);
    file->second.text = PackedText(*text, &m_memory);
    m_cost += cost;
}

void TextsAhead::readForLater(Folder &folder, Lock &lock)
{
    folder.later = std::max(folder.next, folder.later);
    const std::string path = folder.file(folder.later++);
    const auto file = m_files.find(path);
    if (file == m_files.end() || file->second.folder != &folder)
        return;
    lock.unlock();
    readFile(path);
    const bool wasOnDisk = hasReadFromDisk();
    lockSoon(lock);
    noteReading(wasOnDisk);
}

// Who waits for a disk leaves the processors to others, and a disk serves several sooner than one.
void TextsAhead::noteReading(bool wasOnDisk)
{
    m_onDisk = wasOnDisk ? FilesInMemory : std::max(m_onDisk - 1, 0);
    if (wasOnDisk)
        startThread();
}

bool TextsAhead::hasWork(const Folder &folder) const
{
    return folder.hasWork(hasRoom(), isOnDisk());
}

bool TextsAhead::isRead(const std::string &path) const
{
    const Lock lock = locked();
    const auto file = m_files.find(path);
    return file != m_files.end() && !file->second.text.isEmpty();
}

std::optional<FileText> TextsAhead::take(const std::string &path)
{
    Lock lock(m_mutex, std::defer_lock);
    if (!tryLock(lock))
        return std::nullopt;
    const auto file = m_files.find(path);
    if (file == m_files.end())
        return std::nullopt;
    std::optional<FileText> text;
    if (!file->second.text.isEmpty())
        text = file->second.text.unpacked();
    forget(file);
    goOnWhereRoomIs();
    lock.unlock();
    return text && isUnchanged(path, *text) ? text : std::nullopt;
}

void TextsAhead::giveUp(const Ticket &folder)
{
    if (!folder)
        return;
    Lock lock = locked();
    folder->isGivenUp = true;
    dismiss(folder);
    m_progress.wait(lock, [&folder] { return folder->working == 0; });
    for (std::size_t i = 0; i < folder->files.size() && !m_files.empty(); ++i) {
        const auto file = m_files.find(folder->file(i));
        if (file != m_files.end() && file->second.folder == folder.get())
            forget(file);
    }
    folder->files = {};
    folder->next = 0;
    folder->later = 0;
    goOnWhereRoomIs();
    freeMemory();
}

void TextsAhead::forget(Files::iterator file)
{
    const std::string_view path = file->first;
    m_cost -= file->second.text.size();
    file->second.text.free(&m_memory);
    m_files.erase(file);
    m_memory.deallocate(const_cast<char *>(path.data()), path.size(), 1);
    m_count.store(m_files.size(), std::memory_order_release);
}

// The rows that were read are there for long; this is not needed any more.
void TextsAhead::freeMemory()
{
    if (m_threads > 0 || !m_files.empty())
        return;
    m_files = Files(&m_memory);
    m_memory.release();
}

std::size_t TextsAhead::cost() const
{
    const Lock lock = locked();
    return m_cost;
}

int TextsAhead::threads() const
{
    const Lock lock = locked();
    return m_threads;
}

void TextsAhead::wait()
{
    Lock lock = locked();
    m_progress.wait(lock, [this] { return m_threads == 0; });
}
