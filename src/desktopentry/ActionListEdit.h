// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "fields/ListLineForm.h"

#include <frame/DesktopEntryRecord.h>

#include <QList>
#include <QWidget>

namespace VelUI {

/// A field that shows the ids of an entry's actions in one line and edits them in a dialog.
class ActionListEdit : public QWidget
{
    Q_OBJECT

public:
    explicit ActionListEdit(QWidget *parent = nullptr);

    void setActions(const QList<VelUIDesktopAction> &actions);
    QList<VelUIDesktopAction> actions() const;

    /// Sets the title of the dialog and those of the dialogs of a new and of an edited action.
    void setTexts(const QString &title, const QString &addTitle, const QString &editTitle);
    void setReadOnly(bool readOnly);

public Q_SLOTS:
    void editActions();

Q_SIGNALS:
    void changed();

private:
    ListLineForm m_ui;
    QList<VelUIDesktopAction> m_actions;
    QString m_title;
    QString m_addTitle;
    QString m_editTitle;
};

/// The value of the field as a row of a form reads and writes it.
QList<VelUIDesktopAction> fieldValue(const ActionListEdit *field);
void setFieldValue(ActionListEdit *field, const QList<VelUIDesktopAction> &value);

} // namespace VelUI
