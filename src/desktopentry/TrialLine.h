// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFormHost.h"
#include "EntryTrial.h"

#include <QWidget>

class QAbstractButton;
class QLabel;

namespace VelUI {

/// The line under the form that tells what came of trying the entry. It goes when the entry changes.
class TrialLine : public QWidget
{
    Q_OBJECT

public:
    /// \a button starts the trial of what \a form shows, and stops it.
    TrialLine(EntryFormHost &form, QAbstractButton *button);

private:
    void press();
    void tell(const EntryTrial::Result &result);
    void showState();
    static QString textOf(const EntryTrial::Result &result);

    EntryFormHost &m_form;
    QAbstractButton *const m_button;
    QLabel *const m_icon;
    QLabel *const m_text;
    EntryTrial m_trial;
};

} // namespace VelUI
