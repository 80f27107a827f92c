// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "fields/ListDialogForm.h"

#include <frame/DesktopEntryRecord.h>

#include <QDialog>
#include <QList>

namespace VelUI {

class EditActionsWidget;

/// Edits a copy of an entry's actions; Ok waits for the first change.
class EditActionsDialog : public QDialog
{
    Q_OBJECT

public:
    explicit EditActionsDialog(const QList<VelUIDesktopAction> &actions, QWidget *parent = nullptr);

    QList<VelUIDesktopAction> actions() const;
    void setTexts(const QString &addTitle, const QString &editTitle);

public Q_SLOTS:
    void setChanged(bool changed);

private:
    ListDialogForm m_ui;
    EditActionsWidget *m_listWidget;
};

} // namespace VelUI
