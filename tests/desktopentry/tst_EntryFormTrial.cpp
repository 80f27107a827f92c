// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/EntryTrial.h>
#include <desktopentry/FieldEdit.h>
#include <desktopentry/MarkedTextView.h>

#include <QDir>
#include <QFileInfo>
#include <QTextBlock>
#include <QToolButton>

using namespace FormDriving;
using namespace VelUI;

/// An entry is tried before it is saved, and its text is looked at.
class tst_EntryFormTrial : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void runsTheEntryAsItWouldBeSaved();
    void givesTheProgramThePlaceOfTheEntry_data();
    void givesTheProgramThePlaceOfTheEntry();
    void tellsTheExitStatusAndTheError();
    void tellsWhenNothingRunsEntries();
    void leavesNoFileBehind();
    void goesOnWithTheFormMeanwhile();
    void isStoppedByItsButton();
    void survivesTheDeletionOfTheForm();
    void forgetsTheResultWhenTheEntryChanges();
    void triesNoFolder();
    void startsRealPrograms();
    void showsTheFileAsItWouldBeSaved();
    void followsTheFormInTheText();
    void closesTheTextWithTheWindow();

private:
    static constexpr int Patience = 20000;

    /// Has \a script run entries, in place of the program that does.
    void runBy(const QByteArray &script)
    {
        const QString path = write(QStringLiteral("bin/vel-open"), "#!/bin/sh\n" + script);
        QFile::setPermissions(path, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
        qputenv("PATH", QFile::encodeName(this->path(QStringLiteral("bin"))) + ":/usr/bin:/bin");
    }
    QString openDialog(VelDesktopEntryEditDialog &dialog, const QByteArray &bytes)
    {
        const QString file = write(QStringLiteral("entry.desktop"), bytes);
        dialog.setAssistance(true);
        if (!dialog.setDesktopEntryPath(file))
            qFatal("the sample does not load");
        dialog.show();
        return file;
    }
    static QLabel *result(const QWidget &dialog) { return child<QLabel>(&dialog, "tryLabel"); }
    static QToolButton *tryButton(const QWidget &dialog) { return child<QToolButton>(&dialog, "tryButton"); }
    QStringList temporaries() const
    {
        return QDir(path(QStringLiteral("tmp")))
            .entryList(QDir::AllEntries | QDir::NoDotAndDotDot | QDir::Hidden);
    }

    const QByteArray m_bytes =
        "[Desktop Entry]\nType=Application\nName=Editor\nName[de]=Editor\nExec=/bin/sh\n";
    QByteArray m_path;
};

void tst_EntryFormTrial::init()
{
    PropsFormTestCase::init();
    m_path = qgetenv("PATH");
    QDir().mkpath(path(QStringLiteral("tmp")));
    qputenv("TMPDIR", QFile::encodeName(path(QStringLiteral("tmp"))));
}

void tst_EntryFormTrial::cleanup()
{
    qputenv("PATH", m_path);
    qunsetenv("TMPDIR");
    PropsFormTestCase::cleanup();
}

void tst_EntryFormTrial::runsTheEntryAsItWouldBeSaved()
{
    const QString seen = path(QStringLiteral("seen"));
    runBy("cat \"$2\" >'" + seen.toLocal8Bit() + "'; basename \"$2\" >>'" + seen.toLocal8Bit() + "'\n");
    VelDesktopEntryEditDialog dialog;
    const QString file = openDialog(dialog, m_bytes);
    retype(child<QLineEdit>(&dialog, "commentEdit"), QStringLiteral("new"));
    click(tryButton(dialog));
    QTRY_VERIFY_WITH_TIMEOUT(result(dialog)->isVisible(), Patience);
    QCOMPARE(result(dialog)->text(), QStringLiteral("The entry was started (exit status 0)."));
    QCOMPARE(read(seen), m_bytes + "Comment=new\nentry.desktop\n");
    QCOMPARE(read(file), m_bytes);
}

void tst_EntryFormTrial::givesTheProgramThePlaceOfTheEntry_data()
{
    QTest::addColumn<QByteArray>("exec");
    QTest::addColumn<QByteArray>("tried");

    QTest::newRow("the place") << QByteArray("a %k %f b") << QByteArray("a '/x y/%%/e.desktop'  b");
    QTest::newRow("no code") << QByteArray("a %%k") << QByteArray("a %%k");
    QTest::newRow("another code") << QByteArray("a %U") << QByteArray("a %U");
    QTest::newRow("what is no command line") << QByteArray("a %k %q") << QByteArray("a %k %q");
}

