// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "GalleryPage.h"

#include <QVector>

/// Screenshots of the pages in every combination of palette, direction and scale.
namespace GalleryScreenshots {

/**
 * Writes "<page>-<light|dark>-<ltr|rtl>-<scale>.png" into \a directory for each page, at the
 * scale at which the program runs, which \a scale names. The folder is made when it is missing.
 * \return false after a line on standard error when a screenshot could not be made.
 */
bool writeAtThisScale(const QVector<GalleryPage> &pages, const GalleryContext &context,
                      const QString &directory, int scale);

/**
 * Runs the program anew with \a arguments for each scale, since a program cannot change its own.
 * \return whether every run succeeded.
 */
bool runAtEveryScale(const QStringList &arguments);

} // namespace GalleryScreenshots
