// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuIndex.h"

#include "LoadedFolders.h"
#include "VelMenuModel.h"

#include <QDir>

#include <utility>

namespace {

// All in milliseconds.
constexpr int AtOnce = 15;
constexpr int InOneTurn = 10;
constexpr int BetweenNews = 200;
constexpr int Pause = 100;
constexpr int InAll = 10000;

} // namespace

MenuIndex::MenuIndex(const VelMenuModel &model)
    : m_model(model)
    , m_root(QDir::cleanPath(model.menuDirectory()))
{
    connect(&m_turn, &QTimer::timeout, this, [this] { readOn(InOneTurn); });
    m_delay.setSingleShot(true);
    m_delay.setInterval(Pause);
    connect(&m_delay, &QTimer::timeout, this, &MenuIndex::read);
}

MenuIndex::~MenuIndex() = default;

void MenuIndex::read()
{
    m_delay.stop();
    const QSet<QString> opened = LoadedFolders::in(m_model);
    m_walk =
        std::make_unique<MenuWalk>(m_root, [opened](const QString &path) { return opened.contains(path); });
    m_new.clear();
    m_spent = 0;
    m_sinceTold.start();
    m_turn.start(0);
    readOn(AtOnce);
}

// What goes on all the time must not put it off for ever.
void MenuIndex::readSoon()
{
    if (!m_delay.isActive())
        m_delay.start();
}

void MenuIndex::clear()
{
    m_turn.stop();
    m_delay.stop();
    m_walk.reset();
    m_items.clear();
    m_new.clear();
}

void MenuIndex::readOn(int milliseconds)
{
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < milliseconds) {
        const std::optional<MenuWalk::Item> item = m_walk->next();
        if (!item)
            return finish();
        m_new.append({item->path, item->isFolder, m_fields.of(item->path, item->isFolder)});
    }
    m_spent += timer.elapsed();
    if (m_spent >= InAll)
        return finish();
    if (m_sinceTold.elapsed() < BetweenNews)
        return;
    m_sinceTold.start();
    Q_EMIT grown();
}

void MenuIndex::finish()
{
    m_turn.stop();
    m_walk.reset();
    m_items = std::exchange(m_new, {});
    Q_EMIT grown();
}

FilteredRows MenuIndex::find(const QStringList &words) const
{
    FilteredRows rows;
    for (const QVector<Item> *items : {&m_items, &m_new}) {
        for (const Item &item : *items) {
            if ((m_isHiddenFound || !item.fields.isHidden) && EntryFields::match(item.fields, words))
                rows.add(m_root, item.path, item.isFolder);
        }
    }
    return rows;
}
