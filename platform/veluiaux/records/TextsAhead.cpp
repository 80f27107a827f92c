// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TextsAhead.h"

#include "EntryFile.h"

#include <RecordFile.h>

#include <dirent.h>
#include <sys/stat.h>

#include <algorithm>
#include <string_view>
#include <system_error>
#include <thread>
#include <utility>

/// The mutex of the texts guards all but the path.
class TextsAhead::Folder
{
public:
    explicit Folder(std::string folder)
        : path(std::move(folder))
    {
    }

    const std::string path;
    bool isListed = false;
    bool isGivenUp = false;
    int working = 0; // threads that list it or read its files
    std::size_t next = 0; // of the files
    std::vector<std::string> files;

    bool hasWork() const { return !isGivenUp && (isListed ? next < files.size() : working == 0); }
};

namespace {

constexpr std::string_view EntrySuffix = ".desktop";

bool isEntry(std::string_view name)
{
    return name.size() >= EntrySuffix.size() && name.substr(name.size() - EntrySuffix.size()) == EntrySuffix;
}

// What a model of the folder asks for, in the order in which the disk gives it, which is that in
// which it is asked for.
std::vector<std::string> filesOf(const std::string &folder)
{
    std::vector<std::string> files{folder + '/' + RecordFile};
    const std::unique_ptr<DIR, int (*)(DIR *)> directory(::opendir(folder.c_str()), &::closedir);
    if (!directory)
        return {};
    while (const dirent *item = ::readdir(directory.get())) {
        const std::string_view name = item->d_name;
        if (isEntry(name))
            files.push_back(folder + '/' + item->d_name);
        else if (item->d_type == DT_DIR && name.front() != '.')
            files.push_back(folder + '/' + item->d_name + '/' + RecordFile);
        if (files.size() >= TextsAhead::MostFiles)
            break;
    }
    return files;
}

bool isUnchanged(const std::string &path, const FileText &file)
{
    struct stat status;
    return file.settled && ::stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode)
        && FileStamp(status) == file.stamp;
}

} // namespace

TextsAhead &TextsAhead::instance()
{
    // Never destroyed: a thread may still be at work when the process ends.
    static auto *const texts = new TextsAhead;
    return *texts;
}

TextsAhead::Ticket TextsAhead::read(std::string folder)
{
    while (folder.size() > 1 && folder.back() == '/')
        folder.pop_back();
    auto ticket = std::make_shared<Folder>(folder == "/" ? std::string() : std::move(folder));
    const Lock lock(m_mutex);
    m_folders.push_back(ticket);
    if (m_threads < MostThreads)
        startThread();
    return ticket;
}

// Without threads everybody reads by himself.
void TextsAhead::startThread()
{
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
                                   [](const Ticket &folder) { return folder->hasWork(); });
    return next == m_folders.end() ? nullptr : *next;
}

void TextsAhead::work()
{
    Lock lock(m_mutex);
    while (const Ticket folder = nextFolder()) {
        ++folder->working;
        if (folder->isListed)
            readNext(*folder, lock);
        else
            list(*folder, lock);
        --folder->working;
        if (folder->isListed && folder->next == folder->files.size())
            m_folders.remove(folder);
        m_progress.notify_all();
    }
    --m_threads;
    m_progress.notify_all();
}

void TextsAhead::list(Folder &folder, Lock &lock)
{
    lock.unlock();
    std::vector<std::string> files = filesOf(folder.path);
    lock.lock();
    folder.isListed = true;
    if (folder.isGivenUp)
        return;
    // Whoever else reads one of them ahead may keep it.
    for (std::string &file : files) {
        if (m_files.emplace(file, File{&folder, State::Waiting, std::nullopt, 0}).second)
            folder.files.push_back(std::move(file));
    }
    m_count.store(m_files.size(), std::memory_order_release);
    constexpr std::size_t FilesForAThread = 32;
    const std::size_t wanted = folder.files.size() / FilesForAThread;
    while (std::size_t(m_threads) < std::min<std::size_t>(wanted, MostThreads)) {
        const int before = m_threads;
        startThread();
        if (m_threads == before)
            break;
    }
}

void TextsAhead::readNext(Folder &folder, Lock &lock)
{
    const std::string path = folder.files[folder.next++];
    auto file = m_files.find(path);
    if (file == m_files.end() || file->second.folder != &folder)
        return; // It was asked for before its turn.
    file->second.state = State::Reading;
    lock.unlock();
    auto text = EntryFile::read(QByteArray::fromRawData(path.data(), int(path.size())));
    lock.lock();
    // Neither taken nor given up meanwhile: both wait.
    file = m_files.find(path);
    const std::size_t cost = text ? sizeof(DesktopEntryText) + text->text->bytes().size() : 0;
    if (!text || !text->settled || m_cost + cost > Limit || folder.isGivenUp) {
        erase(file);
        return;
    }
    file->second.state = State::Read;
    file->second.text = std::move(text);
    file->second.cost = cost;
    m_cost += cost;
}

std::optional<FileText> TextsAhead::take(const std::string &path)
{
    Lock lock(m_mutex);
    auto file = m_files.find(path);
    while (file != m_files.end() && file->second.state == State::Reading) {
        m_progress.wait(lock);
        file = m_files.find(path);
    }
    if (file == m_files.end())
        return std::nullopt;
    std::optional<FileText> text = std::move(file->second.text);
    forget(path);
    lock.unlock();
    return text && isUnchanged(path, *text) ? text : std::nullopt;
}

void TextsAhead::giveUp(const Ticket &folder)
{
    if (!folder)
        return;
    Lock lock(m_mutex);
    folder->isGivenUp = true;
    m_folders.remove(folder);
    m_progress.wait(lock, [&folder] { return folder->working == 0; });
    for (const std::string &path : folder->files) {
        const auto file = m_files.find(path);
        if (file != m_files.end() && file->second.folder == folder.get())
            forget(path);
    }
    folder->files = {};
    folder->next = 0;
}

void TextsAhead::forget(const std::string &path)
{
    const auto file = m_files.find(path);
    m_cost -= file->second.cost;
    erase(file);
}

void TextsAhead::erase(std::unordered_map<std::string, File>::iterator file)
{
    m_files.erase(file);
    m_count.store(m_files.size(), std::memory_order_release);
}

std::size_t TextsAhead::cost() const
{
    const Lock lock(m_mutex);
    return m_cost;
}

int TextsAhead::threads() const
{
    const Lock lock(m_mutex);
    return m_threads;
}

void TextsAhead::wait()
{
    Lock lock(m_mutex);
    m_progress.wait(lock, [this] { return m_threads == 0; });
}
