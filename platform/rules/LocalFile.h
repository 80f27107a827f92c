// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// The path of the local file that \a target names: an absolute path or a file URL without
/// another host. Empty when it names anything else.
QString localFile(const QString &target);
