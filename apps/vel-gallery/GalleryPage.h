// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <functional>

class QWidget;

/// What the command line gives to the pages.
struct GalleryContext
{
    /// The settings file that was named; empty when there was none.
    QString settingsFile;
};

/// One page of the gallery: a widget at work and the code that makes it.
struct GalleryPage
{
    /// The name on the command line and in the names of screenshots: lower case, words joined by "-".
    QString name;
    /// The title in the list, for the user.
    QString title;
    /// The heading in the list under which the page stands.
    QString category;
    /// The code shown beside the page.
    QString snippet;
    /// Makes the page; the given parent owns it.
    std::function<QWidget *(const GalleryContext &, QWidget *)> create;
    /// Whether the made page shows all that it loads; unset for a page that loads nothing later.
    std::function<bool(QWidget *)> isReady = nullptr;
};
