// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PackedText.h"

#include <algorithm>
#include <cstring>
#include <new>
#include <type_traits>
#include <utility>

namespace {

using Group = DesktopEntryIndex::Group;
using Run = DesktopEntryIndex::Run;

// They are copied as bytes, one array behind the other.
static_assert(std::is_trivially_copyable_v<Group> && std::is_trivially_copyable_v<Run>);
static_assert(sizeof(Group) % alignof(Run) == 0);

} // namespace

/// Behind it stand the groups, the runs and the bytes.
struct PackedText::Head
{
    FileStamp stamp;
    bool settled;
    DesktopEntryIndex::Tag language;
    std::size_t groups;
    std::size_t runs;
    std::size_t bytes;
};

std::size_t PackedText::sizeOf(const FileText &file)
{
    const DesktopEntryIndex &index = file.text->index();
    return sizeof(Head) + index.groups().size() * sizeof(Group) + index.runs().size() * sizeof(Run)
        + file.text->bytes().size();
}

PackedText::PackedText(const FileText &file, std::pmr::memory_resource *memory)
    : m_size(sizeOf(file))
{
    const DesktopEntryIndex &index = file.text->index();
    const std::string_view bytes = file.text->bytes();
    m_block = static_cast<std::byte *>(memory->allocate(m_size, alignof(Head)));
    const auto *const head = new (m_block) Head{
        file.stamp, file.settled, index.language(), index.groups().size(), index.runs().size(), bytes.size()};
    std::byte *place = m_block + sizeof *head;
    const auto put = [&place](const void *from, std::size_t size) {
        if (size > 0)
            std::memcpy(place, from, size);
        place += size;
    };
    put(index.groups().data(), head->groups * sizeof(Group));
    put(index.runs().data(), head->runs * sizeof(Run));
    put(bytes.data(), bytes.size());
}

FileText PackedText::unpacked() const
{
    const auto *const head = reinterpret_cast<const Head *>(m_block);
    const auto *const groups = reinterpret_cast<const Group *>(head + 1);
    const auto *const runs = reinterpret_cast<const Run *>(groups + head->groups);
    QByteArray bytes(reinterpret_cast<const char *>(runs + head->runs), int(head->bytes));
    return {std::make_shared<DesktopEntryText>(
                std::move(bytes), head->language,
                DesktopEntryIndex::Places{{groups, groups + head->groups}, {runs, runs + head->runs}}),
            head->stamp, head->settled};
}

void PackedText::free(std::pmr::memory_resource *memory)
{
    if (m_block)
        memory->deallocate(std::exchange(m_block, nullptr), std::exchange(m_size, 0), alignof(Head));
}
