// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LineChecks.h"

#include "EntryKeys.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QSet>

#include <algorithm>

namespace {

using Severity = EntryFinding::Severity;

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

const QByteArray MainGroup = QByteArrayLiteral("Desktop Entry");
const QByteArray OldMainGroup = QByteArrayLiteral("KDE Desktop Entry");
const QByteArray ActionPrefix = QByteArrayLiteral("Desktop Action ");

class LineCheck
{
public:
    LineCheck(const CheckedEntry &entry, EntryFindings *findings)
        : m_entry(entry)
        , m_findings(findings)
    {
        const auto *main = m_entry.text.mainGroup();
        const auto *actions = main ? EntryText::key(*main, "Actions") : nullptr;
        const QByteArrayList ids = actions ? EntryText::items(actions->value) : QByteArrayList();
        m_actions = QSet<QByteArray>(ids.begin(), ids.end());
    }

    void check()
    {
        if (m_entry.text.isEmpty())
            add(EntryProblem::EmptyFile, Text::tr("The file is empty."));
        checkFileName();
        checkFaults();
        const auto &groups = m_entry.text.groups();
        if (!groups.isEmpty() && groups.constFirst().name != MainGroup
            && groups.constFirst().name != OldMainGroup)
            add(EntryProblem::FirstGroup, Text::tr("The first group of the file is not '[Desktop Entry]'."));
        for (const EntryText::Group &group : groups)
            checkGroup(group);
    }

private:
    void add(EntryProblem problem, const QString &sentence, const QByteArray &group = {},
             Severity severity = EntryFinding::Error)
    {
        m_findings->append({problem, severity, QString::fromUtf8(group), {}, {}, sentence, std::nullopt});
    }

    void checkFileName()
    {
        const QString name = QFileInfo(m_entry.path).fileName();
        const auto *main = m_entry.text.mainGroup();
        const auto *type = main ? EntryText::key(*main, "Type") : nullptr;
        if (name.isEmpty())
            return;
        const bool isFolder = type && type->value == "Directory";
        const QString suffix = isFolder ? QStringLiteral("directory") : QStringLiteral("desktop");
        if (name.endsWith(QLatin1Char('.') + suffix))
            return;
        add(EntryProblem::FileName, Text::tr("The name of the file has to end in '.%1'.").arg(suffix));
    }

    void checkFaults()
    {
        QVector<EntryText::Fault::Kind> told;
        for (const EntryText::Fault &fault : m_entry.text.faults()) {
            if (told.contains(fault.kind))
                continue;
            told.append(fault.kind);
            addFault(fault);
        }
    }

    void addFault(const EntryText::Fault &fault)
    {
        const QString line = QString::fromUtf8(fault.line);
        switch (fault.kind) {
        case EntryText::Fault::CarriageReturn:
            return add(EntryProblem::CarriageReturn, Text::tr("Lines of the file end in a carriage return."));
        case EntryText::Fault::Stray:
            return add(EntryProblem::StrayLine, Text::tr("A line of the file says nothing: %1").arg(line));
        case EntryText::Fault::KeyBeforeGroup:
            return add(EntryProblem::KeyBeforeGroup,
                       Text::tr("A line of the file stands before all groups: %1").arg(line));
        case EntryText::Fault::LeadingBlank:
            return add(EntryProblem::LeadingBlank,
                       Text::tr("A line of the file begins with a blank: %1").arg(line));
        case EntryText::Fault::TrailingBlank:
            return add(EntryProblem::TrailingBlank, Text::tr("A blank stands behind a group: %1").arg(line));
        }
    }

    void checkGroup(const EntryText::Group &group)
    {
        const QString name = QString::fromUtf8(group.name);
        const bool isMalformed = std::any_of(group.name.cbegin(), group.name.cend(), [](char c) {
            return c == '[' || c == ']' || (c >= '\0' && c < ' ') || c == '\x7f';
        });
        if (group.count > 1)
            add(EntryProblem::RepeatedGroup, Text::tr("The group '%1' stands more than once.").arg(name),
                group.name);
        if (isMalformed)
            add(EntryProblem::MalformedGroup, Text::tr("No group can be called '%1'.").arg(name), group.name);
        else if (group.name.startsWith(ActionPrefix))
            checkActionGroup(group);
        else if (group.name == OldMainGroup)
            add(EntryProblem::DeprecatedGroup, Text::tr("The group '%1' is out of use.").arg(name),
                group.name, EntryFinding::Warning);
        else if (group.name != MainGroup && !EntryKeys::isExtension(group.name))
            add(EntryProblem::UnknownGroup,
                Text::tr("There is no group '%1'; one of your own has to begin with 'X-'.").arg(name),
                group.name);
    }

    void checkActionGroup(const EntryText::Group &group)
    {
        const QByteArray id = group.name.mid(ActionPrefix.size());
        const bool isId = std::all_of(id.cbegin(), id.cend(), [](char c) {
            return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-';
        });
        if (!isId)
            add(EntryProblem::InvalidAction,
                Text::tr("The id '%1' of an action may only have letters A to Z, digits and '-'.")
                    .arg(QString::fromUtf8(id)),
                group.name);
        if (!m_actions.contains(id) || id.isEmpty())
            add(EntryProblem::GroupWithoutAction,
                Text::tr("The action '%1' is described, but 'Actions' does not name it.")
                    .arg(QString::fromUtf8(id)),
                group.name);
    }

    const CheckedEntry &m_entry;
    EntryFindings *const m_findings;
    QSet<QByteArray> m_actions; ///< that the entry names
};

} // namespace

void LineChecks::check(const CheckedEntry &entry, EntryFindings *findings)
{
    LineCheck(entry, findings).check();
}
