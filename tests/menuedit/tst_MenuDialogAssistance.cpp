// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "OrdinaryUser.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <frame/DesktopEntryRecord.h>

#include <QAccessible>
#include <QAction>
#include <QCheckBox>
#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QScopeGuard>
#include <QSignalSpy>
#include <QToolButton>
#include <QVBoxLayout>

#include <private/qguiapplication_p.h>
#include <qpa/qplatformaccessibility.h>
#include <qpa/qplatformintegration.h>

#include <algorithm>

namespace {

QStringList alerts;

void noteAlert(QAccessibleEvent *event)
{
    if (event->type() == QAccessible::Alert)
        alerts.append(event->object()->objectName());
}

} // namespace

/// What the menu dialog has beyond its plain form, by mouse and keyboard.
class tst_MenuDialogAssistance : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isNotThereAtFirst();
    void filtersWhatIsTyped();
    void takesTheKeyToFindAnywhere();
    void isReachedByTheTabKey();
    void goesFromMatchToMatch();
    void clearsByEscapeAndStaysOpen();
    void clearsByEscapeWhereverTheKeyboardIs_data();
    void clearsByEscapeWhereverTheKeyboardIs();
    void showsHiddenEntries();
    void hidesAnEntryAndShowsItAgain();
    void tellsWhatTheViewTells_data();
    void tellsWhatTheViewTells();
    void tellsWhyTheMenuCannotBeChanged();
    void helpsWhoPicksToo();
    void showsTheArrowOfTheToolBarInDarkColors();
    void takesBackWhatItTells();
    void takesBackTheDonePartOfWhatFailed_data();
    void takesBackTheDonePartOfWhatFailed();
    void leavesNothingBehind();

private:
    void openAssisted(int count);
    QLineEdit *filterEdit() const { return dialog()->findChild<QLineEdit *>(QStringLiteral("filterEdit")); }
    QLabel *message() const { return dialog()->findChild<QLabel *>(QStringLiteral("messageLabel")); }
    static QStringList partsOf(const QObject *dialog);
};

void tst_MenuDialogAssistance::openAssisted(int count)
{
    openDialog(menu(), count);
    dialog()->setAssistance(true);
    dialog()->layout()->activate();
    QTRY_VERIFY(filterEdit()->isVisible());
    view().setFocus();
}

// The names and classes of all objects below it, but for what Qt makes by itself.
QStringList tst_MenuDialogAssistance::partsOf(const QObject *dialog)
{
    QStringList parts;
    const QList<QWidget *> widgets = dialog->findChildren<QWidget *>();
    for (const QWidget *widget : widgets)
        parts.append(QString::fromLatin1(widget->metaObject()->className()) + widget->objectName());
    const QList<QAction *> actions = dialog->findChildren<QAction *>();
    for (const QAction *action : actions)
        parts.append(action->objectName() + action->text() + action->shortcut().toString()
                     + QString::number(action->shortcutContext()));
    parts.sort();
    return parts;
}

void tst_MenuDialogAssistance::isNotThereAtFirst()
{
    openDialog(menu(), 0);
    for (const char *name : {"filterEdit", "hiddenButton", "messageLabel", "messageUndoButton"})
        QVERIFY2(!dialog()->findChild<QWidget *>(QLatin1String(name)), name);
    QVERIFY(!dialog()->assistance());
}

void tst_MenuDialogAssistance::filtersWhatIsTyped()
{
    writeEntry(QStringLiteral("games/chess.desktop"), QStringLiteral("Chess"), "Exec=xboard\n");
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    openAssisted(2);
    QCOMPARE(filterEdit()->placeholderText(), QStringLiteral("Filter by name, command or keyword"));
    QCOMPARE(filterEdit()->accessibleName(), QStringLiteral("Filter"));
    QVERIFY(filterEdit()->isClearButtonEnabled());
    XDoTool::click(filterEdit());
    XDoTool::run(QStringLiteral("type --delay 30 BOARD"));
    QTRY_COMPARE(names(view(), menu()), QStringList{QStringLiteral("games")});
    QTRY_COMPARE(names(view(), menu() + QLatin1String("/games")), QStringList{QStringLiteral("Chess")});
    XDoTool::press(QStringLiteral("Return"));
    QTRY_COMPARE(view().selectedPath(), menu() + QLatin1String("/games/chess.desktop"));
    QVERIFY(dialog()->isVisible());
}

