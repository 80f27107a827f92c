// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ProxyTestCase.h"

#include <frame/DesktopEntryRecord.h>

QByteArray ProxyTestCase::entry(const QByteArray &keys)
{
    return "[Desktop Entry]\nType=Application\nExec=true\n" + keys;
}

QStringList ProxyTestCase::words(const char *text)
{
    return QString::fromUtf8(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

void ProxyTestCase::setTime(const QString &path, const QDateTime &time)
{
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadWrite));
    QVERIFY(file.setFileTime(time, QFileDevice::FileModificationTime));
}

void ProxyTestCase::cleanup()
{
    QLocale::setDefault(QLocale::system());
    m_proxy.reset();
    m_model.reset();
    TestCase::cleanup();
}

void ProxyTestCase::show(const QString &rootDir)
{
    m_proxy.reset();
    m_rootDir = rootDir;
    m_model = std::make_unique<VelMenuModel>(rootDir, nullptr, nullptr);
    m_model->setReadOnly(false);
    m_proxy = std::make_unique<VelMenuProxyModel>(nullptr);
    m_proxy->setSourceModel(m_model.get());
    m_proxy->sort(0, Qt::DescendingOrder);
}

bool ProxyTestCase::wait(const QString &name, int rows)
{
    const QModelIndex index = source(name);
    if (m_model->canFetchMore(index))
        m_model->fetchMore(index);
    return QTest::qWaitFor([&] { return m_proxy->rowCount(m_proxy->mapFromSource(source(name))) == rows; });
}

QStringList ProxyTestCase::order(const QString &name) const
{
    const QModelIndex parent = m_proxy->mapFromSource(source(name));
    QStringList names;
    for (int row = 0; row < m_proxy->rowCount(parent); ++row)
        names.append(m_proxy->index(row, 0, parent).data(QFileSystemModel::FileNameRole).toString());
    return names;
}

void ProxyTestCase::order(const QStringList &list, const QString &name)
{
    VelUIDesktopEntry record(path(name + QStringLiteral("/.directory")));
    record.setType(QStringLiteral("Directory"));
    record.setSortOrder(list);
    QVERIFY(record.save());
}
