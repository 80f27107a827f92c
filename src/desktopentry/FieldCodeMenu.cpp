// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FieldCodeMenu.h"

#include "choosers/FieldCodes.h"

#include <QLineEdit>

namespace VelUI {

FieldCodeMenu::FieldCodeMenu(QLineEdit *line, QWidget *parent)
    : QMenu(parent)
    , m_line(line)
{
    for (const FieldCodes::Code &code : FieldCodes::all()) {
        QAction *const action = addAction(code.explanation);
        connect(action, &QAction::triggered, this, [this, code] { insert(code.code); });
    }
}

void FieldCodeMenu::insert(const QString &code)
{
    // The Tab key selects all that it comes to: nobody means to replace that.
    if (m_line->selectedText() == m_line->text())
        m_line->deselect();
    if (!m_line->hasSelectedText())
        m_line->setCursorPosition(FieldCodes::place(m_line->text(), m_line->cursorPosition()));
    const int place = m_line->hasSelectedText() ? m_line->selectionStart() : m_line->cursorPosition();
    const QString kept = m_line->text().remove(place, m_line->selectedText().size());
    m_line->insert(FieldCodes::insertion(kept, place, code));
    m_line->setFocus(Qt::OtherFocusReason);
}

} // namespace VelUI
