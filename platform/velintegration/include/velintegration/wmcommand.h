// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

#include <X11/Xlib.h>

VELINTEGRATION_EXPORT bool SendCommandToWM(Display *display, const char *command);
