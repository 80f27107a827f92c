// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutsModel.h"

#include "ActionObject.h"
#include "FurtherKeys.h"
#include "RowsChangedEvent.h"
#include "ShortcutChange.h"
#include "ShortcutObject.h"
#include "ShownKeys.h"

#include <QCoreApplication>

#include <iterator>
#include <utility>

namespace {

// The internal id of group rows; that of a shortcut is the row of its group.
constexpr quintptr GroupId = ~quintptr(0);

// The destructor of an object may delete what others wrap, or what it wraps itself; then these
// ask the model to be deleted.
void deleteOnce(IShortcutObject *object, const ShortcutsModel *model)
{
    if (!object)
        return;
    object->disconnect(model);
    delete object;
}

} // namespace

ShortcutsModel::ShortcutsModel(QSettings *settings, QString settingsGroup, QObject *parent)
    : QAbstractItemModel(parent)
{
    loadKeys(settings, std::move(settingsGroup));
}

ShortcutsModel::~ShortcutsModel()
{
    QVector<QPointer<IShortcutObject>> objects;
    for (int group = 0; group < m_groups.size(); ++group)
        objects += objectsOf(group);
    m_groups.clear();
    m_groupNames.clear();
    for (const QPointer<IShortcutObject> &object : qAsConst(objects))
        deleteOnce(object, this);
}

void ShortcutsModel::registerShortcut(const QString &name, QShortcut *shortcut, const QString &text,
                                      const QString &group)
{
    if (shortcut)
        adopt(new ShortcutObject(name, shortcut, text, group));
}

void ShortcutsModel::registerAction(const QString &name, QAction *action, const QString &group)
{
    if (action)
        adopt(new ActionObject(name, action, group));
}

void ShortcutsModel::adopt(IShortcutObject *object)
{
    const auto loaded = m_loadedKeys.constFind(object->name());
    if (loaded != m_loadedKeys.constEnd())
        object->setObjectKeySequence(*loaded);
    object->reset();
    registerShortcutObject(object);
}

void ShortcutsModel::registerShortcutObject(IShortcutObject *object)
{
    if (!object)
        return;
    const QString groupName = object->group();
    int group = m_groupNames.indexOf(groupName);
    if (group < 0) {
        group = m_groupNames.size();
        m_groupNames.append(groupName);
        m_groups.append(Group());
    }
    Objects &objects = entry(group, object->name());
    if (objects.contains(object))
        return;
    objects.append(object);
    connect(object, &IShortcutObject::deleteMe, this, [this, object] { remove(object); });
    announceRows();
}

void ShortcutsModel::remove(IShortcutObject *object)
{
    const QString name = object->name();
    for (int group = 0; group < m_groups.size(); ++group)
        entry(group, name).removeAll(object);
    deleteOnce(object, this);
    announceRows();
}

// The list of a name in a group, made if need be.
ShortcutsModel::Objects &ShortcutsModel::entry(int group, const QString &name)
{
    Group &names = m_groups[group];
    auto found = names.find(name);
    if (found == names.end()) {
        found = names.insert(name, Objects());
        if (!persistentIndexList().isEmpty())
            shiftPersistentIndexes(group, int(std::distance(names.begin(), found)));
    }
    return *found;
}

// Rows come without a signal; what a view or a host remembers must not slip to another shortcut.
void ShortcutsModel::shiftPersistentIndexes(int group, int firstRow)
{
    QModelIndexList from;
    QModelIndexList to;
    const QModelIndexList remembered = persistentIndexList();
    for (const QModelIndex &index : remembered) {
        if (index.internalId() == quintptr(group) && index.row() >= firstRow) {
            from.append(index);
            to.append(createIndex(index.row() + 1, index.column(), index.internalId()));
        }
    }
    changePersistentIndexList(from, to);
}

void ShortcutsModel::announceRows()
{
    if (m_rowsListeners == 0)
        return;
    RowsChangedEvent event;
    QCoreApplication::sendEvent(this, &event);
}

bool ShortcutsModel::isShortcutItem(const QModelIndex &index) const
{
    return index.parent().isValid();
}

QKeySequence ShortcutsModel::keySequence(const QModelIndex &index) const
{
    return this->index(index.row(), 1, index.parent()).data(Qt::EditRole).value<QKeySequence>();
}

QList<QKeySequence> ShortcutsModel::furtherKeySequences(const QModelIndex &index) const
{
    const IShortcutObject *object = isShortcutItem(index) ? firstObject(index) : nullptr;
    return object ? FurtherKeys::of(*object) : QList<QKeySequence>();
}

QKeySequence ShortcutsModel::defaultKeySequence(const QModelIndex &index) const
{
    return this->index(index.row(), 1, index.parent()).data(Qt::UserRole).value<QKeySequence>();
}

void ShortcutsModel::setKeySequence(const QModelIndex &index, const QKeySequence &key)
{
    // Refused for a group.
    setData(this->index(index.row(), 1, index.parent()), key, Qt::EditRole);
}

