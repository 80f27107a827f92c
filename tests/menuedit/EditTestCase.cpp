// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"

#include "ModalDriver.h"
#include "VelDesktopEntryEditDialog.h"

#include <QLineEdit>

void EditTestCase::fill(QWidget *dialog, const char *field, const QString &text)
{
    auto *widget = dialog->findChild<QWidget *>(QLatin1String(field));
    QVERIFY(widget);
    auto *line = qobject_cast<QLineEdit *>(widget);
    if (!line)
        line = widget->findChild<QLineEdit *>();
    QVERIFY(line);
    line->setText(text);
}

void EditTestCase::accept(QWidget *dialog, const QString &name)
{
    if (!name.isEmpty()) {
        fill(dialog, "nameEdit", name);
        fill(dialog, "localNameEdit", name);
    }
    auto *editor = qobject_cast<VelDesktopEntryEditDialog *>(dialog);
    QVERIFY(editor);
    if (!editor->windowTitle().endsWith(QLatin1String("/.directory")))
        fill(dialog, "execEdit", QStringLiteral("true"));
    editor->accept();
    QCOMPARE(editor->result(), int(QDialog::Accepted));
}

void EditTestCase::reject(QWidget *dialog)
{
    qobject_cast<QDialog *>(dialog)->reject();
}

void EditTestCase::announceDeleteQuestion(ModalDriver &modal, QMessageBox::StandardButton answer)
{
    modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                  QStringLiteral("Are you sure to delete it?"), QMessageBox::Yes | QMessageBox::No,
                  QMessageBox::Yes},
                 answer);
}

QStringList EditTestCase::writeLetters(const char *letters, const QString &folder)
{
    QStringList paths;
    for (const char *letter = letters; *letter; ++letter)
        paths.append(writeEntry(folder + QLatin1Char(*letter) + QLatin1String(".desktop"),
                                QString(QLatin1Char(*letter)).toUpper()));
    return paths;
}
