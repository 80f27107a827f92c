// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <functional>

class MenuVoice;
class QWidget;

/**
 * The desktop's start menu.
 */
namespace StartMenu {

/// Where it is, whether or not there is one.
QString directory();

/// Whether there is any application that a default menu can be built of.
bool isAnyApplicationInstalled();

/**
 * Builds the default menu anew after asking over \a asker, which may go away meanwhile. When the
 * menu cannot be built, the old one stays, a warning is logged, and the user is told why.
 *
 * @param voice goes with \a asker
 * @param begins called when the user wants it, before anything is touched
 * @return whether the user wanted it
 */
bool recreate(QWidget *asker, MenuVoice &voice, const std::function<void()> &begins);

} // namespace StartMenu
