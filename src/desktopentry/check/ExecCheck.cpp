// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExecCheck.h"

#include "ExecFaults.h"
#include "ExecRewriting.h"

#include <QCoreApplication>
#include <QDir>

namespace {

using ExecFaults::Fault;
using Answer = EntryLookups::Answer;

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

constexpr int LongestPath = 4096;

bool isWindowManagerCommand(const QString &exec)
{
    return exec.startsWith(QLatin1String("VELWM_"));
}

// What a repair begins with; nothing where there is none.
QString repairable(const CheckedValue &value)
{
    return value.isLong ? QString() : value.text();
}

QString quotingSentence(const Fault &fault)
{
    switch (fault.problem) {
    case EntryProblem::OpenQuote:
        return Text::tr("A quote is not closed.");
    case EntryProblem::UnescapedCharacter:
        return Text::tr("In quotes, a backslash has to stand before '%1'.").arg(fault.character);
    case EntryProblem::OpenEscape:
        return Text::tr("The command ends in a single backslash, which stands for nothing.");
    default:
        return Text::tr("'%1' has to stand in double quotes.").arg(fault.character);
    }
}

void addQuoting(const Fault &fault, const CheckedValue &value)
{
    const QString exec = repairable(value);
    const auto severity =
        fault.problem == EntryProblem::ReservedCharacter && fault.character == QLatin1Char('\\')
        ? EntryFinding::Warning
        : EntryFinding::Error;
    const QString sentence = quotingSentence(fault);
    if (!ExecRewriting::needsShell(exec))
        value.add(fault.problem, severity, sentence,
                  fault.problem == EntryProblem::OpenQuote ? Text::tr("Close the quote")
                                                           : Text::tr("Put it in quotes"),
                  ExecRewriting::requoted(exec, QDir::homePath()));
    else if (!ExecRewriting::throughShell(exec).isEmpty())
        value.add(fault.problem, severity, sentence, Text::tr("Have a shell run it"),
                  ExecRewriting::throughShell(exec));
    else
        value.add(fault.problem, severity, sentence);
}

void addUnknownCode(const Fault &fault, const CheckedValue &value)
{
    const QString repaired = ExecRewriting::withPlainPercents(repairable(value));
    const QString label = Text::tr("Write '%' as '%%'");
    if (fault.problem == EntryProblem::IncompleteFieldCode)
        value.add(fault.problem, EntryFinding::Error,
                  Text::tr("A field code is not complete: '%' ends the command."), label, repaired);
    else
        value.add(fault.problem, EntryFinding::Error,
                  Text::tr("There is no field code '%%1'.").arg(fault.character), label, repaired);
}

void addKnownCode(const Fault &fault, const CheckedValue &value)
{
    const QString exec = repairable(value);
    const QString remove = Text::tr("Remove it");
    switch (fault.problem) {
    case EntryProblem::DeprecatedFieldCode:
        return value.add(
            fault.problem, EntryFinding::Warning,
            Text::tr("The field code '%%1' is out of use; nothing is put in its place.").arg(fault.character),
            remove, ExecRewriting::withoutCodes(exec, fault.character));
    case EntryProblem::SeveralFileCodes:
        return value.add(fault.problem, EntryFinding::Error,
                         Text::tr("Only one of '%f', '%F', '%u' and '%U' may stand in a command, and once."),
                         Text::tr("Keep the first"),
                         ExecRewriting::withoutCodes(exec, {}, QStringLiteral("fFuU")));
    case EntryProblem::DoubledFieldCode:
        return value.add(fault.problem, EntryFinding::Warning,
                         Text::tr("The field code '%%1' stands more than once.").arg(fault.character),
                         Text::tr("Keep the first"), ExecRewriting::withoutCodes(exec, {}, fault.character));
    default:
        return value.add(fault.problem, EntryFinding::Warning,
                         Text::tr("The field code '%%1' has to be an argument of its own, not in quotes.")
                             .arg(fault.character));
    }
}

void add(const Fault &fault, const CheckedValue &value)
{
    switch (fault.problem) {
    case EntryProblem::IncompleteFieldCode:
    case EntryProblem::UnknownFieldCode:
        return addUnknownCode(fault, value);
    case EntryProblem::DeprecatedFieldCode:
    case EntryProblem::SeveralFileCodes:
    case EntryProblem::DoubledFieldCode:
    case EntryProblem::MisplacedFieldCode:
        return addKnownCode(fault, value);
    default:
        return addQuoting(fault, value);
    }
}

// How much of a command, blanks included, is the path of a program; 0 if none of it is.
int lengthOfProgram(const QString &exec, const QString &folder, const EntryLookups &lookups, bool *isKnown)
{
    for (int blank = exec.indexOf(QLatin1Char(' ')); blank >= 0;
         blank = exec.indexOf(QLatin1Char(' '), blank + 1)) {
        const int next = exec.indexOf(QLatin1Char(' '), blank + 1);
        const int end = next < 0 ? exec.size() : next;
        if (end > LongestPath)
            break;
        const Answer answer = lookups.program(exec.left(end), folder);
        *isKnown = *isKnown && answer != Answer::Unknown;
        if (answer == Answer::Yes)
            return end;
    }
    return 0;
}

void addMissingProgram(const QString &program, const CheckedEntry &entry, const CheckedValue &value)
{
    const QString exec = value.text();
    bool isKnown = true;
    const bool isPath = exec.contains(QLatin1Char('/')) && program == ExecRewriting::quoted(program);
    const int length = isPath ? lengthOfProgram(exec, entry.record.getPath(), entry.lookups, &isKnown) : 0;
    if (length > 0)
        value.add(EntryProblem::BlankInProgram, EntryFinding::Error,
                  Text::tr("The path of the program has a blank: it has to stand in quotes."),
                  Text::tr("Put it in quotes"), ExecRewriting::quoted(exec.left(length)) + exec.mid(length));
    else if (isKnown)
        value.add(EntryProblem::MissingProgram, EntryFinding::Error,
                  Text::tr("There is no program '%1'.").arg(program));
}

} // namespace

