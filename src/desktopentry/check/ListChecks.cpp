// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ListChecks.h"

#include "ItemRepair.h"

#include <frame/DesktopNames.h>

#include <QCoreApplication>
#include <QRegularExpression>
#include <QSet>

#include <algorithm>
#include <cstring>

namespace {

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

// Calls check(item) for each item, and says which ones stand twice.
template <typename Check>
void forEachItem(const CheckedValue &value, Check check)
{
    if (value.key.value.isEmpty())
        return;
    const QByteArrayList items = EntryText::items(value.key.value);
    QSet<QByteArray> seen;
    for (const QByteArray &item : items) {
        const QString text = EntryText::text(item);
        if (seen.contains(item))
            value.add(EntryProblem::RepeatedItem, EntryFinding::Warning,
                      Text::tr("'%1' stands more than once.").arg(text), Text::tr("Keep the first"),
                      ItemRepair::replaced(value, item, {text}));
        else
            check(item);
        seen.insert(item);
    }
}

bool isRegisteredMedia(const QByteArray &media)
{
    static const QByteArrayList registered{
        "application", "audio",     "chemical", "font",  "image",     "inode",       "message",
        "model",       "multipart", "text",     "video", "x-content", "x-directory", "x-scheme-handler"};
    return registered.contains(media) || media.startsWith("x-") || media.startsWith("X-");
}

bool isOfMimeType(char c)
{
    return c > ' ' && c < '\x7f' && !std::strchr("()<>@,;:\\\"/[]?=", c);
}

// Why \a item is no MIME type; empty where it is one.
QString malformedSentence(const QByteArray &item)
{
    const QString text = EntryText::text(item);
    const int slash = item.indexOf('/');
    if (slash < 0)
        return Text::tr("'%1' is no MIME type: it has no '/'.").arg(text);
    const QByteArray media = item.left(slash);
    const QByteArray subtype = item.mid(slash + 1);
    if (subtype.isEmpty())
        return Text::tr("'%1' is no MIME type: nothing stands behind the '/'.").arg(text);
    if (!isRegisteredMedia(media))
        return Text::tr("'%1' is no MIME type: there is no kind '%2'.").arg(text, EntryText::text(media));
    if (!std::all_of(media.cbegin(), media.cend(), isOfMimeType)
        || !std::all_of(subtype.cbegin(), subtype.cend(), isOfMimeType))
        return Text::tr("'%1' is no MIME type: it has a character that none has.").arg(text);
    return {};
}

// The MIME types that were meant by an item: in small letters, without blanks and parameters, several
// at a comma.
QStringList meantMimeTypes(const QByteArray &item)
{
    QStringList types;
    for (const QByteArray &part : item.split(',')) {
        const QByteArray type = part.trimmed().toLower();
        if (malformedSentence(type).isEmpty())
            types.append(QString::fromUtf8(type));
    }
    return types;
}

void checkMimeType(const QByteArray &item, const CheckedEntry &entry, const CheckedValue &value)
{
    const QString sentence = malformedSentence(item);
    if (!sentence.isEmpty()) {
        const QStringList meant = meantMimeTypes(item);
        value.add(EntryProblem::MalformedMimeType, EntryFinding::Error, sentence,
                  meant.isEmpty() ? Text::tr("Remove it")
                                  : Text::tr("Change it to '%1'").arg(meant.join(QLatin1String("', '"))),
                  ItemRepair::replaced(value, item, meant));
        return;
    }
    const QByteArray media = item.left(item.indexOf('/'));
    const bool isOdd = media == "message" || media == "multipart" || media == "x-directory"
        || (media.toLower().startsWith("x-") && media != "x-content" && media != "x-scheme-handler");
    if (isOdd)
        value.add(EntryProblem::OddMimeType, EntryFinding::Warning,
                  Text::tr("MIME types like '%1' are not used for files.").arg(EntryText::text(item)));
    else if (entry.lookups.mimeType(EntryText::text(item)) == EntryLookups::Answer::No)
        value.add(EntryProblem::UnknownMimeType, EntryFinding::Hint,
                  Text::tr("This computer does not know the MIME type '%1'.").arg(EntryText::text(item)));
}

// As D-Bus has them.
bool isInterface(const QByteArray &name)
{
    static const QRegularExpression pattern(
        QStringLiteral("\\A[A-Za-z_][A-Za-z0-9_]*(\\.[A-Za-z_][A-Za-z0-9_]*)+\\z"));
    return name.size() <= 255 && pattern.match(QString::fromLatin1(name)).hasMatch();
}

bool isOfActionId(char c)
{
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-';
}

void checkAction(const QByteArray &item, const CheckedEntry &entry, const CheckedValue &value)
{
    const QString id = EntryText::text(item);
    if (item.isEmpty())
        value.add(EntryProblem::EmptyAction, EntryFinding::Error, Text::tr("An action has no id."));
    else if (!std::all_of(item.cbegin(), item.cend(), isOfActionId))
        value.add(EntryProblem::InvalidAction, EntryFinding::Error,
                  Text::tr("The id '%1' of an action may only have letters A to Z, digits and '-'.").arg(id));
    else if (!entry.text.group("Desktop Action " + item))
        value.add(EntryProblem::ActionWithoutGroup, EntryFinding::Error,
                  Text::tr("Nothing says what the action '%1' is.").arg(id));
}

} // namespace

void ListChecks::checkDesktops(const CheckedValue &value)
{
    forEachItem(value, [&value](const QByteArray &item) {
        const QString name = EntryText::text(item);
        const QStringList registered = DesktopNames::registered();
        if (registered.contains(name) || name.startsWith(QLatin1String("X-")))
            return;
        const QString meant = ItemRepair::meant(item, registered);
        const QString sentence =
            Text::tr("There is no registered desktop '%1'; others have to begin with 'X-'.").arg(name);
        if (meant.isEmpty())
            value.add(EntryProblem::UnknownDesktop, EntryFinding::Error, sentence);
        else
            value.add(EntryProblem::UnknownDesktop, EntryFinding::Error, sentence,
                      Text::tr("Change it to '%1'").arg(meant), ItemRepair::replaced(value, item, {meant}));
    });
}

void ListChecks::checkMimeTypes(const CheckedEntry &entry, const CheckedValue &value)
{
    forEachItem(value, [&](const QByteArray &item) { checkMimeType(item, entry, value); });
}

void ListChecks::checkInterfaces(const CheckedValue &value)
{
    forEachItem(value, [&value](const QByteArray &item) {
        if (!isInterface(item))
            value.add(EntryProblem::InvalidInterface, EntryFinding::Error,
                      Text::tr("'%1' is no name of an interface; such names are like 'org.example.Viewer'.")
                          .arg(EntryText::text(item)));
    });
}

void ListChecks::checkActions(const CheckedEntry &entry, const CheckedValue &value)
{
    forEachItem(value, [&](const QByteArray &item) { checkAction(item, entry, value); });
}
