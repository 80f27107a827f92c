// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <functional>

class QMenu;
class ShortcutsModel;

/**
 * Adds commands to a menu that write the keys of a model to a file, take such a file over and put
 * the keys on a sheet, and registers them in the model.
 *
 * @param menu the menu, in the window that messages stand above
 * @param model outlives the menu
 * @param save called when keys of a file are in force
 */
void addKeyFiles(QMenu *menu, ShortcutsModel *model, const std::function<void()> &save);