IShortcutObject *ShortcutsModel::hasKeySequence(const QKeySequence &key) const
{
    for (const Group &group : m_groups) {
        for (const Objects &objects : group) {
            if (!objects.isEmpty() && objects.constFirst()->keySequence() == key)
                return objects.constFirst();
        }
    }
    return nullptr;
}

QModelIndex ShortcutsModel::index(int row, int column, const QModelIndex &parent) const
{
    if (!hasIndex(row, column, parent))
        return {};
    return createIndex(row, column, parent.isValid() ? quintptr(parent.row()) : GroupId);
}

QModelIndex ShortcutsModel::parent(const QModelIndex &index) const
{
    if (!index.isValid() || index.internalId() == GroupId)
        return {};
    return this->index(int(index.internalId()), 0);
}

int ShortcutsModel::rowCount(const QModelIndex &parent) const
{
    if (!parent.isValid())
        return m_groupNames.size();
    if (parent.internalId() != GroupId || parent.column() != 0 || parent.row() >= m_groups.size())
        return 0;
    return m_groups.at(parent.row()).size();
}

int ShortcutsModel::columnCount(const QModelIndex &) const
{
    return 2;
}

QVariant ShortcutsModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid())
        return {};
    if (index.internalId() == GroupId) {
        const bool isName = index.column() == 0 && role == Qt::DisplayRole;
        return isName ? QVariant(m_groupNames.value(index.row())) : QVariant();
    }
    if (m_spokenChanges > 0 && (role == Qt::AccessibleTextRole || role == Qt::AccessibleDescriptionRole))
        return spokenData(index, role);
    // The object last: finding it is a walk through the group.
    const bool isText = index.column() == 0 && (role == Qt::DisplayRole || role == Qt::DecorationRole);
    const bool isKey =
        index.column() == 1 && (role == Qt::DisplayRole || role == Qt::EditRole || role == Qt::UserRole);
    const IShortcutObject *object = isText || isKey ? firstObject(index) : nullptr;
    if (!object)
        return {};
    if (isText)
        return role == Qt::DisplayRole ? QVariant(object->text()) : QVariant(object->icon());
    if (role == Qt::DisplayRole)
        return object->keySequence().toString(QKeySequence::PortableText);
    return role == Qt::EditRole ? object->keySequence() : object->defaultKeySequence();
}

// What a screen reader says instead of the text of a changed row, and beside it.
QVariant ShortcutsModel::spokenData(const QModelIndex &index, int role) const
{
    const IShortcutObject *object = firstObject(index);
    if (!object || !ShortcutChange::isChanged(*object))
        return {};
    if (role == Qt::AccessibleTextRole) {
        const QString text = index.column() == 0 ? object->text() : ShownKeys::of(*object);
        return tr("%1, changed", "%1: an action or a key").arg(text.isEmpty() ? tr("No shortcut") : text);
    }
    const QString defaultKey = object->defaultKeySequence().toString(QKeySequence::PortableText);
    return defaultKey.isEmpty() ? tr("There is no default shortcut.")
                                : tr("The default shortcut is %1.").arg(defaultKey);
}

QVariant ShortcutsModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return {};
    return section == 0 ? tr("Action") : tr("Shortcut");
}

Qt::ItemFlags ShortcutsModel::flags(const QModelIndex &index) const
{
    const Qt::ItemFlags base = QAbstractItemModel::flags(index);
    return index.column() == 1 && isShortcutItem(index) ? base | Qt::ItemIsEditable : base;
}

bool ShortcutsModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (role != Qt::EditRole || !isShortcutItem(index) || index.column() != 1
        || value.userType() != QMetaType::QKeySequence)
        return false;
    const auto key = value.value<QKeySequence>();
    IShortcutObject *object = firstObject(index);
    if (!object || object->keySequence() == key)
        return false;
    object->setKeySequence(key);
    Q_EMIT dataChanged(index, index);
    return true;
}

// The object that a row shows; null for a row that lost its objects.
IShortcutObject *ShortcutsModel::firstObject(const QModelIndex &index) const
{
    const int groupRow = int(index.internalId());
    const int row = index.row();
    if (groupRow >= m_groups.size() || row >= m_groups.at(groupRow).size())
        return nullptr;
    const Group &group = m_groups.at(groupRow);
    const bool isInFirstHalf = row < group.size() / 2;
    const auto found =
        isInFirstHalf ? std::next(group.cbegin(), row) : std::prev(group.cend(), group.size() - row);
    return found->isEmpty() ? nullptr : found->constFirst();
}

// Group and row of every row that shows nothing.
QVector<QPair<int, int>> ShortcutsModel::emptyRows() const
{
    QVector<QPair<int, int>> rows;
    for (int group = 0; group < m_groups.size(); ++group) {
        int row = 0;
        for (const Objects &objects : m_groups.at(group)) {
            if (objects.isEmpty())
                rows.append({group, row});
            ++row;
        }
    }
    return rows;
}
