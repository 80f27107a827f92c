// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QFile>
#include <QProcess>

// Drives the program from outside, as a user does: keys and clicks go through the X server,
// and what it did is read from the file and from its exit status.
class tst_vel_entryedit : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void refusesACommandLineThatNamesNoFile_data();
    void refusesACommandLineThatNamesNoFile();
    void showsHelpAndVersionWithoutADisplay_data();
    void showsHelpAndVersionWithoutADisplay();
    void saysThatItCannotOpenAMissingFile();
    void saysWhyItCannotOpenAFile();
    void saysThatAFileIsNoEntry();
    void asksBeforeChangesAreLost_data();
    void asksBeforeChangesAreLost();
    void staysWhenWhatItWasToldToSaveCannotBeSaved();
    void endsWithOneWhenCanceled();
    void leavesTheFileWhenNothingWasChanged();
    void createsAnEntryThatRuns();
    void takesATemplate();
    void changesNothingReadOnly();
    void isDescribedByAnEntryOfItsOwn();

private:
    static const QByteArray changeable;

    void start(QProcess &program, const QStringList &arguments);
    // Opens the entry and types into the name in the user's language.
    void startChanged(QProcess &program, const QString &file);
    void waitForWindow(const QString &title);
    static void pressKeys(const QStringList &keys);
    static void typeText(const QString &text);
    void waitUntilGone(const QString &title);
    QString findWindow(const QString &title);
    static QByteArray xdotool(const QStringList &arguments);
};

const QByteArray tst_vel_entryedit::changeable = "[Desktop Entry]\nType=Application\nName=a\nExec=true\n";

QByteArray tst_vel_entryedit::xdotool(const QStringList &arguments)
{
    QProcess process;
    process.start(QStringLiteral("xdotool"), arguments);
    process.waitForFinished();
    return process.readAllStandardOutput().trimmed();
}

void tst_vel_entryedit::start(QProcess &program, const QStringList &arguments)
{
    program.start(QStringLiteral(VEL_PROGRAM), arguments);
    QVERIFY2(program.waitForStarted(), qPrintable(program.errorString()));
}

QString tst_vel_entryedit::findWindow(const QString &title)
{
    const QByteArray found =
        xdotool({QStringLiteral("search"), QStringLiteral("--onlyvisible"), QStringLiteral("--name"), title});
    return QString::fromLatin1(found.split('\n').constLast());
}

void tst_vel_entryedit::waitForWindow(const QString &title)
{
    const auto isActive = [this, &title] {
        const QString window = findWindow(title);
        return !window.isEmpty() && xdotool({QStringLiteral("getactivewindow")}) == window.toLatin1();
    };
    if (!QTest::qWaitFor(isActive, 20000))
        QTest::qFail(qPrintable(QStringLiteral("no active window ") + title), __FILE__, __LINE__);
}

void tst_vel_entryedit::waitUntilGone(const QString &title)
{
    QVERIFY(QTest::qWaitFor([this, &title] { return findWindow(title).isEmpty(); }, 20000));
}

// What has the keyboard gets the keys: wait for the window first.
void tst_vel_entryedit::pressKeys(const QStringList &keys)
{
    xdotool(QStringList{QStringLiteral("key"), QStringLiteral("--delay"), QStringLiteral("20")} + keys);
}

void tst_vel_entryedit::typeText(const QString &text)
{
    xdotool({QStringLiteral("type"), QStringLiteral("--delay"), QStringLiteral("20"), text});
}

void tst_vel_entryedit::refusesACommandLineThatNamesNoFile_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::newRow("nothing") << QStringList();
    QTest::newRow("two files") << QStringList{QStringLiteral("a"), QStringLiteral("b")};
    QTest::newRow("unknown option") << QStringList{QStringLiteral("--nonsense"), QStringLiteral("a")};
}

void tst_vel_entryedit::refusesACommandLineThatNamesNoFile()
{
    QFETCH(QStringList, arguments);
    QProcess program;
    start(program, arguments);
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 2);
    const QByteArray error = program.readAllStandardError();
    QVERIFY2(error.startsWith("vel-entryedit: "), error.constData());
    QCOMPARE(error.count('\n'), 1);
}

void tst_vel_entryedit::showsHelpAndVersionWithoutADisplay_data()
{
    QTest::addColumn<QString>("option");
    QTest::addColumn<QByteArray>("text");
    QTest::newRow("help") << QStringLiteral("--help") << QByteArray("--template");
    QTest::newRow("version") << QStringLiteral("--version") << QByteArray("vel-entryedit " VEL_VERSION "\n");
}

