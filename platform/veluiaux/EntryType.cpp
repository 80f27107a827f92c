// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryType.h"

#include "EntryActions.h"
#include "records/DesktopEntryNames.h"
#include "records/EntryDocument.h"

namespace Names = DesktopEntryNames;

namespace {

constexpr std::string_view ApplicationKeys[] = {
    Names::TryExec,
    Names::Exec,
    Names::Path,
    Names::Terminal,
    Names::Actions,
    Names::MimeType,
    Names::Categories,
    Names::Keywords,
    Names::StartupNotify,
    Names::StartupWMClass,
    Names::PrefersNonDefaultGpu,
    Names::SingleMainWindow,
};

constexpr std::string_view LinkKeys[] = {Names::Url};

} // namespace

void EntryType::set(EntryDocument &entry, const QString &type)
{
    const QString old = entry.text(Names::MainGroup, Names::Type);
    if (old == type)
        return;
    if (old == QLatin1String("Application")) {
        EntryActions::set(entry, {});
        for (const std::string_view key : ApplicationKeys)
            entry.removeKey(Names::MainGroup, key);
    } else if (old == QLatin1String("Link")) {
        for (const std::string_view key : LinkKeys)
            entry.removeKey(Names::MainGroup, key);
    }
    entry.setText(Names::MainGroup, Names::Type, type);
}
