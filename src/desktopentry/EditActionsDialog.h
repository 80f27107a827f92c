// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "fields/ListDialogForm.h"

#include <frame/DesktopEntryRecord.h>

#include <QDialog>
#include <QList>
#include <QSet>

namespace VelUI {

class EditActionsWidget;

/// Edits a copy of an entry's actions; Ok waits for the first change.
///
/// The dialog tells of ids that are wrong and proposes others. Ok does not take ids that would get
/// lost; those that are but odd it takes when the user has been told, or when they were there before.
class EditActionsDialog : public QDialog
{
    Q_OBJECT

public:
    explicit EditActionsDialog(const QList<VelUIDesktopAction> &actions, QWidget *parent = nullptr);

    QList<VelUIDesktopAction> actions() const;
    void setTexts(const QString &addTitle, const QString &editTitle);

    void accept() override;

public Q_SLOTS:
    void setChanged(bool changed);

private:
    void tellOfIds();
    void repairIds();

    ListDialogForm m_ui;
    EditActionsWidget *m_listWidget;
    QSet<QString> m_toldIds;
};

} // namespace VelUI
