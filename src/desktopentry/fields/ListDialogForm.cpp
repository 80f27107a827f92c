// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ListDialogForm.h"

#include "ListMessage.h"

#include <QCoreApplication>
#include <QDialog>
#include <QDialogButtonBox>
#include <QFrame>
#include <QPushButton>
#include <QVBoxLayout>

namespace VelUI {

void ListDialogForm::setupUi(QDialog *dialog, QWidget *listWidget, const Names &names)
{
    if (dialog->objectName().isEmpty())
        dialog->setObjectName(QLatin1String(names.form));
    dialog->resize(400, 300);

    verticalLayout = new QVBoxLayout(dialog);
    verticalLayout->setObjectName(QStringLiteral("verticalLayout"));

    listWidget->setObjectName(QStringLiteral("listWidget"));
    verticalLayout->addWidget(listWidget);

    line = new QFrame(dialog);
    line->setObjectName(QStringLiteral("line"));
    line->setFrameShape(QFrame::HLine);
    line->setFrameShadow(QFrame::Sunken);
    verticalLayout->addWidget(line);

    buttonBox = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, Qt::Horizontal, dialog);
    buttonBox->setObjectName(QStringLiteral("buttonBox"));
    verticalLayout->addWidget(buttonBox);
    QObject::connect(buttonBox, &QDialogButtonBox::accepted, dialog, &QDialog::accept);
    QObject::connect(buttonBox, &QDialogButtonBox::rejected, dialog, &QDialog::reject);

    dialog->setWindowTitle(QCoreApplication::translate(names.form, names.windowTitle));
    QMetaObject::connectSlotsByName(dialog);
}

void ListDialogForm::setOkEnabled(bool enabled)
{
    buttonBox->button(QDialogButtonBox::Ok)->setEnabled(enabled);
}

void ListDialogForm::makeMessage()
{
    QWidget *const dialog = buttonBox->parentWidget();
    m_message = new ListMessage(dialog);
    m_message->setObjectName(QStringLiteral("listMessage"));
    verticalLayout->insertWidget(verticalLayout->indexOf(line), m_message);
    // Before the buttons with Tab, too.
    QWidget *previous = m_message->findChild<QPushButton *>();
    for (const auto button : {QDialogButtonBox::Ok, QDialogButtonBox::Cancel}) {
        QWidget::setTabOrder(previous, buttonBox->button(button));
        previous = buttonBox->button(button);
    }
    QObject::connect(m_message, &ListMessage::repairWanted, dialog, [this] { repair(); });
}

void ListDialogForm::tell(const QString &text, const QString &repairText)
{
    if (text.isEmpty()) {
        if (m_message)
            m_message->hide();
        return;
    }
    if (!m_message)
        makeMessage();
    m_message->tell(text, repairText);
    // The least height that a layout asks for leaves out the lines of a text.
    QWidget *const dialog = buttonBox->parentWidget();
    verticalLayout->activate();
    dialog->resize(dialog->width(),
                   qMax(dialog->height(), verticalLayout->minimumHeightForWidth(dialog->width())));
}

void ListDialogForm::insist()
{
    if (m_message)
        m_message->insist();
}

} // namespace VelUI
