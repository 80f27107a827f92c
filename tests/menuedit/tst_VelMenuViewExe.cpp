// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "VelMenuView.h"

#include <menuedit/EntryExecution.h>

#include <QPointer>
#include <QProcess>
#include <QSignalSpy>

/// Running the selected entry.
class tst_VelMenuViewExe : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void opensTheSelectedEntry();
    void tellsWhenItCannotOpenTheSelectedEntry();
    void opensNothingWithoutASelection();
    void leavesTheStartedProgramRunningWhenItGoesAway();
    void goesAwayWhileItTellsThatNothingStarted();
    void findsTheReasonInWhatTheProgramSays_data();
    void findsTheReasonInWhatTheProgramSays();
    void tellsWhyAnEntryWouldNotStart_data();
    void tellsWhyAnEntryWouldNotStart();
    void tellsNothingOfAnEntryThatStarts();
    void tellsNobodyWhenItHasGone();

private:
    void installOpener(const QByteArray &script);
};

void tst_VelMenuViewExe::installOpener(const QByteArray &script)
{
    const QString program = write(QStringLiteral("bin/vel-open"), "#!/bin/sh\n" + script);
    QVERIFY(QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))) + ":/usr/bin:/bin");
}

void tst_VelMenuViewExe::opensTheSelectedEntry()
{
    const QString log = path(QStringLiteral("log"));
    installOpener("printf '%s|' \"$@\" >'" + QFile::encodeName(log) + ".part'\nmv '" + QFile::encodeName(log)
                  + ".part' '" + QFile::encodeName(log) + "'\n");
    const QString entry = writeEntry(QStringLiteral("with blank %1.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, entry);
    view.slotExe();
    QTRY_VERIFY(QFile::exists(log));
    QCOMPARE(read(log), "--exec|" + QFile::encodeName(entry) + '|');
    QTRY_VERIFY(!view.findChild<QProcess *>());
}

void tst_VelMenuViewExe::tellsWhenItCannotOpenTheSelectedEntry()
{
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("empty"))));
    const QString entry = writeEntry(QStringLiteral("a %1 %2.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, entry);
    ModalDriver modal;
    modal.answer({QMessageBox::Warning, QStringLiteral("Warning"),
                  QStringLiteral("Can't start:\nvel-open --exec ") + entry, QMessageBox::Ok},
                 QMessageBox::Ok);
    view.slotExe();
    QVERIFY(modal.finished());
    QVERIFY(!view.findChild<QProcess *>());
    QCOMPARE(view.selectedPath(), entry);
    qputenv("PATH", "/usr/bin:/bin");
}

void tst_VelMenuViewExe::opensNothingWithoutASelection()
{
    const QString log = path(QStringLiteral("log"));
    installOpener(">'" + QFile::encodeName(log) + "'\n");
    VelMenuView view(menu(), -1, true);
    view.slotExe();
    QVERIFY(!view.findChild<QProcess *>());
}

void tst_VelMenuViewExe::leavesTheStartedProgramRunningWhenItGoesAway()
{
    const QString go = path(QStringLiteral("go"));
    const QString log = path(QStringLiteral("log"));
    installOpener("while [ ! -e '" + QFile::encodeName(go)
                  + "' ]; do sleep 0.05; done\n"
                    "echo alive >'"
                  + QFile::encodeName(log) + "'\n");
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    QPointer<QProcess> started;
    {
        VelMenuView view(menu(), -1, true);
        QVERIFY(open(view, menu(), 1));
        select(view, entry);
        view.slotExe();
        started = view.findChild<QProcess *>();
    }
    QVERIFY(started);
    write(QStringLiteral("go"), "");
    QTRY_VERIFY(QFile::exists(log));
    // It has gone when the program had.
    QTRY_VERIFY(!started);
}

void tst_VelMenuViewExe::goesAwayWhileItTellsThatNothingStarted()
{
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("empty"))));
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    auto *view = new VelMenuView(menu(), -1, true);
    QVERIFY(open(*view, menu(), 1));
    select(*view, entry);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    view->slotExe();
    QVERIFY(modal.finished());
    qputenv("PATH", "/usr/bin:/bin");
}

void tst_VelMenuViewExe::findsTheReasonInWhatTheProgramSays_data()
{
    QTest::addColumn<QByteArray>("output");
    QTest::addColumn<QString>("reason");
    QTest::newRow("nothing") << QByteArray() << QString();
    QTest::newRow("line feeds") << QByteArray("\n\n") << QString();
    QTest::newRow("its own line") << QByteArray("vel-open: /m/a.desktop: is no entry\n") << "is no entry";
    QTest::newRow("without a path") << QByteArray("vel-open: it is late\n") << "it is late";
    QTest::newRow("another path") << QByteArray("vel-open: /m/?.desktop: is no entry\n")
                                  << "/m/?.desktop: is no entry";
    QTest::newRow("after others") << QByteArray("warning: x\nvel-open: /m/a.desktop: gone\ny\n") << "gone";
    QTest::newRow("another program") << QByteArray("one\nother: failed\n") << "other: failed";
}

