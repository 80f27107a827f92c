// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyFiles.h"

#include "EditorCommand.h"

#include <ShortcutScheme.h>
#include <ShortcutSheet.h>
#include <ShortcutsModel.h>
#include <VelKeyServer.h>

#include <QClipboard>
#include <QFileDialog>
#include <QGuiApplication>
#include <QMenu>
#include <QMessageBox>
#include <QPushButton>
#include <QSaveFile>

using ShortcutScheme::OnClash;

namespace {

// In plain text: a path may look like rich text.
void show(QWidget *parent, QMessageBox::Icon icon, const QString &text)
{
    QMessageBox box(icon, EditorTexts::tr("Keys"), text, QMessageBox::Ok, parent);
    box.setTextFormat(Qt::PlainText);
    box.exec();
}

OnClash ask(QWidget *parent, const QString &name, const QString &otherName, const QKeySequence &key)
{
    const QString holder = otherName.isEmpty() ? VelKeyServer::checkForGlobalShortcut(key) : otherName;
    QMessageBox box(QMessageBox::Question, EditorTexts::tr("Keys"),
                    EditorTexts::tr("The file has %1 for %2, but %3 has it, too.")
                        .arg(key.toString(QKeySequence::NativeText), name, holder),
                    QMessageBox::Cancel, parent);
    box.setTextFormat(Qt::PlainText);
    const QAbstractButton *replace =
        otherName.isEmpty() ? nullptr : box.addButton(EditorTexts::tr("&Replace"), QMessageBox::AcceptRole);
    QPushButton *skip = box.addButton(EditorTexts::tr("&Skip"), QMessageBox::AcceptRole);
    box.setDefaultButton(skip);
    box.exec();
    if (box.clickedButton() == skip)
        return OnClash::Skip;
    return replace && box.clickedButton() == replace ? OnClash::Replace : OnClash::Cancel;
}

void exportKeys(QWidget *parent, const ShortcutsModel &model)
{
    const QString path = QFileDialog::getSaveFileName(parent, QString(), QStringLiteral("keys.ini"));
    QString error;
    if (!path.isEmpty() && !ShortcutScheme::save(model, path, &error))
        show(parent, QMessageBox::Warning, error);
}

// Whether keys are in force that were not before.
bool importKeys(QWidget *parent, ShortcutsModel *model)
{
    const QString path = QFileDialog::getOpenFileName(parent);
    if (path.isEmpty())
        return false;
    const ShortcutScheme::Result result = ShortcutScheme::load(
        model, path, [parent](const QString &name, const QString &otherName, const QKeySequence &key) {
            return ask(parent, name, otherName, key);
        });
    if (result.ok)
        model->commitChanges();
    if (!result.error.isEmpty())
        show(parent, QMessageBox::Warning, result.error);
    return result.ok;
}

void saveSheet(QWidget *parent, const QString &name, const QString &sheet)
{
    const QString path = QFileDialog::getSaveFileName(parent, QString(), name);
    if (path.isEmpty())
        return;
    QSaveFile file(path);
    const QByteArray bytes = sheet.toUtf8();
    // What commit() itself still has to write it may fail to write, and say nothing.
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size() || !file.flush()
        || !file.commit())
        show(parent, QMessageBox::Warning, EditorTexts::tr("Cannot write %1.").arg(path));
}

} // namespace

void addKeyFiles(QMenu *menu, ShortcutsModel *model, const std::function<void()> &save)
{
    QWidget *parent = menu->parentWidget();
    const auto add = [=](const char *name, const QString &text, const std::function<void()> &run) {
        QAction *action = menu->addAction(text);
        action->setObjectName(QLatin1String(name));
        QObject::connect(action, &QAction::triggered, parent, run);
        model->registerAction(action->objectName(), action, menu->title());
    };
    menu->addSeparator();
    add("export-keys", EditorTexts::tr("&Export keys..."), [=] { exportKeys(parent, *model); });
    add("import-keys", EditorTexts::tr("&Import keys..."), [=] {
        if (importKeys(parent, model))
            save();
    });
    add("sheet-html", EditorTexts::tr("Save cheat sheet as &HTML..."),
        [=] { saveSheet(parent, QStringLiteral("keys.html"), ShortcutSheet::html(*model)); });
    add("sheet-text", EditorTexts::tr("Save cheat sheet as te&xt..."),
        [=] { saveSheet(parent, QStringLiteral("keys.txt"), ShortcutSheet::plainText(*model)); });
    add("sheet-copy", EditorTexts::tr("&Copy cheat sheet"),
        [=] { QGuiApplication::clipboard()->setText(ShortcutSheet::plainText(*model)); });
}
