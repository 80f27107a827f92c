// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ViewCommands.h"

#include <QFontDatabase>
#include <QPlainTextEdit>
#include <QScrollBar>

namespace {

void scroll(QPlainTextEdit *editor, QAbstractSlider::SliderAction action)
{
    editor->verticalScrollBar()->triggerAction(action);
}

QVector<EditorCommand> showCommands()
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
        {QStringLiteral("view-fixed"), menu, EditorTexts::tr("&Fixed-width font"), QString(),
         [](auto *e) { e->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont)); }},
        {QStringLiteral("view-proportional"), menu, EditorTexts::tr("&Proportional font"), QString(),
         [](auto *e) { e->setFont(QFontDatabase::systemFont(QFontDatabase::GeneralFont)); }},
        {QStringLiteral("view-overwrite"), menu, EditorTexts::tr("O&verwrite"), QString(),
         [](auto *e) { e->setOverwriteMode(!e->overwriteMode()); }},
        {QStringLiteral("view-read-only"), menu, EditorTexts::tr("&Read only"), QString(),
         [](auto *e) { e->setReadOnly(!e->isReadOnly()); }},
        {QStringLiteral("view-cursor"), menu, EditorTexts::tr("Wide cur&sor"), QString(),
         [](auto *e) { e->setCursorWidth(e->cursorWidth() == 1 ? 3 : 1); }},
        {QStringLiteral("view-centre"), menu, EditorTexts::tr("&Center on cursor"), QStringLiteral("Ctrl+L"),
         [](auto *e) { e->centerCursor(); }},
    };
}

QVector<EditorCommand> scrollCommands()
{
    const QString menu = EditorTexts::tr("View");
    return {
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

QVector<EditorCommand> viewCommands()
{
    return showCommands() + scrollCommands();
}
