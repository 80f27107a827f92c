// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuHistory.h"

#include "FileWork.h"
#include "MenuFind.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "ShownMenu.h"
#include "StepCommand.h"
#include "StepRecorder.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/EntryPath.h>

#include <QAction>
#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QIcon>
#include <QPointer>
#include <QShortcut>
#include <QTreeView>

#include <algorithm>

namespace {

constexpr int FewPaths = 20;

QStringList goneOf(QStringList paths)
{
    const auto isThere = [](const QString &path) { return QFileInfo::exists(path); };
    paths.erase(std::remove_if(paths.begin(), paths.end(), isThere), paths.end());
    return paths;
}

// As the text of a command, in which a "&" would mark a letter.
QString literal(QString text)
{
    return text.replace(QLatin1Char('&'), QLatin1String("&&"));
}

} // namespace

MenuHistory::MenuHistory(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuFind &find,
                         MenuVoice &voice)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
    , m_find(find)
    , m_voice(voice)
{
    connect(&m_stack, &QUndoStack::indexChanged, this, &MenuHistory::updateActions);
}

// The stack tells of its end when the actions are gone already.
MenuHistory::~MenuHistory()
{
    m_stack.disconnect(this);
}

void MenuHistory::setOn(bool on)
{
    if (on == isOn())
        return;
    m_keys.clear();
    m_undo.reset();
    m_redo.reset();
    m_stack.clear();
    if (!on)
        return;
    m_undo = makeAction("undoAction", "edit-undo", QStringLiteral("Ctrl+Z"));
    m_redo = makeAction("redoAction", "edit-redo", QStringLiteral("Ctrl+Shift+Z"));
    connect(m_undo.get(), &QAction::triggered, this, &MenuHistory::undo);
    connect(m_redo.get(), &QAction::triggered, this, &MenuHistory::redo);
    updateActions();
}

std::unique_ptr<QAction> MenuHistory::makeAction(const char *name, const char *icon, const QString &keys)
{
    auto action = std::make_unique<QAction>(QIcon::fromTheme(QLatin1String(icon)), QString());
    action->setObjectName(QLatin1String(name));
    action->setShortcut(QKeySequence(keys));
    // No widget has the action, so that its keys need somebody who listens.
    m_keys.push_back(std::make_unique<QShortcut>(action->shortcut(), m_view));
    m_keys.back()->setContext(Qt::WidgetShortcut);
    connect(m_keys.back().get(), &QShortcut::activated, action.get(), &QAction::trigger);
    return action;
}

void MenuHistory::updateActions()
{
    if (!isOn())
        return;
    const StepCommand *past = commandAt(m_stack.index() - 1);
    const StepCommand *next = commandAt(m_stack.index());
    m_undo->setText(past ? literal(past->text().undo()) : QCoreApplication::translate("MenuHistory", "Undo"));
    m_redo->setText(next ? literal(next->text().redo()) : QCoreApplication::translate("MenuHistory", "Redo"));
    m_undo->setEnabled(past);
    m_redo->setEnabled(next);
}

const StepCommand *MenuHistory::commandAt(int index) const
{
    return static_cast<const StepCommand *>(m_stack.command(index));
}

std::unique_ptr<StepRecorder> MenuHistory::record() const
{
    return isOn() ? std::make_unique<StepRecorder>() : nullptr;
}

MenuVoice::Subject MenuHistory::add(const std::unique_ptr<StepRecorder> &recorder, const StepText &text,
                                    const QStringList &items)
{
    FileStep step = recorder && isOn() ? recorder->finish() : FileStep();
    if (step.isEmpty())
        return MenuVoice::Subject::Other;
    m_stack.push(new StepCommand(std::move(step), text, items));
    m_voice.tell(text.done(), MenuVoice::Note, QModelIndex(), MenuVoice::Subject::Step);
    return MenuVoice::Subject::Rest;
}

QString MenuHistory::nameOf(const QString &path) const
{
    const QFileInfo info(path);
    const QString name = m_menu.files().displayOf(path, info.isDir()).name;
    return name.isEmpty() ? info.fileName() : name;
}

