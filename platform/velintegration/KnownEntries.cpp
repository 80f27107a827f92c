// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KnownEntries.h"

#include "MenuCategories.h"

#include <set>

namespace {

using Version = MenuSources::Version;
using Keys = std::vector<std::string>;

std::string ownPlace(const MenuApplication &application, const std::string &name)
{
    return menuCategories().at(application.category).folder + ('/' + name);
}

// What two contents have in common that name and do the same.
std::string purpose(const QString &name, const QString &exec)
{
    return exec.isEmpty() ? std::string() : (name + QLatin1Char('\n') + exec).toStdString();
}

class Search
{
public:
    Search(const std::vector<MenuApplication> &applications, const MenuSnapshot &menu)
        : m_applications(applications)
        , m_menu(menu)
    {
    }

    void takeOwnPlaces()
    {
        for (const MenuApplication &application : m_applications) {
            const Version own = KnownEntries::inOwnPlace(application, m_menu);
            if (!own.place.empty() && m_claimed.insert(own.place).second)
                m_found[application.id] = own;
        }
    }

    // Those that have a key in common with an entry that is nobody's yet.
    template <typename KeyOfEntry, typename KeysOfApplication>
    void takeTouched(KeyOfEntry keyOf, KeysOfApplication keysOf)
    {
        std::multimap<std::string, std::string> places;
        for (const auto &[place, file] : m_menu.files)
            places.emplace(keyOf(place, file), place);
        for (const MenuApplication &application : m_applications) {
            if (m_found.count(application.id) == 0 && claim(places, keysOf(application)))
                takeAsTouched(application);
        }
    }

    void takeAllAsTouched()
    {
        for (const MenuApplication &application : m_applications) {
            if (m_found.count(application.id) == 0)
                takeAsTouched(application);
        }
    }

    const std::map<std::string, Version> &found() const { return m_found; }

private:
    bool claim(const std::multimap<std::string, std::string> &places, const Keys &keys)
    {
        for (const std::string &key : keys) {
            const auto [begin, end] = places.equal_range(key);
            for (auto it = begin; !key.empty() && it != end; ++it) {
                if (m_claimed.insert(it->second).second)
                    return true;
            }
        }
        return false;
    }

    // With a place where no entry of these bytes stands.
    void takeAsTouched(const MenuApplication &application)
    {
        std::string place = ownPlace(application, application.id);
        for (auto file = m_menu.files.find(place);
             file != m_menu.files.end() && file->second.digest == application.digest;
             file = m_menu.files.find(place))
            place += '-';
        m_found[application.id] = {place, application.digest};
    }

    const std::vector<MenuApplication> &m_applications;
    const MenuSnapshot &m_menu;
    std::set<std::string> m_claimed;
    std::map<std::string, Version> m_found;
};

} // namespace

MenuSources::Version KnownEntries::inOwnPlace(const MenuApplication &application, const MenuSnapshot &menu)
{
    for (const std::string &name : {application.id, application.fileName}) {
        const std::string place = ownPlace(application, name);
        const auto file = menu.files.find(place);
        if (file != menu.files.end() && file->second.digest == application.digest)
            return {place, application.digest};
    }
    return {};
}

std::map<std::string, MenuSources::Version> KnownEntries::find(
    const std::vector<MenuApplication> &applications, const MenuSnapshot &menu, Rest rest)
{
    using File = MenuSnapshot::File;
    Search search(applications, menu);
    search.takeOwnPlaces();
    search.takeTouched([](const std::string &, const File &file) { return file.digest; },
                       [](const MenuApplication &application) { return Keys{application.digest}; });
    search.takeTouched(
        [](const std::string &place, const File &) { return place.substr(place.rfind('/') + 1); },
        [](const MenuApplication &application) {
            return Keys{application.fileName, application.id};
        });
    search.takeTouched(
        [](const std::string &, const File &file) { return purpose(file.name, file.exec); },
        [](const MenuApplication &application) { return Keys{purpose(application.name, application.exec)}; });
    if (rest == Rest::Deleted)
        search.takeAllAsTouched();
    return search.found();
}
