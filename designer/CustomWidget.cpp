// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CustomWidget.h"

#include <QIcon>

CustomWidget::CustomWidget(const CustomWidgetInfo &info, QObject *parent)
    : QObject(parent)
    , m_info(info)
{
}

CustomWidget::~CustomWidget() = default;

QString CustomWidget::name() const
{
    return m_info.className;
}

QString CustomWidget::group() const
{
    return QStringLiteral("veluiextra");
}

QString CustomWidget::toolTip() const
{
    return m_info.toolTip;
}

QString CustomWidget::whatsThis() const
{
    return m_info.help;
}

QString CustomWidget::includeFile() const
{
    return m_info.header;
}

QIcon CustomWidget::icon() const
{
    return QIcon(m_info.icon);
}

bool CustomWidget::isContainer() const
{
    return m_info.isContainer;
}

QWidget *CustomWidget::createWidget(QWidget *parent)
{
    return m_info.create(parent);
}

QString CustomWidget::domXml() const
{
    QString objectName = m_info.className;
    objectName[0] = objectName.at(0).toLower();
    return QStringLiteral("<ui language=\"c++\"><widget class=\"%1\" name=\"%2\">%3</widget>"
                          "<customwidgets><customwidget><class>%1</class><extends>%4</extends>"
                          "<header>%5</header><propertyspecifications>%6</propertyspecifications>"
                          "</customwidget></customwidgets></ui>")
        .arg(m_info.className, objectName, m_info.properties, m_info.base, m_info.header,
             m_info.hints);
}
