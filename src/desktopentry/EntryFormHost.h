// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FormRow.h"

#include <frame/DesktopEntryRecord.h>

#include <QObject>
#include <QVector>

namespace VelUI {

class FormLayout;

/// The properties form as those see it who complete it.
class EntryFormHost : public QObject
{
    Q_OBJECT

public:
    virtual FormLayout *formLayout() const = 0;
    /// The rows in the order of the form, also those that the type of the entry hides.
    virtual const QVector<FormRow> &formRows() const = 0;
    /// The entry as it would be saved now.
    virtual VelUIDesktopEntry record() const = 0;

Q_SIGNALS:
    /// What record() gives may have changed.
    void recordChanged();
};

} // namespace VelUI
