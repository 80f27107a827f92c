// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <EntryFile.h>
#include <SharedTexts.h>
#include <TextsAhead.h>

#include <QSet>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

/// Texts that are read before anybody asks for them.
class tst_TextsAhead : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void readsWhatAModelOfTheFolderAsksFor();
    void endsItsThreads();
    void readsWhatIsNotInMemory();
    void handsATextOverToTheFirstLoad();
    void leavesOutWhatIsTooYoung();
    void givesNothingThatHasChanged_data();
    void givesNothingThatHasChanged();
    void staysWithinItsLimit();
    void readsOnWhenTextsWereTaken();
    void givesTheTextWithItsIndex();
    void forgetsWhatIsGivenUp();
    void takesWhatOneOfTwoFoldersLeft();
    void copesWithWhatIsNoFolder();

private:
    void settle(const QString &name);
    std::string folder(const char *name)
    {
        return QFile::encodeName(path(QLatin1String(name))).toStdString();
    }
};

namespace {

TextsAhead::Ticket readAll(const std::string &folder)
{
    TextsAhead::Ticket ticket = TextsAhead::instance().read(folder);
    TextsAhead::instance().wait();
    return ticket;
}

// Where the file system is one in memory, it stays there.
void sendToDisk(const QString &path)
{
    const int file = ::open(QFile::encodeName(path).constData(), O_RDONLY | O_CLOEXEC);
    QVERIFY(file >= 0);
    QCOMPARE(::fdatasync(file), 0);
    QCOMPARE(::posix_fadvise(file, 0, 0, POSIX_FADV_DONTNEED), 0);
    QCOMPARE(::close(file), 0);
}

QByteArray taken(const std::string &path)
{
    const auto file = TextsAhead::instance().take(path);
    return file ? QByteArray(file->text->bytes().data(), int(file->text->bytes().size())) : QByteArray();
}

} // namespace

void tst_TextsAhead::init()
{
    TestCase::init();
    SharedTexts::instance().clear();
}

// Waits until the stamp of a file is worth something, and so are those of the files before it.
void tst_TextsAhead::settle(const QString &name)
{
    const QByteArray file = QFile::encodeName(path(name));
    QTRY_VERIFY(EntryFile::read(file)->settled);
}

void tst_TextsAhead::readsWhatAModelOfTheFolderAsksFor()
{
    write(QStringLiteral("m/a.desktop"), "a");
    write(QStringLiteral("m/.directory"), "record");
    write(QStringLiteral("m/sub/.directory"), "sub");
    write(QStringLiteral("m/sub/b.desktop"), "b");
    write(QStringLiteral("m/plain"), "plain");
    write(QStringLiteral("m/last.desktop"), "last");
    settle(QStringLiteral("m/last.desktop"));
    const std::string m = folder("m");
    QVERIFY(TextsAhead::instance().isEmpty());
    const auto ticket = readAll(m + '/');
    QVERIFY(!TextsAhead::instance().isEmpty());
    QCOMPARE(taken(m + "/a.desktop"), QByteArray("a"));
    QCOMPARE(taken(m + "/.directory"), QByteArray("record"));
    QCOMPARE(taken(m + "/sub/.directory"), QByteArray("sub"));
    QCOMPARE(taken(m + "/last.desktop"), QByteArray("last"));
    QVERIFY(taken(m + "/sub/b.desktop").isEmpty());
    QVERIFY(taken(m + "/plain").isEmpty());
    QVERIFY2(taken(m + "/a.desktop").isEmpty(), "it is taken once");
    QVERIFY2(TextsAhead::instance().isEmpty(), "and nobody asks for it any more");
    QCOMPARE(TextsAhead::instance().cost(), std::size_t(0));
}

void tst_TextsAhead::endsItsThreads()
{
    for (int i = 0; i < 300; ++i)
        write(QStringLiteral("m/%1.desktop").arg(i), "x");
    const auto ticket = TextsAhead::instance().read(folder("m"));
    QVERIFY(TextsAhead::instance().threads() <= TextsAhead::MostThreads);
    QTRY_COMPARE(TextsAhead::instance().threads(), 0);
    TextsAhead::instance().giveUp(ticket);
}

void tst_TextsAhead::readsWhatIsNotInMemory()
{
    constexpr int Files = int(TextsAhead::Limit / 20000) * 2;
    const auto name = [](int number) { return QStringLiteral("m/%1.desktop").arg(number); };
    for (int i = 0; i < Files; ++i)
        write(name(i), QByteArray(20000, '#'));
    settle(name(Files - 1));
    for (int i = 0; i < Files; ++i)
        sendToDisk(path(name(i)));

    // They are more than there is room for.
    const auto ticket = readAll(folder("m"));
    QCOMPARE(TextsAhead::instance().threads(), 0);
    QVERIFY(TextsAhead::instance().cost() <= TextsAhead::Limit);
    int read = 0;
    for (int i = 0; i < Files; ++i)
        read += taken(QFile::encodeName(path(name(i))).toStdString()).size() == 20000 ? 1 : 0;
    QVERIFY2(read > Files / 4, qPrintable(QString::number(read)));
    TextsAhead::instance().giveUp(ticket);
    QTRY_COMPARE(TextsAhead::instance().threads(), 0);
    QVERIFY(TextsAhead::instance().isEmpty());
}

