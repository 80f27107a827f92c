// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * Folders opened in a tree view, from making the models until every row is there with its name and
 * icon, sorted and painted, and nothing changes any more.
 */
namespace MenuOpening {

struct Directory
{
    QString path;
    int rows; // of the folder itself
    int rowsOfEach; // of its folders, when they are all opened
};

struct Times
{
    double done; // microseconds
    double longestFreeze; // of the window's thread, in microseconds
    double memory; // of the process, in KiB, while the tree is shown
};

/// The memory that this process has for itself, in KiB.
double ownMemory();

/// With the models of the menu editor.
Times menu(const Directory &directory);
/// With Qt's own model alone.
Times plain(const Directory &directory);
/// With KDE's model.
Times kDirModel(const Directory &directory);

} // namespace MenuOpening
