// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "PropsTable.h"
#include "TypeChooser.h"

#include <QObject>

class QScrollArea;
class VelDesktopEntryPropsWidget;

namespace VelUI {
class FormLayout;
} // namespace VelUI

/// The parts of the properties form: the type of the entry, and a table of rows below it.
class VelDesktopEntryPropsWidgetPrivate : public QObject
{
    Q_OBJECT

public:
    explicit VelDesktopEntryPropsWidgetPrivate(VelDesktopEntryPropsWidget *form);

    /// The parts of \a form, for the dialog around it.
    static VelDesktopEntryPropsWidgetPrivate &of(VelDesktopEntryPropsWidget &form);

    /// Forgets which types another file had to choose from.
    void allowAllTypes();

    VelDesktopEntryPropsWidget *const q;
    QScrollArea *const scrollArea;
    VelUI::FormLayout *const layout;
    VelUI::TypeChooser typeChooser;
    VelUI::PropsTable rows;
    bool readOnly = false;
    bool isLoading = false;

Q_SIGNALS:
    /// The user chose the other list of desktop environments.
    void showInSwitched();

private:
    void tellChange();
    void connectChanges();
    void keepInView(QWidget *focused);
};
