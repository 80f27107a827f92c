// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TestCase.h"

#include <frame/DesktopEntryRecord.h>

#include <QByteArray>
#include <QString>
#include <QStringList>

class QComboBox;

/// Base of the tests of the properties form. The user's language is German.
class PropsFormTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

    // The types of an entry.
    static const QString application;
    static const QString link;
    static const QString directory;

    /// Writes \a bytes to \a name below folder() and loads that entry.
    VelUIDesktopEntry entry(const QByteArray &bytes, const QString &name = QStringLiteral("entry.desktop"));
    /// Saves \a entry to "saved.desktop" below folder() and returns what stands there.
    QByteArray saved(VelUIDesktopEntry &entry);

    static QComboBox *typeBox(const QWidget &form);
    /// Chooses a type in the combo box, which asks whether that is meant.
    static void chooseType(const QWidget &form, const QString &type);
    /// The labels of the rows that are shown, a "*" behind a bold one.
    static QStringList shownRows(const QWidget &form);

protected Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
};
