// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuMoving.h"

#include "MenuFind.h"
#include "MenuHistory.h"
#include "MenuReordering.h"
#include "MenuSelection.h"
#include "ShownMenu.h"
#include "StepRecorder.h"
#include "StepText.h"
#include "VelMenuProxyModel.h"

#include <frame/EntryPath.h>

#include <QFileInfo>
#include <QPointer>

MenuMoving::MenuMoving(const ShownMenu &menu, MenuSelection &selection, MenuFind &find, MenuVoice &voice,
                       MenuHistory &history)
    : m_menu(menu)
    , m_selection(selection)
    , m_find(find)
    , m_voice(voice)
    , m_history(history)
{
}

MenuMoving::~MenuMoving() = default;

void MenuMoving::move(bool up)
{
    const QModelIndexList moved = items();
    if (moved.isEmpty())
        return;
    const bool isOne = moved.size() == 1;
    const QString path = m_selection.path();
    const QStringList paths = isOne ? QStringList{path} : m_selection.paths();
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    if (recorder)
        recorder->mayWrite(EntryPath::recordFileOf(QFileInfo(path).path()));
    if (isOne)
        MenuReordering::move(m_menu, m_voice, moved.constFirst(), up);
    else
        MenuReordering::moveAll(m_menu, m_voice, moved, up);
    m_selection.reveal(path);
    m_find.clear();
    const QPointer<MenuMoving> self(this);
    Q_EMIT changed();
    if (self)
        m_history.add(recorder,
                      isOne ? StepText(StepText::Kind::Reorder, m_history.nameOf(path))
                            : StepText(StepText::Kind::ReorderItems, QString(), moved.size()),
                      paths);
}

// In the file model: the one where there is no assistance; none where several do not lie in one folder.
QModelIndexList MenuMoving::items() const
{
    if (!m_history.isOn())
        return m_selection.item().isValid() ? QModelIndexList{m_selection.item()} : QModelIndexList();
    const QModelIndexList rows = m_selection.all();
    QModelIndexList items;
    for (const QModelIndex &row : rows) {
        if (row.parent() != rows.constFirst().parent())
            return {};
        items.append(m_menu.proxy().mapToSource(row));
    }
    return items;
}
