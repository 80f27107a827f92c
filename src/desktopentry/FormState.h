// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "Translations.h"

#include <QString>
#include <QVariant>
#include <QVector>

namespace VelUI {

/// All that a user can change in the properties form.
struct FormState
{
    QString type;
    bool isTypeDecided = true;
    bool isOnlyShowIn = true;
    QVector<QVariant> own; ///< of the fields for no language and the user's, row by row
    QVector<QVariant> shown; ///< of the fields in their places
    QString language; ///< of the fields in their places; empty for the user's own
    Translations translations;

    /// Whether nothing differs but which language is shown.
    bool isEqualTo(const FormState &other) const;
    /// Whether all that differs are texts, of which one key press made the others.
    bool isTypedAfter(const FormState &before) const;
    /// Whether the typing that led from \a before to \a between went on.
    bool continues(const FormState &before, const FormState &between) const;
};

} // namespace VelUI
