// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"

#include "VelMenuView.h"
#include <menuedit/ActionState.h>

#include <QAction>
#include <QClipboard>
#include <QFileSystemModel>
#include <QMenu>
#include <QMimeData>
#include <QTemporaryDir>
#include <QTranslator>

#include <sys/stat.h>

Q_DECLARE_METATYPE(ActionState::Selection)

/// The actions of the menu and when they are enabled.
class tst_VelMenuViewActions : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();
    void offersTheActionsInOrder_data();
    void offersTheActionsInOrder();
    void givesEachActionItsTextIconAndKey_data();
    void givesEachActionItsTextIconAndKey();
    void givesEachTextALetterWithAssistance();
    void showsNoLetterOutsideTheMenu();
    void hasTheActionsInTheViewToo();
    void takesKeysOnlyWhileItHasTheFocus();
    void enablesByRule_data();
    void enablesByRule();
    void offersToCreateAndFindWithoutASelection();
    void offersEverythingForAnItemInTheMiddle();
    void offersNoUpForTheFirstAndNoDownForTheLast();
    void offersNeitherForAnOnlyChild();
    void countsShownSiblingsOnly();
    void offersNothingThatWritesInAFolderThatMayNotBeWritten();
    void asksAFolderItselfWhetherItMayBeWritten();
    void offersPasteOnlyForFiles_data();
    void offersPasteOnlyForFiles();
    void followsTheClipboard();
};

void tst_VelMenuViewActions::cleanup()
{
    QGuiApplication::clipboard()->clear();
    MenuTestCase::cleanup();
}

void tst_VelMenuViewActions::offersTheActionsInOrder_data()
{
    QTest::addColumn<bool>("isStartMenu");
    QTest::newRow("the start menu") << true;
    QTest::newRow("another directory") << false;
}

void tst_VelMenuViewActions::offersTheActionsInOrder()
{
    QFETCH(bool, isStartMenu);
    QDir().mkpath(startMenu());
    const VelMenuView view(isStartMenu ? startMenu() : menu(), -1, true);
    const auto *editMenu = view.findChild<QMenu *>(QString(), Qt::FindDirectChildrenOnly);
    QVERIFY(editMenu);
    QCOMPARE(editMenu->title(), QStringLiteral("Edit"));
    QStringList shownActions;
    const QList<QAction *> actions = editMenu->actions();
    for (const QAction *action : actions)
        shownActions.append(action->isSeparator() ? QStringLiteral("-") : action->text());
    QString expected =
        QStringLiteral("New folder|New entry|Edit|Delete|-|Execute|Find|Find Next|-|Cut|Copy|Paste|-|"
                       "Default menu...|-|Up|Down");
    if (!isStartMenu)
        expected.replace(QLatin1String("Default menu...|"), QString());
    QCOMPARE(shownActions.join(QLatin1Char('|')), expected);
    QVERIFY(editMenu->separatorsCollapsible());
}

void tst_VelMenuViewActions::givesEachActionItsTextIconAndKey_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("icon");
    QTest::addColumn<QKeySequence>("key");
    const auto row = [](const char *name, const char *text, const char *icon, const QKeySequence &key) {
        QTest::newRow(name) << QString::fromLatin1(text) << QString::fromLatin1(icon) << key;
    };
    row("dirNewAction", "New folder", "folder-new", {});
    row("fileNewAction", "New entry", "document-new", QKeySequence::New);
    row("editAction", "Edit", "document-properties", Qt::Key_Space);
    row("deleteAction", "Delete", "edit-delete", QKeySequence::Delete);
    row("executeAction", "Execute", "", Qt::CTRL | Qt::Key_E);
    row("findAction", "Find", "edit-find", QKeySequence::Find);
    row("findNextAction", "Find Next", "", QKeySequence::FindNext);
    row("cutAction", "Cut", "edit-cut", QKeySequence::Cut);
    row("copyAction", "Copy", "edit-copy", QKeySequence::Copy);
    row("pasteAction", "Paste", "edit-paste", QKeySequence::Paste);
    row("recreateAction", "Default menu...", "velmenuedit", {});
    row("upAction", "Up", "go-up", {});
    row("downAction", "Down", "go-down", {});
}

void tst_VelMenuViewActions::givesEachActionItsTextIconAndKey()
{
    QFETCH(QString, text);
    QFETCH(QString, icon);
    QFETCH(QKeySequence, key);
    QDir().mkpath(startMenu());
    const VelMenuView view(QString(), -1, true);
    const QAction *found = action(view, QString::fromLatin1(QTest::currentDataTag()));
    QVERIFY(found);
    QCOMPARE(found->text(), text);
    QCOMPARE(found->icon().name(), icon);
    QCOMPARE(found->icon().isNull(), icon.isEmpty());
    QCOMPARE(found->shortcut(), key);
    QVERIFY(qobject_cast<QMenu *>(found->parent()));
}

