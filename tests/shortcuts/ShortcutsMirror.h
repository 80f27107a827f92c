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
    /// Clicks on the row of an action, or of a group: -1.
    Messages clickRow(int row);
    Messages clickDefault();
    Messages clickCustom();
    /// Presses a key in the key field, which has the focus then.
    Messages press(int chord);
    /// Goes on to another part of the dialog, or waits.
    Messages leaveField();
    Messages click(Button button);
    /// Closes the window; the answer is the one to the question, if there is one.
    Messages close(Answer answer);
    /// The host ends the dialog.
    Messages reject();
    Messages done(bool isAccepted);
    Messages hide();

    /// Clicks on what only the assisted dialog has.
    Messages clickNone();
    Messages goTo(const QString &name);
    Messages takeOver(const QString &name);
    /// The names of the other shortcuts that have the key that is shown.
    QStringList holders() const;

    /// Whether a recorded key waits for what the user decides.
    bool isHeld() const { return m_isHeld; }
    bool isRecording() const { return !m_chords.isEmpty(); }
    bool isOkEnabled() const { return m_isChanged || isRecording(); }
    bool isFieldEnabled() const { return current >= 0 && !isDefaultChosen; }
    /// What the key field shows, if it is enabled.
    QKeySequence shownKey() const;
    /// The row that an action stands in.
    int rowOf(int action) const;

    std::vector<Action> actions;
    std::map<QString, QString> saved;
    bool isAssisted = false;
    int current = -1; ///< the first action of the row that is current, or -1
    bool isDefaultChosen = false;
    bool canRestore = true;
    bool isVisible = false;

private:
    Messages endRecording();
    Messages pauseRecording();
    bool clashes(const Action &action, const QString &name, const QKeySequence &key) const;
    Messages refuse(const QKeySequence &key) const;
    void setPending(const QKeySequence &key);
    void discard();
    void commit();
    void showCurrent();

    std::map<QString, QString> m_globals;
    QVector<int> m_chords;
    bool m_isHeld = false; // a key that would be refused waits in the field
    bool m_isChanged = false;
};
