// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Validator.h"

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QRegularExpression>
#include <QTemporaryDir>

#include <algorithm>

namespace {

using Validator::Complaint;
using Validator::Complaints;
using Validator::Sample;

constexpr int FilesAtOnce = 500;

// What the checker's sentences are about. The first that fits counts; "Exec" and its like are in them.
struct Meaning
{
    const char *pattern;
    EntryProblem problem;
};

constexpr Meaning Meanings[] = {
    {"^file is empty", EntryProblem::EmptyFile},
    {"ending with a carriage return", EntryProblem::CarriageReturn},
    {"^file contains line \".*\", which is not a comment, a group or an entry", EntryProblem::StrayLine},
    {"before the first group, but only comments", EntryProblem::KeyBeforeGroup},
    {"starts with a space\\. Comment, group", EntryProblem::LeadingBlank},
    {"ends with a space, but looks like a group", EntryProblem::TrailingBlank},
    {"^first group is not", EntryProblem::FirstGroup},
    {"^file contains multiple groups named", EntryProblem::RepeatedGroup},
    {"but group names may contain all ASCII", EntryProblem::MalformedGroup},
    {"which is deprecated in favor of \"Desktop Entry\"", EntryProblem::DeprecatedGroup},
    {"which play the same role", EntryProblem::DeprecatedGroup},
    {"but groups extending the format", EntryProblem::UnknownGroup},
    {"which has an invalid action identifier", EntryProblem::InvalidAction},
    {"^file contains multiple keys named \"(?<key>.*)\" in group", EntryProblem::RepeatedKey},
    {"^file contains key \"(?<key>.*)\" in group .*but key names must contain only",
     EntryProblem::MalformedKey},
    {"^file contains key \"\" in group", EntryProblem::MalformedKey},
    {"^file contains key \"(?<key>.*)\" in group .*but keys extending the format", EntryProblem::UnknownKey},
    {"^file contains key \"(?<key>.*)\" in group .*is not defined as a locale string",
     EntryProblem::NotTranslatable},
    {"^key \"(?<key>.*)\" in group .*is a localized key, but there is no non-localized",
     EntryProblem::NoPlainValue},
    {"^required key \"(?<key>.*)\" in group .* is not present", EntryProblem::MissingKey},
    {"^key \"(?<key>.*)\" in group .* is deprecated", EntryProblem::DeprecatedKey},
    {"^key \"(?<key>.*)\" is present in group .*, but the type is", EntryProblem::KeyOfOtherType},
    {"for boolean key \"(?<key>.*)\" in group .*contains invalid characters", EntryProblem::InvalidFlag},
    {"^boolean key \"(?<key>.*)\" in group .*which is deprecated", EntryProblem::DeprecatedFlag},
    {"for (locale )?(string|regexp)( list)? key \"(?<key>.*)\" in group .*contains invalid (UTF-8 "
     ")?character",
     EntryProblem::InvalidCharacter},
    {"for key \"(?<key>Type)\" in group .*is not a registered type", EntryProblem::UnknownType},
    {"for key \"(?<key>Type)\" in group .*(deprecated|reserved)", EntryProblem::UnknownType},
    {"for key \"(?<key>Version)\" in group .*is not a known version", EntryProblem::UnknownVersion},
    {"for key \"(?<key>Encoding)\" in group .*is not a registered encoding", EntryProblem::UnknownEncoding},
    {"for key \"(?<key>Icon.*)\" in group .*is an icon name with an extension", EntryProblem::IconSuffix},
    {"for key \"(?<key>Icon.*)\" in group .*looks like a relative path", EntryProblem::RelativeIcon},
    {"for key \"(?<key>Icon.*)\" in group .*is an absolute path to a directory", EntryProblem::MissingIcon},
    {"for key \"(?<key>.*)\" in group .*does not look like an absolute path", EntryProblem::RelativePath},
    {"^DBusActivatable filename must conform", EntryProblem::UnusableBusName},
    {"for key \"(?<key>AutostartCondition)\" in group", EntryProblem::InvalidCondition},
    {"looks the same as that of key", EntryProblem::SameText},
    {"for key \"(?<key>Exec)\" in group .*contains a quote which is not closed", EntryProblem::OpenQuote},
    {"for key \"(?<key>Exec)\" in group .*contains a reserved character", EntryProblem::ReservedCharacter},
    {"for key \"(?<key>Exec)\" in group .*contains a non-escaped character",
     EntryProblem::UnescapedCharacter},
    {"for key \"(?<key>Exec)\" in group .*ends in an incomplete escape", EntryProblem::OpenEscape},
    {"for key \"(?<key>Exec)\" in group .*contains a non-complete field code",
     EntryProblem::IncompleteFieldCode},
    {"for key \"(?<key>Exec)\" in group .*contains an invalid field code", EntryProblem::UnknownFieldCode},
    {"for key \"(?<key>Exec)\" in group .*contains a deprecated field code",
     EntryProblem::DeprecatedFieldCode},
    {"for key \"(?<key>Exec)\" in group .*may contain at most one", EntryProblem::SeveralFileCodes},
    {"for key \"(?<key>.*)\" in group .*contains (action |interface )?\".*\" more than once",
     EntryProblem::RepeatedItem},
    {"for key \"(?<key>Implements)\" in group .*contains an invalid interface name",
     EntryProblem::InvalidInterface},
    {"for key \"(?<key>OnlyShowIn|NotShowIn)\" in group .*contains an unregistered value",
     EntryProblem::UnknownDesktop},
    {"^only one of \"OnlyShowIn\" and \"NotShowIn\"", EntryProblem::BothShowInLists},
    {"for key \"(?<key>MimeType)\" in group .*which is an invalid MIME type",
     EntryProblem::MalformedMimeType},
    {"for key \"(?<key>MimeType)\" in group .*should probably not be used", EntryProblem::OddMimeType},
    {"for key \"(?<key>Categories)\" in group .*contains an unregistered value",
     EntryProblem::UnknownCategory},
    {"for key \"(?<key>Categories)\" in group .*contains a deprecated value",
     EntryProblem::DeprecatedCategory},
    {"in key \"(?<key>Categories)\" in group .*is a reserved category", EntryProblem::ReservedCategory},
    {"in key \"(?<key>Categories)\" in group .*(requires|can be extended with) another category",
     EntryProblem::MissingRelatedCategory},
    {"for key \"(?<key>Categories)\" in group .*does not contain a registered main category",
     EntryProblem::MissingMainCategory},
    {"for key \"(?<key>Categories)\" in group .*contains more than one main category",
     EntryProblem::SeveralMainCategories},
    {"for key \"(?<key>Actions)\" in group .*contains an empty action", EntryProblem::EmptyAction},
    {"for key \"(?<key>Actions)\" in group .*contains invalid action identifier",
     EntryProblem::InvalidAction},
    {"^action \".*\" is defined, but there is no matching", EntryProblem::ActionWithoutGroup},
    {"^action group \".*\" exists, but there is no matching", EntryProblem::GroupWithoutAction},
    {"^filename (does not have|has) a .*extension", EntryProblem::FileName},
    {"^file is of type \"Directory\", but filename", EntryProblem::FileName},
};

struct Pattern
{
    QRegularExpression expression;
    EntryProblem problem;
};

const QVector<Pattern> &patterns()
{
    static const QVector<Pattern> all = [] {
        QVector<Pattern> list;
        for (const Meaning &meaning : Meanings)
            list.append({QRegularExpression(QString::fromLatin1(meaning.pattern),
                                            QRegularExpression::DotMatchesEverythingOption),
                         meaning.problem});
        return list;
    }();
    return all;
}

Complaint meaningOf(EntryFinding::Severity severity, const QString &text)
{
    QString sentence = text;
    sentence.remove(QLatin1String("(will be fatal in the future): "));
    for (const Pattern &pattern : patterns()) {
        const QRegularExpressionMatch match = pattern.expression.match(sentence);
        if (match.hasMatch())
            return {severity, true, pattern.problem, match.captured(QStringLiteral("key")), text};
    }
    return {severity, false, EntryProblem::EmptyFile, {}, text};
}

EntryFinding::Severity severityOf(const QString &word)
{
    if (word == QLatin1String("error"))
        return EntryFinding::Error;
    return word == QLatin1String("warning") ? EntryFinding::Warning : EntryFinding::Hint;
}

QString placeOf(int index, const Sample &sample)
{
    return QStringLiteral("%1/%2").arg(index, 6, 10, QLatin1Char('0')).arg(sample.name);
}

QByteArray outputFor(const QStringList &places, const QString &folder)
{
    QProcess process;
    process.setWorkingDirectory(folder);
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.start(QStringLiteral("desktop-file-validate"), places);
    return process.waitForFinished(300000) ? process.readAll() : QByteArray();
}

// Version 0.28 takes the semicolon that ends a list of interfaces for the begin of one more without a name.
bool isAboutTheEndOfAList(const QString &text)
{
    static const QRegularExpression complaint(
        QStringLiteral("^value \"(?<list>.*)\" for key \"Implements\" in group .*interface name \"\"$"));
    const QString list = complaint.match(text).captured(QStringLiteral("list"));
    const QChar semicolon = QLatin1Char(';');
    return list.endsWith(semicolon) && list != semicolon && !list.startsWith(semicolon)
        && !list.contains(QLatin1String(";;"));
}

// Version 0.26 knows the standard up to 1.4. What it lacks is a key of the entry, of none of its actions.
bool isAboutANewerStandard(const QString &text)
{
    static const QRegularExpression complaint(
        QStringLiteral("^value \"1\\.5\" for key \"Version\" in group .* is not a known version$|"
                       "^file contains key \"SingleMainWindow(\\[.*\\])?\" in group \"(KDE )?Desktop "
                       "Entry\", but keys extending"));
    return complaint.match(text).hasMatch();
}

void read(const QByteArray &output, QVector<Complaints> *all)
{
    static const QRegularExpression line(QStringLiteral("^(\\d{6})/[^:]*: (error|warning|hint): (.*)$"),
                                         QRegularExpression::DotMatchesEverythingOption);
    for (const QByteArray &bytes : output.split('\n')) {
        const QRegularExpressionMatch match = line.match(QString::fromUtf8(bytes));
        if (match.hasMatch() && !isAboutTheEndOfAList(match.captured(3))
            && !isAboutANewerStandard(match.captured(3)))
            (*all)[match.captured(1).toInt()].append(
                meaningOf(severityOf(match.captured(2)), match.captured(3)));
    }
}

bool complainsAbout(const QByteArray &line)
{
    const QTemporaryDir folder;
    const QByteArray entry = "[Desktop Entry]\nType=Application\nName=A\nExec=true\n" + line + '\n';
    return !Validator::check({{QStringLiteral("a.desktop"), entry}}, folder.path()).value(0).isEmpty();
}

} // namespace

