// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditorKey.h"

#include <QKeyEvent>
#include <QPlainTextEdit>

EditorKey::EditorKey(QPlainTextEdit *editor, const Command &command)
    : IShortcutObject(command.name)
    , m_editor(editor)
    , m_command(command)
    , m_keyInForce(command.key)
{
    m_defaultKey = command.key;
    m_key = command.key;
    editor->installEventFilter(this);
    connect(editor, &QObject::destroyed, this, &IShortcutObject::deleteMe);
}

EditorKey::~EditorKey() = default;

QKeySequence EditorKey::objectKeySequence() const
{
    return m_keyInForce;
}

void EditorKey::setObjectKeySequence(const QKeySequence &key)
{
    m_keyInForce = key;
}

void EditorKey::setKeySequence(const QKeySequence &key)
{
    m_key = key;
}

void EditorKey::reset()
{
    m_key = objectKeySequence();
}

QKeySequence EditorKey::keySequence() const
{
    return m_key;
}

void EditorKey::apply()
{
    setObjectKeySequence(m_key);
}

QString EditorKey::group() const
{
    return m_command.group;
}

QString EditorKey::text() const
{
    return m_command.text;
}

QIcon EditorKey::icon() const
{
    return {};
}

bool EditorKey::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_editor && event->type() == QEvent::KeyPress) {
        const auto *press = static_cast<QKeyEvent *>(event);
        if (m_keyInForce == QKeySequence(int(press->modifiers()) | press->key())) {
            m_command.run(m_editor);
            return true;
        }
    }
    return IShortcutObject::eventFilter(watched, event);
}
