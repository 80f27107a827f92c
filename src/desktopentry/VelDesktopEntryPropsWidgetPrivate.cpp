// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelDesktopEntryPropsWidgetPrivate.h"

#include "ActionListEdit.h"
#include "fields/FormLayout.h"
#include "fields/IconEdit.h"
#include "fields/LocalizedLabel.h"
#include "fields/MimeTypeInput.h"
#include "fields/NamedField.h"
#include "fields/PathEdit.h"
#include "fields/ShowInChoice.h"
#include "fields/StringListEdit.h"

#include <VelDesktopEntryPropsWidget.h>

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QRadioButton>
#include <QScrollArea>
#include <QStyle>
#include <QToolButton>
#include <QVBoxLayout>

using namespace VelUI;
using Form = VelDesktopEntryPropsWidgetPrivate;

namespace {

using Label = PropsRow::Label;
using ShownFor = PropsRow::ShownFor;

bool isListDisplay(const QLineEdit *line)
{
    return qobject_cast<const StringListEdit *>(line->parentWidget())
        || qobject_cast<const ActionListEdit *>(line->parentWidget());
}

} // namespace

VelDesktopEntryPropsWidgetPrivate::VelDesktopEntryPropsWidgetPrivate(VelDesktopEntryPropsWidget *widget)
    : QObject(widget)
    , q(widget)
{
    build();
    setType(QStringLiteral("Application"), {});
    connectChanges();
}

VelDesktopEntryPropsWidgetPrivate::~VelDesktopEntryPropsWidgetPrivate()
{
    // Behind the question the combo box is in the middle of telling of its new item, and must
    // not go with the form; confirmTypeChange() deletes it afterwards.
    if (isAskingForType)
        typeBox->setParent(nullptr);
}

void VelDesktopEntryPropsWidgetPrivate::build()
{
    auto *outer = new QVBoxLayout(q);
    outer->setContentsMargins(0, 0, 0, 0);
    scrollArea = new QScrollArea(q);
    scrollArea->setObjectName(QStringLiteral("scrollArea"));
    scrollArea->setWidgetResizable(true);
    scrollArea->setFocusPolicy(Qt::NoFocus);
    outer->addWidget(scrollArea);
    content = new QWidget;
    content->setObjectName(QStringLiteral("content"));
    scrollArea->setWidget(content);
    layout = new FormLayout(content);
    layout->setObjectName(QStringLiteral("formLayout"));

    for (const PropsRow &row : rows())
        addRow(row);
    layout->setRowStretch(layout->rowCount(), 1);

    setListTexts();
}

void VelDesktopEntryPropsWidgetPrivate::addRow(const PropsRow &row)
{
    const QString label = tr(row.label);
    const int number = row.add(*this, row.kind == Label::Localized ? localizedLabel(label) : label);
    if (row.kind == Label::Required)
        layout->setRowLabelBold(number);
    if (row.number)
        this->*row.number = number;
}

int VelDesktopEntryPropsWidgetPrivate::addUrlRow(const QString &label)
{
    url = makeField<QLineEdit>("urlEdit", content);
    urlInfoButton = makeField<QToolButton>("urlInfoButton", content);
    urlInfoButton->setIcon(QIcon::fromTheme(QStringLiteral("document-properties"),
                                            q->style()->standardIcon(QStyle::SP_FileDialogInfoView)));
    urlInfoButton->setToolTip(tr("Information about the URL"));
    urlInfoButton->setAccessibleName(urlInfoButton->toolTip());
    urlInfoButton->hide();

    auto *line = new QHBoxLayout;
    line->setContentsMargins(0, 0, 0, 0);
    line->addWidget(url);
    line->addWidget(urlInfoButton);
    return layout->addRow(label, line);
}

int VelDesktopEntryPropsWidgetPrivate::addShowInRows(const QString &label)
{
    const int first = layout->rowCount();
    showIn = new ShowInChoice(
        {label, tr("Not show in"), tr("Add desktop environment:"), tr("Edit desktop environment:")}, layout);
    return first;
}

