// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"
#include "XDoTool.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/ActionListEdit.h>
#include <desktopentry/EditActionsWidget.h>
#include <desktopentry/EntryFormAssistance.h>
#include <desktopentry/FieldEdit.h>
#include <desktopentry/FormHistory.h>
#include <desktopentry/IconEdit.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>
#include <desktopentry/VelDesktopEntryPropsWidgetPrivate.h>

#include <QAction>
#include <QCheckBox>
#include <QComboBox>
#include <QMenu>
#include <QRadioButton>
#include <QRandomGenerator>
#include <QSignalSpy>
#include <QToolButton>

using namespace FormDriving;
using namespace VelUI;

/// What was done in the assisted form is taken back and done again, with the keys.
class tst_EntryFormHistory : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void takesBackWordsByTheKeys();
    void takesBackAcrossFields();
    void takesTheTiedNameBackToo();
    void takesBackEveryKindOfField_data();
    void takesBackEveryKindOfField();
    void takesBackTheActions();
    void takesBackAChangeOfType();
    void takesBackTheChoiceOfDesktops();
    void takesBackInTheLanguageItWasTypedIn();
    void takesBackWhatAButtonDid();
    void takesBackACopiedEntry();
    void forgetsEverythingWithAnotherEntry();
    void isUnmodifiedWhenAllIsTakenBack();
    void worksWhereverTheDialogHasTheFocus();
    void hasTheFormsHistoryInTheMenuOfALine();
    void leavesLinesTheirOwnHistoryWithoutAssistance();
    void takesNothingBackWhereNothingCanBeEdited();
    void takesBackWhateverWasDone_data();
    void takesBackWhateverWasDone();

private:
    const QByteArray m_bytes =
        "[Desktop Entry]\nType=Application\nName=Editor\nName[de]=Editor\nName[fr]=Editeur\n"
        "Comment=Edits\nExec=/bin/sh\nActions=one;\n\n[Desktop Action one]\nName=One\nExec=one\n";

    static QLineEdit *line(const QWidget &form, const char *name) { return child<QLineEdit>(&form, name); }
    static EntryFormAssistance &assistance(VelDesktopEntryPropsWidget &form)
    {
        return *VelDesktopEntryPropsWidgetPrivate::of(form).assistance;
    }
    static void undo(VelDesktopEntryPropsWidget &form) { assistance(form).history().undoAction()->trigger(); }
    static void redo(VelDesktopEntryPropsWidget &form) { assistance(form).history().redoAction()->trigger(); }
    QByteArray text(VelDesktopEntryPropsWidget &form) { return assistance(form).record().contents(); }
    void openDialog(VelDesktopEntryEditDialog &dialog)
    {
        dialog.setAssistance(true);
        QVERIFY(dialog.setDesktopEntryPath(write(QStringLiteral("entry.desktop"), m_bytes)));
        dialog.show();
        dialog.activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(&dialog, 20000));
    }
};

void tst_EntryFormHistory::takesBackWordsByTheKeys()
{
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog);
    QLineEdit *comment = line(dialog, "commentEdit");
    comment->setFocus();
    for (const char *keys : {"key ctrl+a type two", "key space type words"})
        XDoTool::run(QString::fromLatin1(keys));
    QTRY_COMPARE_WITH_TIMEOUT(comment->text(), QStringLiteral("two words"), 20000);
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE_WITH_TIMEOUT(comment->text(), QStringLiteral("two "), 20000);
    QCOMPARE(comment->cursorPosition(), 4);
    XDoTool::press(QStringLiteral("ctrl+shift+z"));
    QTRY_COMPARE_WITH_TIMEOUT(comment->text(), QStringLiteral("two words"), 20000);
    XDoTool::run(QStringLiteral("key ctrl+z key ctrl+z key ctrl+z"));
    QTRY_COMPARE_WITH_TIMEOUT(comment->text(), QStringLiteral("Edits"), 20000);
    // A line on its own would go on with what it remembers.
    XDoTool::press(QStringLiteral("ctrl+z"));
    XDoTool::run(QStringLiteral("key End type x"));
    QTRY_COMPARE_WITH_TIMEOUT(comment->text(), QStringLiteral("Editsx"), 20000);
}

