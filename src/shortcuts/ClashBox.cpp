// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClashBox.h"

#include <QEvent>
#include <QLabel>
#include <QPushButton>
#include <QScrollBar>
#include <QVBoxLayout>

#include <algorithm>
#include <utility>

namespace {

constexpr int LinesInView = 3;

} // namespace

ClashBox::ClashBox(QWidget *parent)
    : QScrollArea(parent)
{
    setObjectName(QStringLiteral("clashBox"));
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setWidgetResizable(true);

    auto *content = new QWidget;
    m_layout = new QVBoxLayout(content);
    m_layout->setContentsMargins(0, 0, 0, 0);
    m_hint = new QLabel(content);
    m_hint->setTextFormat(Qt::PlainText);
    m_hint->setWordWrap(true);
    m_layout->addWidget(m_hint);
    m_layout->addStretch();
    setWidget(content);
    // The box that it lies in may have a color of its own.
    content->setAutoFillBackground(false);
    viewport()->setAutoFillBackground(false);

    setFocusPolicy(Qt::NoFocus);
    updateHeight();
    connect(verticalScrollBar(), &QScrollBar::rangeChanged, this, &ClashBox::followScrolling);
}

ClashBox::~ClashBox() = default;

void ClashBox::setLines(const QVector<ClashLine::Content> &contents)
{
    const bool isSame = std::equal(
        contents.begin(), contents.end(), m_lines.cbegin(), m_lines.cend(),
        [](const ClashLine::Content &content, const ClashLine *line) { return content == line->content(); });
    if (isSame)
        return;
    QVector<ClashLine *> lines;
    QVector<ClashLine *> newLines;
    for (const ClashLine::Content &content : contents) {
        ClashLine *line = takeLine(content);
        if (!line) {
            line = makeLine(content);
            newLines.append(line);
        }
        m_layout->insertWidget(lines.size(), line);
        lines.append(line);
    }
    const QVector<ClashLine *> oldLines = std::exchange(m_lines, lines);
    m_hint->setVisible(lines.isEmpty());
    for (ClashLine *line : qAsConst(newLines))
        line->show();
    Q_EMIT tabStopsChanged();
    removeLines(oldLines);
    for (ClashLine *line : qAsConst(newLines))
        line->announce();
}

// A line that is there already.
ClashLine *ClashBox::takeLine(const ClashLine::Content &content)
{
    const auto found = std::find_if(m_lines.begin(), m_lines.end(),
                                    [&content](const ClashLine *line) { return content == line->content(); });
    if (found == m_lines.end())
        return nullptr;
    ClashLine *line = *found;
    m_lines.erase(found);
    return line;
}

ClashLine *ClashBox::makeLine(const ClashLine::Content &content)
{
    auto *line = new ClashLine(content, widget());
    connect(line, &ClashLine::goToRequested, this, &ClashBox::goToRequested);
    connect(line, &ClashLine::takeOverRequested, this, &ClashBox::takeOverRequested);
    return line;
}

// One of their buttons may be the one whose click is being handled.
void ClashBox::removeLines(const QVector<ClashLine *> &lines)
{
    const QWidget *focus = window()->focusWidget();
    const bool hadFocus = std::any_of(lines.begin(), lines.end(),
                                      [focus](const ClashLine *line) { return line->isAncestorOf(focus); });
    if (hadFocus)
        moveFocus();
    for (ClashLine *line : lines) {
        m_layout->removeWidget(line);
        line->hide();
        line->deleteLater();
    }
}

void ClashBox::moveFocus()
{
    for (const ClashLine *line : qAsConst(m_lines)) {
        if (!line->buttons().isEmpty()) {
            line->buttons().constFirst()->setFocus();
            return;
        }
    }
    Q_EMIT focusLost();
}

void ClashBox::setHint(const QString &hint)
{
    m_hint->setText(hint);
}

QVector<QWidget *> ClashBox::tabStops()
{
    QVector<QWidget *> stops;
    for (const ClashLine *line : qAsConst(m_lines)) {
        for (QPushButton *button : line->buttons())
            stops.append(button);
    }
    if (focusPolicy() != Qt::NoFocus)
        stops.append(this);
    return stops;
}

void ClashBox::changeEvent(QEvent *event)
{
    QScrollArea::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange)
        updateHeight();
}

void ClashBox::updateHeight()
{
    const QPushButton button(ClashLine::tr("Go to"), this);
    const int height = button.sizeHint().height();
    setFixedHeight(LinesInView * height + (LinesInView - 1) * m_layout->spacing());
}

// Lines without a button could not be scrolled to otherwise.
void ClashBox::followScrolling()
{
    const bool scrolls = verticalScrollBar()->maximum() > 0;
    if (scrolls == (focusPolicy() != Qt::NoFocus))
        return;
    setFocusPolicy(scrolls ? Qt::StrongFocus : Qt::NoFocus);
    const int gap = scrolls ? m_layout->spacing() : 0;
    m_layout->setContentsMargins(isRightToLeft() ? gap : 0, 0, isRightToLeft() ? 0 : gap, 0);
    Q_EMIT tabStopsChanged();
}
