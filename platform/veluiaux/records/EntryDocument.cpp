// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDocument.h"

#include "AtomicFile.h"
#include "DesktopEntryNames.h"
#include "DesktopEntryValue.h"
#include "DesktopEntryWriter.h"
#include "MessageLocale.h"

#include <velcore/language.h>

#include <sys/stat.h>

#include <cerrno>
#include <mutex>
#include <type_traits>
#include <utility>

namespace {

template <typename T>
std::optional<T> decode(std::string_view bytes)
{
    if constexpr (std::is_same_v<T, QString>)
        return DesktopEntryValue::toText(bytes);
    else
        return DesktopEntryValue::toList(bytes);
}

std::string encode(const QString &text)
{
    return DesktopEntryValue::fromText(text);
}

std::string encode(const QStringList &list)
{
    return DesktopEntryValue::fromList(list);
}

QStringList withoutEmpty(QStringList list)
{
    list.removeAll(QString());
    return list;
}

std::shared_ptr<const DesktopEntryText> emptyText()
{
    static const auto text = std::make_shared<const DesktopEntryText>();
    return text;
}

// Two records of this process that save to one file at a time would lose one's changes.
std::mutex &savingMutex()
{
    static std::mutex mutex;
    return mutex;
}

} // namespace

EntryDocument::EntryDocument()
    : m_text(emptyText())
{
}

void EntryDocument::setPath(const QByteArray &path)
{
    m_path = path;
}

bool EntryDocument::load()
{
    m_changes = {};
    auto file = EntryFile::read(m_path);
    m_read = file.has_value();
    m_textPath = m_path;
    m_text = file ? std::move(file->text) : emptyText();
    m_stamp = file ? file->stamp : FileStamp();
    m_settled = file && file->settled;
    m_valid = m_text->group(DesktopEntryNames::MainGroup) != DesktopEntryText::NoGroup;
    return m_read;
}

int EntryDocument::baseGroup(std::string_view group) const
{
    return m_changes.isRemoved(group) ? DesktopEntryText::NoGroup : m_text->group(group);
}

EntryDocument::Value EntryDocument::baseValue(std::string_view group, std::string_view key,
                                              std::string_view locale) const
{
    const DesktopEntryText::Key *const place = m_text->key(baseGroup(group), key, locale);
    return place ? Value(m_text->value(*place)) : std::nullopt;
}

EntryDocument::Value EntryDocument::value(std::string_view group, std::string_view key,
                                          std::string_view locale) const
{
    if (const auto *change = m_changes.find(group, key, locale))
        return change->value ? Value(*change->value) : std::nullopt;
    return baseValue(group, key, locale);
}

template <typename T>
std::optional<T> EntryDocument::read(std::string_view group, std::string_view key) const
{
    const Value bytes = value(group, key, {});
    return bytes ? decode<T>(*bytes) : std::nullopt;
}

template <typename T>
std::optional<T> EntryDocument::readLocal(std::string_view group, std::string_view key,
                                          std::string *locale) const
{
    const MessageLocale messages = MessageLocale::current();
    Value byRank[MessageLocale::BestRank + 1];
    const auto note = [&](const DesktopEntryText::Key &variant) {
        byRank[messages.rank(m_text->locale(variant))] = m_text->value(variant);
    };
    m_text->forEachVariant(baseGroup(group), key, note, messages.language());
    for (int rank = MessageLocale::BestRank; rank > 0; --rank) {
        if (!m_changes.isEmpty()) {
            const std::string wanted = messages.keyLocale(rank);
            if (const auto *change = wanted.empty() ? nullptr : m_changes.find(group, key, wanted))
                byRank[rank] = change->value ? Value(*change->value) : std::nullopt;
        }
        // A variant that is spoiled does not stand in the way of a less exact one.
        auto result = byRank[rank] ? decode<T>(*byRank[rank]) : std::nullopt;
        if (!result)
            continue;
        if (locale)
            *locale = messages.keyLocale(rank);
        return result;
    }
    return std::nullopt;
}

