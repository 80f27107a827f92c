// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QStringList>

#include <optional>

class QWidget;

namespace VelUI {

/// Has a user choose desktop environments, of which the one of this session is marked.
class DesktopChooser
{
    Q_DECLARE_TR_FUNCTIONS(VelUI::DesktopChooser)

public:
    /**
     * Shows the desktop environments with those of \a current chosen, also unknown ones.
     *
     * @param title of the dialog: what the choice is for
     * @return what the user chose; nothing when the choice was canceled or \a parent was deleted
     *         meanwhile
     */
    static std::optional<QStringList> choose(QWidget *parent, const QString &title,
                                             const QStringList &current);
};

} // namespace VelUI
