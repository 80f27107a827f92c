// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TypeChooser.h"

#include "EntryTypeRules.h"
#include "fields/FormLayout.h"
#include "fields/NamedField.h"

#include <frame/GuardedDialog.h>

#include <QComboBox>
#include <QEvent>
#include <QMessageBox>
#include <QPointer>
#include <QSignalBlocker>

#include <utility>

namespace VelUI {

namespace {

// Under which an item of the box carries its type.
constexpr int TypeRole = Qt::UserRole;

QIcon typeIcon(const QString &type)
{
    if (type == EntryTypeRules::Link)
        return QIcon::fromTheme(QStringLiteral("text-html"));
    if (type == EntryTypeRules::Directory)
        return QIcon::fromTheme(QStringLiteral("folder"));
    return QIcon::fromTheme(QStringLiteral("system-run"));
}

} // namespace

TypeChooser::TypeChooser(FormLayout *layout, QWidget *form)
    : m_layout(layout)
    , m_form(form)
    , m_box(makeField<QComboBox>("typeComboBox", layout->parentWidget()))
    , m_row(layout->addRow(tr("Type"), m_box))
{
    // The wheel scrolls the form; on its way over the box it must not change the type.
    m_box->setFocusPolicy(Qt::StrongFocus);
    // Long names of the types must not make the form wider than its window.
    m_box->setMinimumContentsLength(8);
    m_box->installEventFilter(this);
    connect(m_box, QOverload<int>::of(&QComboBox::currentIndexChanged), this, &TypeChooser::boxChanged);
    connect(m_box, QOverload<int>::of(&QComboBox::activated), this, &TypeChooser::itemChosen);
}

TypeChooser::~TypeChooser()
{
    // Behind the question the box is in the middle of telling of its new item, and must not go
    // with the form; confirmChange() deletes it afterwards.
    if (m_isAsking)
        m_box->setParent(nullptr);
}

void TypeChooser::onChosen(std::function<void()> action)
{
    m_chosen = std::move(action);
}

bool TypeChooser::setType(const QString &type, const QStringList &allowed)
{
    const QStringList choices = EntryTypeRules::choices(allowed);
    if (type.isEmpty() || !choices.contains(type))
        return false;
    m_isDecided = true;
    if (type == m_type && choices == m_allowedTypes)
        return false;
    if (choices != m_allowedTypes) {
        m_allowedTypes = choices;
        fillBox();
    }
    m_type = type;
    showType();
    return true;
}

QString TypeChooser::type() const
{
    return m_type;
}

bool TypeChooser::isDecided() const
{
    return m_isDecided;
}

void TypeChooser::leaveOpen()
{
    m_isDecided = false;
}

QStringList TypeChooser::allowedTypes() const
{
    return m_allowedTypes;
}

void TypeChooser::setReadOnly(bool readOnly)
{
    m_box->setDisabled(readOnly);
}

FormRow TypeChooser::row() const
{
    return {QStringLiteral("Type"), tr("Type"), EntryTypeRules::ShownFor::All, {}, m_row, m_box};
}

bool TypeChooser::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_box && event->type() == QEvent::Wheel && !m_box->hasFocus()) {
        event->ignore();
        return true;
    }
    return QObject::eventFilter(watched, event);
}

QString TypeChooser::typeName(const QString &type)
{
    if (type == EntryTypeRules::Application)
        return tr("Application");
    if (type == EntryTypeRules::Link)
        return tr("Link");
    if (type == EntryTypeRules::Directory)
        return tr("Directory");
    return type;
}

void TypeChooser::fillBox()
{
    const QSignalBlocker blocker(m_box);
    m_box->clear();
    for (const QString &allowed : std::as_const(m_allowedTypes))
        m_box->addItem(typeIcon(allowed), typeName(allowed), allowed);
}

void TypeChooser::showType()
{
    const QSignalBlocker blocker(m_box);
    m_box->setCurrentIndex(m_box->findData(m_type, TypeRole, Qt::MatchFixedString));
    m_layout->setRowVisible(m_row, EntryTypeRules::hasChoice(m_type, m_allowedTypes));
}

void TypeChooser::boxChanged(int index)
{
    const QString chosen = m_box->itemData(index, TypeRole).toString();
    if (chosen.isEmpty() || chosen == m_type)
        return;
    const QPointer<TypeChooser> self(this);
    const bool isConfirmed = confirmChange();
    if (!self)
        return;
    if (isConfirmed) {
        m_type = chosen;
        m_isDecided = true;
    }
    showType();
    if (isConfirmed && m_chosen)
        m_chosen();
}

// Choosing the type that is shown changes nothing in the box.
void TypeChooser::itemChosen(int index)
{
    if (m_isDecided || m_box->itemData(index, TypeRole).toString() != m_type)
        return;
    m_isDecided = true;
    if (m_chosen)
        m_chosen();
}

bool TypeChooser::confirmChange()
{
    // By hand: the ready-made question adds a No button to make No the default.
    GuardedDialog<QMessageBox> question(
        QMessageBox::Question, tr("Attention"),
        tr("Desktop entry type was changed.\nSome field values may be lost...\nContinue?"), QMessageBox::Yes,
        m_form);
    question->setDefaultButton(QMessageBox::No);

    const QPointer<TypeChooser> self(this);
    QComboBox *const orphan = m_isAsking ? nullptr : m_box;
    m_isAsking = true;
    const int answer = question.exec();
    if (self)
        m_isAsking = !orphan;
    else if (orphan)
        orphan->deleteLater();
    return answer == QMessageBox::Yes;
}

} // namespace VelUI
