// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormHistory.h"

#include "FieldEdit.h"
#include "LanguageRows.h"
#include "TextChange.h"
#include "fields/FormLayout.h"
#include "fields/ShowInChoice.h"

#include <QAction>
#include <QApplication>
#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QLineEdit>
#include <QMenu>
#include <QPointer>
#include <QScopedValueRollback>
#include <QUndoCommand>

#include <algorithm>
#include <utility>

namespace VelUI {

namespace {

constexpr int LongestHistory = 1000;

QLineEdit *lineOf(QWidget *field)
{
    auto *line = qobject_cast<QLineEdit *>(field);
    return line ? line : field->findChild<QLineEdit *>();
}

} // namespace

class FormHistory::Step : public QUndoCommand
{
public:
    Step(FormHistory &history, const FormState &before, const FormState &after)
        : QUndoCommand(history.labelOf(before, after))
        , m_history(history)
        , m_before(before)
        , m_after(after)
        , m_isTyped(after.isTypedAfter(before))
    {
    }

    void undo() override { m_history.restore(m_before, m_after); }

    void redo() override
    {
        // The first time the user did it.
        if (m_isDone)
            m_history.restore(m_after, m_before);
        m_isDone = true;
    }

    int id() const override { return m_isTyped ? 1 : -1; }

