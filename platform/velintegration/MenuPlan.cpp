// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuPlan.h"

#include "KnownEntries.h"
#include "MenuCategories.h"

namespace {

using Version = MenuSources::Version;

bool stands(const MenuSnapshot &menu, const Version &version)
{
    const auto found = menu.files.find(version.place);
    return found != menu.files.end() && !version.digest.empty() && found->second.digest == version.digest;
}

bool isTaken(const MenuSnapshot &menu, const std::string &place)
{
    return menu.names.count(place) != 0;
}

std::string folderOf(const std::string &place)
{
    return place.substr(0, place.find('/'));
}

std::string folderOf(const MenuApplication &application)
{
    return menuCategories().at(application.category).folder;
}

class Planner
{
public:
    Planner(const std::vector<MenuApplication> &applications, const MenuSnapshot &menu)
        : m_menu(menu)
    {
        for (const MenuApplication &application : applications)
            m_applications.emplace(application.id, &application);
    }

    void remember(const std::string &id, const Version &version)
    {
        m_plan.remembered[id] = version;
        m_reserved.insert(version.place);
    }

    // A name that gets free counts as taken: no step depends on another one.
    MenuPlan plan()
    {
        const std::map<std::string, Version> remembered = m_plan.remembered;
        for (const auto &[id, version] : remembered)
            follow(id, version);
        for (const auto &[id, application] : m_applications) {
            if (remembered.count(id) == 0)
                add(*application);
        }
        return m_plan;
    }

private:
    void follow(const std::string &id, const Version &version)
    {
        const auto found = m_applications.find(id);
        if (found == m_applications.end()) {
            if (stands(m_menu, version))
                m_plan.steps.push_back({id, version, {}, {}});
            return;
        }
        const MenuApplication &application = *found->second;
        // As the application has it, it is untouched, whoever wrote it.
        Version now = {version.place, application.digest};
        if (!stands(m_menu, now))
            now = version;
        m_plan.remembered[id] = now;
        if (!stands(m_menu, now))
            return;
        if (folderOf(now.place) != folderOf(application))
            m_plan.steps.push_back({id, now, {freePlace(application), application.digest}, application.path});
        else if (now.digest != application.digest)
            m_plan.steps.push_back({id, now, {now.place, application.digest}, application.path});
    }

    void add(const MenuApplication &application)
    {
        const Version own = KnownEntries::inOwnPlace(application, m_menu);
        if (!own.place.empty() && m_reserved.count(own.place) == 0)
            remember(application.id, own);
        else
            m_plan.steps.push_back(
                {application.id, {}, {freePlace(application), application.digest}, application.path});
    }

    // The name of its file, else its id, else that with a number.
    std::string freePlace(const MenuApplication &application)
    {
        const std::string folder = folderOf(application) + '/';
        const std::string stem = application.id.substr(0, application.id.rfind('.'));
        std::string place = folder + application.fileName;
        if (!isFree(place))
            place = folder + application.id;
        for (int i = 2; !isFree(place); ++i)
            place = folder + stem + '-' + std::to_string(i) + ".desktop";
        m_reserved.insert(place);
        return place;
    }

    bool isFree(const std::string &place) const
    {
        return !isTaken(m_menu, place) && m_reserved.count(place) == 0;
    }

    const MenuSnapshot &m_menu;
    std::map<std::string, const MenuApplication *> m_applications;
    std::set<std::string> m_reserved; // places that somebody's entry has or had
    MenuPlan m_plan;
};

// What a killed update began: how far each of its changes came, and what is left to do.
class Ending
{
public:
    explicit Ending(const MenuSnapshot &menu)
        : m_menu(menu)
    {
    }

    MenuPlan plan(const MenuSources &memory)
    {
        for (const auto &[id, entry] : memory.entries) {
            const std::optional<Version> version = entry.isChanging ? outcome(entry) : entry.made;
            if (version)
                m_plan.remembered[id] = *version;
            for (const Version *begun : {&entry.made, &entry.next}) {
                if (entry.isChanging && !begun->place.empty())
                    note(folderOf(begun->place), memory);
            }
        }
        return m_plan;
    }

private:
    void note(const std::string &folder, const MenuSources &memory)
    {
        m_plan.begun.insert(folder);
        if (memory.folders.count(folder) == 0)
            m_plan.made.insert(folder);
    }

    // What to remember of a change, if anything.
    std::optional<Version> outcome(const MenuSources::Entry &entry)
    {
        const bool isDone = !entry.next.place.empty() && stands(m_menu, entry.next);
        const bool isUndone = !entry.made.place.empty() && stands(m_menu, entry.made);
        if (isDone) {
            m_plan.placed.insert(entry.next.place);
            if (isUndone && entry.made.place != entry.next.place)
                m_plan.leftovers.push_back(entry.made);
            else if (!entry.made.place.empty() && entry.made.place != entry.next.place)
                m_plan.vacated.insert(entry.made.place);
            return entry.next;
        }
        if (isUndone)
            return entry.made;
        return outcomeOfTouched(entry);
    }

    // Neither the old nor the new entry stands there.
    std::optional<Version> outcomeOfTouched(const MenuSources::Entry &entry)
    {
        const bool wasRemoved = entry.next.place.empty() && !isTaken(m_menu, entry.made.place);
        if (wasRemoved)
            m_plan.vacated.insert(entry.made.place);
        const bool wasNotMade = entry.made.place.empty() && !isTaken(m_menu, entry.next.place);
        if (wasRemoved || wasNotMade)
            return {};
        const bool isNext = !entry.next.place.empty() && isTaken(m_menu, entry.next.place);
        return isNext || entry.made.place.empty() ? entry.next : entry.made;
    }

    const MenuSnapshot &m_menu;
    MenuPlan m_plan;
};

} // namespace

MenuPlan MenuPlan::ending(const MenuSources &memory, const MenuSnapshot &menu)
{
    return Ending(menu).plan(memory);
}

MenuPlan MenuPlan::of(const std::optional<MenuSources> &memory,
                      const std::vector<MenuApplication> &applications, const MenuSnapshot &menu)
{
    Planner planner(applications, menu);
    if (memory) {
        for (const auto &[id, entry] : memory->entries)
            planner.remember(id, entry.made);
    } else {
        // A menu without any folder of ours was not made of the applications.
        const bool isOwn = menu.folders.empty() && !menu.isEmpty;
        const auto rest = isOwn ? KnownEntries::Rest::Deleted : KnownEntries::Rest::Missing;
        for (const auto &[id, version] : KnownEntries::find(applications, menu, rest))
            planner.remember(id, version);
    }
    return planner.plan();
}
