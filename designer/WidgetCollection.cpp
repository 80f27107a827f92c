// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "WidgetCollection.h"

#include "CustomWidget.h"

#include <VelDesktopEntryPropsWidget.h>
#include <VelMenuView.h>
#include <VelRadioGroupBox.h>

namespace {

template <typename Widget>
QWidget *create(QWidget *parent)
{
    return new Widget(parent);
}

QString sizeOf(int width, int height)
{
    return QStringLiteral("<property name=\"geometry\"><rect><x>0</x><y>0</y><width>%1</width>"
                          "<height>%2</height></rect></property>")
        .arg(width)
        .arg(height);
}

CustomWidgetInfo menuView()
{
    return {QStringLiteral("VelMenuView"),
            QStringLiteral("VelMenuView.h"),
            QStringLiteral(":/veluiextra-designer/icons/menuview.png"),
            QStringLiteral("Tree of a menu directory"),
            QStringLiteral(
                "Shows the start menu, or another menu directory, in the desktop's order. A view made in a "
                "form shows the start menu and cannot be edited; construct one in code for the rest."),
            sizeOf(240, 320),
            false,
            create<VelMenuView>};
}

CustomWidgetInfo radioGroupBox()
{
    return {QStringLiteral("VelRadioGroupBox"),
            QStringLiteral("VelRadioGroupBox.h"),
            QStringLiteral(":/veluiextra-designer/icons/radiogroupbox.png"),
            QStringLiteral("Group box whose title is a radio button"),
            QStringLiteral(
                "The boxes under one parent exclude one another. The property \"checked\" set in a form goes "
                "past that exclusivity: set it on one box of a group only, or call setChecked() in code."),
            sizeOf(200, 120)
                + QStringLiteral("<property name=\"title\"><string>RadioGroupBox</string></property>"),
            true,
            create<VelRadioGroupBox>};
}

CustomWidgetInfo entryProperties()
{
    return {QStringLiteral("VelDesktopEntryPropsWidget"),
            QStringLiteral("VelDesktopEntryPropsWidget.h"),
            QStringLiteral(":/veluiextra-designer/icons/entryprops.png"),
            QStringLiteral("Form with every key of a desktop entry"),
            QStringLiteral(
                "Shows and edits a desktop entry record: load it with loadFrom() and write it back with "
                "saveTo() in code. The property \"assistance\" switches on what goes beyond the plain form."),
            sizeOf(420, 400),
            false,
            create<VelDesktopEntryPropsWidget>};
}

} // namespace

WidgetCollection::WidgetCollection(QObject *parent)
    : QObject(parent)
{
    for (const CustomWidgetInfo &info : {menuView(), radioGroupBox(), entryProperties()})
        m_widgets.append(new CustomWidget(info, this));
}

WidgetCollection::~WidgetCollection() = default;

QList<QDesignerCustomWidgetInterface *> WidgetCollection::customWidgets() const
{
    return m_widgets;
}
