// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ReadingAhead.h"

// Not every platform has it.
#if __has_include(<veluiaux/VelUIEntriesAhead.h>)
#include <veluiaux/VelUIEntriesAhead.h>

struct ReadingAhead::Private
{
    VelUIEntriesAhead entries;
};

void ReadingAhead::begin(const QString &path)
{
    d->entries.read(path);
}

void ReadingAhead::end(const QString &path)
{
    d->entries.giveUp(path);
}

#else

struct ReadingAhead::Private
{
};

void ReadingAhead::begin(const QString &) { }

void ReadingAhead::end(const QString &) { }

#endif

ReadingAhead::ReadingAhead()
    : d(std::make_unique<Private>())
{
}

ReadingAhead::~ReadingAhead() = default;
