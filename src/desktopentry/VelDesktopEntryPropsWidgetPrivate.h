// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "PropsRow.h"

#include <QObject>
#include <QStringList>

#include <vector>

class QCheckBox;
class QComboBox;
class QLineEdit;
class QScrollArea;
class QToolButton;
class VelDesktopEntryPropsWidget;

namespace VelUI {
class ActionListEdit;
class FormLayout;
class IconEdit;
class PathEdit;
class ShowInChoice;
class StringListEdit;
} // namespace VelUI

/// The state of the properties form. A table of rows says what it is made of.
class VelDesktopEntryPropsWidgetPrivate : public QObject
{
    Q_OBJECT

public:
    explicit VelDesktopEntryPropsWidgetPrivate(VelDesktopEntryPropsWidget *widget);
    ~VelDesktopEntryPropsWidgetPrivate() override;

    void setType(const QString &newType, const QStringList &newAllowedTypes);
    void loadFrom(const VelUIDesktopEntry &entry);
    void saveTo(VelUIDesktopEntry *entry) const;
    void setReadOnly(bool on);
    void setShowURLInfoButton(bool on);

    int addTypeRow(const QString &label);
    int addUrlRow(const QString &label);
    int addShowInRows(const QString &label);

    bool eventFilter(QObject *watched, QEvent *event) override;

    VelDesktopEntryPropsWidget *const q;
    QStringList allowedTypes;
    QString type;
    QScrollArea *scrollArea = nullptr;
    QWidget *content = nullptr;
    VelUI::FormLayout *layout = nullptr;
    QComboBox *typeBox = nullptr;
    int typeRow = 0;
    QLineEdit *version = nullptr;
    QLineEdit *name = nullptr;
    QLineEdit *localName = nullptr;
    QLineEdit *genericName = nullptr;
    QLineEdit *localGenericName = nullptr;
    QLineEdit *comment = nullptr;
    QLineEdit *localComment = nullptr;
    QCheckBox *noDisplay = nullptr;
    QCheckBox *hidden = nullptr;
    VelUI::ShowInChoice *showIn = nullptr;
    VelUI::IconEdit *icon = nullptr;
    VelUI::IconEdit *localIcon = nullptr;
    VelUI::PathEdit *exec = nullptr;
    int execRow = 0;
    VelUI::PathEdit *tryExec = nullptr;
    int tryExecRow = 0;
    QLineEdit *path = nullptr;
    int pathRow = 0;
    QCheckBox *terminal = nullptr;
    VelUI::StringListEdit *mimeType = nullptr;
    int mimeTypeRow = 0;
    VelUI::StringListEdit *categories = nullptr;
    int categoriesRow = 0;
    VelUI::StringListEdit *keywords = nullptr;
    int keywordsRow = 0;
    VelUI::StringListEdit *localKeywords = nullptr;
    int localKeywordsRow = 0;
    QCheckBox *startupNotify = nullptr;
    QLineEdit *startupWMClass = nullptr;
    int startupWMClassRow = 0;
    VelUI::ActionListEdit *actions = nullptr;
    int actionsRow = 0;
    QLineEdit *url = nullptr;
    QToolButton *urlInfoButton = nullptr;
    int urlRow = 0;
    bool readOnly = false;
    bool showURLInfoButton = false;
    bool isAskingForType = false;

private:
    static const std::vector<VelUI::PropsRow> &rows();
    static QString typeName(const QString &type);

    void build();
    void addRow(const VelUI::PropsRow &row);
    void setListTexts();
    void connectChanges();
    void keepInView(QWidget *focused);
    void fillTypeBox();
    void selectType();
    void typeChosen(int index);
    bool confirmTypeChange();
    void applyType(const QString &newType);
    bool isShown(VelUI::PropsRow::ShownFor group) const;
    void setRowsShown(VelUI::PropsRow::ShownFor group);
};