template <typename T>
void EntryDocument::write(std::string_view group, std::string_view key, std::string_view locale,
                          const T &value)
{
    const Value base = baseValue(group, key, locale);
    const bool asInFile = value.isEmpty() ? !base : base && decode<T>(*base) == value;
    if (asInFile)
        m_changes.drop(group, key, locale);
    else
        m_changes.set({std::string(group), std::string(key), std::string(locale),
                       value.isEmpty() ? std::nullopt : std::make_optional(encode(value))});
}

template <typename T>
void EntryDocument::writeLocal(std::string_view group, std::string_view key, const T &value)
{
    std::string locale;
    const auto now = readLocal<T>(group, key, &locale);
    if (now.value_or(T()) == value)
        return;
    if (!now)
        locale = velLanguageCode();
    write(group, key, locale, value);
}

bool EntryDocument::has(std::string_view group, std::string_view key) const
{
    return value(group, key, {}).has_value();
}

QString EntryDocument::text(std::string_view group, std::string_view key) const
{
    return read<QString>(group, key).value_or(QString());
}

QString EntryDocument::localText(std::string_view group, std::string_view key) const
{
    return readLocal<QString>(group, key).value_or(QString());
}

QStringList EntryDocument::list(std::string_view group, std::string_view key) const
{
    return read<QStringList>(group, key).value_or(QStringList());
}

QStringList EntryDocument::localList(std::string_view group, std::string_view key) const
{
    return readLocal<QStringList>(group, key).value_or(QStringList());
}

bool EntryDocument::flag(std::string_view group, std::string_view key) const
{
    const Value bytes = value(group, key, {});
    return bytes && DesktopEntryValue::toFlag(*bytes);
}

void EntryDocument::setText(std::string_view group, std::string_view key, const QString &value)
{
    if (text(group, key) != value)
        write(group, key, {}, value);
}

void EntryDocument::setLocalText(std::string_view group, std::string_view key, const QString &value)
{
    writeLocal(group, key, value);
}

void EntryDocument::setList(std::string_view group, std::string_view key, const QStringList &value)
{
    const QStringList items = withoutEmpty(value);
    if (list(group, key) != items)
        write(group, key, {}, items);
}

void EntryDocument::setLocalList(std::string_view group, std::string_view key, const QStringList &value)
{
    writeLocal(group, key, withoutEmpty(value));
}

void EntryDocument::setFlag(std::string_view group, std::string_view key, bool value)
{
    if (flag(group, key) == value)
        return;
    const Value base = baseValue(group, key, {});
    if (base ? DesktopEntryValue::toFlag(*base) == value : !value)
        m_changes.drop(group, key, {});
    else
        m_changes.set({std::string(group), std::string(key), {}, std::string(value ? "true" : "false")});
}

bool EntryDocument::hasGroup(std::string_view group) const
{
    if (baseGroup(group) != DesktopEntryText::NoGroup)
        return true;
    for (const auto &change : m_changes.all()) {
        if (change.value && change.group == group)
            return true;
    }
    return false;
}

void EntryDocument::removeKey(std::string_view group, std::string_view key)
{
    std::unordered_set<std::string> locales{std::string()};
    m_text->forEachVariant(baseGroup(group), key, [&](const DesktopEntryText::Key &variant) {
        locales.emplace(m_text->locale(variant));
    });
    for (const auto &change : m_changes.all()) {
        if (change.group == group && change.key == key)
            locales.insert(change.locale);
    }
    for (const std::string &locale : locales) {
        if (baseValue(group, key, locale))
            m_changes.set({std::string(group), std::string(key), locale, std::nullopt});
        else
            m_changes.drop(group, key, locale);
    }
}

void EntryDocument::removeGroups(const std::unordered_set<std::string> &groups)
{
    m_changes.removeGroups(groups);
}

