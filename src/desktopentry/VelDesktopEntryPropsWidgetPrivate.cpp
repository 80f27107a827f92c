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
#include <QRadioButton>
#include <QScopedValueRollback>
#include <QScrollArea>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>

using namespace VelUI;

namespace {

// A line that shows a list is never written in.
bool showsList(const QLineEdit *line)
{
    return qobject_cast<const StringListEdit *>(line->parentWidget())
        || qobject_cast<const ActionListEdit *>(line->parentWidget());
}

template <typename Edit>
void setAllReadOnly(const QWidget *content, bool readOnly)
{
    for (Edit *edit : content->findChildren<Edit *>())
        edit->setReadOnly(readOnly);
}

template <typename Button>
void setAllDisabled(const QWidget *content, bool disabled)
{
    for (Button *button : content->findChildren<Button *>())
        button->setDisabled(disabled);
}

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
    , recordToChange([this] { return loaded; })
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

QWidget *VelDesktopEntryPropsWidgetPrivate::form() const
{
    return q;
}

void VelDesktopEntryPropsWidgetPrivate::allowAllTypes()
{
    q->setType(EntryTypeRules::Application, {});
}

VelUIDesktopEntry VelDesktopEntryPropsWidgetPrivate::loadedAndChanged() const
{
    VelUIDesktopEntry entry = loaded;
    save(&entry);
    return entry;
}

// What another language's row wrote counts before the user's own row, which knows of it.
void VelDesktopEntryPropsWidgetPrivate::save(VelUIDesktopEntry *entry) const
{
    if (typeChooser.isDecided())
        entry->setType(typeChooser.type());
    m_translations.applyTo(entry, [this](const QString &key) {
        return std::any_of(m_rows.begin(), m_rows.end(), [this, &key](const FormRow &row) {
            return row.key == key && EntryTypeRules::isShown(row.shownFor, typeChooser.type());
        });
    });
    rows.save(entry, typeChooser.type());
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
    if (!isCopying)
        m_translations = {};
    rows.load(entry, typeChooser.type());
}

// The fields tell of every change, also of those that filling them makes.
void VelDesktopEntryPropsWidgetPrivate::tellEdit()
{
    if (isLoading)
        return;
    Q_EMIT q->changed();
    tellRecordChange();
}

void VelDesktopEntryPropsWidgetPrivate::showType(const QString &type, bool isDecided)
{
    typeChooser.setType(type, typeChooser.allowedTypes());
    if (!isDecided)
        typeChooser.leaveOpen();
    rows.changeTo(type);
}

void VelDesktopEntryPropsWidgetPrivate::quietly(const std::function<void()> &act)
{
    const QScopedValueRollback<bool> quiet(isLoading, true);
    act();
}

void VelDesktopEntryPropsWidgetPrivate::applyReadOnly()
{
    typeChooser.setReadOnly(readOnly);
    const QWidget *const content = scrollArea->widget();
    for (QLineEdit *line : content->findChildren<QLineEdit *>()) {
        if (!showsList(line))
            line->setReadOnly(readOnly);
    }
    setAllReadOnly<IconEdit>(content, readOnly);
    setAllReadOnly<PathEdit>(content, readOnly);
    setAllReadOnly<StringListEdit>(content, readOnly);
    setAllReadOnly<ActionListEdit>(content, readOnly);
    setAllDisabled<QCheckBox>(content, readOnly);
    setAllDisabled<QRadioButton>(content, readOnly);
}

void VelDesktopEntryPropsWidgetPrivate::tellRecordChange()
{
    if (!isLoading && !isRetyping)
        Q_EMIT recordChanged();
}

void VelDesktopEntryPropsWidgetPrivate::connectChanges()
{
    const auto changed = &VelDesktopEntryPropsWidgetPrivate::tellEdit;
    const QWidget *const content = scrollArea->widget();
    for (QLineEdit *line : content->findChildren<QLineEdit *>()) {
        // Its editor tells of the new record below.
        if (qobject_cast<PathEdit *>(line->parentWidget()))
            connect(line, &QLineEdit::textEdited, q, &VelDesktopEntryPropsWidget::changed);
        else
            connect(line, &QLineEdit::textEdited, this, changed);
    }
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
        {
            // One change, of however many fields.
            const QScopedValueRollback<bool> retyping(isRetyping, true);
            rows.changeTo(typeChooser.type());
        }
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
    if (!focused || !scrollArea->widget()->isAncestorOf(focused)
        || QApplication::mouseButtons() != Qt::NoButton)
        return;
    scrollArea->ensureWidgetVisible(focused);
    // Of a line that takes text that was its cursor only.
    const QRect place(focused->mapTo(scrollArea->widget(), QPoint()), focused->size());
    const QPoint center = place.center();
    scrollArea->ensureVisible(center.x(), center.y(), place.width() / 2 + 1, place.height() / 2 + 1);
}