void tst_EntryFormHistory::takesBackAcrossFields()
{
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog);
    QLineEdit *comment = line(dialog, "commentEdit");
    QLineEdit *generic = line(dialog, "genericNameEdit");
    comment->setFocus();
    XDoTool::run(QStringLiteral("key End type a"));
    QTRY_COMPARE_WITH_TIMEOUT(comment->text(), QStringLiteral("Editsa"), 20000);
    generic->setFocus();
    XDoTool::run(QStringLiteral("type b"));
    QTRY_COMPARE_WITH_TIMEOUT(generic->text(), QStringLiteral("b"), 20000);
    XDoTool::run(QStringLiteral("key ctrl+z key ctrl+z"));
    QTRY_COMPARE_WITH_TIMEOUT(comment->text(), QStringLiteral("Edits"), 20000);
    QCOMPARE(generic->text(), QString());
    QVERIFY(comment->hasFocus());
    XDoTool::run(QStringLiteral("key ctrl+shift+z key ctrl+shift+z"));
    QTRY_COMPARE_WITH_TIMEOUT(generic->text(), QStringLiteral("b"), 20000);
    QCOMPARE(comment->text(), QStringLiteral("Editsa"));
    QVERIFY(generic->hasFocus());
}

void tst_EntryFormHistory::takesTheTiedNameBackToo()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    QTest::keyClicks(line(form, "nameEdit"), QStringLiteral("AB"));
    QCOMPARE(line(form, "localNameEdit")->text(), QStringLiteral("ABEditor"));
    undo(form);
    QCOMPARE(line(form, "nameEdit")->text(), QStringLiteral("Editor"));
    QCOMPARE(line(form, "localNameEdit")->text(), QStringLiteral("Editor"));
    // Still tied.
    QTest::keyClicks(line(form, "nameEdit"), QStringLiteral("C"));
    QCOMPARE(line(form, "localNameEdit")->text(), line(form, "nameEdit")->text());
    undo(form);
    redo(form);
    QVERIFY(line(form, "nameEdit")->text().contains(QLatin1Char('C')));
}

void tst_EntryFormHistory::takesBackEveryKindOfField_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<QVariant>("value");

    QTest::newRow("line") << QStringLiteral("Version") << QVariant(QStringLiteral("1.5"));
    QTest::newRow("path") << QStringLiteral("Exec") << QVariant(QStringLiteral("other"));
    QTest::newRow("icon") << QStringLiteral("Icon") << QVariant(QStringLiteral("other"));
    QTest::newRow("box") << QStringLiteral("Terminal") << QVariant(true);
    QTest::newRow("list") << QStringLiteral("Categories") << QVariant(QStringList{QStringLiteral("Qt")});
    QTest::newRow("emptied") << QStringLiteral("Comment") << QVariant(QString());
}

void tst_EntryFormHistory::takesBackEveryKindOfField()
{
    QFETCH(QString, key);
    QFETCH(QVariant, value);
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    QVERIFY(!assistance(form).history().undoAction()->isEnabled());
    assistance(form).edit(*assistance(form).row(key), value);
    const QByteArray after = text(form);
    QVERIFY(after != m_bytes);
    const QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    undo(form);
    QCOMPARE(text(form), m_bytes);
    QVERIFY(!changed.isEmpty());
    QVERIFY(!assistance(form).history().undoAction()->isEnabled());
    redo(form);
    QCOMPARE(text(form), after);
    QVERIFY(!assistance(form).history().redoAction()->isEnabled());
}

void tst_EntryFormHistory::takesBackTheActions()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    assistance(form).edit(*assistance(form).row(QStringLiteral("Actions")),
                          QVariant::fromValue(QList<VelUIDesktopAction>()));
    QVERIFY(!text(form).contains("Desktop Action"));
    undo(form);
    QCOMPARE(text(form), m_bytes);
    redo(form);
    QVERIFY(!text(form).contains("Desktop Action"));
}

void tst_EntryFormHistory::takesBackAChangeOfType()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    ModalDriver modal;
    modal.handle([](QWidget *box) { QTest::keyClick(box, Qt::Key_Return); });
    chooseType(form, link);
    QVERIFY(modal.finished());
    QVERIFY(text(form).contains("Type=Link"));
    retype(line(form, "urlEdit"), QStringLiteral("x"));
    undo(form);
    undo(form);
    QCOMPARE(text(form), m_bytes);
    QVERIFY(shownRows(form).contains(QStringLiteral("Exec:*")));
    QVERIFY(!assistance(form).history().undoAction()->isEnabled());
    redo(form);
    QVERIFY(text(form).contains("Type=Link"));
    QVERIFY(shownRows(form).contains(QStringLiteral("Url:*")));
    redo(form);
    QVERIFY(text(form).contains("URL=x"));
}

void tst_EntryFormHistory::takesBackTheChoiceOfDesktops()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    click(child<QRadioButton>(&form, "notShowInButton"));
    QVERIFY(child<QRadioButton>(&form, "notShowInButton")->isChecked());
    undo(form);
    QVERIFY(child<QRadioButton>(&form, "onlyShowInButton")->isChecked());
    redo(form);
    QVERIFY(child<QRadioButton>(&form, "notShowInButton")->isChecked());
}

