// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>

#include <initializer_list>

/// Catches signals of the system and tells of them from the event loop; for the rest of the program.
class SystemSignal : public QObject
{
    Q_OBJECT

public:
    /// Where no pipe can be had, the signals keep what they do by default.
    explicit SystemSignal(std::initializer_list<int> signalNumbers, QObject *parent = nullptr);

Q_SIGNALS:
    /// At least one of the signals came.
    void caught();
};
