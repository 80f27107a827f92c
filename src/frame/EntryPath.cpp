// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryPath.h"

namespace {

const QLatin1String RecordFileSuffix("/.directory");
const QLatin1String EntrySuffix(".desktop");

} // namespace

bool EntryPath::isEntry(const QString &path)
{
    return path.endsWith(EntrySuffix);
}

QString EntryPath::entryNamed(const QString &stem)
{
    return stem + EntrySuffix;
}

QString EntryPath::stemOf(const QString &fileName)
{
    return isEntry(fileName) ? fileName.left(fileName.size() - EntrySuffix.size()) : fileName;
}

bool EntryPath::isRecordFile(const QString &path)
{
    return path.endsWith(RecordFileSuffix);
}

QString EntryPath::recordFileOf(const QString &folder)
{
    return folder + RecordFileSuffix;
}

QString EntryPath::describedBy(const QString &recordFile)
{
    return isRecordFile(recordFile) ? recordFile.left(recordFile.size() - RecordFileSuffix.size())
                                    : recordFile;
}
