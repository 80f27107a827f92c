// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuDeletion.h"

#include "FileProgress.h"
#include "KeptThing.h"
#include "MenuFind.h"
#include "MenuHistory.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "OnDisk.h"
#include "ShownMenu.h"
#include "StepRecorder.h"
#include "TreeRemoval.h"
#include "VelMenuModel.h"

#include <frame/MessageBox.h>

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QPointer>
#include <QTreeView>

#include <algorithm>

namespace {

// Without those that lie in others of them.
QStringList outermost(const QStringList &paths)
{
    QStringList result;
    for (const QString &path : paths) {
        const bool isInner = std::any_of(paths.begin(), paths.end(), [&path](const QString &other) {
            return path.startsWith(other + QLatin1Char('/'));
        });
        if (!isInner && !path.isEmpty() && !result.contains(path))
            result.append(path);
    }
    return result;
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
    const QPointer<MenuDeletion> self(this);
    const QStringList wanted = outermost(paths);
    const QStringList left = putAway(wanted);
    bool isChanged = left.size() < wanted.size();
    if (self && !left.isEmpty() && confirmFinal(left) && self)
        isChanged = removeForGood(left) || isChanged;
    if (self && isChanged)
        Q_EMIT changed();
}

// Returns what cannot be put into the trash.
QStringList MenuDeletion::putAway(const QStringList &paths)
{
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    QStringList left;
    QStringList gone;
    QString name;
    TreeState state;
    for (const QString &path : paths) {
        const QString shownName = m_history.nameOf(path);
        std::unique_ptr<KeptThing> kept = recorder ? KeptThing::inTrash(path) : nullptr;
        if (!kept) {
            left.append(path);
            continue;
        }
        gone.append(path);
        name = shownName;
        state = kept->state();
        recorder->deleted(path, std::move(kept));
    }
    const StepText text = gone.size() != 1 ? StepText(StepText::Kind::DeleteItems, QString(), gone.size())
        : state.isFolder()                 ? StepText(StepText::Kind::DeleteFolder, name, state.shownItems())
                                           : StepText(StepText::Kind::Delete, name);
    leave(gone);
    m_history.add(recorder, text, gone);
    return left;
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

// Whether anything was removed.
bool MenuDeletion::removeForGood(const QStringList &paths)
{
    FileProgress nobody;
    QStringList complaints;
    bool isAnyGone = false;
    for (const QString &path : paths) {
        const TreeRemoval::Result result = TreeRemoval::remove(QFile::encodeName(path).toStdString(), nobody);
        isAnyGone = isAnyGone || !OnDisk::exists(path);
        if (!result.succeeded())
            complaints.append(QCoreApplication::translate("MenuDeletion", "%1 cannot be deleted: %2")
                                  .arg(QFile::decodeName(result.path.c_str()),
                                       QString::fromLocal8Bit(result.error.message().c_str())));
    }
    leave(paths);
    if (!complaints.isEmpty())
        m_voice.tell(complaints.join(QLatin1Char('\n')), MenuVoice::Failure, m_view->currentIndex());
    return isAnyGone;
}

void MenuDeletion::leave(const QStringList &paths)
{
    for (const QString &path : paths) {
        m_menu.files().forgetItemInfo(path);
        if (!OnDisk::exists(path))
            m_selection.leave(path);
    }
    m_find.clear();
}
