// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryFields.h"

#include "EntryDisplay.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>
#include <frame/SearchText.h>

#include <algorithm>

namespace {

constexpr int MostCharacters = 16 * 1024 * 1024;

QString fileNameOf(const QString &path)
{
    return path.mid(path.lastIndexOf(QLatin1Char('/')) + 1);
}

EntryFields::Fields read(const QString &path, const QString &file)
{
    const VelUIDesktopEntry entry(file);
    const QString fileName = fileNameOf(path);
    const QStringList fields{EntryPath::stemOf(fileName),
                             entry.getName(),
                             entry.getLocalName(),
                             entry.getGenericName(),
                             entry.getLocalGenericName(),
                             entry.getComment(),
                             entry.getLocalComment(),
                             entry.getExec(),
                             entry.getKeywords().join(QLatin1Char('\n')),
                             entry.getLocalKeywords().join(QLatin1Char('\n'))};
    return {SearchText::folded(fields.join(QLatin1Char('\n'))), SearchText::folded(fileName),
            EntryPath::isEntry(file) && EntryDisplay::isHidden(entry)};
}

} // namespace

bool EntryFields::match(const Fields &fields, const QStringList &words)
{
    return std::all_of(words.begin(), words.end(), [&fields](const QString &word) {
        return fields.text.contains(word)
            || (word.contains(QLatin1Char('.')) && fields.fileName.contains(word));
    });
}

EntryFields::EntryFields()
    : m_known(MostCharacters)
{
}

EntryFields::Fields EntryFields::of(const QString &path, bool isFolder)
{
    const QString file = EntryDisplay::describingFile(path, isFolder);
    if (file.isEmpty())
        return {SearchText::folded(fileNameOf(path)), QString(), false};
    const FileIdentity identity(file);
    const Known *known = m_known.object(path);
    if (known && known->identity == identity)
        return known->fields;
    const Fields fields = read(path, file);
    if (identity.isSettled())
        m_known.insert(path, new Known{identity, fields}, fields.text.size() + path.size());
    else
        m_known.remove(path);
    return fields;
}
