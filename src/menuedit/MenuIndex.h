// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFields.h"
#include "FilteredRows.h"
#include "MenuWalk.h"

#include <QElapsedTimer>
#include <QObject>
#include <QTimer>
#include <QVector>

#include <memory>

class VelMenuModel;

/**
 * All that a menu directory holds, with what it can be found by; read a little at a time while the
 * event loop runs.
 */
class MenuIndex : public QObject
{
    Q_OBJECT

public:
    /// Of the menu directory of \a model, which goes on living as long as this object.
    explicit MenuIndex(const VelMenuModel &model);
    ~MenuIndex() override;

    /// Reads the menu anew, at once for no longer than one may wait and then in the background.
    /// What was known stands until all is read.
    void read();
    /// The same, once nobody has asked for it for a moment.
    void readSoon();
    /// Stops reading and forgets the menu, but not what its files hold.
    void clear();
    bool isReading() const { return m_walk != nullptr; }

    /// Whether entries that the menu leaves out are found.
    void setHiddenFound(bool isFound) { m_isHiddenFound = isFound; }

    /// What a filter for \a words lets through of what is known so far.
    FilteredRows find(const QStringList &words) const;

Q_SIGNALS:
    /// More is known than before; sent a few times a second, and when all was read.
    void grown();

private:
    struct Item
    {
        QString path;
        bool isFolder;
        EntryFields::Fields fields;
    };

    void readOn(int milliseconds);
    void finish();

    const VelMenuModel &m_model;
    QString m_root;
    EntryFields m_fields;
    std::unique_ptr<MenuWalk> m_walk;
    QVector<Item> m_items;
    QVector<Item> m_new;
    QElapsedTimer m_sinceTold;
    QTimer m_turn;
    QTimer m_delay;
    qint64 m_spent = 0;
    bool m_isHiddenFound = false;
};
