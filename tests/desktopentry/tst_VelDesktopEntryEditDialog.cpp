// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntrySamples.h"
#include "FormDriving.h"
#include "TestCase.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <VelMenuDialog.h>
#include <VelMenuView.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>
#include <frame/DesktopEntryRecord.h>
#include <velcore/dirs.h>
#include <velintegration/desktopitems.h>

#include <QCheckBox>
#include <QComboBox>
#include <QDir>
#include <QFileInfo>
#include <QRadioButton>
#include <QSettings>
#include <QVBoxLayout>

using namespace FormDriving;

namespace {

ModalDriver::Box warning(const QString &text)
{
    return {QMessageBox::Warning, QStringLiteral("Warning"), text, QMessageBox::Ok, QMessageBox::NoButton};
}

const QByteArray plainApplication = "[Desktop Entry]\nType=Application\nName=Plain\nExec=/bin/sh\n";

QLineEdit *line(const QWidget *dialog, const char *name)
{
    return child<QLineEdit>(dialog, name);
}

// Presses Ok in a dialog that runs; the result of its loop.
int runAndPressOk(VelDesktopEntryEditDialog &dialog)
{
    ModalDriver modal;
    modal.handle([](QWidget *window) { click(okButton(window)); });
    return dialog.exec();
}

QString type(const QWidget *dialog)
{
    return child<QComboBox>(dialog, "typeComboBox")->currentData().toString();
}

} // namespace

class tst_VelDesktopEntryEditDialog : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void laysOutTheFormAboveTheButtons();
    void remembersItsSize();
    void readsASizeThatIsNoNumberAsNothing();
    void refusesAMissingFile();
    void leavesTheFormWhenAFileIsRefused();
    void makesANewEntry_data();
    void makesANewEntry();
    void namesTheFileInTheTitle();
    void takesTheValuesOfATemplate();
    void takesOnlyWhatTheEntryLacksFromATemplate();
    void warnsOfATemplateThatCannotBeRead();
    void makesAnApplicationOfATemplateOfALink();
    void marksTheTitleAfterTheFirstChange();
    void marksAChangeWithoutAPlaceInTheTitle();
    void refusesAnUnsuitableEntry_data();
    void refusesAnUnsuitableEntry();
    void acceptsTheCorrectedEntry();
    void warnsOfAHiddenEntryAndSaves_data();
    void warnsOfAHiddenEntryAndSaves();
    void staysOpenWhenTheFileCannotBeSaved();
    void leavesAnUntouchedFileAlone_data();
    void leavesAnUntouchedFileAlone();
    void changesOneLineOnly();
    void keepsTheSortOrderOfAFolder();
    void keepsForeignChangesToUntouchedKeys();
    void savesAgainAfterAnAcceptedChange();
    void keepsPermissionsAndLinks();
    void dropsTheKeysOfTheOldType();
    void savesThePositionOnTheDesktop();
    void warnsOfAPositionElsewhereAfterSaving();
    void savesNoPositionWithoutOne();
    void copiesFromAnEntryOfTheMenu();
    void keepsTheTargetsOwnKeysWhenCopying();
    void switchesTheListsWhenCopying();
    void copiesNothingWhenThePickerIsCancelled();
    void showsTheHelp();
    void helpsOnF1();
    void doesNothingWithoutTheForm();
    void survivesItsDeletionBehindThePicker();
    void survivesItsDeletionBehindAWarning_data();
    void survivesItsDeletionBehindAWarning();

private:
    void copyFrom(VelDesktopEntryEditDialog &dialog, const QString &menuEntry);
};

void tst_VelDesktopEntryEditDialog::init()
{
    TestCase::init();
    QDir(QString::fromStdString(GetVelDir(VelDir::StartMenu))).removeRecursively();
    QDir(QString::fromStdString(GetVelDir(VelDir::Desktop))).removeRecursively();
}

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
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
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
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
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
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
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

