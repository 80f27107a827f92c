// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "fields/ListEditorForm.h"

#include <frame/DesktopEntryRecord.h>

#include <QList>
#include <QMetaType>
#include <QWidget>

class QListWidgetItem;

Q_DECLARE_METATYPE(VelUIDesktopAction)

namespace VelUI {

/// A list of actions that is edited with buttons.
///
/// An item shows the id that its action had when the list was filled and carries the action
/// under ActionRole.
class EditActionsWidget : public QWidget
{
    Q_OBJECT

public:
    /// The role under which an item of the list carries its action.
    static constexpr int ActionRole = Qt::UserRole;

    explicit EditActionsWidget(QWidget *parent = nullptr);

    void setActions(const QList<VelUIDesktopAction> &actions);
    QList<VelUIDesktopAction> actions() const;
    /// Makes the action in \a row the only selected one and shows it.
    void select(int row);

    /// Sets the titles of the dialogs of a new and of an edited action.
    void setTexts(const QString &addTitle, const QString &editTitle);

public Q_SLOTS:
    void addAction();
    void editAction();
    void deleteActions();
    void upAction();
    void downAction();
    void updateButtonsAvailability();

Q_SIGNALS:
    void changed();

private:
    void appendItem(const VelUIDesktopAction &action);
    void moveCurrent(int rows);

    ListEditorForm m_ui;
    QString m_addTitle;
    QString m_editTitle;
};

} // namespace VelUI
