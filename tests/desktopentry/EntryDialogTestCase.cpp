// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDialogTestCase.h"

#include "FormDriving.h"

#include <velcore/dirs.h>

#include <QComboBox>
#include <QDir>

using namespace FormDriving;

const QByteArray EntryDialogTestCase::plainApplication =
    "[Desktop Entry]\nType=Application\nName=Plain\nExec=/bin/sh\n";

void EntryDialogTestCase::init()
{
    TestCase::init();
    QDir(QString::fromStdString(GetVelDir(VelDir::StartMenu))).removeRecursively();
    QDir(QString::fromStdString(GetVelDir(VelDir::Desktop))).removeRecursively();
}

ModalDriver::Box EntryDialogTestCase::warning(const QString &text)
{
    return {QMessageBox::Warning, QStringLiteral("Warning"), text, QMessageBox::Ok, QMessageBox::NoButton};
}

QLineEdit *EntryDialogTestCase::line(const QWidget *dialog, const char *name)
{
    return child<QLineEdit>(dialog, name);
}

QString EntryDialogTestCase::type(const QWidget *dialog)
{
    return child<QComboBox>(dialog, "typeComboBox")->currentData().toString();
}
