// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "GalleryPage.h"

#include <QVector>

/// All pages, those of one category one after the other.
QVector<GalleryPage> galleryPages();
