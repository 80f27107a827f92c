// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "check/EntryFinding.h"

#include <QWidget>

class QLabel;
class QPushButton;

namespace VelUI {

/// One thing that is wrong with an entry, under the row that it is about: an icon for how bad it is, the
/// sentence, and a button that mends it.
class FindingLine : public QWidget
{
    Q_OBJECT

public:
    explicit FindingLine(QWidget *parent = nullptr);

    /// Something to be said, in its words.
    struct Said
    {
        EntryFinding finding;
        QString key; ///< that the text is called after
        QString sentence;
        bool canRepair = false;
    };

    void say(const Said &said);
    /// What is shown, with how bad it is, for those who do not see the icon.
    QString spoken() const;

Q_SIGNALS:
    void repairRequested(const EntryRepair &repair);

protected:
    void changeEvent(QEvent *event) override;

private:
    void showIcon();
    QString severityName() const;

    QLabel *const m_icon;
    QLabel *const m_text;
    QPushButton *const m_fixButton;
    EntryFinding::Severity m_severity = EntryFinding::Hint;
    EntryRepair m_repair;
};

} // namespace VelUI
