// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"
#include "SampleMenu.h"

#include <VelMimeTypeIconProvider.h>

#include <QCoreApplication>
#include <QFileSystemModel>
#include <QTreeView>
#include <QVBoxLayout>

#include <memory>

namespace {

// What the model needs for as long as the page lives.
struct FileIcons
{
    SampleMenu sample;
    VelMimeTypeIconProvider provider;
    QFileSystemModel model;
};

QWidget *createPage(const GalleryContext &, QWidget *parent)
{
    auto *page = new QWidget(parent);
    auto icons = std::make_shared<FileIcons>();
    icons->model.setIconProvider(&icons->provider);
    icons->model.setFilter(QDir::AllEntries | QDir::NoDotAndDotDot | QDir::Hidden);
    auto *view = new QTreeView(page);
    view->setModel(&icons->model);
    view->setRootIndex(icons->model.setRootPath(icons->sample.path()));
    QObject::connect(&icons->model, &QFileSystemModel::directoryLoaded, view, [view] { view->expandAll(); });
    view->setColumnWidth(0, 240);
    // The view is gone before what it shows.
    QObject::connect(view, &QObject::destroyed, page, [icons] {});

    auto *layout = new QVBoxLayout(page);
    layout->addWidget(view);
    return page;
}

bool showsRows(QWidget *page)
{
    const auto *view = page->findChild<QTreeView *>();
    return view && view->model()->rowCount(view->rootIndex()) == 4;
}

} // namespace

GalleryPage fileIconsPage()
{
    GalleryPage page;
    page.name = QStringLiteral("file-icons");
    page.title = QCoreApplication::translate("FileIconsPage", "File icons");
    page.category = QCoreApplication::translate("FileIconsPage", "Models");
    page.snippet = QStringLiteral(R"(// The model does not own its icon provider.
VelMimeTypeIconProvider icons;

QFileSystemModel model;
model.setIconProvider(&icons);
view->setModel(&model);
view->setRootIndex(model.setRootPath(directory));)");
    page.create = createPage;
    page.isReady = showsRows;
    return page;
}
