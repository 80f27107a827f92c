// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MessageLocale.h"

#include <unistd.h>

#include <algorithm>
#include <cstring>
#include <iterator>
#include <vector>

namespace {

// By rank; the first that is set and not empty counts.
constexpr std::string_view Variables[] = {"LC_ALL=", "LC_MESSAGES=", "LANG="};

// The environment as it was when the locale was worked out from it.
class KnownEnvironment
{
public:
    /// Whether it is still that one: the same strings in the same places, and in those that count
    /// the same text. A look at the strings themselves would be ten times as much memory to read.
    bool isSame() const;
    /// The text of the locale in the environment of now, which is the known one from now on.
    std::string_view read();

private:
    struct Entry
    {
        const char *place = nullptr;
        std::string text;
    };

    std::vector<const char *> m_places; // with the null at the end; empty if nothing is known
    Entry m_entries[std::size(Variables)];
};

bool KnownEnvironment::isSame() const
{
    if (m_places.empty() || !::environ)
        return false;
    // Never beyond the end of a shorter one.
    for (std::size_t i = 0; ::environ[i] == m_places[i]; ++i) {
        if (!m_places[i])
            return std::all_of(std::begin(m_entries), std::end(m_entries),
                               [](const Entry &entry) { return !entry.place || entry.text == entry.place; });
    }
    return false;
}

std::string_view KnownEnvironment::read()
{
    m_places.clear();
    for (Entry &entry : m_entries)
        entry.place = nullptr;
    for (char **place = ::environ; place && *place; ++place) {
        m_places.push_back(*place);
        for (std::size_t i = 0; i < std::size(Variables); ++i) {
            Entry &entry = m_entries[i];
            const bool isEmpty = !entry.place || entry.text.size() == Variables[i].size();
            if (isEmpty && std::strncmp(*place, Variables[i].data(), Variables[i].size()) == 0)
                entry = {*place, *place};
        }
    }
    m_places.push_back(nullptr);
    for (std::size_t i = 0; i < std::size(Variables); ++i) {
        if (m_entries[i].place && m_entries[i].text.size() > Variables[i].size())
            return m_entries[i].place + Variables[i].size();
    }
    return {};
}

} // namespace

// This runs for every local value. Each thread knows the environment by itself, so none waits.
MessageLocale MessageLocale::current()
{
    thread_local KnownEnvironment environment;
    thread_local MessageLocale locale({});
    if (!environment.isSame())
        locale = MessageLocale(environment.read());
    return locale;
}

MessageLocale::MessageLocale(std::string_view text)
{
    const std::size_t at = text.find('@');
    if (at != std::string_view::npos) {
        m_modifier = text.substr(at);
        text = text.substr(0, at);
    }
    text = text.substr(0, text.find('.'));
    const std::size_t underscore = text.find('_');
    if (underscore != std::string_view::npos) {
        m_country = text.substr(underscore);
        text = text.substr(0, underscore);
    }
    m_language = text;
    if (m_language.empty() || m_language == "C" || m_language == "POSIX") {
        m_language = "en";
        m_country = {};
        m_modifier = {};
    }
}

int MessageLocale::rank(std::string_view keyLocale) const
{
    if (keyLocale.substr(0, m_language.size()) != m_language)
        return 0;
    std::string_view rest = keyLocale.substr(m_language.size());
    int rank = 1;
    if (!m_country.empty() && rest.substr(0, m_country.size()) == m_country) {
        rest.remove_prefix(m_country.size());
        rank += 2;
    }
    if (!m_modifier.empty() && rest == m_modifier)
        return rank + 1;
    return rest.empty() ? rank : 0;
}

std::string MessageLocale::keyLocale(int rank) const
{
    const bool country = rank >= 3;
    const bool modifier = rank == 2 || rank == 4;
    if ((country && m_country.empty()) || (modifier && m_modifier.empty()))
        return {};
    std::string locale(m_language);
    if (country)
        locale += m_country;
    if (modifier)
        locale += m_modifier;
    return locale;
}
