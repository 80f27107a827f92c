// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "NameClash.h"

class QWidget;

/**
 * The question what is to become of a dropped or pasted file whose name is taken.
 */
namespace ClashQuestion {

/// Asks over the window of \a parent, which may go away meanwhile; then, and when the question is
/// closed, all is canceled.
NameClash::Answer ask(QWidget *parent, const NameClash &clash);

} // namespace ClashQuestion
