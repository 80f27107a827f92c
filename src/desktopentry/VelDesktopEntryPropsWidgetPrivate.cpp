// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelDesktopEntryPropsWidgetPrivate.h"

#include "ActionListEdit.h"
#include "EntryFormAssistance.h"
#include "UrlRow.h"
#include "fields/FormLayout.h"
#include "fields/IconEdit.h"
#include "fields/PathEdit.h"
#include "fields/ShowInChoice.h"
#include "fields/StringListEdit.h"

#include <VelDesktopEntryPropsWidget.h>

#include <QApplication>
#include <QCheckBox>
#include <QLineEdit>
#include <QScopedValueRollback>
#include <QScrollArea>
#include <QToolButton>
#include <QVBoxLayout>

using namespace VelUI;

namespace {

QScrollArea *makeScrollArea(QWidget *form)
{
    auto *outer = new QVBoxLayout(form);
    outer->setContentsMargins(0, 0, 0, 0);
    auto *area = new QScrollArea(form);
    area->setObjectName(QStringLiteral("scrollArea"));
    area->setWidgetResizable(true);
    area->setFocusPolicy(Qt::NoFocus);
    outer->addWidget(area);
    return area;
}

FormLayout *makeLayout(QScrollArea *area)
{
    auto *content = new QWidget;
    content->setObjectName(QStringLiteral("content"));
    area->setWidget(content);
    auto *layout = new FormLayout(content);
    layout->setObjectName(QStringLiteral("formLayout"));
    return layout;
}

} // namespace

VelDesktopEntryPropsWidgetPrivate::VelDesktopEntryPropsWidgetPrivate(VelDesktopEntryPropsWidget *form)
    : q(form)
    , scrollArea(makeScrollArea(form))
    , layout(makeLayout(scrollArea))
    , typeChooser(layout, form)
    , rows(layout)
    , recordToSave([this] { return loadedAndChanged(); })
    , m_rows(QVector<FormRow>{typeChooser.row()} + rows.formRows())
{
    layout->setRowStretch(layout->rowCount(), 1);
    connectChanges();
    form->setFocusProxy(rows.nameLine());
}

VelDesktopEntryPropsWidgetPrivate::~VelDesktopEntryPropsWidgetPrivate() = default;

VelDesktopEntryPropsWidgetPrivate &VelDesktopEntryPropsWidgetPrivate::of(VelDesktopEntryPropsWidget &form)
{
    return *form.d;
}

void VelDesktopEntryPropsWidgetPrivate::allowAllTypes()
{
    q->setType(EntryTypeRules::Application, {});
}

VelUIDesktopEntry VelDesktopEntryPropsWidgetPrivate::loadedAndChanged() const
{
    VelUIDesktopEntry entry = loaded;
    q->saveTo(&entry);
    return entry;
}

void VelDesktopEntryPropsWidgetPrivate::load(const VelUIDesktopEntry &entry)
{
    const QScopedValueRollback<bool> loading(isLoading, true);
    q->setType(entry.getType(), typeChooser.allowedTypes());
    if (!entry.isValid())
        return;
    if (!EntryTypeRules::choices({}).contains(entry.getType()))
        typeChooser.leaveOpen();
    loaded = entry;
    rows.load(entry, typeChooser.type());
}

// The fields tell of every change, also of those that filling them makes.
void VelDesktopEntryPropsWidgetPrivate::tellChange()
{
    if (isLoading)
        return;
    Q_EMIT q->changed();
    Q_EMIT recordChanged();
}

void VelDesktopEntryPropsWidgetPrivate::tellRecordChange()
{
    if (!isLoading)
        Q_EMIT recordChanged();
}

void VelDesktopEntryPropsWidgetPrivate::connectChanges()
{
    const auto changed = &VelDesktopEntryPropsWidgetPrivate::tellChange;
    const QWidget *const content = scrollArea->widget();
    for (QLineEdit *line : content->findChildren<QLineEdit *>())
        connect(line, &QLineEdit::textEdited, this, changed);
    for (IconEdit *edit : content->findChildren<IconEdit *>())
        connect(edit, &IconEdit::iconChanged, this, changed);
    for (QCheckBox *box : content->findChildren<QCheckBox *>())
        connect(box, &QCheckBox::stateChanged, this, changed);
    for (PathEdit *edit : content->findChildren<PathEdit *>()) {
        connect(edit, &PathEdit::changed, q, &VelDesktopEntryPropsWidget::changed);
        connect(edit, &PathEdit::changed, this, &VelDesktopEntryPropsWidgetPrivate::tellRecordChange);
    }
    for (StringListEdit *edit : content->findChildren<StringListEdit *>())
        connect(edit, &StringListEdit::changed, this, changed);
    for (ActionListEdit *edit : content->findChildren<ActionListEdit *>())
        connect(edit, &ActionListEdit::changed, this, changed);

    typeChooser.onChosen([this] {
        rows.changeTo(typeChooser.type());
        Q_EMIT q->changed();
        Q_EMIT recordChanged();
    });
    connect(rows.showIn(), &ShowInChoice::switched, this, &VelDesktopEntryPropsWidgetPrivate::showInSwitched);
    connect(rows.showIn(), &ShowInChoice::switched, this, &VelDesktopEntryPropsWidgetPrivate::recordChanged);
    connect(rows.urlRow()->infoButton(), &QToolButton::clicked, this,
            [this] { Q_EMIT q->requestedURLInfo(rows.urlRow()->url()); });
    connect(qApp, &QApplication::focusChanged, this,
            [this](QWidget *, QWidget *focused) { keepInView(focused); });
}

void VelDesktopEntryPropsWidgetPrivate::keepInView(QWidget *focused)
{
    // Moving the form under a pressed mouse would make it miss what it clicks.
    if (focused && scrollArea->widget()->isAncestorOf(focused)
        && QApplication::mouseButtons() == Qt::NoButton)
        scrollArea->ensureWidgetVisible(focused);
}
