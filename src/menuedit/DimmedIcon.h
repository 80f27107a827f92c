// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class QIcon;

/**
 * Icons of items that are about to leave.
 */
namespace DimmedIcon {

/// The \a icon, half transparent.
QIcon of(const QIcon &icon);

} // namespace DimmedIcon
