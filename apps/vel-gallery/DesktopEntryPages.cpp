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

QString text(const char *source)
{
    return QCoreApplication::translate("DesktopEntryPages", source);
}

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
    auto *readOnly = new QCheckBox(text(QT_TRANSLATE_NOOP("DesktopEntryPages", "&Read-only")), page);
    auto *urlButton =
        new QCheckBox(text(QT_TRANSLATE_NOOP("DesktopEntryPages", "&Button beside the address")), page);
    auto *requested = new QLabel(page);
    requested->setTextFormat(Qt::PlainText);
    QObject::connect(readOnly, &QCheckBox::toggled, form, &VelDesktopEntryPropsWidget::setReadOnly);
    QObject::connect(urlButton, &QCheckBox::toggled, form, &VelDesktopEntryPropsWidget::setShowURLInfoButton);
    QObject::connect(
        form, &VelDesktopEntryPropsWidget::requestedURLInfo, requested, [requested](const QString &url) {
            requested->setText(
                text(QT_TRANSLATE_NOOP("DesktopEntryPages", "Information requested for %1")).arg(url));
        });
    urlButton->setChecked(true);

    auto *layout = new QVBoxLayout(page);
    layout->addWidget(readOnly);
    layout->addWidget(urlButton);
    layout->addWidget(form, 1);
    layout->addWidget(requested);
    return page;
}

QWidget *createFieldsPage(const GalleryContext &, QWidget *parent)
{
    auto *page = new QWidget(parent);
    auto *note = new QLabel(text(QT_TRANSLATE_NOOP("DesktopEntryPages",
                                                   "Use the buttons beside the fields to edit commands, "
                                                   "files, icons, lists and actions.")),
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
    page.title = text(QT_TRANSLATE_NOOP("DesktopEntryPages", "Properties form"));
    page.category = text(QT_TRANSLATE_NOOP("DesktopEntryPages", "Desktop entries"));
    page.snippet = QStringLiteral(R"(auto *form = new VelDesktopEntryPropsWidget(page);
form->loadFrom(VelUIDesktopEntry(path));

form->setReadOnly(readOnly->isChecked());
form->setShowURLInfoButton(urlButton->isChecked());
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
    page.title = text(QT_TRANSLATE_NOOP("DesktopEntryPages", "Paths, icons, lists and actions"));
    page.category = text(QT_TRANSLATE_NOOP("DesktopEntryPages", "Desktop entries"));
    page.snippet = QStringLiteral(R"(auto *form = new VelDesktopEntryPropsWidget(page);
form->setFrameStyle(QFrame::NoFrame);

// The user cannot choose another type.
form->setType("Application", {"Application"});
form->loadFrom(VelUIDesktopEntry(path));)");
    page.create = createFieldsPage;
    return page;
}
