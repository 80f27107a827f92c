// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryCheck.h"

#include "AutostartCheck.h"
#include "CategoryCheck.h"
#include "CheckedEntry.h"
#include "ExecCheck.h"
#include "KeyChecks.h"
#include "LineChecks.h"
#include "ListChecks.h"
#include "NameChecks.h"
#include "ValueChecks.h"

#include <QCoreApplication>
#include <QHash>

#include <algorithm>

namespace {

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

using Check = void (*)(const CheckedEntry &, const CheckedValue &);

template <void (*Function)(const CheckedValue &)>
void alone(const CheckedEntry &, const CheckedValue &value)
{
    Function(value);
}

const QHash<QByteArray, Check> &checks()
{
    static const QHash<QByteArray, Check> checks{
        {"Type", alone<ValueChecks::checkType>},
        {"Version", alone<ValueChecks::checkVersion>},
        {"Encoding", alone<ValueChecks::checkEncoding>},
        {"Icon", ValueChecks::checkIcon},
        {"Exec", ExecCheck::checkExec},
        {"TryExec", ExecCheck::checkTryExec},
        {"Path", ValueChecks::checkPath},
        {"URL", ValueChecks::checkUrl},
        {"OnlyShowIn", alone<ListChecks::checkDesktops>},
        {"NotShowIn", alone<ListChecks::checkDesktops>},
        {"MimeType", ListChecks::checkMimeTypes},
        {"Implements", alone<ListChecks::checkInterfaces>},
        {"Categories", alone<CategoryCheck::check>},
        {"Actions", ListChecks::checkActions},
        {"DBusActivatable", ValueChecks::checkBusActivation},
        {"AutostartCondition", alone<AutostartCheck::check>},
    };
    return checks;
}

void checkValue(const CheckedEntry &entry, const CheckedValue &value)
{
    if (!KeyChecks::checkKey(entry, value) || !ValueChecks::checkKind(value))
        return;
    if (const Check check = checks().value(value.key.name))
        check(entry, value);
}

// A record takes half a header for the begin of a group; what it would change then is not what was
// looked at.
bool areGroupsReadAlike(const EntryText &text)
{
    const auto isHalfHeader = [](const EntryText::Fault &fault) {
        return fault.kind == EntryText::Fault::Stray && fault.line.startsWith('[');
    };
    const auto isHeaderlike = [](const EntryText::Key &key) { return key.written.startsWith('['); };
    const auto hasHeaderlike = [isHeaderlike](const EntryText::Group &group) {
        return std::any_of(group.keys.cbegin(), group.keys.cend(), isHeaderlike);
    };
    return std::none_of(text.faults().cbegin(), text.faults().cend(), isHalfHeader)
        && std::none_of(text.groups().cbegin(), text.groups().cend(), hasHeaderlike);
}

// What an application needs beyond what every entry does.
void checkCommand(const CheckedEntry &entry, EntryFindings *findings)
{
    const auto *main = entry.text.mainGroup();
    const auto *type = main ? EntryText::key(*main, "Type") : nullptr;
    const auto *activation = main ? EntryText::key(*main, "DBusActivatable") : nullptr;
    const bool isStarted = activation && activation->value == "true";
    if (type && type->value == "Application" && !isStarted && entry.record.getExec().trimmed().isEmpty())
        findings->append({EntryProblem::MissingProgram,
                          EntryFinding::Error,
                          QStringLiteral("Desktop Entry"),
                          QStringLiteral("Exec"),
                          {},
                          Text::tr("The application has no command."),
                          std::nullopt});
    if (type && type->value == "Link" && !EntryText::key(*main, "URL"))
        findings->append({EntryProblem::MissingTarget,
                          EntryFinding::Error,
                          QStringLiteral("Desktop Entry"),
                          QStringLiteral("URL"),
                          {},
                          Text::tr("The link leads nowhere."),
                          std::nullopt});
}

} // namespace

EntryFindings EntryCheck::check(const VelUIDesktopEntry &record, const QByteArray &contents,
                                const QString &path, const EntryLookups &lookups)
{
    const EntryText text(contents);
    const CheckedEntry entry{record, text, path, lookups};
    EntryFindings findings;
    for (const EntryText::Group &group : text.groups()) {
        for (const EntryText::Key &key : group.keys)
            checkValue(entry, CheckedValue(group, key, &findings));
        KeyChecks::checkGroup(group, &findings);
    }
    checkCommand(entry, &findings);
    NameChecks::check(entry, &findings);
    LineChecks::check(entry, &findings);
    const bool readsAlike = areGroupsReadAlike(text);
    for (EntryFinding &finding : findings) {
        if (finding.repair && (!readsAlike || !finding.repair->changes(record)))
            finding.repair.reset();
    }
    return findings;
}
