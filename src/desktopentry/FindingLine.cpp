// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FindingLine.h"

#include <frame/QtMajor.h>

#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QStyle>

namespace VelUI {

FindingLine::FindingLine(QWidget *parent)
    : QWidget(parent)
    , m_icon(new QLabel(this))
    , m_text(new QLabel(this))
    , m_fixButton(new QPushButton(tr("Fix"), this))
{
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_icon);
    layout->addWidget(m_text, 1);
    layout->addWidget(m_fixButton);
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    m_fixButton->setObjectName(QStringLiteral("fixButton"));
    m_fixButton->setAutoDefault(false);
    connect(m_fixButton, &QPushButton::clicked, this, [this] { Q_EMIT repairRequested(m_repair); });
}

void FindingLine::say(const Said &said)
{
    m_severity = said.finding.severity;
    m_repair = said.finding.repair.value_or(EntryRepair());
    m_text->setObjectName(QLatin1String("check_") + said.key);
    m_text->setText(said.sentence);
    m_fixButton->setVisible(said.canRepair);
    m_fixButton->setToolTip(m_repair.label);
    m_fixButton->setAccessibleName(tr("Fix: %1", "on a button; %1 is what it does").arg(m_repair.label));
    showIcon();
    setAccessibleName(spoken());
    show();
}

QString FindingLine::spoken() const
{
    return tr("%1: %2", "how bad something is, and what it is").arg(severityName(), m_text->text());
}

void FindingLine::changeEvent(QEvent *event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::StyleChange || event->type() == QEvent::PaletteChange)
        showIcon();
}

void FindingLine::showIcon()
{
    static const QStyle::StandardPixmap icons[] = {
        QStyle::SP_MessageBoxInformation, QStyle::SP_MessageBoxWarning, QStyle::SP_MessageBoxCritical};
    const int size = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    const QIcon icon = style()->standardIcon(icons[m_severity], nullptr, this);
    m_icon->setPixmap(QtMajor::pixmapFor(*this, icon, {size, size}));
    m_icon->setAccessibleName(severityName());
    // Beside the icon, whatever the direction of the text is.
    m_text->setAlignment((isRightToLeft() ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignAbsolute
                         | Qt::AlignVCenter);
}

QString FindingLine::severityName() const
{
    switch (m_severity) {
    case EntryFinding::Error:
        return tr("Error");
    case EntryFinding::Warning:
        return tr("Warning");
    default:
        return tr("Hint");
    }
}

} // namespace VelUI