void tst_EntryFormHistory::takesBackInTheLanguageItWasTypedIn()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    auto *box = child<QComboBox>(&form, "languageBox");
    box->setCurrentIndex(box->findData(QStringLiteral("fr")));
    QVERIFY(!assistance(form).history().undoAction()->isEnabled());
    QTest::keyClicks(line(form, "otherNameEdit"), QStringLiteral("xy"));
    box->setCurrentIndex(0);
    retype(line(form, "localNameEdit"), QStringLiteral("zz"));
    const QByteArray after = text(form);
    QVERIFY(after.contains("[fr]=xyEditeur") && after.contains("[de]=zz"));

    undo(form);
    undo(form);
    QVERIFY(text(form).contains("[de]=Editor"));
    QCOMPARE(box->currentIndex(), 0);
    undo(form);
    QCOMPARE(text(form), m_bytes);
    QCOMPARE(box->currentData().toString(), QStringLiteral("fr"));
    QCOMPARE(line(form, "otherNameEdit")->text(), QStringLiteral("Editeur"));
    for (int i = 0; i < 3; ++i)
        redo(form);
    QCOMPARE(text(form), after);
    QCOMPARE(box->currentIndex(), 0);
}

void tst_EntryFormHistory::takesBackWhatAButtonDid()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    const FormRow &row = *assistance(form).row(QStringLiteral("Comment"));
    QTest::keyClicks(row.field, QStringLiteral("a"));
    // One character, as if it had been typed.
    assistance(form).edit(row, QStringLiteral("abEdits"));
    QTest::keyClicks(row.field, QStringLiteral("c"));
    undo(form);
    QCOMPARE(line(form, "commentEdit")->text(), QStringLiteral("abEdits"));
    undo(form);
    QCOMPARE(line(form, "commentEdit")->text(), QStringLiteral("aEdits"));
    QCOMPARE(assistance(form).history().undoAction()->text(), QStringLiteral("Undo change of Comment"));
}

void tst_EntryFormHistory::takesBackACopiedEntry()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    VelDesktopEntryPropsWidgetPrivate &parts = VelDesktopEntryPropsWidgetPrivate::of(form);
    parts.recordToChange = [this] { return entry(m_bytes); };
    parts.isCopying = true;
    form.loadFrom(
        entry("[Desktop Entry]\nType=Application\nName=Other\nExec=other\n", QStringLiteral("o.desktop")));
    parts.isCopying = false;
    QCOMPARE(line(form, "nameEdit")->text(), QStringLiteral("Other"));
    undo(form);
    QCOMPARE(line(form, "nameEdit")->text(), QStringLiteral("Editor"));
    QCOMPARE(child<PathEdit>(&form, "execEdit")->text(), QStringLiteral("/bin/sh"));
    QVERIFY(!assistance(form).history().undoAction()->isEnabled());
}

void tst_EntryFormHistory::forgetsEverythingWithAnotherEntry()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    QTest::keyClicks(line(form, "commentEdit"), QStringLiteral("a"));
    form.loadFrom(entry(m_bytes));
    QVERIFY(!assistance(form).history().undoAction()->isEnabled());
    form.setType(link, {});
    QVERIFY(!assistance(form).history().undoAction()->isEnabled());
}

void tst_EntryFormHistory::isUnmodifiedWhenAllIsTakenBack()
{
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog);
    QVERIFY(!dialog.isWindowModified());
    line(dialog, "commentEdit")->setFocus();
    XDoTool::run(QStringLiteral("key End type a"));
    QTRY_VERIFY_WITH_TIMEOUT(dialog.isWindowModified(), 20000);
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isWindowModified(), 20000);
    XDoTool::press(QStringLiteral("ctrl+shift+z"));
    QTRY_VERIFY_WITH_TIMEOUT(dialog.isWindowModified(), 20000);
}

void tst_EntryFormHistory::worksWhereverTheDialogHasTheFocus()
{
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog);
    auto *terminal = child<QCheckBox>(&dialog, "terminalCheckBox");
    terminal->setFocus();
    XDoTool::press(QStringLiteral("space"));
    QTRY_VERIFY_WITH_TIMEOUT(terminal->isChecked(), 20000);
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_VERIFY_WITH_TIMEOUT(!terminal->isChecked(), 20000);
    okButton(&dialog)->setFocus();
    XDoTool::press(QStringLiteral("ctrl+shift+z"));
    QTRY_VERIFY_WITH_TIMEOUT(terminal->isChecked(), 20000);
    XDoTool::click(child<QToolButton>(&dialog, "undoButton"));
    QTRY_VERIFY_WITH_TIMEOUT(!terminal->isChecked(), 20000);
}