void tst_VelDesktopEntryEditDialog::refusesAnUnsuitableEntry_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<QString>("text");
    const QString notFound = QStringLiteral("can't find executable");
    const QString tryNotFound = QStringLiteral("can't find try executable");
    const QString noUrl = QStringLiteral("can't find URL");
    const QString incomplete = QStringLiteral("wrong/incomplete desktop entry");
    QTest::newRow("no command") << QByteArray("Type=Application\nName=a\n")
                                << QStringLiteral("no executable");
    QTest::newRow("missing path") << QByteArray("Type=Application\nName=a\nExec=/no/such\n") << notFound;
    QTest::newRow("not executable") << QByteArray("Type=Application\nName=a\nExec=/etc/passwd\n") << notFound;
    QTest::newRow("missing program") << QByteArray("Type=Application\nName=a\nExec=no-such-program\n")
                                     << notFound;
    QTest::newRow("missing try path")
        << QByteArray("Type=Application\nName=a\nExec=/bin/sh\nTryExec=/no/such\n") << tryNotFound;
    QTest::newRow("missing try program")
        << QByteArray("Type=Application\nName=a\nExec=/bin/sh\nTryExec=no-such-program\n") << tryNotFound;
    QTest::newRow("no address") << QByteArray("Type=Link\nName=a\n") << noUrl;
    QTest::newRow("missing file") << QByteArray("Type=Link\nName=a\nURL=file:///no/such\n") << noUrl;
    QTest::newRow("no name") << QByteArray("Type=Application\nExec=/bin/sh\n") << incomplete;
    QTest::newRow("wrong command") << QByteArray("Type=Application\nName=a\nExec=\"/bin/sh\n") << incomplete;
}

void tst_VelDesktopEntryEditDialog::refusesAnUnsuitableEntry()
{
    QFETCH(QByteArray, keys);
    QFETCH(QString, text);
    const QByteArray bytes = "[Desktop Entry]\n" + keys;
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    QTest::keyClicks(line(&dialog, "commentEdit"), QStringLiteral("edited"));
    ModalDriver modal;
    modal.handle([&modal, text](QWidget *window) {
        modal.answer(warning(text), QMessageBox::Ok);
        click(okButton(window));
        QVERIFY(window->isVisible());
        QCOMPARE(line(window, "commentEdit")->text(), QStringLiteral("edited"));
        click(cancelButton(window));
    });
    QCOMPARE(dialog.exec(), int(QDialog::Rejected));
    QVERIFY(modal.finished());
    QCOMPARE(read(file), bytes);
}

void tst_VelDesktopEntryEditDialog::acceptsTheCorrectedEntry()
{
    const QString file = path(QStringLiteral("new.desktop"));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file, true));
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        QTest::keyClicks(line(window, "nameEdit"), QStringLiteral("Shell"));
        modal.answer(warning(QStringLiteral("no executable")), QMessageBox::Ok);
        click(okButton(window));
        QVERIFY(!QFile::exists(file));
        QTest::keyClicks(child<VelUI::PathEdit>(window, "execEdit")->findChild<QLineEdit *>(),
                         QStringLiteral("/bin/sh"));
        click(okButton(window));
    });
    QCOMPARE(dialog.exec(), int(QDialog::Accepted));
    QVERIFY(modal.finished());
    QCOMPARE(read(file), QByteArray("[Desktop Entry]\nType=Application\nName=Shell\nExec=/bin/sh\n"));
}

void tst_VelDesktopEntryEditDialog::warnsOfAHiddenEntryAndSaves_data()
{
    QTest::addColumn<QByteArray>("key");
    QTest::newRow("hidden") << QByteArray("Hidden=true\n");
    QTest::newRow("not displayed") << QByteArray("NoDisplay=true\n");
    QTest::newRow("elsewhere") << QByteArray("OnlyShowIn=Elsewhere;\n");
}

void tst_VelDesktopEntryEditDialog::warnsOfAHiddenEntryAndSaves()
{
    QFETCH(QByteArray, key);
    const QString file = write(QStringLiteral("a.desktop"), plainApplication + key);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    QTest::keyClicks(line(&dialog, "commentEdit"), QStringLiteral("edited"));
    ModalDriver modal;
    modal.handle([&modal](QWidget *window) {
        modal.answer(warning(QStringLiteral("You create hidden desktop entry")), QMessageBox::Ok);
        click(okButton(window));
    });
    QCOMPARE(dialog.exec(), int(QDialog::Accepted));
    QVERIFY(modal.finished());
    QCOMPARE(read(file), plainApplication + key + "Comment=edited\n");
}

