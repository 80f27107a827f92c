// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

// The one door to the desktop entry records of the platform.
//
// The classes come from the platform's libveluiaux, the bundled one or another. Below stands
// every operation that the library relies on, checked at compile time: a platform that lacks
// one, or has it with other types, stops the build with the name of the operation.

#include <veluiaux/VelUIDesktopAction.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QByteArray>
#include <QList>
#include <QString>
#include <QStringList>

#include <type_traits>
#include <utility>

namespace DesktopEntryRecord {

/// Whether \a Call can be made on a \a Record and gives a \a Result; evaluates nothing.
template <typename Result, typename Record, typename Call>
constexpr bool gives(const Call &)
{
    return std::is_invocable_r_v<Result, Call, Record &>;
}

} // namespace DesktopEntryRecord

#define VEL_RECORD_NEEDS(Record, Result, call) \
    static_assert(DesktopEntryRecord::gives<Result, Record>( \
                      [](auto &record) -> decltype(record.call) { return record.call; }), \
                  "The platform's " #Record " lacks the operation " #Result " " #call)

#define VEL_RECORD_NEEDS_VALUE(Record, Type, Name) \
    VEL_RECORD_NEEDS(const Record, Type, get##Name()); \
    VEL_RECORD_NEEDS(Record, void, set##Name(std::declval<const Type &>()))

#define VEL_RECORD_NEEDS_CONSTRUCTOR(Record, ...) \
    static_assert(std::is_constructible_v<Record, __VA_ARGS__>, \
                  "The platform's " #Record " lacks the constructor (" #__VA_ARGS__ ")")

// One desktop entry file.
VEL_RECORD_NEEDS_CONSTRUCTOR(VelUIDesktopEntry, const QString &);
VEL_RECORD_NEEDS_CONSTRUCTOR(VelUIDesktopEntry, const VelUIDesktopEntry &);
static_assert(std::is_copy_assignable_v<VelUIDesktopEntry>,
              "The platform's VelUIDesktopEntry cannot be assigned");
static_assert(std::is_same_v<VelUIDesktopEntry::SuitableError, int>,
              "The platform's VelUIDesktopEntry::SuitableError is no int");
static_assert(std::is_same_v<VelUIDesktopEntry::DisplayableError, int>,
              "The platform's VelUIDesktopEntry::DisplayableError is no int");

VEL_RECORD_NEEDS(VelUIDesktopEntry, void, setFilePath(std::declval<const QString &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry, bool, load());
VEL_RECORD_NEEDS(VelUIDesktopEntry, bool, save());
VEL_RECORD_NEEDS(const VelUIDesktopEntry, QByteArray, contents());
VEL_RECORD_NEEDS(const VelUIDesktopEntry, bool, isValid());
VEL_RECORD_NEEDS(VelUIDesktopEntry, void, inheritFrom(std::declval<const VelUIDesktopEntry &>()));
VEL_RECORD_NEEDS(const VelUIDesktopEntry, bool, isSuitable(static_cast<int *>(nullptr)));
VEL_RECORD_NEEDS(const VelUIDesktopEntry, bool, isDisplayable(static_cast<int *>(nullptr)));

VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, Type);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, Name);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, LocalName);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, GenericName);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, LocalGenericName);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, Comment);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, LocalComment);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, Icon);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, LocalIcon);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, Exec);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, TryExec);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, Path);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, URL);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, StartupWMClass);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QString, Version);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, bool, Terminal);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, bool, NoDisplay);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, bool, Hidden);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, bool, StartupNotify);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QStringList, OnlyShowIn);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QStringList, NotShowIn);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QStringList, MimeType);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QStringList, Categories);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QStringList, Keywords);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QStringList, LocalKeywords);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QStringList, SortOrder);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopEntry, QList<VelUIDesktopAction>, Actions);

VEL_RECORD_NEEDS(const VelUIDesktopEntry, QStringList, getLanguages(std::declval<const QString &>()));
VEL_RECORD_NEEDS(const VelUIDesktopEntry, QString, getLanguageInForce(std::declval<const QString &>()));
VEL_RECORD_NEEDS(const VelUIDesktopEntry, QString,
                 getTranslation(std::declval<const QString &>(), std::declval<const QString &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry, void,
                 setTranslation(std::declval<const QString &>(), std::declval<const QString &>(),
                                std::declval<const QString &>()));
VEL_RECORD_NEEDS(const VelUIDesktopEntry, QStringList,
                 getTranslatedList(std::declval<const QString &>(), std::declval<const QString &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry, void,
                 setTranslatedList(std::declval<const QString &>(), std::declval<const QString &>(),
                                   std::declval<const QStringList &>()));

// The command line of an entry.
VEL_RECORD_NEEDS_CONSTRUCTOR(VelUIDesktopEntry::ExecFormatString, const QString &);
VEL_RECORD_NEEDS(VelUIDesktopEntry::ExecFormatString, VelUIDesktopEntry::ExecFormatString &,
                 filePath(std::declval<const QString &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry::ExecFormatString, VelUIDesktopEntry::ExecFormatString &,
                 url(std::declval<const QString &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry::ExecFormatString, VelUIDesktopEntry::ExecFormatString &,
                 appName(std::declval<const QString &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry::ExecFormatString, VelUIDesktopEntry::ExecFormatString &,
                 icon(std::declval<const QString &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry::ExecFormatString, VelUIDesktopEntry::ExecFormatString &,
                 desktopFilePath(std::declval<const QString &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry::ExecFormatString, VelUIDesktopEntry::ExecFormatString &,
                 filePathList(std::declval<const QStringList &>()));
VEL_RECORD_NEEDS(VelUIDesktopEntry::ExecFormatString, VelUIDesktopEntry::ExecFormatString &,
                 urlList(std::declval<const QStringList &>()));
static_assert(std::is_convertible_v<VelUIDesktopEntry::ExecFormatString, QString>,
              "The platform's VelUIDesktopEntry::ExecFormatString does not convert to QString");

// One additional action of an entry.
static_assert(std::is_default_constructible_v<VelUIDesktopAction>,
              "The platform's VelUIDesktopAction lacks the default constructor");
VEL_RECORD_NEEDS_CONSTRUCTOR(VelUIDesktopAction, const QString &);
VEL_RECORD_NEEDS_CONSTRUCTOR(VelUIDesktopAction, const VelUIDesktopAction &);
static_assert(std::is_copy_assignable_v<VelUIDesktopAction>,
              "The platform's VelUIDesktopAction cannot be assigned");
VEL_RECORD_NEEDS(const VelUIDesktopAction, QString, getId());
VEL_RECORD_NEEDS_VALUE(VelUIDesktopAction, QString, Name);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopAction, QString, LocalName);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopAction, QString, Icon);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopAction, QString, LocalIcon);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopAction, QString, Exec);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopAction, QStringList, OnlyShowIn);
VEL_RECORD_NEEDS_VALUE(VelUIDesktopAction, QStringList, NotShowIn);

#undef VEL_RECORD_NEEDS
#undef VEL_RECORD_NEEDS_VALUE
#undef VEL_RECORD_NEEDS_CONSTRUCTOR
