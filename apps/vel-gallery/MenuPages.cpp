// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"
#include "SampleFolder.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelMenuDialog.h>
#include <VelMenuView.h>

#include <QAction>
#include <QCheckBox>
#include <QCoreApplication>
#include <QLabel>
#include <QPushButton>
#include <QToolBar>
#include <QVBoxLayout>

namespace {

struct PageTexts
{
    Q_DECLARE_TR_FUNCTIONS(MenuPages)
};

QLabel *plainLabel(QWidget *parent)
{
    auto *label = new QLabel(parent);
    label->setTextFormat(Qt::PlainText);
    label->setWordWrap(true);
    label->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    return label;
}

// A menu that can be edited, with the actions that have icons in a tool bar.
class MenuViewPage : public QWidget
{
public:
    explicit MenuViewPage(QWidget *parent)
        : QWidget(parent)
        , m_view(new VelMenuView(m_menu.path(), -1, true, this))
    {
        auto *toolBar = new QToolBar(this);
        for (QAction *action : m_view->actions()) {
            if (!action->icon().isNull())
                toolBar->addAction(action);
        }
        auto *path = plainLabel(this);
        connect(m_view, &VelMenuView::selectionChanged, path, &QLabel::setText);
        auto *assistance = new QCheckBox(PageTexts::tr("&Assistance"), this);
        connect(assistance, &QCheckBox::toggled, m_view, &VelMenuView::setAssistance);

        auto *layout = new QVBoxLayout(this);
        layout->addWidget(toolBar);
        layout->addWidget(m_view, 1);
        layout->addWidget(assistance);
        layout->addWidget(path);
    }

    ~MenuViewPage() override
    {
        delete m_view; // before the files that it shows
    }

    bool showsRows() const { return m_view->model()->rowCount(m_view->rootIndex()) == 3; }

private:
    const SampleFolder m_menu{QStringLiteral("menu")};
    VelMenuView *const m_view;
};

// A button for each dialog; a label that tells what was picked.
class MenuDialogsPage : public QWidget
{
public:
    explicit MenuDialogsPage(QWidget *parent)
        : QWidget(parent)
        , m_assistance(new QCheckBox(PageTexts::tr("&Assistance"), this))
        , m_result(plainLabel(this))
    {
        auto *layout = new QVBoxLayout(this);
        const auto addButton = [this, layout](const QString &title, void (MenuDialogsPage::*open)()) {
            auto *button = new QPushButton(title, this);
            connect(button, &QPushButton::clicked, this, open);
            layout->addWidget(button, 0, Qt::AlignLeading);
        };
        addButton(PageTexts::tr("&Pick an entry..."), &MenuDialogsPage::pickEntry);
        addButton(PageTexts::tr("Edit the &menu..."), &MenuDialogsPage::editMenu);
        addButton(PageTexts::tr("Edit an e&ntry..."), &MenuDialogsPage::editEntry);
        layout->addWidget(m_assistance);
        layout->addWidget(m_result);
        layout->addStretch(1);
    }

private:
    void pickEntry()
    {
        VelMenuDialog dialog(m_menu.path(), -1, false, false, this);
        dialog.setAssistance(m_assistance->isChecked());
        if (dialog.exec() == QDialog::Accepted)
            m_result->setText(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr));
    }

    void editMenu()
    {
        VelMenuDialog dialog(m_menu.path(), -1, true, true, this);
        dialog.setAssistance(m_assistance->isChecked());
        dialog.exec();
    }

    void editEntry()
    {
        VelDesktopEntryEditDialog dialog(this);
        dialog.setAssistance(m_assistance->isChecked());
        if (dialog.setDesktopEntryPath(m_menu.filePath(QStringLiteral("terminal.desktop")), true))
            dialog.exec();
    }

    const SampleFolder m_menu{QStringLiteral("menu")};
    QCheckBox *const m_assistance;
    QLabel *const m_result;
};

} // namespace

GalleryPage menuViewPage()
{
    GalleryPage page;
    page.name = QStringLiteral("menu-view");
    page.title = PageTexts::tr("Menu tree");
    page.category = PageTexts::tr("Menus");
    page.snippet = QStringLiteral(R"(auto *view = new VelMenuView(directory, -1, true, page);
connect(view, &VelMenuView::selectionChanged,
        label, &QLabel::setText);
view->setAssistance(true); // more help for its user

for (QAction *action : view->actions())
    toolBar->addAction(action);)");
    page.create = [](const GalleryContext &, QWidget *parent) { return new MenuViewPage(parent); };
    page.isReady = [](QWidget *made) { return static_cast<MenuViewPage *>(made)->showsRows(); };
    return page;
}

GalleryPage menuDialogsPage()
{
    GalleryPage page;
    page.name = QStringLiteral("menu-dialogs");
    page.title = PageTexts::tr("Menu and entry dialogs");
    page.category = PageTexts::tr("Menus");
    page.snippet = QStringLiteral(R"(// Pick an entry of a menu.
VelMenuDialog picker(directory, -1, false, false, this);
if (picker.exec() == QDialog::Accepted)
    run(picker.selectedItemExec({}, {}, nullptr, nullptr));

// Edit the menu; one Close button.
VelMenuDialog editor(directory, -1, true, true, this);
editor.setAssistance(true); // more help for its user
editor.exec();

// Edit one entry, or create it.
VelDesktopEntryEditDialog dialog(this);
dialog.setAssistance(true); // more help for its user
if (dialog.setDesktopEntryPath(path, true))
    dialog.exec();)");
    page.create = [](const GalleryContext &, QWidget *parent) { return new MenuDialogsPage(parent); };
    return page;
}