void tst_EntryFormTrial::givesTheProgramThePlaceOfTheEntry()
{
    QFETCH(QByteArray, exec);
    QFETCH(QByteArray, tried);
    const QString seen = path(QStringLiteral("seen"));
    runBy("sed -n s/^Exec=//p \"$2\" >'" + seen.toLocal8Bit() + "'\n");
    EntryTrial trial;
    bool hasFinished = false;
    connect(&trial, &EntryTrial::finished, this, [&] { hasFinished = true; });
    trial.start(entry("[Desktop Entry]\nType=Application\nName=a\nExec=" + exec + '\n'),
                QStringLiteral("/x y/%/e.desktop"));
    QVERIFY(trial.isRunning());
    QTRY_VERIFY_WITH_TIMEOUT(hasFinished, Patience);
    QVERIFY(!trial.isRunning());
    QCOMPARE(read(seen), tried + '\n');
}

void tst_EntryFormTrial::tellsTheExitStatusAndTheError()
{
    runBy("echo \"vel-open: $2: no such thing\" >&2; exit 3\n");
    VelDesktopEntryEditDialog dialog;
    const QString file = openDialog(dialog, m_bytes);
    click(tryButton(dialog));
    QTRY_VERIFY_WITH_TIMEOUT(result(dialog)->isVisible(), Patience);
    QCOMPARE(result(dialog)->text(),
             QStringLiteral("The entry could not be started (exit status 3): vel-open: %1: no such thing")
                 .arg(file));
}

void tst_EntryFormTrial::tellsWhenNothingRunsEntries()
{
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("nowhere"))));
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog, m_bytes);
    click(tryButton(dialog));
    QTRY_VERIFY_WITH_TIMEOUT(result(dialog)->isVisible(), Patience);
    QVERIFY(result(dialog)->text().startsWith(
        QStringLiteral("The program vel-open, which runs entries, could not be started: ")));
    QVERIFY(tryButton(dialog)->isEnabled());
}

void tst_EntryFormTrial::leavesNoFileBehind()
{
    runBy("test -f \"$2\"\n");
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog, m_bytes);
    click(tryButton(dialog));
    QVERIFY(!temporaries().isEmpty());
    QTRY_VERIFY_WITH_TIMEOUT(result(dialog)->isVisible(), Patience);
    QCOMPARE(result(dialog)->text(), QStringLiteral("The entry was started (exit status 0)."));
    QCOMPARE(temporaries(), QStringList());
}

void tst_EntryFormTrial::goesOnWithTheFormMeanwhile()
{
    const QString gate = path(QStringLiteral("gate"));
    runBy("while ! test -f '" + gate.toLocal8Bit() + "'; do sleep 0.05; done\n");
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog, m_bytes);
    click(tryButton(dialog));
    QCOMPARE(tryButton(dialog)->text(), QStringLiteral("Stop"));
    retype(child<QLineEdit>(&dialog, "commentEdit"), QStringLiteral("typed meanwhile"));
    QCOMPARE(child<QLineEdit>(&dialog, "commentEdit")->text(), QStringLiteral("typed meanwhile"));
    QVERIFY(!result(dialog)->isVisible());
    write(QStringLiteral("gate"), QByteArray());
    QTRY_VERIFY_WITH_TIMEOUT(result(dialog)->isVisible(), Patience);
    QCOMPARE(tryButton(dialog)->text(), QStringLiteral("T&ry"));
}

void tst_EntryFormTrial::isStoppedByItsButton()
{
    runBy("exec sleep 60\n");
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog, m_bytes);
    click(tryButton(dialog));
    click(tryButton(dialog));
    QCOMPARE(result(dialog)->text(), QStringLiteral("The trial was stopped."));
    QVERIFY(result(dialog)->isVisible());
    QCOMPARE(temporaries(), QStringList());
}

void tst_EntryFormTrial::survivesTheDeletionOfTheForm()
{
    runBy("exec sleep 60\n");
    {
        VelDesktopEntryEditDialog dialog;
        openDialog(dialog, m_bytes);
        click(child<QToolButton>(&dialog, "textButton"));
        click(tryButton(dialog));
        QVERIFY(!temporaries().isEmpty());
    }
    QCOMPARE(temporaries(), QStringList());
    QCoreApplication::processEvents();

    VelDesktopEntryEditDialog dialog;
    openDialog(dialog, m_bytes);
    click(tryButton(dialog));
    dialog.setAssistance(false);
    QCOMPARE(temporaries(), QStringList());
}

void tst_EntryFormTrial::forgetsTheResultWhenTheEntryChanges()
{
    runBy("exit 1\n");
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog, m_bytes);
    click(tryButton(dialog));
    QTRY_VERIFY_WITH_TIMEOUT(result(dialog)->isVisible(), Patience);
    QCOMPARE(result(dialog)->text(), QStringLiteral("The entry could not be started (exit status 1)."));
    QTest::keyClicks(child<QLineEdit>(&dialog, "commentEdit"), QStringLiteral("a"));
    QVERIFY(!result(dialog)->isVisible());
}

