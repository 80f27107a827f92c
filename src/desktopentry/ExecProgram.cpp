// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExecProgram.h"

#include "check/ExecRewriting.h"

QString VelUI::ExecProgram::replaced(const QString &command, const QString &program)
{
    const QVector<ExecRewriting::Word> words = ExecRewriting::words(command);
    QString name = program;
    name.replace(QLatin1Char('%'), QLatin1String("%%"));
    const QString written = ExecRewriting::quoted(name);
    if (words.isEmpty())
        return command + written;
    const ExecRewriting::Word &former = words.constFirst();
    return command.left(former.begin) + written + command.mid(former.end);
}
