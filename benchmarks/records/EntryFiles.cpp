// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryFiles.h"

#include <QDir>
#include <QFile>

#include <unistd.h>

#include <iterator>

namespace {

QByteArray languageCode(int i)
{
    static const char *const first[] = {"de", "fr", "es",    "it",    "pl",
                                        "ru", "ja", "zh_CN", "pt_BR", "sr@latin"};
    if (i < int(std::size(first)))
        return first[i];
    return QByteArray(1, char('a' + i / 26)) + char('a' + i % 26);
}

// An entry as applications install them: some languages, comments, two actions.
QByteArray entry(int languages, int number)
{
    QByteArray bytes = "# A desktop entry\n[Desktop Entry]\nVersion=1.0\nType=Application\n";
    const auto localized = [&](const QByteArray &key, const QByteArray &value) {
        bytes += key + "=" + value + "\n";
        for (int i = 0; i < languages; ++i)
            bytes += key + "[" + languageCode(i) + "]=" + value + " \xC3\xBC" + languageCode(i) + "\n";
    };
    const QByteArray name = "Application " + QByteArray::number(number);
    localized("Name", name);
    localized("GenericName", "Text editor of the kind");
    localized("Comment", "Edit text files and look at what is in them");
    localized("Keywords", "text;editor;notes;plain;");
    bytes += "Exec=application-" + QByteArray::number(number)
        + " --new-window %U\nTryExec=application\nIcon=accessories"
          "-text-editor\nTerminal=false\nStartupNotify=true\nCategories=Utility;TextEditor;\nMimeType=text/"
          "plain;"
          "text/x-c;text/x-c++;application/x-shellscript;\nActions=window;document;\n";
    for (const QByteArray id : {"window", "document"}) {
        bytes += "\n[Desktop Action " + id + "]\n";
        localized("Name", "New " + id);
        bytes += "Exec=application --new-" + id + "\n";
    }
    return bytes;
}

} // namespace

QByteArrayList EntryFiles::synthetic(int languages)
{
    QByteArrayList entries;
    for (int i = 0; i < MostFiles; ++i)
        entries.append(entry(languages, i));
    return entries;
}

QByteArrayList EntryFiles::installed()
{
    QByteArrayList entries;
    QDir folder(QStringLiteral("/usr/share/applications"));
    const QStringList names = folder.entryList({QStringLiteral("*.desktop")}, QDir::Files, QDir::Name);
    for (const QString &name : names.mid(0, MostFiles)) {
        QFile file(folder.filePath(name));
        if (file.open(QIODevice::ReadOnly))
            entries.append(file.readAll());
    }
    return entries;
}

EntryFiles::EntryFiles(const QString &parent, const QByteArrayList &contents, int sets)
    : m_folder(parent + QStringLiteral("/records-XXXXXX"))
    , m_count(contents.size())
    , m_size(contents.join().size() / m_count)
{
    for (int set = 0; set < sets; ++set) {
        for (const QByteArray &bytes : contents)
            write(bytes);
    }
    settle();
}

void EntryFiles::write(const QByteArray &bytes)
{
    const QString path = m_folder.filePath(QStringLiteral("entry%1.desktop").arg(m_paths.size()));
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qFatal("cannot write %s", qPrintable(path));
    m_paths.append(path);
    m_encoded.append(QFile::encodeName(path));
}

void EntryFiles::useNextSet()
{
    m_first = (m_first + m_count) % m_paths.size();
}

void EntryFiles::settle()
{
    ::usleep(60000);
}

void EntryFiles::settleForLong()
{
    ::usleep(1100000);
}
