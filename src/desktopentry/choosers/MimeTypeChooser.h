// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QStringList>

#include <optional>

class QWidget;

namespace VelUI {

/// Has a user choose MIME types from the shared database.
class MimeTypeChooser
{
    Q_DECLARE_TR_FUNCTIONS(VelUI::MimeTypeChooser)

public:
    /**
     * Shows the types with those of \a current chosen, also the ones that the database does not know.
     *
     * @return what the user chose; nothing when the choice was canceled or \a parent was deleted
     *         meanwhile
     */
    static std::optional<QStringList> choose(QWidget *parent, const QStringList &current);
};

} // namespace VelUI
