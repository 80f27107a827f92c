// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <EntryDocument.h>
#include <EntryFile.h>
#include <SharedTexts.h>

#include <QDir>
#include <QProcess>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <ctime>

/// The memory of texts that records share.
class tst_SharedTexts : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void settlesWhenALaterChangeIsSureToShow_data();
    void settlesWhenALaterChangeIsSureToShow();
    void readsAnewWhatChangedWithinASecond();
    void keepsATextFromTheSecondLoadOn();
    void doesNotKeepAFileThatIsTooYoung();
    void doesNotKeepAFileFromTheFuture();
    void readsAnewWhatHasChanged_data();
    void readsAnewWhatHasChanged();
    void staysWithinItsLimit();
    void forgetsTheLeastRecentlyUsed();
    void forgetsWhatIsSaved();

private:
    QByteArray settled(const QString &name, const QByteArray &bytes);
};

void tst_SharedTexts::init()
{
    TestCase::init();
    SharedTexts::instance().clear();
}

// Writes a file and waits until its stamp is worth something.
QByteArray tst_SharedTexts::settled(const QString &name, const QByteArray &bytes)
{
    const QByteArray file = QFile::encodeName(write(name, bytes));
    const auto isSettled = [&file] {
        const auto read = EntryFile::read(file);
        return read && read->settled;
    };
    if (!QTest::qWaitFor(isSettled))
        QTest::qFail("the file does not settle", __FILE__, __LINE__);
    return file;
}

void tst_SharedTexts::settlesWhenALaterChangeIsSureToShow_data()
{
    constexpr qint64 Even = 1600000000LL * 1000000000;
    constexpr qint64 Odd = Even + 1000000000;
    constexpr qint64 Millisecond = 1000000;
    QTest::addColumn<qint64>("modified");
    QTest::addColumn<qint64>("changed");
    QTest::addColumn<qint64>("waited"); // since the later of the two
    QTest::addColumn<bool>("settled");
    const auto row = [](const char *title, qint64 modified, qint64 changed, qint64 waited, bool settled) {
        QTest::newRow(title) << modified << changed << waited * Millisecond << settled;
    };
    row("fine, young", Odd + 1, Odd + 1, 49, false);
    row("fine, old enough", Odd + 1, Odd + 1, 50, true);
    row("whole seconds, young", Odd, Odd, 1999, false);
    row("whole seconds, old enough", Odd, Odd, 2000, true);
    row("modification set to a whole second", Odd, Odd + 1, 50, true);
    row("change at a whole second by chance", Odd + 1, Odd, 50, true);
    row("even second, young", Even, Even + 10 * Millisecond, 1999, false);
    row("even second, old enough", Even, Even + 10 * Millisecond, 2000, true);
    row("from the future", Odd + 1, Odd + 1, -1, false);
}

void tst_SharedTexts::settlesWhenALaterChangeIsSureToShow()
{
    QFETCH(qint64, modified);
    QFETCH(qint64, changed);
    QFETCH(qint64, waited);
    QFETCH(bool, settled);
    const auto time = [](qint64 nanoseconds) {
        return timespec{time_t(nanoseconds / 1000000000), long(nanoseconds % 1000000000)};
    };
    struct stat status = {};
    status.st_mtim = time(modified);
    status.st_ctim = time(changed);
    QCOMPARE(FileStamp(status).isSettled(qMax(modified, changed) + waited), settled);
}

namespace {

// A file system that keeps whole seconds; needs root.
class CoarseFileSystem
{
public:
    explicit CoarseFileSystem(const QString &folder)
        : m_folder(folder)
    {
        QFile image(folder + QStringLiteral(".image"));
        m_isMounted = ::geteuid() == 0 && QDir().mkpath(folder) && image.open(QIODevice::WriteOnly)
            && image.resize(2 * 1024 * 1024)
            && run({QStringLiteral("/sbin/mkfs.ext2"), QStringLiteral("-q"), QStringLiteral("-F"),
                    QStringLiteral("-I"), QStringLiteral("128"), image.fileName()})
            && run({QStringLiteral("mount"), QStringLiteral("-o"), QStringLiteral("loop"), image.fileName(),
                    folder});
    }
    ~CoarseFileSystem()
    {
        if (m_isMounted)
            run({QStringLiteral("umount"), m_folder});
    }
    Q_DISABLE_COPY(CoarseFileSystem)

