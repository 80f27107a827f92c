// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TestCase.h"

#include <menuedit/VelMenuModel.h>

#include <memory>

/// The fixture of the tests that look into a model without a view.
class ModelTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

protected Q_SLOTS:
    void cleanup();

protected:
    /// The text of an entry with \a keys.
    static QByteArray entry(const QByteArray &keys);
    /// The model of \a rootDir, when its first \a rows are there.
    std::unique_ptr<VelMenuModel> modelOf(const QString &rootDir, int rows);
    /// The row of \a name below folder().
    QModelIndex indexOf(const QString &name) const { return m_model->index(path(name)); }
    /// What that row shows.
    QString shown(const QString &name) const { return indexOf(name).data().toString(); }

    std::unique_ptr<VelMenuModel> m_model;
};
