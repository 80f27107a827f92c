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
 * Commands are appended to a property of the owner's window. Where there is no X display, a name on
 * the session bus stands for it; its owner has the method that takes a command.
 *
 * What stands here may be used from any thread.
 *
 * \since 1.0
 */
namespace VelWmCommand {

/// The selection's name without the number of the screen.
inline constexpr char selectionPrefix[] = "_VELWM_COMMAND_S";

/// The property that commands are appended to; type STRING, format 8.
inline constexpr char propertyName[] = "_VELWM_COMMAND";

/// The most bytes of a line, without its line feed; a receiver drops longer lines.
inline constexpr std::size_t LongestLine = 4096;

/// The name on the session bus, and of the interface.
inline constexpr char busName[] = "org.vel.WindowManager";
/// The object there.
inline constexpr char busPath[] = "/org/vel/WindowManager";
/// Its method; takes one string, the same bytes as the property.
inline constexpr char busMethod[] = "Command";

/// The name of the selection for \a screen.
inline std::string selectionName(int screen)
{
    return selectionPrefix + std::to_string(screen);
}

} // namespace VelWmCommand

/**
 * Sends a command to the window manager of the display's default screen, or over the session bus where
 * there is no display.
 *
 * Appends the bytes to the property VelWmCommand::propertyName of the window that owns the
 * selection and waits for the server to have taken them. X errors of these requests end
 * here; those of earlier requests go to the error handler that was set, which is set again
 * afterwards. No event is taken from the display's queue.
 *
 * Over the bus a command has to be UTF-8. It waits for the bus to have taken it, not for the receiver.
 *
 * @param display the connection to send over; stays the caller's. Null sends over the bus
 * @param command the bytes, zero-terminated; lines end with a line feed and are no longer than
 *        VelWmCommand::LongestLine, or nobody obeys them
 * @return false when \a command is null, when nobody owns the selection or the name on the bus, when
 *         the owner is gone, or when the server refused
 */
VELINTEGRATION_EXPORT bool SendCommandToWM(Display *display, const char *command);
