// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TrialLine.h"

#include "EntryTypeRules.h"

#include <frame/QtMajor.h>

#include <QAbstractButton>
#include <QAccessible>
#include <QBoxLayout>
#include <QLabel>
#include <QStyle>

namespace VelUI {

TrialLine::TrialLine(EntryFormHost &form, QAbstractButton *button)
    : QWidget(form.form())
    , m_form(form)
    , m_button(button)
    , m_icon(new QLabel(this))
    , m_text(new QLabel(this))
{
    setObjectName(QStringLiteral("trialLine"));
    m_text->setObjectName(QStringLiteral("tryLabel"));
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    m_text->setTextInteractionFlags(Qt::TextSelectableByMouse);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_icon);
    layout->addWidget(m_text, 1);
    hide();
    qobject_cast<QBoxLayout *>(form.form()->layout())->addWidget(this);

    connect(m_button, &QAbstractButton::clicked, this, &TrialLine::press);
    connect(&m_trial, &EntryTrial::finished, this, &TrialLine::tell);
    connect(&m_form, &EntryFormHost::recordChanged, this, [this] {
        if (!m_trial.isRunning())
            hide();
        showState();
    });
    showState();
}

void TrialLine::press()
{
    if (m_trial.isRunning()) {
        m_trial.stop();
        return;
    }
    hide();
    m_trial.start(m_form.record(), m_form.filePath());
    showState();
}

void TrialLine::showState()
{
    const bool isRunning = m_trial.isRunning();
    m_button->setText(isRunning ? tr("Stop", "button: ends the trial of an entry")
                                : tr("T&ry", "button: runs the entry"));
    m_button->setToolTip(isRunning ? tr("Stops the trial")
                                   : tr("Runs the entry as it is now, without saving it"));
    m_button->setEnabled(isRunning || m_form.type() != EntryTypeRules::Directory);
}

void TrialLine::tell(const EntryTrial::Result &result)
{
    const bool isGood = result.outcome == EntryTrial::Result::Ended && result.status == 0;
    const QStyle::StandardPixmap picture =
        isGood ? QStyle::SP_DialogApplyButton : QStyle::SP_MessageBoxWarning;
    const int size = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    const QIcon icon = style()->standardIcon(picture, nullptr, this);
    m_icon->setPixmap(QtMajor::pixmapFor(*this, icon, {size, size}));
    m_text->setText(textOf(result));
    show();
    showState();
    QAccessibleEvent event(m_text, QAccessible::Alert);
    QAccessible::updateAccessibility(&event);
}

QString TrialLine::textOf(const EntryTrial::Result &result)
{
    switch (result.outcome) {
    case EntryTrial::Result::NotStarted:
        return tr("The program vel-open, which runs entries, could not be started: %1").arg(result.error);
    case EntryTrial::Result::Stopped:
        return tr("The trial was stopped.");
    case EntryTrial::Result::Ended:
        break;
    }
    if (result.status == 0 && result.error.isEmpty())
        return tr("The entry was started (exit status 0).");
    if (result.status == 0)
        return tr("The entry was started (exit status 0): %1").arg(result.error);
    if (result.error.isEmpty())
        return tr("The entry could not be started (exit status %1).").arg(result.status);
    return tr("The entry could not be started (exit status %1): %2").arg(result.status).arg(result.error);
}

} // namespace VelUI
