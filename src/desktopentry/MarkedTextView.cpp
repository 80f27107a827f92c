// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MarkedTextView.h"

#include <QFontDatabase>
#include <QPaintEvent>
#include <QPainter>
#include <QScrollBar>
#include <QTextBlock>

namespace VelUI {

// The strip beside the lines.
class MarkedTextView::Margin : public QWidget
{
public:
    explicit Margin(MarkedTextView *view)
        : QWidget(view)
        , m_view(view)
    {
    }

protected:
    void paintEvent(QPaintEvent *event) override { m_view->paintMarks(event); }

private:
    MarkedTextView *const m_view;
};

namespace {

QString markOf(ChangedLines::Kind kind)
{
    switch (kind) {
    case ChangedLines::Changed:
        return QStringLiteral("\u2260"); // not equal
    case ChangedLines::New:
        return QStringLiteral("+");
    case ChangedLines::Same:
        break;
    }
    return {};
}

} // namespace

MarkedTextView::MarkedTextView(QWidget *parent)
    : QPlainTextEdit(parent)
    , m_margin(new Margin(this))
{
    setReadOnly(true);
    setLineWrapMode(QPlainTextEdit::NoWrap);
    setTabChangesFocus(true);
    setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    // Keys and values run from left to right wherever they are read.
    setLayoutDirection(Qt::LeftToRight);
    connect(this, &QPlainTextEdit::updateRequest, m_margin, QOverload<>::of(&QWidget::update));
    arrange();
}

void MarkedTextView::show(const ChangedLines &text)
{
    const QString whole = text.lines().join(QLatin1Char('\n'));
    m_kinds = text.kinds();
    if (whole != toPlainText()) {
        const int down = verticalScrollBar()->value();
        const int right = horizontalScrollBar()->value();
        const int position = textCursor().position();
        setPlainText(whole);
        QTextCursor cursor = textCursor();
        cursor.setPosition(qMin(position, whole.size()));
        setTextCursor(cursor);
        verticalScrollBar()->setValue(down);
        horizontalScrollBar()->setValue(right);
    }
    shade();
    m_margin->update();
}

void MarkedTextView::shade()
{
    QColor color = palette().color(QPalette::Highlight);
    color.setAlphaF(0.25);
    QList<QTextEdit::ExtraSelection> selections;
    for (QTextBlock block = document()->begin(); block.isValid(); block = block.next()) {
        if (m_kinds.value(block.blockNumber(), ChangedLines::Same) == ChangedLines::Same)
            continue;
        QTextEdit::ExtraSelection selection;
        selection.format.setBackground(color);
        selection.format.setProperty(QTextFormat::FullWidthSelection, true);
        selection.cursor = QTextCursor(block);
        selections.append(selection);
    }
    setExtraSelections(selections);
}

void MarkedTextView::paintMarks(QPaintEvent *event)
{
    QPainter painter(m_margin);
    painter.fillRect(event->rect(), palette().brush(QPalette::AlternateBase));
    painter.setPen(palette().color(QPalette::Text));
    painter.setFont(font());
    for (QTextBlock block = firstVisibleBlock(); block.isValid(); block = block.next()) {
        const QRectF place = blockBoundingGeometry(block).translated(contentOffset());
        if (place.top() > event->rect().bottom())
            return;
        const QRectF mark(0, place.top(), m_margin->width(), place.height());
        painter.drawText(mark, Qt::AlignCenter,
                         markOf(m_kinds.value(block.blockNumber(), ChangedLines::Same)));
    }
}

void MarkedTextView::arrange()
{
    const int width = fontMetrics().horizontalAdvance(QLatin1Char('M')) * 2;
    setViewportMargins(width, 0, 0, 0);
    const QRect inside = contentsRect();
    m_margin->setGeometry(inside.left(), inside.top(), width, inside.height());
}

void MarkedTextView::resizeEvent(QResizeEvent *event)
{
    QPlainTextEdit::resizeEvent(event);
    arrange();
}

void MarkedTextView::changeEvent(QEvent *event)
{
    QPlainTextEdit::changeEvent(event);
    if (event->type() == QEvent::FontChange)
        arrange();
    else if (event->type() == QEvent::PaletteChange)
        shade();
}

} // namespace VelUI
