// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

/// Why an entry cannot be used: the codes that VelUIDesktopEntry::isSuitable() gives. Any other
/// one means that the entry is wrong or incomplete.
namespace Unsuitable {

constexpr int NoExec = 1;
constexpr int ProgramMissing = 2;
constexpr int ProgramNotExecutable = 3;
constexpr int ProgramNotInPath = 4;
constexpr int TryExecMissing = 5;
constexpr int TryExecNotInPath = 6;
constexpr int UrlMissing = 7;

} // namespace Unsuitable
