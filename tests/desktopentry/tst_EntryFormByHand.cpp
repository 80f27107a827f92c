// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDialogTestCase.h"
#include "FormDriving.h"
#include "XDoTool.h"

#include <VelDesktopEntryEditDialog.h>

#include <QComboBox>
#include <QFile>
#include <QLabel>
#include <QToolButton>
#include <QTreeView>

using namespace FormDriving;

/// The assisted entry editor under the hands of a user, from an empty form to the bytes on disk.
class tst_EntryFormByHand : public EntryDialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void makesAnEntryInThreeLanguages();
    void makesAnEntryForAProgramWithABlankInItsPath();
    void findsALanguageWithTheKeyboard();
    void undoesInTheTextBesideTheForm();

private:
    static constexpr int Patience = 20000;

    static void type(const QString &text) { XDoTool::run(QStringLiteral("type --delay 20 ") + text); }
    static void open(VelDesktopEntryEditDialog &dialog, const QString &path)
    {
        dialog.setAssistance(true);
        QVERIFY(dialog.setDesktopEntryPath(path, true));
        dialog.show();
        dialog.activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(&dialog, Patience));
    }
    // The field is in view: takes what stands first in its chooser when \a keys were typed.
    static void chooseFirst(QWidget *field, const QString &keys)
    {
        ModalDriver modal;
        modal.handle([keys](QWidget *window) {
            QVERIFY(QTest::qWaitForWindowActive(window, Patience));
            auto *view = child<QTreeView>(window, "choiceView");
            const int all = view->model()->rowCount();
            XDoTool::run(QStringLiteral("key ") + keys);
            QTRY_VERIFY_WITH_TIMEOUT(view->model()->rowCount() > 0 && view->model()->rowCount() != all,
                                     Patience);
            XDoTool::run(QStringLiteral("key Down space"));
            QTRY_COMPARE_WITH_TIMEOUT(view->model()->index(0, 0).data(Qt::CheckStateRole).toInt(),
                                      int(Qt::Checked), Patience);
            XDoTool::click(okButton(window));
            QTRY_VERIFY_WITH_TIMEOUT(!window->isVisible(), Patience);
        });
        const QString former = field->findChild<QLineEdit *>()->text();
        XDoTool::click(field->findChild<QLineEdit *>());
        QTRY_VERIFY_WITH_TIMEOUT(field->findChild<QLineEdit *>()->hasFocus(), Patience);
        XDoTool::run(QStringLiteral("key alt+Down"));
        QTRY_VERIFY_WITH_TIMEOUT(field->findChild<QLineEdit *>()->text() != former, Patience);
        QVERIFY(modal.finished());
    }
    static void addLanguage(QWidget &dialog, const QString &language)
    {
        ModalDriver modal;
        modal.handle([language](QWidget *window) {
            QVERIFY(QTest::qWaitForWindowActive(window, Patience));
            type(language);
            QTRY_VERIFY_WITH_TIMEOUT(okButton(window)->isEnabled(), Patience);
            QCOMPARE(child<QComboBox>(window, "newLanguageBox")->currentText(), language);
            XDoTool::click(okButton(window));
        });
        // What the box offers to complete; it would come again at the next letter.
        modal.handle([language](QWidget *popup) {
            const auto *box = child<QComboBox>(QApplication::activeModalWidget(), "newLanguageBox");
            QTRY_COMPARE_WITH_TIMEOUT(box->currentText(), language, Patience);
            popup->hide();
        });
        XDoTool::click(child<QToolButton>(&dialog, "newLanguageButton"));
        QTRY_COMPARE_WITH_TIMEOUT(languages(dialog)->currentData().toString(), language, Patience);
        QVERIFY(modal.finished());
        QVERIFY(QTest::qWaitForWindowActive(&dialog, Patience));
    }
    static QComboBox *languages(const QWidget &dialog) { return child<QComboBox>(&dialog, "languageBox"); }

    QByteArray m_path;
};

void tst_EntryFormByHand::init()
{
    EntryDialogTestCase::init();
    qputenv("LANG", "de_DE.UTF-8");
    m_path = qgetenv("PATH");
    const QString program =
        write(QStringLiteral("bin/vel-open"), "#!/bin/sh\ngrep -q '^Name\\[ja\\]=J' \"$2\"\n");
    QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))) + ':' + m_path);
}

