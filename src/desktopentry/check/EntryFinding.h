// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryRepair.h"

#include <QString>
#include <QVector>

#include <optional>

/// What can be wrong with a desktop entry.
enum class EntryProblem {
    // The file and its lines.
    EmptyFile,
    FileName,
    CarriageReturn,
    StrayLine,
    KeyBeforeGroup,
    LeadingBlank,
    TrailingBlank,
    // Groups.
    FirstGroup,
    RepeatedGroup,
    UnknownGroup,
    MalformedGroup,
    DeprecatedGroup,
    // Keys.
    MalformedKey,
    UnknownKey,
    RepeatedKey,
    NotTranslatable,
    NoPlainValue,
    MissingKey,
    DeprecatedKey,
    KeyOfOtherType,
    // Values.
    InvalidCharacter,
    InvalidFlag,
    DeprecatedFlag,
    UnknownType,
    UnknownVersion,
    UnknownEncoding,
    IconSuffix,
    RelativeIcon,
    MissingIcon,
    RelativePath,
    MissingFolder,
    MissingScheme,
    MissingTarget,
    MissingFile,
    UnusableBusName,
    InvalidCondition,
    HiddenName,
    SameText,
    // Commands.
    OpenQuote,
    ReservedCharacter,
    UnescapedCharacter,
    OpenEscape,
    IncompleteFieldCode,
    UnknownFieldCode,
    DeprecatedFieldCode,
    SeveralFileCodes,
    DoubledFieldCode,
    MisplacedFieldCode,
    MissingProgram,
    BlankInProgram,
    MissingTryExec,
    // Lists.
    RepeatedItem,
    UnknownDesktop,
    BothShowInLists,
    MalformedMimeType,
    OddMimeType,
    UnknownMimeType,
    InvalidInterface,
    UnknownCategory,
    DeprecatedCategory,
    ReservedCategory,
    MissingRelatedCategory,
    MissingMainCategory,
    SeveralMainCategories,
    // Actions.
    InvalidAction,
    EmptyAction,
    ActionWithoutGroup,
    GroupWithoutAction,
};

/// One thing that an entry check has to say.
struct EntryFinding
{
    enum Severity { Hint, Warning, Error };

    EntryProblem problem;
    Severity severity;
    QString group; ///< the group it is about; empty where it is about the file
    QString key; ///< the key it is about; empty where it is about a group or the file
    QString locale; ///< the language of the key; empty for the plain one
    QString sentence; ///< for the user
    std::optional<EntryRepair> repair;
};

using EntryFindings = QVector<EntryFinding>;
