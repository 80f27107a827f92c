// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutDelegate.h"

#include "IShortcutObject.h"
#include "ShortcutChange.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"
#include "ShownKeys.h"

#include <QAbstractItemView>
#include <QGuiApplication>
#include <QHelpEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QPainterPath>
#include <QTextDocument>
#include <QToolTip>

namespace {

// Before the key of a changed row.
const QString Mark = QStringLiteral("\u2022 ");

const IShortcutObject *objectAt(const QModelIndex &index)
{
    const auto *model = qobject_cast<const ShortcutsModel *>(index.model());
    return model ? ShortcutRows::at(*model, index) : nullptr;
}

bool isChanged(const QModelIndex &index)
{
    const IShortcutObject *object = objectAt(index);
    return object && ShortcutChange::isChanged(*object);
}

// Three quarters of a turn to the left, with an arrow head at its end.
void drawArrow(QPainter *painter, const QRect &rect, const QColor &color)
{
    const qreal size = qMin(rect.width(), rect.height()) * 0.6;
    QRectF circle(0, 0, size, size);
    circle.moveCenter(QRectF(rect).center());
    QPainterPath arc;
    arc.arcMoveTo(circle, -130);
    arc.arcTo(circle, -130, 270);
    const QPointF end = arc.currentPosition();
    const qreal head = size * 0.32;
    painter->save();
    painter->setRenderHint(QPainter::Antialiasing);
    painter->setPen(QPen(color, size / 8));
    painter->drawPath(arc);
    painter->setPen(Qt::NoPen);
    painter->setBrush(color);
    painter->drawPolygon(QPolygonF({end + QPointF(-head, head * 0.2), end + QPointF(head * 0.7, -head),
                                    end + QPointF(head * 0.7, head)}));
    painter->restore();
}

// Names may look like rich text.
QString plain(const QString &text)
{
    return Qt::mightBeRichText(text) ? text.toHtmlEscaped() : text;
}

} // namespace

ShortcutDelegate::ShortcutDelegate(QAbstractItemView *view)
    : QStyledItemDelegate(view)
    , m_view(view)
{
}

ShortcutDelegate::~ShortcutDelegate() = default;

void ShortcutDelegate::initStyleOption(QStyleOptionViewItem *option, const QModelIndex &index) const
{
    QStyledItemDelegate::initStyleOption(option, index);
    const IShortcutObject *object = objectAt(index);
    if (!object)
        return;
    const bool isKey = index.column() == 1;
    if (isKey)
        option->text = ShownKeys::of(*object);
    if (!ShortcutChange::isChanged(*object))
        return;
    option->font.setBold(true);
    option->fontMetrics = QFontMetrics(option->font);
    if (isKey) {
        // The style leaves room for the button, which paint() draws.
        option->text.prepend(Mark);
        option->features |= QStyleOptionViewItem::HasDecoration | QStyleOptionViewItem::HasDisplay;
        option->decorationPosition = QStyleOptionViewItem::Right;
        option->decorationSize = QSize(option->fontMetrics.height(), option->fontMetrics.height());
    }
}

QRect ShortcutDelegate::buttonRect(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    if (index.column() != 1 || !isChanged(index))
        return {};
    QStyleOptionViewItem cell = option;
    initStyleOption(&cell, index);
    return m_view->style()->subElementRect(QStyle::SE_ItemViewItemDecoration, &cell, m_view);
}

// Styles give a decoration a margin, but a row is not to become higher when it gets its button.
QSize ShortcutDelegate::sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    const QSize size = QStyledItemDelegate::sizeHint(option, index);
    if (index.column() != 1)
        return size;
    const QSize name = QStyledItemDelegate::sizeHint(option, index.siblingAtColumn(0));
    return {size.width(), name.height()};
}

void ShortcutDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option,
                             const QModelIndex &index) const
{
    QStyledItemDelegate::paint(painter, option, index);
    const QRect rect = buttonRect(option, index);
    if (rect.isEmpty())
        return;
    const bool isPressed = m_pressed == index && (QGuiApplication::mouseButtons() & Qt::LeftButton);
    const bool isRaised = (option.state & QStyle::State_MouseOver) && !isPressed;
    if (isRaised || isPressed) {
        QStyleOptionToolButton button;
        button.initFrom(m_view);
        button.rect = rect;
        button.state |= QStyle::State_AutoRaise | (isPressed ? QStyle::State_Sunken : QStyle::State_Raised);
        m_view->style()->drawPrimitive(QStyle::PE_PanelButtonTool, &button, painter, m_view);
    }
    const bool isOnHighlight = (option.state & QStyle::State_Selected) && !isRaised && !isPressed;
    drawArrow(painter, rect,
              option.palette.color(isOnHighlight ? QPalette::HighlightedText : QPalette::Text));
}

bool ShortcutDelegate::editorEvent(QEvent *event, QAbstractItemModel *, const QStyleOptionViewItem &option,
                                   const QModelIndex &index)
{
    // A double click is one click: the second one would take back what the first did.
    const bool isPress = event->type() == QEvent::MouseButtonPress;
    if (!isPress && event->type() != QEvent::MouseButtonRelease)
        return false;
    const auto *mouse = static_cast<QMouseEvent *>(event);
    const bool isOnButton =
        mouse->button() == Qt::LeftButton && buttonRect(option, index).contains(mouse->pos());
    const bool isClicked = !isPress && isOnButton && m_pressed == index;
    m_pressed = isPress && isOnButton ? index : QModelIndex();
    if (isClicked)
        Q_EMIT resetRequested(index);
    // With a press the row becomes the current one.
    return isClicked;
}

bool ShortcutDelegate::helpEvent(QHelpEvent *event, QAbstractItemView *view,
                                 const QStyleOptionViewItem &option, const QModelIndex &index)
{
    if (event->type() != QEvent::ToolTip)
        return QStyledItemDelegate::helpEvent(event, view, option, index);
    QToolTip::showText(event->globalPos(), plain(toolTip(event->pos(), option, index)), view->viewport());
    return true;
}

QString ShortcutDelegate::toolTip(QPoint position, const QStyleOptionViewItem &option,
                                  const QModelIndex &index) const
{
    if (buttonRect(option, index).contains(position)) {
        const QString key = ShortcutChange::keyBefore(*objectAt(index)).toString(QKeySequence::PortableText);
        return key.isEmpty() ? tr("Back to no shortcut") : tr("Back to %1").arg(key);
    }
    QStyleOptionViewItem cell = option;
    initStyleOption(&cell, index);
    const QRect text = m_view->style()->subElementRect(QStyle::SE_ItemViewItemText, &cell, m_view);
    const int margin = m_view->style()->pixelMetric(QStyle::PM_FocusFrameHMargin, &cell, m_view) + 1;
    const bool isCut = cell.fontMetrics.horizontalAdvance(cell.text) > text.width() - 2 * margin;
    return isCut ? cell.text : QString();
}