void tst_MenuDialogAssistance::takesTheKeyToFindAnywhere()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    openAssisted(1);
    QTRY_VERIFY(view().hasFocus());
    XDoTool::press(QStringLiteral("ctrl+f"));
    QTRY_VERIFY(filterEdit()->hasFocus());
    dialog()->findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Close)->setFocus();
    XDoTool::press(QStringLiteral("ctrl+f"));
    QTRY_VERIFY(filterEdit()->hasFocus());
    XDoTool::press(QStringLiteral("Down"));
    QTRY_VERIFY(view().hasFocus());
}

void tst_MenuDialogAssistance::isReachedByTheTabKey()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    openAssisted(1);
    QTRY_VERIFY(view().hasFocus());
    auto *hidden = dialog()->findChild<QCheckBox *>(QStringLiteral("hiddenButton"));
    auto *close = dialog()->findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Close);
    XDoTool::press(QStringLiteral("shift+Tab"));
    QTRY_VERIFY(hidden->hasFocus());
    XDoTool::press(QStringLiteral("shift+Tab"));
    QTRY_VERIFY(filterEdit()->hasFocus());
    for (QWidget *next : QVector<QWidget *>{hidden, &view(), close}) {
        XDoTool::press(QStringLiteral("Tab"));
        QTRY_VERIFY(next->hasFocus());
    }
}

void tst_MenuDialogAssistance::goesFromMatchToMatch()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("hit a"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit b"));
    writeEntry(QStringLiteral("c.desktop"), QStringLiteral("miss"));
    openAssisted(3);
    XDoTool::press(QStringLiteral("ctrl+f"));
    QTRY_VERIFY(filterEdit()->hasFocus());
    XDoTool::run(QStringLiteral("type --delay 30 hit"));
    QTRY_COMPARE(names(view(), menu()).size(), 2);
    for (const QString &path : {a, b, a}) {
        XDoTool::press(QStringLiteral("F3"));
        QTRY_COMPARE(view().selectedPath(), path);
    }
    QVERIFY(filterEdit()->hasFocus());
    view().setFocus();
    XDoTool::press(QStringLiteral("F3"));
    QTRY_COMPARE(view().selectedPath(), b);
}

void tst_MenuDialogAssistance::clearsByEscapeAndStaysOpen()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    openAssisted(2);
    for (const bool atTheTree : {false, true}) {
        XDoTool::press(QStringLiteral("ctrl+f"));
        QTRY_VERIFY(filterEdit()->hasFocus());
        XDoTool::run(QStringLiteral("type --delay 30 b"));
        QTRY_COMPARE(names(view(), menu()).size(), 1);
        if (atTheTree) {
            XDoTool::press(QStringLiteral("Down"));
            QTRY_VERIFY(view().hasFocus());
        }
        XDoTool::press(QStringLiteral("Escape"));
        QTRY_COMPARE(names(view(), menu()).size(), 2);
        QVERIFY(filterEdit()->text().isEmpty());
        QVERIFY(dialog()->isVisible());
    }
    XDoTool::press(QStringLiteral("Escape"));
    QTRY_VERIFY(!dialog()->isVisible());
}

void tst_MenuDialogAssistance::clearsByEscapeWhereverTheKeyboardIs_data()
{
    QTest::addColumn<QString>("keys");
    QTest::addColumn<QString>("place");
    QTest::newRow("line") << QString() << QStringLiteral("QLineEdit");
    QTest::newRow("switch") << QStringLiteral("Tab") << QStringLiteral("QCheckBox");
    QTest::newRow("tree") << QStringLiteral("Tab Tab") << QStringLiteral("VelMenuView");
    QTest::newRow("tree, an item selected") << QStringLiteral("Return Down") << QStringLiteral("VelMenuView");
    QTest::newRow("button") << QStringLiteral("Tab Tab Tab") << QStringLiteral("QPushButton");
    QTest::newRow("tool button") << QStringLiteral("shift+Tab") << QStringLiteral("QToolButton");
}

