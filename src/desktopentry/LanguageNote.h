// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QMap>
#include <QString>
#include <QStringList>

/// Tells who sees which language of an entry.
class LanguageNote
{
    Q_DECLARE_TR_FUNCTIONS(LanguageNote)

public:
    /// The languages of each key that has a value without one.
    using Languages = QMap<QString, QStringList>;

    /// What users of \a language see.
    static QString text(const QString &language, const Languages &languages);

private:
    static QString seen(const QString &language, const Languages &languages);
};
