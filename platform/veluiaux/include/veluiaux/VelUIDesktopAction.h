// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/veluiaux_export.h>

#include <QMetaType>
#include <QSharedDataPointer>
#include <QString>
#include <QStringList>

class VelUIDesktopActionData;

/**
 * One additional action of an application's desktop entry, such as "New window".
 *
 * A plain value, bound to no file: VelUIDesktopEntry::getActions() gives a record's actions
 * and VelUIDesktopEntry::setActions() puts them back. Copies share their data until one of
 * them is changed; different objects may be used in different threads.
 *
 * A "Local" text is the one for the user's language as it was when the record gave the
 * action. All texts are empty, and all lists have no items, until they are set.
 *
 * \since 1.0
 */
class VELUIAUX_EXPORT VelUIDesktopAction
{
public:
    /// Makes an action without an id; it cannot be written to an entry.
    VelUIDesktopAction();
    /**
     * Makes an action that has an id and nothing else.
     *
     * @param id what the entry's list of actions calls it; without "[", "]" and control
     *           characters, or no entry can hold it
     */
    explicit VelUIDesktopAction(const QString &id);
    /// Makes a copy that shares the data of \a other.
    VelUIDesktopAction(const VelUIDesktopAction &other);
    /// Takes the data of \a other, which may then only be assigned to or destroyed.
    VelUIDesktopAction(VelUIDesktopAction &&other) noexcept;
    /// Shares the data of \a other.
    VelUIDesktopAction &operator=(const VelUIDesktopAction &other);
    /// Takes the data of \a other, which may then only be assigned to or destroyed.
    VelUIDesktopAction &operator=(VelUIDesktopAction &&other) noexcept;
    ~VelUIDesktopAction();

    /// Whether id, texts and lists are all the same.
    bool operator==(const VelUIDesktopAction &other) const;
    /// Whether id, a text or a list differs.
    bool operator!=(const VelUIDesktopAction &other) const { return !(*this == other); }

    /// Returns the id, by which the entry's list of actions names the action.
    QString getId() const;
    /// Returns the untranslated name, as a menu shows it.
    QString getName() const;
    /// Sets the untranslated name, as a menu shows it.
    void setName(const QString &value);
    /// Returns the name in the user's language.
    QString getLocalName() const;
    /// Sets the name in the user's language.
    void setLocalName(const QString &value);
    /// Returns the icon: a theme name or an absolute path.
    QString getIcon() const;
    /// Sets the icon: a theme name or an absolute path.
    void setIcon(const QString &value);
    /// Returns the icon for the user's language.
    QString getLocalIcon() const;
    /// Sets the icon for the user's language.
    void setLocalIcon(const QString &value);
    /// Returns the command line, with field codes as in an entry's own.
    QString getExec() const;
    /// Sets the command line, with field codes as in an entry's own.
    void setExec(const QString &value);
    /// Returns the desktops that alone show the action; none means all.
    QStringList getOnlyShowIn() const;
    /// Sets the desktops that alone show the action; none means all.
    void setOnlyShowIn(const QStringList &value);
    /// Returns the desktops that do not show the action.
    QStringList getNotShowIn() const;
    /// Sets the desktops that do not show the action.
    void setNotShowIn(const QStringList &value);

private:
    QSharedDataPointer<VelUIDesktopActionData> d;
};

Q_DECLARE_TYPEINFO(VelUIDesktopAction, Q_MOVABLE_TYPE);
