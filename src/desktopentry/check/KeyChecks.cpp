// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyChecks.h"

#include "EntryKeys.h"

#include <QCoreApplication>

namespace {

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

bool isAction(const EntryText::Group &group)
{
    return group.name.startsWith("Desktop Action ");
}

void addMissing(const EntryText::Group &group, const QByteArray &name, EntryFindings *findings)
{
    findings->append({EntryProblem::MissingKey,
                      EntryFinding::Error,
                      QString::fromUtf8(group.name),
                      QString::fromUtf8(name),
                      {},
                      Text::tr("'%1' is missing.").arg(QString::fromUtf8(name)),
                      std::nullopt});
}

// The translation that stands for the plain value best: the plainest English one, else the first.
const EntryText::Key *bestTranslation(const EntryText::Group &group, const QByteArray &name)
{
    const EntryText::Key *best = nullptr;
    for (const EntryText::Key &key : group.keys) {
        const bool isBetter = !best
            || (key.locale.startsWith("en")
                && (!best->locale.startsWith("en") || key.locale.size() < best->locale.size()));
        if (key.name == name && !key.locale.isEmpty() && isBetter)
            best = &key;
    }
    return best;
}

QVariant asValue(const EntryKeys::Key &standard, const QString &text)
{
    return standard.isList() ? QVariant(text.split(QLatin1Char(';'), Qt::SkipEmptyParts)) : QVariant(text);
}

// Who has none of the languages sees nothing without the plain value.
void addNoPlainValue(const EntryKeys::Key &standard, const EntryText::Group &group, EntryFindings *findings)
{
    const QString name = QString::fromUtf8(standard.name);
    EntryFinding finding{
        EntryProblem::NoPlainValue,
        EntryFinding::Error,
        QString::fromUtf8(group.name),
        name,
        {},
        Text::tr("'%1' has translations only, and nothing for all other languages.").arg(name),
        std::nullopt};
    const QString text = EntryText::text(bestTranslation(group, standard.name)->value);
    if (group.name == "Desktop Entry" && group.count == 1 && !text.isEmpty())
        finding.repair = EntryRepair{Text::tr("Take '%1'").arg(text), name, asValue(standard, text)};
    findings->append(finding);
}

void checkPlainValues(const EntryText::Group &group, EntryFindings *findings)
{
    QByteArrayList told;
    for (const EntryText::Key &key : group.keys) {
        if (key.locale.isEmpty() || !key.isReadable || group.lines.contains(key.name)
            || told.contains(key.name))
            continue;
        const EntryKeys::Key *standard = EntryKeys::find(key.name);
        if (!standard || !standard->isTranslatable())
            continue;
        told.append(key.name);
        addNoPlainValue(*standard, group, findings);
    }
}

// What a type that nobody knows may have, nobody knows.
bool hasOwnKeys(const QByteArray &type)
{
    static const QByteArrayList known{"Application", "Link",     "Directory", "Service",
                                      "ServiceType", "FSDevice", "MimeType"};
    return known.contains(type);
}

// The type of the group; where it has none, that of another group which plays the same role.
const EntryText::Key *typeOf(const CheckedEntry &entry, const EntryText::Group &group)
{
    const EntryText::Key *type = EntryText::key(group, "Type");
    for (const char *name : {"Desktop Entry", "KDE Desktop Entry"}) {
        const EntryText::Group *other = entry.text.group(name);
        if (!type && other)
            type = EntryText::key(*other, "Type");
    }
    return type;
}

void checkOwner(const CheckedEntry &entry, const EntryKeys::Key &standard, const CheckedValue &value)
{
    const auto *type = typeOf(entry, value.group);
    if (isAction(value.group) || standard.onlyFor.isEmpty() || !type || type->value == standard.onlyFor
        || !hasOwnKeys(type->value))
        return;
    const QString sentence = Text::tr("'%1' is only for entries of the type '%2'.")
                                 .arg(QString::fromUtf8(standard.name), QString::fromUtf8(standard.onlyFor));
    const bool isFlag = standard.type == EntryKeys::ValueType::Flag;
    const bool isReachable = standard.onlyFor != "FSDevice" && standard.name != "Actions"
        && standard.name != "AutostartCondition" && !value.text().isEmpty();
    if (isFlag || !isReachable || standard.isDeprecated)
        value.add(EntryProblem::KeyOfOtherType, EntryFinding::Error, sentence);
    else
        value.add(EntryProblem::KeyOfOtherType, EntryFinding::Error, sentence, Text::tr("Remove it"),
                  standard.isList() ? QVariant(QStringList()) : QVariant(QString()));
}

void checkDeprecated(const EntryKeys::Key &standard, const CheckedValue &value)
{
    const bool isOldShowIn =
        isAction(value.group) && (standard.name == "OnlyShowIn" || standard.name == "NotShowIn");
    if (standard.isDeprecated || isOldShowIn)
        value.add(EntryProblem::DeprecatedKey, EntryFinding::Warning,
                  Text::tr("'%1' is out of use here.").arg(QString::fromUtf8(standard.name)));
}

// Whether the group may have the key at all.
const EntryKeys::Key *standardKey(const CheckedValue &value)
{
    const EntryKeys::Key *standard = EntryKeys::find(value.key.name);
    return standard && (!isAction(value.group) || EntryKeys::isForActions(value.key.name)) ? standard
                                                                                           : nullptr;
}

bool checkWritten(const CheckedValue &value)
{
    const QString name = QString::fromUtf8(value.key.written);
    if (value.key.isRepetition)
        value.add(EntryProblem::RepeatedKey, EntryFinding::Error,
                  Text::tr("'%1' stands more than once.").arg(name));
    if (!value.key.isWellFormed)
        value.add(EntryProblem::MalformedKey,
                  value.key.isReadable ? EntryFinding::Warning : EntryFinding::Error,
                  Text::tr("No key can be called '%1'.").arg(name));
    return value.key.isReadable;
}

} // namespace

