// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"
#include "SampleFolder.h"

#include <VelDesktopEntryPropsWidget.h>

#include <veluiaux/VelUIDesktopEntry.h>

#include <QCheckBox>
#include <QCoreApplication>
#include <QFrame>
#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>

namespace {

struct PageTexts
{
    Q_DECLARE_TR_FUNCTIONS(DesktopEntryPages)
};

void showSample(VelDesktopEntryPropsWidget *form, const QString &name)
{
    const SampleFolder samples(QStringLiteral("entries"));
    VelUIDesktopEntry entry(samples.filePath(name));
    entry.load();
    form->loadFrom(entry);
}

QWidget *createFormPage(const GalleryContext &, QWidget *parent)
{
    auto *page = new QWidget(parent);
    auto *form = new VelDesktopEntryPropsWidget(page);
    showSample(form, QStringLiteral("standards.desktop"));
    auto *readOnly = new QCheckBox(PageTexts::tr("&Read-only"), page);
    auto *urlButton = new QCheckBox(PageTexts::tr("&Button beside the address"), page);
    auto *assistance = new QCheckBox(PageTexts::tr("&Assistance"), page);
    auto *requested = new QLabel(page);
    requested->setTextFormat(Qt::PlainText);
    QObject::connect(readOnly, &QCheckBox::toggled, form, &VelDesktopEntryPropsWidget::setReadOnly);
    QObject::connect(urlButton, &QCheckBox::toggled, form, &VelDesktopEntryPropsWidget::setShowURLInfoButton);
    QObject::connect(assistance, &QCheckBox::toggled, form, &VelDesktopEntryPropsWidget::setAssistance);
    QObject::connect(form, &VelDesktopEntryPropsWidget::requestedURLInfo, requested,
                     [requested](const QString &url) {
                         requested->setText(PageTexts::tr("Information requested for %1").arg(url));
                     });
    urlButton->setChecked(true);

    auto *layout = new QVBoxLayout(page);
    layout->addWidget(readOnly);
    layout->addWidget(urlButton);
    layout->addWidget(assistance);
    layout->addWidget(form, 1);
    layout->addWidget(requested);
    return page;
}

QWidget *createFieldsPage(const GalleryContext &, QWidget *parent)
{
    auto *page = new QWidget(parent);
    auto *note = new QLabel(PageTexts::tr("Use the buttons beside the fields to edit commands, "
                                          "files, icons, lists and actions."),
                            page);
    note->setWordWrap(true);
    auto *form = new VelDesktopEntryPropsWidget(page);
    form->setFrameStyle(QFrame::NoFrame);
    form->setType(QStringLiteral("Application"), {QStringLiteral("Application")});
    showSample(form, QStringLiteral("editor.desktop"));

    auto *layout = new QVBoxLayout(page);
    layout->addWidget(note);
    layout->addWidget(form, 1);
    return page;
}

} // namespace

GalleryPage desktopEntryFormPage()
{
    GalleryPage page;
    page.name = QStringLiteral("desktop-entry-form");
    page.title = PageTexts::tr("Properties form");
    page.category = PageTexts::tr("Desktop entries");
    page.snippet = QStringLiteral(R"(auto *form = new VelDesktopEntryPropsWidget(page);
form->loadFrom(VelUIDesktopEntry(path));

form->setReadOnly(readOnly->isChecked());
form->setShowURLInfoButton(urlButton->isChecked());
form->setAssistance(true); // more help for its user
connect(form, &VelDesktopEntryPropsWidget::requestedURLInfo,
        this, &Window::showInformation);

// Writes the values; nothing is saved yet.
VelUIDesktopEntry entry(path);
form->saveTo(&entry);
entry.save();)");
    page.create = createFormPage;
    return page;
}

GalleryPage desktopEntryFieldsPage()
{
    GalleryPage page;
    page.name = QStringLiteral("desktop-entry-fields");
    page.title = PageTexts::tr("Paths, icons, lists and actions");
    page.category = PageTexts::tr("Desktop entries");
    page.snippet = QStringLiteral(R"(auto *form = new VelDesktopEntryPropsWidget(page);
form->setFrameStyle(QFrame::NoFrame);

// The user cannot choose another type.
form->setType("Application", {"Application"});
form->loadFrom(VelUIDesktopEntry(path));)");
    page.create = createFieldsPage;
    return page;
}
