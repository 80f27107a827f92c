// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/language.h>

#include "environment.h"

#include <algorithm>
#include <iterator>

namespace {

constexpr char DefaultLanguage[] = "en";

// Desktop entries are translated by language; these are the customary exceptions.
const char *const ByCountry[] = {"en_GB", "pt_BR", "zh_CN", "zh_HK", "zh_TW"};
const char *const ByModifier[] = {"be@latin",          "ca@valencia", "sr@ijekavian",
                                  "sr@ijekavianlatin", "sr@latin",    "uz@cyrillic"};

// lang_COUNTRY.ENCODING@MODIFIER
struct Locale
{
    std::string language;
    std::string country;
    std::string modifier;
};

std::string messageLocale()
{
    for (const char *name : {"LC_ALL", "LC_MESSAGES", "LANG"}) {
        std::string value = variable(name);
        if (!value.empty())
            return value;
    }
    return {};
}

Locale parsed(std::string text)
{
    Locale locale;
    const std::size_t at = text.find('@');
    if (at != std::string::npos) {
        locale.modifier = text.substr(at + 1);
        text.resize(at);
    }
    text = text.substr(0, text.find('.'));
    const std::size_t underscore = text.find('_');
    if (underscore != std::string::npos)
        locale.country = text.substr(underscore + 1);
    locale.language = text.substr(0, underscore);
    return locale;
}

bool isLanguage(const std::string &text)
{
    return text.size() >= 2 && std::all_of(text.begin(), text.end(), [](char c) {
               return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
           });
}

template <std::size_t Size>
bool contains(const char *const (&codes)[Size], const std::string &code)
{
    return std::any_of(std::begin(codes), std::end(codes),
                       [&code](const char *known) { return code == known; });
}

} // namespace

std::string velLanguageCode()
{
    const Locale locale = parsed(messageLocale());
    if (!isLanguage(locale.language) || locale.language == "POSIX")
        return DefaultLanguage;
    std::string withModifier = locale.language + "@" + locale.modifier;
    if (contains(ByModifier, withModifier))
        return withModifier;
    const std::string withCountry = locale.language + "_" + locale.country;
    return contains(ByCountry, withCountry) ? withCountry : locale.language;
}
