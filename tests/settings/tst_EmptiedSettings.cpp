// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// What becomes of a file, and of the objects on it, once its last key was removed.

#include "StderrCapture.h"
#include "TestCase.h"

#include <VelSettings.h>

#include <QDir>

#include <csignal>
#include <memory>

#include <sys/resource.h>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

// While it lives no file can grow beyond a few pages, as on a disk that is nearly full.
class NearlyFullDisk
{
public:
    NearlyFullDisk()
    {
        std::signal(SIGXFSZ, SIG_IGN);
        getrlimit(RLIMIT_FSIZE, &m_before);
        const rlimit limit = {8192, m_before.rlim_max};
        setrlimit(RLIMIT_FSIZE, &limit);
    }
    ~NearlyFullDisk() { setrlimit(RLIMIT_FSIZE, &m_before); }
    Q_DISABLE_COPY(NearlyFullDisk)

private:
    rlimit m_before = {};
};

} // namespace

class tst_EmptiedSettings : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void opensAgainAfterTheLastKeyWasRemoved_data();
    void opensAgainAfterTheLastKeyWasRemoved();
    void opensAgainWhileAnObjectThatRemovedTheLastKeyLives();
    void writesAKeyThatIsSetAfterTheLastOneWasRemoved();
    void keepsEverySlashedKeyWhenAllWereRemoved();
    void sparesAKeyThatComesFromElsewhereAfterTheLastOneWasRemoved();
    void forgetsTheRemovalOfTheLastKeyWithItsObject_data();
    void forgetsTheRemovalOfTheLastKeyWithItsObject();
    void leavesTheRemovalToTheObjectThatMadeIt();
    void keepsTheFileWhileTheRemovalCannotBeForgotten();
    void keepsEditsThatCouldNotBeWritten();
};

void tst_EmptiedSettings::opensAgainAfterTheLastKeyWasRemoved_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("removed");
    QTest::addColumn<bool>("syncs");
    QTest::newRow("one key, written at the end") << QByteArray("# kept\nonly=1\n") << s("only") << false;
    QTest::newRow("one key, synced") << QByteArray("# kept\nonly=1\n") << s("only") << true;
    QTest::newRow("header alone") << QByteArray("[Main]\n") << s("SectionName") << true;
    QTest::newRow("all keys") << QByteArray("[Main]\nonly=1\nb=2\n\n;c\n") << s("") << true;
}

void tst_EmptiedSettings::opensAgainAfterTheLastKeyWasRemoved()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, removed);
    QFETCH(bool, syncs);
    const QString file = write(s("rc"), bytes);
    StderrCapture capture;
    {
        VelSettings settings(file);
        settings.remove(removed);
        if (syncs) {
            settings.sync();
            QCOMPARE(read(file), bytes);
        }
        if (!removed.isEmpty())
            QCOMPARE(settings.value(removed), QVariant());
    }
    const QByteArray refusal("VelSettings: file isn't open or settings are empty\n");
    QVERIFY(capture.take().startsWith(refusal));
    QCOMPARE(read(file), bytes);

    const QByteArray lastOfAll = bytes.contains("[Main]") ? "[Main]\n" : "";
    const bool hadKey = bytes.contains("only");
    {
        VelSettings settings(file);
        QVERIFY(settings.isParsed());
        if (hadKey)
            QCOMPARE(settings.value(s("only")), QVariant(1));
        settings.setValue(s("new"), 3);
    }
    const QByteArray written = read(file);
    QVERIFY(written.startsWith(lastOfAll));
    QCOMPARE(written.contains("only=1\n"), hadKey);
    QCOMPARE(written.contains("b=2\n"), bytes.contains("b=2\n"));
    QVERIFY(written.contains("new=3\n"));
    QCOMPARE(QDir(folder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList{s("rc")});
}

void tst_EmptiedSettings::opensAgainWhileAnObjectThatRemovedTheLastKeyLives()
{
    const QByteArray bytes("# kept\nonly=1\n");
    const QString file = write(s("rc"), bytes);
    StderrCapture capture;
    VelSettings first(file);
    first.remove(s("only"));
    VelSettings second(file);
    capture.take();
    QVERIFY(second.isParsed());
    QCOMPARE(second.value(s("only")), QVariant(1));
    QCOMPARE(read(file), bytes);
    second.setValue(s("new"), 2);
    second.sync();
    QCOMPARE(read(file), QByteArray("new=2\nonly=1\n"));
}

