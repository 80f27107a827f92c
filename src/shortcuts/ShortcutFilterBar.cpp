// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutFilterBar.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLineEdit>
#include <QPushButton>
#include <QShortcut>
#include <QSignalBlocker>

ShortcutFilterBar::ShortcutFilterBar(QWidget *parent)
    : QWidget(parent)
    , m_edit(new QLineEdit(this))
    , m_pressKeysButton(makeButton("pressKeysButton", tr("Press keys")))
    , m_changedOnlyButton(makeButton("changedOnlyButton", tr("Changed only")))
{
    setObjectName(QStringLiteral("filterBar"));
    m_edit->setObjectName(QStringLiteral("filterEdit"));
    m_edit->setAccessibleName(tr("Filter"));
    m_edit->installEventFilter(this);
    m_pressKeysButton->setToolTip(tr("Shows who has the keys that you press; Escape ends it."));
    m_changedOnlyButton->setToolTip(
        tr("Shows the actions alone whose shortcut is not the default one, or was edited."));

    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_edit, 1);
    layout->addWidget(m_pressKeysButton);
    layout->addWidget(m_changedOnlyButton);
    setPressingKeys(false);
    connectParts();
}

ShortcutFilterBar::~ShortcutFilterBar() = default;

QPushButton *ShortcutFilterBar::makeButton(const char *name, const QString &text)
{
    auto *button = new QPushButton(text, this);
    button->setObjectName(QLatin1String(name));
    button->setCheckable(true);
    button->setAutoDefault(false);
    return button;
}

void ShortcutFilterBar::connectParts()
{
    connect(m_edit, &QLineEdit::textChanged, this, &ShortcutFilterBar::filterChanged);
    connect(m_changedOnlyButton, &QPushButton::toggled, this, &ShortcutFilterBar::filterChanged);
    connect(m_pressKeysButton, &QPushButton::toggled, this, [this](bool isOn) {
        setPressingKeys(isOn);
        if (isOn)
            m_edit->setFocus();
        Q_EMIT filterChanged();
    });
    const auto *find = new QShortcut(QKeySequence(QKeySequence::Find), this);
    connect(find, &QShortcut::activated, this, &ShortcutFilterBar::goToField);
}

void ShortcutFilterBar::addButton(QPushButton *button)
{
    layout()->addWidget(button);
}

ShortcutFilter ShortcutFilterBar::filter() const
{
    ShortcutFilter filter;
    if (m_pressKeysButton->isChecked())
        filter.setKey(m_pressed.keys());
    else
        filter.setText(m_edit->text());
    filter.setChangedOnly(m_changedOnlyButton->isChecked());
    return filter;
}

bool ShortcutFilterBar::stepBack()
{
    if (m_pressKeysButton->isChecked())
        m_pressKeysButton->setChecked(false);
    else if (!m_edit->text().isEmpty())
        m_edit->clear();
    else if (m_changedOnlyButton->isChecked())
        m_changedOnlyButton->setChecked(false);
    else
        return false;
    return true;
}

void ShortcutFilterBar::goToField()
{
    m_pressKeysButton->setChecked(false);
    m_edit->setFocus(Qt::ShortcutFocusReason);
    m_edit->selectAll();
}

// The text that was there comes back afterwards.
void ShortcutFilterBar::setPressingKeys(bool isOn)
{
    const QSignalBlocker blocker(this);
    if (isOn)
        m_text = m_edit->text();
    m_pressed.clear();
    m_edit->setText(isOn ? QString() : m_text);
    m_edit->setReadOnly(isOn);
    m_edit->setClearButtonEnabled(!isOn); // does nothing where one cannot write
    m_edit->setPlaceholderText(isOn ? tr("Press the keys to look for")
                                    : tr("Filter by name, group or shortcut"));
}

bool ShortcutFilterBar::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_edit) {
        if (event->type() == QEvent::FocusIn)
            Q_EMIT entered();
        if (m_pressKeysButton->isChecked() ? watchPressedKey(event) : watchKeys(*event))
            return true;
    }
    return QWidget::eventFilter(watched, event);
}

// Return must not press the dialog's Ok.
bool ShortcutFilterBar::watchKeys(const QEvent &event)
{
    if (event.type() != QEvent::KeyPress)
        return false;
    switch (static_cast<const QKeyEvent &>(event).key()) {
    case Qt::Key_Down:
    case Qt::Key_PageDown:
    case Qt::Key_Return:
    case Qt::Key_Enter:
        Q_EMIT left();
        return true;
    default:
        return false;
    }
}

// All keys are looked for, but those that lead out of the field.
bool ShortcutFilterBar::watchPressedKey(QEvent *event)
{
    const bool isOverride = event->type() == QEvent::ShortcutOverride;
    if (!isOverride && event->type() != QEvent::KeyPress && event->type() != QEvent::KeyRelease)
        return false;
    const auto *key = static_cast<QKeyEvent *>(event);
    const bool isPlain = !(key->modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier));
    if (isPlain && (key->key() == Qt::Key_Tab || key->key() == Qt::Key_Backtab))
        return false;
    event->accept();
    if (isOverride)
        return true;
    if (isPlain && key->key() == Qt::Key_Escape) {
        if (event->type() == QEvent::KeyPress)
            m_pressKeysButton->setChecked(false);
        return true;
    }
    if (m_pressed.take(*key)) {
        m_edit->setText(m_pressed.keys().toString(QKeySequence::NativeText));
    }
    return true;
}
