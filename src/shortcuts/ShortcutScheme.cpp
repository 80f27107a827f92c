// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutScheme.h"

#include "IShortcutObject.h"
#include "KeySequences.h"
#include "SchemeText.h"
#include "ShortcutConflict.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"
#include "VelKeyServer.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QSaveFile>

#include <cerrno>
#include <optional>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

using ShortcutScheme::Ask;
using ShortcutScheme::OnClash;
using Keys = QMap<QString, QKeySequence>;

constexpr qint64 LargestFile = qint64(8) * 1024 * 1024;

QString cannotSave(const QString &path, const QString &reason)
{
    return QCoreApplication::translate("ShortcutScheme", "The shortcuts could not be saved to %1: %2",
                                       "%2: what the system says")
        .arg(path, reason);
}

QString cannotRead(const QString &path, const QString &reason)
{
    return QCoreApplication::translate("ShortcutScheme", "The shortcuts could not be read from %1: %2",
                                       "%2: what the system says")
        .arg(path, reason);
}

QString isNoRegularFile(const QString &path)
{
    return QCoreApplication::translate("ShortcutScheme", "%1 is not a regular file.").arg(path);
}

// What the file holds; nothing, and the reason, when it cannot be read.
std::optional<QByteArray> contentsOf(const QString &path, QString *error)
{
    // Opening a pipe must not wait for its writer.
    const int descriptor =
        ::open(QFile::encodeName(path).constData(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY);
    QFile file;
    if (descriptor < 0 || !file.open(descriptor, QIODevice::ReadOnly, QFileDevice::AutoCloseHandle)) {
        *error = cannotRead(path, qt_error_string(errno));
        return std::nullopt;
    }
    struct stat status = {};
    if (fstat(descriptor, &status) != 0 || !S_ISREG(status.st_mode)) {
        *error = isNoRegularFile(path);
        return std::nullopt;
    }
    const QByteArray text = file.read(LargestFile + 1);
    if (file.error() != QFileDevice::NoError) {
        *error = cannotRead(path, file.errorString());
        return std::nullopt;
    }
    if (text.size() > LargestFile) {
        *error = QCoreApplication::translate("ShortcutScheme", "%1 is too large for a file of shortcuts.")
                     .arg(path);
        return std::nullopt;
    }
    return text;
}

std::optional<SchemeText::Contents> read(const QString &path, QString *error)
{
    const std::optional<QByteArray> text = contentsOf(path, error);
    if (!text)
        return std::nullopt;
    SchemeText::Contents contents = SchemeText::read(*text);
    if (!contents.hasGroup) {
        *error = QCoreApplication::translate("ShortcutScheme", "%1 holds no shortcuts.").arg(path);
        return std::nullopt;
    }
    if (contents.unreadable > 0) {
        *error = QCoreApplication::translate("ShortcutScheme", "Unreadable shortcuts in %1 were skipped: %2",
                                             "%2: their number")
                     .arg(path, QString::number(contents.unreadable));
    }
    return contents;
}

QString write(const QByteArray &text, const QString &path)
{
    const QFileInfo target(path);
    if (target.exists() && !target.isFile())
        return isNoRegularFile(path);
    QSaveFile file(path);
    // What commit() itself still has to write it may fail to write, and say nothing.
    if (!file.open(QIODevice::WriteOnly) || file.write(text) != text.size() || !file.flush()
        || !file.commit())
        return cannotSave(path, file.errorString());
    return {};
}

// What becomes of the keys of a model when those of a file are taken over.
class Takeover
{
public:
    Takeover(const ShortcutsModel &model, const Keys &keys);

    // Asks about every clash; false when everything is canceled.
    bool settle(const Ask &ask);
    void carryOut(ShortcutsModel *model) const;
    int taken() const { return m_takers.size(); }

private:
    struct Row
    {
        QPersistentModelIndex index;
        QString name;
        QKeySequence before;
        QKeySequence planned;
    };

    struct Clash
    {
        QString name;
        QString otherName;
        QKeySequence key;
    };

    bool settleGlobalKeys(const Ask &ask);
    std::optional<Clash> nextClash() const;
    const Row *changedRow(const QString &name) const;
    void skip(const QString &name);
    void replace(const Clash &clash);

    QVector<Row> m_rows;
    QHash<QString, QVector<int>> m_rowsOfName;
    QStringList m_takers; // the names that get their key from the file
};

Takeover::Takeover(const ShortcutsModel &model, const Keys &keys)
{
    for (int group = 0; group < model.rowCount(); ++group) {
        const QVector<const IShortcutObject *> objects = ShortcutRows::ofGroup(model, group);
        const QModelIndex parent = model.index(group, 0);
        for (int row = 0; row < objects.size(); ++row) {
            const IShortcutObject *object = objects.at(row);
            if (!object)
                continue;
            const QKeySequence before = object->keySequence();
            m_rowsOfName[object->name()].append(m_rows.size());
            m_rows.append(
                {model.index(row, 1, parent), object->name(), before, keys.value(object->name(), before)});
        }
    }
    for (auto it = keys.cbegin(); it != keys.cend(); ++it) {
        if (m_rowsOfName.contains(it.key()))
            m_takers.append(it.key());
    }
}

bool Takeover::settle(const Ask &ask)
{
    if (!settleGlobalKeys(ask))
        return false;
    // Each answer takes away a taker or a key; a skipped shortcut gets back one that may clash.
    while (const std::optional<Clash> clash = nextClash()) {
        const OnClash answer = ask ? ask(clash->name, clash->otherName, clash->key) : OnClash::Skip;
        if (answer == OnClash::Cancel)
            return false;
        if (answer == OnClash::Replace)
            replace(*clash);
        else
            skip(clash->name);
    }
    return true;
}

bool Takeover::settleGlobalKeys(const Ask &ask)
{
    const QStringList names = m_takers;
    for (const QString &name : names) {
        const Row *row = changedRow(name);
        if (!row || row->planned.isEmpty()
            || !ShortcutConflict::blocksKey(VelKeyServer::checkForGlobalShortcut(row->planned)))
            continue;
        if (ask && ask(name, QString(), row->planned) == OnClash::Cancel)
            return false;
        skip(name);
    }
    return true;
}

std::optional<Takeover::Clash> Takeover::nextClash() const
{
    QHash<QKeySequence, QVector<int>> rowsOfKey;
    for (int i = 0; i < m_rows.size(); ++i) {
        if (!m_rows.at(i).planned.isEmpty())
            rowsOfKey[m_rows.at(i).planned].append(i);
    }
    for (const QString &name : m_takers) {
        const Row *taker = changedRow(name);
        if (!taker)
            continue;
        const QVector<int> holders = rowsOfKey.value(taker->planned);
        for (const int holder : holders) {
            if (m_rows.at(holder).name != name)
                return Clash{name, m_rows.at(holder).name, taker->planned};
        }
    }
    return std::nullopt;
}

// A row of a name whose key is to become another one; null when all keep theirs.
const Takeover::Row *Takeover::changedRow(const QString &name) const
{
    for (const int row : m_rowsOfName.value(name)) {
        if (m_rows.at(row).planned != m_rows.at(row).before)
            return &m_rows.at(row);
    }
    return nullptr;
}

void Takeover::skip(const QString &name)
{
    m_takers.removeOne(name);
    for (const int row : m_rowsOfName.value(name))
        m_rows[row].planned = m_rows.at(row).before;
}

void Takeover::replace(const Clash &clash)
{
    m_takers.removeOne(clash.otherName);
    for (const int row : m_rowsOfName.value(clash.otherName)) {
        if (m_rows.at(row).planned == clash.key)
            m_rows[row].planned = QKeySequence();
    }
}

void Takeover::carryOut(ShortcutsModel *model) const
{
    // Who hears of a new key may delete the model.
    const QPointer<ShortcutsModel> guard(model);
    for (const Row &row : m_rows) {
        if (guard && row.index.isValid() && row.planned != row.before)
            model->setKeySequence(row.index, row.planned);
    }
}

} // namespace

