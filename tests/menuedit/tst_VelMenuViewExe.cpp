// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QPointer>
#include <QProcess>

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

VEL_TEST_MAIN(tst_VelMenuViewExe)
#include "tst_VelMenuViewExe.moc"
