// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModelTestCase.h"

QByteArray ModelTestCase::entry(const QByteArray &keys)
{
    return "[Desktop Entry]\nType=Application\nExec=true\n" + keys;
}

void ModelTestCase::cleanup()
{
    m_model.reset();
    TestCase::cleanup();
}

std::unique_ptr<VelMenuModel> ModelTestCase::modelOf(const QString &rootDir, int rows)
{
    auto model = std::make_unique<VelMenuModel>(rootDir, nullptr, nullptr);
    model->setReadOnly(false);
    const QModelIndex root = model->index(rootDir);
    if (!QTest::qWaitFor([&] { return model->rowCount(root) == rows; }))
        qWarning("%d rows instead of %d", model->rowCount(root), rows);
    return model;
}
