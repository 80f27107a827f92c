// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QString>
#include <QVariant>

#include <memory>

class QSettings;

/**
 * Reads, changes and writes back one existing settings file of the desktop.
 *
 * The file consists of key=value lines below one section header in brackets, in the encoding of
 * the locale:
 *
 * \code
 * [Theme]
 * color=#d4d0c8
 * flat=true
 * font="Sans Serif"
 * size=10
 * \endcode
 *
 * The words true, false, True and False are read as bool, a run of decimal digits as int (0
 * beyond its range), all else as QString; one pair of double quotes around a string is taken
 * off. Keys are flat: keys of all sections stand side by side. The name of the section is the
 * value of "SectionName"; setting it renames the section, removing it drops the header.
 *
 * Writing gives the header, then the keys in sorted order. The format keeps no comments, no blank
 * lines, no order, no header but the last and no key with an empty value. Each line feed and
 * carriage return in a key, a value or the section's name is written as a blank, told in one line on
 * standard error for each value that had any. A file is replaced as a whole or, when that fails,
 * left as it was; it also stays as it is while it cannot be read, is larger than LargestFile or would
 * become so. Keys that another program changed in the meantime are kept, unless they were changed here
 * as well.
 *
 * A file cannot be emptied: while the last key is removed, nothing is written, and once the object
 * is gone without another key having been set, the file stays as it was.
 *
 * \code
 * VelSettings settings(path);
 * if (settings.isParsed()) {
 *     settings.setValue(QStringLiteral("flat"), !settings.value(QStringLiteral("flat"), false).toBool());
 *     settings.sync();
 * }
 * \endcode
 *
 * For the GUI thread alone. All objects of a process on one file see each other's changes.
 *
 * \image html gallery-settings.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT VelSettings
{
public:
    /// The most bytes that a file may have; a larger one is not opened.
    static constexpr qint64 LargestFile = 16 * 1024 * 1024;

    /**
     * Opens the file \a path.
     *
     * Whether that worked is told by isParsed(). A file that does not exist is not made.
     * @param path path of an existing file.
     */
    explicit VelSettings(const QString &path);

    /// Closes the file. Changes that were not written yet are written now.
    ~VelSettings();

    VelSettings(const VelSettings &) = delete;
    VelSettings &operator=(const VelSettings &) = delete;

    /**
     * Opens another file in place of the one before, whose changes are written.
     *
     * A file that does not exist, cannot be read or is larger than LargestFile leaves the object as it
     * was; so does a pipe or a device. When reading fails for another reason, the new file is in place
     * all the same. Does not change what isParsed() returns.
     * @param path path of an existing file.
     * @return whether the file was opened without an error; if not, a critical message is logged
     * unless the file just does not exist.
     */
    bool ParseConfigFile(const QString &path);

    /// Whether the file given to the constructor was opened without an error.
    bool isParsed() const;

    /**
     * The value of \a key, or \a defaultValue where there is none.
     *
     * Always \a defaultValue when isParsed() is false.
     * @param key the key; "/" at its ends and doubled ones are dropped.
     * @param defaultValue what to return for a key that is not there.
     */
    QVariant value(const QString &key, const QVariant &defaultValue = QVariant()) const;

    /**
     * Sets \a key to \a value; without an open file, does nothing.
     * @param key the key, not empty.
     * @param value written as its QVariant::toString() says.
     */
    void setValue(const QString &key, const QVariant &value);

    /**
     * Removes \a key and all keys that begin with it and "/"; without an open file, does nothing.
     * @param key the key; the empty string stands for all keys.
     */
    void remove(const QString &key);

    /**
     * Writes the changes to the file and takes over what others changed in it.
     *
     * Does nothing without a file that was opened without an error.
     * @param touch whether to give the file the current time first, so that programs that watch
     * it read it anew.
     */
    void sync(bool touch = false);

private:
    void close();

    bool parsed = false;
    std::unique_ptr<QSettings> settings;
    QString fileName;
    bool mayBeEmptied = false;
};
