// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFinding.h"

#include <QByteArray>
#include <QChar>
#include <QVector>

/// What is wrong with the quoting and the field codes of a command, by its bytes alone.
namespace ExecFaults {

struct Fault
{
    EntryProblem problem;
    QChar character; ///< the reserved one, or the letter of the field code

    friend bool operator==(const Fault &a, const Fault &b)
    {
        return a.problem == b.problem && a.character == b.character;
    }
};

/// The faults of \a value, the bytes of an Exec value with their escapes; each one once.
QVector<Fault> find(const QByteArray &value);

} // namespace ExecFaults
