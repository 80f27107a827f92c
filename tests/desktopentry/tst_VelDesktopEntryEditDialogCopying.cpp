// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDialogTestCase.h"
#include "EntrySamples.h"
#include "FormDriving.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <VelMenuDialog.h>
#include <VelMenuView.h>
#include <velcore/dirs.h>

#include <QDir>
#include <QDirIterator>
#include <QPointer>
#include <QToolButton>

using namespace FormDriving;

/// Copying from an entry that is picked in the start menu.
class tst_VelDesktopEntryEditDialogCopying : public EntryDialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void copiesFromAnEntryOfTheMenu();
    void keepsTheTargetsOwnKeysWhenCopying();
    void switchesTheListsWhenCopying();
    void keepsAFolderAFolderWhenCopying();
    void marksACopyAsAChange();
    void copiesNothingFromAFileThatDoesNotLoad();
    void copiesNothingWhenThePickerIsCanceled();
    void survivesItsDeletionBehindThePicker();
    void passesItsAssistanceToThePicker();
    void offersTheApplicationsOfANewHome_data();
    void offersTheApplicationsOfANewHome();
    void takesACopyBack();
    void copiesAllLanguages_data();
    void copiesAllLanguages();

private:
    static QString writeToMenu(const QString &name, const QByteArray &bytes);
    void copyFrom(VelDesktopEntryEditDialog &dialog, const QString &menuEntry);
};

QString tst_VelDesktopEntryEditDialogCopying::writeToMenu(const QString &name, const QByteArray &bytes)
{
    const QString menu = QString::fromStdString(GetVelDir(VelDir::StartMenu));
    const QString path = menu + QLatin1Char('/') + name;
    QFile file(path);
    if (!QDir().mkpath(menu) || !file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qFatal("the menu cannot be written");
    return path;
}

void tst_VelDesktopEntryEditDialogCopying::copyFrom(VelDesktopEntryEditDialog &dialog,
                                                    const QString &menuEntry)
{
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        auto *picker = qobject_cast<VelMenuDialog *>(window);
        QVERIFY(picker);
        QCOMPARE(picker->parentWidget(), &dialog);
        QCOMPARE(picker->menuDir(), QString::fromStdString(GetVelDir(VelDir::StartMenu)));
        // It tells the window manager when it goes; nobody takes the command here.
        if (!dialog.assistance())
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

void tst_VelDesktopEntryEditDialogCopying::copiesFromAnEntryOfTheMenu()
{
    const QString source = writeToMenu(QStringLiteral("full.desktop"), EntrySamples::fullApplication());

    const QString file = path(QStringLiteral("new.desktop"));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file, true));
    copyFrom(dialog, source);
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Full"));
    QVERIFY(dialog.isWindowModified());
    QVERIFY(dialog.windowTitle().contains(file));
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QVERIFY(read(file).contains("Exec=/bin/sh -c true %u\n"));
    QCOMPARE(read(source), EntrySamples::fullApplication());
}

void tst_VelDesktopEntryEditDialogCopying::keepsTheTargetsOwnKeysWhenCopying()
{
    const QString source = writeToMenu(QStringLiteral("other.desktop"),
                                       QByteArray(EntrySamples::fullApplication())
                                           .replace("Does all", "Does more")
                                           .replace("X-", "X-Their"));

    const QByteArray bytes = EntrySamples::fullApplication() + "SortOrder=a;b;\n";
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, source);
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(read(file), QByteArray(bytes).replace("Does all", "Does more"));
}

void tst_VelDesktopEntryEditDialogCopying::switchesTheListsWhenCopying()
{
    const QString source =
        writeToMenu(QStringLiteral("other.desktop"), plainApplication + "NotShowIn=Elsewhere;\n");

    const QString file = write(QStringLiteral("a.desktop"), plainApplication + "OnlyShowIn=VEL;\n");
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, source);
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(read(file), plainApplication + "NotShowIn=Elsewhere;\n");
}

void tst_VelDesktopEntryEditDialogCopying::keepsAFolderAFolderWhenCopying()
{
    const QString source = writeToMenu(QStringLiteral("full.desktop"), EntrySamples::fullApplication());
    QVERIFY(QDir().mkpath(path(QStringLiteral("folder"))));
    const QString file = write(QStringLiteral("folder/.directory"), EntrySamples::directory());
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, source);
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Full"));
    click(okButton(&dialog));
    QCOMPARE(dialog.result(), int(QDialog::Accepted));
    QVERIFY(read(file).contains("\nType=Directory\n"));
    QVERIFY(!read(file).contains("\nExec="));
}

void tst_VelDesktopEntryEditDialogCopying::marksACopyAsAChange()
{
    const QString source = writeToMenu(QStringLiteral("page.desktop"), EntrySamples::link());
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(path(QStringLiteral("new.desktop")), true));
    copyFrom(dialog, source);
    QCOMPARE(type(&dialog), QStringLiteral("Link"));
    QVERIFY(dialog.isWindowModified());
}

void tst_VelDesktopEntryEditDialogCopying::copiesNothingFromAFileThatDoesNotLoad()
{
    const QString source = writeToMenu(QStringLiteral("a.desktop"), QByteArray(2 << 20, '#'));
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(write(QStringLiteral("b.desktop"), plainApplication)));
    copyFrom(dialog, source);
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Plain"));
    QVERIFY(!dialog.isWindowModified());
}