void tst_EntryFormByHand::cleanup()
{
    qputenv("PATH", m_path);
    qputenv("LANG", "C.UTF-8");
    EntryDialogTestCase::cleanup();
}

void tst_EntryFormByHand::makesAnEntryInThreeLanguages()
{
    VelDesktopEntryEditDialog dialog;
    const QString file = path(QStringLiteral("new.desktop"));
    open(dialog, file);
    // The focus is in the name at once.
    type(QStringLiteral("Shell"));
    QTRY_COMPARE_WITH_TIMEOUT(line(&dialog, "nameEdit")->text(), QStringLiteral("Shell"), Patience);
    XDoTool::press(QStringLiteral("Tab"));
    type(QStringLiteral("Muschel"));
    QTRY_COMPARE_WITH_TIMEOUT(line(&dialog, "localNameEdit")->text(), QStringLiteral("Muschel"), Patience);

    addLanguage(dialog, QStringLiteral("ja"));
    XDoTool::click(line(&dialog, "otherNameEdit"));
    type(QStringLiteral("Japanese"));
    QTRY_COMPARE_WITH_TIMEOUT(line(&dialog, "otherNameEdit")->text(), QStringLiteral("Japanese"), Patience);

    XDoTool::click(child<QLineEdit>(child<QWidget>(&dialog, "execEdit"), "lineEdit"));
    type(QStringLiteral("/bin/sh"));
    XDoTool::click(child<QToolButton>(&dialog, "tryButton"));
    QTRY_VERIFY_WITH_TIMEOUT(child<QLabel>(&dialog, "tryLabel")->isVisible(), Patience);
    QCOMPARE(child<QLabel>(&dialog, "tryLabel")->text(),
             QStringLiteral("The entry was started (exit status 0)."));
    QVERIFY(!QFile::exists(file));

    XDoTool::click(okButton(&dialog));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isVisible(), Patience);
    QCOMPARE(
        read(file),
        QByteArray(
            "[Desktop "
            "Entry]\nType=Application\nName=Shell\nName[ja]=Japanese\nName[de]=Muschel\nExec=/bin/sh\n"));
}

void tst_EntryFormByHand::makesAnEntryForAProgramWithABlankInItsPath()
{
    const QString program = write(QStringLiteral("My Programs/paint"), "#!/bin/sh\n");
    QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    VelDesktopEntryEditDialog dialog;
    dialog.resize(760, 960);
    const QString file = path(QStringLiteral("new.desktop"));
    open(dialog, file);
    type(QStringLiteral("Paint"));
    QTRY_COMPARE_WITH_TIMEOUT(line(&dialog, "nameEdit")->text(), QStringLiteral("Paint"), Patience);

    auto *exec = child<QLineEdit>(child<QWidget>(&dialog, "execEdit"), "lineEdit");
    XDoTool::click(exec);
    const QStringList words = program.split(QLatin1Char(' '));
    type(words.constFirst());
    XDoTool::press(QStringLiteral("space"));
    type(words.constLast());
    QTRY_COMPARE_WITH_TIMEOUT(exec->text(), program, Patience);
    QTRY_VERIFY_WITH_TIMEOUT(dialog.findChild<QLabel *>(QStringLiteral("check_Exec")), Patience);
    auto *sentence = child<QLabel>(&dialog, "check_Exec");
    QTRY_COMPARE_WITH_TIMEOUT(
        sentence->text(), QStringLiteral("The path of the program has a blank: it has to stand in quotes."),
        Patience);
    auto *fix = child<QPushButton>(sentence->parentWidget(), "fixButton");
    QTRY_VERIFY_WITH_TIMEOUT(!fix->visibleRegion().isEmpty(), Patience);
    XDoTool::click(fix);
    const QString quoted = QLatin1Char('"') + program + QLatin1Char('"');
    QTRY_COMPARE_WITH_TIMEOUT(exec->text(), quoted, Patience);
    QTRY_VERIFY_WITH_TIMEOUT(!sentence->isVisible(), Patience);

    chooseFirst(child<QWidget>(&dialog, "categoriesEdit"), QStringLiteral("G r a p h i c s"));
    chooseFirst(child<QWidget>(&dialog, "categoriesEdit"), QStringLiteral("2 D G r a p h i c s"));
    chooseFirst(child<QWidget>(&dialog, "mimeTypeEdit"), QStringLiteral("i m a g e slash p n g"));

    XDoTool::click(line(&dialog, "localNameEdit"));
    XDoTool::press(QStringLiteral("ctrl+a"));
    type(QStringLiteral("Malen"));
    QTRY_COMPARE_WITH_TIMEOUT(line(&dialog, "localNameEdit")->text(), QStringLiteral("Malen"), Patience);
    addLanguage(dialog, QStringLiteral("ja"));
    XDoTool::click(line(&dialog, "otherNameEdit"));
    type(QStringLiteral("Japanese"));
    QTRY_COMPARE_WITH_TIMEOUT(line(&dialog, "otherNameEdit")->text(), QStringLiteral("Japanese"), Patience);
    XDoTool::click(child<QToolButton>(&dialog, "tryButton"));
    QTRY_COMPARE_WITH_TIMEOUT(child<QLabel>(&dialog, "tryLabel")->text(),
                              QStringLiteral("The entry was started (exit status 0)."), Patience);
    XDoTool::click(okButton(&dialog));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isVisible(), Patience);
    QCOMPARE(read(file),
             "[Desktop Entry]\nType=Application\nName=Paint\nName[ja]=Japanese\nName[de]=Malen\nExec="
                 + quoted.toUtf8() + "\nMimeType=image/png;\nCategories=Graphics;2DGraphics;\n");
}

