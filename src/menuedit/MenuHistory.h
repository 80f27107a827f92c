// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuVoice.h"
#include "StepText.h"

#include <QObject>
#include <QStringList>
#include <QUndoStack>

#include <memory>
#include <vector>

class FileStep;
class MenuFind;
class MenuSelection;
class QAction;
class QShortcut;
class QTreeView;
class ShownMenu;
class StepCommand;
class StepRecorder;
struct Refusal;

/**
 * What was done to a menu, to be undone and done again.
 *
 * An operation asks for a recorder before it begins and hands it in when it is done. Nothing is
 * recorded, and there are no actions, while the history is off, as it is at first.
 */
class MenuHistory : public QObject
{
    Q_OBJECT

public:
    MenuHistory(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuFind &find,
                MenuVoice &voice);
    ~MenuHistory() override;

    bool isOn() const { return m_undo != nullptr; }
    /// Forgets everything when it is switched off.
    void setOn(bool on);

    /// Null while it is off. Their keys work while the view has the keyboard.
    QAction *undoAction() const { return m_undo.get(); }
    QAction *redoAction() const { return m_redo.get(); }

    /// What an operation is to tell what it may change; null while the history is off.
    std::unique_ptr<StepRecorder> record() const;
    /**
     * Takes in what an operation changed, and tells the user what was done. A null recorder, and one
     * that finds nothing changed, are no step.
     *
     * @param items the paths of what it was done to, where it was or is: what there is of them is
     *        selected when it was undone or done again
     * @return what else is told of the operation has this to do with the step
     */
    MenuVoice::Subject add(const std::unique_ptr<StepRecorder> &recorder, const StepText &text,
                           const QStringList &items);
    /// The shown name of the item at \a path.
    QString nameOf(const QString &path) const;

    void undo() { run(true); }
    void redo() { run(false); }

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();
    /// The menu directory itself is another one.
    void replaced();

private:
    std::unique_ptr<QAction> makeAction(const char *name, const char *icon, const QString &keys);
    void run(bool isUndo);
    void turnStack(bool isUndo);
    void finish(const StepCommand &command, bool isUndo);
    QString menuDirectory() const;
    Refusal follow(FileStep &step, bool isUndo) const;
    void refuse(const QString &reason, bool isUndo);
    void takeIn(const QStringList &paths);
    void show(const QStringList &items);
    void updateActions();
    const StepCommand *commandAt(int index) const;

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    QUndoStack m_stack;
    bool m_isRunning = false;
    std::unique_ptr<QAction> m_undo;
    std::unique_ptr<QAction> m_redo;
    std::vector<std::unique_ptr<QShortcut>> m_keys;
};
