// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ListLineForm.h"

#include "ButtonKeys.h"

#include <QCoreApplication>
#include <QEvent>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QToolButton>

#include <climits>

namespace VelUI {

namespace {

// Colors a line that cannot be written in like the window around it, and does so again when the
// user's colors change.
class ReadOnlyLook : public QObject
{
public:
    ReadOnlyLook(QWidget *owner, QLineEdit *line)
        : QObject(line)
        , m_owner(owner)
        , m_line(line)
    {
        owner->installEventFilter(this);
        apply();
    }

    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() == QEvent::PaletteChange || event->type() == QEvent::StyleChange)
            apply();
        return QObject::eventFilter(watched, event);
    }

private:
    void apply()
    {
        QPalette palette = m_owner->palette();
        for (const auto group : {QPalette::Active, QPalette::Inactive, QPalette::Disabled}) {
            palette.setBrush(group, QPalette::Base, palette.brush(group, QPalette::Window));
            palette.setBrush(group, QPalette::Text, palette.brush(group, QPalette::WindowText));
        }
        m_line->setPalette(palette);
    }

    QWidget *const m_owner;
    QLineEdit *const m_line;
};

} // namespace

void ListLineForm::setupUi(QWidget *widget, const Names &names)
{
    if (widget->objectName().isEmpty())
        widget->setObjectName(QLatin1String(names.form));
    widget->resize(571, 32);

    horizontalLayout = new QHBoxLayout(widget);
    horizontalLayout->setObjectName(QStringLiteral("horizontalLayout"));
    horizontalLayout->setContentsMargins(0, 0, 0, 0);

    line = new QLineEdit(widget);
    line->setObjectName(QLatin1String(names.line));
    line->setMaxLength(INT_MAX);
    line->setReadOnly(true);
    horizontalLayout->addWidget(line);

    button = new QToolButton(widget);
    button->setObjectName(QLatin1String(names.button));
    button->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Preferred);
    horizontalLayout->addWidget(button);

    new ReadOnlyLook(widget, line);
    auto *keys = new ButtonKeys(line);
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Enter, Qt::Key_F2})
        keys->add(key, button);
    keys->addTyping(button);

    widget->setFocusProxy(line);
    widget->setWindowTitle(QCoreApplication::translate(names.form, names.windowTitle));
    button->setText(QCoreApplication::translate(names.form, names.buttonText));
    QMetaObject::connectSlotsByName(widget);
}

void ListLineForm::show(const QStringList &items)
{
    line->setText(items.isEmpty() ? QString() : items.join(QLatin1Char(';')) + QLatin1Char(';'));
    line->setCursorPosition(0);
    line->setReadOnly(true);
}

void ListLineForm::setReadOnly(bool readOnly)
{
    button->setVisible(!readOnly);
}

} // namespace VelUI
