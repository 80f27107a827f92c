// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QPointer>
#include <QStringList>

#include <memory>

class MenuFind;
class MenuHistory;
class MenuSelection;
class MenuVoice;
class QAction;
class QMenu;
class ShownMenu;
class StepRecorder;

/**
 * Taking entries out of the menu without deleting them, and back in: two entries of the context
 * menu, of which that is shown that makes sense for what is selected; both for hidden and other entries.
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

    /// Hides the selected entries, or shows them again, as one step.
    void hideSelected();
    void showSelectedAgain();

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

private:
    void update();
    void mark(bool (*change)(const QString &path), bool isShown);
    void finish(const std::unique_ptr<StepRecorder> &recorder, const QStringList &done, const QString &name,
                bool isShown, const QStringList &complaints);
    QStringList selectedEntries() const;

    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    MenuHistory &m_history;
    QPointer<QMenu> m_contextMenu;
    QAction *m_hide;
    QAction *m_showAgain;
};
