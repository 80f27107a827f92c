// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

#include <string>

/**
 * Opens a page of the desktop's help in the user's browser.
 *
 * The page is "doc/<language>/<page>.html" in the user's language (see velLanguageCode()), else
 * "doc/<page>.html", below VEL_DATA_DIR, else below the installed data of the desktop. A
 * VEL_DATA_DIR that holds no absolute path counts as not set. The browser is started
 * by xdg-open and not waited for.
 *
 * @param page the page's name without suffix; empty for "index". A name that leads out of the
 *             help's folder has no page
 * @return false when there is no such page or when xdg-open cannot be started
 */
VELINTEGRATION_EXPORT bool velHelpShow(const std::string &page);
