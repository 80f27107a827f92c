// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ProgramSearch.h"

#include <QByteArray>
#include <QFile>

#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>

namespace {

// What execvp takes when there is no PATH.
constexpr const char *UsualPath = "/bin:/usr/bin";

ProgramSearch::Result check(const QByteArray &path)
{
    struct stat status;
    if (path.contains('\0') || ::stat(path.constData(), &status) != 0)
        return ProgramSearch::Result::Missing;
    if (!S_ISREG(status.st_mode) || ::access(path.constData(), X_OK) != 0)
        return ProgramSearch::Result::NotExecutable;
    return ProgramSearch::Result::Found;
}

} // namespace

bool ProgramSearch::isPath(const QString &program)
{
    return program.contains(QLatin1Char('/'));
}

ProgramSearch::Result ProgramSearch::find(const QString &program, const QString &folder)
{
    const QByteArray name = QFile::encodeName(program);
    if (name.isEmpty())
        return Result::Missing;
    if (isPath(program)) {
        const bool relative = !name.startsWith('/') && !folder.isEmpty();
        return check(relative ? QFile::encodeName(folder) + '/' + name : name);
    }
    const char *const variable = std::getenv("PATH");
    const QByteArray path(variable ? variable : UsualPath);
    for (const QByteArray &entry : path.split(':')) {
        if (check(entry.isEmpty() ? name : entry + '/' + name) == Result::Found)
            return Result::Found;
    }
    return Result::Missing;
}
