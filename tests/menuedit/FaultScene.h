// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QMap>
#include <QString>
#include <QStringList>

#include <memory>

/**
 * An operation on files that something may cut short, and what has to hold whenever it does.
 *
 * The program that is killed and the test that looks at what it left make the same scene.
 */
class FaultScene
{
public:
    /// Everything below a folder: the bytes of files, null for folders.
    using Tree = QMap<QString, QByteArray>;

    /**
     * The scene of that name, with everything in \a folder: "save" (a record), "move" (a folder to
     * \a otherFolder on another file system and back), "drop" (several items and the order of
     * their new folder), "menu" (the default menu) or "undo" (what is undone and done again).
     */
    static std::unique_ptr<FaultScene> make(const QString &name, const QString &folder,
                                            const QString &otherFolder);
    FaultScene(const QString &folder, const QString &otherFolder);
    virtual ~FaultScene() = default;

    /// Lays everything out as it is at first.
    void build();
    /// Does the operation for the time of that number; false when it says that it failed.
    virtual bool step(int number) = 0;
    /// What is wrong, whether or not a step has ended; empty when nothing is.
    virtual QString fault() const = 0;
    /// Makes what killed operations left look two hours old and does the next operation there.
    void goOn();
    /// What lies beside the files that are to be there.
    QStringList strays() const;

    static Tree treeOf(const QString &folder);

protected:
    virtual void fill() = 0;
    virtual void nextOperation() = 0;
    /// The folders that an operation may leave something in.
    virtual QStringList places() const = 0;

    QString path(const QString &name) const { return m_folder + QLatin1Char('/') + name; }
    QString otherPath(const QString &name) const { return m_otherFolder + QLatin1Char('/') + name; }
    static void write(const QString &path, const QByteArray &bytes);

private:
    QString m_folder;
    QString m_otherFolder;
};