void ExecCheck::checkExec(const CheckedEntry &entry, const CheckedValue &value)
{
    const QString exec = value.text();
    for (const Fault &fault : ExecFaults::find(value.key.value))
        add(fault, value);
    const QVector<ExecRewriting::Word> words = ExecRewriting::words(exec);
    if (words.isEmpty() || isWindowManagerCommand(exec))
        return;
    const QString program = words.constFirst().meant;
    if (program.startsWith(QLatin1Char('%')) || program.isEmpty())
        value.add(EntryProblem::MissingProgram, EntryFinding::Error,
                  Text::tr("The command has to begin with a program."));
    else if (entry.lookups.program(program, entry.record.getPath()) == Answer::No)
        addMissingProgram(program, entry, value);
}

void ExecCheck::checkTryExec(const CheckedEntry &entry, const CheckedValue &value)
{
    const QString program = value.text();
    if (program.isEmpty() || entry.lookups.program(program, QString()) != Answer::No)
        return;
    const QVector<ExecRewriting::Word> words = ExecRewriting::words(program);
    const QString meant = words.isEmpty() ? QString() : words.constFirst().meant;
    if (!meant.isEmpty() && meant != program && entry.lookups.program(meant, QString()) == Answer::Yes)
        value.add(EntryProblem::MissingTryExec, EntryFinding::Error,
                  Text::tr("'Try exec' takes the program alone, without quotes and arguments."),
                  Text::tr("Keep the program"), meant);
    else
        value.add(EntryProblem::MissingTryExec, EntryFinding::Error,
                  Text::tr("There is no program '%1', so the entry is not shown.").arg(program));
}