void tst_TextsAhead::handsATextOverToTheFirstLoad()
{
    write(QStringLiteral("m/a.desktop"), "[Desktop Entry]\n");
    settle(QStringLiteral("m/a.desktop"));
    const QByteArray file = QByteArray::fromStdString(folder("m") + "/a.desktop");
    const auto ticket = readAll(folder("m"));
    const SharedTexts::Reader none = [](const QByteArray &) { return std::optional<FileText>(); };
    QVERIFY(SharedTexts::instance().findOrRead(file, none));
    QCOMPARE(TextsAhead::instance().cost(), std::size_t(0));
    QVERIFY2(!SharedTexts::instance().findOrRead(file, none), "it is not kept from the first time on");
    QVERIFY(SharedTexts::instance().findOrRead(file, EntryFile::read));
    QVERIFY2(SharedTexts::instance().findOrRead(file, none), "it is from the second one on");
}

void tst_TextsAhead::leavesOutWhatIsTooYoung()
{
    // Of the future, so that no machine is slow enough for it.
    const QByteArray file = QFile::encodeName(write(QStringLiteral("m/a.desktop"), "x"));
    timespec now;
    ::clock_gettime(CLOCK_REALTIME, &now);
    const timespec times[] = {{now.tv_sec + 3600, 0}, {now.tv_sec + 3600, 0}};
    QCOMPARE(::utimensat(AT_FDCWD, file.constData(), times, 0), 0);
    const auto ticket = readAll(folder("m"));
    QVERIFY(taken(file.toStdString()).isEmpty());
}

void tst_TextsAhead::givesNothingThatHasChanged_data()
{
    QTest::addColumn<QString>("how");
    for (const char *how : {"same size, old time put back", "replaced", "gone", "touched", "a folder now"})
        QTest::newRow(how) << QString(QLatin1String(how));
}

void tst_TextsAhead::givesNothingThatHasChanged()
{
    QFETCH(QString, how);
    const QByteArray file = QFile::encodeName(write(QStringLiteral("m/a.desktop"), "A"));
    settle(QStringLiteral("m/a.desktop"));
    const auto ticket = readAll(folder("m"));
    QVERIFY(TextsAhead::instance().cost() > 0);
    struct stat status;
    QCOMPARE(::stat(file.constData(), &status), 0);
    const timespec times[] = {status.st_atim, status.st_mtim};
    if (how == QLatin1String("same size, old time put back")) {
        write(QStringLiteral("m/a.desktop"), "B");
        QCOMPARE(::utimensat(AT_FDCWD, file.constData(), times, 0), 0);
    } else if (how == QLatin1String("replaced")) {
        const QByteArray other = QFile::encodeName(write(QStringLiteral("b"), "B"));
        QCOMPARE(::utimensat(AT_FDCWD, other.constData(), times, 0), 0);
        QCOMPARE(::rename(other.constData(), file.constData()), 0);
    } else if (how == QLatin1String("touched")) {
        QCOMPARE(::utimensat(AT_FDCWD, file.constData(), nullptr, 0), 0);
    } else {
        QVERIFY(QFile::remove(QFile::decodeName(file)));
        if (how == QLatin1String("a folder now"))
            QCOMPARE(::mkdir(file.constData(), 0700), 0);
    }
    QVERIFY(taken(file.toStdString()).isEmpty());
    QCOMPARE(TextsAhead::instance().cost(), std::size_t(0));
}

void tst_TextsAhead::staysWithinItsLimit()
{
    constexpr int Size = 100000;
    constexpr int Files = int(TextsAhead::Limit / Size) + 40;
    for (int i = 0; i < Files; ++i)
        write(QStringLiteral("m/%1.desktop").arg(i), QByteArray(Size, '#'));
    settle(QStringLiteral("m/%1.desktop").arg(Files - 1));
    const auto ticket = readAll(folder("m"));
    QVERIFY(TextsAhead::instance().cost() <= TextsAhead::Limit);
    QVERIFY(TextsAhead::instance().cost() > TextsAhead::Limit / 2);
    TextsAhead::instance().giveUp(ticket);
    QCOMPARE(TextsAhead::instance().cost(), std::size_t(0));
}

