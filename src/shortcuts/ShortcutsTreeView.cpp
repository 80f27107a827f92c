// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutsTreeView.h"

#include "RowsChangedEvent.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"
#include "ShownKeys.h"
#include "TextWidth.h"

#include <frame/QtMajor.h>

#include <QTimer>

#include <algorithm>
#include <iterator>
#include <utility>
#include <vector>

namespace {

// So many of the items that seem widest are measured exactly.
constexpr int MeasuredItems = 16;
// So many rows are read for the filter at a time, so many milliseconds after the window was shown
// and after the last ones.
constexpr int PreparedRows = 200;
constexpr int PrepareDelay = 100;
constexpr int PreparePause = 10;

struct Candidate
{
    int width;
    int group;
    int row; // -1 for the group itself
};

} // namespace

ShortcutsTreeView::ShortcutsTreeView(QWidget *parent)
    : QTreeView(parent)
{
    connect(&m_preparing, &QTimer::timeout, this, &ShortcutsTreeView::prepareSome);
}

ShortcutsTreeView::~ShortcutsTreeView() = default;

void ShortcutsTreeView::setModel(QAbstractItemModel *newModel)
{
    if (model()) {
        m_rowsListening.reset();
        disconnect(model(), &QObject::destroyed, this, nullptr);
    }
    m_hidden.forget();
    m_index.clear();
    m_closedGroups.clear();
    QTreeView::setModel(newModel);
    if (ShortcutsModel *shortcuts = shortcutsModel()) {
        m_rowsListening = std::make_unique<RowsListening>(shortcuts, this);
        connect(shortcuts, &QObject::destroyed, this, [this] { setModel(nullptr); });
        m_hidden.start(*shortcuts);
        hideRows(*shortcuts, {});
        m_groups = shortcuts->rowCount();
    }
}

void ShortcutsTreeView::openAllGroups()
{
    if (!shortcutsModel()) {
        expandAll();
        return;
    }
    for (int group = 0; group < model()->rowCount(); ++group)
        expand(model()->index(group, 0));
}

bool ShortcutsTreeView::isShortcutCurrent() const
{
    const ShortcutsModel *shortcuts = shortcutsModel();
    return shortcuts && shortcuts->isShortcutItem(currentIndex());
}

QKeySequence ShortcutsTreeView::currentKeySequence() const
{
    return isShortcutCurrent() ? shortcutsModel()->keySequence(currentIndex()) : QKeySequence();
}

// NOLINTNEXTLINE(performance-unnecessary-value-param)
void ShortcutsTreeView::setKeySequence(QKeySequence key)
{
    if (ShortcutsModel *shortcuts = shortcutsModel())
        shortcuts->setKeySequence(currentIndex(), key);
}

void ShortcutsTreeView::currentChanged(const QModelIndex &current, const QModelIndex &previous)
{
    QTreeView::currentChanged(current, previous);
    if (current.isValid())
        m_leftRow = QPersistentModelIndex();
    const ShortcutsModel *shortcuts = shortcutsModel();
    if (!shortcuts || current == previous)
        return;
    if (shortcuts->isShortcutItem(current))
        Q_EMIT currentShortcutChanged(shortcuts->defaultKeySequence(current),
                                      shortcuts->keySequence(current));
    else
        Q_EMIT currentItemIsNotShortcut();
}

void ShortcutsTreeView::dataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight,
                                    const QVector<int> &roles)
{
    QTreeView::dataChanged(topLeft, bottomRight, roles);
    if (m_filter.isActive())
        refreshRowsLater();
    if (!isShortcutCurrent())
        return;
    // The key stands in column 1, whichever column is current.
    const QModelIndex current = currentIndex().siblingAtColumn(1);
    if (current < topLeft || bottomRight < current)
        return;
    const ShortcutsModel *shortcuts = shortcutsModel();
    Q_EMIT currentShortcutChanged(shortcuts->defaultKeySequence(current), shortcuts->keySequence(current));
}

void ShortcutsTreeView::drawRow(QPainter *painter, const QStyleOptionViewItem &option,
                                const QModelIndex &index) const
{
    QStyleOptionViewItem open = option;
    if (shortcutsModel() && index.parent().isValid())
        open.state |= QStyle::State_Open;
    QTreeView::drawRow(painter, open, index);
}

int ShortcutsTreeView::sizeHintForColumn(int column) const
{
    const ShortcutsModel *shortcuts = shortcutsModel();
    if (!shortcuts)
        return QTreeView::sizeHintForColumn(column);
    ensurePolished();
    const QStyleOptionViewItem option = QtMajor::itemOption(*this);
    int width = 0;
    const auto items = widestItems(*shortcuts, column);
    for (const QModelIndex &index : items) {
        const int indent = column == 0 ? indentationOf(index) : 0;
        width = qMax(width, QtMajor::delegateOf(*this, index)->sizeHint(option, index).width() + indent);
    }
    return width;
}

