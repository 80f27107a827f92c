// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ProgramChooser.h"

#include "ChoiceDialog.h"
#include "ProgramSource.h"

#include <frame/GuardedDialog.h>

namespace VelUI {

QString ProgramChooser::choose(QWidget *parent)
{
    const ChoiceDialog::Texts texts{tr("Choose a program"), ProgramSource::headers(),
                                    QStringLiteral("ProgramChooser")};
    GuardedDialog<ChoiceDialog> dialog(ChoiceModel::Kind::One, texts, parent);
    dialog->read(std::make_unique<ProgramSource>());
    return dialog.run() ? dialog->chosen().value(0) : QString();
}

} // namespace VelUI