bool ShortcutScheme::save(const ShortcutsModel &model, const QString &path, QString *error)
{
    Keys keys;
    for (int group = 0; group < model.rowCount(); ++group) {
        const QVector<const IShortcutObject *> objects = ShortcutRows::ofGroup(model, group);
        for (const IShortcutObject *object : objects) {
            // The text of any other key would be another one the next time.
            if (object && KeySequences::survivesSaving(object->keySequence()))
                keys.insert(object->name(), object->keySequence());
        }
    }
    const QString failure = write(SchemeText::write(keys), path);
    if (error)
        *error = failure;
    return failure.isEmpty();
}

ShortcutScheme::Result ShortcutScheme::load(ShortcutsModel *model, const QString &path, const Ask &ask)
{
    Result result = {false, 0, 0, {}};
    const QPointer<ShortcutsModel> guard(model);
    const std::optional<SchemeText::Contents> contents = read(path, &result.error);
    if (!contents || !guard)
        return result;
    Takeover takeover(*model, contents->keys);
    if (!takeover.settle(ask) || !guard)
        return {false, 0, 0, {}};
    takeover.carryOut(model);
    result.ok = true;
    result.taken = takeover.taken();
    result.skipped = contents->keys.size() - result.taken + contents->unreadable;
    return result;
}
