// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"

#include <VelRadioGroupBox.h>

#include <QCheckBox>
#include <QComboBox>
#include <QCoreApplication>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QSpinBox>
#include <QVBoxLayout>

namespace {

struct PageTexts
{
    Q_DECLARE_TR_FUNCTIONS(RadioGroupBoxPage)
};

VelRadioGroupBox *automaticBox(QWidget *parent)
{
    auto *box = new VelRadioGroupBox(PageTexts::tr("&Automatic configuration"), parent);
    auto *form = new QFormLayout(box);
    form->addRow(PageTexts::tr("Script address:"), new QLineEdit(box));
    form->addRow(new QCheckBox(PageTexts::tr("Ask again at every start"), box));
    return box;
}

VelRadioGroupBox *manualBox(QWidget *parent)
{
    auto *box = new VelRadioGroupBox(PageTexts::tr("&Manual configuration"), parent);
    auto *port = new QSpinBox(box);
    port->setRange(1, 65535);
    port->setValue(8080);
    auto *protocol = new QComboBox(box);
    protocol->addItems({QStringLiteral("HTTP"), QStringLiteral("SOCKS")});
    auto *form = new QFormLayout(box);
    form->addRow(PageTexts::tr("Host:"), new QLineEdit(box));
    form->addRow(PageTexts::tr("Port:"), port);
    form->addRow(PageTexts::tr("Protocol:"), protocol);
    return box;
}

VelRadioGroupBox *noneBox(QWidget *parent)
{
    auto *box = new VelRadioGroupBox(PageTexts::tr("&Direct connection"), parent);
    auto *note = new QLabel(PageTexts::tr("There is nothing to set."), box);
    auto *layout = new QVBoxLayout(box);
    layout->addWidget(note);
    return box;
}

QWidget *createPage(const GalleryContext &context, QWidget *parent)
{
    Q_UNUSED(context)
    auto *page = new QWidget(parent);
    VelRadioGroupBox *automatic = automaticBox(page);
    automatic->setObjectName(QStringLiteral("automaticBox"));
    VelRadioGroupBox *manual = manualBox(page);
    manual->setObjectName(QStringLiteral("manualBox"));
    VelRadioGroupBox *none = noneBox(page);
    none->setObjectName(QStringLiteral("noneBox"));
    manual->setChecked(true);

    auto *layout = new QVBoxLayout(page);
    for (VelRadioGroupBox *box : {automatic, manual, none})
        layout->addWidget(box);
    layout->addStretch();
    return page;
}

} // namespace

GalleryPage radioGroupBoxPage()
{
    GalleryPage page;
    page.name = QStringLiteral("radio-group-box");
    page.title = PageTexts::tr("Radio group boxes");
    page.category = PageTexts::tr("Widgets");
    page.snippet =
        QStringLiteral(R"(auto *automatic = new VelRadioGroupBox(tr("&Automatic configuration"), page);
auto *manual = new VelRadioGroupBox(tr("&Manual configuration"), page);
auto *none = new VelRadioGroupBox(tr("&Direct connection"), page);

// One group: the boxes below one parent.
manual->setChecked(true);

connect(manual, &QGroupBox::toggled, this, [](bool on) {
    if (on)
        applyManualConfiguration();
});)");
    page.create = createPage;
    return page;
}
