// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutScheme.h"
#include "ShortcutsModel.h"

#include <QCoreApplication>
#include <QPointer>
#include <QWidget>

#include <optional>

/**
 * Asks the user what is to happen with the keys of a file that others have, and remembers an answer
 * that is meant for all of them.
 */
class SchemeQuestion
{
    Q_DECLARE_TR_FUNCTIONS(SchemeQuestion)

public:
    /// Asks about keys for \a model in a window above \a window.
    SchemeQuestion(const ShortcutsModel *model, QWidget *window);

    /// The answer for one clash, see ShortcutScheme::Ask.
    ShortcutScheme::OnClash ask(const QString &name, const QString &otherName, const QKeySequence &key);

private:
    QString textOf(const QString &name) const;
    QString question(const QString &name, const QString &otherName, const QKeySequence &key) const;

    const QPointer<const ShortcutsModel> m_model;
    const QPointer<QWidget> m_window;
    std::optional<ShortcutScheme::OnClash> m_forAll;
};
