// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FieldEdit.h"

#include "ActionListEdit.h"
#include "EditActionsWidget.h"
#include "fields/IconEdit.h"
#include "fields/PathEdit.h"
#include "fields/PlainFields.h"
#include "fields/StringListEdit.h"

#include <QCheckBox>
#include <QLineEdit>

namespace VelUI {

namespace {

// Unlike setText() this is an edit.
void type(QLineEdit *line, const QString &text)
{
    line->selectAll();
    line->insert(text);
}

} // namespace

QVariant FieldEdit::value(const QWidget *field)
{
    if (const auto *line = qobject_cast<const QLineEdit *>(field))
        return fieldValue(line);
    if (const auto *path = qobject_cast<const PathEdit *>(field))
        return fieldValue(path);
    if (const auto *icon = qobject_cast<const IconEdit *>(field))
        return fieldValue(icon);
    if (const auto *list = qobject_cast<const StringListEdit *>(field))
        return fieldValue(list);
    if (const auto *actions = qobject_cast<const ActionListEdit *>(field))
        return QVariant::fromValue(fieldValue(actions));
    if (const auto *box = qobject_cast<const QCheckBox *>(field))
        return fieldValue(box);
    return {};
}

// A QVariant knows not how to compare actions.
bool FieldEdit::areEqual(const QVariant &left, const QVariant &right)
{
    const int type = qMetaTypeId<QList<VelUIDesktopAction>>();
    if (left.userType() == type && right.userType() == type)
        return left.value<QList<VelUIDesktopAction>>() == right.value<QList<VelUIDesktopAction>>();
    return left == right;
}

void FieldEdit::setValue(QWidget *field, const QVariant &value)
{
    if (areEqual(FieldEdit::value(field), value))
        return;
    if (auto *line = qobject_cast<QLineEdit *>(field))
        type(line, value.toString());
    else if (const auto *path = qobject_cast<PathEdit *>(field))
        type(path->findChild<QLineEdit *>(), value.toString());
    else if (auto *icon = qobject_cast<IconEdit *>(field)) {
        icon->setIcon(value.toString());
        Q_EMIT icon->iconChanged(value.toString());
    } else if (auto *list = qobject_cast<StringListEdit *>(field)) {
        list->setStrings(value.toStringList());
        Q_EMIT list->changed();
    } else if (auto *actions = qobject_cast<ActionListEdit *>(field)) {
        actions->setActions(value.value<QList<VelUIDesktopAction>>());
        Q_EMIT actions->changed();
    } else if (auto *box = qobject_cast<QCheckBox *>(field)) {
        box->setChecked(value.toBool());
    }
}

void FieldEdit::show(QWidget *field, const QVariant &value)
{
    if (areEqual(FieldEdit::value(field), value))
        return;
    if (auto *line = qobject_cast<QLineEdit *>(field))
        setFieldValue(line, value.toString());
    else if (auto *path = qobject_cast<PathEdit *>(field))
        setFieldValue(path, value.toString());
    else if (auto *icon = qobject_cast<IconEdit *>(field))
        setFieldValue(icon, value.toString());
    else if (auto *list = qobject_cast<StringListEdit *>(field))
        setFieldValue(list, value.toStringList());
    else if (auto *actions = qobject_cast<ActionListEdit *>(field))
        setFieldValue(actions, value.value<QList<VelUIDesktopAction>>());
    else if (auto *box = qobject_cast<QCheckBox *>(field))
        setFieldValue(box, value.toBool());
}

void FieldEdit::onEdited(QWidget *field, QObject *context, const std::function<void()> &react)
{
    if (const auto *line = qobject_cast<QLineEdit *>(field))
        QObject::connect(line, &QLineEdit::textEdited, context, react);
    for (const QLineEdit *line : field->findChildren<QLineEdit *>())
        QObject::connect(line, &QLineEdit::textEdited, context, react);
    if (const auto *icon = qobject_cast<IconEdit *>(field))
        QObject::connect(icon, &IconEdit::iconChanged, context, react);
    else if (const auto *list = qobject_cast<StringListEdit *>(field))
        QObject::connect(list, &StringListEdit::changed, context, react);
}

void FieldEdit::focus(QWidget *field)
{
    auto *const line = field->focusPolicy() == Qt::NoFocus ? field->findChild<QLineEdit *>() : nullptr;
    (line ? line : field)->setFocus(Qt::OtherFocusReason);
}

} // namespace VelUI
