// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuDeletion.h"

#include "FewLines.h"
#include "FileWork.h"
#include "KeptThing.h"
#include "MenuFind.h"
#include "MenuHistory.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "OnDisk.h"
#include "ShownMenu.h"
#include "StepRecorder.h"
#include "StepText.h"
#include "TreeRemoval.h"
#include "VelMenuModel.h"

#include <frame/FolderListing.h>
#include <frame/MessageBox.h>

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QLocale>
#include <QPointer>
#include <QTreeView>

#include <algorithm>
#include <iterator>

namespace {

constexpr int MostNames = 5;
constexpr int FewPaths = 20;

// What went into the trash, in words.
class Deleted
{
public:
    void add(const QString &name, const TreeState &state)
    {
        ++m_items;
        m_name = name;
        m_isAnyFolder = m_isAnyFolder || state.isFolder();
        m_entries += state.isFolder() ? state.shownItems() : 1;
    }

    StepText text() const
    {
        if (m_items > 1)
            return m_isAnyFolder
                ? StepText(StepText::Kind::DeleteFolders, QString::number(m_items), m_entries)
                : StepText(StepText::Kind::DeleteItems, QString(), m_items);
        return m_isAnyFolder ? StepText(StepText::Kind::DeleteFolder, m_name, m_entries)
                             : StepText(StepText::Kind::Delete, m_name);
    }

private:
    int m_items = 0;
    int m_entries = 0;
    bool m_isAnyFolder = false;
    QString m_name;
};

QString complaint(const QString &path, const std::error_code &error)
{
    return QCoreApplication::translate("MenuDeletion", "%1 cannot be deleted: %2")
        .arg(path, QString::fromLocal8Bit(error.message().c_str()));
}

// Whether it is a folder that holds what may not be taken out of it; such a folder cannot be moved, either.
bool isFixed(const QString &path)
{
    const QFileInfo info(path);
    return info.isDir() && !info.isSymLink() && !info.isWritable()
        && !FolderListing::namesIn(path).value_or(QSet<QString>{path}).isEmpty();
}

FileWork deletingFiles(QWidget *view)
{
    return FileWork(view, QCoreApplication::translate("VelMenuView", "Delete"),
                    QCoreApplication::translate("VelMenuView", "Deleting files..."));
}

} // namespace

MenuDeletion::MenuDeletion(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuFind &find,
                           MenuVoice &voice, MenuHistory &history)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
    , m_find(find)
    , m_voice(voice)
    , m_history(history)
{
}

MenuDeletion::~MenuDeletion() = default;

void MenuDeletion::remove(const QStringList &paths)
{
    if (paths.isEmpty())
        return;
    const QPointer<MenuDeletion> self(this);
    Outcome outcome;
    // First: rows that go while they are selected have the selection looked at each time.
    m_selection.leave(paths);
    // While many go one by one, their folders would be read anew again and again.
    const bool areMany = paths.size() > FewPaths;
    if (areMany)
        m_menu.files().setWatching(false);
    putAway(paths, &outcome);
    if (self && !outcome.isCanceled && !outcome.untrashed.isEmpty() && confirmFinal(outcome.untrashed)
        && self)
        removeForGood(&outcome);
    if (self && areMany)
        m_menu.files().setWatching(true);
    if (self)
        selectWhatStays(paths);
    if (self && outcome.isChanged)
        Q_EMIT changed();
    if (self)
        tellWhatStays(paths, outcome);
}

// In one step, which holds what has gone when the user ends it.
void MenuDeletion::putAway(const QStringList &paths, Outcome *outcome)
{
    const QPointer<MenuDeletion> self(this);
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    QStringList gone;
    Deleted deleted;
    {
        FileWork work = deletingFiles(m_view);
        work.expect(paths.size());
        for (const QString &path : paths) {
            if (!work.goOn()) {
                outcome->isCanceled = true;
                break;
            }
            const QString name = m_history.nameOf(path);
            if (std::unique_ptr<KeptThing> kept = recorder ? KeptThing::inTrash(path) : nullptr) {
                deleted.add(name, kept->state());
                gone.append(path);
                recorder->deleted(path, std::move(kept));
            } else {
                outcome->refuse(path);
            }
            work.advance();
        }
    }
    if (!self)
        return;
    outcome->isChanged = !gone.isEmpty();
    forget(gone);
    outcome->subject = m_history.add(recorder, deleted.text(), gone);
}

