// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StderrCapture.h"
#include "TestCase.h"

#include <VelSettings.h>

#include <QDateTime>
#include <QDir>
#include <QFileInfo>
#include <QSettings>

#include <type_traits>

#include <sys/stat.h>
#include <sys/time.h>
#include <utime.h>

static_assert(!std::is_copy_constructible<VelSettings>::value && !std::is_copy_assignable<VelSettings>::value,
              "two objects would own one QSettings");
static_assert(!std::has_virtual_destructor<VelSettings>::value, "a plain class");

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

// Gives the file a time in the past, so that a change is seen.
void makeOld(const QString &path)
{
    const utimbuf times = {1000000000, 1000000000};
    utime(QFile::encodeName(path).constData(), &times);
}

struct stat statusOf(const QString &path)
{
    struct stat status = {};
    stat(QFile::encodeName(path).constData(), &status);
    return status;
}

} // namespace

class tst_VelSettings : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void doesNothingWithoutAFile();
    void saysNothingAboutAMissingFile();
    void opensAFileByARelativePath();
    void readsTypedValues();
    void givesTheDefaultForAMissingKey();
    void writesChangesOnSync();
    void writesChangesWhenItIsDestroyed();
    void leavesAnUnchangedFileAlone();
    void leavesTheEditsOfOthersUnwrittenWhenItIsDestroyed();
    void touchesAnUnchangedFileOnSync();
    void touchesNothingWithoutBeingAsked();
    void touchesAFileWhoseNameIsNotAscii();
    void touchesBeforeItLooksForChanges();
    void writesNoLineBreakOfAValue();
    void renamesTheSection();
    void dropsTheHeaderWithTheSectionName();
    void removesAKey();
    void removesTheKeysBelowAKey();
    void switchesToAnotherFile();
    void keepsItsFileWhenTheOtherOneIsMissing();
    void doesNotCallItselfParsedAfterALaterSuccess();
    void setsAndWritesThoughItIsNotParsed();
    void keepsItsFileNameWhenTheOtherFileGivesAnError();
    void opensAnEmptyFile();
    void opensADirectoryWithoutACrash();
    void refusesWhatIsNoRegularFile_data();
    void refusesWhatIsNoRegularFile();
    void refusesAFileAboveItsLimit();
    void leavesAFileThatGrewAboveItsLimit();
    void writesAFileThatWasEmptiedAfterItGrewAboveItsLimit();
    void writesNoFileAboveItsLimit();
    void doesNotWaitForAFileThatBecameAPipe();
    void syncsNothingThatGaveAnErrorWhenItWasOpened();
    void sharesChangesBetweenObjectsOnOneFile();
    void registersItsFormatOnceUnderItsExtension();
};

void tst_VelSettings::doesNothingWithoutAFile()
{
    VelSettings settings(path(s("none")));
    QVERIFY(!settings.isParsed());
    settings.setValue(s("a"), 1);
    QCOMPARE(settings.value(s("a"), 2), QVariant(2));
    QCOMPARE(settings.value(s("a")), QVariant());
    settings.remove(s("a"));
    settings.sync();
    settings.sync(true);
    QVERIFY(!QFile::exists(path(s("none"))));
}

void tst_VelSettings::saysNothingAboutAMissingFile()
{
    StderrCapture capture;
    VelSettings settings(path(s("none")));
    QVERIFY(!settings.ParseConfigFile(path(s("none"))));
    QCOMPARE(capture.take(), QByteArray());
}

void tst_VelSettings::opensAFileByARelativePath()
{
    const QString file = write(s("rc"), "a=1\n");
    const QString before = QDir::currentPath();
    QVERIFY(QDir::setCurrent(folder()));
    VelSettings settings(s("rc"));
    QVERIFY(QDir::setCurrent(before));
    QVERIFY(settings.isParsed());
    settings.setValue(s("a"), 2);
    settings.sync(true);
    QCOMPARE(read(file), QByteArray("a=2\n"));
}