// But those to take back and to do again, whose texts change.
void tst_VelMenuViewActions::givesEachTextALetterWithAssistance()
{
    QDir().mkpath(startMenu());
    VelMenuView view(QString(), -1, true);
    auto *editMenu = view.findChild<QMenu *>(QString(), Qt::FindDirectChildrenOnly);
    const auto texts = [editMenu] {
        QStringList list;
        const QList<QAction *> actions = editMenu->actions();
        for (const QAction *action : actions) {
            if (!action->isSeparator() && !action->objectName().startsWith(QLatin1String("undo"))
                && !action->objectName().startsWith(QLatin1String("redo")))
                list.append(action->text());
        }
        return list;
    };
    const QStringList plain = texts();
    view.setAssistance(true);
    QHash<QString, QString> taken;
    const QStringList assisted = texts();
    QVERIFY(assisted.size() > plain.size());
    for (const QString &text : assisted) {
        const QString letter = QKeySequence::mnemonic(text).toString();
        QVERIFY2(!letter.isEmpty(), qPrintable(text));
        QVERIFY2(!taken.contains(letter), qPrintable(text + QLatin1String(", ") + taken.value(letter)));
        taken.insert(letter, text);
    }
    for (const QString &text : plain)
        QVERIFY2(QStringList(assisted).replaceInStrings(QStringLiteral("&"), QString()).contains(text),
                 qPrintable(text));
    view.setAssistance(false);
    QCOMPARE(texts(), plain);
    QVERIFY(!plain.join(QString()).contains(QLatin1Char('&')));
}

namespace {

/// Puts the letters behind the texts, as languages without letters do.
class LettersBehind : public QTranslator
{
public:
    using QTranslator::QTranslator;
    bool isEmpty() const override { return false; }
    QString translate(const char *context, const char *source, const char *, int) const override
    {
        const QString text = QString::fromUtf8(source);
        const int letter = text.indexOf(QLatin1Char('&'));
        if (letter < 0 || qstrcmp(context, "VelMenuView") != 0)
            return {};
        return QString(text).remove(letter, 1) + QStringLiteral("(&%1)").arg(text.at(letter + 1).toUpper());
    }
};

} // namespace

void tst_VelMenuViewActions::showsNoLetterOutsideTheMenu()
{
    LettersBehind translator;
    QVERIFY(QCoreApplication::installTranslator(&translator));
    VelMenuView view(menu(), -1, true);
    const auto texts = [&view](QString (QAction::*text)() const) {
        QStringList list;
        const QList<QAction *> actions = view.actions();
        for (const QAction *action : actions.mid(0, 12))
            list.append((action->*text)());
        return list;
    };
    const QStringList toolTips = texts(&QAction::toolTip);
    const QStringList iconTexts = texts(&QAction::iconText);
    view.setAssistance(true);
    QVERIFY(texts(&QAction::text).contains(QStringLiteral("New folder(&F)")));
    QCOMPARE(texts(&QAction::toolTip), toolTips);
    QCOMPARE(texts(&QAction::iconText), iconTexts);
    view.setAssistance(false);
    QCOMPARE(texts(&QAction::toolTip), toolTips);
    QCOMPARE(texts(&QAction::iconText), iconTexts);
    QCoreApplication::removeTranslator(&translator);
}

void tst_VelMenuViewActions::hasTheActionsInTheViewToo()
{
    QDir().mkpath(startMenu());
    const VelMenuView view(QString(), -1, true);
    QCOMPARE(view.actions().size(), 13);
    QCOMPARE(VelMenuView(menu(), -1, true).actions().size(), 12);
}

void tst_VelMenuViewActions::takesKeysOnlyWhileItHasTheFocus()
{
    const VelMenuView view(menu(), -1, true);
    const QList<QAction *> actions = view.actions();
    for (const QAction *action : actions)
        QCOMPARE(action->shortcutContext(), Qt::WidgetShortcut);
}

