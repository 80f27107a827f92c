// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShownNameOrder.h"

#include <velcore/language.h>

#include <QLocale>

namespace {

// By this much of a name it is ordered: marks in an odd order make a collator take very long.
constexpr int LongestName = 255;

} // namespace

ShownNameOrder::ShownNameOrder()
    : m_collator(QLocale(QString::fromStdString(velLanguageCode())))
{
    m_collator.setCaseSensitivity(Qt::CaseInsensitive);
}

bool ShownNameOrder::isBefore(const QString &name, const std::string &file, const QString &otherName,
                              const std::string &otherFile) const
{
    const int order = m_collator.compare(name.left(LongestName), otherName.left(LongestName));
    return order != 0 ? order < 0 : file < otherFile;
}
