// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FieldChoosers.h"

#include "CategoryChooser.h"
#include "ChooserButton.h"
#include "EntryFormAssistance.h"
#include "ExecProgram.h"
#include "FieldCodeMenu.h"
#include "FieldEdit.h"
#include "choosers/DesktopChooser.h"
#include "choosers/MimeTypeChooser.h"
#include "choosers/ProgramChooser.h"
#include "fields/PathEdit.h"
#include "fields/StringListEdit.h"

#include <QLineEdit>
#include <QPointer>

namespace VelUI {

namespace {

// TryExec names the file; nothing is quoted there.
QString programAlone(const QString &, const QString &program)
{
    return program;
}

} // namespace

FieldChoosers::FieldChoosers(EntryFormAssistance *assistance)
    : QObject(assistance)
    , m_assistance(assistance)
{
    addProgramButton(QStringLiteral("Exec"), ExecProgram::replaced);
    addFieldCodes(QStringLiteral("Exec"));
    addProgramButton(QStringLiteral("TryExec"), programAlone);
    addListButton(QStringLiteral("MimeType"), MimeTypeChooser::choose);
    addListButton(QStringLiteral("Categories"), CategoryChooser::choose);
    for (const QString &key : {QStringLiteral("OnlyShowIn"), QStringLiteral("NotShowIn")}) {
        const QString title = m_assistance->row(key)->label;
        addListButton(key, [title](QWidget *parent, const QStringList &current) {
            return DesktopChooser::choose(parent, title, current);
        });
    }
}

QToolButton *FieldChoosers::addButton(const FormRow &row, const QString &text, const QString &tip)
{
    auto *button = new ChooserButton(text, row.field, true);
    button->setObjectName(QStringLiteral("chooseButton_") + row.key);
    button->setAccessibleName(tr("Choose %1", "name of a \"Choose...\" button").arg(row.label));
    button->setToolTip(tip);
    button->setSizePolicy(QSizePolicy::Minimum, QSizePolicy::Fixed); // as wide as those above and below
    m_assistance->addBeside(row, button);
    return button;
}

void FieldChoosers::addListButton(const QString &key, const ChooseList &choose)
{
    const FormRow &row = *m_assistance->row(key);
    const QPointer<StringListEdit> field = qobject_cast<StringListEdit *>(row.field);
    const auto *button = addButton(row, tr("Choose..."), tr("Chooses from all that are known (Alt+Down)"));
    connect(button, &QToolButton::clicked, this, [field, choose] {
        const auto chosen = choose(field, field->strings());
        if (chosen && field)
            FieldEdit::setValue(field, *chosen);
    });
}

void FieldChoosers::addProgramButton(const QString &key, TakeProgram take)
{
    const FormRow &row = *m_assistance->row(key);
    const QPointer<PathEdit> field = qobject_cast<PathEdit *>(row.field);
    const auto *button = addButton(row, tr("Choose..."), tr("Chooses an installed program (Alt+Down)"));
    connect(button, &QToolButton::clicked, this, [field, take] {
        const QString program = ProgramChooser::choose(field);
        if (field && !program.isEmpty())
            FieldEdit::setValue(field, take(field->text(), program));
    });
}

void FieldChoosers::addFieldCodes(const QString &key)
{
    const FormRow &row = *m_assistance->row(key);
    auto *button = new ChooserButton(tr("Insert", "button: a field code"), row.field, false);
    button->setObjectName(QStringLiteral("fieldCodeButton"));
    button->setAccessibleName(tr("Insert a field code"));
    button->setToolTip(tr("Inserts a code that stands for the files to open, or for a part of this entry"));
    button->setPopupMode(QToolButton::InstantPopup);
    button->setMenu(new FieldCodeMenu(row.field->findChild<QLineEdit *>(), button));
    m_assistance->addBeside(row, button);
}

} // namespace VelUI
