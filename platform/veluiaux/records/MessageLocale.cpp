// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MessageLocale.h"

#include <unistd.h>

#include <cstring>
#include <iterator>

namespace {

// By rank; the first that is set and not empty counts.
constexpr std::string_view Variables[] = {"LC_ALL=", "LC_MESSAGES=", "LANG="};

} // namespace

MessageLocale MessageLocale::current()
{
    // One walk over the environment instead of three: this runs for every local value.
    std::string_view values[std::size(Variables)];
    for (char **entry = ::environ; entry && *entry; ++entry) {
        if ((*entry)[0] != 'L' || ((*entry)[1] != 'C' && (*entry)[1] != 'A'))
            continue;
        for (std::size_t i = 0; i < std::size(Variables); ++i) {
            const std::string_view name = Variables[i];
            if (values[i].empty() && std::strncmp(*entry, name.data(), name.size()) == 0)
                values[i] = *entry + name.size();
        }
    }
    for (const std::string_view value : values) {
        if (!value.empty())
            return MessageLocale(value);
    }
    return MessageLocale({});
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
