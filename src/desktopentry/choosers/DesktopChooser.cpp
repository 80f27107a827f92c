// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopChooser.h"

#include "ChoiceDialog.h"

#include <frame/DesktopNames.h>
#include <frame/GuardedDialog.h>

namespace VelUI {

namespace {

// The session's own stand before the others.
enum Group { Session, Other };

QVector<Choice> choices(const QStringList &current, const QString &sessionNote, const QString &unknownNote)
{
    const QStringList registered = DesktopNames::registered();
    const QStringList ofSession = DesktopNames::ofSession();
    QStringList names = ofSession + registered + current;
    names.removeDuplicates();
    QVector<Choice> choices;
    for (const QString &name : qAsConst(names)) {
        const bool isOfSession = ofSession.contains(name);
        Choice choice;
        choice.value = name;
        choice.texts = QStringList{name};
        if (isOfSession)
            choice.texts.append(sessionNote);
        else if (!registered.contains(name))
            choice.texts.append(unknownNote);
        choice.group = isOfSession ? Session : Other;
        choices.append(choice);
    }
    return choices;
}

} // namespace

std::optional<QStringList> DesktopChooser::choose(QWidget *parent, const QString &title,
                                                  const QStringList &current)
{
    const ChoiceDialog::Texts texts{title,
                                    {tr("Desktop environment"), tr("Remark", "title of a column")},
                                    QStringLiteral("DesktopChooser")};
    GuardedDialog<ChoiceDialog> dialog(ChoiceModel::Kind::Several, texts, parent);
    dialog->model()->add(choices(current, tr("This session"), tr("Not registered")));
    dialog->setChosen(current);
    return dialog.run() ? std::make_optional(dialog->chosen()) : std::nullopt;
}

} // namespace VelUI
