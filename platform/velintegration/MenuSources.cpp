// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuSources.h"

#include <algorithm>
#include <cctype>
#include <utility>

namespace {

constexpr std::string_view Heading =
    "# What the entries of the start menu beside this file were made from. By it an update of the menu\n"
    "# tells what was edited, moved or deleted. Without it nothing is lost, and what was deleted from\n"
    "# the menu may come back once.\n"
    "version 1\n";
constexpr std::string_view Digits = "0123456789abcdef";
constexpr std::string_view Nothing = "-";
constexpr std::size_t MostWords = 6; // of a line that is as it should be

bool standsAsIs(char c)
{
    const auto byte = static_cast<unsigned char>(c);
    return byte > ' ' && byte != 0x7f && c != '%';
}

// A word without blanks and control characters; "-" stands for no text at all.
std::string escaped(std::string_view text)
{
    if (text.empty())
        return std::string(Nothing);
    std::string result;
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        if (standsAsIs(c) && !(c == '-' && text.size() == 1)) {
            result += c;
            continue;
        }
        result += '%';
        result += Digits[byte >> 4];
        result += Digits[byte & 15];
    }
    return result;
}

int digit(char c)
{
    const std::size_t value = Digits.find(c);
    return value == std::string_view::npos ? -1 : int(value);
}

std::optional<std::string> unescaped(std::string_view word)
{
    if (word == Nothing)
        return std::string();
    // Nearly every word. Those of a menu with hundreds of entries are read at each look at it.
    if (!word.empty() && std::all_of(word.begin(), word.end(), standsAsIs))
        return std::string(word);
    std::string result;
    for (std::size_t i = 0; i < word.size(); ++i) {
        if (word[i] != '%') {
            result += word[i];
            continue;
        }
        if (i + 2 >= word.size())
            return {};
        const int high = digit(word[i + 1]);
        const int low = digit(word[i + 2]);
        if (high < 0 || low < 0 || high + low == 0)
            return {};
        result += char(high * 16 + low);
        i += 2;
    }
    // Nothing stands there in another way than it is written.
    if (escaped(result) != word)
        return {};
    return result;
}

std::string lineOf(std::initializer_list<std::string_view> words)
{
    std::string line;
    for (const std::string_view word : words)
        line += (line.empty() ? "" : " ") + escaped(word);
    return line + '\n';
}

std::string_view taken(std::string_view *text, char end)
{
    const std::size_t length = std::min(text->find(end), text->size());
    const std::string_view part = text->substr(0, length);
    text->remove_prefix(std::min(length + 1, text->size()));
    return part;
}

// The words of a line; none for a line that was not written by lineOf().
std::optional<std::vector<std::string>> wordsOf(std::string_view line)
{
    std::vector<std::string> words;
    words.reserve(MostWords);
    while (!line.empty()) {
        std::optional<std::string> word = unescaped(taken(&line, ' '));
        if (!word)
            return {};
        words.push_back(std::move(*word));
    }
    return words;
}

bool isDigest(std::string_view text)
{
    const auto isDigit = [](char c) { return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f'); };
    return !text.empty() && std::all_of(text.begin(), text.end(), isDigit);
}

bool isVersion(const MenuSources::Version &version)
{
    return MenuSources::isPlace(version.place) && isDigest(version.digest);
}

bool isNone(const MenuSources::Version &version)
{
    return version.place.empty() && version.digest.empty();
}

bool readEntry(const std::vector<std::string> &words, MenuSources *sources)
{
    MenuSources::Entry entry;
    entry.isChanging = words.front() == "change";
    if (words.size() != (entry.isChanging ? 6U : 4U) || words.back().empty())
        return false;
    entry.made = {words[1], words[2]};
    if (entry.isChanging)
        entry.next = {words[3], words[4]};
    const bool isSound = entry.isChanging
        ? (isVersion(entry.made) && (isVersion(entry.next) || isNone(entry.next)))
            || (isNone(entry.made) && isVersion(entry.next))
        : isVersion(entry.made);
    if (!isSound)
        return false;
    // They were written in this order.
    const std::size_t known = sources->entries.size();
    sources->entries.emplace_hint(sources->entries.end(), words.back(), std::move(entry));
    return sources->entries.size() > known;
}

bool isFolderName(std::string_view name)
{
    return !name.empty() && name.front() != '.' && name.find('/') == std::string_view::npos;
}

bool readFact(const std::vector<std::string> &words, MenuSources *sources)
{
    const std::string &kind = words.front();
    if (kind == "entry" || kind == "change")
        return readEntry(words, sources);
    if (kind == "environment" && words.size() == 3) {
        sources->environment = words[1];
        sources->searchPath = words[2];
        return true;
    }
    if (kind == "looked" && words.size() == 4) {
        sources->stamps.push_back({words[3], words[1], words[2]});
        return true;
    }
    return kind == "folder" && words.size() == 3 && isFolderName(words[2]) && isDigest(words[1])
        && sources->folders.emplace(words[2], words[1]).second;
}

} // namespace

bool MenuSources::isPlace(std::string_view place)
{
    const std::size_t middle = place.find('/');
    return middle != std::string_view::npos && isFolderName(place.substr(0, middle))
        && isFolderName(place.substr(middle + 1));
}

std::string MenuSources::toText() const
{
    std::string text(Heading);
    text += lineOf({"environment", environment, searchPath});
    for (const FolderStamp &stamp : stamps)
        text += lineOf({"looked", stamp.times, stamp.contents, stamp.path});
    for (const auto &[folder, digest] : folders)
        text += lineOf({"folder", digest, folder});
    for (const auto &[id, entry] : entries) {
        text += entry.isChanging
            ? lineOf({"change", entry.made.place, entry.made.digest, entry.next.place, entry.next.digest, id})
            : lineOf({"entry", entry.made.place, entry.made.digest, id});
    }
    return text;
}

std::optional<MenuSources> MenuSources::fromText(std::string_view text)
{
    if (text.substr(0, Heading.size()) != Heading || text.back() != '\n')
        return {};
    text.remove_prefix(Heading.size());
    MenuSources sources;
    while (!text.empty()) {
        const std::optional<std::vector<std::string>> words = wordsOf(taken(&text, '\n'));
        if (!words || words->empty() || !readFact(*words, &sources))
            return {};
    }
    return sources;
}
