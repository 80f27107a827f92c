// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDocument.h"

#include "DesktopEntryNames.h"
#include "DesktopEntryWriter.h"
#include "EntryFile.h"
#include "FileDescriptor.h"
#include "InheritedKeys.h"
#include "SharedTexts.h"

#include <DesktopEntryValue.h>
#include <velcore/folderlock.h>
#include <velcore/language.h>

#include <fcntl.h>

#include <algorithm>
#include <mutex>
#include <utility>

namespace {

// So often a save starts anew because another program was faster.
constexpr int MostAttempts = 10;

constexpr std::size_t UsualLine = 32; // bytes, rather less: to make more room costs more than to have some
constexpr std::size_t MostReserved = 1024;

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
    auto file = SharedTexts::instance().findOrRead(m_path, EntryFile::read);
    m_read = file.has_value();
    m_textPath = m_path;
    m_text = file ? std::move(file->text) : emptyText();
    m_stamp = file ? file->stamp : FileStamp();
    m_settled = file && file->settled;
    m_valid = m_text->group(DesktopEntryNames::MainGroup) != DesktopEntryText::NoGroup;
    return m_read;
}

template <typename T>
void EntryDocument::write(std::string_view group, std::string_view key, std::string_view locale,
                          const T &value)
{
    const auto base = this->group(group).base(key, locale);
    const bool asInFile = value.isEmpty() ? !base : base && DesktopEntryValue::decode<T>(*base) == value;
    if (asInFile)
        m_changes.drop(group, key, locale);
    else
        m_changes.set(
            {group, key, locale, value.isEmpty() ? std::nullopt : std::make_optional(encode(value))});
}

template <typename T>
void EntryDocument::writeLocal(std::string_view group, std::string_view key, const T &value)
{
    std::string locale;
    const auto now = this->group(group).readLocal<T>(key, &locale);
    if (now.value_or(T()) == value)
        return;
    if (!now)
        locale = velLanguageCode();
    write(group, key, locale, value);
}

bool EntryDocument::has(std::string_view group, std::string_view key) const
{
    return this->group(group).value(key).has_value();
}

QString EntryDocument::text(std::string_view group, std::string_view key, std::string_view language) const
{
    return this->group(group).text(key, language);
}

QString EntryDocument::localText(std::string_view group, std::string_view key) const
{
    return this->group(group).localText(key);
}

QStringList EntryDocument::list(std::string_view group, std::string_view key, std::string_view language) const
{
    return this->group(group).list(key, language);
}

QStringList EntryDocument::localList(std::string_view group, std::string_view key) const
{
    return this->group(group).localList(key);
}

bool EntryDocument::flag(std::string_view group, std::string_view key) const
{
    return this->group(group).flag(key);
}

QStringList EntryDocument::languages(std::string_view group, std::string_view key) const
{
    QStringList found;
    std::unordered_set<std::string_view> known;
    const auto add = [&](std::string_view language) {
        if (!language.empty() && known.insert(language).second)
            found.append(QString::fromUtf8(language.data(), int(language.size())));
    };
    m_text->forEachVariant(this->group(group).group(), key, [&](const DesktopEntryText::Key &line) {
        const auto *change = m_changes.find(group, key, m_text->locale(line));
        if (!change || change->value)
            add(m_text->locale(line));
    });
    for (const auto &change : m_changes.all()) {
        if (change.value && change.group() == group && change.key == key)
            add(change.locale);
    }
    return found;
}

QString EntryDocument::languageInForce(std::string_view group, std::string_view key) const
{
    std::string locale;
    this->group(group).readLocal<QString>(key, &locale);
    return QString::fromStdString(locale);
}

void EntryDocument::setText(std::string_view group, std::string_view key, const QString &value,
                            std::string_view language)
{
    if (text(group, key, language) != value)
        write(group, key, language, value);
}

void EntryDocument::setLocalText(std::string_view group, std::string_view key, const QString &value)
{
    writeLocal(group, key, value);
}

void EntryDocument::setList(std::string_view group, std::string_view key, const QStringList &value,
                            std::string_view language)
{
    const QStringList items = withoutEmpty(value);
    if (list(group, key, language) != items)
        write(group, key, language, items);
}

void EntryDocument::setLocalList(std::string_view group, std::string_view key, const QStringList &value)
{
    writeLocal(group, key, withoutEmpty(value));
}

void EntryDocument::setFlag(std::string_view group, std::string_view key, bool value)
{
    if (flag(group, key) == value)
        return;
    const auto base = this->group(group).base(key);
    if (base ? DesktopEntryValue::toFlag(*base) == value : !value)
        m_changes.drop(group, key, {});
    else
        m_changes.set(group, key, {}, value ? "true" : "false");
}

void EntryDocument::removeKey(std::string_view group, std::string_view key)
{
    std::unordered_set<std::string> inFile;
    m_text->forEachLine(this->group(group).group(), key,
                        [&](const DesktopEntryText::Key &line) { inFile.emplace(m_text->locale(line)); });
    m_changes.dropIf([&](const DesktopEntryChanges::Change &change) {
        return change.group() == group && change.key == key && inFile.count(change.locale) == 0;
    });
    for (const std::string &locale : inFile)
        m_changes.set({group, key, locale, std::nullopt});
}

void EntryDocument::removeGroups(const std::unordered_set<std::string> &groups)
{
    m_changes.removeGroups(groups);
}

void EntryDocument::restoreGroup(const std::string &group)
{
    m_changes.restoreGroup(group);
}

