// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "GalleryPage.h"

#include <QHash>
#include <QVector>
#include <QWidget>

class QLabel;
class QListWidget;
class QPlainTextEdit;
class QStackedWidget;

/// The list of pages on one side, the chosen page with its code on the other.
class GalleryWindow : public QWidget
{
    Q_OBJECT

public:
    GalleryWindow(const QVector<GalleryPage> &pages, const GalleryContext &context,
                  QWidget *parent = nullptr);

    /// Shows the page \a name, making it first if need be; false when there is none.
    bool showPage(const QString &name);
    /// Cuts the window to its screen; pictures are taken of the whole one.
    void fitToScreen();
    /// The widget of the page that is shown.
    QWidget *currentPage() const;

private:
    void fillList();
    void showRow(int row);
    QWidget *buildSide(QWidget *parent);

    const QVector<GalleryPage> m_pages;
    const GalleryContext m_context;
    QHash<int, QWidget *> m_frames; // by index in m_pages
    QListWidget *m_list = nullptr;
    QLabel *m_title = nullptr;
    QStackedWidget *m_stack = nullptr;
    QPlainTextEdit *m_code = nullptr;
};
