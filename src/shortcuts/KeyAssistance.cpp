// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyAssistance.h"

#include "ClashBox.h"
#include "ClashLines.h"
#include "IShortcutObject.h"
#include "RowsChangedEvent.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"
#include "ShortcutsTreeView.h"

#include <QApplication>
#include <QEvent>
#include <QGridLayout>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>

namespace {

QGridLayout *gridOf(const EditShortcutsForm &form)
{
    return static_cast<QGridLayout *>(form.groupBox->layout());
}

// The column of the key field that grows, so that the button beside it does not.
constexpr int FieldColumn = 2;

} // namespace

KeyAssistance::KeyAssistance(const EditShortcutsForm &form, ShortcutsModel *shortcuts)
    : m_form(form)
    , m_model(shortcuts)
    , m_rowsListening(shortcuts, this)
{
    addNoneButton();
    addClashBox();
    describeKeyField(tr("Press the keys of the shortcut. Tab leaves the field."));
    m_timer.setSingleShot(true);
    m_timer.setInterval(0);
    connect(&m_timer, &QTimer::timeout, this, &KeyAssistance::update);
    connectForm();
    update();
}

KeyAssistance::~KeyAssistance()
{
    // The focus may be in what goes.
    disconnect(qApp, nullptr, this, nullptr);
    delete m_noneButton;
    delete m_clashBox;
    gridOf(m_form)->setColumnStretch(FieldColumn, 0);
    describeKeyField(QString());
    showNames(QString());
}

void KeyAssistance::addNoneButton()
{
    m_noneButton = new QPushButton(EditShortcutsForm::tr("None"), m_form.groupBox);
    m_noneButton->setObjectName(QStringLiteral("noneButton"));
    gridOf(m_form)->addWidget(m_noneButton, 2, FieldColumn + 1);
    gridOf(m_form)->setColumnStretch(FieldColumn, 1);
    connect(m_noneButton, &QPushButton::clicked, this, &KeyAssistance::noneChosen);
    m_noneButton->show();
}

void KeyAssistance::addClashBox()
{
    m_clashBox = new ClashBox(m_form.groupBox);
    gridOf(m_form)->addWidget(m_clashBox, 3, 0, 1, FieldColumn + 2);
    connect(m_clashBox, &ClashBox::goToRequested, this, &KeyAssistance::goToRequested);
    connect(m_clashBox, &ClashBox::takeOverRequested, this, &KeyAssistance::takeOverRequested);
    connect(m_clashBox, &ClashBox::tabStopsChanged, this, &KeyAssistance::orderTabs);
    connect(m_clashBox, &ClashBox::focusLost, this, [this] { m_form.treeView->setFocus(); });
    m_clashBox->show();
    orderTabs();
}

// What has just come is what the user wants to reach from the field.
void KeyAssistance::orderTabs()
{
    QWidget *last = m_form.keyWidget;
    const QVector<QWidget *> stops = m_clashBox->tabStops();
    for (QWidget *stop : stops) {
        QWidget::setTabOrder(last, stop);
        last = stop;
    }
    QWidget::setTabOrder(last, m_noneButton);
}

void KeyAssistance::describeKeyField(const QString &hint)
{
    m_form.keyWidget->setToolTip(hint);
    m_form.keyWidget->setAccessibleDescription(hint);
}

void KeyAssistance::connectForm()
{
    const auto later = [this] { m_timer.start(); };
    connect(m_form.treeView, &ShortcutsTreeView::currentShortcutChanged, this, later);
    connect(m_form.treeView, &ShortcutsTreeView::currentItemIsNotShortcut, this, later);
    // The key field itself tells of a key only when it is complete.
    if (const auto *line = m_form.keyWidget->findChild<QLineEdit *>())
        connect(line, &QLineEdit::textChanged, this, later);
    if (m_model) {
        connect(m_model, &QAbstractItemModel::dataChanged, this, later);
        connect(m_model, &QObject::destroyed, this, later);
    }
    connect(m_form.customKeyRB, &QRadioButton::clicked, this, &KeyAssistance::enterField);
    // The arrow keys move the focus to the button when they have pressed it.
    const auto followArrows = [this] {
        if (m_form.customKeyRB->isChecked() && m_form.customKeyRB->hasFocus())
            enterField();
    };
    connect(m_form.customKeyRB, &QRadioButton::toggled, this, followArrows, Qt::QueuedConnection);
    connect(qApp, &QApplication::focusChanged, this,
            [this](const QWidget *, const QWidget *now) { followFocus(now); });
}

void KeyAssistance::enterField()
{
    m_form.keyWidget->setFocus();
}

bool KeyAssistance::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == RowsChangedEvent::eventType())
        m_timer.start();
    return QObject::eventFilter(watched, event);
}

void KeyAssistance::followFocus(const QWidget *now)
{
    const bool isInField = now == m_form.keyWidget;
    m_clashBox->setHint(isInField ? m_form.keyWidget->toolTip() : QString());
    if (now && now->window() == m_form.groupBox->window() && !hasFocus())
        Q_EMIT left();
}

bool KeyAssistance::hasFocus() const
{
    const QWidget *focus = QApplication::focusWidget();
    return focus
        && (focus == m_form.keyWidget || focus == m_noneButton || focus == m_clashBox
            || m_clashBox->isAncestorOf(focus));
}

QKeySequence KeyAssistance::key() const
{
    const QKeySequence shown = m_form.keyWidget->keySequence();
    return shown.isEmpty() ? m_form.treeView->currentKeySequence() : shown;
}

void KeyAssistance::update()
{
    const QModelIndex index = m_model ? m_form.treeView->currentIndex() : QModelIndex();
    const IShortcutObject *current = index.isValid() ? ShortcutRows::at(*m_model, index) : nullptr;
    showNames(current ? current->text() : QString());
    m_clashBox->setLines(current ? linesFor(*current) : QVector<ClashLine::Content>());
}

QVector<ClashLine::Content> KeyAssistance::linesFor(const IShortcutObject &current) const
{
    const QWidget *dialog = m_form.groupBox->window();
    const QWidget *window = dialog->parentWidget() ? dialog->parentWidget()->window() : nullptr;
    return ClashLines::of(*m_model, current, key(), window);
}

// What the parts act on; an empty text for nothing.
void KeyAssistance::showNames(const QString &text)
{
    const bool isNone = text.isEmpty();
    if (auto *line = m_form.keyWidget->findChild<QLineEdit *>())
        line->setAccessibleName(isNone ? QString() : tr("Key for action '%1'").arg(text));
    if (m_noneButton)
        m_noneButton->setAccessibleName(isNone ? QString() : tr("None: no key for action '%1'").arg(text));
    if (m_clashBox)
        m_clashBox->setAccessibleName(isNone ? QString()
                                             : tr("What speaks against the key for action '%1'").arg(text));
}
