// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SchemeMenu.h"

#include "SchemeQuestion.h"
#include "ShortcutScheme.h"
#include "ShortcutSheet.h"

#include <frame/GuardedDialog.h>
#include <frame/MessageBox.h>

#include <QClipboard>
#include <QFileDialog>
#include <QFileInfo>
#include <QGuiApplication>
#include <QMimeData>
#include <QSaveFile>

namespace {

// The file that the user chooses; an empty path for none.
QString chosenFile(QWidget *parent, QFileDialog::AcceptMode mode, const QString &title, const QString &filter,
                   const QString &suffix)
{
    GuardedDialog<QFileDialog> dialog(parent, title, QString(), filter);
    dialog->setAcceptMode(mode);
    dialog->setFileMode(mode == QFileDialog::AcceptSave ? QFileDialog::AnyFile : QFileDialog::ExistingFile);
    dialog->setDefaultSuffix(suffix);
    if (mode == QFileDialog::AcceptSave)
        dialog->selectFile(QLatin1String("shortcuts.") + suffix);
    return dialog.run() ? dialog->selectedFiles().value(0) : QString();
}

// What went wrong; empty for nothing.
QString write(const QString &path, const QString &text)
{
    const QFileInfo target(path);
    if (target.exists() && !target.isFile())
        return SchemeMenu::tr("This is not a regular file.");
    QSaveFile file(path);
    const QByteArray bytes = text.toUtf8();
    // What commit() itself still has to write it may fail to write, and say nothing.
    const bool isWritten =
        file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() && file.flush() && file.commit();
    return isWritten ? QString() : file.errorString();
}

QString report(const ShortcutScheme::Result &result)
{
    const QString taken = QString::number(result.taken);
    const QString skipped = QString::number(result.skipped);
    if (result.error.isEmpty())
        return SchemeMenu::tr("Shortcuts taken over: %1, left out: %2. "
                              "Ok puts them into force, Reset takes them back.")
            .arg(taken, skipped);
    return SchemeMenu::tr("%3\nShortcuts taken over: %1, left out: %2. "
                          "Ok puts them into force, Reset takes them back.",
                          "%3: a sentence about lines that were skipped")
        .arg(taken, skipped, result.error);
}

} // namespace

SchemeMenu::SchemeMenu(ShortcutsModel *model, QWidget *parent)
    : QMenu(parent)
    , m_model(model)
{
    add("exportAction", tr("&Export keys..."), &SchemeMenu::exportKeys);
    add("importAction", tr("&Import keys..."), &SchemeMenu::importKeys);
    addSeparator();
    add("htmlAction", tr("Save cheat sheet as &HTML..."), &SchemeMenu::saveHtml);
    add("plainTextAction", tr("Save cheat sheet as &text..."), &SchemeMenu::savePlainText);
    add("copyAction", tr("&Copy cheat sheet"), &SchemeMenu::copySheet);
}

SchemeMenu::~SchemeMenu() = default;

void SchemeMenu::add(const char *name, const QString &text, void (SchemeMenu::*run)())
{
    QAction *action = addAction(text);
    action->setObjectName(QLatin1String(name));
    connect(action, &QAction::triggered, this, [this, run] {
        if (m_model)
            (this->*run)();
    });
}

QWidget *SchemeMenu::dialogParent() const
{
    return parentWidget() ? parentWidget()->window() : nullptr;
}

void SchemeMenu::exportKeys()
{
    const QPointer<QWidget> window = dialogParent();
    const QPointer<ShortcutsModel> model = m_model;
    const QString path = chosenFile(window, QFileDialog::AcceptSave, tr("Export keys"),
                                    tr("Keys (*.ini);;All files (*)"), QStringLiteral("ini"));
    QString error;
    if (path.isEmpty() || !model || ShortcutScheme::save(*model, path, &error))
        return;
    MessageBox::show(window, QMessageBox::Critical, tr("Export keys"),
                     tr("%1\nChoose another folder or another name, and try again.").arg(error));
}

void SchemeMenu::importKeys()
{
    const QPointer<SchemeMenu> self(this);
    const QPointer<QWidget> window = dialogParent();
    const QPointer<ShortcutsModel> model = m_model;
    const QString path = chosenFile(window, QFileDialog::AcceptOpen, tr("Import keys"),
                                    tr("Keys (*.ini);;All files (*)"), QStringLiteral("ini"));
    if (path.isEmpty() || !model)
        return;
    SchemeQuestion question(model, window);
    const ShortcutScheme::Result result = ShortcutScheme::load(
        model, path, [&question](const QString &name, const QString &otherName, const QKeySequence &key) {
            return question.ask(name, otherName, key);
        });
    if (!self)
        return;
    if (result.ok)
        Q_EMIT keysChanged();
    if (!self)
        return;
    if (result.ok)
        MessageBox::show(window, result.error.isEmpty() ? QMessageBox::Information : QMessageBox::Warning,
                         tr("Import keys"), report(result));
    else if (!result.error.isEmpty())
        MessageBox::show(window, QMessageBox::Critical, tr("Import keys"),
                         tr("%1\nChoose a file that was written with 'Export keys...'.").arg(result.error));
}

void SchemeMenu::saveHtml()
{
    saveSheet(tr("HTML documents (*.html);;All files (*)"), QStringLiteral("html"),
              ShortcutSheet::html(*m_model));
}

void SchemeMenu::savePlainText()
{
    saveSheet(tr("Plain text (*.txt);;All files (*)"), QStringLiteral("txt"),
              ShortcutSheet::plainText(*m_model));
}

void SchemeMenu::saveSheet(const QString &filter, const QString &suffix, const QString &sheet)
{
    const QPointer<QWidget> window = dialogParent();
    const QString title = tr("Save cheat sheet");
    const QString path = chosenFile(window, QFileDialog::AcceptSave, title, filter, suffix);
    const QString failure = path.isEmpty() ? QString() : write(path, sheet);
    if (!failure.isEmpty())
        MessageBox::show(window, QMessageBox::Critical, title,
                         tr("The cheat sheet could not be saved to %1: %2\n"
                            "Choose another folder or another name, and try again.",
                            "%2: what the system says")
                             .arg(path, failure));
}

// For a text editor and for a text processor.
void SchemeMenu::copySheet()
{
    auto *sheet = new QMimeData;
    sheet->setText(ShortcutSheet::plainText(*m_model));
    sheet->setHtml(ShortcutSheet::html(*m_model));
    QGuiApplication::clipboard()->setMimeData(sheet); // which owns it
}
