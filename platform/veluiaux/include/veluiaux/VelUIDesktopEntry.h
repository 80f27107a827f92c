// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/VelUIDesktopAction.h>
#include <veluiaux/veluiaux_export.h>

#include <QByteArray>
#include <QList>
#include <QSharedDataPointer>
#include <QString>
#include <QStringList>

class VelUIDesktopEntryData;
class VelUIExecFormatData;

/**
 * One desktop entry file: a ".desktop" file, or the ".directory" file of a menu folder.
 *
 * The file format is the Desktop Entry Standard of freedesktop.org, version 1.5. A record
 * keeps what it changed apart from the file's bytes, and save() rewrites only the lines of
 * the keys that changed: comments, blank lines, order, other languages, unknown keys and
 * groups, line ends and a byte order mark stay as they are.
 *
 * Texts: a getter gives an empty text or list for a key that is absent or not valid UTF-8.
 * A setter given what its getter returns changes nothing; an empty text or list removes the
 * key; false is written only where the key stands. The "Local" operations are about the value
 * for the message locale of the process (LC_ALL, LC_MESSAGES, LANG): the getter takes the
 * variant that fits best and never the value without a language; the setter writes the variant
 * that the getter found, else the one for velLanguageCode(). Empty list items are dropped.
 *
 * A value class: copies share their data until one of them is changed. Different records may
 * be used in different threads, also on the same file; one record may not.
 *
 * \since 1.0
 */
class VELUIAUX_EXPORT VelUIDesktopEntry
{
public:
    /// Why an entry cannot be used, see isSuitable().
    using SuitableError = int;
    /// Why an entry is not to be shown, see isDisplayable().
    using DisplayableError = int;

    /**
     * Builds the command line of an entry from its Exec text.
     *
     * The field codes %f %F %u %U %i %c %k %% are filled in as the standard says, the
     * deprecated ones vanish; all else is copied. Every argument is quoted so that a POSIX
     * shell gives it back as part of one word; where a code stands inside quotes it is
     * inserted in that quoting. A code for which nothing was given vanishes.
     */
    class VELUIAUX_EXPORT ExecFormatString
    {
    public:
        /// Starts from the Exec text \a exec.
        explicit ExecFormatString(const QString &exec);
        /// Makes a copy that shares what was given so far.
        ExecFormatString(const ExecFormatString &other);
        /// Shares what was given to \a other so far.
        ExecFormatString &operator=(const ExecFormatString &other);
        ~ExecFormatString();

        /// Gives the file for %f, and for %F, %u and %U when nothing more fitting is given.
        ExecFormatString &filePath(const QString &path);
        /// Gives the URL for %u, and for %U when there is no list of URLs.
        ExecFormatString &url(const QString &url);
        /// Gives the translated name of the application, for %c.
        ExecFormatString &appName(const QString &name);
        /// Gives the icon, for %i: two words, "--icon" and this, or none when it is empty.
        ExecFormatString &icon(const QString &icon);
        /// Gives the place of the entry's file, for %k.
        ExecFormatString &desktopFilePath(const QString &path);
        /// Gives the files for %F, one word each; an empty list counts as none given.
        ExecFormatString &filePathList(const QStringList &paths);
        /// Gives the URLs for %U, one word each; an empty list counts as none given.
        ExecFormatString &urlList(const QStringList &urls);

        /// Returns the command line; empty if the Exec text has an unknown field code.
        operator QString() const;

    private:
        QSharedDataPointer<VelUIExecFormatData> d;
    };

    /**
     * Makes a record bound to the file \a path and reads that; isValid() tells whether it was
     * an entry. An empty path gives an unbound, empty record.
     */
    explicit VelUIDesktopEntry(const QString &path = QString());
    /// Makes a copy that shares the data of \a other and is bound to the same file.
    VelUIDesktopEntry(const VelUIDesktopEntry &other);
    /// Takes the data of \a other, which may then only be assigned to or destroyed.
    VelUIDesktopEntry(VelUIDesktopEntry &&other) noexcept;
    /// Shares the data of \a other and binds to the same file.
    VelUIDesktopEntry &operator=(const VelUIDesktopEntry &other);
    /// Takes the data of \a other, which may then only be assigned to or destroyed.
    VelUIDesktopEntry &operator=(VelUIDesktopEntry &&other) noexcept;
    ~VelUIDesktopEntry();

