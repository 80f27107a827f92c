// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutsMirror.h"

namespace {

QKeySequence sequenceOf(QVector<int> chords)
{
    chords.resize(4);
    return {chords.at(0), chords.at(1), chords.at(2), chords.at(3)};
}

} // namespace

void ShortcutsMirror::add(const QString &group, const QString &name, const QString &text,
                          const QKeySequence &defaultKey)
{
    actions.push_back({group, name, text, defaultKey, defaultKey, defaultKey});
}

void ShortcutsMirror::restart()
{
    for (Action &action : actions) {
        const auto it = saved.find(action.name);
        action.inForce = it == saved.end() ? action.defaultKey : QKeySequence(it->second);
        action.pending = action.inForce;
    }
    m_chords.clear();
    m_isHeld = false;
    m_isChanged = false;
    isVisible = false;
    canRestore = true;
    isDefaultChosen = false;
    current = -1;
}

void ShortcutsMirror::save()
{
    for (std::size_t i = 0; i < actions.size(); ++i) {
        if (rowOf(int(i)) == int(i))
            saved[actions[i].name] = actions[i].inForce.toString(QKeySequence::PortableText);
    }
}

int ShortcutsMirror::rowOf(int action) const
{
    const auto index = std::size_t(action);
    const bool isTwin = index > 0 && actions[index].name == actions[index - 1].name
        && actions[index].group == actions[index - 1].group;
    return isTwin ? rowOf(action - 1) : action;
}

void ShortcutsMirror::showCurrent()
{
    if (current >= 0) {
        const Action &action = actions[std::size_t(current)];
        isDefaultChosen = action.pending == action.defaultKey;
    }
}

QKeySequence ShortcutsMirror::shownKey() const
{
    return isRecording() ? sequenceOf(m_chords) : actions[std::size_t(current)].pending;
}

void ShortcutsMirror::setPending(const QKeySequence &key)
{
    actions[std::size_t(current)].pending = key;
    m_isChanged = true;
    canRestore = true;
    showCurrent();
}

ShortcutsMirror::Messages ShortcutsMirror::refuse(const QKeySequence &key) const
{
    const auto global = m_globals.find(key.toString());
    const bool isBlocked = global != m_globals.end()
        && !(global->second.startsWith(QLatin1String("VELWM_"))
             && global->second.contains(QLatin1String("_ICON")));
    if (isBlocked)
        return {{Message::Global, key.toString(), global->second}};
    for (std::size_t i = 0; i < actions.size(); ++i) {
        if (rowOf(int(i)) == int(i) && actions[i].pending == key)
            return {{Message::Local, key.toString(), actions[i].text}};
    }
    return {};
}

ShortcutsMirror::Messages ShortcutsMirror::endRecording()
{
    if (!isRecording())
        return {};
    const QKeySequence key = sequenceOf(m_chords);
    m_chords.clear();
    m_isHeld = false;
    if (key == actions[std::size_t(current)].pending)
        return {};
    const Messages messages = refuse(key);
    if (messages.empty())
        setPending(key);
    return messages;
}

ShortcutsMirror::Messages ShortcutsMirror::clickRow(int row)
{
    const Messages messages = endRecording();
    const bool isOther = row != current;
    current = row;
    if (isOther)
        showCurrent();
    return messages;
}

ShortcutsMirror::Messages ShortcutsMirror::clickDefault()
{
    const Messages messages = endRecording();
    if (!isDefaultChosen)
        setPending(actions[std::size_t(current)].defaultKey);
    isDefaultChosen = true;
    return messages;
}

ShortcutsMirror::Messages ShortcutsMirror::clickCustom()
{
    const Messages messages = endRecording();
    isDefaultChosen = false;
    return messages;
}

ShortcutsMirror::Messages ShortcutsMirror::press(int chord)
{
    if (m_isHeld)
        m_chords.clear();
    m_isHeld = false;
    m_chords.append(chord);
    return m_chords.size() == 4 ? leaveField() : Messages();
}

ShortcutsMirror::Messages ShortcutsMirror::leaveField()
{
    return isAssisted ? pauseRecording() : endRecording();
}

