// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "InputFunction.h"
#include "ListDialogForm.h"

#include <QDialog>
#include <QStringList>

namespace VelUI {

class EditableListWidget;

/// Edits a copy of a list of strings; Ok waits for the first change.
class EditStringsDialog : public QDialog
{
    Q_OBJECT

public:
    explicit EditStringsDialog(const QStringList &strings, QWidget *parent = nullptr);

    QStringList strings() const;
    void setInputFunction(InputFunction function);
    void setTexts(const QString &addTitle, const QString &addLabel, const QString &editTitle,
                  const QString &editLabel);

public Q_SLOTS:
    void setChanged(bool changed);

private:
    void tellOfSemicolons();
    void splitAtSemicolons();

    ListDialogForm m_ui;
    EditableListWidget *m_listWidget;
};

} // namespace VelUI