    /**
     * Binds the record to another file; what it holds stays.
     *
     * save() then writes the whole entry there, or, if the record was never read from a file,
     * what has been set.
     */
    void setFilePath(const QString &path);
    /**
     * Reads the file anew and drops all changes.
     *
     * @return false, with an empty record, if the file cannot be read, is no regular file or
     *         is larger than 1 MiB
     */
    bool load();
    /**
     * Writes the changes to the file, or nothing at all when there are none.
     *
     * The new contents replace the old in one step. Permissions, access list and user attributes
     * stay, and where they cannot, nobody gets more rights than before. Symbolic links are
     * followed, but none that another user may have planted; missing folders are not made. If the
     * file has changed since it was read, the changes are applied to it as it now stands; if it is
     * gone it is written whole. Programs that save to one file at a time do not undo each other's
     * changes; one of them may wait for the others, a second at most.
     *
     * @return false if that failed; the file is as it was then
     */
    bool save();
    /// The bytes that save() leaves in the file when nobody else has changed that since it was read.
    QByteArray contents() const;
    /// Whether a file with a "Desktop Entry" group was read, or something inherited from a
    /// valid record. Setters make no record valid.
    bool isValid() const;
    /// Takes over the keys of \a other that this record does not have: translations only with
    /// their key, action groups only with the list of actions. Never overwrites.
    void inheritFrom(const VelUIDesktopEntry &other);

    /**
     * Tells whether the entry can be used as it stands.
     *
     * @param error if not null, is set to 0 or to the first reason that applies: 1 no Exec in an
     *        application; Exec's program 2 does not exist, 3 is not an executable file, 4 is not
     *        in PATH; TryExec 5 as a path, 6 as a name cannot be found; 7 a link without a target
     *        or to a local file that does not exist; -1 no known type, an Exec that is no command
     *        line, or no name
     */
    bool isSuitable(SuitableError *error) const;
    /**
     * Tells whether menus are to show the entry.
     *
     * @param error if not null, is set to 0 or to the first reason that applies: 1 Hidden;
     *        2 NoDisplay; 3 OnlyShowIn or NotShowIn shut out the desktop that
     *        XDG_CURRENT_DESKTOP names ("VEL" if none); 4 TryExec cannot be found
     */
    bool isDisplayable(DisplayableError *error) const;

    /// Returns the type: "Application", "Link" or "Directory", or what else the file says.
    QString getType() const;
    /// Sets the type. When that changes it, the keys and action groups that are only for the
    /// old type go, in all languages.
    void setType(const QString &type);

