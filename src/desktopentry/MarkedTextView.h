// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ChangedLines.h"

#include <QPlainTextEdit>

namespace VelUI {

/// Shows a text, a mark beside each line that was changed and a shade behind it.
class MarkedTextView : public QPlainTextEdit
{
    Q_OBJECT

public:
    explicit MarkedTextView(QWidget *parent = nullptr);

    /// Shows the lines of \a text; what the user looks at stays in view.
    void show(const ChangedLines &text);

protected:
    void resizeEvent(QResizeEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    class Margin;

    void arrange();
    void shade();
    void paintMarks(QPaintEvent *event);

    QVector<ChangedLines::Kind> m_kinds;
    Margin *const m_margin;
};

} // namespace VelUI
