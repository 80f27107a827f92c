// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFormHost.h"

#include <QObject>
#include <QStringList>
#include <QVector>

namespace VelUI {

/**
 * Turns the rows of one language to another one.
 *
 * Another language has fields of its own, which take the places of the user's; so what the user's
 * fields show, and how they hang together, stays as it is.
 */
class LanguageRows : public QObject
{
    Q_OBJECT

public:
    /// Turns those of \a rows that have a language.
    LanguageRows(EntryFormHost &form, QVector<FormRow> &rows);
    /// Turns back to the user's language.
    ~LanguageRows() override;

    /// The language that is shown; empty for the user's own.
    QString language() const;
    void turnTo(const QString &language);

    /// All rows of the form with the fields that are in their places.
    const QVector<FormRow> &rows() const { return m_rows; }
    /// The keys that have languages.
    QStringList keys() const;

Q_SIGNALS:
    void turned();

private:
    struct Pair
    {
        int row; // in m_rows
        QWidget *own;
        QWidget *other;
    };

    QWidget *makeField(const FormRow &row);
    void makeFields();
    void showFields(bool isOwn);
    void showValues();
    void edited(const Pair &pair);
    VelUIDesktopEntry withoutFields() const;

    EntryFormHost &m_form;
    QVector<FormRow> &m_rows;
    QVector<Pair> m_pairs;
    QString m_language;
};

} // namespace VelUI
