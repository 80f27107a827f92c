// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ValueChecks.h"

#include "EntryKeys.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QRegularExpression>
#include <QUrl>

#include <algorithm>

namespace {

using Answer = EntryLookups::Answer;

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

bool isControl(char c)
{
    return (c >= '\0' && c < ' ') || c == '\x7f';
}

bool isUtf8(const QByteArray &bytes)
{
    return QString::fromUtf8(bytes).toUtf8() == bytes && !bytes.contains('\0');
}

QString withoutControls(const QByteArray &value)
{
    QByteArray result;
    for (const char c : value) {
        if (!isControl(c) || c == '\t')
            result += c == '\t' ? ' ' : c;
    }
    return EntryText::text(result);
}

bool checkFlag(const CheckedValue &value)
{
    const QByteArray &flag = value.key.value;
    if (flag == "true" || flag == "false")
        return true;
    if (flag == "1" || flag == "0") {
        value.add(EntryProblem::DeprecatedFlag, EntryFinding::Warning,
                  Text::tr("'%1' is out of use here; it has to be 'true' or 'false'.").arg(value.written()));
        return true;
    }
    const QString sentence = Text::tr("'%1' has to be 'true' or 'false'.").arg(value.written());
    const QByteArray meant = flag.trimmed().toLower();
    if (meant == "true" || meant == "yes" || meant == "on")
        value.add(EntryProblem::InvalidFlag, EntryFinding::Error, sentence, Text::tr("Change it to 'true'"),
                  true);
    else
        value.add(EntryProblem::InvalidFlag, EntryFinding::Error, sentence);
    return false;
}

bool isSuffix(const QString &name, const char *suffix)
{
    return name.endsWith(QLatin1String(suffix));
}

void checkIconName(const QString &name, const CheckedEntry &entry, const CheckedValue &value)
{
    if (isSuffix(name, ".png") || isSuffix(name, ".svg") || isSuffix(name, ".xpm"))
        value.add(EntryProblem::IconSuffix, EntryFinding::Error,
                  Text::tr("The name of an icon has no suffix like '%1'.").arg(name.right(4)),
                  Text::tr("Remove the suffix"), name.left(name.size() - 4));
    else if (entry.lookups.icon(name) == Answer::No)
        value.add(EntryProblem::MissingIcon, EntryFinding::Warning,
                  Text::tr("No icon theme has an icon '%1'.").arg(name));
}

QString absolute(const QString &path)
{
    if (path == QLatin1String("~") || path.startsWith(QLatin1String("~/")))
        return QDir::homePath() + path.mid(1);
    return {};
}

// Adds the finding about a path, with the absolute one as a repair where one is meant.
void addRelative(EntryProblem problem, EntryFinding::Severity severity, const QString &sentence,
                 const CheckedValue &value)
{
    const QString meant = absolute(value.text());
    if (meant.isEmpty())
        value.add(problem, severity, sentence);
    else
        value.add(problem, severity, sentence, Text::tr("Write the folder in full"), meant);
}

bool hasScheme(const QString &url)
{
    static const QRegularExpression scheme(QStringLiteral("^[A-Za-z][A-Za-z0-9+.-]*:"));
    return scheme.match(url).hasMatch();
}

bool looksLikeHost(const QString &url)
{
    static const QRegularExpression host(QStringLiteral("^[A-Za-z0-9-]+(\\.[A-Za-z0-9-]+)+(:[0-9]+)?(/|$)"));
    return host.match(url).hasMatch();
}

void addNoScheme(const CheckedValue &value)
{
    const QString url = value.text();
    const QString path = url.startsWith(QLatin1Char('/')) ? url : absolute(url);
    const QString sentence =
        Text::tr("The address does not say how to reach it, as 'https:' and 'file:' do.");
    const QString label = Text::tr("Change it to '%1'");
    if (!path.isEmpty()) {
        const QString better = QUrl::fromLocalFile(path).toString(QUrl::FullyEncoded);
        value.add(EntryProblem::MissingScheme, EntryFinding::Warning, sentence, label.arg(better), better);
    } else if (looksLikeHost(url)) {
        const QString better = QLatin1String("https://") + url;
        value.add(EntryProblem::MissingScheme, EntryFinding::Warning, sentence, label.arg(better), better);
    } else {
        value.add(EntryProblem::MissingScheme, EntryFinding::Warning, sentence);
    }
}

bool isBusName(const QString &name)
{
    static const QRegularExpression pattern(
        QStringLiteral("^[A-Za-z_-][A-Za-z0-9_-]*(\\.[A-Za-z_-][A-Za-z0-9_-]*)+$"));
    return name.size() <= 255 && pattern.match(name).hasMatch();
}

} // namespace

