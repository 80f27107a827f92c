// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "InputFunction.h"
#include "ListEditorForm.h"

#include <QStringList>
#include <QWidget>

namespace VelUI {

/// A list of strings that is edited with buttons; the order of the items is the list's.
class EditableListWidget : public QWidget
{
    Q_OBJECT

public:
    explicit EditableListWidget(QWidget *parent = nullptr);

    void setStrings(const QStringList &strings);
    QStringList strings() const;
    /// Makes the string in \a row the only selected one and shows it.
    void select(int row);

    void setTexts(const QString &addTitle, const QString &addLabel, const QString &editTitle,
                  const QString &editLabel);
    /// Sets what asks for an item; null for the plain prompt.
    void setInputFunction(InputFunction function);

public Q_SLOTS:
    void addAction();
    void editAction();
    void deleteActions();
    void upAction();
    void downAction();
    void updateButtonsAvailability();

Q_SIGNALS:
    void changed();

private:
    void moveCurrent(int rows);

    ListEditorForm m_ui;
    QString m_addTitle;
    QString m_addLabel;
    QString m_editTitle;
    QString m_editLabel;
    InputFunction m_inputFunction = askForText;
};

} // namespace VelUI
