// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryWindow.h"

#include <support/WindowProgram.h>

#include <VelDesktopEntryPropsWidget.h>

#include <QApplication>
#include <QCommandLineParser>
#include <QDialogButtonBox>
#include <QFile>
#include <QFileInfo>
#include <QIcon>
#include <QPushButton>

namespace {

enum ExitStatus { Saved = 0, Canceled = 1, NotOpened = 2 };

struct Options
{
    QString file;
    QString pattern;
    bool create = false;
    bool readOnly = false;
    QString error; ///< what is wrong with the command line; empty when nothing is
};

QString absolute(const QString &path)
{
    return path.isEmpty() ? path : QFileInfo(path).absoluteFilePath();
}

Options parse()
{
    QCommandLineParser parser;
    parser.setApplicationDescription(QCoreApplication::translate("vel-entryedit", "Edits a desktop entry."));
    parser.addHelpOption();
    parser.addVersionOption();
    const QCommandLineOption create(
        QStringLiteral("create"),
        QCoreApplication::translate("vel-entryedit", "Make a new entry when there is no such file."));
    const QCommandLineOption pattern(
        QStringLiteral("template"),
        QCoreApplication::translate("vel-entryedit", "Begin with the values of the entry <file>."),
        QStringLiteral("file"));
    const QCommandLineOption readOnly(QStringLiteral("read-only"),
                                      QCoreApplication::translate("vel-entryedit", "Show the entry only."));
    parser.addOptions({create, pattern, readOnly});
    parser.addPositionalArgument(QStringLiteral("file"),
                                 QCoreApplication::translate("vel-entryedit", "The entry to edit."));

    Options options;
    options.error = Program::parse(parser);
    if (!options.error.isEmpty())
        return options;
    options.file = absolute(parser.positionalArguments().value(0));
    if (parser.positionalArguments().size() != 1 || options.file.isEmpty())
        options.error = QCoreApplication::translate("vel-entryedit", "one file has to be named");
    options.pattern = absolute(parser.value(pattern));
    options.create = parser.isSet(create);
    options.readOnly = parser.isSet(readOnly);
    return options;
}

// Looking only: nothing in the form can be changed, and nothing can be saved.
void makeReadOnly(VelDesktopEntryEditDialog *dialog)
{
    if (auto *form = dialog->findChild<VelDesktopEntryPropsWidget *>())
        form->setReadOnly(true);
    if (auto *box = dialog->findChild<QDialogButtonBox *>())
        box->button(QDialogButtonBox::Ok)->setEnabled(false);
    if (auto *copyButton = dialog->findChild<QPushButton *>(QStringLiteral("copyButton")))
        copyButton->setEnabled(false);
}

// Why the file will not be opened, as far as that can be seen beforehand; empty when nothing is seen.
QString whyNotOpened(const QString &path)
{
    const QFileInfo info(path);
    if (!info.exists())
        return QCoreApplication::translate(
                   "vel-entryedit", "cannot open %1: there is no such file, --create makes a new entry")
            .arg(path);
    if (!info.isFile())
        return QCoreApplication::translate("vel-entryedit", "cannot open %1: it is no regular file")
            .arg(path);
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return QCoreApplication::translate("vel-entryedit", "cannot open %1: %2")
            .arg(path, file.errorString());
    return QString();
}

// On the terminal before the message box, which has to be closed first.
bool open(VelDesktopEntryEditDialog *dialog, const Options &options)
{
    const QString whyNot = options.create ? QString() : whyNotOpened(options.file);
    if (!whyNot.isEmpty())
        Program::printError(whyNot);
    const bool isOpened = dialog->setDesktopEntryPath(options.file, options.create, options.pattern);
    if (!isOpened && whyNot.isEmpty())
        Program::printError(QCoreApplication::translate("vel-entryedit", "cannot open %1").arg(options.file));
    return isOpened;
}

int run(const Options &options)
{
    QApplication::setWindowIcon(QIcon::fromTheme(QStringLiteral("document-edit")));
    EntryWindow dialog(options.file);
    dialog.setAssistance(true);
    if (!open(&dialog, options))
        return NotOpened;
    if (options.readOnly)
        makeReadOnly(&dialog);
    return dialog.exec() == QDialog::Accepted ? Saved : Canceled;
}

} // namespace

int main(int argc, char **argv)
{
    return Program::runWithWindows(argc, argv, QStringLiteral("vel-entryedit"), NotOpened, parse, run);
}
