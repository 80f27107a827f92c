// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DesktopEntryText.h"
#include "FileStamp.h"

#include <memory>

/// The text of a file as it was read, and the state in which the file was then.
struct FileText
{
    std::shared_ptr<const DesktopEntryText> text; ///< never null
    FileStamp stamp;
    bool settled = false; ///< the stamp alone tells whether the file has changed since
};
