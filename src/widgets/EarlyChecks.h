// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class VelRadioGroupBox;

/**
 * The boxes that were checked before another one of their group existed, as the code does that builds
 * a form: it sets the properties of a widget as soon as it has made it. A box is remembered until the
 * program waits for events.
 */
namespace EarlyChecks {

/// Remembers \a box, which is alone below its parent.
void note(VelRadioGroupBox *box);

/// Forgets \a box.
void forget(const VelRadioGroupBox &box);

/// Checks the box that waits for \a newcomer, if there is one.
void fulfill(const VelRadioGroupBox &newcomer);

} // namespace EarlyChecks