void tst_EntryFormTrial::triesNoFolder()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    QVERIFY(tryButton(form)->isEnabled());
    form.setType(directory, {});
    QVERIFY(!tryButton(form)->isEnabled());
    form.setType(link, {});
    QVERIFY(tryButton(form)->isEnabled());
}

// The program that comes with the library, and a program that it starts.
void tst_EntryFormTrial::startsRealPrograms()
{
    qputenv("PATH", QByteArray(VEL_PROGRAMS) + ':' + m_path);
    const QString made = path(QStringLiteral("made by a trial"));
    const QString program = write(QStringLiteral("a program"), "#!/bin/sh\nprintf %s \"$1\" >\"$2\"\n");
    QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    VelDesktopEntryEditDialog dialog;
    const QString file = openDialog(dialog, m_bytes);
    FieldEdit::setValue(child<QWidget>(&dialog, "execEdit"),
                        QStringLiteral("\"%1\" %k \"%2\"").arg(program, made));
    click(tryButton(dialog));
    QTRY_VERIFY_WITH_TIMEOUT(result(dialog)->isVisible(), Patience);
    QCOMPARE(result(dialog)->text(), QStringLiteral("The entry was started (exit status 0)."));
    QTRY_VERIFY_WITH_TIMEOUT(QFileInfo(made).size() > 0, Patience);
    QCOMPARE(read(made), file.toLocal8Bit());

    FieldEdit::setValue(child<QWidget>(&dialog, "execEdit"), QStringLiteral("/no/such/program"));
    click(tryButton(dialog));
    QTRY_VERIFY_WITH_TIMEOUT(result(dialog)->isVisible(), Patience);
    QVERIFY2(result(dialog)->text().startsWith(
                 QStringLiteral("The entry could not be started (exit status 1): vel-open: ") + file),
             qPrintable(result(dialog)->text()));
}

void tst_EntryFormTrial::showsTheFileAsItWouldBeSaved()
{
    VelDesktopEntryEditDialog dialog;
    const QString file = openDialog(dialog, m_bytes);
    retype(child<QLineEdit>(&dialog, "commentEdit"), QStringLiteral("new"));
    click(child<QToolButton>(&dialog, "textButton"));
    auto *view = child<MarkedTextView>(&dialog, "entryText");
    QVERIFY(view->isVisible() && view->isReadOnly());
    const QString shown = view->toPlainText() + QLatin1Char('\n');
    QCOMPARE(child<QLabel>(&dialog, "changesLabel")->text(),
             QString::fromUtf8("\xE2\x89\xA0 changed lines: 0, + new lines: 1, removed lines: 0"));
    QCOMPARE(view->extraSelections().size(), 1);
    QCOMPARE(view->extraSelections().constFirst().cursor.block().text(), QStringLiteral("Comment=new"));

    VelUIDesktopEntry saved{file};
    dialog.findChild<VelDesktopEntryPropsWidget *>()->saveTo(&saved);
    QCOMPARE(shown.toUtf8(), saved.contents());
}

void tst_EntryFormTrial::followsTheFormInTheText()
{
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog, m_bytes);
    click(child<QToolButton>(&dialog, "textButton"));
    auto *view = child<MarkedTextView>(&dialog, "entryText");
    QCOMPARE(child<QLabel>(&dialog, "changesLabel")->text(), QStringLiteral("Nothing is changed."));
    retype(child<QLineEdit>(&dialog, "nameEdit"), QStringLiteral("Other"));
    QTRY_VERIFY_WITH_TIMEOUT(view->toPlainText().contains(QStringLiteral("Name=Other\nName[de]=Other")),
                             Patience);
    QCOMPARE(view->extraSelections().size(), 2);
    click(child<QToolButton>(&dialog, "undoButton"));
    click(child<QToolButton>(&dialog, "undoButton"));
    QTRY_COMPARE_WITH_TIMEOUT(view->toPlainText().toUtf8() + '\n', m_bytes, Patience);
    QVERIFY(view->extraSelections().isEmpty());
}

void tst_EntryFormTrial::closesTheTextWithTheWindow()
{
    VelDesktopEntryEditDialog dialog;
    openDialog(dialog, m_bytes);
    auto *button = child<QToolButton>(&dialog, "textButton");
    click(button);
    auto *text = child<QDialog>(&dialog, "entryTextDialog");
    QVERIFY(text->isVisible());
    text->close();
    QVERIFY(!button->isChecked());
    click(button);
    QVERIFY(button->isChecked());
    dialog.reject();
    QVERIFY(!button->isChecked());
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.findChild<QDialog *>(QStringLiteral("entryTextDialog")), Patience);
}

VEL_TEST_MAIN(tst_EntryFormTrial)

#include "tst_EntryFormTrial.moc"
