// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "IconThemeFolder.h"
#include "TestCase.h"

#include <veluiaux/VelIcon.h>

#include <QImage>

#include <memory>

/// The names of emblems by their corners.
using Emblems = QMap<Qt::Corner, QString>;

/// The fixture of the tests of icons: a theme of plain colors.
class IconTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

protected Q_SLOTS:
    void init();

protected:
    /// The icon of that name without emblems and fallback.
    static QIcon themeIcon(const QString &name) { return VelIcon::fromTheme(name, Emblems(), QIcon()); }
    /// What the icon paints on white.
    static QImage painted(const QIcon &icon, int size, qreal ratio = 1,
                          Qt::LayoutDirection direction = Qt::LeftToRight);
    /// An icon of one color.
    static QIcon plainIcon(const QColor &color);

    /// The theme "first", with "red" and the emblems "blue" and "green".
    std::unique_ptr<IconThemeFolder> m_theme;
};
