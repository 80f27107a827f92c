// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HouseRules.h"

#include "SourceFiles.h"

#include <QRegularExpression>

namespace {

// Stands for the public headers of all three platform libraries.
const QString PlatformHeaders = QStringLiteral("platform headers");

QStringList cellsOf(const QString &line)
{
    QStringList cells = line.trimmed().split(QLatin1Char('|'));
    if (cells.size() < 3)
        return {};
    cells.removeFirst();
    cells.removeLast();
    for (QString &cell : cells)
        cell = cell.trimmed();
    return cells;
}

// The rows of the table whose heading is \a heading.
QVector<QStringList> tableOf(const QString &page, const QStringList &heading)
{
    const QStringList lines = page.split(QLatin1Char('\n'));
    QVector<QStringList> rows;
    for (int i = 0; i < lines.size(); ++i) {
        if (cellsOf(lines.at(i)) != heading)
            continue;
        for (int row = i + 2; row < lines.size(); ++row) {
            const QStringList cells = cellsOf(lines.at(row));
            if (cells.size() != heading.size())
                break;
            rows.append(cells);
        }
    }
    return rows;
}

// The words between backquotes.
QStringList names(const QString &cell)
{
    static const QRegularExpression quoted(QStringLiteral("`([^`]+)`"));
    QStringList found;
    QRegularExpressionMatchIterator matches = quoted.globalMatch(cell);
    while (matches.hasNext())
        found.append(matches.next().captured(1));
    return found;
}

bool isPlatformHeader(const QString &file)
{
    return file.startsWith(QLatin1String("platform/"))
        && file.section(QLatin1Char('/'), 2, 2) == QLatin1String("include");
}

} // namespace

HouseRules::HouseRules(const QString &page)
{
    readFolders(page);
    readDoors(page);
    readRuleHeaders(page);
    readStages(page);
}

const HouseRules &HouseRules::inForce()
{
    static const HouseRules rules(SourceFiles::textOf(QStringLiteral("docs/architecture.md")));
    return rules;
}

bool HouseRules::allowsFolder(const QString &folder, const QString &file) const
{
    if (SourceFiles::isBelow(file, folder))
        return true;
    for (const QString &allowed : m_allowed.value(folder)) {
        if (allowed == PlatformHeaders ? isPlatformHeader(file) : SourceFiles::isBelow(file, allowed))
            return true;
    }
    return false;
}

bool HouseRules::isDoor(const QString &includer, const QString &header) const
{
    const QString folder = includer.section(QLatin1Char('/'), 0, 1);
    return includer.endsWith(QLatin1String(".cpp"))
        && m_doors.contains(folder, header.section(QLatin1Char('/'), -1));
}

bool HouseRules::isRuleHeader(const QString &includer, const QString &header) const
{
    return m_ruleHeaders.contains(includer.section(QLatin1Char('/'), 0, 1), header);
}

int HouseRules::stage(const QString &room, const QString &name) const
{
    const QVector<QStringList> all = stages(room);
    for (int i = 0; i < all.size(); ++i) {
        if (all.at(i).contains(name))
            return i;
    }
    return -1;
}

void HouseRules::readFolders(const QString &page)
{
    for (const QStringList &row :
         tableOf(page, {QStringLiteral("folder"), QStringLiteral("is"), QStringLiteral("may include")})) {
        const QStringList allowed = foldersMeant(row.at(2));
        for (const QString &folder : names(row.at(0)))
            m_allowed.insert(folder, allowed);
    }
}

QStringList HouseRules::foldersMeant(const QString &words)
{
    static const QMap<QString, QString> meaning{
        {QStringLiteral("`include/`"), QStringLiteral("include")},
        {QStringLiteral("frame"), QStringLiteral("src/frame")},
        {QStringLiteral("rules"), QStringLiteral("platform/rules")},
        {QStringLiteral("velcore"), QStringLiteral("platform/velcore/include")},
        {QStringLiteral("veluiaux"), QStringLiteral("platform/veluiaux/include")},
        {PlatformHeaders, PlatformHeaders},
    };
    if (words == QLatin1String("nothing of ours"))
        return {};
    QStringList folders;
    for (const QString &word : words.split(QStringLiteral(", "))) {
        if (meaning.contains(word))
            folders.append(meaning.value(word));
        else
            m_errors.append(QStringLiteral("\"%1\" is no folder that may be included").arg(word));
    }
    return folders;
}

void HouseRules::readDoors(const QString &page)
{
    for (const QStringList &row :
         tableOf(page, {QStringLiteral("from"), QStringLiteral("opens"), QStringLiteral("for")})) {
        for (const QString &folder : names(row.at(0))) {
            for (const QString &header : names(row.at(1)))
                m_doors.insert(folder, header);
        }
    }
}

void HouseRules::readRuleHeaders(const QString &page)
{
    for (const QStringList &row :
         tableOf(page, {QStringLiteral("program"), QStringLiteral("takes the rules")})) {
        for (const QString &program : names(row.at(0))) {
            for (const QString &header : names(row.at(1)))
                m_ruleHeaders.insert(program, header);
        }
    }
}

void HouseRules::readStages(const QString &page)
{
    for (const QStringList &row :
         tableOf(page,
                 {QStringLiteral("room"), QStringLiteral("rules"), QStringLiteral("model"),
                  QStringLiteral("view or form"), QStringLiteral("dialog")})) {
        QVector<QStringList> stages;
        for (int i = 1; i < row.size(); ++i)
            stages.append(names(row.at(i)));
        for (const QString &room : names(row.at(0)))
            m_stages.insert(room, stages);
    }
}
