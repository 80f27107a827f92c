// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <functional>

/// A change of a record.
using Change = std::function<void(VelUIDesktopEntry &)>;
Q_DECLARE_METATYPE(Change)

/// The fixture of the tests of a record, in German.
class RecordTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

protected Q_SLOTS:
    void init();

protected:
    /// The first line of a record.
    static inline const QByteArray Header = "[Desktop Entry]\n";

    /// A text in UTF-8.
    static QString text(const char *utf8);
    /// The bytes of a file that held \a before, after a change and a save.
    QByteArray changed(const QByteArray &before, const Change &change);
};
