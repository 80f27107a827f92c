// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"
#include "editor/EditorCommands.h"
#include "editor/EditorKey.h"
#include "editor/KeyFiles.h"

#include <EditShortcutsDialog.h>
#include <ShortcutsModel.h>

#include <QAction>
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

const QString settingsName = QStringLiteral("vel-gallery");
const QString settingsGroup = QStringLiteral("Shortcuts");

QKeySequence portableKey(const QString &key)
{
    return QKeySequence(key, QKeySequence::PortableText);
}

void deleteLine(QPlainTextEdit *editor)
{
    QTextCursor cursor = editor->textCursor();
    cursor.movePosition(QTextCursor::StartOfBlock);
    if (!cursor.movePosition(QTextCursor::NextBlock, QTextCursor::KeepAnchor))
        cursor.movePosition(QTextCursor::EndOfBlock, QTextCursor::KeepAnchor);
    cursor.removeSelectedText();
}

// A small text editor whose keys the user can change, with each kind of shortcut object.
class ShortcutsPage : public QMainWindow
{
    Q_OBJECT

public:
    explicit ShortcutsPage(QWidget *parent)
        : QMainWindow(parent, Qt::Widget)
    {
        QSettings settings(settingsName, settingsName);
        m_model = new ShortcutsModel(&settings, settingsGroup, this);
        m_model->setObjectName(QStringLiteral("shortcutsModel"));
        buildEditor();
        addCommands();
        addEditorKey(settings);
        addFocusShortcut();
        addConfigureActions();
    }

    static QString pageTitle() { return tr("Shortcuts"); }
    static QString pageCategory() { return tr("Shortcuts"); }

private:
    void buildEditor()
    {
        m_editor = new QPlainTextEdit(this);
        m_editor->setObjectName(QStringLiteral("editor"));
        m_editor->setPlainText(tr("one line\nanother line\nand a third one\n"));
        setCentralWidget(m_editor);
        m_last = new QLabel(this);
        m_last->setObjectName(QStringLiteral("lastCommand"));
        statusBar()->addWidget(m_last);
        statusBar()->setSizeGripEnabled(false);
    }

    // The menus of the commands, each with its action of the command's name.
    void addCommands()
    {
        QMap<QString, QMenu *> menus;
        const auto commands = editorCommands();
        for (const EditorCommand &command : commands) {
            QMenu *&menu = menus[command.menu];
            if (!menu)
                menu = menuBar()->addMenu(command.menu);
            QAction *action = menu->addAction(command.text);
            action->setObjectName(command.name);
            action->setShortcut(portableKey(command.key));
            connect(action, &QAction::triggered, m_editor, [this, action, command] {
                command.run(m_editor);
                showLast(action->iconText());
            });
            m_model->registerAction(command.name, action, command.menu);
        }
        addKeyFiles(menus.value(EditorTexts::tr("File")), m_model, [this] { saveKeys(); });
    }

    // A key that is no action's; its saved key is not the model's business.
    void addEditorKey(const QSettings &settings)
    {
        const QString text = tr("Delete the whole line");
        const auto run = [this, text](QPlainTextEdit *editor) {
            deleteLine(editor);
            showLast(text);
        };
        auto *key = new EditorKey(m_editor,
                                  {QStringLiteral("delete-line"), EditorTexts::tr("Text"), text,
                                   portableKey(QStringLiteral("Ctrl+Shift+K")), run});
        const QVariant saved = settings.value(settingsGroup + QLatin1Char('/') + key->name());
        if (saved.isValid()) {
            key->setObjectKeySequence(portableKey(saved.toString()));
            key->reset();
        }
        m_model->registerShortcutObject(key);
    }

    void addFocusShortcut()
    {
        auto *shortcut = new QShortcut(QKeySequence(Qt::Key_F6), this);
        connect(shortcut, &QShortcut::activated, m_editor, [this] { m_editor->setFocus(); });
        m_model->registerShortcut(QStringLiteral("focus-editor"), shortcut, tr("Go to the editor"),
                                  tr("View"));
    }

    // Both dialogs: the one that helps, and the one that hosts get who ask for nothing.
    void addConfigureActions()
    {
        QMenu *menu = menuBar()->addMenu(tr("Settings"));
        addConfigureAction(menu, QStringLiteral("configure-shortcuts"), tr("Configure shortcuts..."),
                           portableKey(QStringLiteral("Ctrl+F12")), true);
        addConfigureAction(menu, QStringLiteral("configure-shortcuts-plain"),
                           tr("Configure shortcuts in the plain dialog..."), QKeySequence(), false);
    }

    void addConfigureAction(QMenu *menu, const QString &name, const QString &text, const QKeySequence &key,
                            bool assistance)
    {
        QAction *action = menu->addAction(text);
        action->setObjectName(name);
        action->setShortcut(key);
        connect(action, &QAction::triggered, this, [this, assistance] { configure(assistance); });
        m_model->registerAction(name, action, menu->title());
    }

    void configure(bool assistance)
    {
        const QPointer<EditShortcutsDialog> dialog(new EditShortcutsDialog(m_model, this));
        dialog->setAssistance(assistance);
        if (dialog->exec() == QDialog::Accepted && dialog)
            saveKeys();
        delete dialog;
    }

    void saveKeys()
    {
        QSettings settings(settingsName, settingsName);
        m_model->saveKeys(&settings, settingsGroup);
    }

    void showLast(const QString &command) { m_last->setText(tr("Last command: %1").arg(command)); }

    ShortcutsModel *m_model = nullptr;
    QPlainTextEdit *m_editor = nullptr;
    QLabel *m_last = nullptr;
};

} // namespace

GalleryPage shortcutsPage()
{
    GalleryPage page;
    page.name = QStringLiteral("shortcuts");
    page.title = ShortcutsPage::pageTitle();
    page.category = ShortcutsPage::pageCategory();
    page.snippet = QStringLiteral(R"(QSettings settings;
auto *model = new ShortcutsModel(&settings, "Shortcuts", this);
model->registerAction("file-save", saveAction, tr("File"));
model->registerShortcut("focus", focusShortcut, tr("Go to the editor"), tr("View"));
// What is neither: a class of your own, from IShortcutObject.
model->registerShortcutObject(new EditorKey(editor, deleteLine));

EditShortcutsDialog dialog(model, this);
dialog.setAssistance(true); // a filter, clashes in words, schemes
if (dialog.exec() == QDialog::Accepted)
    model->saveKeys(&settings, "Shortcuts");)");
    page.create = [](const GalleryContext &, QWidget *parent) { return new ShortcutsPage(parent); };
    return page;
}

#include "ShortcutsPage.moc"
