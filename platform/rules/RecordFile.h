// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

/// The name of the file in a menu folder that holds the folder's own entry.
constexpr char RecordFile[] = ".directory";
