// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

VELINTEGRATION_EXPORT bool CreateStartMenu(const char *menuDir, const char *templateDir);
