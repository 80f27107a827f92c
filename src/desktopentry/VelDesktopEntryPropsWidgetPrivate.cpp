// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelDesktopEntryPropsWidgetPrivate.h"

#include "ActionListEdit.h"
#include "FormLayout.h"
#include "GuardedDialog.h"
#include "IconEdit.h"
#include "LocalisedLabel.h"
#include "MimeTypeInput.h"
#include "NamedField.h"
#include "PathEdit.h"
#include "ShowInChoice.h"
#include "StringListEdit.h"

#include <VelDesktopEntryPropsWidget.h>

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QEvent>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QMessageBox>
#include <QPointer>
#include <QScrollArea>
#include <QSignalBlocker>
#include <QStyle>
#include <QToolButton>
#include <QVBoxLayout>

#include <utility>

using namespace VelUI;
using Form = VelDesktopEntryPropsWidgetPrivate;

namespace {

using Label = PropsRow::Label;
using ShownFor = PropsRow::ShownFor;

const QLatin1String applicationType("Application");
const QLatin1String linkType("Link");
const QLatin1String directoryType("Directory");

bool isListDisplay(const QLineEdit *line)
{
    return qobject_cast<const StringListEdit *>(line->parentWidget())
        || qobject_cast<const ActionListEdit *>(line->parentWidget());
}

QIcon typeIcon(const QString &type)
{
    if (type == linkType)
        return QIcon::fromTheme(QStringLiteral("text-html"));
    if (type == directoryType)
        return QIcon::fromTheme(QStringLiteral("folder"));
    return QIcon::fromTheme(QStringLiteral("system-run"));
}

} // namespace

VelDesktopEntryPropsWidgetPrivate::VelDesktopEntryPropsWidgetPrivate(VelDesktopEntryPropsWidget *widget)
    : QObject(widget)
    , q(widget)
{
    build();
    setType(applicationType, {});
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

    ShowInChoice{onlyShowInButton, onlyShowIn, notShowInButton, notShowIn}.connectUp(this);
    setListTexts();
}

void VelDesktopEntryPropsWidgetPrivate::addRow(const PropsRow &row)
{
    const QString label = tr(row.label);
    const int number = row.add(*this, row.kind == Label::Localised ? localisedLabel(label) : label);
    if (row.kind == Label::Required)
        layout->setRowLabelBold(number);
    if (row.number)
        this->*row.number = number;
}

int VelDesktopEntryPropsWidgetPrivate::addTypeRow(const QString &label)
{
    typeBox = makeField<QComboBox>("typeComboBox", content);
    // The wheel scrolls the form; on its way over the box it must not change the type.
    typeBox->setFocusPolicy(Qt::StrongFocus);
    // Long names of the types must not make the form wider than its window.
    typeBox->setMinimumContentsLength(8);
    typeBox->installEventFilter(this);
    return layout->addRow(label, typeBox);
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

int VelDesktopEntryPropsWidgetPrivate::addShowInRow(const QString &label, QRadioButton **button,
                                                    StringListEdit **list)
{
    *button = new RowRadioButton(label, content);
    *list = new StringListEdit(content);
    const bool first = !notShowInButton;
    (*button)->setObjectName(first ? QStringLiteral("onlyShowInButton") : QStringLiteral("notShowInButton"));
    (*list)->setObjectName(first ? QStringLiteral("onlyShowInEdit") : QStringLiteral("notShowInEdit"));
    return layout->addRow(*button, *list);
}

void VelDesktopEntryPropsWidgetPrivate::setListTexts()
{
    const QString only = tr("Only show in");
    const QString no = tr("Not show in");
    const QString addDesktop = tr("Add desktop environment:");
    const QString editDesktop = tr("Edit desktop environment:");
    onlyShowIn->setTexts(only, only, addDesktop, only, editDesktop);
    notShowIn->setTexts(no, no, addDesktop, no, editDesktop);
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
    connect(onlyShowInButton, &QRadioButton::toggled, this, [this] { showInSwitched = true; });
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

bool VelDesktopEntryPropsWidgetPrivate::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == typeBox && event->type() == QEvent::Wheel && !typeBox->hasFocus()) {
        event->ignore();
        return true;
    }
    return QObject::eventFilter(watched, event);
}

void VelDesktopEntryPropsWidgetPrivate::setType(const QString &newType, const QStringList &newAllowedTypes)
{
    const QStringList allowed =
        newAllowedTypes.isEmpty() ? QStringList{applicationType, linkType, directoryType} : newAllowedTypes;
    if (newType.isEmpty() || !allowed.contains(newType))
        return;
    if (newType == type && allowed == allowedTypes)
        return;
    if (allowed != allowedTypes) {
        allowedTypes = allowed;
        fillTypeBox();
    }
    applyType(newType);
}

