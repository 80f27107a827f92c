// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ModalDriver.h"
#include "TestCase.h"

#include <QByteArray>
#include <QString>

class QLineEdit;

/// Base of the tests of the entry dialog. There is neither a start menu nor a desktop folder.
class EntryDialogTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

    /// The least that an application needs.
    static const QByteArray plainApplication;

    /// The box in which the dialog tells of a failure.
    static ModalDriver::Box warning(const QString &text);
    /// A line of the form by its object name.
    static QLineEdit *line(const QWidget *dialog, const char *name);
    /// The type that the form shows.
    static QString type(const QWidget *dialog);

protected Q_SLOTS:
    void init();
};
