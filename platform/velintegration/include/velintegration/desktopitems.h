// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

VELINTEGRATION_EXPORT bool SaveDesktopItemPosition(const char *fileName, int x, int y);
VELINTEGRATION_EXPORT bool ReadDesktopItemPosition(const char *fileName, int *x, int *y);