void tst_MenuDialogAssistance::clearsByEscapeWhereverTheKeyboardIs()
{
    QFETCH(QString, keys);
    QFETCH(QString, place);
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    openAssisted(2);
    XDoTool::press(QStringLiteral("ctrl+f"));
    QTRY_VERIFY(filterEdit()->hasFocus());
    XDoTool::run(QStringLiteral("type --delay 30 b"));
    QTRY_COMPARE(names(view(), menu()).size(), 1);
    if (!keys.isEmpty())
        XDoTool::run(QLatin1String("key --delay 50 ") + keys);
    QTRY_COMPARE(QLatin1String(dialog()->focusWidget()->metaObject()->className()), place);

    XDoTool::press(QStringLiteral("Escape"));
    QTRY_COMPARE(names(view(), menu()).size(), 2);
    QVERIFY(filterEdit()->text().isEmpty());
    QVERIFY(dialog()->isVisible());
    XDoTool::press(QStringLiteral("Escape"));
    QTRY_VERIFY(!dialog()->isVisible());
}

void tst_MenuDialogAssistance::showsHiddenEntries()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"), "Exec=true\nHidden=true\n");
    openAssisted(1);
    auto *button = dialog()->findChild<QCheckBox *>(QStringLiteral("hiddenButton"));
    QCOMPARE(button->text(), QStringLiteral("Show hidden"));
    QVERIFY(button->isCheckable() && !button->isChecked());
    XDoTool::click(button);
    QTRY_COMPARE(names(view(), menu()).join(QString()), QStringLiteral("AB"));
    XDoTool::click(button);
    QTRY_COMPARE(names(view(), menu()).join(QString()), QStringLiteral("A"));
}

void tst_MenuDialogAssistance::hidesAnEntryAndShowsItAgain()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    openAssisted(1);
    for (const bool isToBeHidden : {true, false}) {
        clickItem(a);
        ModalDriver modal;
        pickInDropMenu(modal, isToBeHidden ? QStringLiteral("Hide") : QStringLiteral("Show again"));
        XDoTool::press(QStringLiteral("Menu"));
        QTRY_VERIFY(modal.finished());
        QTRY_COMPARE(VelUIDesktopEntry(a).getNoDisplay(), isToBeHidden);
        QTRY_COMPARE(shown(view(), a).data(Qt::ForegroundRole).isValid(), isToBeHidden);
        QCOMPARE(message()->text(),
                 isToBeHidden ? QStringLiteral("A is hidden: the menu no longer shows it.")
                              : QStringLiteral("The menu shows A again."));
    }
}

void tst_MenuDialogAssistance::tellsWhatTheViewTells_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<bool>("isMarked");
    QTest::newRow("note") << 0 << false;
    QTest::newRow("warning") << 1 << true;
    QTest::newRow("failure") << 2 << true;
}

void tst_MenuDialogAssistance::tellsWhatTheViewTells()
{
    QFETCH(int, kind);
    QFETCH(bool, isMarked);
    openAssisted(0);
    const QString text =
        QStringLiteral("<b>Text</b> of a message that is longer than the line is wide, so that it "
                       "is shown in two lines or in three.");
    alerts.clear();
    const int width = dialog()->width();
    // As if a screen reader were there.
    QPlatformAccessibility *platform = QGuiApplicationPrivate::platformIntegration()->accessibility();
    platform->setActive(true);
    const auto former = QAccessible::installUpdateHandler(noteAlert);
    Q_EMIT view().told(text, kind);
    QAccessible::installUpdateHandler(former);
    platform->setActive(false);
    QCOMPARE(message()->text(), text);
    QCOMPARE(message()->textFormat(), Qt::PlainText);
    QCOMPARE(alerts, QStringList{QStringLiteral("messageLabel")});
    auto *icon = dialog()->findChild<QLabel *>(QStringLiteral("messageIcon"));
    QCOMPARE(icon->isVisible(), isMarked);
    QVERIFY(!isMarked || !icon->pixmap(Qt::ReturnByValue).isNull());
    QCoreApplication::processEvents();
    QCOMPARE(dialog()->width(), width);
    // Nothing can be taken back yet.
    QVERIFY(!dialog()->findChild<QPushButton *>(QStringLiteral("messageUndoButton"))->isVisible());
}

