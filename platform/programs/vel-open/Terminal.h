// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

/**
 * The words that, put before a command, run it in a terminal window.
 *
 * That is the terminal in TERMINAL, which may have arguments, else x-terminal-emulator, else
 * xterm: the first that is installed.
 *
 * @return an empty list when there is no terminal
 */
QStringList terminalWords();
