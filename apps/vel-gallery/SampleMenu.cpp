// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SampleMenu.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

namespace {

struct SampleFile
{
    const char *name;
    const char *contents;
};

const SampleFile files[] = {
    {".directory",
     "[Desktop Entry]\nType=Directory\nName=Sample menu\nSortOrder=*;office;tools;terminal.desktop;\n"},
    {"office/.directory", "[Desktop Entry]\nType=Directory\nName=Office\nIcon=applications-office\n"},
    {"office/letters.desktop",
     "[Desktop Entry]\nType=Application\nName=Letters\nIcon=document-edit\nExec=letters %f\n"},
    {"office/tables.desktop",
     "[Desktop Entry]\nType=Application\nName=Tables\nIcon=x-office-spreadsheet\nExec=tables %f\n"},
    {"tools/.directory", "[Desktop Entry]\nType=Directory\nName=Tools\nIcon=applications-utilities\n"},
    {"tools/calculator.desktop",
     "[Desktop Entry]\nType=Application\nName=Calculator\nIcon=accessories-calculator\nExec=calculator\n"},
    {"tools/line.desktop", "[Desktop Entry]\nType=Application\nName=Line\nExec=VELWM_SEPARATOR\n"},
    {"tools/standards.desktop",
     "[Desktop Entry]\nType=Link\nName=Standards\nURL=https://www.freedesktop.org\n"},
    {"terminal.desktop",
     "[Desktop Entry]\nType=Application\nName=Terminal\nIcon=utilities-terminal\nExec=xterm\n"},
};

} // namespace

SampleMenu::SampleMenu()
{
    for (const SampleFile &sample : files) {
        const QString target = m_folder.filePath(QString::fromLatin1(sample.name));
        QDir().mkpath(QFileInfo(target).absolutePath());
        QFile file(target);
        if (file.open(QIODevice::WriteOnly))
            file.write(sample.contents);
    }
}

QString SampleMenu::path() const
{
    return m_folder.path();
}

QString SampleMenu::entryPath() const
{
    return m_folder.filePath(QStringLiteral("terminal.desktop"));
}
