// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ClashLine.h"

#include <QKeySequence>
#include <QVector>

class IShortcutObject;
class ShortcutsModel;

namespace ClashLines {

/**
 * What speaks against a key, as it is told to the user.
 *
 * Of very many clashes the first are told, and the number of the others. That the application itself
 * gave a shortcut a standard key of the platform is left out: that is what such keys are for.
 *
 * @param model the shortcuts
 * @param shortcut the one that has the key, or is to get it
 * @param key the key
 * @param window the window in which the shortcut works; may be null
 */
QVector<ClashLine::Content> of(const ShortcutsModel &model, const IShortcutObject &shortcut,
                               const QKeySequence &key, const QWidget *window);

} // namespace ClashLines
