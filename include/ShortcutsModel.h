// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QAbstractItemModel>
#include <QKeySequence>
#include <QList>
#include <QMap>
#include <QPair>
#include <QPointer>
#include <QStringList>
#include <QVector>

#include "IShortcutObject.h"

class QAction;
class QSettings;
class QShortcut;

/**
 * The keyboard shortcuts of an application, in groups, with the keys that its user chose.
 *
 * \code
 * auto *model = new ShortcutsModel(&settings, QStringLiteral("Shortcuts"), this);
 * model->registerAction(QStringLiteral("file-save"), saveAction, tr("File"));
 * ...
 * EditShortcutsDialog dialog(model, this);
 * if (dialog.exec() == QDialog::Accepted)
 *     model->saveKeys(&settings, QStringLiteral("Shortcuts"));
 * \endcode
 *
 * The model loads the saved keys when it is made and puts them on the shortcuts and actions as
 * these are registered. So the keys that the application's own code sets have to be set before
 * the registration (they are the default keys), and the registration has to come before the
 * model is shown: it emits no signal. The model never saves by itself.
 *
 * Rows: the groups in the order of their first registration; below each its shortcuts, sorted
 * by name. Column 0 is the text, column 1 the pending key, which can be edited. An edit takes
 * effect with commitChanges().
 *
 * The model owns the shortcut objects, never the shortcuts and actions themselves. When one of
 * these is destroyed, its object goes without a signal; its row stays and shows nothing.
 * Persistent indexes keep pointing to their shortcuts all the same.
 *
 * For the GUI thread alone.
 *
 * \image html gallery-shortcuts.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT ShortcutsModel : public QAbstractItemModel
{
    Q_OBJECT

public:
    /**
     * Makes an empty model and loads the saved keys with loadKeys().
     *
     * @param settings where the keys were saved; not kept
     * @param settingsGroup the group of the settings that holds them; empty for none
     * @param parent owns the model
     */
    ShortcutsModel(QSettings *settings, QString settingsGroup, QObject *parent = nullptr);
    /// Deletes the shortcut objects that are still registered. Saves nothing.
    ~ShortcutsModel() override;

    /**
     * Registers a shortcut and puts the key saved for it into force.
     *
     * @param name the name under which its key is saved, see IShortcutObject
     * @param shortcut the shortcut; not owned; its present key becomes the default key
     * @param text the text shown to the user
     * @param group the name of its group; when empty, the object name of the shortcut's parent
     */
    void registerShortcut(const QString &name, QShortcut *shortcut, const QString &text,
                          const QString &group = QString());
    /**
     * Registers an action and puts the key saved for it into force.
     *
     * Its text (without mnemonic marks) and its icon are those of the action. The key is the first
     * of the action's; the further ones stay, see furtherKeySequences().
     *
     * @param name the name under which its key is saved, see IShortcutObject
     * @param action the action; not owned; its present key becomes the default key
     * @param group the name of its group; when empty, the object name of the action's parent
     */
    void registerAction(const QString &name, QAction *action, const QString &group = QString());
    /**
     * Adds an object to the model and takes ownership of it.
     *
     * Objects with the same name in the same group share a row, where the first one counts.
     * The key saved for it is not put on it: an object that wants it reads it from the settings
     * before it is registered.
     *
     * @param object the object; a null pointer and one that is registered already are ignored
     */
    void registerShortcutObject(IShortcutObject *object);

    /**
     * Reads the saved keys.
     *
     * They reach the shortcuts that are registered afterwards; those that are registered
     * already stay as they are. A saved text that does not parse counts as no key.
     *
     * @param settings where the keys were saved; not kept; a null pointer is ignored
     * @param settingsGroup the group of the settings that holds them; empty for none
     */
    void loadKeys(QSettings *settings, QString settingsGroup);

    /// Tells whether an index, in any column, belongs to a shortcut and not to a group.
    bool isShortcutItem(const QModelIndex &index) const;
    /// Returns the pending key of the row of an index; empty for a group.
    QKeySequence keySequence(const QModelIndex &index) const;
    /**
     * Returns the keys that the row of an index has beside the pending one.
     *
     * Only an action has such keys, those of QAction::shortcuts() after the first. They take part
     * in no edit and are not saved; they stay on the action when the pending key is put into force.
     *
     * @param index any column of the row
     * @return empty for a group
     */
    QList<QKeySequence> furtherKeySequences(const QModelIndex &index) const;
    /// Returns the default key of the row of an index; empty for a group.
    QKeySequence defaultKeySequence(const QModelIndex &index) const;
    /**
     * Sets the pending key of the row of an index; does nothing for a group.
     *
     * @param index any column of the row
     * @param key the key; may be empty
     */
    void setKeySequence(const QModelIndex &index, const QKeySequence &key);
    /**
     * Finds the shortcut whose pending key equals a key.
     *
     * The whole sequence is compared: "Ctrl+K" does not find "Ctrl+K, Ctrl+C", although the
     * first begins the second.
     *
     * @param key the key to look for; an empty one finds the first shortcut without a key
     * @return the first such object in the order of the rows, owned by the model; null when
     *         there is none
     */
    IShortcutObject *hasKeySequence(const QKeySequence &key) const;

    /// Returns a group (no parent) or a row of a group; an invalid index when there is none.
    QModelIndex index(int row, int column, const QModelIndex &parent = QModelIndex()) const override;
    /// Returns the group of a row, in column 0; an invalid index for a group.
    QModelIndex parent(const QModelIndex &index) const override;
    /// Returns the number of groups, or of the rows of a group; a row of a group has none.
    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    /// Two: text and key.
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    /**
     * Returns the text (column 0, Qt::DisplayRole), the icon (column 0, Qt::DecorationRole), the
     * pending key as portable text (column 1, Qt::DisplayRole) or as QKeySequence (column 1,
     * Qt::EditRole), the default key (column 1, Qt::UserRole); for a group its name.
     */
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    /// Returns the titles of the columns, "Action" and "Shortcut", translated (Qt::DisplayRole).
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    /// Column 1 of a shortcut can be edited; everything can be selected.
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    /**
     * Sets the pending key of a shortcut, of the first one where several share the row.
     *
     * @param index column 1 of a shortcut
     * @param value a QKeySequence; any other type is refused
     * @param role Qt::EditRole
     * @return false when it is refused and when the key is the pending one already
     */
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;

