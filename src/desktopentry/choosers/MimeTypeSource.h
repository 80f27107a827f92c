// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "Choice.h"
#include "ChoiceSource.h"

#include <QCoreApplication>
#include <QMimeDatabase>
#include <QVector>

namespace VelUI {

/**
 * The MIME types of the shared database: name, comment, patterns of file names.
 *
 * The names are there with the first step. The rest takes a file for each type, and follows.
 */
class MimeTypeSource : public ChoiceSource
{
    Q_DECLARE_TR_FUNCTIONS(VelUI::MimeTypeSource)

public:
    /// \a chosen are shown too where the database does not know them.
    explicit MimeTypeSource(const QStringList &chosen);

    static QStringList headers();

    bool read(ChoiceModel *model) override;

private:
    void readNames(ChoiceModel *model);
    Choice choice(const QString &name, const QMimeType &type) const;

    const QStringList m_chosen;
    const QMimeDatabase m_database;
    QVector<QMimeType> m_types; // of the rows
    int m_next = -1; // row whose rest is to be read; before the names none
};

} // namespace VelUI
