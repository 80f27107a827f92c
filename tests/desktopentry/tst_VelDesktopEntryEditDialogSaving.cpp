// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDialogTestCase.h"
#include "EntrySamples.h"
#include "FormDriving.h"

#include <VelDesktopEntryEditDialog.h>
#include <desktopentry/PathEdit.h>
#include <velcore/dirs.h>
#include <velintegration/desktopitems.h>

#include <QCheckBox>
#include <QComboBox>
#include <QDir>
#include <QFileInfo>
#include <QPointer>
#include <QRadioButton>

using namespace FormDriving;

/// What Ok checks, tells and saves.
class tst_VelDesktopEntryEditDialogSaving : public EntryDialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
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
    void emptiesTheListThatTheUserLeft_data();
    void emptiesTheListThatTheUserLeft();
    void refusesATypeThatItDoesNotKnow();
    void savesNoTypeOfTheFileBefore();
    void savesThePositionOnTheDesktop_data();
    void savesThePositionOnTheDesktop();
    void warnsOfAPositionElsewhereAfterSaving_data();
    void warnsOfAPositionElsewhereAfterSaving();
    void savesNoPositionWithoutOne();
    void survivesItsDeletionBehindAWarning_data();
    void survivesItsDeletionBehindAWarning();
};

void tst_VelDesktopEntryEditDialogSaving::refusesAnUnsuitableEntry_data()
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

void tst_VelDesktopEntryEditDialogSaving::refusesAnUnsuitableEntry()
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

void tst_VelDesktopEntryEditDialogSaving::acceptsTheCorrectedEntry()
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

void tst_VelDesktopEntryEditDialogSaving::warnsOfAHiddenEntryAndSaves_data()
{
    QTest::addColumn<QByteArray>("key");
    QTest::newRow("hidden") << QByteArray("Hidden=true\n");
    QTest::newRow("not displayed") << QByteArray("NoDisplay=true\n");
    QTest::newRow("elsewhere") << QByteArray("OnlyShowIn=Elsewhere;\n");
}

void tst_VelDesktopEntryEditDialogSaving::warnsOfAHiddenEntryAndSaves()
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

void tst_VelDesktopEntryEditDialogSaving::staysOpenWhenTheFileCannotBeSaved()
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

void tst_VelDesktopEntryEditDialogSaving::leavesAnUntouchedFileAlone_data()
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

void tst_VelDesktopEntryEditDialogSaving::leavesAnUntouchedFileAlone()
{
    QFETCH(QByteArray, bytes);
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(read(file), bytes);
}

void tst_VelDesktopEntryEditDialogSaving::changesOneLineOnly()
{
    const QString file = write(QStringLiteral("a.desktop"), EntrySamples::fullApplication());
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "commentEdit"), QStringLiteral("Something else"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(read(file),
             EntrySamples::fullApplication().replace("Comment=Does all\n", "Comment=Something else\n"));
}

void tst_VelDesktopEntryEditDialogSaving::keepsTheSortOrderOfAFolder()
{
    const QString file = write(QStringLiteral("menu/.directory"), EntrySamples::directory());
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Other"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(read(file), EntrySamples::directory().replace("Name=Folder", "Name=Other"));
}

void tst_VelDesktopEntryEditDialogSaving::keepsForeignChangesToUntouchedKeys()
{
    const QString file = write(QStringLiteral("a.desktop"), plainApplication + "Comment=old\nPath=/\n");
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Ours"));
    // Another program rewrites the file while the dialog is open.
    write(QStringLiteral("a.desktop"), plainApplication + "Comment=theirs\nPath=/\nX-Theirs=1\n");
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(read(file),
             QByteArray(plainApplication).replace("Plain", "Ours") + "Comment=theirs\nPath=/\nX-Theirs=1\n");
}

void tst_VelDesktopEntryEditDialogSaving::savesAgainAfterAnAcceptedChange()
{
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Other"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Plain"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(read(file), plainApplication);
}

void tst_VelDesktopEntryEditDialogSaving::keepsPermissionsAndLinks()
{
    const QString target = write(QStringLiteral("target.desktop"), plainApplication);
    QFile::setPermissions(target, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    const QFile::Permissions before = QFile::permissions(target);
    const QString file = path(QStringLiteral("link.desktop"));
    QVERIFY(QFile::link(target, file));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    retype(line(&dialog, "nameEdit"), QStringLiteral("Other"));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QVERIFY(QFileInfo(file).isSymLink());
    QVERIFY(read(target).contains("Name=Other\n"));
    QCOMPARE(QFile::permissions(target), before);
}

void tst_VelDesktopEntryEditDialogSaving::dropsTheKeysOfTheOldType()
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
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    const QByteArray bytes = read(file);
    QVERIFY(bytes.contains("Type=Directory\n"));
    for (const char *key : {"Exec", "Keywords", "Actions", "[Desktop Action", "StartupWMClass"})
        QVERIFY2(!bytes.contains(QByteArray("\n") + key), key);
    QVERIFY(bytes.contains("X-Vendor-Key=keep me\n"));
}

void tst_VelDesktopEntryEditDialogSaving::emptiesTheListThatTheUserLeft_data()
{
    QTest::addColumn<int>("switches");
    QTest::addColumn<QByteArray>("lists");
    QTest::newRow("no switch") << 0 << QByteArray("OnlyShowIn=X;\nNotShowIn=Y;\n");
    QTest::newRow("a switch") << 1 << QByteArray("OnlyShowIn=X;\n");
    QTest::newRow("there and back") << 2 << QByteArray("OnlyShowIn=X;\nNotShowIn=Y;\n");
}