void tst_VelMenuViewExe::findsTheReasonInWhatTheProgramSays()
{
    QFETCH(QByteArray, output);
    QFETCH(QString, reason);
    QCOMPARE(EntryExecution::reasonIn(output, QStringLiteral("/m/a.desktop")), reason);
}

void tst_VelMenuViewExe::tellsWhyAnEntryWouldNotStart_data()
{
    QTest::addColumn<QByteArray>("program");
    QTest::addColumn<QByteArray>("exec");
    QTest::addColumn<QString>("text");
    QTest::newRow("the program itself")
        << QByteArray("exec '" VEL_OPEN "' \"$@\"\n") << QByteArray("no-such-program")
        << QStringLiteral("R&D %2 was not started: %1.");
    QTest::newRow("ends without a word")
        << QByteArray("exit 3\n") << QByteArray("true")
        << "R&D %2 was not started: the program vel-open ended with an error.";
    QTest::newRow("is killed") << QByteArray("kill -9 $$\n") << QByteArray("true")
                               << "R&D %2 was not started: the program vel-open ended with an error.";
    QTest::newRow("is not there") << QByteArray() << QByteArray("true")
                                  << "R&D %2 was not started: the program vel-open cannot be run.";
}

void tst_VelMenuViewExe::tellsWhyAnEntryWouldNotStart()
{
    QFETCH(QByteArray, program);
    QFETCH(QByteArray, exec);
    QFETCH(QString, text);
    if (program.isEmpty())
        qputenv("PATH", QFile::encodeName(path(QStringLiteral("empty"))));
    else
        installOpener(program);
    const QString entry =
        writeEntry(QStringLiteral("a %1.desktop"), QStringLiteral("R&D %2"), "Exec=" + exec + '\n');
    if (text.contains(QLatin1String("%1"))) {
        QProcess same;
        same.start(QStringLiteral(VEL_OPEN), {QStringLiteral("--exec"), entry});
        QVERIFY(same.waitForFinished());
        QCOMPARE(same.exitCode(), 1);
        const QString said = QString::fromLocal8Bit(same.readAllStandardError().trimmed());
        const QString before = QLatin1String("vel-open: ") + entry + QLatin1String(": ");
        QVERIFY2(said.startsWith(before) && said.contains(QLatin1String("no-such-program")),
                 qPrintable(said));
        text.replace(QLatin1String("%1"), said.mid(before.size()));
    }
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 1));
    select(view, entry);
    QSignalSpy told(&view, &VelMenuView::told);
    view.slotExe();
    QTRY_COMPARE_WITH_TIMEOUT(told.size(), 1, 20000);
    QCOMPARE(told.at(0).at(0).toString(), text);
    QCOMPARE(told.at(0).at(1).toInt(), 2);
    QTRY_VERIFY(!view.findChild<QProcess *>());
    qputenv("PATH", "/usr/bin:/bin");
}

void tst_VelMenuViewExe::tellsNothingOfAnEntryThatStarts()
{
    installOpener("echo noise >&2\n");
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 1));
    select(view, entry);
    QSignalSpy told(&view, &VelMenuView::told);
    view.slotExe();
    QVERIFY(view.findChild<QProcess *>());
    QTRY_VERIFY_WITH_TIMEOUT(!view.findChild<QProcess *>(), 20000);
    QCOMPARE(told.size(), 0);
}

void tst_VelMenuViewExe::tellsNobodyWhenItHasGone()
{
    const QString go = path(QStringLiteral("go"));
    installOpener("while [ ! -e '" + QFile::encodeName(go) + "' ]; do sleep 0.05; done\nexit 1\n");
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    QPointer<QProcess> started;
    {
        VelMenuView view(menu(), -1, true);
        view.setAssistance(true);
        QVERIFY(open(view, menu(), 1));
        select(view, entry);
        view.slotExe();
        started = view.findChild<QProcess *>();
    }
    QVERIFY(started);
    write(QStringLiteral("go"), "");
    QTRY_VERIFY_WITH_TIMEOUT(!started, 20000);
}

VEL_TEST_MAIN(tst_VelMenuViewExe)
#include "tst_VelMenuViewExe.moc"
