// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconThemeFolder.h"

#include <QDir>
#include <QFile>
#include <QIcon>
#include <QImage>

IconThemeFolder::IconThemeFolder(const QString &searchPath, const QString &name, const QVector<int> &sizes)
    : m_searchPath(searchPath)
    , m_name(name)
    , m_sizes(sizes)
{
}

void IconThemeFolder::write() const
{
    const QString folder = m_searchPath + QLatin1Char('/') + m_name;
    QDir().mkpath(folder);
    QByteArray directories;
    QByteArray groups;
    for (const int size : m_sizes) {
        const QByteArray number = QByteArray::number(size);
        directories += number + ',';
        groups += "\n[" + number + "]\nSize=" + number + "\nType=Fixed\n";
        QDir().mkpath(folder + QLatin1Char('/') + QString::number(size));
    }
    QFile file(folder + QStringLiteral("/index.theme"));
    if (!file.open(QIODevice::WriteOnly)
        || file.write("[Icon Theme]\nName=Test\nDirectories=" + directories + '\n' + groups) < 0)
        qFatal("cannot write %s", qPrintable(file.fileName()));
}

void IconThemeFolder::add(const QString &name, const QColor &color) const
{
    for (const int size : m_sizes)
        add(name, color, size);
}

void IconThemeFolder::add(const QString &name, const QColor &color, int size) const
{
    QImage image(size, size, QImage::Format_ARGB32);
    image.fill(color);
    const QString path = m_searchPath + QLatin1Char('/') + m_name + QLatin1Char('/') + QString::number(size)
        + QLatin1Char('/') + name + QStringLiteral(".png");
    if (!image.save(path))
        qFatal("cannot write %s", qPrintable(path));
}

void IconThemeFolder::use() const
{
    QIcon::setThemeSearchPaths({m_searchPath});
    QIcon::setThemeName(m_name);
}
