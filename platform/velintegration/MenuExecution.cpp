// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuExecution.h"

#include "CategoryFolder.h"
#include "ContentsDigest.h"
#include "MenuCategories.h"
#include "MenuFile.h"
#include "MenuOrder.h"
#include "ShownNameOrder.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QFile>

#include <algorithm>
#include <cerrno>

namespace fs = std::filesystem;

namespace {

std::string folderOf(const std::string &place)
{
    return place.substr(0, place.find('/'));
}

std::string nameOf(const std::string &place)
{
    return place.substr(place.find('/') + 1);
}

QString decoded(const std::string &name)
{
    return QFile::decodeName(name.c_str());
}

QStringList decoded(const std::set<std::string> &names)
{
    QStringList list;
    for (const std::string &name : names)
        list.append(decoded(name));
    return list;
}

// By the names that are shown. What is no entry has no place of its own.
class EntryOrder
{
public:
    explicit EntryOrder(const fs::path &folder)
        : m_folder(decoded(folder.string()) + QLatin1Char('/'))
    {
    }

    bool isBefore(const QString &name, const QString &other)
    {
        return other.endsWith(QLatin1String(".desktop"))
            && m_order.isBefore(shownName(name), QFile::encodeName(name).toStdString(), shownName(other),
                                QFile::encodeName(other).toStdString());
    }

private:
    const QString &shownName(const QString &name)
    {
        const auto known = m_names.find(name);
        if (known != m_names.end())
            return known->second;
        return m_names[name] = shownNameOf(VelUIDesktopEntry(m_folder + name));
    }

    QString m_folder;
    ShownNameOrder m_order;
    std::map<QString, QString> m_names;
};

int placeOfCategory(const QString &name)
{
    const QVector<MenuCategory> &all = menuCategories();
    const auto found = std::find_if(all.begin(), all.end(), [&name](const MenuCategory &category) {
        return name == QLatin1String(category.folder);
    });
    return found == all.end() ? -1 : int(found - all.begin());
}

bool isCategoryBefore(const QString &name, const QString &other)
{
    return placeOfCategory(name) < placeOfCategory(other);
}

} // namespace

MenuExecution::MenuExecution(const fs::path &menu, const MenuPlan &plan,
                             const std::vector<MenuApplication> &applications, MenuSources *sources)
    : m_menu(menu)
    , m_plan(plan)
    , m_sources(sources)
{
    for (const MenuApplication &application : applications)
        m_applications[application.id] = &application;
    m_sources->entries.clear();
    for (const auto &[id, version] : plan.remembered)
        m_sources->entries[id] = {version, {}, false};
    adoptFolders();
}

bool MenuExecution::isNeeded() const
{
    return !m_plan.steps.empty() || !m_plan.begun.empty();
}

// A folder that looks like a new one is as good as ours; one that went is none any more.
void MenuExecution::adoptFolders()
{
    for (const MenuCategory &category : menuCategories()) {
        const CategoryFolder folder(m_menu, category.folder);
        if (!folder.exists())
            m_sources->folders.erase(category.folder);
        else if (m_sources->folders.count(category.folder) == 0 && folder.digest() == folder.newDigest())
            m_sources->folders[category.folder] = folder.newDigest();
    }
}

bool MenuExecution::run(const Save &save)
{
    MenuSources begun = *m_sources;
    for (const MenuStep &step : m_plan.steps)
        begun.entries[step.id] = {step.from, step.to, true};
    if (!m_plan.steps.empty() && !save(begun))
        return false;
    for (const std::string &place : m_plan.placed)
        m_children[folderOf(place)].come.insert(nameOf(place));
    for (const std::string &place : m_plan.vacated)
        m_children[folderOf(place)].gone.insert(nameOf(place));
    removeLeftovers();
    makeFolders();
    for (const MenuStep &step : m_plan.steps)
        m_isDone = carryOut(step) && m_isDone;
    updateOrders();
    removeFolders();
    updateRootOrder();
    errno = m_reason;
    return m_isDone;
}

// What is done is done; of what is not, the first reason is told.
bool MenuExecution::noted(bool isDone)
{
    if (!isDone && m_reason == 0)
        m_reason = errno;
    return isDone;
}

void MenuExecution::removeLeftovers()
{
    for (const MenuSources::Version &leftover : m_plan.leftovers) {
        m_hasChanged = MenuFile::remove(m_menu / leftover.place, leftover.digest) || m_hasChanged;
        m_children[folderOf(leftover.place)].gone.insert(nameOf(leftover.place));
    }
}

