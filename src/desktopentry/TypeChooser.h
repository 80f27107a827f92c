// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FormRow.h"

#include <QCoreApplication>
#include <QObject>
#include <QStringList>

#include <functional>

class QComboBox;
class QWidget;

namespace VelUI {

class FormLayout;

/// The row in which the type of an entry is shown and chosen, and the question before a change.
class TypeChooser : public QObject
{
    Q_DECLARE_TR_FUNCTIONS(VelDesktopEntryPropsWidgetPrivate)

public:
    /// Appends the row to \a layout; the question belongs to \a form.
    TypeChooser(FormLayout *layout, QWidget *form);
    ~TypeChooser() override;

    /// Sets what happens when the user chose another type and confirmed that.
    void onChosen(std::function<void()> action);

    /// Shows \a type among the \a allowed ones; false when there is nothing to change or the type is
    /// not allowed.
    bool setType(const QString &type, const QStringList &allowed);
    QString type() const;
    /// Whether the type shown is that of the entry: it is not after leaveOpen(), until the user
    /// chooses one, be it the one shown, or setType() sets one.
    bool isDecided() const;
    /// The entry has a type that the form does not know: the one shown is a proposal.
    void leaveOpen();
    QStringList allowedTypes() const;
    void setReadOnly(bool readOnly);
    FormRow row() const;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    static QString typeName(const QString &type);

    void fillBox();
    void showType();
    void boxChanged(int index);
    void itemChosen(int index);
    bool confirmChange();

    FormLayout *const m_layout;
    QWidget *const m_form;
    QComboBox *const m_box;
    const int m_row;
    QString m_type;
    QStringList m_allowedTypes;
    std::function<void()> m_chosen;
    bool m_isAsking = false;
    bool m_isDecided = true;
};

} // namespace VelUI
