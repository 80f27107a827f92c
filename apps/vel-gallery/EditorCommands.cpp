// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditorCommands.h"

#include <QApplication>
#include <QCoreApplication>
#include <QDateTime>
#include <QFileDialog>
#include <QFontDatabase>
#include <QInputDialog>
#include <QMessageBox>
#include <QPlainTextEdit>
#include <QSaveFile>
#include <QScrollBar>
#include <QTextBlock>

#include <algorithm>

namespace {

using Change = QString (*)(const QString &);

struct EditorTexts
{
    Q_DECLARE_TR_FUNCTIONS(EditorCommands)
};

void openFile(QPlainTextEdit *editor)
{
    const QString path = QFileDialog::getOpenFileName(editor);
    QFile file(path);
    if (path.isEmpty())
        return;
    if (file.open(QIODevice::ReadOnly))
        editor->setPlainText(QString::fromUtf8(file.readAll()));
    else
        QMessageBox::warning(editor, EditorTexts::tr("Open"), EditorTexts::tr("Cannot read %1.").arg(path));
}

void saveFile(QPlainTextEdit *editor)
{
    const QString path = QFileDialog::getSaveFileName(editor);
    if (path.isEmpty())
        return;
    QSaveFile file(path);
    const QByteArray bytes = editor->toPlainText().toUtf8();
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size() || !file.commit())
        QMessageBox::warning(editor, EditorTexts::tr("Save"), EditorTexts::tr("Cannot write %1.").arg(path));
}

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

// Changes the selection, or the word at the cursor.
void changeWord(QPlainTextEdit *editor, Change change)
{
    QTextCursor cursor = editor->textCursor();
    if (!cursor.hasSelection())
        cursor.select(QTextCursor::WordUnderCursor);
    cursor.insertText(change(cursor.selectedText()));
}

// Changes every selected line, or the one with the cursor.
void changeLines(QPlainTextEdit *editor, const std::function<void(QStringList &)> &change)
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

void deleteTo(QPlainTextEdit *editor, QTextCursor::MoveOperation operation)
{
    QTextCursor cursor = editor->textCursor();
    cursor.movePosition(operation, QTextCursor::KeepAnchor);
    cursor.removeSelectedText();
}

void insertLine(QPlainTextEdit *editor, QTextCursor::MoveOperation side)
{
    editor->moveCursor(side);
    editor->insertPlainText(QStringLiteral("\n"));
    if (side == QTextCursor::StartOfBlock)
        editor->moveCursor(QTextCursor::PreviousBlock);
}

void select(QPlainTextEdit *editor, QTextCursor::SelectionType type)
{
    QTextCursor cursor = editor->textCursor();
    cursor.select(type);
    editor->setTextCursor(cursor);
}

void scroll(QPlainTextEdit *editor, QAbstractSlider::SliderAction action)
{
    editor->verticalScrollBar()->triggerAction(action);
}

QString swapCase(const QString &word)
{
    QString swapped = word;
    for (QChar &character : swapped)
        character = character.isUpper() ? character.toLower() : character.toUpper();
    return swapped;
}

QVector<EditorCommand> fileCommands()
{
    const QString menu = EditorTexts::tr("File");
    const auto insert = [](const QString &format) {
        return [format](QPlainTextEdit *e) {
            e->insertPlainText(QDateTime::currentDateTime().toString(format));
        };
    };
    return {
        {QStringLiteral("file-new"), menu, EditorTexts::tr("&New"), QStringLiteral("Ctrl+N"),
         [](auto *e) { e->clear(); }},
        {QStringLiteral("file-open"), menu, EditorTexts::tr("&Open..."), QStringLiteral("Ctrl+O"), openFile},
        {QStringLiteral("file-save"), menu, EditorTexts::tr("&Save..."), QStringLiteral("Ctrl+S"), saveFile},
        {QStringLiteral("insert-date"), menu, EditorTexts::tr("Insert &date"), QStringLiteral("F5"),
         insert(QStringLiteral("yyyy-MM-dd"))},
        {QStringLiteral("insert-time"), menu, EditorTexts::tr("Insert &time"), QStringLiteral("Shift+F5"),
         insert(QStringLiteral("hh:mm"))},
        {QStringLiteral("insert-rule"), menu, EditorTexts::tr("Insert &rule"), QString(),
         [](auto *e) { e->insertPlainText(QString(40, QLatin1Char('-'))); }},
    };
}

