// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QString>
#include <QStringList>
#include <QVector>

#include <map>
#include <vector>

/**
 * What must be in force, pending and saved after everything that a user and a host do with the
 * shortcuts dialog: rules in a few plain lists, with no widget and no model of Qt.
 *
 * Each operation tells the messages that it must bring.
 */
class ShortcutsMirror
{
public:
    /// One wrapped action. Several of one name and group share a row, the first one's.
    struct Action
    {
        QString group;
        QString name;
        QString text;
        QKeySequence defaultKey;
        QKeySequence inForce;
        QKeySequence pending;
    };
    enum class Message { Global, Local, Question };
    struct Told
    {
        Message kind;
        QString key;
        QString holder;
    };
    using Messages = std::vector<Told>;
    enum class Answer { Yes, No, Cancel };
    enum Button { Ok, Cancel, Reset, RestoreDefaults };

    /// Adds an action; they come in the order in which the rows are shown.
    void add(const QString &group, const QString &name, const QString &text, const QKeySequence &defaultKey);
    /// A key that the desktop has, for a command.
    void addGlobal(const QKeySequence &key, const QString &command) { m_globals[key.toString()] = command; }
    /// Starts the application anew: actions get their saved keys.
    void restart();
    /// The host saves.
    void save();

    /// Shows the dialog that is hidden.
    void show() { isVisible = true; }
    /// Clicks on the row of an action; -1 for that of a group.
    Messages clickRow(int row);
    Messages clickDefault();
    Messages clickCustom();
    /// Presses a key in the key field, which has the focus then.
    Messages press(int chord);
    /// Goes on to another part of the dialog.
    Messages leaveField();
    /// Waits until the recording ends, or goes on to what belongs to the key.
    Messages pause();
    Messages click(Button button);
    /// Closes the window; the answer is the one to the question, if there is one.
    Messages close(Answer answer);
    /// The host ends the dialog.
    Messages reject();
    Messages done(bool isAccepted);
    Messages hide();

    // With assistance.
    Messages clickNone();
    /// Takes the shown key over from the actions of a name.
    Messages takeOver(const QString &name);
    /// Goes to the first action of a name that clashes with the shown key.
    Messages goTo(const QString &name);
    /// The names of the actions that it can be taken over from.
    QStringList holders() const;
    /// Takes back what was changed of the current action.
    Messages takeBack();
    /// Filters by a text that is in names of actions or groups.
    Messages setFilter(const QString &text);
    /// The tree made a group current by itself.
    void forgetLeftRow() { m_leftRow = -1; }
    bool isSeen(int row) const;

    bool isRecording() const { return !m_chords.isEmpty(); }
    /// Whether no more chords go into the recording after the next one.
    bool isNextTheLast() const { return !m_isHeld && m_chords.size() == 3; }
    /// Whether what was recorded waits for the user.
    bool isHeld() const { return m_isHeld; }
    bool isOkEnabled() const { return m_isChanged || isRecording(); }
    bool isFieldEnabled() const { return current >= 0 && !isDefaultChosen; }
    /// The key that is recorded, or else the pending one of the current action.
    QKeySequence shownKey() const;
    /// The row that an action stands in.
    int rowOf(int action) const;

    std::vector<Action> actions;
    std::map<QString, QString> saved;
    int current = -1; ///< the first action of the row that is current, or -1
    bool isDefaultChosen = false;
    bool canRestore = true;
    bool isVisible = false;
    bool hasAssistance = false;

private:
    Messages endRecording();
    void stopRecording();
    bool isGlobal(const QKeySequence &key) const;
    Messages refuse(const QKeySequence &key) const;
    void setPending(const QKeySequence &key);
    void discard();
    void commit();
    void showCurrent();

    std::map<QString, QString> m_globals;
    QVector<int> m_chords;
    bool m_isHeld = false; // what was recorded waits for the user
    bool m_isChanged = false;
    QString m_filter;
    int m_leftRow = -1; // was current until the filter hid it
};
