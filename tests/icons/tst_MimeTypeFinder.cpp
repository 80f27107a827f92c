// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <icons/MimeTypeFinder.h>

#include <QDir>
#include <QElapsedTimer>
#include <QMimeDatabase>
#include <QProcess>
#include <QStandardPaths>

#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

namespace {

/// The bytes that this process has read; 0 when nobody counts them.
qint64 readSoFar()
{
    QFile counters(QStringLiteral("/proc/self/io"));
    if (!counters.open(QIODevice::ReadOnly))
        return 0;
    const QByteArray first = counters.readLine(); // "rchar: 4711"
    return first.mid(first.indexOf(' ')).trimmed().toLongLong();
}

} // namespace

class tst_MimeTypeFinder : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void agreesWithTheDatabaseOnEveryPattern_data();
    void agreesWithTheDatabaseOnEveryPattern();
    void agreesWithTheDatabaseOnOddNames_data();
    void agreesWithTheDatabaseOnOddNames();
    void agreesWithTheDatabaseOnWhatIsNoFile_data();
    void agreesWithTheDatabaseOnWhatIsNoFile();
    void agreesWithTheDatabaseOnAnyFileName();
    void seesAFileThatBecameAPipe();
    void seesContentsThatChanged();
    void followsTheDatabase();
    void readsNoHugeCache();

private:
    static QString own(const QString &path)
    {
        return MimeTypeFinder::instance().typeOf(QFileInfo(path)).name();
    }
    static QString qt(const QString &path) { return QMimeDatabase().mimeTypeForFile(QFileInfo(path)).name(); }
    void compareWithContents(const QString &name, int kinds = 10);
};

void tst_MimeTypeFinder::compareWithContents(const QString &name, int kinds)
{
    static const QByteArrayList allContents{
        QByteArray(),
        "plain text\n",
        "\x89PNG\r\n\x1a\n0000IHDR",
        "%PDF-1.4\n",
        "\x7f"
        "ELF\2\1\1",
        "PK\3\4",
        "<?xml version=\"1.0\"?><svg xmlns=\"http://www.w3.org/2000/svg\"/>",
        "[Desktop Entry]\nType=Application\n",
        "#!/bin/sh\n",
        QByteArray("\0\1\2\3\xff\xfe", 6),
    };
    const QString path = folder() + QLatin1Char('/') + name;
    for (const QByteArray &contents : allContents.mid(0, kinds)) {
        QFile file(path);
        if (!file.open(QIODevice::WriteOnly))
            return; // longer than a name may be
        file.write(contents);
        file.close();
        QCOMPARE(MimeTypeFinder::instance().typeOf(QFileInfo(path)), QMimeDatabase().mimeTypeForFile(path));
        QCOMPARE(own(path), qt(path));
    }
    QFile::remove(path);
    QCOMPARE(own(path), qt(path));
}

void tst_MimeTypeFinder::agreesWithTheDatabaseOnEveryPattern_data()
{
    QTest::addColumn<QString>("pattern");
    QFile file(QStringLiteral("/usr/share/mime/globs2"));
    if (!file.open(QIODevice::ReadOnly))
        QSKIP("no MIME database is installed");
    for (const QByteArray &line : file.readAll().split('\n')) {
        if (!line.isEmpty() && !line.startsWith('#'))
            QTest::newRow(line.constData()) << QString::fromUtf8(line.split(':').value(2));
    }
}

void tst_MimeTypeFinder::agreesWithTheDatabaseOnEveryPattern()
{
    QFETCH(QString, pattern);
    pattern.replace(QRegularExpression(QStringLiteral("\\[([^]])[^]]*\\]")), QStringLiteral("\\1"));
    pattern.replace(QLatin1Char('?'), QLatin1Char('q'));
    for (const char *filling : {"", "a", "Some name", ".hidden", "README", "x-y", "a.so.1", "a.desktop"}) {
        QString name = pattern;
        name.replace(QLatin1Char('*'), QLatin1String(filling));
        if (name.isEmpty() || name.contains(QLatin1Char('/')))
            continue;
        const QString path = write(name, "plain text\n");
        QCOMPARE(own(path), qt(path));
    }
    QString name = pattern;
    name.replace(QLatin1Char('*'), QLatin1String("a"));
    compareWithContents(name, 3);
    compareWithContents(name.toUpper(), 3);
}