    bool mergeWith(const QUndoCommand *command) override
    {
        const auto *next = static_cast<const Step *>(command);
        if (m_history.m_beginsStep || !next->m_after.continues(m_before, m_after))
            return false;
        m_after = next->m_after;
        return true;
    }

private:
    FormHistory &m_history;
    const FormState m_before;
    FormState m_after;
    const bool m_isTyped;
    bool m_isDone = false;
};

FormHistory::FormHistory(EntryFormHost &form, LanguageRows &rows)
    : m_form(form)
    , m_rows(rows)
    , m_undo(new QAction(this))
    , m_redo(new QAction(this))
{
    m_stack.setUndoLimit(LongestHistory);
    makeActions();
    start();
    // Whether what it shows is what was loaded, nobody knows.
    m_stack.resetClean();
    connect(&m_form, &EntryFormHost::recordChanged, this, &FormHistory::look);
    connect(&m_form, &EntryFormHost::entryLoaded, this, &FormHistory::start);
    connect(&m_form, &EntryFormHost::typeSet, this, &FormHistory::start);
    connect(&m_rows, &LanguageRows::turned, this, [this] {
        m_last.language = m_rows.language();
        m_last.shown = state().shown;
        watchLines();
    });
    connect(&m_stack, &QUndoStack::indexChanged, this, &FormHistory::updateActions);
    connect(&m_stack, &QUndoStack::cleanChanged, this, [this](bool isClean) {
        if (isClean)
            Q_EMIT unchanged();
    });
    connect(qApp, &QApplication::focusChanged, this, &FormHistory::beginStep);
    watchLines();
}

FormHistory::~FormHistory()
{
    m_stack.disconnect(this);
}

void FormHistory::makeActions()
{
    m_undo->setObjectName(QStringLiteral("undoAction"));
    m_undo->setIcon(QIcon::fromTheme(QStringLiteral("edit-undo")));
    m_undo->setShortcuts(QKeySequence::Undo);
    m_redo->setObjectName(QStringLiteral("redoAction"));
    m_redo->setIcon(QIcon::fromTheme(QStringLiteral("edit-redo")));
    m_redo->setShortcuts(QKeySequence::Redo);
    for (QAction *action : {m_undo, m_redo}) {
        action->setShortcutContext(Qt::WidgetWithChildrenShortcut);
        m_form.form()->addAction(action);
    }
    const auto onTriggered = [this](QAction *action, void (QUndoStack::*step)()) {
        connect(action, &QAction::triggered, this, [this, step] {
            if (!m_form.isReadOnly())
                (m_stack.*step)();
        });
    };
    onTriggered(m_undo, &QUndoStack::undo);
    onTriggered(m_redo, &QUndoStack::redo);
    updateActions();
}

void FormHistory::updateActions()
{
    m_undo->setEnabled(m_stack.canUndo());
    m_undo->setText(m_stack.canUndo() && !m_stack.undoText().isEmpty()
                        ? tr("Undo change of %1").arg(m_stack.undoText())
                        : tr("Undo"));
    m_redo->setEnabled(m_stack.canRedo());
    m_redo->setText(m_stack.canRedo() && !m_stack.redoText().isEmpty()
                        ? tr("Redo change of %1").arg(m_stack.redoText())
                        : tr("Redo"));
}

// Lines have a history of their own, which must not take their keys.
void FormHistory::watchLines()
{
    const auto lines = m_form.formLayout()->parentWidget()->findChildren<QLineEdit *>();
    for (QLineEdit *line : lines)
        line->installEventFilter(this);
}

bool FormHistory::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::ShortcutOverride: {
        const auto &key = *static_cast<QKeyEvent *>(event);
        if (!key.matches(QKeySequence::Undo) && !key.matches(QKeySequence::Redo))
            break;
        event->accept();
        return true;
    }
    case QEvent::KeyPress:
        if (react(*static_cast<QKeyEvent *>(event)))
            return true;
        break;
    case QEvent::ContextMenu:
        showMenu(static_cast<QWidget *>(watched), static_cast<QContextMenuEvent *>(event)->globalPos());
        return true;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

bool FormHistory::react(const QKeyEvent &event)
{
    if (event.matches(QKeySequence::Undo))
        m_undo->trigger();
    else if (event.matches(QKeySequence::Redo))
        m_redo->trigger();
    else
        return false;
    return true;
}

// The menu of a line, but with the history of the form.
void FormHistory::showMenu(QWidget *line, const QPoint &place)
{
    auto *edit = qobject_cast<QLineEdit *>(line);
    QMenu *const menu = edit ? edit->createStandardContextMenu() : nullptr;
    if (!menu)
        return;
    menu->setAttribute(Qt::WA_DeleteOnClose);
    if (!edit->isReadOnly() && menu->actions().size() > 2) {
        delete menu->actions().constFirst();
        delete menu->actions().constFirst();
        menu->insertActions(menu->actions().constFirst(), {m_undo, m_redo});
    }
    menu->popup(place);
}

void FormHistory::beginStep()
{
    m_beginsStep = true;
}

void FormHistory::start()
{
    if (m_isRestoring)
        return;
    m_stack.clear();
    m_stack.setClean();
    m_last = state();
    m_beginsStep = true;
    updateActions();
}

FormState FormHistory::state() const
{
    FormState state;
    state.type = m_form.type();
    state.isTypeDecided = m_form.isTypeDecided();
    state.isOnlyShowIn = m_form.showInChoice()->isOnlyChosen();
    for (const FormRow &row : m_form.formRows())
        state.own.append(FieldEdit::value(row.field));
    for (const FormRow &row : m_rows.rows())
        state.shown.append(FieldEdit::value(row.field));
    state.language = m_rows.language();
    state.translations = m_form.translations();
    return state;
}

void FormHistory::look()
{
    if (m_isRestoring)
        return;
    const FormState now = state();
    if (m_last.isEqualTo(now))
        return;
    const FormState former = std::exchange(m_last, now);
    m_stack.push(new Step(*this, former, now));
    m_beginsStep = false;
    updateActions();
}

QString FormHistory::labelOf(const FormState &before, const FormState &after) const
{
    const QVector<FormRow> &rows = m_rows.rows();
    if (before.type != after.type)
        return rows.constFirst().label;
    for (int i = 0; i < rows.size(); ++i) {
        if (!FieldEdit::areEqual(before.shown.at(i), after.shown.at(i)))
            return rows.at(i).label;
    }
    return {};
}

void FormHistory::restore(const FormState &wanted, const FormState &left)
{
    const QScopedValueRollback<bool> restoring(m_isRestoring, true);
    m_form.quietly([&] {
        m_rows.turnTo(wanted.language);
        showFields(wanted);
    });
    m_form.tellEdit();
    m_last = state();
    m_beginsStep = true;
    focusChange(wanted, left);
}

void FormHistory::showFields(const FormState &wanted)
{
    if (m_form.type() != wanted.type || m_form.isTypeDecided() != wanted.isTypeDecided)
        m_form.showType(wanted.type, wanted.isTypeDecided);
    m_form.showInChoice()->choose(wanted.isOnlyShowIn);
    m_form.translations() = wanted.translations;
    const QVector<FormRow> &rows = m_form.formRows();
    for (int i = 0; i < rows.size(); ++i)
        FieldEdit::show(rows.at(i).field, wanted.own.at(i));
}

// Whoever takes something back wants to see it.
void FormHistory::focusChange(const FormState &wanted, const FormState &left)
{
    const QVector<FormRow> &rows = m_rows.rows();
    for (int i = 0; i < rows.size(); ++i) {
        if (FieldEdit::areEqual(wanted.shown.at(i), left.shown.at(i)) || rows.at(i).field->isHidden())
            continue;
        rows.at(i).field->setFocus();
        if (wanted.shown.at(i).userType() == QMetaType::QString)
            lineOf(rows.at(i).field)
                ->setCursorPosition(
                    TextChange(left.shown.at(i).toString(), wanted.shown.at(i).toString()).end());
        return;
    }
}

} // namespace VelUI
