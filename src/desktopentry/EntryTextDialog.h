// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ChangedLines.h"
#include "EntryFormHost.h"

#include <QDialog>
#include <QTimer>

class QLabel;

namespace VelUI {

class MarkedTextView;

/// Shows the file of the entry as it would be saved, and what of it is another than it was; the user
/// goes on in the form meanwhile.
class EntryTextDialog : public QDialog
{
    Q_OBJECT

public:
    /// \a history takes back what was done in the form, here, too.
    EntryTextDialog(EntryFormHost &form, const QList<QAction *> &history);

    /// Remembers the size.
    ~EntryTextDialog() override;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void placeBesideForm();
    void refresh();
    static QString summary(const ChangedLines &text);

    EntryFormHost &m_form;
    MarkedTextView *const m_view;
    QLabel *const m_summary;
    QTimer m_soon;
};

} // namespace VelUI