void tst_VelDesktopEntryEditDialog::staysOpenWhenTheFileCannotBeSaved()
{
    const QString file = path(QStringLiteral("missing folder/new.desktop"));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file, true, write(QStringLiteral("pattern"), plainApplication)));
    dialog.setDesktopEntryCoords(1, 2);
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        modal.answer(warning(QStringLiteral("Can't save file ") + file), QMessageBox::Ok);
        click(okButton(window));
        QVERIFY(window->isVisible());
        QCOMPARE(line(window, "nameEdit")->text(), QStringLiteral("Plain"));

        // All that there is to tell, in its order.
        child<QCheckBox>(window, "noDisplayCheckBox")->click();
        const auto hidden = warning(QStringLiteral("You create hidden desktop entry"));
        modal.answer(hidden, QMessageBox::Ok);
        modal.answer(warning(QStringLiteral("Can't save file ") + file), QMessageBox::Ok);
        click(okButton(window));
        QVERIFY(window->isVisible());

        QVERIFY(QDir().mkpath(path(QStringLiteral("missing folder"))));
        modal.answer(hidden, QMessageBox::Ok);
        modal.answer(warning(QStringLiteral("Can't save position on desktop for ") + file), QMessageBox::Ok);
        click(okButton(window));
    });
    QCOMPARE(dialog.exec(), int(QDialog::Accepted));
    QVERIFY(modal.finished());
    QCOMPARE(read(file), plainApplication + "NoDisplay=true\n");
}

void tst_VelDesktopEntryEditDialog::leavesAnUntouchedFileAlone_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QByteArray own = EntrySamples::fullApplication();
    QTest::newRow("application") << own;
    QTest::newRow("link") << EntrySamples::link();
    QTest::newRow("directory") << EntrySamples::directory();
    QTest::newRow("other line ends") << QByteArray(plainApplication).replace("\n", "\r\n");
    QTest::newRow("no last line end") << plainApplication + "Comment=end";
    QTest::newRow("empty values") << plainApplication + "Comment=\nKeywords=\nTerminal=false\n";
    QTest::newRow("odd spelling") << plainApplication + "Comment =  spaced  \nKeywords=a;;b\nTerminal=1\n";
    QTest::newRow("not UTF-8") << plainApplication + "Comment=\xff\xfe\n";
}

void tst_VelDesktopEntryEditDialog::leavesAnUntouchedFileAlone()
{
    QFETCH(QByteArray, bytes);
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QCOMPARE(read(file), bytes);
}

void tst_VelDesktopEntryEditDialog::changesOneLineOnly()
{
    const QString file = write(QStringLiteral("a.desktop"), EntrySamples::fullApplication());
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "commentEdit"), QStringLiteral("Something else"));
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QCOMPARE(read(file),
             EntrySamples::fullApplication().replace("Comment=Does all\n", "Comment=Something else\n"));
}

void tst_VelDesktopEntryEditDialog::keepsTheSortOrderOfAFolder()
{
    const QString file = write(QStringLiteral("menu/.directory"), EntrySamples::directory());
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Other"));
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QCOMPARE(read(file), EntrySamples::directory().replace("Name=Folder", "Name=Other"));
}

void tst_VelDesktopEntryEditDialog::keepsForeignChangesToUntouchedKeys()
{
    const QString file = write(QStringLiteral("a.desktop"), plainApplication + "Comment=old\nPath=/\n");
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Ours"));
    // Another program rewrites the file while the dialog is open.
    write(QStringLiteral("a.desktop"), plainApplication + "Comment=theirs\nPath=/\nX-Theirs=1\n");
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QCOMPARE(read(file),
             QByteArray(plainApplication).replace("Plain", "Ours") + "Comment=theirs\nPath=/\nX-Theirs=1\n");
}

void tst_VelDesktopEntryEditDialog::savesAgainAfterAnAcceptedChange()
{
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Other"));
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Plain"));
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QCOMPARE(read(file), plainApplication);
}

