// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>

#include <memory>

class MenuFilterBar;
class MessageLine;
class ToolBarExtension;
class ToolBarFocus;
class QAction;
class QDialog;
class QToolBar;
class QVBoxLayout;
class VelMenuView;

/**
 * What the menu dialog has beyond its plain form: the line to filter by above the tree and the line
 * that talks below it.
 *
 * It puts its parts into the dialog when it is made and takes them out again when it is destroyed;
 * then the dialog is as it was.
 */
class MenuDialogAssistance : public QObject
{
    Q_OBJECT

public:
    /// Completes \a dialog, whose \a view lies in \a layout; there is a \a toolBar where the menu can be
    /// edited, else null.
    MenuDialogAssistance(QDialog *dialog, QVBoxLayout *layout, VelMenuView *view, QToolBar *toolBar);
    ~MenuDialogAssistance() override;

    /// Remembers what was opened in the tree, which it opened again when it was made.
    void remember() const;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QAction *action(const char *name) const;
    void takeKeys();
    void giveKeysBack();
    void focusFilter();
    void tellIfReadOnly();

    QDialog *const m_dialog;
    VelMenuView *const m_view;
    const bool m_isEditable;
    std::unique_ptr<ToolBarFocus> m_toolBarFocus;
    std::unique_ptr<ToolBarExtension> m_toolBarExtension;
    std::unique_ptr<MenuFilterBar> m_filterBar;
    std::unique_ptr<MessageLine> m_message;
};