void tst_VelSettings::readsTypedValues()
{
    VelSettings settings(write(s("rc"), "[ Main ]\nflag=True\nsize=007\npath = one = two\nquoted=\"a b\"\n"));
    QVERIFY(settings.isParsed());
    QCOMPARE(settings.value(s("SectionName")), QVariant(s("Main")));
    QCOMPARE(settings.value(s("flag")), QVariant(true));
    QCOMPARE(settings.value(s("flag")).userType(), int(QMetaType::Bool));
    QCOMPARE(settings.value(s("size")), QVariant(7));
    QCOMPARE(settings.value(s("size")).userType(), int(QMetaType::Int));
    QCOMPARE(settings.value(s("path")), QVariant(s("one = two")));
    QCOMPARE(settings.value(s("quoted")), QVariant(s("a b")));
    QCOMPARE(settings.value(s("Flag")), QVariant()); // keys are case-sensitive
}

void tst_VelSettings::givesTheDefaultForAMissingKey()
{
    VelSettings settings(write(s("rc"), "a=1\n"));
    QCOMPARE(settings.value(s("b")), QVariant());
    QCOMPARE(settings.value(s("b"), s("default")), QVariant(s("default")));
}

void tst_VelSettings::writesChangesOnSync()
{
    const QString file = write(s("rc"), "# comment\n[Main]\nz=1\nb=\"v\"\npath = one = two\n");
    VelSettings settings(file);
    settings.setValue(s("new"), s("x y"));
    settings.setValue(s("z"), false);
    settings.sync();
    QCOMPARE(read(file), QByteArray("[Main]\nb=v\nnew=\"x y\"\npath=\"one = two\"\nz=false\n"));
}

void tst_VelSettings::writesChangesWhenItIsDestroyed()
{
    const QString file = write(s("rc"), "a=1\n");
    {
        VelSettings settings(file);
        settings.setValue(s("a"), 2);
    }
    QCOMPARE(read(file), QByteArray("a=2\n"));
}

void tst_VelSettings::leavesAnUnchangedFileAlone()
{
    const QByteArray bytes("# comment\n\n[b]\nx=007\n");
    const QString file = write(s("rc"), bytes);
    makeOld(file);
    const struct stat before = statusOf(file);
    {
        VelSettings settings(file);
        QCOMPARE(settings.value(s("x")), QVariant(7));
        settings.sync();
    }
    QCOMPARE(read(file), bytes);
    QCOMPARE(statusOf(file).st_mtime, before.st_mtime);
    QCOMPARE(statusOf(file).st_ino, before.st_ino);
}

void tst_VelSettings::leavesTheEditsOfOthersUnwrittenWhenItIsDestroyed()
{
    const QByteArray bytes("a=1\nb=2\n");
    const QString file = write(s("rc"), bytes);
    VelSettings other(file);
    {
        VelSettings settings(file);
        settings.remove(s("b"));
        settings.sync();
        write(s("rc"), bytes);
        other.setValue(s("a"), 3);
    }
    QCOMPARE(read(file), bytes);
    other.sync();
    QCOMPARE(read(file), QByteArray("a=3\nb=2\n"));
}

void tst_VelSettings::touchesAnUnchangedFileOnSync()
{
    const QByteArray bytes("# comment\n\n[b]\nx=007\n");
    const QString file = write(s("rc"), bytes);
    makeOld(file);
    const struct stat before = statusOf(file);
    VelSettings settings(file);
    settings.sync(true);
    QCOMPARE(read(file), bytes);
    QCOMPARE(statusOf(file).st_ino, before.st_ino);
    QCOMPARE(statusOf(file).st_mode, before.st_mode);
    QVERIFY(qAbs(statusOf(file).st_mtime - time(nullptr)) < 60);
    QCOMPARE(settings.value(s("x")), QVariant(7));
}

void tst_VelSettings::touchesNothingWithoutBeingAsked()
{
    const QString file = write(s("rc"), "a=1\n");
    makeOld(file);
    VelSettings settings(file);
    settings.sync();
    QCOMPARE(statusOf(file).st_mtime, time_t(1000000000));
}