void tst_VelMenuViewActions::enablesByRule_data()
{
    QTest::addColumn<ActionState::Selection>("selection");
    QTest::addColumn<QString>("enabled");
    const auto row = [](const char *name, bool any, bool writable, bool clipboard, int place, int count,
                        const char *enabled) {
        QTest::newRow(name) << ActionState::Selection{any, writable, clipboard, place, count}
                            << QString::fromLatin1(enabled);
    };
    row("nothing selected", false, false, false, 0, 0, "create");
    row("nothing selected, but files to paste", false, false, true, 0, 0, "create");
    row("in the middle", true, true, false, 1, 3, "create edit up down");
    row("in the middle, files to paste", true, true, true, 1, 3, "create edit paste up down");
    row("first", true, true, false, 0, 3, "create edit down");
    row("last", true, true, false, 2, 3, "create edit up");
    ActionState::Selection recent{true, true, false, 1, 3};
    recent.isByTime = true;
    QTest::newRow("in the middle, by time") << recent << QStringLiteral("create edit");
    const auto several = [](int first, int last, int items) {
        ActionState::Selection selection{true, true, false, first, 5};
        selection.items = items;
        selection.lastRow = last;
        return selection;
    };
    QTest::newRow("several in the middle") << several(1, 2, 2) << QStringLiteral("create remove up down");
    QTest::newRow("several at the top") << several(0, 1, 2) << QStringLiteral("create remove down");
    QTest::newRow("several at the bottom") << several(3, 4, 2) << QStringLiteral("create remove up");
    QTest::newRow("several at both ends") << several(0, 4, 2) << QStringLiteral("create remove up down");
    QTest::newRow("all of them") << several(0, 4, 5) << QStringLiteral("create remove");
    ActionState::Selection scattered = several(1, 2, 2);
    scattered.areSiblings = false;
    QTest::newRow("several in two folders") << scattered << QStringLiteral("create remove");
    ActionState::Selection locked = several(1, 2, 2);
    locked.isAnyLocked = true;
    QTest::newRow("several, one may not be written") << locked << QStringLiteral("create");
    row("alone", true, true, false, 0, 1, "create edit");
    row("may not be written", true, false, true, 1, 3, "");
}

void tst_VelMenuViewActions::enablesByRule()
{
    QFETCH(ActionState::Selection, selection);
    QFETCH(QString, enabled);
    const ActionState state = ActionState::of(selection);
    QStringList result;
    if (state.create)
        result.append(QStringLiteral("create"));
    if (state.edit)
        result.append(QStringLiteral("edit"));
    // What is done to all is enabled wherever one can be edited.
    if (state.remove && !state.edit)
        result.append(QStringLiteral("remove"));
    if (state.paste)
        result.append(QStringLiteral("paste"));
    if (state.up)
        result.append(QStringLiteral("up"));
    if (state.down)
        result.append(QStringLiteral("down"));
    QCOMPARE(result.join(QLatin1Char(' ')), enabled);
}

namespace {

QStringList list(const char *names)
{
    return QString::fromLatin1(names).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

} // namespace

void tst_VelMenuViewActions::offersToCreateAndFindWithoutASelection()
{
    write(QStringLiteral("config/startmenu/a.desktop"), entryText(QStringLiteral("A")));
    VelMenuView view(QString(), -1, true);
    QVERIFY(open(view, startMenu(), 1));
    QCOMPARE(enabledActions(view),
             list("dirNewAction fileNewAction findAction findNextAction recreateAction"));
    select(view, startMenu() + QLatin1String("/a.desktop"));
    view.selectionModel()->clearSelection();
    QCOMPARE(enabledActions(view),
             list("dirNewAction fileNewAction findAction findNextAction recreateAction"));
}

void tst_VelMenuViewActions::offersEverythingForAnItemInTheMiddle()
{
    for (const char *name : {"a", "b", "c"})
        writeEntry(QLatin1String(name) + QLatin1String(".desktop"), QString::fromLatin1(name));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 3));
    QTRY_COMPARE(names(view, menu()), list("a b c"));
    select(view, menu() + QLatin1String("/b.desktop"));
    QCOMPARE(
        enabledActions(view),
        list("dirNewAction fileNewAction editAction deleteAction executeAction findAction findNextAction "
             "cutAction copyAction upAction downAction"));
}

void tst_VelMenuViewActions::offersNoUpForTheFirstAndNoDownForTheLast()
{
    for (const char *name : {"a", "b", "c"})
        writeEntry(QLatin1String("sub/") + QLatin1String(name) + QLatin1String(".desktop"),
                   QString::fromLatin1(name));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    const QString sub = menu() + QLatin1String("/sub");
    QVERIFY(open(view, sub, 3));
    QTRY_COMPARE(names(view, sub), list("a b c"));
    select(view, sub + QLatin1String("/a.desktop"));
    QVERIFY(!action(view, QStringLiteral("upAction"))->isEnabled());
    QVERIFY(action(view, QStringLiteral("downAction"))->isEnabled());
    select(view, sub + QLatin1String("/c.desktop"));
    QVERIFY(action(view, QStringLiteral("upAction"))->isEnabled());
    QVERIFY(!action(view, QStringLiteral("downAction"))->isEnabled());
}

