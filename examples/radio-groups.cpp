// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Two groups of settings, of which one applies.

#include <VelRadioGroupBox.h>

#include <QApplication>
#include <QLineEdit>
#include <QSpinBox>
#include <QVBoxLayout>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QWidget window;
    auto *layout = new QVBoxLayout(&window);

    auto *byName = new VelRadioGroupBox(QStringLiteral("By &name"), &window);
    (new QVBoxLayout(byName))->addWidget(new QLineEdit);
    layout->addWidget(byName);

    auto *byNumber = new VelRadioGroupBox(QStringLiteral("By n&umber"), &window);
    (new QVBoxLayout(byNumber))->addWidget(new QSpinBox);
    layout->addWidget(byNumber);

    byName->setChecked(true); // a box can be checked once it has a sibling
    window.show();
    return application.exec();
}
