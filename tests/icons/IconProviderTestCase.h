// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "IconThemeFolder.h"
#include "TestCase.h"
#include "VelMimeTypeIconProvider.h"

#include <QColor>
#include <QImage>

#include <memory>

/// The fixture of the tests of the provider: a theme and built-in pixmaps of plain colors.
class IconProviderTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

protected Q_SLOTS:
    void init();

protected:
    // The colors of the pixmaps; each stands for one icon only.
    static inline const QColor folderColor{0x80, 0, 0};
    static inline const QColor fileColor{0, 0x80, 0};
    static inline const QColor namedColor{0, 0, 0x80};
    static inline const QColor textColor{0x80, 0x80, 0};
    static inline const QColor unknownColor{0x80, 0, 0x80};
    static inline const QColor htmlColor{0, 0x80, 0x80};
    static inline const QColor linkColor{0xff, 0, 0};
    static inline const QColor unreadableColor{0, 0xff, 0};

    /// The text of an entry with \a lines.
    static QByteArray entry(const QByteArray &lines);
    /// What the icon paints on white.
    static QImage painted(const QIcon &icon, int size = 16);
    /// The color of the icon itself.
    static QColor middle(const QIcon &icon) { return painted(icon).pixelColor(12, 4); }
    /// The color where one emblem stands.
    static QColor topRight(const QIcon &icon) { return painted(icon).pixelColor(15, 0); }
    /// The color where the other emblem stands.
    static QColor bottomLeft(const QIcon &icon) { return painted(icon).pixelColor(0, 15); }
    /// The icon of \a name below folder().
    QIcon iconOf(const QString &name) const { return m_provider->icon(QFileInfo(path(name))); }
    /// Writes a built-in pixmap of one color.
    void writePixmap(const QString &name, int size, const QColor &color);
    /// Makes a named pipe.
    void makePipe(const QString &name);

    std::unique_ptr<IconThemeFolder> m_theme;
    std::unique_ptr<VelMimeTypeIconProvider> m_provider;
};
