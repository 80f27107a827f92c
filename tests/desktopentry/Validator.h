// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <desktopentry/check/EntryFinding.h>

#include <QByteArray>
#include <QString>
#include <QVector>

/// desktop-file-validate, the public checker of entries, run on many files at once.
namespace Validator {

/// A file to be checked.
struct Sample
{
    QString name; ///< without a folder
    QByteArray bytes;
};

/// One line that the checker writes.
struct Complaint
{
    EntryFinding::Severity severity;
    bool isKnown; ///< the test knows what problem it is about
    EntryProblem problem;
    QString key; ///< with its language; empty where it is about none
    QString text;
};

using Complaints = QVector<Complaint>;

/// What the checker says about each of \a samples, written below \a folder. Empty when it cannot be run.
QVector<Complaints> check(const QVector<Sample> &samples, const QString &folder);

/// Whether the checker looks at all for what \a finding is about.
bool looksFor(const EntryFinding &finding);

} // namespace Validator