void tst_VelDesktopEntryEditDialogCopying::copiesNothingWhenThePickerIsCanceled()
{
    const QString file = write(QStringLiteral("a.desktop"), plainApplication);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, QString());
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Plain"));
    QVERIFY(!dialog.isWindowModified());
}

void tst_VelDesktopEntryEditDialogCopying::survivesItsDeletionBehindThePicker()
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

void tst_VelDesktopEntryEditDialogCopying::passesItsAssistanceToThePicker()
{
    writeToMenu(QStringLiteral("a.desktop"), plainApplication);
    VelDesktopEntryEditDialog dialog;
    QVERIFY(dialog.setDesktopEntryPath(path(QStringLiteral("new.desktop")), true));
    for (const bool isAssisted : {false, true}) {
        dialog.setAssistance(isAssisted);
        QCOMPARE(dialog.assistance(), isAssisted);
        QCOMPARE(dialog.findChild<VelDesktopEntryPropsWidget *>()->assistance(), isAssisted);
        ModalDriver modal;
        modal.handle([&](QWidget *window) {
            if (!isAssisted)
                modal.answer(warning(QStringLiteral("Can't send command to vel-wm")), QMessageBox::Ok);
            QCOMPARE(qobject_cast<VelMenuDialog *>(window)->assistance(), isAssisted);
            click(cancelButton(window));
        });
        click(child<QPushButton>(&dialog, "copyButton"));
        QVERIFY(modal.finished());
    }
}

void tst_VelDesktopEntryEditDialogCopying::offersTheApplicationsOfANewHome_data()
{
    QTest::addColumn<bool>("hasAssistance");
    QTest::newRow("plain") << false;
    QTest::newRow("with assistance") << true;
}

void tst_VelDesktopEntryEditDialogCopying::offersTheApplicationsOfANewHome()
{
    QFETCH(bool, hasAssistance);
    const QString menu = QString::fromStdString(GetVelDir(VelDir::StartMenu));
    QDir(menu).removeRecursively();
    QFile::remove(menu + QStringLiteral(".sources"));
    write(QStringLiteral("share/applications/full.desktop"), EntrySamples::fullApplication());
    const QByteArray dataDirs = qgetenv("XDG_DATA_DIRS");
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("share"))));
    VelDesktopEntryEditDialog dialog;
    dialog.setAssistance(hasAssistance);
    QVERIFY(dialog.setDesktopEntryPath(path(QStringLiteral("new.desktop")), true));
    copyFrom(dialog, QString());
    qputenv("XDG_DATA_DIRS", dataDirs);
    QDirIterator found(menu, {QStringLiteral("full.desktop")}, QDir::Files, QDirIterator::Subdirectories);
    QCOMPARE(found.hasNext(), hasAssistance);
    QDir(menu).removeRecursively();
    QFile::remove(menu + QStringLiteral(".sources"));
}

void tst_VelDesktopEntryEditDialogCopying::takesACopyBack()
{
    const QString source = writeToMenu(QStringLiteral("full.desktop"), EntrySamples::fullApplication());
    VelDesktopEntryEditDialog dialog;
    dialog.setAssistance(true);
    const QString file = write(QStringLiteral("plain.desktop"), plainApplication);
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, source);
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Full"));
    click(child<QToolButton>(&dialog, "undoButton"));
    QCOMPARE(line(&dialog, "nameEdit")->text(), QStringLiteral("Plain"));
    QVERIFY(!child<QToolButton>(&dialog, "undoButton")->isEnabled());
    QVERIFY(!dialog.isWindowModified());
    click(okButton(&dialog));
    QCOMPARE(read(file), plainApplication);
}

void tst_VelDesktopEntryEditDialogCopying::copiesAllLanguages_data()
{
    QTest::addColumn<bool>("isAssisted");
    QTest::addColumn<bool>("isTakenBack");
    QTest::addColumn<QByteArray>("keys");
    const QByteArray former = "Name=Plain\nName[fr]=Simple\nName[sv]=Enkel\nComment[fr]=Rien\n";
    QTest::newRow("with assistance")
        << true << false
        << QByteArray("Name=Copied\nName[fr]=Copie\nName[ja]=\xE5\x86\x99\nKeywords[fr]=k;\n");
    QTest::newRow("taken back") << true << true << former;
    QTest::newRow("without") << false << false << QByteArray(former).replace("Plain", "Copied");
}

void tst_VelDesktopEntryEditDialogCopying::copiesAllLanguages()
{
    QFETCH(bool, isAssisted);
    QFETCH(bool, isTakenBack);
    QFETCH(QByteArray, keys);
    const QByteArray start = "[Desktop Entry]\nType=Application\nExec=true\n";
    const QString source = writeToMenu(
        QStringLiteral("other.desktop"),
        start + "Name=Copied\nName[fr]=Copie\nName[ja]=\xE5\x86\x99\nKeywords[fr]=k;\nX-A[fr]=a\n");
    const QString file = write(QStringLiteral("a.desktop"),
                               start + "Name=Plain\nName[fr]=Simple\nName[sv]=Enkel\nComment[fr]=Rien\n");
    VelDesktopEntryEditDialog dialog;
    dialog.setAssistance(isAssisted);
    QVERIFY(dialog.setDesktopEntryPath(file));
    copyFrom(dialog, source);
    if (isTakenBack)
        click(child<QToolButton>(&dialog, "undoButton"));
    click(okButton(&dialog));
    QCOMPARE(read(file), start + keys);
}

VEL_TEST_MAIN(tst_VelDesktopEntryEditDialogCopying)

#include "tst_VelDesktopEntryEditDialogCopying.moc"
