// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionIds.h"

#include <QHash>
#include <QSet>

#include <algorithm>
#include <optional>

namespace VelUI {

namespace {

using ActionIds::Fault;

bool isUsual(QChar c)
{
    return (c >= QLatin1Char('a') && c <= QLatin1Char('z'))
        || (c >= QLatin1Char('A') && c <= QLatin1Char('Z'))
        || (c >= QLatin1Char('0') && c <= QLatin1Char('9')) || c == QLatin1Char('-');
}

bool isImpossible(QChar c)
{
    return c == QLatin1Char('[') || c == QLatin1Char(']') || c.category() == QChar::Other_Control;
}

std::optional<Fault> faultOf(const QString &id)
{
    if (id.isEmpty())
        return Fault::Missing;
    if (std::any_of(id.begin(), id.end(), isImpossible))
        return Fault::Impossible;
    if (!std::all_of(id.begin(), id.end(), isUsual))
        return Fault::Odd;
    return {};
}

// The letters without their marks, and a "-" for each run of other characters between them.
QString usual(const QString &id)
{
    QString result;
    bool isGap = false;
    for (const QChar c : id.normalized(QString::NormalizationForm_KD)) {
        if (c.isMark())
            continue;
        if (!isUsual(c)) {
            isGap = !result.isEmpty();
            continue;
        }
        if (isGap)
            result += QLatin1Char('-');
        isGap = false;
        result += c;
    }
    return result.isEmpty() ? QStringLiteral("action") : result;
}

// Ids that no other action has; an entry may have thousands that are alike.
class UnusedIds
{
public:
    explicit UnusedIds(const QStringList &taken)
        : m_taken(taken.begin(), taken.end())
    {
    }

    QString take(const QString &id)
    {
        QString proposal = id;
        for (int &number = m_numbers[id]; m_taken.contains(proposal); ++number)
            proposal = id + QLatin1Char('-') + QString::number(number + 2);
        m_taken.insert(proposal);
        return proposal;
    }

private:
    QSet<QString> m_taken;
    QHash<QString, int> m_numbers; // tried already
};

VelUIDesktopAction withId(const VelUIDesktopAction &action, const QString &id)
{
    VelUIDesktopAction result(id);
    result.setName(action.getName());
    result.setLocalName(action.getLocalName());
    result.setIcon(action.getIcon());
    result.setLocalIcon(action.getLocalIcon());
    result.setExec(action.getExec());
    result.setOnlyShowIn(action.getOnlyShowIn());
    result.setNotShowIn(action.getNotShowIn());
    return result;
}

} // namespace

QVector<ActionIds::Problem> ActionIds::problems(const QStringList &ids)
{
    UnusedIds unused(ids);
    QSet<QString> earlier;
    QVector<Problem> problems;
    for (int row = 0; row < ids.size(); ++row) {
        const QString &id = ids.at(row);
        std::optional<Fault> fault = faultOf(id);
        if (!id.isEmpty() && earlier.contains(id))
            fault = Fault::Equal;
        earlier.insert(id);
        if (!fault)
            continue;
        problems.append({row, id, *fault, unused.take(usual(id))});
    }
    return problems;
}

bool ActionIds::isLost(Fault fault)
{
    return fault != Fault::Odd;
}

QStringList ActionIds::of(const QList<VelUIDesktopAction> &actions)
{
    QStringList ids;
    for (const VelUIDesktopAction &action : actions)
        ids.append(action.getId());
    return ids;
}

QList<VelUIDesktopAction> ActionIds::repaired(QList<VelUIDesktopAction> actions)
{
    for (const Problem &problem : problems(of(actions)))
        actions[problem.row] = withId(actions.at(problem.row), problem.proposal);
    return actions;
}

} // namespace VelUI
