// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "WrappedObject.h"

#include <QAction>

/**
 * A QAction of the application; text and icon are the action's own.
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
};
