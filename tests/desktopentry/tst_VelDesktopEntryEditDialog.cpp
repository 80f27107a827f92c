// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDialogTestCase.h"
#include "EntrySamples.h"
#include "FormDriving.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/PathEdit.h>

#include <QComboBox>
#include <QDir>
#include <QSettings>
#include <QVBoxLayout>

using namespace FormDriving;

/// The dialog itself: what it shows, which file it opens, its help.
class tst_VelDesktopEntryEditDialog : public EntryDialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void laysOutTheFormAboveTheButtons();
    void remembersItsSize();
    void readsASizeThatIsNoNumberAsNothing();
    void refusesAMissingFile();
    void saysThatAFileIsNoEntry_data();
    void saysThatAFileIsNoEntry();
    void saysThatATemplateIsNoEntry();
    void leavesTheFormWhenAFileIsRefused();
    void makesANewEntry_data();
    void makesANewEntry();
    void namesTheFileInTheTitle();
    void takesTheValuesOfATemplate();
    void takesOnlyWhatTheEntryLacksFromATemplate();
    void warnsOfATemplateThatCannotBeRead();
    void makesAnApplicationOfATemplateOfALink();
    void opensWithTheNameSelected();
    void marksTheTitleAfterTheFirstChange();
    void marksAChangeWithoutAPlaceInTheTitle();
    void showsTheHelp();
    void helpsOnF1();
    void doesNothingWithoutTheForm();
};

void tst_VelDesktopEntryEditDialog::laysOutTheFormAboveTheButtons()
{
    VelDesktopEntryEditDialog dialog;
    auto *layout = qobject_cast<QVBoxLayout *>(dialog.layout());
    QVERIFY(layout);
    QVERIFY(qobject_cast<VelDesktopEntryPropsWidget *>(layout->itemAt(0)->widget()));
    auto *box = qobject_cast<QDialogButtonBox *>(layout->itemAt(1)->widget());
    QVERIFY(box);
    QCOMPARE(box->orientation(), Qt::Horizontal);
    QCOMPARE(box->standardButtons(),
             QDialogButtonBox::Ok | QDialogButtonBox::Cancel | QDialogButtonBox::Help);
    auto *copyButton = child<QPushButton>(&dialog, "copyButton");
    QCOMPARE(copyButton->text(), QStringLiteral("Copy from..."));
    QCOMPARE(box->buttonRole(copyButton), QDialogButtonBox::ResetRole);
    QCOMPARE(box->button(QDialogButtonBox::Help)->shortcut(), QKeySequence(QStringLiteral("F1")));
    QCOMPARE(dialog.size(), QSize(560, 440));
}

void tst_VelDesktopEntryEditDialog::remembersItsSize()
{
    {
        VelDesktopEntryEditDialog dialog;
        dialog.resize(700, 500);
    }
    QCOMPARE(QSettings().value(QStringLiteral("/VelMimeTypesSelectDialog/Width")).toInt(), 700);
    QCOMPARE(QSettings().value(QStringLiteral("/VelMimeTypesSelectDialog/Height")).toInt(), 500);
    VelDesktopEntryEditDialog dialog;
    QCOMPARE(dialog.size(), QSize(700, 500));
}

void tst_VelDesktopEntryEditDialog::readsASizeThatIsNoNumberAsNothing()
{
    QSettings().setValue(QStringLiteral("/VelMimeTypesSelectDialog/Width"), QStringLiteral("wide"));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.width() < 560);
}

void tst_VelDesktopEntryEditDialog::refusesAMissingFile()
{
    VelDesktopEntryEditDialog dialog;
    const QString missing = path(QStringLiteral("missing.desktop"));
    ModalDriver modal;
    modal.answer(warning(QStringLiteral("Can't load file ") + missing), QMessageBox::Ok);
    QVERIFY(!dialog.setDesktopEntryPath(missing));
    QVERIFY(modal.finished());
}

void tst_VelDesktopEntryEditDialog::saysThatAFileIsNoEntry_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<bool>("create");
    for (const bool create : {false, true}) {
        const char *const how = create ? " (create)" : "";
        QTest::addRow("text%s", how) << QByteArray("Dear diary\n") << create;
        QTest::addRow("nothing%s", how) << QByteArray() << create;
        QTest::addRow("bytes%s", how) << QByteArray("\x7f\x45LF\0\1", 6) << create;
        QTest::addRow("another group%s", how) << QByteArray("[Other Entry]\nName=a\n") << create;
    }
}

void tst_VelDesktopEntryEditDialog::saysThatAFileIsNoEntry()
{
    QFETCH(QByteArray, bytes);
    QFETCH(bool, create);
    VelDesktopEntryEditDialog dialog;
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    ModalDriver modal;
    modal.answer(
        warning(
            QStringLiteral("The file %1 is not a desktop entry: it has no group [Desktop Entry].").arg(file)),
        QMessageBox::Ok);
    QVERIFY(dialog.setDesktopEntryPath(file, create));
    QVERIFY(modal.finished());
    QVERIFY(dialog.windowTitle().contains(file));
    QCOMPARE(read(file), bytes);
}

