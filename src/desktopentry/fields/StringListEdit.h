// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "InputFunction.h"
#include "ListLineForm.h"

#include <QStringList>
#include <QWidget>

namespace VelUI {

/// A field that shows a list of strings in one line and edits it in a dialog.
class StringListEdit : public QWidget
{
    Q_OBJECT

public:
    explicit StringListEdit(QWidget *parent = nullptr);

    void setStrings(const QStringList &strings);
    QStringList strings() const;
    /// Empties the list; changed() is not emitted.
    void clear();

    /// Sets the title of the dialog and the texts of its prompts.
    void setTexts(const QString &title, const QString &addTitle, const QString &addLabel,
                  const QString &editTitle, const QString &editLabel);
    /// Sets what asks for an item; null for the plain prompt.
    void setInputFunction(InputFunction function);
    void setReadOnly(bool readOnly);

public Q_SLOTS:
    void editStrings();

Q_SIGNALS:
    void changed();

private:
    bool hasPromptTexts() const;

    ListLineForm m_ui;
    QStringList m_strings;
    QString m_title;
    QString m_addTitle;
    QString m_addLabel;
    QString m_editTitle;
    QString m_editLabel;
    InputFunction m_inputFunction = nullptr;
};

/// The value of the field as a row of a form reads and writes it.
QStringList fieldValue(const StringListEdit *field);
void setFieldValue(StringListEdit *field, const QStringList &value);

} // namespace VelUI
