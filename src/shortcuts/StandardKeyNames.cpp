// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StandardKeyNames.h"

#include <QCoreApplication>

#include <algorithm>
#include <iterator>

namespace {

struct StandardName
{
    QKeySequence::StandardKey key;
    const char *name;
};

constexpr char Context[] = "StandardKeyNames";

constexpr StandardName Names[] = {
    {QKeySequence::HelpContents, QT_TRANSLATE_NOOP("StandardKeyNames", "Help")},
    {QKeySequence::WhatsThis, QT_TRANSLATE_NOOP("StandardKeyNames", "What's this?")},
    {QKeySequence::Open, QT_TRANSLATE_NOOP("StandardKeyNames", "Open")},
    {QKeySequence::Close, QT_TRANSLATE_NOOP("StandardKeyNames", "Close")},
    {QKeySequence::Save, QT_TRANSLATE_NOOP("StandardKeyNames", "Save")},
    {QKeySequence::SaveAs, QT_TRANSLATE_NOOP("StandardKeyNames", "Save as")},
    {QKeySequence::New, QT_TRANSLATE_NOOP("StandardKeyNames", "New")},
    {QKeySequence::Delete, QT_TRANSLATE_NOOP("StandardKeyNames", "Delete")},
    {QKeySequence::Cut, QT_TRANSLATE_NOOP("StandardKeyNames", "Cut")},
    {QKeySequence::Copy, QT_TRANSLATE_NOOP("StandardKeyNames", "Copy")},
    {QKeySequence::Paste, QT_TRANSLATE_NOOP("StandardKeyNames", "Paste")},
    {QKeySequence::Undo, QT_TRANSLATE_NOOP("StandardKeyNames", "Undo")},
    {QKeySequence::Redo, QT_TRANSLATE_NOOP("StandardKeyNames", "Redo")},
    {QKeySequence::Back, QT_TRANSLATE_NOOP("StandardKeyNames", "Back")},
    {QKeySequence::Forward, QT_TRANSLATE_NOOP("StandardKeyNames", "Forward")},
    {QKeySequence::Refresh, QT_TRANSLATE_NOOP("StandardKeyNames", "Refresh")},
    {QKeySequence::ZoomIn, QT_TRANSLATE_NOOP("StandardKeyNames", "Zoom in")},
    {QKeySequence::ZoomOut, QT_TRANSLATE_NOOP("StandardKeyNames", "Zoom out")},
    {QKeySequence::Print, QT_TRANSLATE_NOOP("StandardKeyNames", "Print")},
    {QKeySequence::AddTab, QT_TRANSLATE_NOOP("StandardKeyNames", "New tab")},
    {QKeySequence::NextChild, QT_TRANSLATE_NOOP("StandardKeyNames", "Next tab")},
    {QKeySequence::PreviousChild, QT_TRANSLATE_NOOP("StandardKeyNames", "Previous tab")},
    {QKeySequence::Find, QT_TRANSLATE_NOOP("StandardKeyNames", "Find")},
    {QKeySequence::FindNext, QT_TRANSLATE_NOOP("StandardKeyNames", "Find next")},
    {QKeySequence::FindPrevious, QT_TRANSLATE_NOOP("StandardKeyNames", "Find previous")},
    {QKeySequence::Replace, QT_TRANSLATE_NOOP("StandardKeyNames", "Replace")},
    {QKeySequence::SelectAll, QT_TRANSLATE_NOOP("StandardKeyNames", "Select all")},
    {QKeySequence::Deselect, QT_TRANSLATE_NOOP("StandardKeyNames", "Deselect")},
    {QKeySequence::FullScreen, QT_TRANSLATE_NOOP("StandardKeyNames", "Full screen")},
    {QKeySequence::Preferences, QT_TRANSLATE_NOOP("StandardKeyNames", "Preferences")},
    {QKeySequence::Quit, QT_TRANSLATE_NOOP("StandardKeyNames", "Quit")},
    {QKeySequence::Cancel, QT_TRANSLATE_NOOP("StandardKeyNames", "Cancel")},
    {QKeySequence::Bold, QT_TRANSLATE_NOOP("StandardKeyNames", "Bold")},
    {QKeySequence::Italic, QT_TRANSLATE_NOOP("StandardKeyNames", "Italic")},
    {QKeySequence::Underline, QT_TRANSLATE_NOOP("StandardKeyNames", "Underline")},
};

constexpr char MoveCursor[] = QT_TRANSLATE_NOOP("StandardKeyNames", "Move the cursor");
constexpr char SelectText[] = QT_TRANSLATE_NOOP("StandardKeyNames", "Select text");
constexpr char EditText[] = QT_TRANSLATE_NOOP("StandardKeyNames", "Edit text");

// Those that a text editor has by the dozen share a name.
constexpr QKeySequence::StandardKey EditingKeys[] = {
    QKeySequence::DeleteStartOfWord,   QKeySequence::DeleteEndOfWord, QKeySequence::DeleteEndOfLine,
    QKeySequence::DeleteCompleteLine,  QKeySequence::Backspace,       QKeySequence::InsertParagraphSeparator,
    QKeySequence::InsertLineSeparator,
};

bool isBoundTo(QKeySequence::StandardKey standardKey, const QKeySequence &key)
{
    return QKeySequence::keyBindings(standardKey).contains(key);
}

template <typename Keys>
bool isBoundToOne(const Keys &standardKeys, const QKeySequence &key)
{
    return std::any_of(std::begin(standardKeys), std::end(standardKeys),
                       [&](QKeySequence::StandardKey standardKey) { return isBoundTo(standardKey, key); });
}

bool isBoundWithin(QKeySequence::StandardKey first, QKeySequence::StandardKey last, const QKeySequence &key)
{
    for (int standardKey = first; standardKey <= last; ++standardKey) {
        if (isBoundTo(QKeySequence::StandardKey(standardKey), key))
            return true;
    }
    return false;
}

} // namespace

QStringList StandardKeyNames::of(const QKeySequence &key)
{
    QStringList names;
    for (const StandardName &standard : Names) {
        if (isBoundTo(standard.key, key))
            names.append(QCoreApplication::translate(Context, standard.name));
    }
    if (isBoundWithin(QKeySequence::MoveToNextChar, QKeySequence::MoveToEndOfDocument, key))
        names.append(QCoreApplication::translate(Context, MoveCursor));
    if (isBoundWithin(QKeySequence::SelectNextChar, QKeySequence::SelectEndOfDocument, key))
        names.append(QCoreApplication::translate(Context, SelectText));
    if (isBoundToOne(EditingKeys, key))
        names.append(QCoreApplication::translate(Context, EditText));
    return names;
}