void tst_MimeTypeFinder::agreesWithTheDatabaseOnOddNames_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"a",
                             "core",
                             "CORE",
                             "Core",
                             "core.1",
                             "makefile",
                             "Makefile",
                             "MAKEFILE",
                             "makefile.am",
                             "x-foo.desktop",
                             "x-.desktop",
                             ".desktop",
                             "..desktop",
                             "a.Desktop",
                             "a.DESKTOP",
                             "a.desktop~",
                             "a.desktop.bak",
                             ".directory",
                             "a.directory",
                             "a.c",
                             "a.C",
                             "a.cc",
                             "a.h",
                             "a.H",
                             "a.hs",
                             "a.m",
                             "a.doc",
                             "a.pcf",
                             "a.ppt",
                             "a.xls",
                             "a.pl",
                             "a.ts",
                             "a.sub",
                             "a.key",
                             "a.iso",
                             "a.tar.gz",
                             "a.TAR.GZ",
                             "tar.gz",
                             ".tar.gz",
                             "a.tar",
                             "a.gz",
                             "a.1",
                             "a.12",
                             "a.so",
                             "a.so.1",
                             "a.so.1.desktop",
                             "readme",
                             "README.md",
                             "README.desktop",
                             "callgrind.out.desktop",
                             "001.vdr",
                             "01.vdr",
                             "a.anim1",
                             "a.anim0",
                             "a.anim",
                             "CMakeLists.txt",
                             "sconscript.x",
                             "a,v",
                             "a%",
                             "a%b.desktop",
                             "a*b.desktop",
                             "a?.desktop",
                             "[a].desktop",
                             "a b.desktop",
                             " .desktop",
                             "a\nb.desktop",
                             "a\\b.desktop",
                             "a.",
                             "a..",
                             "a.b.c.d.desktop",
                             ":a.desktop",
                             ":.desktop",
                             "-a.desktop",
                             "#a.desktop",
                             "\xd0\x96.desktop",
                             "\xd0\x96.DESKTOP",
                             "\xc4\xb0.desktop",
                             "a.\xc4\xb0",
                             "a.de\xc5\xbf"
                             "ktop",
                             "a.des\xe2\x84\xaatop",
                             "desktop",
                             "a.kdelnk",
                             "winmail.dat",
                             "settings.xml",
                             "pom.xml",
                             "a.xml",
                             "a.svg",
                             "a.html",
                             "a.txt",
                             "a.bin",
                             "a.exe",
                             "a.foo",
                             "a.wav",
                             "a.ogg",
                             "a.mpg"})
        QTest::newRow(name) << QString::fromUtf8(name);
}

void tst_MimeTypeFinder::agreesWithTheDatabaseOnOddNames()
{
    QFETCH(QString, name);
    compareWithContents(name);
}

void tst_MimeTypeFinder::agreesWithTheDatabaseOnWhatIsNoFile_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"folder",
                             "folder.desktop",
                             "folder/",
                             "pipe",
                             "pipe.desktop",
                             "socket.desktop",
                             "link.desktop",
                             "link-to-text.desktop",
                             "link-to-folder.desktop",
                             "link-to-pipe.desktop",
                             "dangling.desktop",
                             "missing",
                             "missing.desktop",
                             "file.desktop/",
                             "file.desktop/x.desktop",
                             "/dev/null",
                             "/dev/zero",
                             "",
                             ":/a.desktop",
                             "relative.desktop"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_MimeTypeFinder::agreesWithTheDatabaseOnWhatIsNoFile()
{
    QFETCH(QString, name);
    const QDir dir(folder());
    QVERIFY(dir.mkdir(QStringLiteral("folder")) && dir.mkdir(QStringLiteral("folder.desktop")));
    for (const char *pipe : {"pipe", "pipe.desktop"})
        QCOMPARE(::mkfifo(QFile::encodeName(path(QString::fromLatin1(pipe))).constData(), 0600), 0);
    write(QStringLiteral("file.desktop"), "text");
    write(QStringLiteral("file.txt"), "text");
    const auto link = [this](const char *target, const char *linkName) {
        return QFile::link(path(QString::fromLatin1(target)), path(QString::fromLatin1(linkName)));
    };
    QVERIFY(link("file.desktop", "link.desktop") && link("file.txt", "link-to-text.desktop"));
    QVERIFY(link("folder", "link-to-folder.desktop") && link("pipe", "link-to-pipe.desktop"));
    QVERIFY(link("nowhere", "dangling.desktop"));
    const int handle = ::socket(AF_UNIX, SOCK_STREAM, 0);
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    qstrncpy(address.sun_path, QFile::encodeName(path(QStringLiteral("socket.desktop"))).constData(),
             sizeof address.sun_path);
    QCOMPARE(::bind(handle, reinterpret_cast<sockaddr *>(&address), sizeof address), 0);
    ::close(handle);

    QString path = this->path(name);
    if (name.isEmpty() || name.startsWith(QLatin1Char('/')) || name.startsWith(QLatin1Char(':')))
        path = name;
    if (name == QLatin1String("relative.desktop")) {
        write(name, "text");
        path = QDir::current().relativeFilePath(this->path(name));
    }
    if (path.isEmpty()) { // from the database
        for (int time = 0; time < 2; ++time)
            expectWarning(QStringLiteral("No file name specified"));
    }
    QCOMPARE(own(path), qt(path));
}

