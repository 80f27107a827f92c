// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

#include <cstddef>
#include <string>

// The one type of Xlib that is needed; its header would bring macros named None and Bool.
typedef struct _XDisplay Display; // NOLINT(bugprone-reserved-identifier)

/**
 * The names that the channel to the window manager goes by.
 *
 * The channel is an ICCCM manager selection, one a screen; its owner is the window manager.
 * Commands are appended to a property of the owner's window.
 */
namespace VelWmCommand {

/// The selection's name without the number of the screen.
inline constexpr char selectionPrefix[] = "_VELWM_COMMAND_S";

/// The property that commands are appended to; type STRING, format 8.
inline constexpr char propertyName[] = "_VELWM_COMMAND";

/// The most bytes of a line, without its line feed; a receiver drops longer lines.
inline constexpr std::size_t LongestLine = 4096;

/// The name of the selection for \a screen.
inline std::string selectionName(int screen)
{
    return selectionPrefix + std::to_string(screen);
}

} // namespace VelWmCommand

/**
 * Sends a command to the window manager of the display's default screen.
 *
 * Appends the bytes to the property VelWmCommand::propertyName of the window that owns the
 * selection and waits for the server to have taken them. X errors of these requests end
 * here; those of earlier requests go to the error handler that was set, which is set again
 * afterwards. No event is taken from the display's queue.
 *
 * @param display the connection to send over; stays the caller's
 * @param command the bytes, zero-terminated; lines end with a line feed and are no longer than
 *        VelWmCommand::LongestLine, or nobody obeys them
 * @return false when \a display or \a command is null, when nobody owns the selection, when
 *         the owner is gone, or when the server refused
 */
VELINTEGRATION_EXPORT bool SendCommandToWM(Display *display, const char *command);
