// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutsMirror.h"

#include <algorithm>

namespace {

QKeySequence sequenceOf(QVector<int> chords)
{
    chords.resize(4);
    return {chords.at(0), chords.at(1), chords.at(2), chords.at(3)};
}

// Whether one is the beginning of the other, or the same.
bool clash(const QKeySequence &left, const QKeySequence &right)
{
    const int count = qMin(left.count(), right.count());
    for (int i = 0; i < count; ++i) {
        if (left[uint(i)] != right[uint(i)])
            return false;
    }
    return count > 0;
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
    stopRecording();
    m_isChanged = false;
    m_filter.clear();
    m_leftRow = -1;
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

bool ShortcutsMirror::isGlobal(const QKeySequence &key) const
{
    const auto global = m_globals.find(key.toString());
    return global != m_globals.end()
        && !(global->second.startsWith(QLatin1String("VELWM_"))
             && global->second.contains(QLatin1String("_ICON")));
}

ShortcutsMirror::Messages ShortcutsMirror::refuse(const QKeySequence &key) const
{
    if (isGlobal(key))
        return {{Message::Global, key.toString(), m_globals.at(key.toString())}};
    for (std::size_t i = 0; i < actions.size(); ++i) {
        if (rowOf(int(i)) == int(i) && actions[i].pending == key)
            return {{Message::Local, key.toString(), actions[i].text}};
    }
    return {};
}

void ShortcutsMirror::stopRecording()
{
    m_chords.clear();
    m_isHeld = false;
}

ShortcutsMirror::Messages ShortcutsMirror::endRecording()
{
    if (!isRecording())
        return {};
    const QKeySequence key = sequenceOf(m_chords);
    stopRecording();
    if (key == actions[std::size_t(current)].pending)
        return {};
    const Messages messages = refuse(key);
    if (messages.empty())
        setPending(key);
    return messages;
}

// Assistance keeps a key that would be refused, for as long as the user is about it.
ShortcutsMirror::Messages ShortcutsMirror::pause()
{
    if (hasAssistance && isRecording()) {
        const QKeySequence key = sequenceOf(m_chords);
        m_isHeld = key != actions[std::size_t(current)].pending && !refuse(key).empty();
    }
    return m_isHeld ? Messages() : endRecording();
}

ShortcutsMirror::Messages ShortcutsMirror::clickRow(int row)
{
    const Messages messages = endRecording();
    const bool isOther = row != current;
    current = row;
    m_leftRow = -1;
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
        stopRecording();
    m_chords.append(chord);
    return m_chords.size() == 4 ? pause() : Messages();
}

ShortcutsMirror::Messages ShortcutsMirror::leaveField()
{
    return endRecording();
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
    stopRecording();
    isVisible = false;
    return {};
}

void ShortcutsMirror::discard()
{
    stopRecording();
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

ShortcutsMirror::Messages ShortcutsMirror::clickNone()
{
    pause();
    stopRecording();
    if (!actions[std::size_t(current)].pending.isEmpty())
        setPending({});
    return {};
}

QStringList ShortcutsMirror::holders() const
{
    QStringList names;
    if (current < 0 || isGlobal(shownKey()))
        return names;
    const Action &own = actions[std::size_t(current)];
    for (std::size_t i = 0; i < actions.size(); ++i) {
        if (rowOf(int(i)) == int(i) && actions[i].name != own.name && clash(actions[i].pending, shownKey()))
            names.append(actions[i].name);
    }
    return names;
}

ShortcutsMirror::Messages ShortcutsMirror::takeOver(const QString &name)
{
    const QKeySequence key = shownKey();
    pause();
    for (std::size_t i = 0; i < actions.size(); ++i) {
        if (actions[i].name == name && rowOf(int(i)) == int(i) && clash(actions[i].pending, key))
            actions[i].pending = QKeySequence();
    }
    m_isChanged = true;
    canRestore = true;
    return pause();
}

ShortcutsMirror::Messages ShortcutsMirror::goTo(const QString &name)
{
    const QKeySequence key = shownKey();
    pause();
    stopRecording();
    const auto isOther = [&](const Action &action) {
        return action.name == name && clash(action.pending, key);
    };
    current = int(std::find_if(actions.begin(), actions.end(), isOther) - actions.begin());
    m_leftRow = -1;
    showCurrent();
    return {};
}

ShortcutsMirror::Messages ShortcutsMirror::takeBack()
{
    Action &action = actions[std::size_t(current)];
    const bool isEdited = action.pending != action.inForce;
    if (!isEdited && action.pending == action.defaultKey)
        return {};
    action.pending = isEdited ? action.inForce : action.defaultKey;
    m_isChanged = false;
    for (const Action &each : actions)
        m_isChanged = m_isChanged || each.pending != each.inForce;
    canRestore = true;
    showCurrent();
    return {};
}

bool ShortcutsMirror::isSeen(int row) const
{
    const Action &action = actions[std::size_t(row)];
    return action.group.contains(m_filter, Qt::CaseInsensitive)
        || action.text.contains(m_filter, Qt::CaseInsensitive);
}

ShortcutsMirror::Messages ShortcutsMirror::setFilter(const QString &text)
{
    const Messages messages = endRecording();
    m_filter = text;
    if (current >= 0 && !isSeen(current)) {
        m_leftRow = current;
        current = -1;
    } else if (current < 0 && m_leftRow >= 0 && isSeen(m_leftRow)) {
        current = m_leftRow;
        showCurrent();
    }
    return messages;
}
