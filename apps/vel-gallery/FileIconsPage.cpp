// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"
#include "SampleFolder.h"

#include <VelMimeTypeIconProvider.h>

#include <QCoreApplication>
#include <QFileSystemModel>
#include <QTreeView>
#include <QVBoxLayout>

namespace {

// A file model with the desktop's icons, on the files of a menu.
class FileIconsPage : public QWidget
{
public:
    explicit FileIconsPage(QWidget *parent)
        : QWidget(parent)
        , m_view(new QTreeView(this))
    {
        m_model.setIconProvider(&m_icons);
        m_model.setFilter(QDir::AllEntries | QDir::NoDotAndDotDot | QDir::Hidden);
        m_view->setModel(&m_model);
        m_view->setRootIndex(m_model.setRootPath(m_files.path()));
        connect(&m_model, &QFileSystemModel::directoryLoaded, m_view, &QTreeView::expandAll);
        m_view->setColumnWidth(0, 240);

        auto *layout = new QVBoxLayout(this);
        layout->addWidget(m_view);
    }

    ~FileIconsPage() override
    {
        delete m_view; // before what it shows
    }

    bool showsRows() const { return m_model.rowCount(m_view->rootIndex()) == 4; }

private:
    const SampleFolder m_files{QStringLiteral("menu")};
    VelMimeTypeIconProvider m_icons; // before the model, which does not own it
    QFileSystemModel m_model;
    QTreeView *const m_view;
};

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
    page.create = [](const GalleryContext &, QWidget *parent) { return new FileIconsPage(parent); };
    page.isReady = [](QWidget *made) { return static_cast<FileIconsPage *>(made)->showsRows(); };
    return page;
}
