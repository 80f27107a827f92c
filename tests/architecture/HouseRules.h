// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QHash>
#include <QMap>
#include <QString>
#include <QStringList>
#include <QVector>

/**
 * Who may include whom, read from the tables in docs/architecture.md: the page that people
 * read is the rule that the tests apply.
 */
class HouseRules
{
public:
    /// The rules that \a page gives, a text in Markdown.
    explicit HouseRules(const QString &page);

    /// The rules in force.
    static const HouseRules &inForce();

    /// What in the tables could not be understood, for people to read.
    QStringList errors() const { return m_errors; }

    /// The folders that have a rule.
    QStringList folders() const { return m_allowed.keys(); }
    /// Whether a file of \a folder may include \a file because of the folder that it lies in.
    bool allowsFolder(const QString &folder, const QString &file) const;
    /// Whether \a includer may include the public header \a header of another subsystem.
    bool isDoor(const QString &includer, const QString &header) const;
    /// Whether \a includer, of a program that makes no window, may include the rule \a header.
    bool isRuleHeader(const QString &includer, const QString &header) const;

    /// The folders whose units stand in the table from rules to window.
    QStringList rooms() const { return m_stages.keys(); }
    /// The names of the units of \a room by their stage, from the rules to the dialog.
    QVector<QStringList> stages(const QString &room) const { return m_stages.value(room); }
    /// The stage of the unit \a name of \a room; -1 when the table does not have it.
    int stage(const QString &room, const QString &name) const;

private:
    void readFolders(const QString &page);
    void readDoors(const QString &page);
    void readRuleHeaders(const QString &page);
    void readStages(const QString &page);
    QStringList foldersMeant(const QString &words);

    QStringList m_errors;
    QMap<QString, QStringList> m_allowed;
    QMultiHash<QString, QString> m_doors;
    QMultiHash<QString, QString> m_ruleHeaders;
    QMap<QString, QVector<QStringList>> m_stages;
};
