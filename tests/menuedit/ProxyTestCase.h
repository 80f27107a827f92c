// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TestCase.h"

#include <menuedit/VelMenuModel.h>
#include <menuedit/VelMenuProxyModel.h>

#include <QDateTime>

#include <memory>

/// The fixture of the tests that look at the order of a menu without a view.
class ProxyTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

protected Q_SLOTS:
    void cleanup();

protected:
    /// The text of an entry with \a keys.
    static QByteArray entry(const QByteArray &keys);
    /// The words of \a text.
    static QStringList words(const char *text);
    /// Makes \a time the time at which a file was changed.
    static void setTime(const QString &path, const QDateTime &time);
    /// Makes the models of \a rootDir as the view does.
    void show(const QString &rootDir);
    /// Waits until a folder shows so many \a rows; false when they do not come.
    bool wait(const QString &name, int rows);
    /// The row of \a name below folder(), in the model of the files.
    QModelIndex source(const QString &name) const { return m_model->index(path(name)); }
    /// The file names of a folder's children as they are shown.
    QStringList order(const QString &name = QString()) const;
    /// Writes the list of a folder.
    void order(const QStringList &list, const QString &name = QString());

    std::unique_ptr<VelMenuModel> m_model;
    std::unique_ptr<VelMenuProxyModel> m_proxy;
    /// What show() was told.
    QString m_rootDir;
};
