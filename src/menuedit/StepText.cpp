// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StepText.h"

#include <QCoreApplication>

namespace {

struct Texts
{
    const char *undo;
    const char *redo;
    const char *done;
};

// In the order of StepText::Kind. %1 is the item or the number of items, %2 the folder.
constexpr Texts AllTexts[] = {
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo creation of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo creation of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "%1 was created.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo change of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo change of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "%1 was changed.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo deletion of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo deletion of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "%1 was deleted.")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo deletion of folder %1 (%n entries)"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo deletion of folder %1 (%n entries)"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "The folder %1 was deleted (%n entries).")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo deletion of %n items"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo deletion of %n items"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "%n items were deleted.")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo deletion of %1 items (%n entries)"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo deletion of %1 items (%n entries)"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "%1 items were deleted (%n entries).")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo moving of %1 to %2"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo moving of %1 to %2"),
     QT_TRANSLATE_NOOP("MenuHistory", "%1 was moved to %2.")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo moving of %n items to %2"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo moving of %n items to %2"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "%n items were moved to %2.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo copying of %1 to %2"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo copying of %1 to %2"),
     QT_TRANSLATE_NOOP("MenuHistory", "%1 was copied to %2.")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo copying of %n items to %2"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo copying of %n items to %2"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "%n items were copied to %2.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo reordering of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo reordering of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "%1 has another place.")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo reordering of %n items"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo reordering of %n items"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "%n items have other places.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo default menu"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo default menu"),
     QT_TRANSLATE_NOOP("MenuHistory", "The default menu was built.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo hiding of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo hiding of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "%1 is hidden: the menu no longer shows it.")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo hiding of %n items"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo hiding of %n items"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "%n items are hidden: the menu no longer shows them.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo showing %1 again"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo showing %1 again"),
     QT_TRANSLATE_NOOP("MenuHistory", "The menu shows %1 again.")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo showing %n items again"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo showing %n items again"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "The menu shows %n items again.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo sorting of folder %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo sorting of folder %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "The folder %1 was sorted by name.")},
    {QT_TRANSLATE_NOOP("MenuHistory", "Undo duplication of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "Redo duplication of %1"),
     QT_TRANSLATE_NOOP("MenuHistory", "%1 was duplicated. The copy is selected.")},
    {QT_TRANSLATE_N_NOOP("MenuHistory", "Undo duplication of %n items"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "Redo duplication of %n items"),
     QT_TRANSLATE_N_NOOP("MenuHistory", "%n items were duplicated. The copies are selected.")},
};

// English has no catalog that would know the form for one.
constexpr Texts FoldersOfOne = {
    QT_TRANSLATE_NOOP("MenuHistory", "Undo deletion of %1 items (1 entry)"),
    QT_TRANSLATE_NOOP("MenuHistory", "Redo deletion of %1 items (1 entry)"),
    QT_TRANSLATE_NOOP("MenuHistory", "%1 items were deleted (1 entry)."),
};
constexpr Texts FolderOfOne = {
    QT_TRANSLATE_NOOP("MenuHistory", "Undo deletion of folder %1 (1 entry)"),
    QT_TRANSLATE_NOOP("MenuHistory", "Redo deletion of folder %1 (1 entry)"),
    QT_TRANSLATE_NOOP("MenuHistory", "The folder %1 was deleted (1 entry)."),
};

const Texts &textsOf(StepText::Kind kind, int count)
{
    const bool isOne = count == 1;
    return isOne && kind == StepText::Kind::DeleteFolder ? FolderOfOne
        : isOne && kind == StepText::Kind::DeleteFolders ? FoldersOfOne
                                                         : AllTexts[int(kind)];
}

} // namespace

StepText::StepText(Kind kind, const QString &item, int count, const QString &folder)
    : m_kind(kind)
    , m_item(item)
    , m_count(count)
    , m_folder(folder)
{
}

QString StepText::undo() const
{
    return filledIn(textsOf(m_kind, m_count).undo);
}

QString StepText::redo() const
{
    return filledIn(textsOf(m_kind, m_count).redo);
}

QString StepText::done() const
{
    return filledIn(textsOf(m_kind, m_count).done);
}

// Names may hold a % of their own, so all of it is filled in at once.
QString StepText::filledIn(const char *text) const
{
    // With a number, a catalog has no answer for a text that has but one form.
    const int number = QLatin1String(text).contains(QLatin1String("%n")) ? m_count : -1;
    const QString translated = QCoreApplication::translate("MenuHistory", text, nullptr, number);
    const bool hasItem = translated.contains(QLatin1String("%1"));
    const bool hasFolder = translated.contains(QLatin1String("%2"));
    if (hasItem && hasFolder)
        return translated.arg(m_item, m_folder);
    return hasItem ? translated.arg(m_item) : hasFolder ? translated.arg(m_folder) : translated;
}
