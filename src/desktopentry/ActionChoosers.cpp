// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionChoosers.h"

#include "ActionPropsDialog.h"
#include "FieldChoosers.h"
#include "FormRow.h"
#include "fields/FormLayout.h"

namespace VelUI {

namespace {

FormRow rowOf(const FormLayout &layout, const QString &key, QWidget *field)
{
    FormRow row;
    row.key = key;
    row.label = field->focusProxy()->accessibleName();
    row.number = layout.rowOf(field);
    row.field = field;
    return row;
}

} // namespace

void ActionChoosers::addTo(ActionPropsDialog *dialog)
{
    auto *layout = dialog->findChild<FormLayout *>();
    layout->spread();
    QVector<FormRow> rows;
    for (const auto &[key, name] :
         {std::make_pair("OnlyShowIn", "onlyShowInEdit"), std::make_pair("NotShowIn", "notShowInEdit"),
          std::make_pair("Exec", "execEdit")})
        rows.append(rowOf(*layout, QLatin1String(key), dialog->findChild<QWidget *>(QLatin1String(name))));
    const auto place = [layout](const FormRow &row, QWidget *button) {
        layout->addBeside(row.number, row.field, button);
    };
    new FieldChoosers(rows, place, dialog);
}

} // namespace VelUI