std::vector<EntryDocument::Entry> EntryDocument::entries() const
{
    std::vector<Entry> entries;
    std::unordered_map<std::string, std::size_t> known;
    const auto add = [&](std::string_view group, std::string_view key, std::string_view locale,
                         std::string_view value) {
        const std::string place = std::string(group) + '\n' + std::string(key) + '\n' + std::string(locale);
        const auto [found, isNew] = known.emplace(place, entries.size());
        if (isNew)
            entries.push_back(
                {std::string(group), std::string(key), std::string(locale), std::string(value)});
        else
            entries[found->second].value = value;
    };
    for (std::size_t i = 0; i < m_text->groups().size(); ++i) {
        const auto &group = m_text->groups()[i];
        const std::string_view name = m_text->groupName(group);
        if (baseGroup(name) != int(i))
            continue;
        for (std::uint32_t k = group.firstKey; k < group.endKey; ++k) {
            const auto &key = m_text->keys()[k];
            const auto *change = m_changes.find(name, m_text->keyName(key), m_text->locale(key));
            if (!change)
                add(name, m_text->keyName(key), m_text->locale(key), m_text->value(key));
            else if (change->value)
                add(name, change->key, change->locale, *change->value);
        }
    }
    for (const auto &change : m_changes.all()) {
        if (change.value)
            add(change.group, change.key, change.locale, *change.value);
    }
    return entries;
}

void EntryDocument::inheritFrom(const EntryDocument &other)
{
    namespace Names = DesktopEntryNames;
    std::unordered_set<std::string> actions;
    if (!has(Names::MainGroup, Names::Actions)) {
        for (const QString &id : other.list(Names::MainGroup, Names::Actions))
            actions.insert(Names::actionGroup(id.toStdString()));
    }
    std::vector<Entry> taken;
    for (Entry &entry : other.entries()) {
        if (Names::isActionGroup(entry.group) && actions.count(entry.group) == 0)
            continue;
        if (has(entry.group, entry.key))
            continue;
        if (!entry.locale.empty()
            && (!other.has(entry.group, entry.key) || value(entry.group, entry.key, entry.locale)))
            continue;
        taken.push_back(std::move(entry));
    }
    for (Entry &entry : taken)
        m_changes.set(
            {std::move(entry.group), std::move(entry.key), std::move(entry.locale), std::move(entry.value)});
    m_valid = m_valid || (other.m_valid && !taken.empty());
}

bool EntryDocument::save()
{
    if (m_path.isEmpty())
        return false;
    const std::lock_guard<std::mutex> lock(savingMutex());
    const QByteArray target = AtomicFile::target(m_path);
    if (target.isEmpty())
        return false;

    struct stat status;
    const bool exists = ::stat(target.constData(), &status) == 0;
    if (!exists && errno != ENOENT)
        return false;
    // A file that is gone is written whole, and so is one that this text did not come from.
    if (!exists || (m_read && !isFromPath()))
        return replace(target, DesktopEntryWriter::apply(*m_text, m_changes));
    if (m_changes.isEmpty())
        return true;

    auto text = m_text;
    if (!isFromPath() || !m_settled || FileStamp(status) != m_stamp) {
        // Somebody else may have written meanwhile: our changes go into what stands there now.
        const auto file = EntryFile::readAnew(target);
        if (!file)
            return false;
        if (file->text->bytes() != text->bytes())
            text = file->text;
    }
    return replace(target, DesktopEntryWriter::apply(*text, m_changes));
}

bool EntryDocument::replace(const QByteArray &target, const QByteArray &bytes)
{
    // A larger one could not be read again.
    if (bytes.size() > EntryFile::LargestSize)
        return false;
    const auto stamp = AtomicFile::replace(target, {bytes.constData(), std::size_t(bytes.size())});
    if (!stamp)
        return false;
    m_text = std::make_shared<DesktopEntryText>(bytes);
    m_stamp = *stamp;
    m_settled = false;
    m_read = true;
    m_textPath = m_path;
    m_changes = {};
    return true;
}
