// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RecordedKey.h"

#include "KeySequences.h"

namespace {

// The dead keys have a block of their own, which grows with Qt.
constexpr int LastDeadKey = 0x010012ff;

bool isDead(int key)
{
    return key >= Qt::Key_Dead_Grave && key <= LastDeadKey;
}

// Changes what other keys give, and gives nothing itself.
bool changesOtherKeys(int key)
{
    switch (key) {
    case Qt::Key_AltGr:
    case Qt::Key_CapsLock:
    case Qt::Key_Codeinput:
    case Qt::Key_Direction_L:
    case Qt::Key_Direction_R:
    case Qt::Key_Eisu_Shift:
    case Qt::Key_Eisu_toggle:
    case Qt::Key_Hyper_L:
    case Qt::Key_Hyper_R:
    case Qt::Key_Kana_Lock:
    case Qt::Key_Kana_Shift:
    case Qt::Key_Mode_switch:
    case Qt::Key_Multi_key:
    case Qt::Key_NumLock:
    case Qt::Key_ScrollLock:
    case Qt::Key_Super_L:
    case Qt::Key_Super_R:
        return true;
    default:
        return false;
    }
}

} // namespace

bool RecordedKey::isModifier(int key)
{
    return key == Qt::Key_Control || key == Qt::Key_Shift || key == Qt::Key_Alt || key == Qt::Key_Meta;
}

bool RecordedKey::isChord(int key, Qt::KeyboardModifiers modifiers)
{
    if (key == 0 || isModifier(key) || changesOtherKeys(key) || isDead(key))
        return false;
    const Qt::KeyboardModifiers held =
        modifiers & (Qt::ShiftModifier | Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier);
    return KeySequences::survivesSaving(QKeySequence(key | int(held)));
}
