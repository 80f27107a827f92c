// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QIcon>
#include <QKeySequence>
#include <QObject>
#include <QString>

/**
 * One thing of an application that the user can give a key.
 *
 * It stands between the thing itself (the wrapped object: a QShortcut, a QAction, anything
 * else that has a key) and the ShortcutsModel. It knows three keys: the one in force on the
 * wrapped object; the default key, which is the one that the application's own code gave it;
 * and the pending key, which the user edits and which takes effect with apply().
 *
 * ShortcutsModel::registerShortcut() and ShortcutsModel::registerAction() make the objects
 * for shortcuts and actions. For anything else derive from this class, give the abstract
 * functions, set the default key and the pending key in the constructor, and hand the object
 * to ShortcutsModel::registerShortcutObject(), which owns it from then on.
 *
 * When what it wraps goes away, the object has to emit deleteMe(); it is deleted within that
 * emission and must not be used afterwards.
 *
 * For the GUI thread alone.
 *
 * \image html gallery-shortcuts.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT IShortcutObject : public QObject
{
    Q_OBJECT

public:
    /**
     * Makes an object without a QObject parent, with both keys empty.
     *
     * @param name the name under which the key is saved; unique within the application unless
     *             several things are to share one row and one saved key. It may not contain
     *             "/" or "\", which divide groups of QSettings
     */
    explicit IShortcutObject(const QString &name);
    ~IShortcutObject() override;

    /// Returns the key that the wrapped object had before any saved key was put on it.
    virtual QKeySequence defaultKeySequence() const;
    /// Returns the key in force on the wrapped object.
    virtual QKeySequence objectKeySequence() const = 0;
    /**
     * Puts a key on the wrapped object; the pending key stays.
     *
     * @param key the key; an empty one takes the object's key away
     */
    virtual void setObjectKeySequence(const QKeySequence &key) = 0;
    /**
     * Sets the pending key; the wrapped object keeps its own.
     *
     * @param key the key; may be empty
     */
    virtual void setKeySequence(const QKeySequence &key) = 0;
    /// Throws an edit away: the pending key becomes objectKeySequence().
    virtual void reset() = 0;
    /// Returns the pending key.
    virtual QKeySequence keySequence() const = 0;
    /// Puts the pending key into force with setObjectKeySequence().
    virtual void apply() = 0;
    /// Returns the name given to the constructor.
    virtual QString name() const;
    /// Returns the name of the group that the object is shown in; empty unless overridden.
    virtual QString group() const;
    /// Returns the text that the user sees, without mnemonic marks.
    virtual QString text() const = 0;
    /// Returns the icon beside the text; may be null.
    virtual QIcon icon() const = 0;

Q_SIGNALS:
    /// What the object wraps is gone; the model removes the object and deletes it.
    void deleteMe();

protected:
    QString m_name; ///< the name; never changed
    QKeySequence m_defaultKey; ///< what defaultKeySequence() returns
    QKeySequence m_key; ///< the pending key
};