void tst_vel_entryedit::showsHelpAndVersionWithoutADisplay()
{
    QFETCH(QString, option);
    QFETCH(QByteArray, text);
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.remove(QStringLiteral("DISPLAY"));
    QProcess program;
    program.setProcessEnvironment(environment);
    start(program, {option});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(program.readAllStandardError(), QByteArray());
    QVERIFY(program.readAllStandardOutput().contains(text));
}

void tst_vel_entryedit::saysThatItCannotOpenAMissingFile()
{
    const QString missing = path(QStringLiteral("missing.desktop"));
    QProcess program;
    start(program, {missing});
    waitForWindow(QStringLiteral("Warning"));
    // Whoever looks at the terminal need not close the box first.
    QByteArray error;
    QTRY_VERIFY_WITH_TIMEOUT((error += program.readAllStandardError()).endsWith('\n'), 20000);
    QCOMPARE(error,
             "vel-entryedit: cannot open " + missing.toLocal8Bit()
                 + ": there is no such file, --create makes a new entry\n");
    pressKeys({QStringLiteral("Return")});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 2);
    QCOMPARE(program.readAllStandardError(), QByteArray());
}

void tst_vel_entryedit::saysWhyItCannotOpenAFile()
{
    QProcess program;
    start(program, {folder()});
    waitForWindow(QStringLiteral("Warning"));
    pressKeys({QStringLiteral("Return")});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 2);
    QCOMPARE(program.readAllStandardError(),
             "vel-entryedit: cannot open " + folder().toLocal8Bit() + ": it is no regular file\n");
}

void tst_vel_entryedit::startChanged(QProcess &program, const QString &file)
{
    start(program, {file});
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    pressKeys({QStringLiteral("Tab"), QStringLiteral("x")});
}

void tst_vel_entryedit::asksBeforeChangesAreLost_data()
{
    QTest::addColumn<QString>("leave");
    QTest::newRow("Escape") << QStringLiteral("Escape");
    QTest::newRow("closed by the window manager") << QStringLiteral("alt+F4");
}

void tst_vel_entryedit::asksBeforeChangesAreLost()
{
    QFETCH(QString, leave);
    const QString file = write(QStringLiteral("a.desktop"), changeable);
    QProcess program;
    startChanged(program, file);
    // No answer is no.
    pressKeys({leave});
    waitForWindow(QStringLiteral("Unsaved changes"));
    pressKeys({QStringLiteral("Escape")});
    waitUntilGone(QStringLiteral("Unsaved changes"));
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    QCOMPARE(program.state(), QProcess::Running);
    // Return saves.
    pressKeys({leave});
    waitForWindow(QStringLiteral("Unsaved changes"));
    pressKeys({QStringLiteral("Return")});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 0);
    QVERIFY2(read(file).contains("]=x\n"), read(file).constData());
}

void tst_vel_entryedit::staysWhenWhatItWasToldToSaveCannotBeSaved()
{
    const QString file = write(QStringLiteral("a.desktop"), "[Desktop Entry]\nType=Application\nName=a\n");
    QProcess program;
    startChanged(program, file);
    pressKeys({QStringLiteral("Escape")});
    waitForWindow(QStringLiteral("Unsaved changes"));
    pressKeys({QStringLiteral("Return")});
    waitForWindow(QStringLiteral("^Warning$")); // there is no command
    pressKeys({QStringLiteral("Return")});
    waitUntilGone(QStringLiteral("^Warning$"));
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    QCOMPARE(program.state(), QProcess::Running);
    pressKeys({QStringLiteral("Escape")});
    waitForWindow(QStringLiteral("Unsaved changes"));
    pressKeys({QStringLiteral("Tab"), QStringLiteral("space")}); // Discard
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 1);
}

void tst_vel_entryedit::saysThatAFileIsNoEntry()
{
    const QByteArray bytes = "Dear diary\n";
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    QProcess program;
    start(program, {file});
    waitForWindow(QStringLiteral("^Warning$"));
    pressKeys({QStringLiteral("Return")});
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    pressKeys({QStringLiteral("Escape")});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 1);
    QCOMPARE(read(file), bytes);
}

void tst_vel_entryedit::endsWithOneWhenCanceled()
{
    const QString file = write(QStringLiteral("a.desktop"), changeable);
    QProcess program;
    startChanged(program, file);
    pressKeys({QStringLiteral("Escape")});
    waitForWindow(QStringLiteral("Unsaved changes"));
    pressKeys({QStringLiteral("Tab"), QStringLiteral("space")}); // Discard
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 1);
    QCOMPARE(read(file), changeable);
    QCOMPARE(program.readAllStandardError(), QByteArray());
}

