// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutsModel.h"

#include <QMenu>
#include <QPointer>

/**
 * The keys of a model to a file and back, and on a sheet.
 */
class SchemeMenu : public QMenu
{
    Q_OBJECT

public:
    /// A menu for \a model, which may be null; its windows open above that of \a parent.
    SchemeMenu(ShortcutsModel *model, QWidget *parent);
    ~SchemeMenu() override;

Q_SIGNALS:
    /// Keys of a file were made pending.
    void keysChanged();

private:
    void add(const char *name, const QString &text, void (SchemeMenu::*run)());
    void exportKeys();
    void importKeys();
    void saveHtml();
    void savePlainText();
    void copySheet();
    void saveSheet(const QString &filter, const QString &suffix, const QString &sheet);
    QWidget *dialogParent() const;

    const QPointer<ShortcutsModel> m_model;
};
