// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconProviderTestCase.h"

#include <QDir>
#include <QPainter>

#include <sys/stat.h>
#include <unistd.h>

QByteArray IconProviderTestCase::entry(const QByteArray &lines)
{
    return "[Desktop Entry]\n" + lines;
}

void IconProviderTestCase::init()
{
    TestCase::init();
    m_theme = std::make_unique<IconThemeFolder>(path(QStringLiteral(".icons")), QStringLiteral("test"));
    m_theme->write();
    m_theme->add(QStringLiteral("named"), namedColor);
    m_theme->add(QStringLiteral("text-plain"), textColor);
    m_theme->add(QStringLiteral("text-html"), htmlColor);
    m_theme->add(QStringLiteral("unknown"), unknownColor);
    m_theme->add(QStringLiteral("emblem-symbolic-link"), linkColor);
    m_theme->add(QStringLiteral("emblem-unreadable"), unreadableColor);
    m_theme->use();

    qputenv("VEL_DATA_DIR", QFile::encodeName(path(QStringLiteral(".data"))));
    QVERIFY(QDir().mkpath(path(QStringLiteral(".data/pixmaps"))));
    for (const int size : {16, 32}) {
        writePixmap(QStringLiteral("folder%1.xpm").arg(size), size, folderColor);
        writePixmap(QStringLiteral("icon%1.xpm").arg(size), size, fileColor);
    }
    m_provider = std::make_unique<VelMimeTypeIconProvider>();
}

void IconProviderTestCase::writePixmap(const QString &name, int size, const QColor &color)
{
    QImage image(size, size, QImage::Format_RGB32);
    image.fill(color);
    QVERIFY(image.save(path(QStringLiteral(".data/pixmaps/") + name), "XPM"));
}

void IconProviderTestCase::makePipe(const QString &name)
{
    QCOMPARE(::mkfifo(QFile::encodeName(path(name)).constData(), 0600), 0);
}

QImage IconProviderTestCase::painted(const QIcon &icon, int size)
{
    QImage image(size, size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    QPainter painter(&image);
    icon.paint(&painter, image.rect());
    return image;
}
