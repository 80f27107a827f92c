// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileCommands.h"

#include <QDateTime>
#include <QFileDialog>
#include <QMessageBox>
#include <QPlainTextEdit>
#include <QSaveFile>

namespace {

// In plain text: a path may look like rich text.
void warn(QWidget *parent, const QString &title, const QString &text)
{
    QMessageBox box(QMessageBox::Warning, title, text, QMessageBox::Ok, parent);
    box.setTextFormat(Qt::PlainText);
    box.exec();
}

void openFile(QPlainTextEdit *editor)
{
    const QString path = QFileDialog::getOpenFileName(editor);
    QFile file(path);
    if (path.isEmpty())
        return;
    if (file.open(QIODevice::ReadOnly))
        editor->setPlainText(QString::fromUtf8(file.readAll()));
    else
        warn(editor, EditorTexts::tr("Open"), EditorTexts::tr("Cannot read %1.").arg(path));
}

void saveFile(QPlainTextEdit *editor)
{
    const QString path = QFileDialog::getSaveFileName(editor);
    if (path.isEmpty())
        return;
    QSaveFile file(path);
    const QByteArray bytes = editor->toPlainText().toUtf8();
    // What commit() itself still has to write it may fail to write, and say nothing.
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size() || !file.flush()
        || !file.commit())
        warn(editor, EditorTexts::tr("Save"), EditorTexts::tr("Cannot write %1.").arg(path));
}

} // namespace

QVector<EditorCommand> fileCommands()
{
    const QString menu = EditorTexts::tr("File");
    const auto insert = [](const QString &format) {
        return [format](QPlainTextEdit *e) {
            e->insertPlainText(QDateTime::currentDateTime().toString(format));
        };
    };
    return {
        {QStringLiteral("file-new"), menu, EditorTexts::tr("&New"), QStringLiteral("Ctrl+N"),
         [](auto *e) { e->clear(); }},
        {QStringLiteral("file-open"), menu, EditorTexts::tr("&Open..."), QStringLiteral("Ctrl+O"), openFile},
        {QStringLiteral("file-save"), menu, EditorTexts::tr("&Save..."), QStringLiteral("Ctrl+S"), saveFile},
        {QStringLiteral("insert-date"), menu, EditorTexts::tr("Insert &date"), QStringLiteral("F5"),
         insert(QStringLiteral("yyyy-MM-dd"))},
        {QStringLiteral("insert-time"), menu, EditorTexts::tr("Insert &time"), QStringLiteral("Shift+F5"),
         insert(QStringLiteral("hh:mm"))},
        {QStringLiteral("insert-rule"), menu, EditorTexts::tr("Insert &rule"), QString(),
         [](auto *e) { e->insertPlainText(QString(40, QLatin1Char('-'))); }},
    };
}
