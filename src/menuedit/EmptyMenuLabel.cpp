// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EmptyMenuLabel.h"

#include "ShownMenu.h"
#include "VelMenuProxyModel.h"

#include <QCoreApplication>
#include <QEvent>
#include <QKeySequence>
#include <QTreeView>

namespace {

// Milliseconds: the rows of a folder come a moment after it.
constexpr int UntilEmpty = 300;

} // namespace

EmptyMenuLabel::EmptyMenuLabel(QTreeView *view, const ShownMenu &menu)
    : QLabel(view->viewport())
    , m_view(view)
    , m_menu(menu)
{
    setObjectName(QStringLiteral("emptyMenuLabel"));
    setTextFormat(Qt::PlainText);
    setText(
        QCoreApplication::translate(
            "VelMenuView",
            "This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.")
            .arg(QKeySequence(QKeySequence::New).toString(QKeySequence::NativeText)));
    setAlignment(Qt::AlignCenter);
    setWordWrap(true);
    setMargin(fontMetrics().height());
    setAttribute(Qt::WA_TransparentForMouseEvents);
    hide();
    view->viewport()->installEventFilter(this);
    m_patience.setSingleShot(true);
    m_patience.setInterval(UntilEmpty);
    connect(&m_patience, &QTimer::timeout, this, [this] { setVisible(isEmpty()); });
    const QAbstractItemModel *rows = &menu.proxy();
    connect(rows, &QAbstractItemModel::rowsInserted, this, &EmptyMenuLabel::look);
    connect(rows, &QAbstractItemModel::rowsRemoved, this, &EmptyMenuLabel::look);
    connect(rows, &QAbstractItemModel::modelReset, this, &EmptyMenuLabel::look);
    connect(rows, &QAbstractItemModel::layoutChanged, this, &EmptyMenuLabel::look);
    look();
}

EmptyMenuLabel::~EmptyMenuLabel() = default;

bool EmptyMenuLabel::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == parentWidget() && event->type() == QEvent::Resize)
        setGeometry(parentWidget()->rect());
    return QLabel::eventFilter(watched, event);
}

// A filter that lets nothing through is told of elsewhere; a directory that is missing, too.
bool EmptyMenuLabel::isEmpty() const
{
    const QModelIndex root = m_view->rootIndex();
    return root.isValid() && !m_menu.proxy().isFiltered() && m_menu.proxy().rowCount(root) == 0;
}

void EmptyMenuLabel::look()
{
    setGeometry(parentWidget()->rect());
    if (!isEmpty())
        hide();
    m_patience.start();
}
