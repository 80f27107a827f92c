// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFind.h"

#include "FoundOrder.h"
#include "LoadedFolders.h"
#include "LongWork.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "OnDisk.h"
#include "RowCache.h"
#include "ShownMenu.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/MessageBox.h>

#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QInputDialog>
#include <QPointer>
#include <QTreeView>

namespace {

constexpr int MostMilliseconds = 10000;

} // namespace

MenuFind::MenuFind(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuVoice &voice)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
    , m_voice(voice)
{
}

MenuFind::~MenuFind() = default;

void MenuFind::clear()
{
    m_matches.clear();
    m_shown = -1;
}

void MenuFind::ask()
{
    const QPointer<MenuFind> self(this);
    const QString text = QInputDialog::getText(m_view, QCoreApplication::translate("VelMenuView", "Find"),
                                               QCoreApplication::translate("VelMenuView", "Find string:"),
                                               QLineEdit::Normal, m_text);
    if (!self)
        return;
    m_text = text;
    find(false);
}

bool MenuFind::find(bool next)
{
    if (m_text.isEmpty() || m_isSearching)
        return false;
    if (next && showNext())
        return true;

    clear();
    const QString text = m_text;
    QVector<MenuWalk::Item> matches;
    const QPointer<MenuFind> self(this);
    const End end = search(text, &matches);
    // The view may show another directory by now, and another text may have been asked for.
    if (!self || end == End::Canceled || m_text != text)
        return false;
    m_matches = inOrder(matches);
    const bool isFound = showNext();
    if (!isFound)
        tellNothing(text);
    if (self && end == End::Limit)
        tellOfLimit();
    return isFound;
}

MenuFind::End MenuFind::search(const QString &text, QVector<MenuWalk::Item> *matches)
{
    const QPointer<MenuFind> self(this);
    m_isSearching = true;
    LongWork work(m_view, QCoreApplication::translate("VelMenuView", "Find"),
                  QCoreApplication::translate("VelMenuView", "Searching the menu for '%1'...").arg(text));
    if (!self)
        return End::Canceled;
    const QSet<QString> opened = LoadedFolders::in(m_menu.files());
    MenuWalk walk(m_menu.files().menuDirectory(), [&](const QString &path) { return opened.contains(path); });
    QElapsedTimer timer;
    timer.start();
    bool isInTime = true;
    while (const std::optional<MenuWalk::Item> item = isInTime ? walk.next() : std::nullopt) {
        const RowCache::Display display = m_menu.files().displayOf(item->path, item->isFolder);
        if ((!display.isHidden || m_menu.proxy().isHiddenShown())
            && display.name.contains(text, Qt::CaseInsensitive))
            matches->append(*item);
        if (!work.goOn() || !self) {
            if (self)
                m_isSearching = false;
            return End::Canceled;
        }
        isInTime = timer.elapsed() < MostMilliseconds;
    }
    m_isSearching = false;
    return isInTime && walk.isWhole() ? End::Whole : End::Limit;
}

QStringList MenuFind::inOrder(const QVector<MenuWalk::Item> &matches) const
{
    return FoundOrder::sorted(QDir::cleanPath(m_menu.files().menuDirectory()), matches,
                              [this](const MenuWalk::Item &item) {
                                  return m_menu.files().displayOf(item.path, item.isFolder).name;
                              });
}

void MenuFind::tellNothing(const QString &text)
{
    MessageBox::show(m_view, QMessageBox::Information, QCoreApplication::translate("VelMenuView", "Find"),
                     QCoreApplication::translate("VelMenuView", "'%1' not found .").arg(text),
                     QMessageBox::Close);
}

void MenuFind::tellOfLimit()
{
    m_voice.tell(
        QCoreApplication::translate("VelMenuView",
                                    "The menu is too large to be searched as a whole. Only a part of it "
                                    "was searched."),
        MenuVoice::Warning);
}

// Drops the matches that are gone.
bool MenuFind::showNext()
{
    while (!m_matches.isEmpty()) {
        const int next = (m_shown + 1) % m_matches.size();
        if (show(m_matches.at(next))) {
            m_shown = next;
            return true;
        }
        m_matches.removeAt(next);
        if (next <= m_shown)
            --m_shown;
    }
    return false;
}

bool MenuFind::show(const QString &path)
{
    m_menu.proxy().letThrough({path});
    const QModelIndex match = OnDisk::exists(path) ? m_selection.shown(path) : QModelIndex();
    if (!match.isValid())
        return false;
    connect(&m_menu.files(), &QFileSystemModel::directoryLoaded, this, &MenuFind::keepInSight,
            Qt::UniqueConnection);
    m_selection.select(match);
    m_view->scrollTo(match);
    return true;
}

// The folders on the way are read only now; their rows push the match out of sight.
void MenuFind::keepInSight(const QString &loadedFolder)
{
    const QString match = m_matches.value(m_shown);
    if (match.startsWith(loadedFolder + QLatin1Char('/')) && m_selection.path() == match)
        m_view->scrollTo(m_selection.shown(match));
}
