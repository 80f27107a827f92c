// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuOrder.h"

#include "ContentsDigest.h"
#include "MenuCategories.h"
#include "MenuFile.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QFile>

#include <algorithm>
#include <sstream>

namespace fs = std::filesystem;

namespace {

// So often a change starts anew because another program was faster.
constexpr int MostAttempts = 10;

bool isChild(const QString &element)
{
    return !element.contains(QLatin1Char('*'));
}

QStringList updated(QStringList order, const QStringList &gone, const QStringList &come,
                    const MenuOrder::IsBefore &isBefore)
{
    for (const QString &name : gone) {
        if (!come.contains(name))
            order.removeAll(name);
    }
    for (const QString &name : come) {
        if (!order.contains(name))
            order = MenuOrder::inserted(order, name, isBefore);
    }
    return order;
}

} // namespace

QStringList MenuOrder::inserted(const QStringList &order, const QString &name, const IsBefore &isBefore)
{
    const auto behind = std::find_if(order.begin(), order.end(), [&](const QString &element) {
        return isChild(element) && isBefore(name, element);
    });
    if (std::none_of(order.begin(), order.end(), isChild))
        return order;
    QStringList result = order;
    result.insert(int(behind - order.begin()), name);
    return result;
}

bool MenuOrder::update(const fs::path &folder, const QStringList &gone, const QStringList &come,
                       const IsBefore &isBefore)
{
    const fs::path path = menuFolderRecord(folder);
    for (int attempt = 0; attempt < MostAttempts; ++attempt) {
        const std::string digest = fileDigest(path);
        if (digest.empty())
            return true;
        // Where this reads something else already, the file is not replaced.
        VelUIDesktopEntry record(QFile::decodeName(path.c_str()));
        const QStringList order = record.getSortOrder();
        const QStringList wanted = updated(order, gone, come, isBefore);
        if (wanted == order)
            return true;
        record.setSortOrder(wanted);
        if (MenuFile::replace(path, digest, record.contents().toStdString()))
            return true;
    }
    return false;
}

std::string MenuOrder::withoutOrder(const std::string &record)
{
    std::istringstream lines(record);
    std::string rest;
    for (std::string line; std::getline(lines, line);) {
        const std::string key = line.substr(0, line.find('='));
        const std::size_t end = key.find_last_not_of(' ');
        if (end == std::string::npos || key.substr(0, end + 1) != "SortOrder")
            rest += line + '\n';
    }
    return rest;
}