void tst_VelDesktopEntryEditDialog::saysThatATemplateIsNoEntry()
{
    VelDesktopEntryEditDialog dialog;
    const QString pattern = write(QStringLiteral("pattern"), "Name=a\n");
    ModalDriver modal;
    modal.answer(
        warning(QStringLiteral("The file %1 is not a desktop entry: it has no group [Desktop Entry].")
                    .arg(pattern)),
        QMessageBox::Ok);
    QVERIFY(dialog.setDesktopEntryPath(path(QStringLiteral("a.desktop")), true, pattern));
    QVERIFY(modal.finished());
}

void tst_VelDesktopEntryEditDialog::leavesTheFormWhenAFileIsRefused()
{
    VelDesktopEntryEditDialog dialog;
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    QVERIFY(dialog.setDesktopEntryPath(file));
    const QString title = dialog.windowTitle();
    const QString broken = path(QStringLiteral("folder.desktop"));
    QVERIFY(QDir().mkdir(broken));
    {
        ModalDriver modal;
        modal.answer(warning(QStringLiteral("Can't load file ") + broken), QMessageBox::Ok);
        QVERIFY(!dialog.setDesktopEntryPath(broken, false));
        QVERIFY(modal.finished());
    }
    QCOMPARE(dialog.windowTitle(), title);
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Plain"));
    line(&dialog, "nameEdit")->setText(QStringLiteral("New"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QVERIFY(read(file).contains("Name=New\n"));
}

void tst_VelDesktopEntryEditDialog::makesANewEntry_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QStringList>("types");
    const QString application = QStringLiteral("Application"), link = QStringLiteral("Link"),
                  directory = QStringLiteral("Directory");
    QTest::newRow("folder") << QStringLiteral(".directory") << QStringList{directory};
    QTest::newRow("entry") << QStringLiteral("a.desktop") << QStringList{application, link};
    QTest::newRow("other case") << QStringLiteral("a.Desktop") << QStringList{application, link, directory};
    QTest::newRow("other name") << QStringLiteral("a.txt") << QStringList{application, link, directory};
    QTest::newRow("no folder file") << QStringLiteral("x.directory")
                                    << QStringList{application, link, directory};
}

void tst_VelDesktopEntryEditDialog::makesANewEntry()
{
    QFETCH(QString, file);
    QFETCH(QStringList, types);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(path(file), true));
    auto *box = child<QComboBox>(&dialog, "typeComboBox");
    QStringList shown;
    for (int i = 0; i < box->count(); ++i)
        shown.append(box->itemData(i).toString());
    QCOMPARE(shown, types);
    QCOMPARE(type(&dialog), types.constFirst());
    QVERIFY(!QFile::exists(path(file)));
}

void tst_VelDesktopEntryEditDialog::namesTheFileInTheTitle()
{
    VelDesktopEntryEditDialog dialog;
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    QVERIFY(dialog.setDesktopEntryPath(file, true));
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Desktop Entry Editor - ") + file + QStringLiteral("[*]"));
}

