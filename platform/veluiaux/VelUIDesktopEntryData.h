// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "records/EntryDocument.h"

#include <QSharedData>

/// What the copies of a record share.
class VelUIDesktopEntryData : public QSharedData
{
public:
    EntryDocument document;
};
