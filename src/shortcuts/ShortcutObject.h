// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "WrappedObject.h"

#include <QShortcut>

/**
 * A QShortcut of the application.
 */
class ShortcutObject : public WrappedObject<QShortcut>
{
    Q_OBJECT

public:
    /**
     * Wraps a shortcut, whose present key becomes the default key.
     *
     * @param name the name under which the key is saved
     * @param shortcut the shortcut; not owned
     * @param text the text shown to the user
     * @param group the group; when empty, the object name of the shortcut's parent
     */
    ShortcutObject(const QString &name, QShortcut *shortcut, const QString &text, const QString &group);
    ~ShortcutObject() override;

    QKeySequence objectKeySequence() const override;
    void setObjectKeySequence(const QKeySequence &key) override;
    QString text() const override;
    QIcon icon() const override;

private:
    const QString m_text;
};
