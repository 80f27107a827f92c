// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DropContents.h"

#include "MenuClipboard.h"

#include <QCoreApplication>

#include <algorithm>

namespace {

// Data may stand in a URL as a whole.
QString noFile(const QUrl &url)
{
    constexpr int LongestShown = 200;
    QString address = url.toDisplayString();
    if (address.size() > LongestShown)
        address = address.left(LongestShown) + QStringLiteral("...");
    return QCoreApplication::translate("VelMenuView",
                                       "%1 is no file on this computer. Nothing was moved or copied.")
        .arg(address);
}

} // namespace

DropContents DropContents::of(const QMimeData *data, bool isAssisted)
{
    DropContents contents;
    if (!data || !data->hasUrls())
        return contents;
    contents.sources = MenuClipboard::localPaths(data);
    const QList<QUrl> foreign = MenuClipboard::foreignUrls(data);
    const auto isRefused = [isAssisted](const QUrl &url) { return !isAssisted || !WebAddress::isOne(url); };
    const auto refused = std::find_if(foreign.begin(), foreign.end(), isRefused);
    if (refused != foreign.end())
        contents.refusal = noFile(*refused);
    else
        contents.addresses = WebAddress::withTitles(foreign, MenuClipboard::titleTexts(data));
    return contents;
}