bool KeyChecks::checkKey(const CheckedEntry &entry, const CheckedValue &value)
{
    if (!checkWritten(value) || !isOfStandard(value.group) || EntryKeys::isExtension(value.key.name))
        return false;
    const EntryKeys::Key *standard = standardKey(value);
    if (!standard) {
        value.add(EntryProblem::UnknownKey, EntryFinding::Error,
                  Text::tr("There is no key '%1' here; one of your own has to begin with 'X-'.")
                      .arg(QString::fromUtf8(value.key.name)));
        return false;
    }
    if (!value.key.locale.isEmpty() && !standard->isTranslatable()) {
        value.add(EntryProblem::NotTranslatable, EntryFinding::Error,
                  Text::tr("'%1' cannot be translated.").arg(QString::fromUtf8(value.key.name)));
        return false;
    }
    checkDeprecated(*standard, value);
    checkOwner(entry, *standard, value);
    return true;
}

void KeyChecks::checkGroup(const EntryText::Group &group, EntryFindings *findings)
{
    if (!isOfStandard(group))
        return;
    checkPlainValues(group, findings);
    const QByteArrayList wanted =
        isAction(group) ? QByteArrayList{"Name", "Exec"} : QByteArrayList{"Type", "Name"};
    for (const QByteArray &name : wanted) {
        if (!EntryText::key(group, name))
            addMissing(group, name, findings);
    }
    if (group.lines.value("OnlyShowIn").size() + group.lines.value("NotShowIn").size() > 1)
        findings->append({EntryProblem::BothShowInLists,
                          EntryFinding::Error,
                          QString::fromUtf8(group.name),
                          QStringLiteral("NotShowIn"),
                          {},
                          Text::tr("'Only show in' and 'Not show in' exclude each other."),
                          std::nullopt});
}

bool KeyChecks::isOfStandard(const EntryText::Group &group)
{
    return group.name == "Desktop Entry" || group.name == "KDE Desktop Entry" || isAction(group);
}