bool ValueChecks::checkKind(const CheckedValue &value)
{
    const EntryKeys::Key *key = EntryKeys::find(value.key.name);
    if (key->type == EntryKeys::ValueType::Flag)
        return checkFlag(value);
    const QByteArray &bytes = value.key.value;
    if (key->isTranslatable() ? isUtf8(bytes) : std::none_of(bytes.cbegin(), bytes.cend(), isControl))
        return true;
    const QString sentence = key->isTranslatable()
        ? Text::tr("The text is not encoded in UTF-8.")
        : Text::tr("A control character or tab may not stand here.");
    if (key->type == EntryKeys::ValueType::Text && isUtf8(bytes))
        value.add(EntryProblem::InvalidCharacter, EntryFinding::Error, sentence, Text::tr("Remove it"),
                  withoutControls(bytes));
    else
        value.add(EntryProblem::InvalidCharacter, EntryFinding::Error, sentence);
    return false;
}

void ValueChecks::checkType(const CheckedValue &value)
{
    static const QByteArrayList registered{"Application", "Link", "Directory"};
    static const QByteArrayList reserved{"Service", "ServiceType", "FSDevice", "MimeType"};
    const QByteArray &type = value.key.value;
    if (registered.contains(type))
        return;
    value.add(
        EntryProblem::UnknownType, reserved.contains(type) ? EntryFinding::Warning : EntryFinding::Error,
        Text::tr("The type has to be 'Application', 'Link' or 'Directory', not '%1'.").arg(value.text()));
}

void ValueChecks::checkVersion(const CheckedValue &value)
{
    static const QByteArrayList known{"1.0",   "1.1",   "1.2",   "1.3",   "1.4",  "1.5",
                                      "0.9.4", "0.9.5", "0.9.6", "0.9.7", "0.9.8"};
    if (known.contains(value.key.value))
        return;
    value.add(EntryProblem::UnknownVersion, EntryFinding::Error,
              Text::tr("There is no version '%1' of the standard.").arg(value.text()),
              Text::tr("Change it to '%1'").arg(QLatin1String("1.4")), QStringLiteral("1.4"));
}

void ValueChecks::checkEncoding(const CheckedValue &value)
{
    if (value.key.value != "UTF-8" && value.key.value != "Legacy-Mixed")
        value.add(EntryProblem::UnknownEncoding, EntryFinding::Error,
                  Text::tr("There is no encoding '%1'.").arg(value.text()));
}

void ValueChecks::checkIcon(const CheckedEntry &entry, const CheckedValue &value)
{
    const QString name = value.text();
    if (name.startsWith(QLatin1Char('/'))) {
        // Where there is none, there may be one some day; a folder is never one.
        const bool isFolder = name.endsWith(QLatin1Char('/'));
        if (isFolder || entry.lookups.icon(name) == Answer::No)
            value.add(EntryProblem::MissingIcon, isFolder ? EntryFinding::Error : EntryFinding::Warning,
                      Text::tr("There is no picture '%1'.").arg(name));
    } else if (name.contains(QLatin1Char('/'))) {
        addRelative(EntryProblem::RelativeIcon, EntryFinding::Error,
                    Text::tr("An icon has a name or a path that begins with '/'."), value);
    } else if (!name.isEmpty()) {
        checkIconName(name, entry, value);
    }
}

void ValueChecks::checkPath(const CheckedEntry &entry, const CheckedValue &value)
{
    const QString path = value.text();
    if (!path.startsWith(QLatin1Char('/')))
        addRelative(EntryProblem::RelativePath, EntryFinding::Warning,
                    Text::tr("The path of a folder begins with '/'."), value);
    else if (entry.lookups.file(path) == Answer::No)
        value.add(EntryProblem::MissingFolder, EntryFinding::Warning,
                  Text::tr("There is no folder '%1'.").arg(path));
}

void ValueChecks::checkUrl(const CheckedEntry &entry, const CheckedValue &value)
{
    const auto *type = EntryText::key(value.group, "Type");
    if (type && type->value != "Link")
        return;
    const QString url = value.text();
    if (url.trimmed().isEmpty())
        return value.add(EntryProblem::MissingTarget, EntryFinding::Error,
                         Text::tr("The link leads nowhere."));
    if (!hasScheme(url))
        addNoScheme(value);
    const QString file = url.startsWith(QLatin1Char('/')) ? url : QUrl(url).toLocalFile();
    if (!file.isEmpty() && entry.lookups.file(file) == Answer::No)
        value.add(EntryProblem::MissingFile, EntryFinding::Error,
                  Text::tr("There is no file '%1'.").arg(file));
}

void ValueChecks::checkBusActivation(const CheckedEntry &entry, const CheckedValue &value)
{
    if (value.key.value != "true" && value.key.value != "1")
        return;
    const QString name = QFileInfo(entry.path).fileName();
    const QLatin1String suffix(".desktop");
    if (!name.endsWith(suffix) || !isBusName(name.left(name.size() - suffix.size())))
        value.add(
            EntryProblem::UnusableBusName, EntryFinding::Error,
            Text::tr(
                "D-Bus cannot start '%1': a file of a name like 'org.example.Program.desktop' is needed.")
                .arg(name));
}
