// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RowLook.h"

#include <QColor>
#include <QFont>
#include <QGuiApplication>
#include <QPalette>
#include <QTextDocument>

namespace {

// Not that of what is disabled: it is to be read.
QColor grayText()
{
    constexpr double Strength = 0.55;
    const QColor text = QGuiApplication::palette().color(QPalette::Text);
    const QColor base = QGuiApplication::palette().color(QPalette::Base);
    const auto mixed = [](double from, double to) { return to + (from - to) * Strength; };
    return QColor::fromRgbF(mixed(text.redF(), base.redF()), mixed(text.greenF(), base.greenF()),
                            mixed(text.blueF(), base.blueF()));
}

QVariant slanted()
{
    QFont font;
    font.setItalic(true);
    return font;
}

QVariant explanation(const QString &path, int role)
{
    const QString text = EntryState::explanation(path);
    return role == Qt::ToolTipRole && Qt::mightBeRichText(text)
        ? Qt::convertFromPlainText(text, Qt::WhiteSpaceNormal)
        : text;
}

} // namespace

bool RowLook::isOf(int role)
{
    return role == Qt::ForegroundRole || role == Qt::FontRole || role == Qt::ToolTipRole
        || role == Qt::AccessibleDescriptionRole;
}

QVariant RowLook::data(const Item &item, int role)
{
    const bool isOutside = EntryState::isOutsideMenu(item.state);
    const bool isShown = item.state == EntryState::Kind::Shown;
    if (role == Qt::ForegroundRole)
        return isOutside || item.isCut ? QVariant(grayText()) : QVariant();
    if (role == Qt::FontRole)
        return isShown || isOutside ? QVariant() : slanted();
    return isShown ? QVariant() : explanation(item.path, role);
}