QString VelDesktopEntryPropsWidgetPrivate::typeName(const QString &type)
{
    if (type == applicationType)
        return tr("Application");
    if (type == linkType)
        return tr("Link");
    if (type == directoryType)
        return tr("Directory");
    return type;
}

void VelDesktopEntryPropsWidgetPrivate::fillTypeBox()
{
    const QSignalBlocker blocker(typeBox);
    typeBox->clear();
    for (const QString &allowed : std::as_const(allowedTypes))
        typeBox->addItem(typeIcon(allowed), typeName(allowed), allowed);
}

void VelDesktopEntryPropsWidgetPrivate::selectType()
{
    const QSignalBlocker blocker(typeBox);
    typeBox->setCurrentIndex(typeBox->findData(type, Qt::UserRole, Qt::MatchFixedString));
}

void VelDesktopEntryPropsWidgetPrivate::applyType(const QString &newType)
{
    type = newType;
    selectType();
    setRowsShown(ShownFor::Application);
    setRowsShown(ShownFor::Link);
    layout->setRowVisible(typeRow, allowedTypes.size() > 1 || type != directoryType);
    urlInfoButton->setVisible(showURLInfoButton && isShown(ShownFor::Link));
}

bool VelDesktopEntryPropsWidgetPrivate::isShown(ShownFor group) const
{
    switch (group) {
    case ShownFor::Application:
        return type == applicationType;
    case ShownFor::Link:
        return type == linkType;
    case ShownFor::All:
        break;
    }
    return true;
}

void VelDesktopEntryPropsWidgetPrivate::setRowsShown(ShownFor group)
{
    const bool shown = isShown(group);
    for (const PropsRow &row : rows()) {
        if (row.shownFor != group)
            continue;
        if (row.number)
            layout->setRowVisible(this->*row.number, shown);
        else
            row.field(*this)->setVisible(shown);
        if (!shown)
            row.clear(*this);
    }
}

void VelDesktopEntryPropsWidgetPrivate::typeChosen(int index)
{
    const QString chosen = typeBox->itemData(index).toString();
    if (chosen.isEmpty() || chosen == type)
        return;
    const QPointer<Form> alive(this);
    const bool isConfirmed = confirmTypeChange();
    if (!alive)
        return;
    if (!isConfirmed) {
        selectType();
        return;
    }
    applyType(chosen);
    Q_EMIT q->changed();
}

bool VelDesktopEntryPropsWidgetPrivate::confirmTypeChange()
{
    // By hand: the ready-made question adds a No button to make No the default.
    GuardedDialog<QMessageBox> box(
        QMessageBox::Question, tr("Attention"),
        tr("Desktop entry type was changed.\nSome field values may be lost...\nContinue?"), QMessageBox::Yes,
        q);
    box->setDefaultButton(QMessageBox::No);

    const QPointer<Form> alive(this);
    QComboBox *const orphan = isAskingForType ? nullptr : typeBox;
    isAskingForType = true;
    const int answer = box.exec();
    if (alive)
        isAskingForType = !orphan;
    else if (orphan)
        orphan->deleteLater();
    return answer == QMessageBox::Yes;
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

void VelDesktopEntryPropsWidgetPrivate::loadShowIn(const VelUIDesktopEntry &entry)
{
    ShowInChoice{onlyShowInButton, onlyShowIn, notShowInButton, notShowIn}.load(entry.getOnlyShowIn(),
                                                                                entry.getNotShowIn());
    showInSwitched = false;
}

void VelDesktopEntryPropsWidgetPrivate::saveShowIn(VelUIDesktopEntry *entry) const
{
    if (onlyShowInButton->isChecked()) {
        entry->setOnlyShowIn(onlyShowIn->strings());
        entry->setNotShowIn({});
        return;
    }
    // An entry that holds both lists keeps them, unless something else was chosen: here, or
    // in the other entry that the form was filled from.
    const bool keepsBoth = !showInSwitched && !entry->getNotShowIn().isEmpty()
        && onlyShowIn->strings() == entry->getOnlyShowIn();
    entry->setNotShowIn(notShowIn->strings());
    if (!keepsBoth)
        entry->setOnlyShowIn({});
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
    urlInfoButton->setVisible(on && isShown(ShownFor::Link));
}
