// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The form in a window of one's own, for the desktop entry named on the command line.

#include <VelDesktopEntryPropsWidget.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QApplication>
#include <QDialogButtonBox>
#include <QPushButton>
#include <QVBoxLayout>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    VelUIDesktopEntry entry(application.arguments().value(1));
    if (!entry.load())
        return 2; // no such file, or no desktop entry

    QWidget window;
    auto *form = new VelDesktopEntryPropsWidget(&window);
    form->setType(QStringLiteral("Application"), {QStringLiteral("Application"), QStringLiteral("Link")});
    form->loadFrom(entry);

    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Save | QDialogButtonBox::Close, &window);
    QPushButton *save = buttons->button(QDialogButtonBox::Save);
    save->setEnabled(false);
    QObject::connect(form, &VelDesktopEntryPropsWidget::changed, save, [save] { save->setEnabled(true); });
    QObject::connect(save, &QPushButton::clicked, &window, [&] {
        form->saveTo(&entry); // what was not touched stays byte for byte
        save->setEnabled(!entry.save());
    });
    QObject::connect(buttons, &QDialogButtonBox::rejected, &window, &QWidget::close);

    auto *layout = new QVBoxLayout(&window);
    layout->addWidget(form);
    layout->addWidget(buttons);
    window.resize(480, 560);
    window.show();
    return application.exec();
}
