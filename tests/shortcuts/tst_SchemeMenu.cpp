// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DialogTestCase.h"
#include "QtMajor.h"

#include <QCheckBox>
#include <QClipboard>
#include <QFileDialog>
#include <QLineEdit>
#include <QMenu>
#include <QMimeData>

/// The keys of the assisted dialog in files and on sheets.
class tst_SchemeMenu : public DialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void exportsAndImportsKeys();
    void resetTakesAnImportBack();
    void asksAboutClashes_data();
    void asksAboutClashes();
    void asksOnceForAllClashes();
    void doesNotOfferToReplaceGlobalKeys();
    void survivesADialogThatGoesWithTheQuestion();
    void tellsOfLinesThatItCannotRead();
    void tellsWhatToDoWhenAFileCannotBeRead();
    void tellsWhatToDoWhenAFileCannotBeWritten();
    void doesNothingWithoutAFile();
    void savesSheets();
    void copiesASheet();
    void doesNothingWithoutAModel();

private:
    void trigger(const char *name) const
    {
        const auto *menu = child<QPushButton>("schemesButton")->menu();
        menu->findChild<QAction *>(str(name))->trigger();
    }
    // In the file dialog that opens next.
    static void choose(ModalDriver *modal, const QString &path)
    {
        modal->handle([path](QWidget *window) {
            auto *dialog = qobject_cast<QFileDialog *>(window);
            QVERIFY(dialog);
            dialog->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))->setText(path);
            static_cast<QDialog *>(dialog)->accept();
        });
    }
    // Presses the button of a text in the question that opens next.
    static void answer(ModalDriver *modal, const QString &contained, const QString &button,
                       bool forAll = false)
    {
        modal->handle([=](QWidget *window) {
            auto *box = qobject_cast<QMessageBox *>(window);
            QVERIFY(box);
            QVERIFY2(box->text().contains(contained), qPrintable(box->text()));
            box->checkBox()->setChecked(forAll);
            const auto buttons = box->buttons();
            for (QAbstractButton *candidate : buttons) {
                if (candidate->text().remove(QLatin1Char('&')) == button)
                    return candidate->click();
            }
            QFAIL("There is no such button.");
        });
    }
    static ModalDriver::Box report(int taken, int skipped)
    {
        return {QMessageBox::Information, str("Import keys"),
                str("Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.")
                    .arg(taken)
                    .arg(skipped),
                QMessageBox::Ok};
    }
    QString scheme(const QByteArray &lines) { return write(str("keys.ini"), "[Shortcuts]\n" + lines); }
};

void tst_SchemeMenu::init()
{
    DialogTestCase::init();
    m_dialog->setAssistance(true);
}

void tst_SchemeMenu::exportsAndImportsKeys()
{
    m_model->setKeySequence(row("open"), f9);
    ModalDriver modal;
    choose(&modal, path(str("mine")));
    trigger("exportAction");
    QVERIFY(QFile::exists(path(str("mine.ini"))));
    m_model->resetShortcuts();
    m_model->setKeySequence(row("cut"), QKeySequence());

    choose(&modal, path(str("mine.ini")));
    modal.answer(report(5, 0), QMessageBox::Ok);
    trigger("importAction");
    QCOMPARE(pendingKey("open"), f9);
    QCOMPARE(pendingKey("cut"), VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C));
    QCOMPARE(open->shortcut(), f1);
    QVERIFY(isChanged());
    QVERIFY(modal.finished());
}

void tst_SchemeMenu::resetTakesAnImportBack()
{
    ModalDriver modal;
    choose(&modal, scheme("open=F9\nnobody=F10\n"));
    modal.answer(report(1, 1), QMessageBox::Ok);
    trigger("importAction");
    QCOMPARE(pendingKey("open"), f9);
    m_dialog->processButtonBox(button(QDialogButtonBox::Reset));
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
}

void tst_SchemeMenu::asksAboutClashes_data()
{
    QTest::addColumn<QString>("button");
    QTest::addColumn<QKeySequence>("openKey");
    QTest::addColumn<QKeySequence>("saveKey");
    QTest::addColumn<QKeySequence>("printKey");
    QTest::newRow("Replace") << str("Replace") << f2 << QKeySequence() << f9;
    QTest::newRow("Skip") << str("Skip") << f1 << f2 << f9;
    QTest::newRow("Cancel") << str("Cancel") << f1 << f2 << QKeySequence();
}

void tst_SchemeMenu::asksAboutClashes()
{
    QFETCH(QString, button);
    ModalDriver modal;
    choose(&modal, scheme("open=F2\nprint=F9\n"));
    answer(
        &modal,
        str("The file has shortcut 'F2' for action 'Text of open', but action 'Text of save' has it, too."),
        button);
    if (button != str("Cancel"))
        modal.answer(report(button == str("Skip") ? 1 : 2, button == str("Skip") ? 1 : 0), QMessageBox::Ok);
    trigger("importAction");
    QVERIFY(modal.finished());
    QTEST(pendingKey("open"), "openKey");
    QTEST(pendingKey("save"), "saveKey");
    QTEST(pendingKey("print"), "printKey");
    QCOMPARE(isChanged(), button != str("Cancel"));
}

