// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryWindow.h"

#include <QFontDatabase>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QScreen>
#include <QScrollArea>
#include <QScrollBar>
#include <QSplitter>
#include <QStackedWidget>
#include <QStyle>
#include <QVBoxLayout>

namespace {

// The index of the page that a row stands for; headings have none.
constexpr int PageRole = Qt::UserRole;

QListWidgetItem *headingItem(const QString &text, QListWidget *list)
{
    auto *item = new QListWidgetItem(text, list);
    item->setFlags(Qt::NoItemFlags);
    QFont font = list->font();
    font.setBold(true);
    item->setFont(font);
    return item;
}

QScrollArea *scrolled(QWidget *page, QWidget *parent)
{
    auto *area = new QScrollArea(parent);
    area->setFrameShape(QFrame::NoFrame);
    area->setWidgetResizable(true);
    area->setWidget(page);
    area->setMinimumWidth(page->minimumSizeHint().width() + area->verticalScrollBar()->sizeHint().width());
    return area;
}

QLabel *titleLabel(QWidget *parent)
{
    auto *label = new QLabel(parent);
    QFont font = label->font();
    font.setPointSizeF(font.pointSizeF() * 1.4);
    label->setFont(font);
    return label;
}

} // namespace

GalleryWindow::GalleryWindow(const QVector<GalleryPage> &pages, const GalleryContext &context,
                             QWidget *parent)
    : QWidget(parent)
    , m_pages(pages)
    , m_context(context)
{
    setWindowTitle(tr("Widget gallery"));

    m_list = new QListWidget(this);
    m_list->setObjectName(QStringLiteral("pageList"));
    m_list->setAccessibleName(tr("Pages"));
    fillList();

    auto *splitter = new QSplitter(this);
    splitter->setChildrenCollapsible(false);
    splitter->addWidget(m_list);
    splitter->addWidget(buildSide(splitter));
    splitter->setStretchFactor(1, 1);
    const int listWidth = m_list->sizeHintForColumn(0) + 2 * m_list->frameWidth() + 24;
    m_list->setMinimumWidth(listWidth);
    splitter->setSizes({listWidth, 1100 - listWidth});

    auto *layout = new QHBoxLayout(this);
    layout->addWidget(splitter);
    resize(1100, 680);

    connect(m_list, &QListWidget::currentRowChanged, this, &GalleryWindow::showRow);
    if (!m_pages.isEmpty())
        showPage(m_pages.constFirst().name);
}

bool GalleryWindow::showPage(const QString &name)
{
    for (int row = 0; row < m_list->count(); ++row) {
        const QVariant index = m_list->item(row)->data(PageRole);
        if (index.isValid() && m_pages.at(index.toInt()).name == name) {
            m_list->setCurrentRow(row);
            return true;
        }
    }
    return false;
}

void GalleryWindow::fitToScreen()
{
    const QSize frame(0, style()->pixelMetric(QStyle::PM_TitleBarHeight, nullptr, this));
    resize(size().boundedTo(screen()->availableSize() - frame));
}

QWidget *GalleryWindow::currentPage() const
{
    const auto *area = qobject_cast<QScrollArea *>(m_stack->currentWidget());
    return area ? area->widget() : nullptr;
}

void GalleryWindow::fillList()
{
    QString category;
    for (int i = 0; i < m_pages.size(); ++i) {
        const GalleryPage &page = m_pages.at(i);
        if (page.category != category) {
            category = page.category;
            headingItem(category, m_list);
        }
        auto *item = new QListWidgetItem(page.title, m_list);
        item->setData(PageRole, i);
    }
}

QWidget *GalleryWindow::buildSide(QWidget *parent)
{
    auto *side = new QWidget(parent);
    m_title = titleLabel(side);
    m_stack = new QStackedWidget(side);
    m_code = new QPlainTextEdit(side);
    m_code->setObjectName(QStringLiteral("codeView"));
    m_code->setAccessibleName(tr("Code of this page"));
    m_code->setReadOnly(true);
    m_code->setTabChangesFocus(true);
    m_code->setLineWrapMode(QPlainTextEdit::NoWrap);
    m_code->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    // Code reads from the left in every language.
    m_code->setLayoutDirection(Qt::LeftToRight);

    auto *split = new QSplitter(side);
    split->setChildrenCollapsible(false);
    split->addWidget(m_stack);
    split->addWidget(m_code);
    split->setStretchFactor(0, 1);
    split->setStretchFactor(1, 1);
    split->setSizes({450, 450}); // in equal parts

    auto *layout = new QVBoxLayout(side);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_title);
    layout->addWidget(split, 1);
    return side;
}

void GalleryWindow::showRow(int row)
{
    const QListWidgetItem *item = m_list->item(row);
    if (!item || !item->data(PageRole).isValid())
        return;
    const int index = item->data(PageRole).toInt();
    const GalleryPage &page = m_pages.at(index);
    if (!m_frames.contains(index)) {
        QScrollArea *area = scrolled(page.create(m_context, m_stack), m_stack);
        m_stack->addWidget(area);
        m_frames.insert(index, area);
    }
    m_title->setText(page.title);
    m_code->setPlainText(page.snippet);
    m_stack->setCurrentWidget(m_frames.value(index));
}
