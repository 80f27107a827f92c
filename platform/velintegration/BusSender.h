// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

/**
 * Sends a command to the window manager over the session bus, and waits for the bus to have taken it.
 *
 * @return false when there is no bus, when nobody takes commands there, and for what is no UTF-8
 */
bool sendCommandOverBus(const char *command);