void tst_SchemeMenu::asksOnceForAllClashes()
{
    ModalDriver modal;
    choose(&modal, scheme("open=F2\nprint=F3\n"));
    answer(&modal, str("F2"), str("Replace"), true);
    modal.answer(report(2, 0), QMessageBox::Ok);
    trigger("importAction");
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f2);
    QCOMPARE(pendingKey("print"), QKeySequence(Qt::Key_F3));
    QCOMPARE(pendingKey("save"), QKeySequence());
    QCOMPARE(pendingKey("copy"), QKeySequence());
}

void tst_SchemeMenu::doesNotOfferToReplaceGlobalKeys()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nF9=VELWM_RUN\n");
    ModalDriver modal;
    choose(&modal, scheme("open=F9\n"));
    modal.handle([](QWidget *window) {
        auto *box = qobject_cast<QMessageBox *>(window);
        QVERIFY(box);
        QVERIFY2(box->text().contains(str("the global action 'VELWM_RUN' has it")), qPrintable(box->text()));
        QCOMPARE(box->buttons().size(), 2);
        box->defaultButton()->click();
    });
    modal.answer(report(0, 1), QMessageBox::Ok);
    trigger("importAction");
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
}

void tst_SchemeMenu::survivesADialogThatGoesWithTheQuestion()
{
    ModalDriver modal;
    choose(&modal, scheme("open=F2\n"));
    modal.handle([this](QWidget *) { m_dialog.reset(); });
    trigger("importAction");
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f1);
}

void tst_SchemeMenu::tellsOfLinesThatItCannotRead()
{
    const QString path = scheme("open=F9\nsave=no key at all\n");
    ModalDriver modal;
    choose(&modal, path);
    modal.answer(
        {QMessageBox::Warning, str("Import keys"),
         str("Unreadable shortcuts in %1 were skipped: 1\nShortcuts taken over: 1, left out: 1. Ok puts "
             "them into force, Reset takes them back.")
             .arg(path),
         QMessageBox::Ok},
        QMessageBox::Ok);
    trigger("importAction");
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f9);
}

void tst_SchemeMenu::tellsWhatToDoWhenAFileCannotBeRead()
{
    const QString path = write(str("other.ini"), "[Other]\na=b\n");
    ModalDriver modal;
    choose(&modal, path);
    modal.answer(
        {QMessageBox::Critical, str("Import keys"),
         str("%1 holds no shortcuts.\nChoose a file that was written with 'Export keys...'.").arg(path),
         QMessageBox::Ok},
        QMessageBox::Ok);
    trigger("importAction");
    QVERIFY(modal.finished());
    QVERIFY(!isChanged());
}

void tst_SchemeMenu::tellsWhatToDoWhenAFileCannotBeWritten()
{
    for (const char *name : {"exportAction", "htmlAction", "plainTextAction"}) {
        ModalDriver modal;
        choose(&modal, path(str("no such folder/file.x")));
        modal.handle([this](QWidget *window) {
            auto *box = qobject_cast<QMessageBox *>(window);
            QVERIFY(box);
            QCOMPARE(box->icon(), QMessageBox::Critical);
            QVERIFY2(box->text().contains(path(str("no such folder/file.x"))), qPrintable(box->text()));
            QVERIFY(box->text().endsWith(str("\nChoose another folder or another name, and try again.")));
            box->accept();
        });
        trigger(name);
        QVERIFY(modal.finished());
    }
}

void tst_SchemeMenu::doesNothingWithoutAFile()
{
    for (const char *name : {"exportAction", "importAction", "htmlAction", "plainTextAction"}) {
        ModalDriver modal;
        modal.handle([](QWidget *window) { qobject_cast<QDialog *>(window)->reject(); });
        trigger(name);
        QVERIFY(modal.finished());
    }
    QVERIFY(QDir(folder()).isEmpty());
    QVERIFY(!isChanged());
}

void tst_SchemeMenu::savesSheets()
{
    ModalDriver modal;
    choose(&modal, path(str("sheet")));
    trigger("htmlAction");
    QVERIFY(read(path(str("sheet.html"))).startsWith("<!DOCTYPE html>"));
    QVERIFY(read(path(str("sheet.html"))).contains("Text of open"));
    choose(&modal, path(str("sheet")));
    trigger("plainTextAction");
    QVERIFY(read(path(str("sheet.txt"))).startsWith("File\n  Text of open"));
    QVERIFY(modal.finished());
}

void tst_SchemeMenu::copiesASheet()
{
    trigger("copyAction");
    const QMimeData *data = QGuiApplication::clipboard()->mimeData();
    QVERIFY(data->text().startsWith(str("File\n  Text of open")));
    QVERIFY(data->html().contains(str("Text of open")));
}

void tst_SchemeMenu::doesNothingWithoutAModel()
{
    m_model.reset();
    const ModalDriver modal;
    for (const char *name : {"exportAction", "importAction", "htmlAction", "plainTextAction", "copyAction"})
        trigger(name);
    QVERIFY(modal.finished());
}

VEL_TEST_MAIN(tst_SchemeMenu)

#include "tst_SchemeMenu.moc"