void tst_VelSettings::touchesAFileWhoseNameIsNotAscii()
{
    const QString file = write(s("\u00e4 %1"), "a=1\n");
    makeOld(file);
    VelSettings settings(file);
    // A reader sets the access time of an old file by itself, but not back from the future.
    const timeval future[2] = {{time(nullptr) + 3600, 0}, {1000000000, 0}};
    QCOMPARE(utimes(QFile::encodeName(file).constData(), future), 0);
    settings.sync(true);
    QVERIFY(qAbs(statusOf(file).st_mtime - time(nullptr)) < 60);
    QVERIFY(qAbs(statusOf(file).st_atime - time(nullptr)) < 60);
}

void tst_VelSettings::touchesBeforeItLooksForChanges()
{
    const QString file = write(s("rc"), "a=1\n");
    makeOld(file);
    VelSettings settings(file);
    // A change that neither the size nor the time of the file gives away.
    write(s("rc"), "a=2\n");
    makeOld(file);
    settings.sync();
    QCOMPARE(settings.value(s("a")), QVariant(1));
    settings.sync(true);
    QCOMPARE(settings.value(s("a")), QVariant(2));
}

void tst_VelSettings::writesNoLineBreakOfAValue()
{
    const QString file = write(s("rc"), "[Main]\na=1\nz=2\n");
    StderrCapture capture;
    {
        VelSettings settings(file);
        settings.setValue(s("SectionName"), s("M\n[X]"));
        settings.setValue(s("b"), s("x\r\nz=3"));
        settings.setValue(s("c\nz"), 4);
        settings.sync();
        QCOMPARE(read(file), QByteArray("[M [X]]\na=1\nb=\"x  z=3\"\nc z=4\nz=2\n"));
    }
    QCOMPARE(capture.take().count('\n'), 3);
}

void tst_VelSettings::renamesTheSection()
{
    const QString file = write(s("rc"), "[Old]\na=1\n");
    VelSettings settings(file);
    settings.setValue(s("SectionName"), s("New"));
    settings.sync();
    QCOMPARE(read(file), QByteArray("[New]\na=1\n"));
}

void tst_VelSettings::dropsTheHeaderWithTheSectionName()
{
    const QString file = write(s("rc"), "[Old]\na=1\n");
    VelSettings settings(file);
    settings.remove(s("SectionName"));
    settings.sync();
    QCOMPARE(read(file), QByteArray("a=1\n"));
}

void tst_VelSettings::removesAKey()
{
    const QString file = write(s("rc"), "[Main]\na=1\nb=2\n");
    VelSettings settings(file);
    settings.remove(s("a"));
    QCOMPARE(settings.value(s("a")), QVariant());
    settings.sync();
    QCOMPARE(read(file), QByteArray("[Main]\nb=2\n"));
}

void tst_VelSettings::removesTheKeysBelowAKey()
{
    const QString file = write(s("rc"), "x=1\nx/y=2\nxy=3\n");
    VelSettings settings(file);
    QCOMPARE(settings.value(s("x/y")), QVariant(2));
    settings.remove(s("x"));
    settings.sync();
    QCOMPARE(read(file), QByteArray("xy=3\n"));
}

void tst_VelSettings::switchesToAnotherFile()
{
    const QString one = write(s("one"), "a=1\n");
    const QString two = write(s("two"), "a=2\n");
    VelSettings settings(one);
    settings.setValue(s("b"), 1);
    QVERIFY(settings.ParseConfigFile(two));
    QCOMPARE(read(one), QByteArray("a=1\nb=1\n")); // let go of, so written
    QCOMPARE(settings.value(s("a")), QVariant(2));
    settings.setValue(s("b"), 2);
    settings.sync();
    QCOMPARE(read(two), QByteArray("a=2\nb=2\n"));
    QCOMPARE(read(one), QByteArray("a=1\nb=1\n"));
}

