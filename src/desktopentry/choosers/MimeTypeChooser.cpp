// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MimeTypeChooser.h"

#include "ChoiceDialog.h"
#include "MimeTypeSource.h"

#include <frame/GuardedDialog.h>

namespace VelUI {

std::optional<QStringList> MimeTypeChooser::choose(QWidget *parent, const QStringList &current)
{
    const ChoiceDialog::Texts texts{tr("Choose MIME types"), MimeTypeSource::headers(),
                                    QStringLiteral("MimeTypeChooser")};
    GuardedDialog<ChoiceDialog> dialog(ChoiceModel::Kind::Several, texts, parent);
    dialog->setChosen(current);
    dialog->read(std::make_unique<MimeTypeSource>(current));
    return dialog.run() ? std::make_optional(dialog->chosen()) : std::nullopt;
}

} // namespace VelUI