QVector<EditorCommand> basicEditCommands()
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
        {QStringLiteral("select-all"), menu, EditorTexts::tr("Select &all"), QStringLiteral("Ctrl+A"),
         [](auto *e) { e->selectAll(); }},
        {QStringLiteral("select-word"), menu, EditorTexts::tr("Select word"), QStringLiteral("Alt+W"),
         [](auto *e) { select(e, QTextCursor::WordUnderCursor); }},
        {QStringLiteral("select-line"), menu, EditorTexts::tr("Select line"), QStringLiteral("Alt+L"),
         [](auto *e) { select(e, QTextCursor::LineUnderCursor); }},
        {QStringLiteral("select-paragraph"), menu, EditorTexts::tr("Select paragraph"), QString(),
         [](auto *e) { select(e, QTextCursor::BlockUnderCursor); }},
        {QStringLiteral("find-selected"), menu, EditorTexts::tr("Find selected a&gain"), QStringLiteral("F3"),
         [](auto *e) { find(e, {}); }},
        {QStringLiteral("find-previous"), menu, EditorTexts::tr("Find selected before"),
         QStringLiteral("Shift+F3"), [](auto *e) { find(e, QTextDocument::FindBackward); }},
        {QStringLiteral("find-word"), menu, EditorTexts::tr("Find selected word"), QString(),
         [](auto *e) { find(e, QTextDocument::FindWholeWords); }},
        {QStringLiteral("find-case"), menu, EditorTexts::tr("Find selected in this case"), QString(),
         [](auto *e) { find(e, QTextDocument::FindCaseSensitively); }},
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

QVector<EditorCommand> changeCommands()
{
    const QString menu = EditorTexts::tr("Text");
    const auto lines = [](const std::function<void(QStringList &)> &change) {
        return [change](QPlainTextEdit *editor) { changeLines(editor, change); };
    };
    const auto each = [lines](const std::function<QString(const QString &)> &change) {
        return lines(
            [change](QStringList &all) { std::transform(all.begin(), all.end(), all.begin(), change); });
    };
    const auto word = [](Change change) {
        return [change](QPlainTextEdit *editor) { changeWord(editor, change); };
    };
    return {
        {QStringLiteral("word-upper"), menu, EditorTexts::tr("To upper case"), QStringLiteral("F7"),
         word([](const QString &w) { return w.toUpper(); })},
        {QStringLiteral("word-lower"), menu, EditorTexts::tr("To lower case"), QStringLiteral("Shift+F7"),
         word([](const QString &w) { return w.toLower(); })},
        {QStringLiteral("word-swap"), menu, EditorTexts::tr("Swap case"), QString(), word(swapCase)},
        {QStringLiteral("word-capital"), menu, EditorTexts::tr("Capitalise"), QString(),
         word([](const QString &w) { return w.left(1).toUpper() + w.mid(1).toLower(); })},
        {QStringLiteral("line-up"), menu, EditorTexts::tr("Move line up"), QStringLiteral("Ctrl+Shift+Up"),
         [](auto *e) { moveLine(e, -1); }},
        {QStringLiteral("line-down"), menu, EditorTexts::tr("Move line down"),
         QStringLiteral("Ctrl+Shift+Down"), [](auto *e) { moveLine(e, 1); }},
        {QStringLiteral("line-above"), menu, EditorTexts::tr("New line above"),
         QStringLiteral("Ctrl+Shift+Return"), [](auto *e) { insertLine(e, QTextCursor::StartOfBlock); }},
        {QStringLiteral("line-below"), menu, EditorTexts::tr("New line below"), QStringLiteral("Ctrl+Return"),
         [](auto *e) { insertLine(e, QTextCursor::EndOfBlock); }},
        {QStringLiteral("lines-double"), menu, EditorTexts::tr("Double lines"), QStringLiteral("Ctrl+D"),
         lines([](QStringList &all) { all += QStringList(all); })},
        {QStringLiteral("lines-join"), menu, EditorTexts::tr("Join lines"), QStringLiteral("Ctrl+J"),
         lines([](QStringList &all) { all = QStringList(all.join(QLatin1Char(' '))); })},
        {QStringLiteral("lines-sort"), menu, EditorTexts::tr("Sort lines"), QStringLiteral("Ctrl+K, Ctrl+S"),
         lines([](QStringList &all) { all.sort(); })},
        {QStringLiteral("lines-reverse"), menu, EditorTexts::tr("Reverse lines"),
         QStringLiteral("Ctrl+K, Ctrl+R"),
         lines([](QStringList &all) { std::reverse(all.begin(), all.end()); })},
        {QStringLiteral("lines-unique"), menu, EditorTexts::tr("Remove double lines"), QString(),
         lines([](QStringList &all) { all.removeDuplicates(); })},
        {QStringLiteral("lines-empty"), menu, EditorTexts::tr("Remove empty lines"), QString(),
         lines([](QStringList &all) { all.removeAll(QString()); })},
        {QStringLiteral("lines-trim"), menu, EditorTexts::tr("Trim lines"), QString(),
         each([](const QString &line) { return line.trimmed(); })},
        {QStringLiteral("lines-indent"), menu, EditorTexts::tr("Indent lines"), QStringLiteral("Ctrl+I"),
         each([](const QString &line) { return QStringLiteral("    ") + line; })},
        {QStringLiteral("lines-unindent"), menu, EditorTexts::tr("Unindent lines"),
         QStringLiteral("Ctrl+Shift+I"),
         each([](const QString &line) { return line.mid(line.startsWith(QLatin1String("    ")) ? 4 : 0); })},
        {QStringLiteral("lines-comment"), menu, EditorTexts::tr("Comment lines"),
         QStringLiteral("Ctrl+K, Ctrl+C"),
         each([](const QString &line) { return QStringLiteral("# ") + line; })},
        {QStringLiteral("lines-uncomment"), menu, EditorTexts::tr("Uncomment lines"),
         QStringLiteral("Ctrl+K, Ctrl+U"),
         each([](const QString &line) { return line.mid(line.startsWith(QLatin1String("# ")) ? 2 : 0); })},
        {QStringLiteral("lines-spaces"), menu, EditorTexts::tr("Tabulators to spaces"), QString(),
         each([](QString line) { return line.replace(QLatin1Char('\t'), QLatin1String("    ")); })},
    };
}

