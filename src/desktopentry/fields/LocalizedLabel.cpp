// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LocalizedLabel.h"

#include <velcore/language.h>

namespace VelUI {

QString localizedLabel(const QString &label)
{
    return localizedLabel(label, QString::fromStdString(velLanguageCode()));
}

QString localizedLabel(const QString &label, const QString &language)
{
    return label + QStringLiteral(" [") + language + QLatin1Char(']');
}

} // namespace VelUI
