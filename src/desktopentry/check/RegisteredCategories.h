// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

/// The categories of applications that freedesktop.org registers for menus.
///
/// A pure table; names for users stand elsewhere. Categories are compared letter by letter, case
/// included, as menus do.
namespace RegisteredCategories {

/// What is registered of a category.
enum class Kind {
    Main, ///< every application should have at least one of these
    Additional, ///< says more about an application that has a main category
    Reserved, ///< only for entries that name their desktops in OnlyShowIn
    Deprecated ///< was registered once
};

/// One registered category.
struct Category
{
    QString name;
    Kind kind;
    /// The categories that it goes with, in the order of the register: it wants all of one of
    /// these lists beside it. Empty where it goes with anything.
    QVector<QStringList> related;
};

/// All categories: the main ones first, then the others, in the order of the register.
const QVector<Category> &all();

/// The category of \a name, null when none is registered under it. The pointer stays good.
const Category *find(const QString &name);

/// Whether \a name is a main category.
bool isMain(const QString &name);

/// Whether \a name marks a category of somebody's own ("X-..."), which needs no registration.
bool isExtension(const QString &name);

} // namespace RegisteredCategories