void tst_EntryFormHistory::hasTheFormsHistoryInTheMenuOfALine()
{
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog);
    QLineEdit *generic = line(dialog, "genericNameEdit");
    generic->setFocus();
    XDoTool::run(QStringLiteral("type ab"));
    QTRY_COMPARE_WITH_TIMEOUT(generic->text(), QStringLiteral("ab"), 20000);
    const FormHistory &history =
        VelDesktopEntryPropsWidgetPrivate::of(*dialog.findChild<VelDesktopEntryPropsWidget *>())
            .assistance->history();
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        auto *menu = qobject_cast<QMenu *>(window);
        QVERIFY(menu);
        QCOMPARE(menu->actions().constFirst(), history.undoAction());
        XDoTool::run(QStringLiteral("key Down key Return"));
    });
    XDoTool::press(QStringLiteral("Menu"));
    QTRY_COMPARE_WITH_TIMEOUT(generic->text(), QString(), 20000);
    QVERIFY(modal.finished());
}

void tst_EntryFormHistory::leavesLinesTheirOwnHistoryWithoutAssistance()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    form.setAssistance(false);
    form.show();
    QLineEdit *comment = line(form, "commentEdit");
    QTest::keyClicks(comment, QStringLiteral("a"));
    QTest::keySequence(comment, QKeySequence::Undo);
    QCOMPARE(comment->text(), QStringLiteral("Edits"));
}

void tst_EntryFormHistory::takesNothingBackWhereNothingCanBeEdited()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    QTest::keyClicks(line(form, "commentEdit"), QStringLiteral("a"));
    form.setReadOnly(true);
    undo(form);
    QCOMPARE(line(form, "commentEdit")->text(), QStringLiteral("aEdits"));
    form.setReadOnly(false);
    undo(form);
    QCOMPARE(line(form, "commentEdit")->text(), QStringLiteral("Edits"));
}

void tst_EntryFormHistory::takesBackWhateverWasDone_data()
{
    QTest::addColumn<quint32>("seed");
    for (quint32 seed = 1; seed <= 20; ++seed)
        QTest::addRow("seed %u", seed) << seed;
}

// Types, sets, turns and goes to and fro at random; at the ends stand the same bytes again.
void tst_EntryFormHistory::takesBackWhateverWasDone()
{
    QFETCH(quint32, seed);
    QRandomGenerator random(seed);
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    const FormHistory &history = assistance(form).history();
    const QString texts[] = {QString(), QStringLiteral("word"), QStringLiteral("two words"),
                             QString::fromUtf8("\xC3\xA4;%")};
    for (int i = 0; i < 60; ++i) {
        const auto &rows = assistance(form).rows();
        const FormRow row = rows.at(random.bounded(rows.size()));
        switch (random.bounded(8)) {
        case 0:
            undo(form);
            break;
        case 1:
            redo(form);
            break;
        case 2:
            child<QComboBox>(&form, "languageBox")->setCurrentIndex(random.bounded(2));
            break;
        case 3: {
            const QString type = QStringList{application, link, directory}.at(random.bounded(3));
            if (typeBox(form)->currentData() == type)
                break;
            ModalDriver modal;
            modal.handle([](QWidget *box) { QTest::keyClick(box, Qt::Key_Return); });
            chooseType(form, type);
            QVERIFY(modal.finished());
            break;
        }
        default:
            if (!assistance(form).isShown(row))
                break;
            if (qobject_cast<QLineEdit *>(row.field) && random.bounded(2))
                QTest::keyClicks(row.field, texts[random.bounded(3)].left(5));
            else if (FieldEdit::value(row.field).userType() == QMetaType::QString)
                FieldEdit::setValue(row.field, texts[random.bounded(4)]);
            else if (FieldEdit::value(row.field).userType() == QMetaType::Bool)
                FieldEdit::setValue(row.field, bool(random.bounded(2)));
            else if (FieldEdit::value(row.field).userType() == QMetaType::QStringList)
                FieldEdit::setValue(row.field, QStringList{texts[1 + random.bounded(2)]});
        }
    }
    while (history.redoAction()->isEnabled())
        redo(form);
    const QByteArray last = text(form);
    while (history.undoAction()->isEnabled())
        undo(form);
    QCOMPARE(text(form), m_bytes);
    while (history.redoAction()->isEnabled())
        redo(form);
    QCOMPARE(text(form), last);
}

VEL_TEST_MAIN(tst_EntryFormHistory)

#include "tst_EntryFormHistory.moc"
