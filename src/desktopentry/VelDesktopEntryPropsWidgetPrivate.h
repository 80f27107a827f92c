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

    VelDesktopEntryPropsWidget *const q;
    QScrollArea *const scrollArea;
    VelUI::FormLayout *const layout;
    VelUI::TypeChooser typeChooser;
    VelUI::PropsTable rows;
    bool readOnly = false;

private:
    void connectChanges();
    void keepInView(QWidget *focused);
};
