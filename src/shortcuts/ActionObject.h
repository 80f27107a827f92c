// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "WrappedObject.h"

#include <QAction>
#include <QList>

/**
 * A QAction of the application; text and icon are the action's own.
 *
 * The user chooses the first of its keys; the further ones stay.
 */
class ActionObject : public WrappedObject<QAction>
{
    Q_OBJECT

public:
    /**
     * Wraps an action, whose present key becomes the default key.
     *
     * @param name the name under which the key is saved
     * @param action the action; not owned
     * @param group the group; when empty, the object name of the action's parent
     */
    ActionObject(const QString &name, QAction *action, const QString &group);
    ~ActionObject() override;

    QKeySequence objectKeySequence() const override;
    void setObjectKeySequence(const QKeySequence &key) override;
    QString text() const override;
    QIcon icon() const override;

    /// The keys that the action has, or will have, beside the pending one.
    QList<QKeySequence> furtherKeys() const;

private:
    QList<QKeySequence> keysAfterTheFirst() const;

    QKeySequence m_doubled; // a further key for as long as it is the first one, too
    int m_placeOfDoubled = 0;
};
