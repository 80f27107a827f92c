// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditCommands.h"

#include <QApplication>
#include <QInputDialog>
#include <QPlainTextEdit>
#include <QTextBlock>

namespace {

void find(QPlainTextEdit *editor, QTextDocument::FindFlags flags)
{
    if (!editor->find(editor->textCursor().selectedText(), flags))
        QApplication::beep();
}

void goToLine(QPlainTextEdit *editor)
{
    bool ok = false;
    const int line = QInputDialog::getInt(editor, EditorTexts::tr("Go to line"), EditorTexts::tr("Line:"), 1,
                                          1, editor->blockCount(), 1, &ok);
    if (ok)
        editor->setTextCursor(QTextCursor(editor->document()->findBlockByNumber(line - 1)));
}

void deleteTo(QPlainTextEdit *editor, QTextCursor::MoveOperation operation)
{
    QTextCursor cursor = editor->textCursor();
    cursor.movePosition(operation, QTextCursor::KeepAnchor);
    cursor.removeSelectedText();
}

void select(QPlainTextEdit *editor, QTextCursor::SelectionType type)
{
    QTextCursor cursor = editor->textCursor();
    cursor.select(type);
    editor->setTextCursor(cursor);
}

QVector<EditorCommand> clipboardCommands()
{
    const QString menu = EditorTexts::tr("Edit");
    return {
        {QStringLiteral("edit-undo"), menu, EditorTexts::tr("&Undo"), QStringLiteral("Ctrl+Z"),
         [](auto *e) { e->undo(); }},
        {QStringLiteral("edit-redo"), menu, EditorTexts::tr("&Redo"), QStringLiteral("Ctrl+Shift+Z"),
         [](auto *e) { e->redo(); }},
        {QStringLiteral("edit-cut"), menu, EditorTexts::tr("Cu&t"), QStringLiteral("Ctrl+X"),
         [](auto *e) { e->cut(); }},
        {QStringLiteral("edit-copy"), menu, EditorTexts::tr("&Copy"), QStringLiteral("Ctrl+C"),
         [](auto *e) { e->copy(); }},
        {QStringLiteral("edit-paste"), menu, EditorTexts::tr("&Paste"), QStringLiteral("Ctrl+V"),
         [](auto *e) { e->paste(); }},
    };
}

QVector<EditorCommand> selectCommands()
{
    const QString menu = EditorTexts::tr("Edit");
    return {
        {QStringLiteral("select-all"), menu, EditorTexts::tr("Select &all"), QStringLiteral("Ctrl+A"),
         [](auto *e) { e->selectAll(); }},
        {QStringLiteral("select-word"), menu, EditorTexts::tr("Select word"), QStringLiteral("Alt+W"),
         [](auto *e) { select(e, QTextCursor::WordUnderCursor); }},
        {QStringLiteral("select-line"), menu, EditorTexts::tr("Select line"), QStringLiteral("Alt+L"),
         [](auto *e) { select(e, QTextCursor::LineUnderCursor); }},
        {QStringLiteral("select-paragraph"), menu, EditorTexts::tr("Select paragraph"), QString(),
         [](auto *e) { select(e, QTextCursor::BlockUnderCursor); }},
    };
}

QVector<EditorCommand> findCommands()
{
    const QString menu = EditorTexts::tr("Edit");
    return {
        {QStringLiteral("find-selected"), menu, EditorTexts::tr("Find selected a&gain"), QStringLiteral("F3"),
         [](auto *e) { find(e, {}); }},
        {QStringLiteral("find-previous"), menu, EditorTexts::tr("Find selected backward"),
         QStringLiteral("Shift+F3"), [](auto *e) { find(e, QTextDocument::FindBackward); }},
        {QStringLiteral("find-word"), menu, EditorTexts::tr("Find selected word"), QString(),
         [](auto *e) { find(e, QTextDocument::FindWholeWords); }},
        {QStringLiteral("find-case"), menu, EditorTexts::tr("Find selected, matching case"), QString(),
         [](auto *e) { find(e, QTextDocument::FindCaseSensitively); }},
    };
}

QVector<EditorCommand> goCommands()
{
    const QString menu = EditorTexts::tr("Edit");
    return {
        {QStringLiteral("go-line"), menu, EditorTexts::tr("Go to &line..."), QStringLiteral("Ctrl+G"),
         goToLine},
        {QStringLiteral("go-start"), menu, EditorTexts::tr("Go to start"), QString(),
         [](auto *e) { e->moveCursor(QTextCursor::Start); }},
        {QStringLiteral("go-end"), menu, EditorTexts::tr("Go to end"), QString(),
         [](auto *e) { e->moveCursor(QTextCursor::End); }},
        {QStringLiteral("go-next"), menu, EditorTexts::tr("Go to next paragraph"), QStringLiteral("Alt+Down"),
         [](auto *e) { e->moveCursor(QTextCursor::NextBlock); }},
        {QStringLiteral("go-previous"), menu, EditorTexts::tr("Go to previous paragraph"),
         QStringLiteral("Alt+Up"), [](auto *e) { e->moveCursor(QTextCursor::PreviousBlock); }},
    };
}

QVector<EditorCommand> deleteCommands()
{
    const QString menu = EditorTexts::tr("Edit");
    return {
        {QStringLiteral("delete-word-left"), menu, EditorTexts::tr("Delete word to the left"), QString(),
         [](auto *e) { deleteTo(e, QTextCursor::PreviousWord); }},
        {QStringLiteral("delete-word-right"), menu, EditorTexts::tr("Delete word to the right"), QString(),
         [](auto *e) { deleteTo(e, QTextCursor::NextWord); }},
        {QStringLiteral("delete-to-start"), menu, EditorTexts::tr("Delete to start of line"), QString(),
         [](auto *e) { deleteTo(e, QTextCursor::StartOfBlock); }},
        {QStringLiteral("delete-to-end"), menu, EditorTexts::tr("Delete to end of line"), QString(),
         [](auto *e) { deleteTo(e, QTextCursor::EndOfBlock); }},
    };
}

} // namespace

QVector<EditorCommand> editCommands()
{
    return clipboardCommands() + selectCommands() + findCommands() + goCommands() + deleteCommands();
}