void EntryDocument::copyGroups(const std::unordered_map<std::string, std::string> &names)
{
    if (names.empty())
        return;
    std::unordered_set<std::string> taken;
    DesktopEntryChanges copies;
    forEachValue(
        [&](std::string_view group, std::string_view key, std::string_view locale, std::string_view value) {
            const auto name = names.find(*taken.emplace(group).first);
            if (name != names.end())
                copies.set(name->second, key, locale, value);
        });
    for (const auto &copy : copies.all()) {
        if (taken.count(copy.group()) == 0)
            m_changes.set(copy);
    }
}

template <typename Visitor>
void EntryDocument::forEachValue(Visitor visit) const
{
    for (std::size_t i = 0; i < m_text->groups().size(); ++i) {
        const auto &group = m_text->groups()[i];
        const std::string_view name = m_text->groupName(group);
        if (this->group(name).group() != int(i))
            continue;
        m_text->forEachKey(group, [&](const DesktopEntryText::Key &key) {
            const auto *change = m_changes.find(name, m_text->keyName(key), m_text->locale(key));
            if (!change)
                visit(name, m_text->keyName(key), m_text->locale(key), m_text->value(key));
            else if (change->value)
                visit(name, m_text->keyName(key), m_text->locale(key), std::string_view(*change->value));
        });
    }
    for (const auto &change : m_changes.all()) {
        if (change.value)
            visit(std::string_view(change.group()), std::string_view(change.key),
                  std::string_view(change.locale), std::string_view(*change.value));
    }
}

void EntryDocument::inheritFrom(const EntryDocument &other)
{
    InheritedKeys inherited({*m_text, m_changes}, {*other.m_text, other.m_changes});
    DesktopEntryChanges taken;
    // About as many as there are lines, within reason.
    taken.reserve(
        std::min(other.m_text->bytes().size() / UsualLine + other.m_changes.all().size(), MostReserved));
    other.forEachValue(
        [&](std::string_view group, std::string_view key, std::string_view locale, std::string_view value) {
            if (inherited.has(group, key, locale))
                taken.set(group, key, locale, value);
        });
    m_valid = m_valid || (other.m_valid && !taken.isEmpty());
    m_changes.add(std::move(taken));
}

QByteArray EntryDocument::contents() const
{
    return DesktopEntryWriter::apply(*m_text, m_changes);
}

bool EntryDocument::save()
{
    if (m_path.isEmpty())
        return false;
    const std::lock_guard<std::mutex> lock(savingMutex());
    // Taken only when the new file is on disk: nobody else waits for that. When another program was
    // faster, all is done once more, now with the lock.
    LockedFolder locked;
    auto outcome = Outcome::Overtaken;
    for (int attempt = 1; outcome == Outcome::Overtaken; ++attempt) {
        const auto target = AtomicFile::find(m_path);
        outcome = target ? replace(*target, &locked, attempt == MostAttempts) : Outcome::Failed;
    }
    return outcome == Outcome::Saved;
}

EntryDocument::Outcome EntryDocument::replace(const AtomicFile::Target &target, LockedFolder *locked,
                                              bool isLast)
{
    // A file that is gone or was emptied is written whole, and so is one that this text did not come
    // from.
    const bool isEmptied = target.exists && target.status.st_size == 0 && !m_text->bytes().empty();
    const bool isWhole = !target.exists || isEmptied || (m_read && !isFromPath());
    if (!isWhole && m_changes.isEmpty())
        return Outcome::Saved;
    const bool isKnown = isWhole || (isFromPath() && m_settled && FileStamp(target.status) == m_stamp);
    // Somebody else may have written meanwhile: our changes go into what stands there now. It stays
    // open until the end, so that no later file can look like this one.
    const FileDescriptor file(isKnown ? -1 : EntryFile::open(target.path, O_NOFOLLOW));
    const auto now = isKnown ? FileText{m_text, FileStamp(target.status)} : EntryFile::readOpen(file.get());
    if (!now)
        return Outcome::Failed;
    if (!(now->stamp == FileStamp(target.status)) && !isLast)
        return Outcome::Overtaken;
    const bool isSame = isKnown || now->text->bytes() == m_text->bytes(); // then ours has its index already
    return replace(target, DesktopEntryWriter::apply(isSame ? *m_text : *now->text, m_changes), locked,
                   isLast);
}

EntryDocument::Outcome EntryDocument::replace(const AtomicFile::Target &target, const QByteArray &bytes,
                                              LockedFolder *locked, bool isLast)
{
    // A larger one could not be read again.
    if (bytes.size() > EntryFile::LargestSize)
        return Outcome::Failed;
    AtomicFile::Replacement replacement(target, {bytes.constData(), std::size_t(bytes.size())});
    if (!replacement.isReady())
        return Outcome::Failed;
    // Whoever was faster while this waited in vain has got on: then it is worth waiting again.
    if (!*locked && Vel::lockFolder(target.folder->get()))
        *locked = target.folder;
    if (!isLast && !AtomicFile::isUnchanged(target))
        return Outcome::Overtaken;
    if (!replacement.commit())
        return Outcome::Failed;
    SharedTexts::instance().remove(m_path);
    m_text = std::make_shared<DesktopEntryText>(bytes);
    // So young a file could change without getting another stamp.
    m_settled = false;
    m_read = true;
    m_textPath = m_path;
    m_changes = {};
    return Outcome::Saved;
}