void tst_MenuDialogAssistance::tellsWhyTheMenuCannotBeChanged()
{
    openDialog(menu(), 0);
    const WithoutPermission withoutPermission;
    QVERIFY(QFile::setPermissions(menu(), QFile::ReadOwner | QFile::ExeOwner));
    dialog()->setAssistance(true);
    const QString text =
        QStringLiteral("This menu cannot be changed: you may not write to the folder %1.").arg(menu());
    QCOMPARE(message()->text(), text);
    Q_EMIT view().told(QStringLiteral("Something."), 0);
    QCOMPARE(message()->text(), QStringLiteral("Something."));
    filterEdit()->setText(QStringLiteral("x"));
    QTRY_COMPARE(message()->text(), QStringLiteral("Nothing in this menu matches 'x'."));
    filterEdit()->clear();
    QCOMPARE(message()->text(), text);
    QVERIFY(QFile::setPermissions(menu(), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
}

void tst_MenuDialogAssistance::helpsWhoPicksToo()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    const QString b = writeEntry(QStringLiteral("b.desktop"), QStringLiteral("hit"));
    VelMenuDialog picker(menu(), 22, false, false, nullptr, Qt::Window);
    picker.setAssistance(true);
    auto *pickerView = picker.findChild<VelMenuView *>();
    picker.show();
    QVERIFY(QTest::qWaitForWindowActive(&picker));
    QVERIFY(open(*pickerView, menu(), 2));
    auto *line = picker.findChild<QLineEdit *>(QStringLiteral("filterEdit"));
    QVERIFY(!line->hasFocus());
    XDoTool::press(QStringLiteral("ctrl+f"));
    QTRY_VERIFY(line->hasFocus());
    XDoTool::run(QStringLiteral("type --delay 30 hit"));
    QTRY_COMPARE(names(*pickerView, menu()).size(), 1);
    XDoTool::press(QStringLiteral("F3"));
    QTRY_COMPARE(pickerView->selectedPath(), b);
    QVERIFY(picker.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok)->isEnabled());
    QVERIFY(picker.findChild<QLabel *>(QStringLiteral("messageLabel"))->text().isEmpty());
}

void tst_MenuDialogAssistance::showsTheArrowOfTheToolBarInDarkColors()
{
    openAssisted(0);
    auto *arrow = dialog()->findChild<QToolButton *>(QStringLiteral("qt_toolbar_ext_button"));
    QVERIFY(arrow);
    const auto colors = [arrow] {
        const QImage image = arrow->icon().pixmap(arrow->iconSize()).toImage();
        QSet<QRgb> found;
        for (int x = 0; x < image.width(); ++x) {
            for (int y = 0; y < image.height(); ++y) {
                if (image.pixelColor(x, y).alpha() > 0)
                    found.insert(image.pixelColor(x, y).rgb());
            }
        }
        return found;
    };
    for (const QColor &text : {QColor(Qt::white), QColor(Qt::black)}) {
        QPalette palette = dialog()->palette();
        palette.setColor(QPalette::ButtonText, text);
        dialog()->setPalette(palette);
        QTRY_COMPARE(colors(), QSet<QRgb>{text.rgb()});
    }
}

void tst_MenuDialogAssistance::takesBackWhatItTells()
{
    writeFolder(QString(), QStringLiteral("Menu"), "a.desktop;b.desktop;");
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    openAssisted(2);
    auto *button = dialog()->findChild<QPushButton *>(QStringLiteral("messageUndoButton"));
    QVERIFY(!button->isVisible());
    clickItem(menu() + QLatin1String("/b.desktop"));
    clickAction("upAction");
    QTRY_COMPARE(names(view(), menu()).join(QString()), QStringLiteral("BA"));
    QCOMPARE(message()->text(), QStringLiteral("B has another place."));
    QVERIFY(button->isVisible() && button->isEnabled());
    QCOMPARE(button->toolTip(), QStringLiteral("Undo reordering of B"));
    XDoTool::click(button);
    QTRY_COMPARE(names(view(), menu()).join(QString()), QStringLiteral("AB"));
    QVERIFY(!button->isEnabled());
    // A second click, out of habit, takes nothing else back.
    view().slotUp();
    view().slotDown();
    QTRY_VERIFY(button->isVisible());
    button->setFocus();
    XDoTool::press(QStringLiteral("space"));
    QTRY_VERIFY2(message()->text().startsWith(QLatin1String("Done: Undo ")), qPrintable(message()->text()));
    QVERIFY(!button->isVisible());
    QVERIFY(view().hasFocus());
    QVERIFY(view().undoAction()->isEnabled());
    view().redoAction()->trigger();
    QVERIFY(button->isVisible());
    view().undoAction()->trigger();
    view().undoAction()->trigger();
    QTRY_COMPARE(names(view(), menu()).join(QString()), QStringLiteral("AB"));
    // It does not offer to take back what it does not tell of.
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("R&D"));
    clickItem(menu() + QLatin1String("/b.desktop"));
    XDoTool::press(QStringLiteral("F5"));
    QTRY_COMPARE(names(view(), menu()).join(QString()), QStringLiteral("AR&D"));
    clickAction("upAction");
    QCOMPARE(view().undoAction()->text(), QStringLiteral("Undo reordering of R&&D"));
    QCOMPARE(button->toolTip(), QStringLiteral("Undo reordering of R&D"));
    filterEdit()->setText(QStringLiteral("nowhere"));
    QTRY_VERIFY(message()->text().startsWith(QLatin1String("Nothing in this menu")));
    QVERIFY(!button->isVisible());
}

