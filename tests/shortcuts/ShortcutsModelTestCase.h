// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutsModel.h"
#include "TestCase.h"

#include <QAction>
#include <QKeySequence>
#include <QWidget>

#include <memory>

/// The fixture of the tests of the model: one without a row, and a window for actions.
class ShortcutsModelTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

protected Q_SLOTS:
    void init();
    void cleanup();

protected:
    static inline const QKeySequence f1{Qt::Key_F1};
    static inline const QKeySequence f2{Qt::Key_F2};
    static inline const QKeySequence f3{Qt::Key_F3};

    /// A text in Latin-1.
    static QString str(const char *text);
    /// The row of a shortcut by its place.
    QModelIndex row(int group, int row, int column = 0) const
    {
        return m_model->index(row, column, m_model->index(group, 0));
    }
    /// Registers a new action of the window.
    QAction *addAction(const char *name, const char *group, const QKeySequence &key = QKeySequence());

    std::unique_ptr<ShortcutsModel> m_model;
    std::unique_ptr<QWidget> m_window;
};
