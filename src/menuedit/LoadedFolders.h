// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSet>
#include <QString>

class VelMenuModel;

/**
 * Which folders of a menu a model has read, as it does when the user opens one.
 */
namespace LoadedFolders {

/// Their paths. Has no further folder read, and makes no row.
QSet<QString> in(const VelMenuModel &model);

} // namespace LoadedFolders
