// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryTextDialog.h"

#include "MarkedTextView.h"

#include <frame/DialogSize.h>

#include <QDialogButtonBox>
#include <QEvent>
#include <QLabel>
#include <QScreen>
#include <QVBoxLayout>

namespace VelUI {

EntryTextDialog::EntryTextDialog(EntryFormHost &form, const QList<QAction *> &history)
    : QDialog(form.form())
    , m_form(form)
    , m_view(new MarkedTextView(this))
    , m_summary(new QLabel(this))
{
    setObjectName(QStringLiteral("entryTextDialog"));
    addActions(history);
    setWindowTitle(tr("Text of the entry"));
    m_view->setObjectName(QStringLiteral("entryText"));
    m_view->setAccessibleName(tr("The file as it would be saved"));
    m_summary->setObjectName(QStringLiteral("changesLabel"));
    m_summary->setTextFormat(Qt::PlainText);
    m_summary->setWordWrap(true);
    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Close, this);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto *layout = new QVBoxLayout(this);
    layout->addWidget(m_view);
    layout->addWidget(m_summary);
    layout->addWidget(buttons);
    DialogSize::restore(*this, QStringLiteral("EntryTextDialog"), QSize(560, 400));
    placeBesideForm();

    // Several signals may tell of one edit.
    m_soon.setSingleShot(true);
    m_soon.setInterval(0);
    connect(&m_soon, &QTimer::timeout, this, &EntryTextDialog::refresh);
    connect(&m_form, &EntryFormHost::recordChanged, &m_soon, QOverload<>::of(&QTimer::start));
    m_form.form()->installEventFilter(this);
    refresh();
}

EntryTextDialog::~EntryTextDialog()
{
    DialogSize::remember(*this, QStringLiteral("EntryTextDialog"));
}

// It goes with the window that the form is in.
bool EntryTextDialog::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == parent() && event->type() == QEvent::Hide && !event->spontaneous())
        reject();
    return QDialog::eventFilter(watched, event);
}

// Who types in the form wants to see both.
void EntryTextDialog::placeBesideForm()
{
    const QRect form = m_form.form()->window()->frameGeometry();
    const QRect available = m_form.form()->screen()->availableGeometry();
    if (form.right() + frameGeometry().width() <= available.right())
        move(form.right() + 1, form.top());
    else if (form.left() - frameGeometry().width() >= available.left())
        move(form.left() - frameGeometry().width(), form.top());
}

void EntryTextDialog::refresh()
{
    const ChangedLines text(QString::fromUtf8(m_form.baseRecord().contents()),
                            QString::fromUtf8(m_form.record().contents()));
    m_view->show(text);
    m_summary->setText(summary(text));
    m_view->setAccessibleDescription(m_summary->text());
}

QString EntryTextDialog::summary(const ChangedLines &text)
{
    const int changed = text.count(ChangedLines::Changed);
    const int added = text.count(ChangedLines::New);
    if (changed + added + text.removed() == 0)
        return tr("Nothing is changed.");
    return tr("\u2260 changed lines: %1, + new lines: %2, removed lines: %3")
        .arg(changed)
        .arg(added)
        .arg(text.removed());
}

} // namespace VelUI