void tst_VelDesktopEntryEditDialogSaving::emptiesTheListThatTheUserLeft()
{
    QFETCH(int, switches);
    QFETCH(QByteArray, lists);
    const QString file = write(QStringLiteral("a.desktop"), plainApplication + "OnlyShowIn=X;\nNotShowIn=Y;\n");
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    for (int i = 0; i < switches; ++i)
        child<QRadioButton>(&dialog, i % 2 == 0 ? "onlyShowInButton" : "notShowInButton")->click();
    QCOMPARE(dialog.isWindowModified(), switches > 0);
    ModalDriver modal;
    modal.answer(warning(QStringLiteral("You create hidden desktop entry")), QMessageBox::Ok);
    click(okButton(&dialog));
    QVERIFY(modal.finished());
    QCOMPARE(read(file), plainApplication + lists);
}

void tst_VelDesktopEntryEditDialogSaving::refusesATypeThatItDoesNotKnow()
{
    const QByteArray bytes = "[Desktop Entry]\nType=FSDevice\nName=a\n";
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    QTest::keyClicks(line(&dialog, "commentEdit"), QStringLiteral("x"));
    ModalDriver modal;
    modal.answer(warning(QStringLiteral("wrong/incomplete desktop entry")), QMessageBox::Ok);
    click(okButton(&dialog));
    QVERIFY(modal.finished());
    QCOMPARE(read(file), bytes);
}

void tst_VelDesktopEntryEditDialogSaving::savesNoTypeOfTheFileBefore()
{
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(path(QStringLiteral("folder/.directory")), true));
    QVERIFY(dialog.setDesktopEntryPath(file));
    QCOMPARE(type(&dialog), QStringLiteral("Application"));
    click(okButton(&dialog));
    QCOMPARE(read(file), plainApplication);
}

void tst_VelDesktopEntryEditDialogSaving::savesThePositionOnTheDesktop_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QPoint>("place");
    QTest::newRow("blank in the name") << QStringLiteral("my entry.desktop") << QPoint(120, 34);
    QTest::newRow("another script") << QString::fromUtf8("Ж.desktop") << QPoint(0, 0);
    QTest::newRow("another screen") << QStringLiteral("a.desktop") << QPoint(-1, -700);
}

void tst_VelDesktopEntryEditDialogSaving::savesThePositionOnTheDesktop()
{
    QFETCH(QString, name);
    QFETCH(QPoint, place);
    const QString desktop = QString::fromStdString(GetVelDir(VelDir::Desktop));
    QVERIFY(QDir().mkpath(desktop));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(desktop + QLatin1Char('/') + name, true,
                                       write(QStringLiteral("pattern"), plainApplication)));
    dialog.setDesktopEntryCoords(place.x(), place.y());
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    int x = 0;
    int y = 0;
    QVERIFY(ReadDesktopItemPosition(QFile::encodeName(name).constData(), &x, &y));
    QCOMPARE(QPoint(x, y), place);
}

void tst_VelDesktopEntryEditDialogSaving::warnsOfAPositionElsewhereAfterSaving_data()
{
    QTest::addColumn<bool>("belowTheDesktop");
    QTest::newRow("elsewhere") << false;
    QTest::newRow("below the desktop") << true;
}

void tst_VelDesktopEntryEditDialogSaving::warnsOfAPositionElsewhereAfterSaving()
{
    QFETCH(bool, belowTheDesktop);
    const QString desktop = QString::fromStdString(GetVelDir(VelDir::Desktop));
    const QString folder =
        belowTheDesktop ? desktop + QStringLiteral("/below") : path(QStringLiteral("elsewhere"));
    QVERIFY(QDir().mkpath(folder));
    const QString file = folder + QStringLiteral("/elsewhere.desktop");
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
    int x = 0;
    int y = 0;
    QVERIFY(!ReadDesktopItemPosition("elsewhere.desktop", &x, &y));
}

void tst_VelDesktopEntryEditDialogSaving::savesNoPositionWithoutOne()
{
    const QString desktop = QString::fromStdString(GetVelDir(VelDir::Desktop));
    QVERIFY(QDir().mkpath(desktop));
    const QString file = desktop + QStringLiteral("/unplaced.desktop");
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file, true, write(QStringLiteral("pattern"), plainApplication)));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    int x = 0;
    int y = 0;
    QVERIFY(!ReadDesktopItemPosition("unplaced.desktop", &x, &y));
}

void tst_VelDesktopEntryEditDialogSaving::survivesItsDeletionBehindAWarning_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("text");
    const QByteArray link = "[Desktop Entry]\nType=Link\nName=a\n";
    QTest::newRow("unsuitable") << link << QStringLiteral("can't find URL");
    QTest::newRow("hidden") << plainApplication + "Hidden=true\n"
                            << QStringLiteral("You create hidden desktop entry");
    QTest::newRow("position") << plainApplication << QStringLiteral("Can't save position on desktop for ");
}

void tst_VelDesktopEntryEditDialogSaving::survivesItsDeletionBehindAWarning()
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

VEL_TEST_MAIN(tst_VelDesktopEntryEditDialogSaving)

#include "tst_VelDesktopEntryEditDialogSaving.moc"
