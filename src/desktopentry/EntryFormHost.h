// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FormRow.h"
#include "Translations.h"

#include <frame/DesktopEntryRecord.h>

#include <QObject>
#include <QVector>

#include <functional>

class QWidget;

namespace VelUI {

class FormLayout;
class ShowInChoice;

/// The properties form as those see it who complete it.
class EntryFormHost : public QObject
{
    Q_OBJECT

public:
    virtual QWidget *form() const = 0;
    virtual FormLayout *formLayout() const = 0;
    /// The rows in the order of the form, also those that the type of the entry hides.
    virtual const QVector<FormRow> &formRows() const = 0;
    /// The entry as it would be saved now.
    virtual VelUIDesktopEntry record() const = 0;
    /// The same without what the fields show.
    virtual VelUIDesktopEntry baseRecord() const = 0;
    /// What is edited in languages that no field shows; tellEdit() after a change.
    virtual Translations &translations() = 0;
    /// Of the file that the entry will be; empty where nobody knows.
    virtual QString filePath() const = 0;
    virtual bool isReadOnly() const = 0;
    virtual QString type() const = 0;
    virtual bool isTypeDecided() const = 0;
    /// Shows the rows of another type; nobody is asked.
    virtual void showType(const QString &type, bool isDecided) = 0;
    virtual ShowInChoice *showInChoice() const = 0;
    /// Tells everybody of an edit by the user.
    virtual void tellEdit() = 0;
    /// Does something to the fields of which tellEdit() then tells.
    virtual void quietly(const std::function<void()> &act) = 0;
    /// Brings new fields into the state that the form is in.
    virtual void applyReadOnly() = 0;

Q_SIGNALS:
    /// The form shows another entry.
    void entryLoaded();
    /// Another type was set, and not by the user.
    void typeSet();
    /// What record() gives may have changed.
    void recordChanged();
};

} // namespace VelUI