QVector<EditorCommand> viewCommands()
{
    const QString menu = EditorTexts::tr("View");
    return {
        {QStringLiteral("zoom-in"), menu, EditorTexts::tr("Zoom &in"), QStringLiteral("Ctrl++"),
         [](auto *e) { e->zoomIn(); }},
        {QStringLiteral("zoom-out"), menu, EditorTexts::tr("Zoom &out"), QStringLiteral("Ctrl+-"),
         [](auto *e) { e->zoomOut(); }},
        {QStringLiteral("view-wrap"), menu, EditorTexts::tr("&Wrap lines"), QStringLiteral("F10"),
         [](auto *e) {
             const bool isWrapped = e->lineWrapMode() != QPlainTextEdit::NoWrap;
             e->setLineWrapMode(isWrapped ? QPlainTextEdit::NoWrap : QPlainTextEdit::WidgetWidth);
         }},
        {QStringLiteral("view-fixed"), menu, EditorTexts::tr("&Fixed width"), QString(),
         [](auto *e) { e->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont)); }},
        {QStringLiteral("view-proportional"), menu, EditorTexts::tr("&Proportional width"), QString(),
         [](auto *e) { e->setFont(QFontDatabase::systemFont(QFontDatabase::GeneralFont)); }},
        {QStringLiteral("view-overwrite"), menu, EditorTexts::tr("O&verwrite"), QString(),
         [](auto *e) { e->setOverwriteMode(!e->overwriteMode()); }},
        {QStringLiteral("view-read-only"), menu, EditorTexts::tr("&Read only"), QString(),
         [](auto *e) { e->setReadOnly(!e->isReadOnly()); }},
        {QStringLiteral("view-cursor"), menu, EditorTexts::tr("&Broad cursor"), QString(),
         [](auto *e) { e->setCursorWidth(e->cursorWidth() == 1 ? 3 : 1); }},
        {QStringLiteral("view-centre"), menu, EditorTexts::tr("&Centre on cursor"), QStringLiteral("Ctrl+L"),
         [](auto *e) { e->centerCursor(); }},
        {QStringLiteral("scroll-up"), menu, EditorTexts::tr("Scroll &up"), QString(),
         [](auto *e) { scroll(e, QAbstractSlider::SliderSingleStepSub); }},
        {QStringLiteral("scroll-down"), menu, EditorTexts::tr("Scroll &down"), QString(),
         [](auto *e) { scroll(e, QAbstractSlider::SliderSingleStepAdd); }},
        {QStringLiteral("scroll-top"), menu, EditorTexts::tr("Scroll to &top"), QString(),
         [](auto *e) { scroll(e, QAbstractSlider::SliderToMinimum); }},
        {QStringLiteral("scroll-bottom"), menu, EditorTexts::tr("Scroll to botto&m"), QString(),
         [](auto *e) { scroll(e, QAbstractSlider::SliderToMaximum); }},
    };
}

} // namespace

QVector<EditorCommand> editorCommands()
{
    return fileCommands() + basicEditCommands() + changeCommands() + viewCommands();
}
