// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuMirror.h"
#include "MenuTestCase.h"
#include "VelMenuView.h"

#include <memory>
#include <random>

/**
 * A shown menu of random items beside the plain model of it, the choice of what to do next, and
 * the comparison of the two.
 */
class RandomMenuTestCase : public MenuTestCase
{
    Q_OBJECT

public:
    using MenuTestCase::MenuTestCase;

protected:
    using Kind = MenuMirror::Kind;
    /// How many items the menu has at first.
    static constexpr int Items = 300;

    /// Writes the menu and makes the plain model of it.
    void build();
    /// Selects the item of a path in the menu.
    void selectItem(const QString &path);
    /// What differs between the view and the plain model; empty when nothing does.
    QString compare();
    /// Says what the step does, for the message of a failure.
    void describe(const QString &text) { m_step = text; }
    /// Fills in the entry editor and accepts it.
    static void fillIn(QWidget *dialog, const QString &name, bool isFolder);
    /// The whole path of one in the menu.
    QString full(const QString &relative) const
    {
        return relative.isEmpty() ? menu() : menu() + QLatin1Char('/') + relative;
    }
    /// A name that no item has.
    QString fresh() { return QStringLiteral("Entry %1").arg(++m_counter, 5, 10, QLatin1Char('0')); }
    /// A random number below \a below.
    int number(int below) { return std::uniform_int_distribution<int>(0, below - 1)(m_random); }
    /// True so many times in a hundred.
    bool chance(int percent) { return number(100) < percent; }
    /// One of the list; null when that is empty.
    QString any(const QStringList &list) { return list.isEmpty() ? QString() : list.at(number(list.size())); }
    /// The items that the view shows.
    QStringList shownPaths() const;
    /// All folders of the menu, itself among them.
    QStringList folders() const;

    std::mt19937 m_random;
    std::unique_ptr<VelMenuView> m_view;
    MenuMirror m_mirror;
    /// The file names shown in each folder after the last step.
    QMap<QString, QStringList> m_rows;
    /// What must be selected; null when that does not matter.
    QString m_selected;
    /// What describe() was told.
    QString m_step;

private:
    /// Writes one item, unless there is one of that name.
    void buildItem(const QString &folder, int number);
    /// Opens every folder below \a parent; false when rows do not come.
    bool openAll(const QModelIndex &parent, const QString &folder);
    /// The same for the rows of one folder and those below.
    QString compareRows(const QModelIndex &parent, const QString &folder);

    int m_counter = 0;
};