void tst_VelSettings::keepsItsFileWhenTheOtherOneIsMissing()
{
    const QString one = write(s("one"), "a=1\n");
    VelSettings settings(one);
    QVERIFY(!settings.ParseConfigFile(path(s("none"))));
    QVERIFY(settings.isParsed());
    QCOMPARE(settings.value(s("a")), QVariant(1));
    settings.setValue(s("a"), 2);
    settings.sync();
    QCOMPARE(read(one), QByteArray("a=2\n"));
}

void tst_VelSettings::doesNotCallItselfParsedAfterALaterSuccess()
{
    VelSettings settings(path(s("none")));
    const QString file = write(s("rc"), "a=1\n");
    QVERIFY(settings.ParseConfigFile(file));
    QVERIFY(!settings.isParsed());
    QCOMPARE(settings.value(s("a"), s("default")), QVariant(s("default")));
}

void tst_VelSettings::setsAndWritesThoughItIsNotParsed()
{
    VelSettings settings(path(s("none")));
    const QString file = write(s("rc"), "a=1\nb=2\n");
    QVERIFY(settings.ParseConfigFile(file));
    settings.setValue(s("a"), 3);
    settings.remove(s("b"));
    settings.sync();
    QCOMPARE(read(file), QByteArray("a=3\n"));
}

void tst_VelSettings::keepsItsFileNameWhenTheOtherFileGivesAnError()
{
    const QString file = write(s("rc"), "a=1\n");
    VelSettings settings(file);
    expectWarning(s("Cant register format!"));
    QVERIFY(!settings.ParseConfigFile(folder()));
    QVERIFY(settings.isParsed());
    // The settings are those of the other one already, the name is still that of the first.
    QCOMPARE(settings.value(s("a"), 5), QVariant(5));
    makeOld(file);
    settings.sync(true);
    QVERIFY(qAbs(statusOf(file).st_mtime - time(nullptr)) < 60);
    QCOMPARE(read(file), QByteArray("a=1\n"));
}

void tst_VelSettings::opensAnEmptyFile()
{
    const QString file = write(s("rc"), "");
    VelSettings settings(file);
    QVERIFY(settings.isParsed());
    settings.setValue(s("a"), 1);
    settings.sync();
    QCOMPARE(read(file), QByteArray("a=1\n"));
}

void tst_VelSettings::opensADirectoryWithoutACrash()
{
    expectWarning(s("Cant register format!"));
    VelSettings settings(folder());
    QVERIFY(!settings.isParsed());
    QCOMPARE(settings.value(s("a"), 1), QVariant(1));
    settings.sync(true);
}

void tst_VelSettings::refusesWhatIsNoRegularFile_data()
{
    QTest::addColumn<QString>("file");
    QTest::newRow("pipe") << s("pipe");
    QTest::newRow("link to a pipe") << s("link");
    QTest::newRow("device") << s("/dev/zero");
}

void tst_VelSettings::refusesWhatIsNoRegularFile()
{
    QFETCH(QString, file);
    QCOMPARE(mkfifo(QFile::encodeName(path(s("pipe"))).constData(), 0600), 0);
    QVERIFY(QFile::link(s("pipe"), path(s("link"))));
    const QString name = QDir(folder()).filePath(file);
    expectWarning(s("No regular file: '%1'!").arg(name));
    VelSettings settings(name);
    QVERIFY(!settings.isParsed());
    QCOMPARE(settings.value(s("a"), 1), QVariant(1));
    settings.setValue(s("a"), 2);
    settings.sync();
}

void tst_VelSettings::refusesAFileAboveItsLimit()
{
    const QString one = write(s("one"), "a=1\n");
    const QString file = write(s("rc"), "a=2\n");
    QVERIFY(QFile::resize(file, VelSettings::LargestFile));
    VelSettings settings(file);
    QVERIFY(settings.isParsed());
    QVERIFY(settings.ParseConfigFile(one));

    QVERIFY(QFile::resize(file, VelSettings::LargestFile + 1));
    expectWarning(s("Too large: '%1'!").arg(file));
    QVERIFY(!settings.ParseConfigFile(file));
    QCOMPARE(settings.value(s("a")), QVariant(1)); // of the one before
}

