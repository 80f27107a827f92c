// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RadioGroupBoxAccessible.h"

#include <VelRadioGroupBox.h>

namespace {

QAccessibleInterface *create(const QString &className, QObject *object)
{
    // Qt asks for each class that the object derives from, so subclasses come by here as well.
    if (className != QLatin1String("VelRadioGroupBox"))
        return nullptr;
    auto *box = qobject_cast<VelRadioGroupBox *>(object);
    return box ? new RadioGroupBoxAccessible(box) : nullptr; // Qt's cache of interfaces owns it
}

// The title as it is read: "&" only marks the underlined letter, "&&" stands for one "&".
QString withoutMnemonic(const QString &title)
{
    QString plain;
    for (int i = 0; i < title.size(); ++i) {
        if (title.at(i) == QLatin1Char('&') && ++i == title.size())
            break;
        plain += title.at(i);
    }
    return plain;
}

} // namespace

RadioGroupBoxAccessible::RadioGroupBoxAccessible(VelRadioGroupBox *box)
    : QAccessibleWidget(box, QAccessible::RadioButton)
{
}

void RadioGroupBoxAccessible::install(VelRadioGroupBox *box)
{
    static const bool installed = [] {
        QAccessible::installFactory(create);
        return true;
    }();
    Q_UNUSED(installed)
    // Setting the title in the constructor of the base class made and kept one for a QGroupBox.
    QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(box);
    if (interface && interface->role() != QAccessible::RadioButton)
        QAccessible::deleteAccessibleInterface(QAccessible::uniqueId(interface));
}

QString RadioGroupBoxAccessible::text(QAccessible::Text kind) const
{
    if (kind == QAccessible::Name && box()->accessibleName().isEmpty())
        return withoutMnemonic(box()->title());
    return QAccessibleWidget::text(kind);
}

QAccessible::State RadioGroupBoxAccessible::state() const
{
    QAccessible::State state = QAccessibleWidget::state();
    state.checkable = true;
    state.checked = box()->isChecked();
    return state;
}

QStringList RadioGroupBoxAccessible::actionNames() const
{
    QStringList names = QAccessibleWidget::actionNames();
    if (box()->isEnabled())
        names.prepend(pressAction());
    return names;
}

void RadioGroupBoxAccessible::doAction(const QString &actionName)
{
    if (actionName == pressAction() && box()->isEnabled())
        box()->setChecked(true);
    else
        QAccessibleWidget::doAction(actionName);
}

VelRadioGroupBox *RadioGroupBoxAccessible::box() const
{
    return static_cast<VelRadioGroupBox *>(object());
}
