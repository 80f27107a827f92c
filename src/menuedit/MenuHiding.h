// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "StepText.h"

#include <QObject>
#include <QPointer>

class MenuFind;
class MenuHistory;
class MenuSelection;
class MenuVoice;
class QAction;
class QMenu;
class ShownMenu;

/**
 * Taking entries out of the menu without deleting them, and back in: two entries of the context
 * menu, of which the one is shown that makes sense for what is selected.
 */
class MenuHiding : public QObject
{
    Q_OBJECT

public:
    MenuHiding(const ShownMenu &menu, MenuSelection &selection, MenuFind &find, MenuVoice &voice,
               MenuHistory &history);
    ~MenuHiding() override;

    /// Puts the entries into \a menu, before its first separator; null takes them out again.
    void setContextMenu(QMenu *menu);

    /// Hides the selected entry, or shows it again.
    void hideSelected();
    void showSelectedAgain();

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

private:
    void update();
    void mark(bool (*change)(const QString &path), StepText::Kind kind);
    QString selectedEntry() const;

    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    MenuHistory &m_history;
    QPointer<QMenu> m_contextMenu;
    QAction *m_hide;
    QAction *m_showAgain;
};
