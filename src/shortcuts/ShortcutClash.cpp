// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutClash.h"

#include "FurtherKeys.h"
#include "IShortcutObject.h"
#include "KeySequences.h"
#include "KeyboardLayout.h"
#include "ShortcutConflict.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"
#include "StandardKeyNames.h"
#include "VelKeyServer.h"
#include "WindowMnemonics.h"

#include <frame/QtMajor.h>

#include <QCoreApplication>

#include <algorithm>

namespace {

using Clashes = QVector<ShortcutClash>;

QString shown(const QKeySequence &key)
{
    return key.toString(QKeySequence::NativeText);
}

ShortcutClash sameKey(const QKeySequence &key, const IShortcutObject &other)
{
    const QString text = other.keySequence() == key
        ? QCoreApplication::translate("ShortcutClash", "Shortcut '%1' is already used for action '%2'.")
        : QCoreApplication::translate("ShortcutClash", "Shortcut '%1' is a further shortcut of action '%2'.");
    return {ShortcutClash::SameKey, text.arg(shown(key), other.text()), other.name()};
}

ShortcutClash longerKey(const QKeySequence &key, const QKeySequence &longer, const IShortcutObject &other)
{
    return {ShortcutClash::Prefix,
            QCoreApplication::translate("ShortcutClash", "Shortcut '%2' of action '%3' begins with '%1'.")
                .arg(shown(key), shown(longer), other.text()),
            other.name()};
}

ShortcutClash shorterKey(const QKeySequence &key, const QKeySequence &shorter, const IShortcutObject &other)
{
    return {ShortcutClash::Prefix,
            QCoreApplication::translate("ShortcutClash",
                                        "Shortcut '%2' begins with '%1', the shortcut of action '%3'.")
                .arg(shown(shorter), shown(key), other.text()),
            other.name()};
}

void addClash(const QKeySequence &key, const IShortcutObject &other, const QKeySequence &otherKey,
              Clashes *clashes)
{
    if (otherKey.isEmpty()) // would begin every key
        return;
    if (otherKey == key)
        clashes->append(sameKey(key, other));
    else if (key.matches(otherKey) == QKeySequence::PartialMatch)
        clashes->append(longerKey(key, otherKey, other));
    else if (otherKey.matches(key) == QKeySequence::PartialMatch)
        clashes->append(shorterKey(key, otherKey, other));
}

Clashes withModel(const ShortcutsModel &model, const QString &name, const QKeySequence &key)
{
    Clashes clashes;
    for (int group = 0; group < model.rowCount(); ++group) {
        const QVector<const IShortcutObject *> objects = ShortcutRows::ofGroup(model, group);
        for (const IShortcutObject *other : objects) {
            if (!other || other->name() == name)
                continue;
            addClash(key, *other, other->keySequence(), &clashes);
            const QList<QKeySequence> further = FurtherKeys::of(*other);
            for (const QKeySequence &otherKey : further)
                addClash(key, *other, otherKey, &clashes);
        }
    }
    std::stable_sort(
        clashes.begin(), clashes.end(),
        [](const ShortcutClash &left, const ShortcutClash &right) { return left.kind < right.kind; });
    return clashes;
}

Clashes withMnemonics(const QWidget &window, const QKeySequence &chord)
{
    Clashes clashes;
    const QVector<WindowMnemonics::Owner> owners = WindowMnemonics::ownersOf(window, chord);
    for (const WindowMnemonics::Owner &owner : owners) {
        const QString text = owner.isMenu
            ? QCoreApplication::translate("ShortcutClash", "Shortcut '%1' opens the menu '%2'.")
            : QCoreApplication::translate("ShortcutClash", "Shortcut '%1' leads to '%2' in the window.");
        clashes.append({ShortcutClash::Mnemonic, text.arg(shown(chord), owner.text), QString()});
    }
    return clashes;
}

Clashes withStandardKeys(const QKeySequence &chord)
{
    Clashes clashes;
    const QStringList names = StandardKeyNames::of(chord);
    for (const QString &name : names) {
        clashes.append(
            {ShortcutClash::StandardKey,
             QCoreApplication::translate("ShortcutClash", "Shortcut '%1' is the standard shortcut for '%2'.")
                 .arg(shown(chord), name),
             QString()});
    }
    return clashes;
}

Clashes withGlobalKeys(const QKeySequence &key)
{
    const QString action = VelKeyServer::checkForGlobalShortcut(key);
    if (!ShortcutConflict::blocksKey(action))
        return {};
    return {
        {ShortcutClash::GlobalKey,
         QCoreApplication::translate("ShortcutClash", "Shortcut '%1' is already used for global action '%2'.")
             .arg(shown(key), action),
         QString()}};
}

Clashes withTyping(int chord)
{
    constexpr int Named = 0x01000000; // from here on no key has a character
    const int key = chord & ~int(Qt::KeyboardModifierMask);
    const int held = chord & int(Qt::KeyboardModifierMask) & ~int(Qt::ShiftModifier | Qt::KeypadModifier);
    if (held != 0 || key >= Named || !QChar::isPrint(uint(key)))
        return {};
    return {{ShortcutClash::BareKey,
             QCoreApplication::translate("ShortcutClash",
                                         "With '%1' as a shortcut this key cannot be typed into texts.")
                 .arg(shown(QKeySequence(chord))),
             QString()}};
}

Clashes withLayout(const QKeySequence &key)
{
    for (int i = 0; i < key.count(); ++i) {
        if (KeyboardLayout::produces(QtMajor::chord(key, i)))
            continue;
        const QString text =
            QCoreApplication::translate("ShortcutClash", "The current keyboard layout cannot produce '%1'.");
        return {
            {ShortcutClash::NotOnLayout, text.arg(shown(QKeySequence(QtMajor::chord(key, i)))), QString()}};
    }
    return {};
}

} // namespace

QVector<ShortcutClash> ShortcutClash::find(const ShortcutsModel &model, const QString &name,
                                           const QKeySequence &key, const QWidget *window)
{
    if (key.isEmpty() || !KeySequences::isKnown(key))
        return {};
    const QKeySequence chord(QtMajor::chord(key, 0));
    return withModel(model, name, key) + (window ? withMnemonics(*window, chord) : Clashes())
        + withStandardKeys(chord) + withGlobalKeys(key) + withTyping(QtMajor::chord(key, 0))
        + withLayout(key);
}
