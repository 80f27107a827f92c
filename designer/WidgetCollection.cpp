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

// A text for the program, which no translator gets to see.
QString plainText(const QString &property)
{
    return QStringLiteral("<stringpropertyspecification name=\"%1\" type=\"singleline\" notr=\"true\"/>")
        .arg(property);
}

QString toolTip(const QString &property, const QString &text)
{
    return QStringLiteral("<tooltip name=\"%1\">%2</tooltip>").arg(property, text.toHtmlEscaped());
}

CustomWidgetInfo menuView()
{
    return {
        QStringLiteral("VelMenuView"),
        QStringLiteral("VelMenuView.h"),
        QStringLiteral(":/veluiextra-designer/icons/menuview.png"),
        QStringLiteral("Tree of a menu directory"),
        QStringLiteral(
            "Shows the start menu, or the directory that the property \"menuDir\" names, in the desktop's "
            "order. With \"editable\" the user can change it, in a preview, too; \"assistance\" switches on "
            "what goes beyond the plain tree."),
        sizeOf(240, 320),
        QStringLiteral("QTreeView"),
        toolTip(QStringLiteral("menuDir"), QStringLiteral("The menu directory; empty for the start menu"))
            + toolTip(QStringLiteral("itemIconSize"),
                      QStringLiteral("The edge of the icons in pixels; -1 leaves it to the style"))
            + plainText(QStringLiteral("menuDir")),
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
                "The boxes under one parent exclude one another. A box that is alone cannot be checked: set "
                "\"checked\" for the last box of the form, or call setChecked() after setupUi()."),
            sizeOf(200, 120)
                + QStringLiteral("<property name=\"title\"><string>RadioGroupBox</string></property>"),
            QStringLiteral("QGroupBox"),
            QString(),
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
            QStringLiteral("QWidget"),
            toolTip(QStringLiteral("type"), QStringLiteral("Application, Link or Directory"))
                + plainText(QStringLiteral("type")),
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
