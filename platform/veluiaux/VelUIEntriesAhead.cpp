// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelUIEntriesAhead.h>

#include "records/TextsAhead.h"

#include <QFile>
#include <QHash>

struct VelUIEntriesAhead::Private
{
    QHash<QString, TextsAhead::Ticket> folders;
};

VelUIEntriesAhead::VelUIEntriesAhead()
    : d(std::make_unique<Private>())
{
}

VelUIEntriesAhead::~VelUIEntriesAhead()
{
    for (const TextsAhead::Ticket &folder : qAsConst(d->folders))
        TextsAhead::instance().giveUp(folder);
}

void VelUIEntriesAhead::read(const QString &folder)
{
    giveUp(folder);
    const QByteArray path = QFile::encodeName(folder);
    if (!path.isEmpty() && !path.contains('\0'))
        d->folders.insert(folder, TextsAhead::instance().read(path.toStdString()));
}

void VelUIEntriesAhead::giveUp(const QString &folder)
{
    TextsAhead::instance().giveUp(d->folders.take(folder));
}
