// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsAssistance.h"

#include "KeyColumn.h"
#include "NoMatchLabel.h"
#include "SchemeMenu.h"
#include "ShortcutFilterBar.h"
#include "ShortcutsTreeView.h"
#include "TreeAssistance.h"

#include <frame/DialogSize.h>

#include <QBoxLayout>
#include <QEvent>
#include <QLineEdit>
#include <QPushButton>
#include <QScreen>
#include <QSettings>

namespace {

constexpr int PreparationDelay = 250; // in milliseconds; shorter than a hand takes to the first key
constexpr int MoreHeight = 120; // for the parts that a plain dialog does not have
constexpr int WindowFrame = 40; // at most, with the title bar

QString settingsGroup()
{
    return QStringLiteral("EditShortcutsDialog");
}

QString keyColumnKey()
{
    return settingsGroup() + QLatin1String("/KeyColumnWidth");
}

// The widgets that the Tab key goes through, in its order.
QVector<QWidget *> tabOrder(QWidget *window)
{
    QVector<QWidget *> widgets;
    for (QWidget *widget = window->nextInFocusChain(); widget != window;
         widget = widget->nextInFocusChain()) {
        if (widget->focusPolicy() & Qt::TabFocus)
            widgets.append(widget);
    }
    return widgets;
}

void putBehind(QWidget *last, const QVector<QWidget *> &widgets)
{
    for (QWidget *widget : widgets) {
        QWidget::setTabOrder(last, widget);
        last = widget;
    }
}

} // namespace

EditShortcutsAssistance::EditShortcutsAssistance(const EditShortcutsForm &form, ShortcutsModel *shortcuts)
    : m_form(form)
    , m_model(shortcuts)
    , m_tree(std::make_unique<TreeAssistance>(form.treeView, shortcuts))
{
    connect(m_tree.get(), &TreeAssistance::keysChanged, this, &EditShortcutsAssistance::keysChanged);
    const QVector<QWidget *> former = tabOrder(dialog());
    addFilterBar();
    addSchemes();
    putBehind(tabOrder(dialog()).constLast(), former);
    restoreSizes();
    dialog()->installEventFilter(this);
}

EditShortcutsAssistance::~EditShortcutsAssistance()
{
    if (dialog()->isVisible())
        rememberSizes();
    qobject_cast<QBoxLayout *>(dialog()->layout())->setStretchFactor(m_form.treeView, 0);
    m_form.treeView->setFilter(ShortcutFilter());
}

QWidget *EditShortcutsAssistance::dialog() const
{
    return m_form.treeView->parentWidget();
}

bool EditShortcutsAssistance::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == dialog() && event->type() == QEvent::Hide && !event->spontaneous())
        rememberSizes();
    return QObject::eventFilter(watched, event);
}

// The screen may have become smaller meanwhile. A dialog that is seen keeps its size.
void EditShortcutsAssistance::restoreSizes()
{
    m_tree->keyColumn()->setChosenWidth(QSettings().value(keyColumnKey()).toInt());
    if (dialog()->isVisible())
        return;
    const QSize available = dialog()->screen()->availableSize();
    const QSize roomy(dialog()->width(),
                      qMin(dialog()->height() + MoreHeight, available.height() - WindowFrame));
    DialogSize::restore(*dialog(), settingsGroup(), roomy);
    dialog()->resize(dialog()->size().boundedTo(available));
}

void EditShortcutsAssistance::rememberSizes() const
{
    if (!dialog()->isMaximized() && !dialog()->isFullScreen())
        DialogSize::remember(*dialog(), settingsGroup());
    QSettings settings;
    const int width = m_tree->keyColumn()->chosenWidth();
    if (settings.value(keyColumnKey()).toInt() != width)
        settings.setValue(keyColumnKey(), width);
}

void EditShortcutsAssistance::addFilterBar()
{
    m_filterBar = std::make_unique<ShortcutFilterBar>(dialog());
    m_noMatchLabel = std::make_unique<NoMatchLabel>(m_form.treeView);
    auto *layout = qobject_cast<QBoxLayout *>(dialog()->layout());
    layout->insertWidget(layout->indexOf(m_form.treeView), m_filterBar.get());
    layout->setStretchFactor(m_form.treeView, 1);
    if (!dialog()->isVisible())
        m_filterBar->filterEdit()->setFocus();

    connect(m_filterBar.get(), &ShortcutFilterBar::filterChanged, this,
            &EditShortcutsAssistance::applyFilter);
    // Not while the dialog opens.
    m_preparation.setSingleShot(true);
    m_preparation.setInterval(PreparationDelay);
    connect(&m_preparation, &QTimer::timeout, m_form.treeView, &ShortcutsTreeView::prepareFilter);
    connect(m_filterBar.get(), &ShortcutFilterBar::entered, &m_preparation, QOverload<>::of(&QTimer::start));
    connect(m_filterBar.get(), &ShortcutFilterBar::left, m_form.treeView, [this] {
        m_form.treeView->selectFirstShortcut();
        m_form.treeView->setFocus();
    });
}

void EditShortcutsAssistance::addSchemes()
{
    auto *button = new QPushButton(tr("Schemes"), m_filterBar.get());
    button->setObjectName(QStringLiteral("schemesButton"));
    button->setAutoDefault(false);
    auto *menu = new SchemeMenu(m_model, button);
    button->setMenu(menu);
    m_filterBar->addButton(button);
    connect(menu, &SchemeMenu::keysChanged, this, &EditShortcutsAssistance::keysChanged);
}

void EditShortcutsAssistance::applyFilter()
{
    const ShortcutFilter filter = m_filterBar->filter();
    if (!filter.isActive())
        m_noMatchLabel->say(QString());
    m_form.treeView->setFilter(filter, [this](int count) { showCount(count); });
}

void EditShortcutsAssistance::showCount(int count)
{
    const QKeySequence key = m_filterBar->filter().key();
    if (count > 0)
        m_noMatchLabel->say(QString());
    else if (key.isEmpty())
        m_noMatchLabel->say(tr("No action matches the filter."));
    else
        m_noMatchLabel->say(tr("No action has the shortcut %1.").arg(key.toString(QKeySequence::NativeText)));
}

bool EditShortcutsAssistance::stepBackFromFilter()
{
    return m_filterBar->stepBack();
}
