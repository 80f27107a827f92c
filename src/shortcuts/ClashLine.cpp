// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClashLine.h"

#include <frame/QtMajor.h>

#include <QAccessibleWidget>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QStyle>

#include <utility>

namespace {

QAccessibleInterface *create(const QString &className, QObject *object)
{
    if (className != QLatin1String("ClashLine"))
        return nullptr;
    auto *line = qobject_cast<ClashLine *>(object);
    return line ? new QAccessibleWidget(line, QAccessible::AlertMessage) : nullptr; // Qt owns it
}

void installAccessible()
{
    static const bool installed = [] {
        QAccessible::installFactory(create);
        return true;
    }();
    Q_UNUSED(installed)
}

} // namespace

bool ClashLine::Content::operator==(const Content &other) const
{
    return text == other.text && key == other.key && otherName == other.otherName
        && otherText == other.otherText && isSerious == other.isSerious && canTakeOver == other.canTakeOver;
}

ClashLine::ClashLine(Content content, QWidget *parent)
    : QWidget(parent)
    , m_content(std::move(content))
{
    installAccessible();
    setAccessibleName(m_content.text);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);

    auto *icon = new QLabel(this);
    const int size = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    const QStyle::StandardPixmap which =
        m_content.isSerious ? QStyle::SP_MessageBoxWarning : QStyle::SP_MessageBoxInformation;
    const QIcon standardIcon = style()->standardIcon(which, nullptr, this);
    icon->setPixmap(QtMajor::pixmapFor(*this, standardIcon, {size, size}));
    layout->addWidget(icon);

    auto *label = new QLabel(m_content.text, this);
    label->setTextFormat(Qt::PlainText);
    label->setWordWrap(true);
    // Beside the icon, whatever the direction of the text is.
    label->setAlignment((isRightToLeft() ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignAbsolute
                        | Qt::AlignVCenter);
    layout->addWidget(label, 1);
    if (!m_content.otherName.isEmpty())
        addButtons(layout);
}

ClashLine::~ClashLine() = default;

void ClashLine::addButtons(QHBoxLayout *layout)
{
    QPushButton *goTo = addButton(layout, tr("Go to"), tr("Go to action '%1'").arg(m_content.otherText));
    connect(goTo, &QPushButton::clicked, this, [this] { Q_EMIT goToRequested(m_content.otherName); });
    if (!m_content.canTakeOver)
        return;
    QPushButton *takeOver =
        addButton(layout, tr("Take over"),
                  tr("Take over '%1' from action '%2'").arg(m_content.key, m_content.otherText));
    connect(takeOver, &QPushButton::clicked, this, [this] { Q_EMIT takeOverRequested(m_content.otherName); });
}

QPushButton *ClashLine::addButton(QHBoxLayout *layout, const QString &text, const QString &name)
{
    auto *button = new QPushButton(text, this);
    button->setAccessibleName(name);
    layout->addWidget(button);
    m_buttons.append(button);
    return button;
}

void ClashLine::announce()
{
    QAccessibleEvent event(this, QAccessible::Alert);
    QAccessible::updateAccessibility(&event);
}