// Laying every text out would take longer than all the rest of opening the dialog.
QVector<QModelIndex> ShortcutsTreeView::widestItems(const ShortcutsModel &shortcuts, int column) const
{
    TextWidth textWidth(font());
    const int iconWidth = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    const auto widthOf = [&](const IShortcutObject &object) {
        if (column == 1)
            return ShownKeys::roughLength(object);
        return textWidth.of(object.text()) + (object.icon().isNull() ? 0 : iconWidth) + indentation();
    };
    std::vector<Candidate> candidates;
    for (int group = 0; group < shortcuts.rowCount(); ++group) {
        const QModelIndex index = shortcuts.index(group, 0);
        if (column == 0)
            candidates.push_back({textWidth.of(index.data().toString()), group, -1});
        if (!isExpanded(index))
            continue;
        const auto objects = ShortcutRows::ofGroup(shortcuts, group);
        for (int row = 0; row < objects.size(); ++row) {
            if (const IShortcutObject *object = objects.at(row))
                candidates.push_back({widthOf(*object), group, row});
        }
    }
    const auto end =
        candidates.begin() + std::min<std::ptrdiff_t>(MeasuredItems, std::ptrdiff_t(candidates.size()));
    std::partial_sort(candidates.begin(), end, candidates.end(),
                      [](const Candidate &left, const Candidate &right) { return left.width > right.width; });
    QVector<QModelIndex> items;
    std::transform(candidates.begin(), end, std::back_inserter(items),
                   [&shortcuts, column](const Candidate &candidate) {
                       const QModelIndex group = shortcuts.index(candidate.group, 0);
                       return candidate.row < 0 ? group : shortcuts.index(candidate.row, column, group);
                   });
    return items;
}

int ShortcutsTreeView::indentationOf(const QModelIndex &index) const
{
    const int level = (rootIsDecorated() ? 1 : 0) + (index.parent().isValid() ? 1 : 0);
    return level * indentation();
}

bool ShortcutsTreeView::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == model() && event->type() == RowsChangedEvent::eventType()) {
        m_index.clear();
        m_hidden.forget();
        refreshRowsLater();
    }
    return QTreeView::eventFilter(watched, event);
}

ShortcutsModel *ShortcutsTreeView::shortcutsModel() const
{
    return qobject_cast<ShortcutsModel *>(model());
}

// Once for all that comes and goes together, for instance with the window of many actions.
void ShortcutsTreeView::refreshRowsLater()
{
    if (m_isRefreshPending)
        return;
    m_isRefreshPending = true;
    QTimer::singleShot(0, this, &ShortcutsTreeView::refreshRows);
}

void ShortcutsTreeView::refreshRows()
{
    m_isRefreshPending = false;
    const ShortcutsModel *shortcuts = shortcutsModel();
    if (!shortcuts)
        return;
    hideRows(*shortcuts, currentIndex());
    for (; m_groups < shortcuts->rowCount(); ++m_groups)
        expand(shortcuts->index(m_groups, 0));
    leaveHiddenRow();
}

void ShortcutsTreeView::hideRows(const ShortcutsModel &shortcuts, const QModelIndex &keptRow)
{
    if (!m_filter.isActive()) {
        m_hidden.show(shortcuts, HiddenRows::notEmpty(shortcuts));
    } else {
        ShortcutIndex::Matches matches = m_index.matches(shortcuts, m_filter);
        if (ShortcutRows::at(shortcuts, keptRow))
            matches[keptRow.parent().row()][keptRow.row()] = true;
        const int count = m_hidden.show(shortcuts, matches);
        if (m_tellCount)
            m_tellCount(count);
    }
    scheduleDelayedItemsLayout();
}

// Keys must not go to a row that nobody sees.
void ShortcutsTreeView::leaveHiddenRow()
{
    const QPersistentModelIndex current = currentIndex();
    if (current.isValid() && isRowHidden(current.row(), current.parent())) {
        selectionModel()->clear();
        m_leftRow = current;
    } else if (!current.isValid() && m_leftRow.isValid()
               && !isRowHidden(m_leftRow.row(), m_leftRow.parent())) {
        setCurrentIndex(m_leftRow);
    }
}

void ShortcutsTreeView::goTo(const QModelIndex &row)
{
    setCurrentIndex(row);
    if (isRowHidden(row.row(), row.parent()))
        refreshRows();
    scrollTo(row);
}

void ShortcutsTreeView::setFilter(const ShortcutFilter &filter, const Count &tell)
{
    const bool wasActive = m_filter.isActive();
    m_filter = filter;
    m_tellCount = tell;
    const ShortcutsModel *shortcuts = shortcutsModel();
    if (!shortcuts)
        return;
    hideRows(*shortcuts, {});
    if (m_filter.isActive() && !wasActive)
        openGroups(*shortcuts);
    else if (!m_filter.isActive())
        closeGroups();
    leaveHiddenRow();
    if (!m_filter.isActive())
        scrollTo(currentIndex());
}

// A dialog of thousands of shortcuts is to be painted first, and to follow the mouse meanwhile.
void ShortcutsTreeView::prepareFilter()
{
    m_preparing.start(PrepareDelay);
}

void ShortcutsTreeView::prepareSome()
{
    const ShortcutsModel *shortcuts = shortcutsModel();
    if (shortcuts && m_index.readSome(*shortcuts, PreparedRows))
        m_preparing.start(PreparePause);
    else
        m_preparing.stop();
}

void ShortcutsTreeView::openGroups(const ShortcutsModel &shortcuts)
{
    for (int group = 0; group < shortcuts.rowCount(); ++group) {
        const QModelIndex index = shortcuts.index(group, 0);
        if (isExpanded(index))
            continue;
        m_closedGroups.append(index);
        expand(index);
    }
}

void ShortcutsTreeView::closeGroups()
{
    const auto groups = std::exchange(m_closedGroups, {});
    for (const QPersistentModelIndex &group : groups) {
        if (group != currentIndex().parent())
            collapse(group);
    }
}

void ShortcutsTreeView::selectFirstShortcut()
{
    const ShortcutsModel *shortcuts = shortcutsModel();
    if (!shortcuts || isShortcutCurrent())
        return;
    for (int group = 0; group < shortcuts->rowCount(); ++group) {
        const QModelIndex header = shortcuts->index(group, 0);
        for (int row = 0; row < shortcuts->rowCount(header); ++row) {
            if (!isRowHidden(row, header)) {
                setCurrentIndex(shortcuts->index(row, 0, header));
                return;
            }
        }
    }
}
