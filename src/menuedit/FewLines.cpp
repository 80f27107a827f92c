// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FewLines.h"

#include <QCoreApplication>

namespace {

// More would push what they are about out of the window.
constexpr int Most = 3;

} // namespace

QString FewLines::of(const QStringList &lines)
{
    // There are never as few as one more, which English has no form for here.
    if (lines.size() <= Most + 1)
        return lines.join(QLatin1Char('\n'));
    QStringList few = lines.mid(0, Most);
    few.append(QCoreApplication::translate("VelMenuView", "And %n more.", nullptr, lines.size() - Most));
    return few.join(QLatin1Char('\n'));
}