void tst_VelMenuViewActions::offersNeitherForAnOnlyChild()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, a);
    QVERIFY(!action(view, QStringLiteral("upAction"))->isEnabled());
    QVERIFY(!action(view, QStringLiteral("downAction"))->isEnabled());
    QVERIFY(action(view, QStringLiteral("editAction"))->isEnabled());
}

void tst_VelMenuViewActions::countsShownSiblingsOnly()
{
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"), "Hidden=true\n");
    writeEntry(QStringLiteral("c.desktop"), QStringLiteral("C"), "Hidden=true\n");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QTRY_COMPARE(files(view)->rowCount(files(view)->index(menu())), 3);
    select(view, b);
    QVERIFY(!action(view, QStringLiteral("upAction"))->isEnabled());
    QVERIFY(!action(view, QStringLiteral("downAction"))->isEnabled());
}

void tst_VelMenuViewActions::offersNothingThatWritesInAFolderThatMayNotBeWritten()
{
    for (const char *name : {"a", "b", "c"})
        write(QLatin1String("config/startmenu/") + QLatin1String(name) + QLatin1String(".desktop"),
              entryText(QString::fromLatin1(name)));
    VelMenuView view(QString(), -1, true);
    QVERIFY(open(view, startMenu(), 3));
    view.FillClipboard(files(view)->index(startMenu() + QLatin1String("/a.desktop")), Qt::CopyAction);
    select(view, startMenu() + QLatin1String("/b.desktop"));
    QVERIFY(QFile::setPermissions(startMenu(), QFile::ReadOwner | QFile::ExeOwner));
    {
        const WithoutPermission nobody;
        view.setActionsEnabled();
    }
    QVERIFY(QFile::setPermissions(startMenu(), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QCOMPARE(enabledActions(view), list("findAction findNextAction recreateAction"));
    view.setActionsEnabled();
    QVERIFY(action(view, QStringLiteral("pasteAction"))->isEnabled());
    QVERIFY(action(view, QStringLiteral("dirNewAction"))->isEnabled());
}

void tst_VelMenuViewActions::asksAFolderItselfWhetherItMayBeWritten()
{
    // Where somebody else than the superuser can go, too.
    const QTemporaryDir outside(QStringLiteral("/tmp/veltest-XXXXXX"));
    const QString closed = outside.filePath(QStringLiteral("closed"));
    QVERIFY(QDir().mkpath(closed));
    VelMenuView view(outside.path(), -1, true);
    QVERIFY(open(view, outside.path(), 1));
    select(view, closed);
    const auto mayEdit = [&](mode_t ofFolder, mode_t ofMenu) {
        chmod(QFile::encodeName(closed).constData(), ofFolder);
        chmod(QFile::encodeName(outside.path()).constData(), ofMenu);
        const WithoutPermission nobody;
        view.setActionsEnabled();
        return action(view, QStringLiteral("editAction"))->isEnabled();
    };
    QVERIFY(!mayEdit(0555, 0777));
    QVERIFY(mayEdit(0777, 0555));
    QVERIFY(mayEdit(0777, 0777));
}

void tst_VelMenuViewActions::offersPasteOnlyForFiles_data()
{
    QTest::addColumn<QString>("format");
    QTest::addColumn<bool>("isOffered");
    QTest::newRow("nothing") << QString() << false;
    QTest::newRow("text") << QStringLiteral("text/plain") << false;
    QTest::newRow("a list") << QStringLiteral("text/uri-list") << true;
    QTest::newRow("a list to move") << QStringLiteral("text/uri-move-list") << true;
    QTest::newRow("another case") << QStringLiteral("Text/Uri-List") << false;
}

void tst_VelMenuViewActions::offersPasteOnlyForFiles()
{
    QFETCH(QString, format);
    QFETCH(bool, isOffered);
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, a);
    QGuiApplication::clipboard()->clear();
    if (!format.isEmpty()) {
        auto *data = new QMimeData;
        data->setData(format, "file:///tmp/x\n");
        QGuiApplication::clipboard()->setMimeData(data);
    }
    view.setActionsEnabled();
    QCOMPARE(action(view, QStringLiteral("pasteAction"))->isEnabled(), isOffered);
}

void tst_VelMenuViewActions::followsTheClipboard()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, a);
    auto *data = new QMimeData;
    data->setUrls({QUrl::fromLocalFile(a)});
    QGuiApplication::clipboard()->setMimeData(data);
    QTRY_VERIFY(action(view, QStringLiteral("pasteAction"))->isEnabled());
    QGuiApplication::clipboard()->clear();
    QTRY_VERIFY(!action(view, QStringLiteral("pasteAction"))->isEnabled());
}

VEL_TEST_MAIN(tst_VelMenuViewActions)
#include "tst_VelMenuViewActions.moc"
