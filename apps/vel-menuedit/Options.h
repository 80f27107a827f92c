// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class QCommandLineParser;

/**
 * What the command line asks for.
 */
struct Options
{
    QString dir;
    bool isStartMenu = false;
    int iconSize = -1;
    bool editable = true;
    bool pick = false;
    /// Why the command line cannot be followed; empty when it can.
    QString error;

    /// Reads the command line; ends the program for --help and --version.
    static Options parse();

private:
    void chooseDir(const QCommandLineParser &parser);
    void chooseIconSize(const QString &text);
};