void tst_TextsAhead::readsOnWhenTextsWereTaken()
{
    constexpr int Size = 100000;
    constexpr int Files = int(TextsAhead::Limit / Size) * 3;
    const auto name = [](int number) { return QStringLiteral("m/%1.desktop").arg(number); };
    for (int i = 0; i < Files; ++i)
        write(name(i), QByteArray(Size, '#'));
    settle(name(Files - 1));
    const auto ticket = readAll(folder("m"));
    // In any order: all but a few come by and by, for which there was no room when they were read.
    QSet<QString> left;
    for (int i = 0; i < Files; ++i)
        left.insert(path(name(i)));
    for (int before = -1; before != left.size();) {
        before = left.size();
        for (const QString &file : left.values()) {
            TextsAhead::instance().wait();
            QVERIFY(TextsAhead::instance().cost() <= TextsAhead::Limit);
            if (!TextsAhead::instance().isRead(QFile::encodeName(file).toStdString()))
                continue;
            QCOMPARE(taken(QFile::encodeName(file).toStdString()).size(), Size);
            left.remove(file);
        }
    }
    QVERIFY2(left.size() <= Files / 10, qPrintable(QString::number(left.size())));
    TextsAhead::instance().giveUp(ticket);
    QVERIFY(TextsAhead::instance().isEmpty());
}

void tst_TextsAhead::givesTheTextWithItsIndex()
{
    QByteArray bytes = "\xEF\xBB\xBF# first\n[Desktop Entry]\nName=n\nName[de]=d\nName[en]=e\nIcon=i\n";
    for (int i = 0; i < 40; ++i)
        bytes += "[Desktop Action " + QByteArray::number(i) + "]\nName=a\n";
    const QByteArray file = QFile::encodeName(write(QStringLiteral("m/a.desktop"), bytes));
    settle(QStringLiteral("m/a.desktop"));
    const auto ticket = readAll(folder("m"));
    const auto ahead = TextsAhead::instance().take(file.toStdString());
    const auto read = EntryFile::read(file);
    QVERIFY(ahead && read && ahead->stamp == read->stamp);
    QVERIFY(ahead->text->bytes() == read->text->bytes());
    QCOMPARE(ahead->text->groups().size(), read->text->groups().size());
    QCOMPARE(ahead->text->cost(), read->text->cost());
    for (const char *const group : {"Desktop Entry", "Desktop Action 0", "Desktop Action 39", "none"}) {
        QCOMPARE(ahead->text->group(group), read->text->group(group));
        for (const char *const locale : {"", "de", "en", "fr"}) {
            const auto ours = ahead->text->key(ahead->text->group(group), "Name", locale);
            const auto theirs = read->text->key(read->text->group(group), "Name", locale);
            QCOMPARE(bool(ours), bool(theirs));
            QVERIFY(!ours || ahead->text->value(*ours) == read->text->value(*theirs));
        }
    }
}

void tst_TextsAhead::forgetsWhatIsGivenUp()
{
    for (int i = 0; i < 500; ++i)
        write(QStringLiteral("m/%1.desktop").arg(i), "x");
    settle(QStringLiteral("m/499.desktop"));
    // While it is listed, while it is read, and afterwards.
    for (int round = 0; round < 60; ++round) {
        const auto ticket = TextsAhead::instance().read(folder("m"));
        for (int i = 0; i < round * 4; ++i)
            taken(folder("m") + '/' + std::to_string(i) + ".desktop");
        if (round % 10 == 9)
            TextsAhead::instance().wait();
        TextsAhead::instance().giveUp(ticket);
        QCOMPARE(TextsAhead::instance().cost(), std::size_t(0));
        QVERIFY(TextsAhead::instance().isEmpty());
        QVERIFY(taken(folder("m") + "/499.desktop").isEmpty());
    }
    QTRY_COMPARE(TextsAhead::instance().threads(), 0);
}

void tst_TextsAhead::takesWhatOneOfTwoFoldersLeft()
{
    write(QStringLiteral("m/sub/.directory"), "x");
    settle(QStringLiteral("m/sub/.directory"));
    const auto outer = readAll(folder("m"));
    const auto inner = readAll(folder("m/sub"));
    TextsAhead::instance().giveUp(inner);
    QCOMPARE(taken(folder("m/sub") + "/.directory"), QByteArray("x"));
    TextsAhead::instance().giveUp(outer);
    TextsAhead::instance().giveUp(outer);
    TextsAhead::instance().giveUp(nullptr);
}

void tst_TextsAhead::copesWithWhatIsNoFolder()
{
    write(QStringLiteral("m/a.desktop"), "x");
    settle(QStringLiteral("m/a.desktop"));
    for (const std::string &path : {folder("none"), folder("m/a.desktop"), std::string(), std::string("/")})
        TextsAhead::instance().giveUp(readAll(path));
    QCOMPARE(TextsAhead::instance().cost(), std::size_t(0));
}

VEL_TEST_GUILESS_MAIN(tst_TextsAhead)

#include "tst_TextsAhead.moc"