void tst_EntryFormByHand::findsALanguageWithTheKeyboard()
{
    VelDesktopEntryEditDialog dialog;
    open(dialog, write(QStringLiteral("a.desktop"), plainApplication + "Name[fr]=Un\nName[pl]=Dwa\n"));
    XDoTool::press(QStringLiteral("alt+l"));
    QTRY_VERIFY_WITH_TIMEOUT(languages(dialog)->hasFocus(), Patience);
    XDoTool::press(QStringLiteral("Down"));
    QTRY_COMPARE_WITH_TIMEOUT(languages(dialog)->currentData().toString(), QStringLiteral("fr"), Patience);
    QCOMPARE(line(&dialog, "otherNameEdit")->text(), QStringLiteral("Un"));
    XDoTool::press(QStringLiteral("End"));
    QTRY_COMPARE_WITH_TIMEOUT(languages(dialog)->currentData().toString(), QStringLiteral("pl"), Patience);
    QCOMPARE(line(&dialog, "otherNameEdit")->text(), QStringLiteral("Dwa"));

    // From the name the Tab key comes to the name in that language.
    line(&dialog, "nameEdit")->setFocus();
    XDoTool::press(QStringLiteral("Tab"));
    QTRY_VERIFY_WITH_TIMEOUT(line(&dialog, "otherNameEdit")->hasFocus(), Patience);
}

void tst_EntryFormByHand::undoesInTheTextBesideTheForm()
{
    VelDesktopEntryEditDialog dialog;
    open(dialog, write(QStringLiteral("a.desktop"), plainApplication));
    line(&dialog, "commentEdit")->setFocus();
    type(QStringLiteral("Sure"));
    QTRY_COMPARE_WITH_TIMEOUT(line(&dialog, "commentEdit")->text(), QStringLiteral("Sure"), Patience);
    XDoTool::click(child<QToolButton>(&dialog, "textButton"));
    auto *changes = child<QLabel>(&dialog, "changesLabel");
    QVERIFY(QTest::qWaitForWindowActive(changes->window(), Patience));
    XDoTool::press(QStringLiteral("ctrl+z"));
    QTRY_COMPARE_WITH_TIMEOUT(line(&dialog, "commentEdit")->text(), QString(), Patience);
    QTRY_COMPARE_WITH_TIMEOUT(changes->text(), QStringLiteral("Nothing is changed."), Patience);
    XDoTool::press(QStringLiteral("Escape"));
    QTRY_VERIFY_WITH_TIMEOUT(!child<QToolButton>(&dialog, "textButton")->isChecked(), Patience);
    QVERIFY(dialog.isVisible());
}

VEL_TEST_MAIN(tst_EntryFormByHand)

#include "tst_EntryFormByHand.moc"
