// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

#include <string>

VELINTEGRATION_EXPORT bool velHelpShow(const std::string &page);
