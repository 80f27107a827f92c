// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>

class QLineEdit;

namespace VelUI {

/// Carries what the user types in one line along into a second one, which holds the same text for
/// the user's language and is the one that menus show.
///
/// The lines are tied while they hold the same text, not an empty one. They stay tied when the user
/// empties the first, until the second changes by itself.
class TiedLines : public QObject
{
    Q_OBJECT

public:
    /// Watches the lines, whose texts it never changes but for what the user types in \a base.
    TiedLines(QLineEdit *base, QLineEdit *local);

private:
    void carry(const QString &text);
    void lookAnew();

    QLineEdit *const m_base;
    QLineEdit *const m_local;
    bool m_isTied = false;
    bool m_isCarrying = false; // until the first line has told of its new text
};

} // namespace VelUI
