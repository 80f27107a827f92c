// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QPointer>

class QToolBar;
class QToolButton;

/**
 * Paints the arrow behind which a tool bar keeps what it has no room for in the color of its texts, for
 * as long as it exists: some styles have it black, which nobody sees in dark colors.
 */
class ToolBarExtension : public QObject
{
    Q_OBJECT

public:
    explicit ToolBarExtension(QToolBar *toolBar);
    ~ToolBarExtension() override;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void paint();

    QPointer<QToolButton> m_button;
};