QVector<Complaints> Validator::check(const QVector<Sample> &samples, const QString &folder)
{
    QVector<Complaints> all(samples.size());
    for (int first = 0; first < samples.size(); first += FilesAtOnce) {
        QStringList places;
        for (int i = first; i < qMin(first + FilesAtOnce, int(samples.size())); ++i) {
            places.append(placeOf(i, samples.at(i)));
            QDir(folder).mkpath(places.constLast().section(QLatin1Char('/'), 0, 0));
            QFile file(folder + QLatin1Char('/') + places.constLast());
            if (!file.open(QIODevice::WriteOnly) || file.write(samples.at(i).bytes) < 0)
                return {};
        }
        read(outputFor(places, folder), &all);
        for (const QString &place : qAsConst(places))
            QDir(folder + QLatin1Char('/') + place.section(QLatin1Char('/'), 0, 0)).removeRecursively();
    }
    return all;
}

// Version 0.26 looks neither for interfaces nor at the values of newer keys.
bool Validator::looksFor(const EntryFinding &finding)
{
    static const bool seesInterfaces = complainsAbout("Implements=a");
    static const bool seesMainWindow = complainsAbout("SingleMainWindow=a");
    if (finding.problem == EntryProblem::InvalidInterface)
        return seesInterfaces;
    if (finding.problem == EntryProblem::InvalidFlag && finding.key == QLatin1String("SingleMainWindow"))
        return seesMainWindow;
    return std::any_of(std::begin(Meanings), std::end(Meanings),
                       [&](const Meaning &meaning) { return meaning.problem == finding.problem; });
}