    bool isMounted() const { return m_isMounted; }

private:
    static bool run(QStringList command)
    {
        QProcess process;
        const QString program = command.takeFirst();
        process.start(program, command);
        return process.waitForFinished() && process.exitStatus() == QProcess::NormalExit
            && process.exitCode() == 0;
    }

    QString m_folder;
    bool m_isMounted;
};

FileStamp stampOf(const QByteArray &file)
{
    struct stat status = {};
    return ::stat(file.constData(), &status) == 0 ? FileStamp(status) : FileStamp();
}

qint64 millisecondsOfSecond()
{
    timespec now;
    ::clock_gettime(CLOCK_REALTIME, &now);
    return now.tv_nsec / 1000000;
}

} // namespace

void tst_SharedTexts::readsAnewWhatChangedWithinASecond()
{
    const CoarseFileSystem coarse(path(QStringLiteral("coarse")));
    if (!coarse.isMounted())
        QSKIP("a file system that keeps whole seconds cannot be mounted here");
    const QByteArray file = QFile::encodeName(path(QStringLiteral("coarse/x")));
    EntryDocument document;
    document.setPath(file);
    // All within one second: written, old enough for other file systems, read, written again. A
    // busy machine may take longer.
    constexpr int Attempts = 20;
    bool sameStamp = false;
    for (int i = 0; i < Attempts && !sameStamp; ++i) {
        QVERIFY(QTest::qWaitFor([] { return millisecondsOfSecond() < 100; }));
        write(QStringLiteral("coarse/x"), "[A]\n");
        QVERIFY(QTest::qWaitFor([] { return millisecondsOfSecond() >= 300; }));
        const FileStamp before = stampOf(file);
        QVERIFY(document.load());
        write(QStringLiteral("coarse/x"), "[B]\n");
        sameStamp = stampOf(file) == before;
    }
    if (!sameStamp)
        QSKIP("the machine was too slow to write twice within a second");

    QCOMPARE(EntryFile::read(file)->text->bytes(), std::string_view("[B]\n"));
    document.setText("B", "Key", QStringLiteral("1"));
    QVERIFY(document.save());
    QCOMPARE(read(path(QStringLiteral("coarse/x"))), QByteArray("[B]\nKey=1\n"));
}

void tst_SharedTexts::keepsATextFromTheSecondLoadOn()
{
    const QByteArray file = settled(QStringLiteral("x"), "[Desktop Entry]\n");
    const auto first = SharedTexts::instance().findOrRead(file, EntryFile::read);
    QCOMPARE(SharedTexts::instance().cost(), std::size_t(0));
    const auto second = SharedTexts::instance().findOrRead(file, EntryFile::read);
    QVERIFY(SharedTexts::instance().cost() > 0);
    const auto third = SharedTexts::instance().findOrRead(file, EntryFile::read);
    QVERIFY(first && second && third);
    QVERIFY(first->text.get() != second->text.get());
    QCOMPARE(third->text.get(), second->text.get());
    QVERIFY(EntryFile::read(file)->text.get() != third->text.get());
}

void tst_SharedTexts::doesNotKeepAFileThatIsTooYoung()
{
    const QByteArray file = QFile::encodeName(write(QStringLiteral("x"), "[Desktop Entry]\n"));
    SharedTexts::instance().findOrRead(file, EntryFile::read);
    const auto second = SharedTexts::instance().findOrRead(file, EntryFile::read);
    QVERIFY(second);
    if (second->settled)
        QSKIP("the machine was too slow to read the file within 50 ms");
    QCOMPARE(SharedTexts::instance().cost(), std::size_t(0));
}

void tst_SharedTexts::doesNotKeepAFileFromTheFuture()
{
    const QByteArray file = settled(QStringLiteral("x"), "[Desktop Entry]\n");
    struct timespec now;
    ::clock_gettime(CLOCK_REALTIME, &now);
    const struct timespec times[] = {{now.tv_sec + 3600, 0}, {now.tv_sec + 3600, 0}};
    QCOMPARE(::utimensat(AT_FDCWD, file.constData(), times, 0), 0);
    for (int i = 0; i < 2; ++i)
        QVERIFY(!SharedTexts::instance().findOrRead(file, EntryFile::read)->settled);
    QCOMPARE(SharedTexts::instance().cost(), std::size_t(0));
}