void tst_MenuDialogAssistance::takesBackTheDonePartOfWhatFailed_data()
{
    QTest::addColumn<QString>("action");
    QTest::addColumn<QString>("note");
    QTest::addColumn<QString>("failure");
    QTest::newRow("delete") << "deleteAction"
                            << "A was deleted."
                            << "%1 cannot be deleted: Permission denied";
    QTest::newRow("hide") << "hideAction"
                          << "A is hidden: the menu no longer shows it."
                          << "'X' was not changed: the file %1 cannot be written.";
}

void tst_MenuDialogAssistance::takesBackTheDonePartOfWhatFailed()
{
    QFETCH(QString, action);
    QFETCH(QString, note);
    QFETCH(QString, failure);
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    const QString x = writeEntry(QStringLiteral("fixed/x.desktop"), QStringLiteral("X"));
    writeFolder(QString(), QStringLiteral("Menu"), "fixed;a.desktop;");
    const QByteArray bytes = read(a);
    openAssisted(2);
    QVERIFY(open(view(), QFileInfo(x).path(), 1));
    const QByteArray dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(folder()));
    const auto restored = qScopeGuard([&] { qputenv("XDG_DATA_HOME", dataHome); });
    const OrdinaryUser user(folder());
    clickItem(a);
    XDoTool::press(QStringLiteral("shift+Up"));
    QTRY_COMPARE(view().selectionModel()->selectedIndexes().size(), 2);

    const QList<QAction *> actions = view().findChild<QMenu *>()->actions();
    const auto wanted = std::find_if(actions.begin(), actions.end(), [&](const QAction *candidate) {
        return candidate->objectName() == action;
    });
    QVERIFY(wanted != actions.end());
    // After the selection: an item of a folder that is known to be locked is not deleted.
    QVERIFY(QFile::setPermissions(x, QFile::ReadOwner));
    QVERIFY(QFile::setPermissions(QFileInfo(x).path(), QFile::ReadOwner | QFile::ExeOwner));
    (*wanted)->trigger();

    QTRY_COMPARE(message()->text(), note + QLatin1Char('\n') + failure.arg(x));
    QVERIFY(dialog()->findChild<QLabel *>(QStringLiteral("messageIcon"))->isVisible());
    auto *button = dialog()->findChild<QPushButton *>(QStringLiteral("messageUndoButton"));
    QVERIFY(button->isVisible() && button->isEnabled());
    const auto isBack = [&] { return QFile::exists(a) && read(a) == bytes; };
    QVERIFY(!isBack());
    XDoTool::click(button);
    QTRY_VERIFY(isBack());
    QVERIFY2(message()->text().startsWith(QLatin1String("Done: Undo ")), qPrintable(message()->text()));
    // A failure of its own has nothing to take back.
    Q_EMIT view().told(QStringLiteral("Failed."), 2);
    QCOMPARE(message()->text(), QStringLiteral("Failed."));
    QVERIFY(!button->isVisible());
    QVERIFY(
        QFile::setPermissions(QFileInfo(x).path(), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
}

void tst_MenuDialogAssistance::leavesNothingBehind()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    openDialog(menu(), 1);
    const QStringList before = partsOf(dialog());
    dialog()->setAssistance(true);
    QVERIFY(partsOf(dialog()) != before);
    dialog()->setAssistance(false);
    QCOMPARE(partsOf(dialog()), before);
    QCOMPARE(qobject_cast<QVBoxLayout *>(dialog()->layout())->count(), 3);
    // The key asks for a text again.
    clickItem(menu() + QLatin1String("/a.desktop"));
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        // Before, the key would go to the dialog behind it.
        QVERIFY(QTest::qWaitForWindowActive(window));
        XDoTool::press(QStringLiteral("Escape"));
    });
    XDoTool::press(QStringLiteral("ctrl+f"));
    QTRY_VERIFY(modal.finished());
}

VEL_TEST_MAIN(tst_MenuDialogAssistance)
#include "tst_MenuDialogAssistance.moc"
