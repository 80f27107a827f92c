// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

#include <QDialog>

class QDialogButtonBox;
class QLineEdit;

namespace VelUI {

class FormLayout;
class IconEdit;
class PathEdit;
class ShowInChoice;

/// Edits one action; Ok waits for a change and for an id, a name and a command.
class ActionPropsDialog : public QDialog
{
    Q_OBJECT

public:
    explicit ActionPropsDialog(const VelUIDesktopAction &action, QWidget *parent = nullptr);

    /// The action as the fields show it.
    VelUIDesktopAction action() const;

public Q_SLOTS:
    void setChanged(bool changed);

private:
    void build();
    void addRows(FormLayout *layout);
    void load(const VelUIDesktopAction &action);
    void connectChanges();

    QDialogButtonBox *m_buttonBox = nullptr;
    QLineEdit *m_id = nullptr;
    QLineEdit *m_name = nullptr;
    QLineEdit *m_localName = nullptr;
    IconEdit *m_icon = nullptr;
    IconEdit *m_localIcon = nullptr;
    ShowInChoice *m_showIn = nullptr;
    PathEdit *m_exec = nullptr;
};

} // namespace VelUI