// The user is still about the key: where it would be refused, nothing is decided.
ShortcutsMirror::Messages ShortcutsMirror::pauseRecording()
{
    m_isHeld =
        isRecording() && shownKey() != actions[std::size_t(current)].pending && !refuse(shownKey()).empty();
    return m_isHeld ? Messages() : endRecording();
}

ShortcutsMirror::Messages ShortcutsMirror::clickNone()
{
    Messages messages = pauseRecording();
    m_chords.clear();
    m_isHeld = false;
    if (!actions[std::size_t(current)].pending.isEmpty())
        setPending(QKeySequence());
    return messages;
}

bool ShortcutsMirror::clashes(const Action &action, const QString &name, const QKeySequence &key) const
{
    return action.name == name && !action.pending.isEmpty()
        && (action.pending.matches(key) != QKeySequence::NoMatch
            || key.matches(action.pending) != QKeySequence::NoMatch);
}

ShortcutsMirror::Messages ShortcutsMirror::goTo(const QString &name)
{
    const QKeySequence key = shownKey();
    Messages messages = pauseRecording();
    m_chords.clear();
    m_isHeld = false;
    current = 0;
    while (!clashes(actions[std::size_t(current)], name, key))
        ++current;
    showCurrent();
    return messages;
}

ShortcutsMirror::Messages ShortcutsMirror::takeOver(const QString &name)
{
    const QKeySequence key = shownKey();
    pauseRecording();
    for (std::size_t i = 0; i < actions.size(); ++i) {
        if (rowOf(int(i)) == int(i) && clashes(actions[i], name, key))
            actions[i].pending = QKeySequence();
    }
    m_isChanged = true;
    canRestore = true;
    return pauseRecording();
}

QStringList ShortcutsMirror::holders() const
{
    QStringList names;
    for (std::size_t i = 0; current >= 0 && i < actions.size(); ++i) {
        const Action &action = actions[i];
        if (rowOf(int(i)) == int(i) && action.name != actions[std::size_t(current)].name
            && !action.pending.isEmpty() && action.pending == shownKey())
            names.append(action.name);
    }
    return names;
}

// The button is pressed when the recording ends, and released when it may be disabled again.
ShortcutsMirror::Messages ShortcutsMirror::click(Button button)
{
    if (button == Cancel) {
        discard();
        isVisible = false;
        return {};
    }
    if (button == RestoreDefaults ? !canRestore : !isOkEnabled())
        return {};
    const Messages messages = endRecording();
    if (button == RestoreDefaults) {
        for (Action &action : actions)
            action.pending = action.defaultKey;
        m_isChanged = true;
        canRestore = false;
        showCurrent();
    } else if (button == Reset && m_isChanged) {
        discard();
        canRestore = true;
    } else if (button == Ok && m_isChanged && messages.empty()) {
        commit();
    }
    return messages;
}

ShortcutsMirror::Messages ShortcutsMirror::close(Answer answer)
{
    Messages messages = endRecording();
    if (!messages.empty())
        return messages;
    if (!m_isChanged) {
        isVisible = false;
        return {};
    }
    if (answer == Answer::Yes) {
        commit();
    } else if (answer == Answer::No) {
        discard();
        isVisible = false;
    }
    return {{Message::Question, {}, {}}};
}

ShortcutsMirror::Messages ShortcutsMirror::reject()
{
    if (isOkEnabled())
        discard();
    isVisible = false;
    return {};
}

// It is the Ok button that commits; a host that accepts finds the keys still pending.
ShortcutsMirror::Messages ShortcutsMirror::done(bool isAccepted)
{
    if (!isAccepted)
        return reject();
    const Messages messages = endRecording();
    if (messages.empty())
        isVisible = false;
    return messages;
}

ShortcutsMirror::Messages ShortcutsMirror::hide()
{
    m_chords.clear();
    m_isHeld = false;
    isVisible = false;
    return {};
}

void ShortcutsMirror::discard()
{
    m_chords.clear();
    m_isHeld = false;
    for (Action &action : actions)
        action.pending = action.inForce;
    m_isChanged = false;
    showCurrent();
}

void ShortcutsMirror::commit()
{
    for (Action &action : actions)
        action.inForce = action.pending;
    m_isChanged = false;
    isVisible = false;
}