public Q_SLOTS:
    /// Makes every default key the pending one; takes effect with commitChanges().
    void restoreDefaults();
    /// Throws the edits away: every pending key becomes the one in force.
    void resetShortcuts();
    /// Puts every pending key into force.
    void commitChanges();
    /**
     * Writes the keys in force of all shortcuts, one string in portable text form for each name.
     *
     * Edits that were not committed are not saved. What the settings hold under other names
     * stays, as does what they hold for a key whose text would not read back as that key.
     *
     * @param settings where to save; not kept; whether it worked is told by its status()
     * @param settingsGroup the group of the settings to write to; empty for none
     */
    void saveKeys(QSettings *settings, QString settingsGroup);

private:
    friend class ShortcutRows; // reads all rows at once
    friend class RowsListening; // has it tell of rows that come and go
    friend class SpokenChanges; // has it tell screen readers of changes
    using Objects = QList<IShortcutObject *>;
    using Group = QMap<QString, Objects>;

    void adopt(IShortcutObject *object);
    void remove(IShortcutObject *object);
    Objects &entry(int group, const QString &name);
    void shiftPersistentIndexes(int group, int firstRow);
    void announceRows();
    QVariant spokenData(const QModelIndex &index, int role) const;
    IShortcutObject *firstObject(const QModelIndex &index) const;
    QVector<QPointer<IShortcutObject>> objectsOf(int group) const;
    void emitKeysChanged(int group);
    QVector<QPair<int, int>> emptyRows() const;

    QMap<QString, QKeySequence> m_loadedKeys;
    QStringList m_groupNames;
    QVector<Group> m_groups;
    int m_spokenChanges = 0; // how many want that it tells of changes
    int m_rowsListeners = 0; // how many want to hear of rows
};