void tst_MimeTypeFinder::agreesWithTheDatabaseOnAnyFileName()
{
    // Names put together from what patterns are made of, the same in every run.
    const QStringList parts{QStringLiteral("a"),        QStringLiteral("."),    QStringLiteral(".desktop"),
                            QStringLiteral(".DESKTOP"), QStringLiteral("core"), QStringLiteral("readme"),
                            QStringLiteral(".so"),      QStringLiteral("1"),    QStringLiteral(".tar"),
                            QStringLiteral(".gz"),      QStringLiteral("~"),    QStringLiteral("%"),
                            QStringLiteral(",v"),       QStringLiteral(".C"),   QStringLiteral(".c"),
                            QStringLiteral(".anim"),    QStringLiteral(".vdr"), QStringLiteral("-"),
                            QStringLiteral("makefile"), QStringLiteral(".txt"), QStringLiteral("Ж")};
    quint32 seed = 12345;
    const auto next = [&seed](int bound) {
        seed = seed * 1664525U + 1013904223U;
        return int((seed >> 8) % quint32(bound));
    };
    for (int i = 0; i < 2000; ++i) {
        QString name;
        for (int count = 1 + next(4); count > 0; --count)
            name += parts.at(next(parts.size()));
        if (name == QLatin1String(".") || name == QLatin1String(".."))
            continue;
        const QString path = write(name,
                                   i % 3 == 0       ? "\x89PNG\r\n\x1a\n0000IHDR"
                                       : i % 3 == 1 ? "text\n"
                                                    : "");
        QCOMPARE(own(path), qt(path));
        QFile::remove(path);
    }
}

void tst_MimeTypeFinder::seesAFileThatBecameAPipe()
{
    const QString path = write(QStringLiteral("a.desktop"), "");
    QFileInfo info(path);
    QVERIFY(info.isFile());
    QCOMPARE(MimeTypeFinder::instance().typeOf(info).name(), QStringLiteral("application/x-desktop"));
    QVERIFY(QFile::remove(path));
    QCOMPARE(::mkfifo(QFile::encodeName(path).constData(), 0600), 0);
    QCOMPARE(MimeTypeFinder::instance().typeOf(info), QMimeDatabase().mimeTypeForFile(info));
}

void tst_MimeTypeFinder::seesContentsThatChanged()
{
    const QString path = write(QStringLiteral("noext"), "text\n");
    QCOMPARE(own(path), QStringLiteral("text/plain"));
    write(QStringLiteral("noext"), "%PDF-1.4\n");
    QCOMPARE(own(path), QStringLiteral("application/pdf"));
}

void tst_MimeTypeFinder::followsTheDatabase()
{
    const QString program = QStandardPaths::findExecutable(QStringLiteral("update-mime-database"));
    if (program.isEmpty())
        QSKIP("update-mime-database is not installed");
    const QString path = write(QStringLiteral("a.veltest.desktop"), "text\n");
    QCOMPARE(own(path), QStringLiteral("application/x-desktop"));

    const QString mime = VelTest::TestEnvironment::instance().home() + QStringLiteral("/.local/share/mime");
    QVERIFY(QDir().mkpath(mime + QStringLiteral("/packages")));
    QFile package(mime + QStringLiteral("/packages/veltest.xml"));
    QVERIFY(package.open(QIODevice::WriteOnly));
    package.write(
        "<?xml version=\"1.0\"?>"
        "<mime-info xmlns=\"http://www.freedesktop.org/standards/shared-mime-info\">"
        "<mime-type type=\"application/x-veltest\"><glob pattern=\"*.veltest.desktop\"/></mime-type>"
        "</mime-info>");
    package.close();
    QCOMPARE(QProcess::execute(program, {mime}), 0);
    // The database itself looks for changes only every few seconds.
    QTRY_COMPARE_WITH_TIMEOUT(own(path), QStringLiteral("application/x-veltest"), 15000);
    QCOMPARE(qt(path), QStringLiteral("application/x-veltest"));

    QVERIFY(QDir(mime).removeRecursively());
    QTRY_COMPARE_WITH_TIMEOUT(own(path), QStringLiteral("application/x-desktop"), 15000);
}

void tst_MimeTypeFinder::readsNoHugeCache()
{
    const QString usual = QStringLiteral("/usr/share/mime/mime.cache");
    if (!QFile::exists(usual) || readSoFar() == 0)
        QSKIP("the system has no cache or does not count what is read");
    const QString path = write(QStringLiteral("a.desktop"), "text\n");
    const QString mime = VelTest::TestEnvironment::instance().home() + QStringLiteral("/.local/share/mime");
    QVERIFY(QDir().mkpath(mime));
    QVERIFY(QFile::copy(usual, mime + QStringLiteral("/mime.cache")));
    const qint64 size = 70 * 1024 * 1024;
    QVERIFY(QFile::resize(mime + QStringLiteral("/mime.cache"), size));

    const qint64 before = readSoFar();
    QElapsedTimer timer;
    timer.start();
    // By then the finder has looked at the caches anew.
    QTRY_VERIFY((own(path), timer.elapsed() > 1200));
    QVERIFY2(readSoFar() - before < size / 2, QByteArray::number(readSoFar() - before).constData());
    QCOMPARE(own(path), qt(path));
    QVERIFY(QDir(mime).removeRecursively());
}

VEL_TEST_GUILESS_MAIN(tst_MimeTypeFinder)

#include "tst_MimeTypeFinder.moc"