    /// Returns the untranslated name.
    QString getName() const;
    /// Sets the untranslated name.
    void setName(const QString &value);
    /// Returns the name in the user's language.
    QString getLocalName() const;
    /// Sets the name in the user's language.
    void setLocalName(const QString &value);
    /// Returns the untranslated name of the kind of thing this is, such as "Web browser".
    QString getGenericName() const;
    /// Sets the untranslated name of the kind of thing this is, such as "Web browser".
    void setGenericName(const QString &value);
    /// Returns the generic name in the user's language.
    QString getLocalGenericName() const;
    /// Sets the generic name in the user's language.
    void setLocalGenericName(const QString &value);
    /// Returns the untranslated tool tip.
    QString getComment() const;
    /// Sets the untranslated tool tip.
    void setComment(const QString &value);
    /// Returns the tool tip in the user's language.
    QString getLocalComment() const;
    /// Sets the tool tip in the user's language.
    void setLocalComment(const QString &value);
    /// Returns the icon: a theme name or an absolute path.
    QString getIcon() const;
    /// Sets the icon: a theme name or an absolute path.
    void setIcon(const QString &value);
    /// Returns the icon for the user's language.
    QString getLocalIcon() const;
    /// Sets the icon for the user's language.
    void setLocalIcon(const QString &value);
    /// Returns the command line of an application, with its field codes (see ExecFormatString).
    QString getExec() const;
    /// Sets the command line of an application, with its field codes (see ExecFormatString).
    void setExec(const QString &value);
    /// Returns the program whose presence tells whether the application is installed.
    QString getTryExec() const;
    /// Sets the program whose presence tells whether the application is installed.
    void setTryExec(const QString &value);
    /// Returns the working folder of the application.
    QString getPath() const;
    /// Sets the working folder of the application.
    void setPath(const QString &value);
    /// Returns the target of a link.
    QString getURL() const;
    /// Sets the target of a link.
    void setURL(const QString &value);
    /// Returns the window class by which the application's first window is known.
    QString getStartupWMClass() const;
    /// Sets the window class by which the application's first window is known.
    void setStartupWMClass(const QString &value);
    /// Returns the version of the entry format that the entry conforms to.
    QString getVersion() const;
    /// Sets the version of the entry format that the entry conforms to.
    void setVersion(const QString &value);
    /// Returns whether the application runs in a terminal.
    bool getTerminal() const;
    /// Sets whether the application runs in a terminal.
    void setTerminal(bool value);
    /// Returns whether the entry is kept out of menus.
    bool getNoDisplay() const;
    /// Sets whether the entry is kept out of menus.
    void setNoDisplay(bool value);
    /// Returns whether the entry counts as deleted.
    bool getHidden() const;
    /// Sets whether the entry counts as deleted.
    void setHidden(bool value);
    /// Returns whether the application tells when it has started.
    bool getStartupNotify() const;
    /// Sets whether the application tells when it has started.
    void setStartupNotify(bool value);
    /// Returns the desktops that alone show the entry; none means all.
    QStringList getOnlyShowIn() const;
    /// Sets the desktops that alone show the entry; none means all.
    void setOnlyShowIn(const QStringList &value);
    /// Returns the desktops that do not show the entry.
    QStringList getNotShowIn() const;
    /// Sets the desktops that do not show the entry.
    void setNotShowIn(const QStringList &value);
    /// Returns the MIME types the application opens.
    QStringList getMimeType() const;
    /// Sets the MIME types the application opens.
    void setMimeType(const QStringList &value);
    /// Returns the menu categories of the application.
    QStringList getCategories() const;
    /// Sets the menu categories of the application.
    void setCategories(const QStringList &value);
    /// Returns the untranslated words by which a search finds the entry.
    QStringList getKeywords() const;
    /// Sets the untranslated words by which a search finds the entry.
    void setKeywords(const QStringList &value);
    /// Returns the search words in the user's language.
    QStringList getLocalKeywords() const;
    /// Sets the search words in the user's language.
    void setLocalKeywords(const QStringList &value);

    /// Returns the languages in which \a key has a value, as they stand in the file: "de", "pt_BR".
    QStringList getLanguages(const QString &key) const;
    /// Returns the language whose value the "Local" getter of \a key gives; empty when it gives none.
    QString getLanguageInForce(const QString &key) const;
    /// Returns the value of \a key, such as "Name", for exactly \a language.
    QString getTranslation(const QString &key, const QString &language) const;
    /// Sets the value of \a key for exactly \a language; nothing where that cannot stand in a key.
    void setTranslation(const QString &key, const QString &language, const QString &value);
    /// Returns the list that \a key, such as "Keywords", has for exactly \a language.
    QStringList getTranslatedList(const QString &key, const QString &language) const;
    /// Sets the list that \a key has for exactly \a language.
    void setTranslatedList(const QString &key, const QString &language, const QStringList &value);

    /// Returns the order of a folder's items, as its ".directory" entry gives it.
    QStringList getSortOrder() const;
    /// Sets the order of a folder's items, as its ".directory" entry gives it.
    void setSortOrder(const QStringList &value);
    /// Returns the application's additional actions in their order, each id once. An action
    /// whose group is missing has its id alone.
    QList<VelUIDesktopAction> getActions() const;
    /**
     * Sets the additional actions and their order.
     *
     * The groups of actions that are no longer among them go; one that is put back before the
     * record is saved has its other languages and foreign keys again. They also go along where an
     * action has nothing new but its id. An action whose id cannot stand in a group header is left
     * out; of two with the same id the later one counts.
     */
    void setActions(const QList<VelUIDesktopAction> &actions);

private:
    QSharedDataPointer<VelUIDesktopEntryData> d;
};
