// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "AtomicFile.h"
#include "DesktopEntryChanges.h"
#include "FileStamp.h"
#include "GroupValues.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <memory>
#include <string>
#include <string_view>
#include <unordered_set>

/**
 * One desktop entry: the text of its file and what has been changed since.
 *
 * Cheap to copy: the text is shared, only the changes are copied. Values are made from the
 * text when they are asked for.
 */
class EntryDocument
{
public:
    EntryDocument();

    /// Binds the document to a file without reading it.
    void setPath(const QByteArray &path);
    /// Reads the file anew and drops all changes; false if it cannot be read.
    bool load();
    /// Writes the changes to the file; false if that failed, the file is as it was then.
    bool save();
    /// What the changes make of the text that was read.
    QByteArray contents() const;
    /// Whether a file with a main group was read, or something taken over from such a document.
    bool isValid() const { return m_valid; }
    /// Takes over the keys of \a other that this document does not have.
    void inheritFrom(const EntryDocument &other);

    /// The values of one group, for looking at several at once; see there for how long.
    GroupValues group(std::string_view name) const { return {*m_text, m_changes, name}; }

    /// Whether the key stands in the entry, if only with an empty value.
    bool has(std::string_view group, std::string_view key) const;
    QString text(std::string_view group, std::string_view key, std::string_view language = {}) const;
    QString localText(std::string_view group, std::string_view key) const;
    QStringList list(std::string_view group, std::string_view key, std::string_view language = {}) const;
    QStringList localList(std::string_view group, std::string_view key) const;
    bool flag(std::string_view group, std::string_view key) const;
    /// The languages that the key has a value for, in the order of the file, then of the setting.
    QStringList languages(std::string_view group, std::string_view key) const;
    /// The language whose value localText() and localList() give.
    QString languageInForce(std::string_view group, std::string_view key) const;

    void setText(std::string_view group, std::string_view key, const QString &value,
                 std::string_view language = {});
    void setLocalText(std::string_view group, std::string_view key, const QString &value);
    void setList(std::string_view group, std::string_view key, const QStringList &value,
                 std::string_view language = {});
    void setLocalList(std::string_view group, std::string_view key, const QStringList &value);
    void setFlag(std::string_view group, std::string_view key, bool value);

    /// Removes a key in all languages.
    void removeKey(std::string_view group, std::string_view key);
    void removeGroups(const std::unordered_set<std::string> &groups);
    /// A group that was removed comes back as it was then; any other stays as it is.
    void restoreGroup(const std::string &group);
    /// Makes a group of all keys of another, in all languages, for each group that \a names gives a
    /// name to that no group has yet.
    void copyGroups(const std::unordered_map<std::string, std::string> &names);

private:
    /// Calls \a visit(group, key, locale, value) for all keys that count, in the order of the file, then of
    /// the setting. A key that stands there twice comes twice; the last value is the one that it has.
    template <typename Visitor>
    void forEachValue(Visitor visit) const;
    template <typename T>
    void write(std::string_view group, std::string_view key, std::string_view locale, const T &value);
    template <typename T>
    void writeLocal(std::string_view group, std::string_view key, const T &value);

    bool isFromPath() const { return m_read && m_textPath == m_path; }

    enum class Outcome { Saved, Failed, Overtaken };
    /// A folder that keeps its lock for as long as it is open.
    using LockedFolder = std::shared_ptr<const FileDescriptor>;
    Outcome replace(const AtomicFile::Target &target, LockedFolder *locked, bool isLast);
    Outcome replace(const AtomicFile::Target &target, const QByteArray &bytes, LockedFolder *locked,
                    bool isLast);

    QByteArray m_path;
    std::shared_ptr<const DesktopEntryText> m_text; ///< never null
    FileStamp m_stamp; ///< of the file when it was read
    bool m_read = false; ///< m_text is that of a file
    QByteArray m_textPath; ///< and of this one
    bool m_settled = false; ///< m_stamp alone tells whether that file has changed since
    bool m_valid = false;
    DesktopEntryChanges m_changes;
};