void tst_VelDesktopEntryEditDialog::keepsPermissionsAndLinks()
{
    const QString target = write(QStringLiteral("target.desktop"), plainApplication);
    QFile::setPermissions(target, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    const QFile::Permissions before = QFile::permissions(target);
    const QString file = path(QStringLiteral("link.desktop"));
    QVERIFY(QFile::link(target, file));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Other"));
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QVERIFY(QFileInfo(file).isSymLink());
    QVERIFY(read(target).contains("Name=Other\n"));
    QCOMPARE(QFile::permissions(target), before);
}

void tst_VelDesktopEntryEditDialog::dropsTheKeysOfTheOldType()
{
    const QString file = write(QStringLiteral("a.desktop"), EntrySamples::fullApplication());
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    {
        ModalDriver modal;
        modal.handle([](QWidget *box) { QTest::keyClick(box, Qt::Key_Return); });
        auto *types = child<QComboBox>(&dialog, "typeComboBox");
        types->setCurrentIndex(types->findData(QStringLiteral("Directory")));
        QVERIFY(modal.finished());
    }
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    const QByteArray bytes = read(file);
    QVERIFY(bytes.contains("Type=Directory\n"));
    for (const char *key : {"Exec", "Keywords", "Actions", "[Desktop Action", "StartupWMClass"})
        QVERIFY2(!bytes.contains(QByteArray("\n") + key), key);
    QVERIFY(bytes.contains("X-Vendor-Key=keep me\n"));
}

void tst_VelDesktopEntryEditDialog::savesThePositionOnTheDesktop()
{
    const QString desktop = QString::fromStdString(GetVelDir(VelDir::Desktop));
    QVERIFY(QDir().mkpath(desktop));
    const QString file = desktop + QStringLiteral("/my entry.desktop");
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file, true, write(QStringLiteral("pattern"), plainApplication)));
    dialog.setDesktopEntryCoords(120, 34);
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    int x = 0;
    int y = 0;
    QVERIFY(ReadDesktopItemPosition("my entry.desktop", &x, &y));
    QCOMPARE(x, 120);
    QCOMPARE(y, 34);
}

void tst_VelDesktopEntryEditDialog::warnsOfAPositionElsewhereAfterSaving()
{
    const QString file = path(QStringLiteral("a.desktop"));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file, true, write(QStringLiteral("pattern"), plainApplication)));
    dialog.setDesktopEntryCoords(1, 2);
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        modal.answerWith(warning(QStringLiteral("Can't save position on desktop for ") + file),
                         [&file](QMessageBox *box) {
                             QVERIFY(QFile::exists(file));
                             box->button(QMessageBox::Ok)->click();
                         });
        click(okButton(window));
    });
    QCOMPARE(dialog.exec(), int(QDialog::Accepted));
    QVERIFY(modal.finished());
}

void tst_VelDesktopEntryEditDialog::savesNoPositionWithoutOne()
{
    const QString desktop = QString::fromStdString(GetVelDir(VelDir::Desktop));
    QVERIFY(QDir().mkpath(desktop));
    const QString file = desktop + QStringLiteral("/unplaced.desktop");
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file, true, write(QStringLiteral("pattern"), plainApplication)));
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    int x = 0;
    int y = 0;
    QVERIFY(!ReadDesktopItemPosition("unplaced.desktop", &x, &y));
}

void tst_VelDesktopEntryEditDialog::copyFrom(VelDesktopEntryEditDialog &dialog, const QString &menuEntry)
{
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        auto *picker = qobject_cast<VelMenuDialog *>(window);
        QVERIFY(picker);
        QCOMPARE(picker->parentWidget(), &dialog);
        QCOMPARE(picker->menuDir(), QString::fromStdString(GetVelDir(VelDir::StartMenu)));
        // It tells the window manager when it goes; nobody takes the command here.
        modal.answer(warning(QStringLiteral("Can't send command to vel-wm")), QMessageBox::Ok);
        if (menuEntry.isEmpty()) {
            click(cancelButton(picker));
            return;
        }
        auto *view = picker->findChild<VelMenuView *>();
        view->showAndSelect(menuEntry);
        QTRY_VERIFY(okButton(picker)->isEnabled());
        click(okButton(picker));
    });
    click(child<QPushButton>(&dialog, "copyButton"));
    QVERIFY(modal.finished());
}

