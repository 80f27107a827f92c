// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LocalizedLabel.h"

#include <velcore/language.h>

namespace VelUI {

QString localizedLabel(const QString &label)
{
    return label + QStringLiteral(" [") + QString::fromStdString(velLanguageCode()) + QLatin1Char(']');
}

} // namespace VelUI
