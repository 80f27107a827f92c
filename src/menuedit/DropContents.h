// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "WebAddress.h"

#include <QString>
#include <QStringList>
#include <QVector>

class QMimeData;

/**
 * What of dragged or copied data a menu can take.
 */
struct DropContents
{
    QStringList sources; ///< absolute paths; empty where nothing is meant for a menu
    QVector<WebAddress> addresses;
    QString refusal; ///< why none of it can be taken; may be empty

    /// What there is in \a data; addresses are taken only where there is assistance.
    static DropContents of(const QMimeData *data, bool isAssisted);
};