void tst_VelDesktopEntryEditDialog::takesTheValuesOfATemplate()
{
    VelDesktopEntryEditDialog dialog;
    const QString pattern = write(QStringLiteral("pattern"), EntrySamples::fullApplication());
    const QString file = path(QStringLiteral("new.desktop"));
    QVERIFY(dialog.setDesktopEntryPath(file, true, pattern));
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Full"));
    QCOMPARE(child<VelUI::PathEdit>(&dialog, "execEdit")->text(), QStringLiteral("/bin/sh -c true %u"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    const QByteArray bytes = read(file);
    QVERIFY(bytes.startsWith("[Desktop Entry]\nType=Application\nName=Full\n"));
    QVERIFY(bytes.contains("\nExec=/bin/sh -c true %u\n"));
    QVERIFY(bytes.contains("[Desktop Action new]\n"));
    // Only what the form shows.
    for (const char *other : {"X-Vendor-Key", "[X-Group]", "Plein", "# A comment"})
        QVERIFY2(!bytes.contains(other), other);
    QCOMPARE(read(pattern), EntrySamples::fullApplication());
}

void tst_VelDesktopEntryEditDialog::takesOnlyWhatTheEntryLacksFromATemplate()
{
    VelDesktopEntryEditDialog dialog;
    const QString pattern = write(QStringLiteral("pattern"), EntrySamples::fullApplication());
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    QVERIFY(dialog.setDesktopEntryPath(file, false, pattern));
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Plain"));
    QCOMPARE(line(&dialog, "commentEdit")->text(), QStringLiteral("Does all"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QVERIFY(read(file).startsWith(plainApplication));
    QVERIFY(read(file).contains("Comment=Does all\n"));
    QVERIFY(!read(file).contains("X-Vendor-Key"));
}

void tst_VelDesktopEntryEditDialog::warnsOfATemplateThatCannotBeRead()
{
    VelDesktopEntryEditDialog dialog;
    const QString pattern = path(QStringLiteral("no pattern"));
    ModalDriver modal;
    modal.answer(warning(QStringLiteral("Can't load file ") + pattern), QMessageBox::Ok);
    QVERIFY(dialog.setDesktopEntryPath(path(QStringLiteral("new.desktop")), true, pattern));
    QVERIFY(modal.finished());
    QCOMPARE(line(&dialog, "nameEdit")->text(), QString());
    QVERIFY(dialog.windowTitle().contains(QLatin1String("new.desktop")));
}

void tst_VelDesktopEntryEditDialog::makesAnApplicationOfATemplateOfALink()
{
    VelDesktopEntryEditDialog dialog;
    const QString pattern = write(QStringLiteral("pattern"), EntrySamples::link());
    QVERIFY(dialog.setDesktopEntryPath(path(QStringLiteral("new.desktop")), true, pattern));
    QCOMPARE(type(&dialog), QStringLiteral("Application"));
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Page"));
    QCOMPARE(line(&dialog, "urlEdit")->text(), QString());
}

void tst_VelDesktopEntryEditDialog::opensWithTheNameSelected()
{
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(write(QStringLiteral("a.desktop"), plainApplication)));
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QLineEdit *name = line(&dialog, "nameEdit");
    QCOMPARE(QApplication::focusWidget(), name);
    QCOMPARE(name->selectedText(), name->text());
    QTest::keyClick(name, Qt::Key_Tab, Qt::ShiftModifier);
    QCOMPARE(QApplication::focusWidget(), child<QComboBox>(&dialog, "typeComboBox"));
}

void tst_VelDesktopEntryEditDialog::marksTheTitleAfterTheFirstChange()
{
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(write(QStringLiteral("a.desktop"), plainApplication)));
    QVERIFY(!dialog.isWindowModified());
    QTest::keyClicks(line(&dialog, "commentEdit"), QStringLiteral("x"));
    QVERIFY(dialog.isWindowModified());
}

void tst_VelDesktopEntryEditDialog::marksAChangeWithoutAPlaceInTheTitle()
{
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(write(QStringLiteral("a.desktop"), plainApplication)));
    dialog.setWindowTitle(QStringLiteral("Of the caller"));
    QTest::keyClicks(line(&dialog, "commentEdit"), QStringLiteral("x"));
    QVERIFY(dialog.isWindowModified());
}

void tst_VelDesktopEntryEditDialog::showsTheHelp()
{
    VelDesktopEntryEditDialog dialog;
    ModalDriver modal;
    modal.handle([&dialog](QWidget *window) {
        auto *box = qobject_cast<QMessageBox *>(window);
        QVERIFY(box);
        QCOMPARE(box->parentWidget(), &dialog);
        QCOMPARE(box->windowTitle(), QStringLiteral("Help"));
        QCOMPARE(box->icon(), QMessageBox::Information);
        QCOMPARE(box->standardButtons(), QMessageBox::Close);
        QCOMPARE(box->textFormat(), Qt::RichText);
        QVERIFY(box->text().startsWith(QLatin1String(
            "<b>Desktop entry</b> is a multipurpose info file for installed apps, devices, etc. "
            "It can be used to build menu entries, shortcuts, etc.")));
        QVERIFY(box->text().contains(QLatin1String("'Desktop Entry Standard'")));
        QVERIFY(box->text().contains(QLatin1String("https://www.freedesktop.org")));
        QVERIFY(box->text().endsWith(QLatin1String(
            "<br><br>Desktop entry file is a text ini-like file with one main section [Desktop Entry] and "
            "possible additional sections for each action defined in the main section field 'Actions'. "
            "All fields are text string pairs: key=value. Value can also be a semicolon separated string "
            "list.")));
        box->button(QMessageBox::Close)->click();
    });
    click(dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Help));
    QVERIFY(modal.finished());
}

void tst_VelDesktopEntryEditDialog::helpsOnF1()
{
    VelDesktopEntryEditDialog dialog;
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QCOMPARE(window->windowTitle(), QStringLiteral("Help"));
        QTest::keyClick(window, Qt::Key_Escape);
    });
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_F1);
    QTRY_VERIFY(modal.finished()); // the button is pressed for a moment
}

void tst_VelDesktopEntryEditDialog::doesNothingWithoutTheForm()
{
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    VelDesktopEntryEditDialog dialog;
    delete dialog.findChild<VelDesktopEntryPropsWidget *>();
    QVERIFY(!dialog.setDesktopEntryPath(file));
    QVERIFY(!dialog.setDesktopEntryPath(path(QStringLiteral("missing.desktop"))));
    dialog.setDesktopEntryCoords(1, 2);
    click(child<QPushButton>(&dialog, "copyButton"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(read(file), plainApplication);
}

VEL_TEST_MAIN(tst_VelDesktopEntryEditDialog)

#include "tst_VelDesktopEntryEditDialog.moc"
