// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

namespace VelUI {

class ActionPropsDialog;

/// The choosers of the fields of an action.
namespace ActionChoosers {

/// Adds their buttons to \a dialog, which was not shown yet.
void addTo(ActionPropsDialog *dialog);

} // namespace ActionChoosers

} // namespace VelUI