void tst_SharedTexts::readsAnewWhatHasChanged_data()
{
    QTest::addColumn<QString>("how");
    QTest::newRow("same size, old time put back") << QStringLiteral("in place");
    QTest::newRow("another file of that name") << QStringLiteral("replaced");
    QTest::newRow("gone") << QStringLiteral("gone");
    QTest::newRow("touched") << QStringLiteral("touched");
}

void tst_SharedTexts::readsAnewWhatHasChanged()
{
    QFETCH(QString, how);
    const QByteArray file = settled(QStringLiteral("x"), "[A]\n");
    SharedTexts::instance().findOrRead(file, EntryFile::read);
    const auto first = SharedTexts::instance().findOrRead(file, EntryFile::read);
    QVERIFY(SharedTexts::instance().cost() > 0);
    struct stat status;
    QCOMPARE(::stat(file.constData(), &status), 0);
    const struct timespec times[] = {status.st_atim, status.st_mtim};
    if (how == QLatin1String("in place")) {
        write(QStringLiteral("x"), "[B]\n");
        QCOMPARE(::utimensat(AT_FDCWD, file.constData(), times, 0), 0);
    } else if (how == QLatin1String("replaced")) {
        const QByteArray other = QFile::encodeName(write(QStringLiteral("y"), "[B]\n"));
        QCOMPARE(::utimensat(AT_FDCWD, other.constData(), times, 0), 0);
        QCOMPARE(::rename(other.constData(), file.constData()), 0);
    } else if (how == QLatin1String("gone")) {
        QVERIFY(QFile::remove(QFile::decodeName(file)));
    } else {
        QCOMPARE(::utimensat(AT_FDCWD, file.constData(), nullptr, 0), 0);
    }
    const auto second = SharedTexts::instance().findOrRead(file, EntryFile::read);
    if (how == QLatin1String("gone")) {
        QVERIFY(!second);
        return;
    }
    QVERIFY(second && second->text.get() != first->text.get());
    QCOMPARE(second->text->bytes() == "[B]\n", how != QLatin1String("touched"));
}

void tst_SharedTexts::staysWithinItsLimit()
{
    const QByteArray file = settled(QStringLiteral("x"), "[Desktop Entry]\n" + QByteArray(100000, '#'));
    const auto text = EntryFile::read(file);
    SharedTexts texts;
    for (int i = 0; i < 200; ++i) {
        texts.insert(QByteArray::number(i), *text);
        QVERIFY(texts.cost() <= SharedTexts::Limit);
    }
    QVERIFY(texts.cost() > SharedTexts::Limit / 2);
    texts.clear();
    QCOMPARE(texts.cost(), std::size_t(0));
}

void tst_SharedTexts::forgetsTheLeastRecentlyUsed()
{
    const QByteArray used = settled(QStringLiteral("used"), "[Desktop Entry]\n" + QByteArray(100000, '#'));
    const QByteArray unused =
        settled(QStringLiteral("unused"), "[Desktop Entry]\n" + QByteArray(100000, '#'));
    SharedTexts texts;
    const auto file = EntryFile::read(used);
    texts.insert(used, *file);
    texts.insert(unused, *EntryFile::read(unused));
    for (int i = 0; i < 200; ++i) {
        texts.insert(QByteArray::number(i), *file);
        QVERIFY(texts.find(used));
    }
    QVERIFY(!texts.find(unused));
}

void tst_SharedTexts::forgetsWhatIsSaved()
{
    const QByteArray file = settled(QStringLiteral("x"), "[Desktop Entry]\n");
    EntryDocument document;
    document.setPath(file);
    QVERIFY(document.load());
    QVERIFY(document.load());
    QVERIFY(SharedTexts::instance().cost() > 0);
    document.setText("Desktop Entry", "Name", QStringLiteral("A"));
    QVERIFY(document.save());
    QCOMPARE(SharedTexts::instance().cost(), std::size_t(0));
}

VEL_TEST_GUILESS_MAIN(tst_SharedTexts)

#include "tst_SharedTexts.moc"
