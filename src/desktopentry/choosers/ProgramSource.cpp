// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ProgramSource.h"

#include "ChoiceModel.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>

namespace VelUI {

namespace {

constexpr qint64 MostMilliseconds = 8;

} // namespace

ProgramSource::ProgramSource()
{
    const QStringList folders =
        QFile::decodeName(qgetenv("PATH")).split(QLatin1Char(':'), Qt::SkipEmptyParts);
    // A relative one means another folder wherever the program is started.
    for (const QString &folder : folders) {
        if (QDir::isAbsolutePath(folder))
            m_folders.append(QDir::cleanPath(folder));
    }
    m_folders.removeDuplicates();
}

QStringList ProgramSource::headers()
{
    return {tr("Program", "title of a column"), tr("Folder", "title of a column")};
}

bool ProgramSource::openNextFolder()
{
    if (m_folders.isEmpty())
        return false;
    m_files.emplace(m_folders.takeFirst(), FolderListing::With);
    return true;
}

bool ProgramSource::read(ChoiceModel *model)
{
    QElapsedTimer timer;
    timer.start();
    QVector<Choice> choices;
    bool isMore = true;
    while (isMore && timer.elapsed() < MostMilliseconds) {
        const std::optional<FolderListing::Item> file = m_files ? m_files->next() : std::nullopt;
        if (!file) {
            isMore = openNextFolder();
            continue;
        }
        if (m_names.contains(file->name) || file->isFolder || !QFileInfo(file->path).isExecutable())
            continue;
        m_names.insert(file->name);
        Choice choice;
        choice.value = file->name;
        choice.texts = QStringList{file->name, QFileInfo(file->path).path()};
        choices.append(choice);
    }
    model->add(choices);
    return isMore;
}

} // namespace VelUI
