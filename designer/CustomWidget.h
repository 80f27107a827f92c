// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QtUiPlugin/QDesignerCustomWidgetInterface>

/// What Designer shows and writes of one widget class.
struct CustomWidgetInfo
{
    QString className;
    QString header;
    QString icon;
    QString toolTip;
    QString help;
    /// The size and properties of a new widget, as the inside of its <widget> element.
    QString properties;
    /// The class that Designer takes the properties of when the plugin is not there.
    QString base;
    /// What Designer knows of single properties, as the inside of <propertyspecifications>.
    QString hints;
    bool isContainer;
    QWidget *(*create)(QWidget *parent);
};

/// One widget class in Designer's widget box.
class CustomWidget : public QObject, public QDesignerCustomWidgetInterface
{
    Q_OBJECT
    Q_INTERFACES(QDesignerCustomWidgetInterface)

public:
    CustomWidget(const CustomWidgetInfo &info, QObject *parent);
    ~CustomWidget() override;

    QString name() const override;
    QString group() const override;
    QString toolTip() const override;
    QString whatsThis() const override;
    QString includeFile() const override;
    QIcon icon() const override;
    bool isContainer() const override;
    QWidget *createWidget(QWidget *parent) override;
    QString domXml() const override;

private:
    CustomWidgetInfo m_info;
};
