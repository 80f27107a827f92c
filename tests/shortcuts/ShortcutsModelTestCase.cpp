// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutsModelTestCase.h"

#include <QAbstractItemModelTester>

QString ShortcutsModelTestCase::str(const char *text)
{
    return QString::fromLatin1(text);
}

void ShortcutsModelTestCase::init()
{
    TestCase::init();
    m_window.reset(new QWidget);
    m_model.reset(new ShortcutsModel(nullptr, QString()));
}

void ShortcutsModelTestCase::cleanup()
{
    // The model says nothing when rows come, so that it is looked at only now.
    if (m_model)
        QAbstractItemModelTester tester(m_model.get(),
                                        QAbstractItemModelTester::FailureReportingMode::QtTest);
    m_model.reset();
    m_window.reset();
    TestCase::cleanup();
}

QAction *ShortcutsModelTestCase::addAction(const char *name, const char *group, const QKeySequence &key)
{
    auto *action = new QAction(str("&Text of ") + str(name), m_window.get());
    action->setShortcut(key);
    m_model->registerAction(str(name), action, str(group));
    return action;
}