void VelDesktopEntryPropsWidgetPrivate::setListTexts()
{
    const QString mimeLabel = tr("MIME type or file name extension:");
    mimeType->setTexts(tr("MIME type"), tr("Add MIME type"), mimeLabel, tr("Edit MIME type"), mimeLabel);
    mimeType->setInputFunction(askForMimeType);
    categories->setTexts(tr("Categories"), tr("Add category"), tr("Category:"), tr("Edit category"),
                         tr("Category:"));
    for (StringListEdit *list : {keywords, localKeywords})
        list->setTexts(tr("Keywords"), tr("Add keyword"), tr("Keyword:"), tr("Edit keyword"), tr("Keyword:"));
    actions->setTexts(tr("Actions"), tr("Add action"), tr("Edit action"));
}

void VelDesktopEntryPropsWidgetPrivate::connectChanges()
{
    const auto changed = &VelDesktopEntryPropsWidget::changed;
    for (QLineEdit *line : content->findChildren<QLineEdit *>())
        connect(line, &QLineEdit::textEdited, q, changed);
    for (IconEdit *edit : content->findChildren<IconEdit *>())
        connect(edit, &IconEdit::iconChanged, q, changed);
    for (QCheckBox *box : content->findChildren<QCheckBox *>())
        connect(box, &QCheckBox::stateChanged, q, changed);
    for (PathEdit *edit : content->findChildren<PathEdit *>())
        connect(edit, &PathEdit::changed, q, changed);
    for (StringListEdit *edit : content->findChildren<StringListEdit *>())
        connect(edit, &StringListEdit::changed, q, changed);
    connect(actions, &ActionListEdit::changed, q, changed);

    connect(typeBox, QOverload<int>::of(&QComboBox::currentIndexChanged), this, &Form::typeChosen);
    connect(urlInfoButton, &QToolButton::clicked, q, [this] { Q_EMIT q->requestedURLInfo(url->text()); });
    connect(qApp, &QApplication::focusChanged, this,
            [this](QWidget *, QWidget *focused) { keepInView(focused); });
}

void VelDesktopEntryPropsWidgetPrivate::keepInView(QWidget *focused)
{
    // Moving the form under a pressed mouse would make it miss what it clicks.
    if (focused && content->isAncestorOf(focused) && QApplication::mouseButtons() == Qt::NoButton)
        scrollArea->ensureWidgetVisible(focused);
}

void VelDesktopEntryPropsWidgetPrivate::loadFrom(const VelUIDesktopEntry &entry)
{
    setType(entry.getType(), allowedTypes);
    if (!entry.isValid())
        return;
    for (const PropsRow &row : rows()) {
        if (row.load && isShown(row.shownFor))
            row.load(*this, entry);
    }
}

void VelDesktopEntryPropsWidgetPrivate::saveTo(VelUIDesktopEntry *entry) const
{
    if (!entry)
        return;
    for (const PropsRow &row : rows()) {
        if (row.save && isShown(row.shownFor))
            row.save(*this, entry);
    }
}

void VelDesktopEntryPropsWidgetPrivate::setReadOnly(bool on)
{
    if (on == readOnly)
        return;
    readOnly = on;
    typeBox->setDisabled(on);
    for (QLineEdit *line : content->findChildren<QLineEdit *>()) {
        if (!isListDisplay(line))
            line->setReadOnly(on);
    }
    for (IconEdit *edit : content->findChildren<IconEdit *>())
        edit->setReadOnly(on);
    for (PathEdit *edit : content->findChildren<PathEdit *>())
        edit->setReadOnly(on);
    for (StringListEdit *edit : content->findChildren<StringListEdit *>())
        edit->setReadOnly(on);
    actions->setReadOnly(on);
    for (QCheckBox *box : content->findChildren<QCheckBox *>())
        box->setDisabled(on);
    for (QRadioButton *button : content->findChildren<QRadioButton *>())
        button->setDisabled(on);
}

void VelDesktopEntryPropsWidgetPrivate::setShowURLInfoButton(bool on)
{
    if (on == showURLInfoButton)
        return;
    showURLInfoButton = on;
    urlInfoButton->setVisible(on && isShown(ShownFor::Links));
}
