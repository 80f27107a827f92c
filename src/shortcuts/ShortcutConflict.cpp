// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutConflict.h"

#include "IShortcutObject.h"
#include "KeySequences.h"
#include "ShortcutsModel.h"
#include "VelKeyServer.h"

bool ShortcutConflict::blocksKey(const QString &globalAction)
{
    const bool isIconAction =
        globalAction.startsWith(QLatin1String("VELWM_")) && globalAction.contains(QLatin1String("_ICON"));
    return !globalAction.isEmpty() && !isIconAction;
}

ShortcutConflict ShortcutConflict::find(const ShortcutsModel &model, const QKeySequence &key)
{
    if (key.isEmpty() || !KeySequences::isKnown(key))
        return {};
    const QString globalAction = VelKeyServer::checkForGlobalShortcut(key);
    if (blocksKey(globalAction))
        return {Global, globalAction};
    if (const IShortcutObject *object = model.hasKeySequence(key))
        return {Local, object->text()};
    return {};
}
