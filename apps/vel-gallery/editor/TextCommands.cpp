// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TextCommands.h"

#include <QPlainTextEdit>
#include <QTextBlock>

#include <algorithm>

namespace {

using WordChange = std::function<QString(const QString &)>;
using LinesChange = std::function<void(QStringList &)>;
using Run = std::function<void(QPlainTextEdit *)>;

// Changes the selection, or the word at the cursor.
void changeWord(QPlainTextEdit *editor, const WordChange &change)
{
    QTextCursor cursor = editor->textCursor();
    if (!cursor.hasSelection())
        cursor.select(QTextCursor::WordUnderCursor);
    cursor.insertText(change(cursor.selectedText()));
}

// Changes every selected line, or the one with the cursor.
void changeLines(QPlainTextEdit *editor, const LinesChange &change)
{
    QTextCursor cursor = editor->textCursor();
    const int end = cursor.selectionEnd();
    cursor.setPosition(cursor.selectionStart());
    cursor.movePosition(QTextCursor::StartOfBlock);
    cursor.setPosition(end, QTextCursor::KeepAnchor);
    cursor.movePosition(QTextCursor::EndOfBlock, QTextCursor::KeepAnchor);
    QStringList lines = cursor.selectedText().split(QChar::ParagraphSeparator);
    change(lines);
    cursor.insertText(lines.join(QLatin1Char('\n')));
}

void moveLine(QPlainTextEdit *editor, int by)
{
    QTextCursor cursor = editor->textCursor();
    const int target = cursor.blockNumber() + by;
    if (target < 0 || target >= editor->blockCount())
        return;
    QStringList lines = editor->toPlainText().split(QLatin1Char('\n'));
    lines.move(cursor.blockNumber(), target);
    cursor.select(QTextCursor::Document);
    cursor.insertText(lines.join(QLatin1Char('\n')));
    editor->setTextCursor(QTextCursor(editor->document()->findBlockByNumber(target)));
}

void insertLine(QPlainTextEdit *editor, QTextCursor::MoveOperation side)
{
    editor->moveCursor(side);
    editor->insertPlainText(QStringLiteral("\n"));
    if (side == QTextCursor::StartOfBlock)
        editor->moveCursor(QTextCursor::PreviousBlock);
}

QString swapCase(const QString &word)
{
    QString swapped = word;
    for (QChar &character : swapped)
        character = character.isUpper() ? character.toLower() : character.toUpper();
    return swapped;
}

Run word(const WordChange &change)
{
    return [change](QPlainTextEdit *editor) { changeWord(editor, change); };
}

Run lines(const LinesChange &change)
{
    return [change](QPlainTextEdit *editor) { changeLines(editor, change); };
}

Run eachLine(const WordChange &change)
{
    return lines([change](QStringList &all) { std::transform(all.begin(), all.end(), all.begin(), change); });
}

QVector<EditorCommand> wordCommands()
{
    const QString menu = EditorTexts::tr("Text");
    return {
        {QStringLiteral("word-upper"), menu, EditorTexts::tr("To upper case"), QStringLiteral("F7"),
         word([](const QString &w) { return w.toUpper(); })},
        {QStringLiteral("word-lower"), menu, EditorTexts::tr("To lower case"), QStringLiteral("Shift+F7"),
         word([](const QString &w) { return w.toLower(); })},
        {QStringLiteral("word-swap"), menu, EditorTexts::tr("Swap case"), QString(), word(swapCase)},
        {QStringLiteral("word-capital"), menu, EditorTexts::tr("Capitalize"), QString(),
         word([](const QString &w) { return w.left(1).toUpper() + w.mid(1).toLower(); })},
    };
}

QVector<EditorCommand> lineCommands()
{
    const QString menu = EditorTexts::tr("Text");
    return {
        {QStringLiteral("line-up"), menu, EditorTexts::tr("Move line up"), QStringLiteral("Ctrl+Shift+Up"),
         [](auto *e) { moveLine(e, -1); }},
        {QStringLiteral("line-down"), menu, EditorTexts::tr("Move line down"),
         QStringLiteral("Ctrl+Shift+Down"), [](auto *e) { moveLine(e, 1); }},
        {QStringLiteral("line-above"), menu, EditorTexts::tr("New line above"),
         QStringLiteral("Ctrl+Shift+Return"), [](auto *e) { insertLine(e, QTextCursor::StartOfBlock); }},
        {QStringLiteral("line-below"), menu, EditorTexts::tr("New line below"), QStringLiteral("Ctrl+Return"),
         [](auto *e) { insertLine(e, QTextCursor::EndOfBlock); }},
    };
}

// What takes the selected lines for a list.
QVector<EditorCommand> listCommands()
{
    const QString menu = EditorTexts::tr("Text");
    return {
        {QStringLiteral("lines-double"), menu, EditorTexts::tr("Duplicate lines"), QStringLiteral("Ctrl+D"),
         lines([](QStringList &all) { all += QStringList(all); })},
        {QStringLiteral("lines-join"), menu, EditorTexts::tr("Join lines"), QStringLiteral("Ctrl+J"),
         lines([](QStringList &all) { all = QStringList(all.join(QLatin1Char(' '))); })},
        {QStringLiteral("lines-sort"), menu, EditorTexts::tr("Sort lines"), QStringLiteral("Ctrl+K, Ctrl+S"),
         lines([](QStringList &all) { all.sort(); })},
        {QStringLiteral("lines-reverse"), menu, EditorTexts::tr("Reverse lines"),
         QStringLiteral("Ctrl+K, Ctrl+R"),
         lines([](QStringList &all) { std::reverse(all.begin(), all.end()); })},
        {QStringLiteral("lines-unique"), menu, EditorTexts::tr("Remove duplicate lines"), QString(),
         lines([](QStringList &all) { all.removeDuplicates(); })},
        {QStringLiteral("lines-empty"), menu, EditorTexts::tr("Remove empty lines"), QString(),
         lines([](QStringList &all) { all.removeAll(QString()); })},
    };
}

QVector<EditorCommand> eachLineCommands()
{
    const QString menu = EditorTexts::tr("Text");
    return {
        {QStringLiteral("lines-trim"), menu, EditorTexts::tr("Trim lines"), QString(),
         eachLine([](const QString &line) { return line.trimmed(); })},
        {QStringLiteral("lines-indent"), menu, EditorTexts::tr("Indent lines"), QStringLiteral("Ctrl+I"),
         eachLine([](const QString &line) { return QStringLiteral("    ") + line; })},
        {QStringLiteral("lines-unindent"), menu, EditorTexts::tr("Unindent lines"),
         QStringLiteral("Ctrl+Shift+I"), eachLine([](const QString &line) {
             return line.mid(line.startsWith(QLatin1String("    ")) ? 4 : 0);
         })},
        {QStringLiteral("lines-comment"), menu, EditorTexts::tr("Comment lines"),
         QStringLiteral("Ctrl+K, Ctrl+C"),
         eachLine([](const QString &line) { return QStringLiteral("# ") + line; })},
        {QStringLiteral("lines-uncomment"), menu, EditorTexts::tr("Uncomment lines"),
         QStringLiteral("Ctrl+K, Ctrl+U"), eachLine([](const QString &line) {
             return line.mid(line.startsWith(QLatin1String("# ")) ? 2 : 0);
         })},
        {QStringLiteral("lines-spaces"), menu, EditorTexts::tr("Tabs to spaces"), QString(),
         eachLine([](QString line) { return line.replace(QLatin1Char('\t'), QLatin1String("    ")); })},
    };
}

} // namespace

QVector<EditorCommand> textCommands()
{
    return wordCommands() + lineCommands() + listCommands() + eachLineCommands();
}
