// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuDialog.h"

class VelMenuDialogPrivate
{
};

VelMenuDialog::VelMenuDialog(const QString &, int, bool, bool, QWidget *parent, Qt::WindowFlags f)
    : QDialog(parent, f)
    , d(new VelMenuDialogPrivate)
{
}

VelMenuDialog::VelMenuDialog(QWidget *parent)
    : VelMenuDialog(QString(), -1, false, false, parent)
{
}

VelMenuDialog::~VelMenuDialog() = default;

QString VelMenuDialog::menuDir() const
{
    return {};
}

QString VelMenuDialog::selectedItemPath() const
{
    return {};
}

QString VelMenuDialog::selectedItemExec(const QString &, const QString &, const QStringList *,
                                        const QStringList *) const
{
    return {};
}

bool VelMenuDialog::updateWM()
{
    return false;
}

void VelMenuDialog::selChanged(QItemSelection, QItemSelection) { }

void VelMenuDialog::changed() { }

void VelMenuDialog::applySlot() { }

void VelMenuDialog::helpSlot() { }