void MenuExecution::makeFolders()
{
    std::set<std::string> wanted;
    for (const MenuStep &step : m_plan.steps) {
        if (!step.to.place.empty())
            wanted.insert(folderOf(step.to.place));
    }
    const fs::path record = menuFolderRecord(m_menu);
    std::error_code error;
    const bool isBare = fs::is_empty(m_menu, error) && !error;
    for (const std::string &folder : wanted) {
        if (!CategoryFolder(m_menu, folder).exists())
            makeFolder(folder);
    }
    if (!isBare)
        return;
    QStringList order = decoded(wanted);
    std::sort(order.begin(), order.end(), isCategoryBefore);
    MenuFile::add(record, {menuDirectoryEntry(menuRoot(), order).toStdString()});
}

void MenuExecution::makeFolder(const std::string &name)
{
    std::vector<const MenuStep *> steps;
    for (const MenuStep &step : m_plan.steps) {
        if (!step.to.place.empty() && folderOf(step.to.place) == name)
            steps.push_back(&step);
    }
    const ShownNameOrder order;
    std::sort(steps.begin(), steps.end(), [&](const MenuStep *left, const MenuStep *right) {
        return order.isBefore(m_applications.at(left->id)->shownName, left->to.place,
                              m_applications.at(right->id)->shownName, right->to.place);
    });
    QStringList names;
    for (const MenuStep *step : steps)
        names.append(decoded(nameOf(step->to.place)));
    const CategoryFolder folder(m_menu, name);
    errno = 0;
    if (!noted(folder.make(names)))
        return; // and none of these steps can be done
    m_sources->folders[name] = folder.newDigest();
    m_folders.come.insert(name);
    m_hasChanged = true;
}

bool MenuExecution::carryOut(const MenuStep &step)
{
    errno = 0;
    if (change(step)) {
        noteDone(step);
        return true;
    }
    const int reason = errno;
    // It is the user's now, who may have changed it just at this moment; else it stays to be done.
    const bool isTouched =
        !step.from.place.empty() && fileDigest(m_menu / step.from.place) != step.from.digest;
    if (step.from.place.empty())
        m_sources->entries.erase(step.id);
    else
        m_sources->entries[step.id] = {step.from, {}, false};
    errno = reason;
    return noted(isTouched);
}

bool MenuExecution::change(const MenuStep &step) const
{
    const fs::path from = m_menu / step.from.place;
    if (step.to.place.empty())
        return MenuFile::remove(from, step.from.digest);
    const fs::path to = m_menu / step.to.place;
    MenuFile::Contents contents;
    if (!MenuFile::read(step.source, &contents) || contentsDigest(contents.bytes) != step.to.digest)
        return false;
    if (step.from.place.empty())
        return MenuFile::add(to, contents);
    return step.from.place == step.to.place ? MenuFile::replace(to, step.from.digest, contents.bytes)
                                            : MenuFile::move(from, step.from.digest, to, contents);
}

void MenuExecution::noteDone(const MenuStep &step)
{
    m_hasChanged = true;
    if (step.to.place.empty())
        m_sources->entries.erase(step.id);
    else
        m_sources->entries[step.id] = {step.to, {}, false};
    if (step.from.place == step.to.place)
        return;
    if (!step.from.place.empty())
        m_children[folderOf(step.from.place)].gone.insert(nameOf(step.from.place));
    if (!step.to.place.empty())
        m_children[folderOf(step.to.place)].come.insert(nameOf(step.to.place));
}

void MenuExecution::updateOrders()
{
    for (const auto &[name, children] : m_children) {
        const fs::path folder = m_menu / name;
        EntryOrder order(folder);
        const auto isBefore = [&order](const QString &left, const QString &right) {
            return order.isBefore(left, right);
        };
        errno = 0;
        m_isDone = noted(MenuOrder::update(folder, decoded(children.gone), decoded(children.come), isBefore))
            && m_isDone;
    }
}

void MenuExecution::removeFolders()
{
    std::set<std::string> emptied = m_plan.made;
    for (const auto &[name, children] : m_children) {
        if (!children.gone.empty())
            emptied.insert(name);
    }
    for (const std::string &name : emptied) {
        const auto ours = m_sources->folders.find(name);
        if (ours == m_sources->folders.end() || !CategoryFolder(m_menu, name).removeIfEmpty(ours->second))
            continue;
        m_sources->folders.erase(ours);
        m_folders.gone.insert(name);
    }
}

void MenuExecution::updateRootOrder()
{
    for (const std::string &name : m_plan.begun)
        (CategoryFolder(m_menu, name).exists() ? m_folders.come : m_folders.gone).insert(name);
    if (m_folders.gone.empty() && m_folders.come.empty())
        return;
    errno = 0;
    m_isDone =
        noted(MenuOrder::update(m_menu, decoded(m_folders.gone), decoded(m_folders.come), isCategoryBefore))
        && m_isDone;
}
