// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryWindow.h"

#include <velintegration/help.h>

#include <QCloseEvent>
#include <QDialogButtonBox>
#include <QKeyEvent>
#include <QMessageBox>

EntryWindow::EntryWindow(const QString &file)
    : m_file(file)
{
    // The dialog's own help says what an entry is; the page of the program has more.
    auto *box = findChild<QDialogButtonBox *>();
    disconnect(box, &QDialogButtonBox::helpRequested, this, nullptr);
    connect(box, &QDialogButtonBox::helpRequested, this, &EntryWindow::showHelp);
}

void EntryWindow::showHelp()
{
    if (!velHelpShow("vel-entryedit"))
        QMetaObject::invokeMethod(this, "helpSlot");
}

void EntryWindow::keyPressEvent(QKeyEvent *event)
{
    if (!event->matches(QKeySequence::Cancel) || mayEnd())
        VelDesktopEntryEditDialog::keyPressEvent(event);
}

void EntryWindow::closeEvent(QCloseEvent *event)
{
    if (mayEnd())
        VelDesktopEntryEditDialog::closeEvent(event);
    else
        event->ignore();
}

// Whether the changes may be lost. Where they are saved, that ends the window.
bool EntryWindow::mayEnd()
{
    if (!isWindowModified() || !isVisible())
        return true;
    QMessageBox box(QMessageBox::Question, tr("Unsaved changes"),
                    tr("The entry %1 was changed.\nSave the changes?").arg(m_file),
                    QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel, this);
    box.setTextFormat(Qt::PlainText);
    box.setDefaultButton(QMessageBox::Save);
    const int answer = box.exec();
    if (answer == QMessageBox::Save)
        accept();
    return answer == QMessageBox::Discard;
}
