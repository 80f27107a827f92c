// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"
#include "SampleMenu.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelMenuDialog.h>
#include <VelMenuView.h>

#include <QAction>
#include <QCoreApplication>
#include <QLabel>
#include <QPushButton>
#include <QToolBar>
#include <QVBoxLayout>

#include <memory>

namespace {

QString text(const char *source)
{
    return QCoreApplication::translate("MenuPages", source);
}

QLabel *plainLabel(QWidget *parent)
{
    auto *label = new QLabel(parent);
    label->setTextFormat(Qt::PlainText);
    label->setWordWrap(true);
    label->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    return label;
}

// The page that shows a sample keeps it as long as it lives itself.
template <typename Widget>
std::shared_ptr<SampleMenu> keepSample(Widget *page)
{
    auto sample = std::make_shared<SampleMenu>();
    QObject::connect(page, &QObject::destroyed, page, [sample] {});
    return sample;
}

QWidget *createViewPage(const GalleryContext &, QWidget *parent)
{
    auto *page = new QWidget(parent);
    const auto sample = keepSample(page);
    auto *view = new VelMenuView(sample->path(), -1, true, page);
    auto *path = plainLabel(page);
    QObject::connect(view, &VelMenuView::selectionChanged, path, &QLabel::setText);

    auto *toolBar = new QToolBar(page);
    for (QAction *action : view->actions()) {
        if (!action->icon().isNull())
            toolBar->addAction(action);
    }
    auto *layout = new QVBoxLayout(page);
    layout->addWidget(toolBar);
    layout->addWidget(view, 1);
    layout->addWidget(path);
    return page;
}

bool showsRows(QWidget *page)
{
    const auto *view = page->findChild<VelMenuView *>();
    return view && view->model()->rowCount(view->rootIndex()) == 3;
}

QWidget *createDialogsPage(const GalleryContext &, QWidget *parent)
{
    auto *page = new QWidget(parent);
    const auto sample = keepSample(page);
    auto *pick = new QPushButton(text(QT_TRANSLATE_NOOP("MenuPages", "&Pick an entry...")), page);
    auto *edit = new QPushButton(text(QT_TRANSLATE_NOOP("MenuPages", "Edit the &menu...")), page);
    auto *entry = new QPushButton(text(QT_TRANSLATE_NOOP("MenuPages", "Edit an e&ntry...")), page);
    auto *result = plainLabel(page);

    QObject::connect(pick, &QPushButton::clicked, page, [page, sample, result] {
        VelMenuDialog dialog(sample->path(), -1, false, false, page);
        if (dialog.exec() == QDialog::Accepted)
            result->setText(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr));
    });
    QObject::connect(edit, &QPushButton::clicked, page, [page, sample] {
        VelMenuDialog dialog(sample->path(), -1, true, true, page);
        dialog.exec();
    });
    QObject::connect(entry, &QPushButton::clicked, page, [page, sample] {
        VelDesktopEntryEditDialog dialog(page);
        if (dialog.setDesktopEntryPath(sample->entryPath(), true))
            dialog.exec();
    });

    auto *layout = new QVBoxLayout(page);
    for (QPushButton *button : {pick, edit, entry})
        layout->addWidget(button, 0, Qt::AlignLeading);
    layout->addWidget(result);
    layout->addStretch(1);
    return page;
}

} // namespace

GalleryPage menuViewPage()
{
    GalleryPage page;
    page.name = QStringLiteral("menu-view");
    page.title = text(QT_TRANSLATE_NOOP("MenuPages", "Menu tree"));
    page.category = text(QT_TRANSLATE_NOOP("MenuPages", "Menus"));
    page.snippet = QStringLiteral(R"(auto *view = new VelMenuView(directory, -1, true, page);
connect(view, &VelMenuView::selectionChanged,
        label, &QLabel::setText);

for (QAction *action : view->actions())
    toolBar->addAction(action);)");
    page.create = createViewPage;
    page.isReady = showsRows;
    return page;
}

GalleryPage menuDialogsPage()
{
    GalleryPage page;
    page.name = QStringLiteral("menu-dialogs");
    page.title = text(QT_TRANSLATE_NOOP("MenuPages", "Menu and entry dialogs"));
    page.category = text(QT_TRANSLATE_NOOP("MenuPages", "Menus"));
    page.snippet = QStringLiteral(R"(// Pick an entry of a menu.
VelMenuDialog picker(directory, -1, false, false, this);
if (picker.exec() == QDialog::Accepted)
    run(picker.selectedItemExec({}, {}, nullptr, nullptr));

// Edit the menu; one Close button.
VelMenuDialog editor(directory, -1, true, true, this);
editor.exec();

// Edit one entry, or create it.
VelDesktopEntryEditDialog dialog(this);
if (dialog.setDesktopEntryPath(path, true))
    dialog.exec();)");
    page.create = createDialogsPage;
    return page;
}
