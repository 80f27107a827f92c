// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClashQuestion.h"
#include "FileWork.h"
#include "KeptThing.h"
#include "MenuDropHost.h"
#include "MenuHistory.h"
#include "ShownOrder.h"
#include "StepRecorder.h"
#include "VelMenuView.h"
#include "VelMenuViewPrivate.h"

#include <frame/EntryPath.h>
#include <frame/GuardedDialog.h>

#include <QCoreApplication>
#include <QFileInfo>
#include <QFileSystemModel>
#include <QMessageBox>
#include <QPointer>
#include <QSortFilterProxyModel>

#include <algorithm>

namespace {

/// Answers for a view, if there is one.
class ViewDropHost : public MenuDropHost
{
public:
    ViewDropHost(VelMenuView *view, QObject *owner)
        : m_view(view)
        , m_owner(owner)
    {
    }

    // The box has the one button Yes, which Escape and closing press as well; a No comes only from
    // a program that ends the box with it. It is made by hand: the static function would add a No
    // button to show its default.
    // Nothing of this object is touched when it is closed.
    bool confirmOverwrite(const QString &target) override
    {
        GuardedDialog<QMessageBox> box(QMessageBox::Question, QFileSystemModel::tr("Attention"),
                                       QFileSystemModel::tr("%1 already exists. Overwrite?").arg(target),
                                       QMessageBox::Yes, asker());
        box->setTextFormat(Qt::PlainText);
        box->setDefaultButton(QMessageBox::No);
        return box.exec() != QMessageBox::No;
    }

    // Nor here.
    NameClash::Answer askAbout(const NameClash &clash) override { return ClashQuestion::ask(asker(), clash); }

    std::optional<QStringList> orderWith(const QStringList &names, int row,
                                         const QModelIndex &folder) override
    {
        const QSortFilterProxyModel *shown = m_view ? proxy() : nullptr;
        return shown ? std::optional<QStringList>(ShownOrder::with(*shown, names, row, folder))
                     : std::nullopt;
    }

    std::unique_ptr<FileProgress> follow(Qt::DropAction action) override
    {
        if (!m_view)
            return MenuDropHost::follow(action);
        const bool isMove = action == Qt::MoveAction;
        return std::make_unique<FileWork>(
            m_view,
            isMove ? QCoreApplication::translate("VelMenuView", "Move")
                   : QCoreApplication::translate("VelMenuView", "Copy"),
            isMove ? QCoreApplication::translate("VelMenuView", "Moving files...")
                   : QCoreApplication::translate("VelMenuView", "Copying files..."));
    }

    void begins(const QVector<DropItem> &items, Qt::DropAction action, const QString &folder) override
    {
        m_recorder = m_view ? VelMenuViewPrivate::historyOf(*m_view).record() : nullptr;
        if (!m_recorder)
            return;
        m_isMove = action == Qt::MoveAction;
        m_items = items;
        m_recorder->mayWrite(EntryPath::recordFileOf(folder));
        for (const DropItem &item : items) {
            if (m_isMove && item.isFile())
                m_recorder->mayMove(item.source, item.target);
            else
                m_recorder->mayMake(item.target);
        }
    }

    void replaced(const QString &path, std::unique_ptr<KeptThing> kept) override
    {
        if (m_recorder)
            m_recorder->deleted(path, std::move(kept));
    }

    void finished(const DropResult &result) override
    {
        if (!m_view)
            return;
        if (result.isDone)
            show(result);
        // What made room and is back is nothing that the drop made.
        const bool isAnyBack = !result.isDone
            && std::any_of(m_items.begin(), m_items.end(),
                           [](const DropItem &item) { return item.isReplacing; });
        if (isAnyBack)
            m_recorder.reset();
        // Whoever hears of it may take the view away, and this with it.
        const QPointer<MenuHistory> history(&VelMenuViewPrivate::historyOf(*m_view));
        const MenuVoice::Subject subject = m_recorder ? remember(result) : MenuVoice::Subject::Other;
        if (history && !result.complaint.isEmpty())
            tellAt(result.targets.value(0), result.complaint, subject);
    }

private:
    void show(const DropResult &result) const
    {
        if (result.sortAnew)
            m_view->invalidateSortOrder(result.folder);
        forgetOrders(result.targets);
        VelMenuViewPrivate::selectionOf(*m_view).show(result.targets);
        m_view->setActionsEnabled();
    }

    // What came may stand where another folder was whose order is still known.
    void forgetOrders(const QStringList &paths) const
    {
        const QFileSystemModel *model = files();
        for (const QString &path : paths) {
            if (model && QFileInfo(path).isDir())
                m_view->invalidateSortOrder(model->index(path));
        }
    }

    QWidget *asker() const
    {
        auto *owner = qobject_cast<QWidget *>(m_owner);
        return owner ? owner : m_view;
    }

    // Also what was done before something failed.
    MenuVoice::Subject remember(const DropResult &result)
    {
        MenuHistory &history = VelMenuViewPrivate::historyOf(*m_view);
        QStringList paths = result.targets;
        for (const DropItem &item : qAsConst(m_items)) {
            if (item.isFile())
                paths.append(item.source);
        }
        const std::unique_ptr<StepRecorder> recorder = std::move(m_recorder);
        return history.add(recorder, textOf(history), paths);
    }

    StepText textOf(const MenuHistory &history) const
    {
        const DropItem &first = m_items.constFirst();
        const QString name = history.nameOf(first.target);
        if (first.isHere && m_items.size() == 1)
            return StepText(StepText::Kind::Reorder, name);
        if (!first.isFile() && m_items.size() == 1)
            return StepText(StepText::Kind::Create, name);
        const QString folder = history.nameOf(QFileInfo(first.target).path());
        if (m_items.size() == 1)
            return StepText(m_isMove ? StepText::Kind::Move : StepText::Kind::Copy, name, 1, folder);
        return StepText(m_isMove ? StepText::Kind::MoveItems : StepText::Kind::CopyItems, QString(),
                        m_items.size(), folder);
    }

    const QSortFilterProxyModel *proxy() const
    {
        return qobject_cast<const QSortFilterProxyModel *>(m_view->model());
    }

    const QFileSystemModel *files() const
    {
        return proxy() ? qobject_cast<const QFileSystemModel *>(proxy()->sourceModel()) : nullptr;
    }

    // Tells without a window: the user goes on undisturbed, the item tells why nothing happened.
    void tellAt(const QString &path, const QString &text, MenuVoice::Subject subject) const
    {
        QModelIndex shown;
        if (files() && !path.isEmpty() && QFileInfo::exists(path))
            shown = proxy()->mapFromSource(files()->index(path));
        VelMenuViewPrivate::voiceOf(*m_view).tell(text, MenuVoice::Failure, shown, subject);
    }

    VelMenuView *const m_view;
    QObject *const m_owner;
    std::unique_ptr<StepRecorder> m_recorder; // of the drop that has begun
    bool m_isMove = false;
    QVector<DropItem> m_items;
};

} // namespace

void MenuDropHost::replaced(const QString &path, std::unique_ptr<KeptThing> kept)
{
    Q_UNUSED(path)
    Q_UNUSED(kept)
}

std::unique_ptr<MenuDropHost> MenuDropHost::create(VelMenuView *view, QObject *owner)
{
    return std::make_unique<ViewDropHost>(view, owner);
}
