// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QModelIndexList>
#include <QObject>

class MenuFind;
class MenuHistory;
class MenuSelection;
class MenuVoice;
class ShownMenu;

/**
 * Moving what is selected by one place in its folder.
 */
class MenuMoving : public QObject
{
    Q_OBJECT

public:
    MenuMoving(const ShownMenu &menu, MenuSelection &selection, MenuFind &find, MenuVoice &voice,
               MenuHistory &history);
    ~MenuMoving() override;

    /// Moves the selected item, or all selected items if they lie in one folder, as one step.
    void move(bool up);

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

private:
    QModelIndexList items() const;

    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    MenuHistory &m_history;
};
