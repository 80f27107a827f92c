// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"
#include "editor/EditorCommands.h"
#include "editor/EditorKey.h"

#include <EditShortcutsDialog.h>
#include <ShortcutsModel.h>

#include <QAction>
#include <QCoreApplication>
#include <QLabel>
#include <QMainWindow>
#include <QMenu>
#include <QMenuBar>
#include <QPlainTextEdit>
#include <QPointer>
#include <QSettings>
#include <QShortcut>
#include <QStatusBar>
#include <QTextCursor>

namespace {

struct PageTexts
{
    Q_DECLARE_TR_FUNCTIONS(ShortcutsPage)
};

const QString settingsGroup = QStringLiteral("Shortcuts");

QString settingsName()
{
    return QStringLiteral("vel-gallery");
}

void configure(QMainWindow *page, ShortcutsModel *model)
{
    const QPointer<EditShortcutsDialog> dialog(new EditShortcutsDialog(model, page));
    if (dialog->exec() == QDialog::Accepted && dialog) {
        QSettings settings(settingsName(), settingsName());
        model->saveKeys(&settings, settingsGroup);
    }
    delete dialog;
}

// The menus of the commands, each with its action of the command's name.
void addCommands(QMainWindow *page, QPlainTextEdit *editor, QLabel *last, ShortcutsModel *model)
{
    QMap<QString, QMenu *> menus;
    const auto commands = editorCommands();
    for (const EditorCommand &command : commands) {
        QMenu *&menu = menus[command.menu];
        if (!menu)
            menu = page->menuBar()->addMenu(command.menu);
        QAction *action = menu->addAction(command.text);
        action->setObjectName(command.name);
        action->setShortcut(QKeySequence(command.key, QKeySequence::PortableText));
        QObject::connect(action, &QAction::triggered, editor, [editor, last, action, command] {
            command.run(editor);
            last->setText(PageTexts::tr("Last command: %1").arg(action->iconText()));
        });
        model->registerAction(command.name, action, command.menu);
    }
}

// A key that is no action's; its saved key is not the model's business.
void addEditorKey(QPlainTextEdit *editor, QLabel *last, ShortcutsModel *model, const QSettings &settings)
{
    const QString text = PageTexts::tr("Delete the whole line");
    const auto deleteLine = [last, text](QPlainTextEdit *e) {
        QTextCursor cursor = e->textCursor();
        cursor.movePosition(QTextCursor::StartOfBlock);
        if (!cursor.movePosition(QTextCursor::NextBlock, QTextCursor::KeepAnchor))
            cursor.movePosition(QTextCursor::EndOfBlock, QTextCursor::KeepAnchor);
        cursor.removeSelectedText();
        last->setText(PageTexts::tr("Last command: %1").arg(text));
    };
    auto *key =
        new EditorKey(editor,
                      {QStringLiteral("delete-line"), EditorTexts::tr("Text"), text,
                       QKeySequence(QStringLiteral("Ctrl+Shift+K"), QKeySequence::PortableText), deleteLine});
    const QVariant saved = settings.value(settingsGroup + QLatin1Char('/') + key->name());
    if (saved.isValid()) {
        key->setObjectKeySequence(QKeySequence(saved.toString(), QKeySequence::PortableText));
        key->reset();
    }
    model->registerShortcutObject(key);
}

QWidget *createPage(const GalleryContext &context, QWidget *parent)
{
    Q_UNUSED(context)
    auto *page = new QMainWindow(parent, Qt::Widget);
    QSettings settings(settingsName(), settingsName());
    auto *model = new ShortcutsModel(&settings, settingsGroup, page);
    model->setObjectName(QStringLiteral("shortcutsModel"));
    auto *editor = new QPlainTextEdit(page);
    editor->setObjectName(QStringLiteral("editor"));
    editor->setPlainText(PageTexts::tr("one line\nanother line\nand a third one\n"));
    page->setCentralWidget(editor);
    auto *last = new QLabel(page);
    last->setObjectName(QStringLiteral("lastCommand"));
    page->statusBar()->addWidget(last);
    page->statusBar()->setSizeGripEnabled(false);
    addCommands(page, editor, last, model);
    addEditorKey(editor, last, model, settings);

    auto *focusShortcut = new QShortcut(QKeySequence(Qt::Key_F6), page);
    QObject::connect(focusShortcut, &QShortcut::activated, editor, [editor] { editor->setFocus(); });
    model->registerShortcut(QStringLiteral("focus-editor"), focusShortcut, PageTexts::tr("Go to the editor"),
                            PageTexts::tr("View"));

    QAction *configureAction = page->menuBar()
                                   ->addMenu(PageTexts::tr("Settings"))
                                   ->addAction(PageTexts::tr("Configure shortcuts..."));
    configureAction->setObjectName(QStringLiteral("configure-shortcuts"));
    configureAction->setShortcut(QKeySequence(QStringLiteral("Ctrl+F12"), QKeySequence::PortableText));
    QObject::connect(configureAction, &QAction::triggered, page, [page, model] { configure(page, model); });
    model->registerAction(configureAction->objectName(), configureAction, PageTexts::tr("Settings"));
    return page;
}

} // namespace

GalleryPage shortcutsPage()
{
    GalleryPage page;
    page.name = QStringLiteral("shortcuts");
    page.title = PageTexts::tr("Shortcuts");
    page.category = PageTexts::tr("Shortcuts");
    page.snippet = QStringLiteral(R"(QSettings settings;
auto *model = new ShortcutsModel(&settings, "Shortcuts", this);
model->registerAction("file-save", saveAction, tr("File"));
model->registerShortcut("focus", focusShortcut, tr("Go to the editor"), tr("View"));
// What is neither: a class of your own, from IShortcutObject.
model->registerShortcutObject(new EditorKey(editor, deleteLine));

EditShortcutsDialog dialog(model, this);
if (dialog.exec() == QDialog::Accepted)
    model->saveKeys(&settings, "Shortcuts");)");
    page.create = createPage;
    return page;
}
