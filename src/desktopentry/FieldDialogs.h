// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>

class QDialog;

namespace VelUI {

class EntryFormAssistance;

/// Completes the dialogs that the fields of the assisted form open, those of lists, of actions and of
/// one action: their sizes are remembered, and the fields of an action have choosers.
class FieldDialogs : public QObject
{
    Q_OBJECT

public:
    /// Watches the fields of the form of \a assistance, which owns this.
    explicit FieldDialogs(EntryFormAssistance *assistance);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void watchField(QObject *field);
    void watch(QDialog *dialog);
};

} // namespace VelUI