void tst_VelDesktopEntryEditDialog::copiesFromAnEntryOfTheMenu()
{
    const QString menu = QString::fromStdString(GetVelDir(VelDir::StartMenu));
    QVERIFY(QDir().mkpath(menu));
    const QString source = menu + QStringLiteral("/full.desktop");
    QFile sourceFile(source);
    QVERIFY(sourceFile.open(QIODevice::WriteOnly));
    sourceFile.write(EntrySamples::fullApplication());
    sourceFile.close();

    const QString file = path(QStringLiteral("new.desktop"));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file, true));
    copyFrom(dialog, source);
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Full"));
    QVERIFY(dialog.isWindowModified());
    QVERIFY(dialog.windowTitle().contains(file));
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QVERIFY(read(file).contains("Exec=/bin/sh -c true %u\n"));
    QCOMPARE(read(source), EntrySamples::fullApplication());
}

void tst_VelDesktopEntryEditDialog::keepsTheTargetsOwnKeysWhenCopying()
{
    const QString menu = QString::fromStdString(GetVelDir(VelDir::StartMenu));
    QVERIFY(QDir().mkpath(menu));
    const QString source = menu + QStringLiteral("/other.desktop");
    QFile sourceFile(source);
    QVERIFY(sourceFile.open(QIODevice::WriteOnly));
    sourceFile.write(QByteArray(EntrySamples::fullApplication())
                         .replace("Does all", "Does more")
                         .replace("X-", "X-Their"));
    sourceFile.close();

    const QByteArray bytes = EntrySamples::fullApplication() + "SortOrder=a;b;\n";
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, source);
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QCOMPARE(read(file), QByteArray(bytes).replace("Does all", "Does more"));
}

void tst_VelDesktopEntryEditDialog::switchesTheListsWhenCopying()
{
    const QString menu = QString::fromStdString(GetVelDir(VelDir::StartMenu));
    QVERIFY(QDir().mkpath(menu));
    const QString source = menu + QStringLiteral("/other.desktop");
    QFile sourceFile(source);
    QVERIFY(sourceFile.open(QIODevice::WriteOnly));
    sourceFile.write(plainApplication + "NotShowIn=Elsewhere;\n");
    sourceFile.close();

    const QString file = write(QStringLiteral("a.desktop"), plainApplication + "OnlyShowIn=VEL;\n");
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, source);
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QCOMPARE(read(file), plainApplication + "NotShowIn=Elsewhere;\n");
}

void tst_VelDesktopEntryEditDialog::copiesNothingWhenThePickerIsCancelled()
{
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, QString());
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Plain"));
    QVERIFY(!dialog.isWindowModified());
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
    QCOMPARE(runAndPressOk(dialog), int(QDialog::Accepted));
    QCOMPARE(read(file), plainApplication);
}

void tst_VelDesktopEntryEditDialog::survivesItsDeletionBehindThePicker()
{
    auto *dialog = new VelDesktopEntryEditDialog;
    const QPointer<VelDesktopEntryEditDialog> alive(dialog);
    ModalDriver modal;
    modal.handle([&modal, dialog](QWidget *) {
        modal.answer(warning(QStringLiteral("Can't send command to vel-wm")), QMessageBox::Ok);
        delete dialog;
    });
    click(child<QPushButton>(dialog, "copyButton"));
    QVERIFY(modal.finished());
    QVERIFY(!alive);
}

void tst_VelDesktopEntryEditDialog::survivesItsDeletionBehindAWarning_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("text");
    const QByteArray link = "[Desktop Entry]\nType=Link\nName=a\n";
    QTest::newRow("unsuitable") << link << QStringLiteral("can't find URL");
    QTest::newRow("hidden") << plainApplication + "Hidden=true\n"
                            << QStringLiteral("You create hidden desktop entry");
    QTest::newRow("position") << plainApplication << QStringLiteral("Can't save position on desktop for ");
}

void tst_VelDesktopEntryEditDialog::survivesItsDeletionBehindAWarning()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, text);
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    auto *dialog = new VelDesktopEntryEditDialog;
    const QPointer<VelDesktopEntryEditDialog> alive(dialog);
    QVERIFY(dialog->setDesktopEntryPath(file));
    dialog->setDesktopEntryCoords(1, 2);
    ModalDriver modal;
    modal.answerWith(warning(text.endsWith(QLatin1Char(' ')) ? text + file : text),
                     [dialog](QMessageBox *) { delete dialog; });
    dialog->accept();
    QVERIFY(modal.finished());
    QVERIFY(!alive);
    QCOMPARE(read(file), bytes);
}

VEL_TEST_MAIN(tst_VelDesktopEntryEditDialog)

#include "tst_VelDesktopEntryEditDialog.moc"
