// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

#include <climits>

#include <fnmatch.h>

/**
 * The places of two names in a `SortOrder`, by one walk over the list, element by element.
 *
 * The rule as it is written down: the tests compare with it what keeps an index of the list.
 */
class SortOrderWalk
{
public:
    /// Walks over \a list for \a left and \a right.
    SortOrderWalk(const QStringList &list, const QString &left, const QString &right)
    {
        for (int i = 0; i < list.size(); ++i) {
            if (!step(i, list.at(i), left, right))
                return;
        }
    }

    /// The place of the left name; INT_MAX for one that stands nowhere.
    int leftPlace() const { return place(m_leftExact, m_leftAny); }
    /// The place of the right name; INT_MAX for one that stands nowhere.
    int rightPlace() const { return place(m_rightExact, m_rightAny); }

private:
    // Whether the walk goes on.
    bool step(int i, const QString &element, const QString &left, const QString &right)
    {
        if (element == left) {
            m_leftExact = i;
            if (m_rightExact != -1)
                return false;
            if (element == right)
                m_rightExact = i;
            else
                m_leftAny = i;
            return element != right;
        }
        if (element == right) {
            m_rightExact = m_rightAny = i;
            return m_leftExact == -1;
        }
        if (m_leftAny == -1 && m_rightAny == -1 && element.contains(QLatin1Char('*'))) {
            if (matches(element, left))
                m_leftAny = i;
            if (matches(element, right))
                m_rightAny = i;
        }
        return true;
    }

    static bool matches(const QString &pattern, const QString &name)
    {
        return fnmatch(pattern.toLocal8Bit().constData(), name.toLocal8Bit().constData(), 0) == 0;
    }
    static int place(int exact, int any) { return exact != -1 ? exact : any != -1 ? any : INT_MAX; }

    int m_leftExact = -1;
    int m_rightExact = -1;
    int m_leftAny = -1;
    int m_rightAny = -1;
};