void MenuHistory::run(bool isUndo)
{
    const StepCommand *command = commandAt(m_stack.index() - (isUndo ? 1 : 0));
    if (!command || m_isRunning)
        return;
    const QStringList paths = command->step().paths();
    const QStringList released = m_menu.files().release(paths);
    const QPointer<MenuHistory> self(this);
    // The view may go while this takes long, and the stack with it.
    FileStep step = std::move(command->step());
    m_isRunning = true;
    // While many come and go one by one, their folders would be read anew again and again.
    const bool areMany = paths.size() > FewPaths;
    if (areMany)
        m_menu.files().setWatching(false);
    const Refusal refusal = follow(step, isUndo);
    if (!self)
        return;
    m_isRunning = false;
    if (areMany)
        m_menu.files().setWatching(true);
    command->step() = std::move(step);
    m_menu.files().watchAgain(released);
    if (!refusal) {
        takeIn(paths);
        finish(*command, isUndo);
        return;
    }
    if (refusal.isForGood) {
        command->giveUp();
        turnStack(isUndo);
    }
    refuse(refusal.reason, isUndo);
}

void MenuHistory::turnStack(bool isUndo)
{
    if (isUndo)
        m_stack.undo();
    else
        m_stack.redo();
}

void MenuHistory::finish(const StepCommand &command, bool isUndo)
{
    const QString text = isUndo ? command.text().undo() : command.text().redo();
    const QPointer<MenuHistory> self(this);
    turnStack(isUndo);
    show(command.items());
    m_find.clear();
    Q_EMIT changed();
    if (self)
        m_voice.tell(QCoreApplication::translate("MenuHistory", "Done: %1").arg(text), MenuVoice::Note,
                     QModelIndex(), isUndo ? MenuVoice::Subject::Other : MenuVoice::Subject::Step);
}

Refusal MenuHistory::follow(FileStep &step, bool isUndo) const
{
    FileWork work(m_view,
                  isUndo ? QCoreApplication::translate("MenuHistory", "Undo")
                         : QCoreApplication::translate("MenuHistory", "Redo"),
                  QCoreApplication::translate("MenuHistory", "Moving files..."));
    return isUndo ? step.undo(work) : step.redo(work);
}

void MenuHistory::refuse(const QString &reason, bool isUndo)
{
    m_voice.tell((isUndo ? QCoreApplication::translate("MenuHistory", "Nothing was undone: %1")
                         : QCoreApplication::translate("MenuHistory", "Nothing was done again: %1"))
                     .arg(reason),
                 MenuVoice::Failure, m_view->currentIndex());
}

// The models learn at once what is where, and read anew what they knew of it.
void MenuHistory::takeIn(const QStringList &paths)
{
    const QString menu = menuDirectory();
    const QString target = QFileInfo(menu).canonicalFilePath();
    QStringList items;
    QSet<QString> folders;
    for (const QString &path : paths) {
        if (path == menu || path == target) {
            Q_EMIT replaced();
            return;
        }
        const QString item = EntryPath::describedBy(path);
        const QString folder = item == path ? QFileInfo(path).path() : item;
        if (folder != menu && !folder.startsWith(menu + QLatin1Char('/')))
            continue;
        m_menu.files().noteRecordFile(item);
        items.append(path);
        if (item != path)
            items.append(item);
        folders.insert(folder);
        if (item == path && QFileInfo(path).isDir())
            folders.insert(path);
    }
    m_menu.files().forgetItems(items);
    m_menu.proxy().invalidateSortOrders(folders);
}

QString MenuHistory::menuDirectory() const
{
    return QDir::cleanPath(m_menu.files().menuDirectory());
}

void MenuHistory::show(const QStringList &items)
{
    const QString selected = m_selection.path();
    QStringList there;
    for (const QString &item : items) {
        if (item.startsWith(menuDirectory() + QLatin1Char('/')) && QFileInfo::exists(item))
            there.append(item);
    }
    if (!there.isEmpty())
        m_selection.show(there);
    else if (!selected.isEmpty() && !QFileInfo::exists(selected))
        m_selection.leave(goneOf(m_selection.paths()));
}