void tst_vel_entryedit::leavesTheFileWhenNothingWasChanged()
{
    const QByteArray bytes =
        "#!/usr/bin/env x\n[Desktop Entry]\nName=a\nType=Application\nExec=true\nX-Key=1\n";
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    QProcess program;
    program.setWorkingDirectory(folder());
    start(program, {QStringLiteral("a.desktop")});
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    pressKeys({QStringLiteral("Return")});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(read(file), bytes);
}

void tst_vel_entryedit::createsAnEntryThatRuns()
{
    const QString file = path(QStringLiteral("new.desktop"));
    const QString witness = path(QStringLiteral("witness"));
    const QString script =
        write(QStringLiteral("run"), "#!/bin/sh\necho \"$1\" > '" + witness.toUtf8() + "'\n");
    QVERIFY(QFile::setPermissions(script, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));

    QProcess program;
    start(program, {QStringLiteral("--create"), file});
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    // The name has the keys at first, and what is typed takes its place.
    typeText(QStringLiteral("My program"));
    pressKeys({QStringLiteral("Return")});

    waitForWindow(QStringLiteral("^Warning$"));
    pressKeys({QStringLiteral("Return")});
    waitUntilGone(QStringLiteral("^Warning$"));
    QVERIFY(!QFile::exists(file));
    QCOMPARE(program.state(), QProcess::Running);

    // The command has the keys now, which is what was missing.
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    typeText(script + QStringLiteral(" started"));
    pressKeys({QStringLiteral("Return")});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(read(file),
             "[Desktop Entry]\nType=Application\nName=My program\nExec=" + script.toUtf8() + " started\n");

    QProcess open;
    open.start(QStringLiteral(VEL_OPEN), {QStringLiteral("--exec"), file});
    QVERIFY(open.waitForFinished(20000));
    QCOMPARE(open.exitCode(), 0);
    QTRY_VERIFY_WITH_TIMEOUT(QFile::exists(witness) && read(witness) == "started\n", 20000);
}

void tst_vel_entryedit::takesATemplate()
{
    const QString pattern = write(QStringLiteral("pattern.desktop"),
                                  "[Desktop Entry]\nType=Application\nName=Pattern\nExec=/bin/sh\n");
    const QString file = path(QStringLiteral("new.desktop"));
    QProcess program;
    start(program, {QStringLiteral("--create"), QStringLiteral("--template"), pattern, file});
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    pressKeys({QStringLiteral("Return")});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(read(file), QByteArray("[Desktop Entry]\nType=Application\nName=Pattern\nExec=/bin/sh\n"));
}

void tst_vel_entryedit::changesNothingReadOnly()
{
    const QByteArray bytes = "[Desktop Entry]\nType=Application\nName=a\nExec=true\n";
    const QString file = write(QStringLiteral("a.desktop"), bytes);
    QProcess program;
    start(program, {QStringLiteral("--read-only"), file});
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    typeText(QStringLiteral("xyz"));
    pressKeys({QStringLiteral("Tab"), QStringLiteral("x"), QStringLiteral("Return")});
    QVERIFY(!program.waitForFinished(500));

    // Back over the five of the bar above the form, Help and Cancel: what comes before them is no button
    // that copies but a field.
    pressKeys(QStringList(QVector<QString>(8, QStringLiteral("shift+Tab")).toList()));
    pressKeys(
        {QStringLiteral("space"), QStringLiteral("Tab"), QStringLiteral("Tab"), QStringLiteral("space")});
    waitForWindow(QStringLiteral("^Help$"));
    pressKeys({QStringLiteral("Escape")});
    waitUntilGone(QStringLiteral("^Help$"));
    waitForWindow(QStringLiteral("Desktop Entry Editor"));
    pressKeys({QStringLiteral("Escape")});
    QVERIFY(program.waitForFinished(20000));
    QCOMPARE(program.exitCode(), 1);
    QCOMPARE(read(file), bytes);
}

void tst_vel_entryedit::isDescribedByAnEntryOfItsOwn()
{
    QProcess validate;
    validate.start(QStringLiteral("desktop-file-validate"), {QStringLiteral(VEL_ENTRY)});
    QVERIFY(validate.waitForFinished());
    QCOMPARE(validate.exitCode(), 0);
    QCOMPARE(validate.readAllStandardOutput(), QByteArray());
    const QByteArray entry = read(QStringLiteral(VEL_ENTRY));
    QVERIFY(entry.contains("\nMimeType=application/x-desktop;\n"));
    QVERIFY(entry.contains("\nExec=vel-entryedit %f\n"));
}

VEL_TEST_MAIN(tst_vel_entryedit)

#include "tst_vel_entryedit.moc"
