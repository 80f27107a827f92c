// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <EntryDocument.h>
#include <EntryFile.h>
#include <SharedTexts.h>

#include <fcntl.h>
#include <sys/stat.h>

/// The memory of texts that records share.
class tst_SharedTexts : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void givesOneTextForAnUnchangedFile();
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

void tst_SharedTexts::givesOneTextForAnUnchangedFile()
{
    const QByteArray file = settled(QStringLiteral("x"), "[Desktop Entry]\n");
    const auto first = SharedTexts::instance().findOrRead(file, EntryFile::read);
    const auto second = SharedTexts::instance().findOrRead(file, EntryFile::read);
    QVERIFY(first && second);
    QCOMPARE(first->text.get(), second->text.get());
    QVERIFY(EntryFile::read(file)->text.get() != first->text.get());
}

void tst_SharedTexts::doesNotKeepAFileThatIsTooYoung()
{
    const QByteArray file = QFile::encodeName(write(QStringLiteral("x"), "[Desktop Entry]\n"));
    const auto first = SharedTexts::instance().findOrRead(file, EntryFile::read);
    QVERIFY(first);
    if (first->settled)
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
    const auto first = SharedTexts::instance().findOrRead(file, EntryFile::read);
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
    QVERIFY(SharedTexts::instance().cost() > 0);
    document.setText("Desktop Entry", "Name", QStringLiteral("A"));
    QVERIFY(document.save());
    QCOMPARE(SharedTexts::instance().cost(), std::size_t(0));
}

VEL_TEST_GUILESS_MAIN(tst_SharedTexts)

#include "tst_SharedTexts.moc"
