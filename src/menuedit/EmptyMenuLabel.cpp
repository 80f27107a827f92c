// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EmptyMenuLabel.h"

#include "ShownMenu.h"
#include "StartMenu.h"
#include "VelMenuProxyModel.h"

#include <QCoreApplication>
#include <QEvent>
#include <QKeySequence>
#include <QTreeView>

namespace {

// Milliseconds: the rows of a folder come a moment after it.
constexpr int UntilEmpty = 300;

// Why it is empty, as far as one can tell, and how to begin.
QString textOf(const QString &directory)
{
    const QString newKey = QKeySequence(QKeySequence::New).toString(QKeySequence::NativeText);
    if (directory != StartMenu::directory())
        return QCoreApplication::translate(
                   "VelMenuView",
                   "This menu is empty. Press %1 for a new entry, or right-click here "
                   "for what else can be added.")
            .arg(newKey);
    // As the menu reads.
    const QString build = QCoreApplication::translate("VelMenuView", "Default menu...");
    return (StartMenu::isAnyApplicationInstalled()
                ? QCoreApplication::translate(
                    "VelMenuView",
                    "This menu is empty. Right-click here and choose '%2' to fill it "
                    "with the applications that are installed, or press %1 for a new "
                    "entry.")
                : QCoreApplication::translate(
                    "VelMenuView",
                    "This menu is empty, because no application was found that is installed. Once there "
                    "is one, right-click here and choose '%2'. Until then, press %1 for an entry of your "
                    "own."))
        .arg(newKey, build);
}

} // namespace

EmptyMenuLabel::EmptyMenuLabel(QTreeView *view, const ShownMenu &menu)
    : QLabel(view->viewport())
    , m_view(view)
    , m_menu(menu)
{
    setObjectName(QStringLiteral("emptyMenuLabel"));
    setTextFormat(Qt::PlainText);
    setAlignment(Qt::AlignCenter);
    setWordWrap(true);
    setMargin(fontMetrics().height());
    setAttribute(Qt::WA_TransparentForMouseEvents);
    hide();
    view->viewport()->installEventFilter(this);
    m_patience.setSingleShot(true);
    m_patience.setInterval(UntilEmpty);
    connect(&m_patience, &QTimer::timeout, this, &EmptyMenuLabel::appear);
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

void EmptyMenuLabel::appear()
{
    if (!isEmpty())
        return;
    setText(textOf(m_menu.directory()));
    show();
}

void EmptyMenuLabel::look()
{
    setGeometry(parentWidget()->rect());
    if (!isEmpty())
        hide();
    m_patience.start();
}
