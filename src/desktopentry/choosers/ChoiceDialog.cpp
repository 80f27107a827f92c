// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ChoiceDialog.h"

#include "ChoiceFilter.h"
#include "ChoiceSource.h"
#include "ChoiceView.h"

#include <frame/DialogSize.h>

#include <QAccessible>
#include <QCoreApplication>
#include <QDialogButtonBox>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace VelUI {

ChoiceDialog::ChoiceDialog(ChoiceModel::Kind kind, const Texts &texts, QWidget *parent)
    : QDialog(parent)
    , m_model(new ChoiceModel(kind, texts.headers, this))
    , m_filter(new ChoiceFilter(m_model, this))
    , m_sizeGroup(texts.sizeGroup)
{
    setWindowTitle(texts.title);
    build(texts);
    layOut();
    connectParts();
    rowsChanged();
    showCount();
    DialogSize::restore(*this, m_sizeGroup, QSize(680, 460));
}

ChoiceDialog::~ChoiceDialog()
{
    DialogSize::remember(*this, m_sizeGroup);
}

void ChoiceDialog::build(const Texts &texts)
{
    m_filterEdit = new QLineEdit(this);
    m_filterEdit->setObjectName(QStringLiteral("filterEdit"));
    m_filterEdit->setAccessibleName(tr("Filter"));
    m_filterEdit->setPlaceholderText(tr("Type to filter"));
    m_filterEdit->setClearButtonEnabled(true);
    m_filterEdit->installEventFilter(this);

    m_view = new ChoiceView(this);
    m_view->setObjectName(QStringLiteral("choiceView"));
    m_view->setAccessibleName(texts.title);
    m_view->setModel(m_filter);

    m_countLabel = new QLabel(this);
    m_countLabel->setObjectName(QStringLiteral("countLabel"));
    m_countLabel->setVisible(isSeveral());
    m_stateLabel = new QLabel(this);
    m_stateLabel->setObjectName(QStringLiteral("stateLabel"));

    m_buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    m_buttons->setObjectName(QStringLiteral("buttonBox"));
}

void ChoiceDialog::layOut()
{
    auto *line = new QHBoxLayout;
    line->addWidget(m_countLabel);
    line->addStretch();
    line->addWidget(m_stateLabel);
    auto *layout = new QVBoxLayout(this);
    layout->addWidget(m_filterEdit);
    layout->addWidget(m_view);
    layout->addLayout(line);
    layout->addWidget(m_buttons);
}

void ChoiceDialog::connectParts()
{
    connect(m_buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(m_buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(m_filterEdit, &QLineEdit::textChanged, this, &ChoiceDialog::filterChanged);
    connect(m_model, &ChoiceModel::chosenChanged, this, &ChoiceDialog::showCount);
    connect(m_filter, &QAbstractItemModel::rowsInserted, this, &ChoiceDialog::rowsChanged);
    connect(m_filter, &QAbstractItemModel::rowsRemoved, this, &ChoiceDialog::rowsChanged);
    connect(m_view, &ChoiceView::leftUpward, this,
            [this] { m_filterEdit->setFocus(Qt::BacktabFocusReason); });
    connect(m_view, &ChoiceView::typed, this, [this](QKeyEvent *event) {
        m_filterEdit->setFocus(Qt::OtherFocusReason);
        QCoreApplication::sendEvent(m_filterEdit, event);
    });
    if (!isSeveral())
        connect(m_view, &QAbstractItemView::doubleClicked, this, &QDialog::accept);
    connect(&m_reading, &QTimer::timeout, this, &ChoiceDialog::readSome);
}

bool ChoiceDialog::isSeveral() const
{
    return m_model->kind() == ChoiceModel::Kind::Several;
}

void ChoiceDialog::setChosen(const QStringList &values)
{
    m_model->setChosen(values);
    m_filter->invalidate();
    showCount();
}

QStringList ChoiceDialog::chosen() const
{
    if (isSeveral())
        return m_model->chosen().values();
    const QModelIndex current = m_view->currentIndex();
    return current.isValid() ? QStringList(m_model->at(m_filter->modelRow(current)).value) : QStringList();
}

void ChoiceDialog::read(std::unique_ptr<ChoiceSource> source)
{
    m_source = std::move(source);
    m_reading.start(0);
    rowsChanged();
}

void ChoiceDialog::readSome()
{
    if (m_source->read(m_model))
        return;
    m_reading.stop();
    m_source.reset();
    rowsChanged();
}

void ChoiceDialog::filterChanged()
{
    m_filter->setTyped(m_filterEdit->text());
    rowsChanged();
}

void ChoiceDialog::rowsChanged()
{
    // Who types chooses what stands first.
    if (!isSeveral() && !m_view->hasFocus()) {
        m_view->setCurrentIndex(m_filter->index(0, 0));
        m_view->scrollToTop();
    }
    const bool isEmpty = m_filter->rowCount() == 0;
    showState(m_source ? tr("Reading...") : isEmpty ? tr("No match") : QString());
    if (!isSeveral())
        m_buttons->button(QDialogButtonBox::Ok)->setDisabled(isEmpty);
}

void ChoiceDialog::showState(const QString &state)
{
    if (state == m_stateLabel->text())
        return;
    m_stateLabel->setText(state);
    QAccessibleEvent event(m_stateLabel, QAccessible::Alert);
    QAccessible::updateAccessibility(&event);
}

void ChoiceDialog::showCount()
{
    const QString count = tr("%n chosen", nullptr, m_model->chosen().count());
    m_countLabel->setText(count);
    m_view->setAccessibleDescription(isSeveral() ? count : QString());
}

void ChoiceDialog::enterList()
{
    m_view->beginAtFirst();
    m_view->setFocus(Qt::TabFocusReason);
}

bool ChoiceDialog::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_filterEdit && event->type() == QEvent::KeyPress
        && watchFilterKey(static_cast<const QKeyEvent &>(*event)))
        return true;
    return QDialog::eventFilter(watched, event);
}

// Return must not press Ok before anything was checked.
bool ChoiceDialog::watchFilterKey(const QKeyEvent &event)
{
    switch (event.key()) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
        if (!isSeveral())
            return false;
        enterList();
        return true;
    case Qt::Key_Down:
    case Qt::Key_PageDown:
        enterList();
        return true;
    case Qt::Key_Escape:
        if (m_filterEdit->text().isEmpty())
            return false;
        m_filterEdit->clear();
        return true;
    default:
        return false;
    }
}

} // namespace VelUI