void tst_VelSettings::leavesAFileThatGrewAboveItsLimit()
{
    const QString file = write(s("rc"), "a=1\n");
    VelSettings settings(file);
    write(s("rc"), "a=1\nb=2\n");
    QVERIFY(QFile::resize(file, VelSettings::LargestFile + 1));
    settings.setValue(s("c"), 3);
    settings.sync();
    settings.sync();
    QCOMPARE(QFileInfo(file).size(), VelSettings::LargestFile + 1);

    write(s("rc"), "a=1\nb=2\n");
    settings.sync();
    QCOMPARE(read(file), QByteArray("a=1\nb=2\nc=3\n"));
}

void tst_VelSettings::writesAFileThatWasEmptiedAfterItGrewAboveItsLimit()
{
    const QString file = write(s("rc"), "a=1\n");
    VelSettings settings(file);
    QVERIFY(QFile::resize(file, VelSettings::LargestFile + 1));
    settings.setValue(s("c"), 3);
    settings.sync();
    write(s("rc"), "");
    settings.sync();
    QCOMPARE(read(file), QByteArray("c=3\n"));
}

void tst_VelSettings::writesNoFileAboveItsLimit()
{
    const QString file = write(s("rc"), "a=1\n");
    VelSettings settings(file);
    settings.setValue(s("b"), QString(int(VelSettings::LargestFile), QLatin1Char('x')));
    settings.sync();
    QCOMPARE(read(file), QByteArray("a=1\n"));
    settings.remove(s("b"));
    settings.setValue(s("c"), 3);
    settings.sync();
    QCOMPARE(read(file), QByteArray("a=1\nc=3\n"));
}

void tst_VelSettings::doesNotWaitForAFileThatBecameAPipe()
{
    const QString file = write(s("rc"), "a=1\n");
    {
        VelSettings settings(file);
        settings.setValue(s("b"), 2);
        QVERIFY(QFile::remove(file));
        QCOMPARE(mkfifo(QFile::encodeName(file).constData(), 0600), 0);
        settings.sync();
    }
    QVERIFY(S_ISFIFO(statusOf(file).st_mode));
}

void tst_VelSettings::syncsNothingThatGaveAnErrorWhenItWasOpened()
{
    const QString file = path(s("rc"));
    QVERIFY(QDir().mkdir(file));
    expectWarning(s("Cant register format!"));
    VelSettings settings(file);
    QVERIFY(QDir().rmdir(file));
    write(s("rc"), "a=1\n");
    settings.setValue(s("a"), 2);
    settings.sync();
    QCOMPARE(read(file), QByteArray("a=1\n"));
}

void tst_VelSettings::sharesChangesBetweenObjectsOnOneFile()
{
    const QString file = write(s("rc"), "a=1\n");
    VelSettings one(file);
    VelSettings other(file);
    one.setValue(s("a"), 2);
    QCOMPARE(other.value(s("a")), QVariant(2));
}

// The last one: it takes all the formats that are left.
void tst_VelSettings::registersItsFormatOnceUnderItsExtension()
{
    const VelSettings one(write(s("one"), "a=1\n"));
    const VelSettings other(write(s("other"), "a=1\n"));
    QVERIFY(one.isParsed() && other.isParsed());
    const QSettings first(QSettings::CustomFormat1, QSettings::UserScope, s("organization"), s("program"));
    QVERIFY(first.fileName().endsWith(s("/program.themerc")));

    int left = 0;
    const auto read = [](QIODevice &, QSettings::SettingsMap &) { return false; };
    const auto write = [](QIODevice &, const QSettings::SettingsMap &) { return false; };
    while (QSettings::registerFormat(s("taken"), read, write) != QSettings::InvalidFormat)
        ++left;
    QCOMPARE(left, 15); // of sixteen
}

VEL_TEST_GUILESS_MAIN(tst_VelSettings)

#include "tst_VelSettings.moc"
