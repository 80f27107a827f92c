// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FieldChoosers.h"

#include "CategoryChooser.h"
#include "ChooserButton.h"
#include "ExecProgram.h"
#include "FieldCodeMenu.h"
#include "FieldEdit.h"
#include "FormRow.h"
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

FieldChoosers::FieldChoosers(const QVector<FormRow> &rows, Place place, QObject *parent)
    : QObject(parent)
    , m_place(std::move(place))
{
    for (const FormRow &row : rows) {
        if (!row.isTranslation())
            addTo(row);
    }
}

void FieldChoosers::addTo(const FormRow &row)
{
    if (row.key == QLatin1String("Exec")) {
        addProgramButton(row, ExecProgram::replaced);
        addFieldCodes(row);
    } else if (row.key == QLatin1String("TryExec")) {
        addProgramButton(row, programAlone);
    } else if (row.key == QLatin1String("MimeType")) {
        addListButton(row, MimeTypeChooser::choose);
    } else if (row.key == QLatin1String("Categories")) {
        addListButton(row, CategoryChooser::choose);
    } else if (row.key == QLatin1String("OnlyShowIn") || row.key == QLatin1String("NotShowIn")) {
        addListButton(row, [title = row.label](QWidget *parent, const QStringList &current) {
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
    // Back from the choice, the form shows what has the keyboard: this, and not where one was before.
    button->setFocusPolicy(Qt::StrongFocus);
    button->setSizePolicy(QSizePolicy::Minimum, QSizePolicy::Fixed); // as wide as those above and below
    m_place(row, button);
    return button;
}

void FieldChoosers::addListButton(const FormRow &row, const ChooseList &choose)
{
    const QPointer<StringListEdit> field = qobject_cast<StringListEdit *>(row.field);
    const auto *button = addButton(row, tr("Choose..."), tr("Chooses from all that are known (Alt+Down)"));
    connect(button, &QToolButton::clicked, this, [field, choose] {
        const auto chosen = choose(field, field->strings());
        if (chosen && field)
            FieldEdit::setValue(field, *chosen);
    });
}

void FieldChoosers::addProgramButton(const FormRow &row, TakeProgram take)
{
    const QPointer<PathEdit> field = qobject_cast<PathEdit *>(row.field);
    const auto *button = addButton(row, tr("Choose..."), tr("Chooses an installed program (Alt+Down)"));
    connect(button, &QToolButton::clicked, this, [field, take] {
        const QString program = ProgramChooser::choose(field);
        if (field && !program.isEmpty())
            FieldEdit::setValue(field, take(field->text(), program));
    });
}

void FieldChoosers::addFieldCodes(const FormRow &row)
{
    auto *button = new ChooserButton(tr("Insert", "button: a field code"), row.field, false);
    button->setObjectName(QStringLiteral("fieldCodeButton"));
    button->setAccessibleName(tr("Insert a field code"));
    button->setToolTip(tr("Inserts a code that stands for the files to open, or for a part of this entry"));
    button->setPopupMode(QToolButton::InstantPopup);
    button->setMenu(new FieldCodeMenu(row.field->findChild<QLineEdit *>(), button));
    m_place(row, button);
}

} // namespace VelUI
