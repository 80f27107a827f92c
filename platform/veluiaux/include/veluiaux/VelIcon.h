// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/veluiaux_export.h>

#include <QIcon>
#include <QMap>
#include <QPair>
#include <QString>

/**
 * Makes icons of the current icon theme, with small emblems in their corners.
 *
 * An icon made here costs next to nothing until it is shown: the theme, the image file and
 * the emblems are looked up when the icon is painted first, or asked for its sizes, its name
 * or whether it is null. So a model may ask for thousands of them. What was looked up is
 * shared between all icons made of the same parts, and follows a change of the theme.
 *
 * An emblem stands in the corner that is given, in right-to-left layouts too; an emblem that
 * the theme lacks is left out. Pixmaps are made at the pixel ratio of the device.
 *
 * For the GUI thread alone, as pixmaps are.
 *
 * \since 1.0
 */
class VELUIAUX_EXPORT VelIcon
{
public:
    VelIcon() = delete;

    /**
     * The icon \a name overlaid with \a emblems.
     *
     * @param name a name in the icon theme, such a name with the suffix of an image file
     *             ("editor.png"), or the absolute path of an image file
     * @param emblems names of theme icons by the corner they stand in
     * @param fallback taken, with the same emblems, where the theme has no such icon or the
     *                 file is no image
     * @return the icon; null only when \a fallback is null and has to be taken
     */
    static QIcon fromTheme(const QString &name, const QMap<Qt::Corner, QString> &emblems,
                           const QIcon &fallback);

    /**
     * The icon \a name with one emblem.
     *
     * @param name as above
     * @param emblem the corner and the name of the emblem in the theme
     * @param fallback as above
     */
    static QIcon fromTheme(const QString &name, const QPair<Qt::Corner, QString> &emblem,
                           const QIcon &fallback);

    /**
     * A given icon overlaid with emblems.
     *
     * @param icon any icon; it is shared, not changed
     * @param emblems names of theme icons by the corner they stand in
     * @return \a icon itself when there are no emblems; null when \a icon is null
     */
    static QIcon withEmblems(const QIcon &icon, const QMap<Qt::Corner, QString> &emblems);
};