// What may not be taken from its folder is not asked about, nor what has gone by itself.
void MenuDeletion::Outcome::refuse(const QString &path)
{
    if (!OnDisk::exists(path))
        return;
    if (QFileInfo(QFileInfo(path).absolutePath()).isWritable() && !isFixed(path))
        untrashed.append(path);
    else
        complaints.append(complaint(path, std::make_error_code(std::errc::permission_denied)));
}

bool MenuDeletion::confirmFinal(const QStringList &paths) const
{
    const QString text = paths.size() == 1
        ? QCoreApplication::translate("MenuDeletion",
                                      "There is no trash for %1. It would be deleted for good: this cannot "
                                      "be undone. Delete it?")
              .arg(m_history.nameOf(paths.constFirst()))
        : QCoreApplication::translate("MenuDeletion",
                                      "There is no trash for %n of these items. They would be deleted for "
                                      "good: this cannot be undone. Delete them?",
                                      nullptr, paths.size());
    return MessageBox::show(m_view, QMessageBox::Warning,
                            QCoreApplication::translate("VelMenuView", "Attention"), text,
                            QMessageBox::Yes | QMessageBox::No, QMessageBox::No)
        == QMessageBox::Yes;
}

void MenuDeletion::removeForGood(Outcome *outcome)
{
    const QPointer<MenuDeletion> self(this);
    const QStringList paths = outcome->untrashed;
    {
        FileWork work = deletingFiles(m_view);
        for (const QString &path : paths) {
            const QString name = m_history.nameOf(path);
            const TreeRemoval::Result result =
                TreeRemoval::remove(QFile::encodeName(path).toStdString(), work);
            // Of a folder some may have gone.
            outcome->isChanged = outcome->isChanged || !OnDisk::exists(path) || QFileInfo(path).isDir();
            outcome->isCanceled = result.error == std::errc::operation_canceled;
            if (outcome->isCanceled) {
                outcome->begun = {path, name};
                break;
            }
            if (!result.succeeded())
                outcome->complaints.append(complaint(QFile::decodeName(result.path.c_str()), result.error));
        }
    }
    if (self)
        forget(paths);
}

void MenuDeletion::forget(const QStringList &paths)
{
    for (const QString &path : paths)
        m_menu.files().forgetItemInfo(path);
    m_find.clear();
}

void MenuDeletion::selectWhatStays(const QStringList &paths)
{
    QStringList left;
    std::copy_if(paths.begin(), paths.end(), std::back_inserter(left), &OnDisk::exists);
    if (!left.isEmpty())
        m_selection.show(left);
}

void MenuDeletion::tellWhatStays(const QStringList &paths, const Outcome &outcome)
{
    QStringList texts;
    if (!outcome.complaints.isEmpty())
        texts.append(FewLines::of(outcome.complaints));
    if (outcome.isCanceled)
        texts.append(canceledText(paths, outcome));
    texts.removeAll(QString());
    if (!texts.isEmpty())
        m_voice.tell(texts.join(QLatin1Char('\n')),
                     outcome.complaints.isEmpty() ? MenuVoice::Warning : MenuVoice::Failure,
                     m_view->currentIndex(), outcome.subject);
}

QString MenuDeletion::canceledText(const QStringList &paths, const Outcome &outcome) const
{
    QStringList names;
    for (const QString &path : paths) {
        if (OnDisk::exists(path))
            names.append(path == outcome.begun.path ? outcome.begun.name : m_history.nameOf(path));
    }
    if (names.isEmpty())
        return {};
    return names.size() > MostNames
        ? QCoreApplication::translate(
            "MenuDeletion", "The deletion was canceled. %n items are still there, in whole or in part.",
            nullptr, names.size())
        : QCoreApplication::translate("MenuDeletion",
                                      "The deletion was canceled. Still there, in whole or in part: %1.")
              .arg(QLocale().createSeparatedList(names));
}