void tst_EmptiedSettings::writesAKeyThatIsSetAfterTheLastOneWasRemoved()
{
    const QString file = write(s("rc"), "old=1\n");
    StderrCapture capture;
    VelSettings settings(file);
    settings.remove(s("old"));
    settings.sync();
    capture.take();
    settings.setValue(s("new"), 2);
    settings.sync();
    QCOMPARE(read(file), QByteArray("new=2\n"));
}

void tst_EmptiedSettings::keepsEverySlashedKeyWhenAllWereRemoved()
{
    const QString file = write(s("rc"), "//dbl=1\n/lead=2\nonly=3\ntrail/=4\n");
    StderrCapture capture;
    {
        VelSettings settings(file);
        settings.remove(QString());
    }
    capture.take();
    {
        VelSettings settings(file);
        settings.setValue(s("only"), 5);
    }
    QCOMPARE(read(file), QByteArray("//dbl=1\n/lead=2\nonly=5\ntrail/=4\n"));
}

void tst_EmptiedSettings::sparesAKeyThatComesFromElsewhereAfterTheLastOneWasRemoved()
{
    const QString file = write(s("rc"), "only=1\n");
    StderrCapture capture;
    VelSettings settings(file);
    settings.remove(s("only"));
    settings.sync();
    capture.take();
    write(s("rc"), "from=elsewhere\nonly=1\n");
    settings.sync();
    QCOMPARE(read(file), QByteArray("from=elsewhere\n"));
    QCOMPARE(settings.value(s("from")), QVariant(s("elsewhere")));
}

void tst_EmptiedSettings::forgetsTheRemovalOfTheLastKeyWithItsObject_data()
{
    QTest::addColumn<bool>("syncs");
    QTest::newRow("not synced") << false;
    QTest::newRow("synced") << true;
}

void tst_EmptiedSettings::forgetsTheRemovalOfTheLastKeyWithItsObject()
{
    QFETCH(bool, syncs);
    const QString file = write(s("rc"), "only=1\n");
    StderrCapture capture;
    {
        VelSettings settings(file);
        settings.remove(s("only"));
        if (syncs)
            settings.sync();
    }
    capture.take();
    // With this key the removal could be carried out, long after its time.
    const QByteArray longer("from=elsewhere\nonly=1\n");
    write(s("rc"), longer);
    VelSettings later(file);
    QCOMPARE(read(file), longer);
    QCOMPARE(later.value(s("only")), QVariant(1));
    QCOMPARE(later.value(s("from")), QVariant(s("elsewhere")));
}

void tst_EmptiedSettings::leavesTheRemovalToTheObjectThatMadeIt()
{
    const QString file = write(s("rc"), "only=1\n");
    const QString elsewhere = write(s("elsewhere"), "a=1\nb=2\n");
    StderrCapture capture;
    VelSettings settings(file);
    auto other = std::make_unique<VelSettings>(elsewhere);
    other->remove(s("b"));
    QVERIFY(other->ParseConfigFile(file));
    settings.remove(s("only"));
    other.reset();
    settings.setValue(s("new"), 2);
    settings.sync();
    capture.take();
    QCOMPARE(read(file), QByteArray("new=2\n"));
}

void tst_EmptiedSettings::keepsTheFileWhileTheRemovalCannotBeForgotten()
{
    const QByteArray bytes("# kept\nonly=1\n");
    const QString file = write(s("folder/rc"), bytes);
    StderrCapture capture;
    {
        VelSettings settings(file);
        settings.remove(s("only"));
        // Nothing can be written for a while.
        QVERIFY(QDir(folder()).rename(s("folder"), s("away")));
        write(s("folder"), "");
    }
    QVERIFY(QFile::remove(path(s("folder"))));
    QVERIFY(QDir(folder()).rename(s("away"), s("folder")));
    const VelSettings later(file);
    capture.take();
    QVERIFY(later.isParsed());
    QCOMPARE(later.value(s("only")), QVariant(1));
    QCOMPARE(read(file), bytes);
}

void tst_EmptiedSettings::keepsEditsThatCouldNotBeWritten()
{
    const QString file = write(s("rc"), "a=1\n");
    const QByteArray text(20000, 'x');
    VelSettings settings(file);
    settings.setValue(s("b"), QString::fromLatin1(text));
    {
        const NearlyFullDisk disk;
        expectWarning(s("Cant register format!"));
        const VelSettings later(file);
        QVERIFY(!later.isParsed());
        QCOMPARE(read(file), QByteArray("a=1\n"));
    }
    settings.sync();
    QCOMPARE(read(file), "a=1\nb=" + text + '\n');
}

VEL_TEST_GUILESS_MAIN(tst_EmptiedSettings)

#include "tst_EmptiedSettings.moc"
