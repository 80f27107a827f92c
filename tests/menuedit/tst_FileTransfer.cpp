// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "OtherFileSystem.h"
#include "TestCase.h"

#include <menuedit/FileProgress.h>
#include <menuedit/FileTransfer.h>
#include <menuedit/TreeLimits.h>

#include <QDateTime>
#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <dirent.h>
#include <sys/stat.h>
#include <unistd.h>

using namespace FileTransfer;

Q_DECLARE_METATYPE(FileTransfer::Action)

class tst_FileTransfer : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void copiesAFile();
    void movesAFile();
    void copiesAFolderWithEverythingInIt();
    void movesAFolder();
    void movesAcrossFileSystems();
    void takesSeveralItems();
    void leavesAloneWhatIsThereAlready();
    void givesOtherNames_data();
    void givesOtherNames();
    void carriesNamesThatAreNoText();
    void keepsPermissionsAndForAMoveTheTimes();

    void copiesTheFileBehindALink();
    void remakesALinkToAFolder();
    void keepsAMovedLinkPointingToTheSame();
    void keepsLinksInsideAFolder();

    void refuses_data();
    void refuses();
    void refusesADirectoryThatIsNotWritable();
    void takesEverythingBackWhenOneItemFails_data();
    void takesEverythingBackWhenOneItemFails();
    void takesBackAFolderThatCannotBeCopiedWhole_data();
    void takesBackAFolderThatCannotBeCopiedWhole();
    void leavesTheSourceWhenTheDiskIsFull();
    void copiesNoFolderThatIsTooDeep();

private:
    QByteArray tree(const QString &folder) const;
};

namespace {

// A small file system of its own in a folder; needs root.
class SmallFileSystem
{
public:
    explicit SmallFileSystem(const QString &path)
        : m_path(path)
    {
        QDir().mkpath(path);
        m_isMounted = QProcess::execute(QStringLiteral("mount"),
                                        {QStringLiteral("-t"), QStringLiteral("tmpfs"), QStringLiteral("-o"),
                                         QStringLiteral("size=256k"), QStringLiteral("tmpfs"), path})
            == 0;
    }
    ~SmallFileSystem()
    {
        if (m_isMounted)
            QProcess::execute(QStringLiteral("umount"), {m_path});
    }
    bool isMounted() const { return m_isMounted; }

private:
    QString m_path;
    bool m_isMounted;
};

bool makePipe(const QString &path)
{
    return mkfifo(QFile::encodeName(path).constData(), 0600) == 0;
}

void describe(const QByteArray &path, const QByteArray &shown, QByteArray &text)
{
    struct stat status = {};
    lstat(path.constData(), &status);
    text += shown + ' ' + QByteArray::number(status.st_mode, 8);
    if (S_ISLNK(status.st_mode)) {
        char target[4096];
        const ssize_t length = readlink(path.constData(), target, sizeof target);
        text += " -> " + QByteArray(target, int(length));
    } else if (S_ISREG(status.st_mode)) {
        FILE *file = fopen(path.constData(), "rb");
        char bytes[4096];
        const size_t length = file ? fread(bytes, 1, sizeof bytes, file) : 0;
        text += " = " + QByteArray(bytes, int(length));
        if (file)
            fclose(file);
    }
    text += '\n';
    if (!S_ISDIR(status.st_mode))
        return;
    dirent **entries = nullptr;
    const int count = scandir(path.constData(), &entries, nullptr, alphasort);
    for (int i = 0; i < count; ++i) {
        const QByteArray name = entries[i]->d_name;
        free(entries[i]);
        if (name != "." && name != "..")
            describe(path + '/' + name, shown + '/' + name, text);
    }
    free(entries);
}

} // namespace

void tst_FileTransfer::init()
{
    TestCase::init();
    QDir(folder()).mkpath(QStringLiteral("from"));
    QDir(folder()).mkpath(QStringLiteral("to"));
}

// All that lies below a folder, byte by byte.
QByteArray tst_FileTransfer::tree(const QString &top) const
{
    QByteArray text;
    describe(QFile::encodeName(top), QByteArray(), text);
    return text;
}

void tst_FileTransfer::copiesAFile()
{
    const QString file = write(QStringLiteral("from/a"), "one");

    const Result result = transfer({file}, path(QStringLiteral("to")), Action::Copy);

    QVERIFY(result.succeeded());
    QCOMPARE(read(path(QStringLiteral("to/a"))), QByteArray("one"));
    QCOMPARE(read(file), QByteArray("one"));
    QCOMPARE(
        QDir(path(QStringLiteral("to"))).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
        QStringList{QStringLiteral("a")});
}

void tst_FileTransfer::movesAFile()
{
    const QString file = write(QStringLiteral("from/a"), "one");

    QVERIFY(transfer({file}, path(QStringLiteral("to")), Action::Move).succeeded());

    QCOMPARE(read(path(QStringLiteral("to/a"))), QByteArray("one"));
    QVERIFY(!QFile::exists(file));
}

void tst_FileTransfer::copiesAFolderWithEverythingInIt()
{
    write(QStringLiteral("from/d/.directory"), "[Desktop Entry]\n");
    write(QStringLiteral("from/d/a"), "");
    write(QStringLiteral("from/d/sub/deep/b"), QByteArray(300000, 'x'));
    QDir(folder()).mkpath(QStringLiteral("from/d/empty"));
    const QByteArray before = tree(path(QStringLiteral("from/d")));

    QVERIFY(transfer({path(QStringLiteral("from/d"))}, path(QStringLiteral("to")), Action::Copy).succeeded());

    QCOMPARE(tree(path(QStringLiteral("to/d"))), before);
    QCOMPARE(tree(path(QStringLiteral("from/d"))), before);
    QCOMPARE(read(path(QStringLiteral("to/d/sub/deep/b"))).size(), 300000);
}

void tst_FileTransfer::movesAFolder()
{
    write(QStringLiteral("from/d/sub/b"), "b");
    const QByteArray before = tree(path(QStringLiteral("from/d")));

    QVERIFY(transfer({path(QStringLiteral("from/d"))}, path(QStringLiteral("to")), Action::Move).succeeded());

    QCOMPARE(tree(path(QStringLiteral("to/d"))), before);
    QVERIFY(!QFile::exists(path(QStringLiteral("from/d"))));
}

void tst_FileTransfer::movesAcrossFileSystems()
{
    const QString other = otherFileSystem(folder());
    if (other.isEmpty())
        QSKIP("there is no second file system to write to");
    const QTemporaryDir target(other + QStringLiteral("/tst_FileTransfer-XXXXXX"));
    write(QStringLiteral("from/d/sub/b"), "b");
    const QString file = write(QStringLiteral("from/a"), "a");
    QVERIFY(QFile::link(QStringLiteral("sub/b"), path(QStringLiteral("from/d/link"))));
    const QByteArray before = tree(path(QStringLiteral("from/d")));

    const Result result = transfer({path(QStringLiteral("from/d")), file}, target.path(), Action::Move);

    QVERIFY2(result.succeeded(), qPrintable(result.reason));
    QCOMPARE(tree(target.filePath(QStringLiteral("d"))), before);
    QCOMPARE(read(target.filePath(QStringLiteral("a"))), QByteArray("a"));
    QCOMPARE(tree(path(QStringLiteral("from"))).count('\n'), 1);
    QCOMPARE(tree(target.path()).count(".vel"), 0);
}

void tst_FileTransfer::takesSeveralItems()
{
    const QStringList files{write(QStringLiteral("from/a"), "a"), write(QStringLiteral("from/b"), "b"),
                            write(QStringLiteral("from/c"), "c")};

    QVERIFY(transfer(files, path(QStringLiteral("to")), Action::Move).succeeded());

    QCOMPARE(QDir(path(QStringLiteral("to"))).entryList(QDir::Files).size(), 3);
    QVERIFY(QDir(path(QStringLiteral("from"))).entryList(QDir::Files).isEmpty());
}

void tst_FileTransfer::leavesAloneWhatIsThereAlready()
{
    const QString here = write(QStringLiteral("to/a"), "a");
    const QString other = write(QStringLiteral("from/b"), "b");

    QVERIFY(transfer({here, other}, path(QStringLiteral("to")), Action::Move).succeeded());

    QCOMPARE(read(here), QByteArray("a"));
    QCOMPARE(read(path(QStringLiteral("to/b"))), QByteArray("b"));
}

void tst_FileTransfer::givesOtherNames_data()
{
    QTest::addColumn<Action>("action");
    QTest::newRow("copy") << Action::Copy;
    QTest::newRow("move") << Action::Move;
}

// Each into a folder of its own, also the one that it lies in.
void tst_FileTransfer::givesOtherNames()
{
    QFETCH(Action, action);
    const QVector<Item> items{
        {write(QStringLiteral("one/a"), "a"), path(QStringLiteral("one/b"))},
        {path(QStringLiteral("from")), path(QStringLiteral("other/taken-2"))},
        {write(QStringLiteral("one/stays"), "stays"), path(QStringLiteral("one/stays"))},
    };
    write(QStringLiteral("from/inner/x"), "x");
    write(QStringLiteral("other/taken"), "taken");
    FileProgress nobody;
    const Result result = transfer(items, action, nobody);
    QVERIFY2(result.succeeded(), qPrintable(result.path));
    QCOMPARE(read(path(QStringLiteral("one/b"))), QByteArray("a"));
    QCOMPARE(read(path(QStringLiteral("other/taken-2/inner/x"))), QByteArray("x"));
    QCOMPARE(read(path(QStringLiteral("other/taken"))), QByteArray("taken"));
    QCOMPARE(read(path(QStringLiteral("one/stays"))), QByteArray("stays"));
    QCOMPARE(QFile::exists(path(QStringLiteral("one/a"))), action == Action::Copy);
    QCOMPARE(QFile::exists(path(QStringLiteral("from/inner/x"))), action == Action::Copy);
}

void tst_FileTransfer::carriesNamesThatAreNoText()
{
    QDir(folder()).mkpath(QStringLiteral("from/d"));
    const QByteArray odd = QFile::encodeName(path(QStringLiteral("from/d/"))) + "\xff\xfe\n";
    FILE *file = fopen(odd.constData(), "wb");
    QVERIFY(file);
    fputs("odd", file);
    fclose(file);
    const QByteArray before = tree(path(QStringLiteral("from/d")));

    QVERIFY(transfer({path(QStringLiteral("from/d"))}, path(QStringLiteral("to")), Action::Copy).succeeded());

    const QByteArray copied = tree(path(QStringLiteral("to/d")));
    // The temporary folder could not take such names away.
    unlink(odd.constData());
    unlink((QFile::encodeName(path(QStringLiteral("to/d/"))) + "\xff\xfe\n").constData());
    QCOMPARE(copied, before);
}

void tst_FileTransfer::keepsPermissionsAndForAMoveTheTimes()
{
    const QString file = write(QStringLiteral("from/a"), "a");
    QFile::setPermissions(file, QFile::ReadOwner | QFile::ExeOwner);
    const QDateTime old(QDate(2001, 2, 3), QTime(4, 5, 6));
    {
        QFile stamped(file);
        QFile::setPermissions(file, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
        QVERIFY(stamped.open(QIODevice::ReadWrite));
        QVERIFY(stamped.setFileTime(old, QFileDevice::FileModificationTime));
    }
    const QString copy = path(QStringLiteral("to/a"));

    QVERIFY(transfer({file}, path(QStringLiteral("to")), Action::Copy).succeeded());
    QCOMPARE(QFileInfo(copy).permissions(), QFileInfo(file).permissions());
    QVERIFY(QFileInfo(copy).lastModified() > old.addYears(1));

    QVERIFY(QFile::remove(copy));
    QVERIFY(transfer({file}, path(QStringLiteral("to")), Action::Move).succeeded());
    QCOMPARE(QFileInfo(copy).lastModified(), old);
}

void tst_FileTransfer::copiesTheFileBehindALink()
{
    write(QStringLiteral("from/a"), "a");
    QVERIFY(QFile::link(QStringLiteral("a"), path(QStringLiteral("from/link"))));

    QVERIFY(
        transfer({path(QStringLiteral("from/link"))}, path(QStringLiteral("to")), Action::Copy).succeeded());

    QVERIFY(!QFileInfo(path(QStringLiteral("to/link"))).isSymLink());
    QCOMPARE(read(path(QStringLiteral("to/link"))), QByteArray("a"));
}

void tst_FileTransfer::remakesALinkToAFolder()
{
    write(QStringLiteral("from/d/a"), "a");
    QVERIFY(QFile::link(QStringLiteral("d"), path(QStringLiteral("from/link"))));

    QVERIFY(
        transfer({path(QStringLiteral("from/link"))}, path(QStringLiteral("to")), Action::Copy).succeeded());

    QVERIFY(QFileInfo(path(QStringLiteral("to/link"))).isSymLink());
    QCOMPARE(read(path(QStringLiteral("to/link/a"))), QByteArray("a"));
}

void tst_FileTransfer::keepsAMovedLinkPointingToTheSame()
{
    write(QStringLiteral("from/a"), "a");
    QVERIFY(QFile::link(QStringLiteral("a"), path(QStringLiteral("from/link"))));
    QVERIFY(QFile::link(path(QStringLiteral("from/a")), path(QStringLiteral("from/absolute"))));

    QVERIFY(transfer({path(QStringLiteral("from/link")), path(QStringLiteral("from/absolute"))},
                     path(QStringLiteral("to")), Action::Move)
                .succeeded());

    for (const QString &name : {QStringLiteral("to/link"), QStringLiteral("to/absolute")}) {
        QVERIFY(QFileInfo(path(name)).isSymLink());
        QCOMPARE(read(path(name)), QByteArray("a"));
    }
    QCOMPARE(QDir(path(QStringLiteral("from"))).entryList(QDir::Files), QStringList{QStringLiteral("a")});
}

void tst_FileTransfer::keepsLinksInsideAFolder()
{
    write(QStringLiteral("from/d/a"), "a");
    QVERIFY(QFile::link(QStringLiteral("a"), path(QStringLiteral("from/d/link"))));
    QVERIFY(QFile::link(QStringLiteral("missing"), path(QStringLiteral("from/d/dangling"))));
    QVERIFY(QFile::link(QStringLiteral(".."), path(QStringLiteral("from/d/loop"))));
    const QByteArray before = tree(path(QStringLiteral("from/d")));

    QVERIFY(transfer({path(QStringLiteral("from/d"))}, path(QStringLiteral("to")), Action::Copy).succeeded());

    QCOMPARE(tree(path(QStringLiteral("to/d"))), before);
}

void tst_FileTransfer::refuses_data()
{
    QTest::addColumn<QStringList>("sources");
    QTest::addColumn<QString>("target");
    QTest::addColumn<int>("failure");
    const auto row = [](const char *title, const QStringList &sources, const char *target, Failure failure) {
        QTest::newRow(title) << sources << QString::fromUtf8(target) << int(failure);
    };
    const QString a = QStringLiteral("from/a");
    const QString d = QStringLiteral("from/d");
    row("source gone", {QStringLiteral("from/missing")}, "to", Failure::SourceGone);
    row("second source gone", {a, QStringLiteral("from/missing")}, "to", Failure::SourceGone);
    row("no local file", {QString()}, "to", Failure::SourceGone);
    row("target exists", {QStringLiteral("from/taken")}, "to", Failure::TargetExists);
    row("second target exists", {a, QStringLiteral("from/taken")}, "to", Failure::TargetExists);
    row("target is a link to nothing", {QStringLiteral("from/linked")}, "to", Failure::TargetExists);
    row("two of one name", {a, QStringLiteral("from/d/a")}, "to", Failure::TargetExists);
    row("into itself", {d}, "from/d", Failure::IntoItself);
    row("below itself", {d}, "from/d/sub", Failure::IntoItself);
    row("below itself by a link", {d}, "to/back", Failure::IntoItself);
    row("directory gone", {a}, "missing", Failure::NotWritable);
    row("directory is a file", {a}, "to/taken", Failure::NotWritable);
}

void tst_FileTransfer::refuses()
{
    QFETCH(QStringList, sources);
    QFETCH(QString, target);
    QFETCH(int, failure);
    write(QStringLiteral("from/a"), "a");
    write(QStringLiteral("from/d/a"), "a");
    write(QStringLiteral("from/d/sub/b"), "b");
    write(QStringLiteral("from/taken"), "new");
    write(QStringLiteral("from/linked"), "new");
    write(QStringLiteral("to/taken"), "old");
    QVERIFY(QFile::link(path(QStringLiteral("missing")), path(QStringLiteral("to/linked"))));
    QVERIFY(QFile::link(path(QStringLiteral("from/d/sub")), path(QStringLiteral("to/back"))));
    for (QString &source : sources)
        source = source.isEmpty() ? source : path(source);
    const QByteArray before = tree(folder());

    for (const Action action : {Action::Copy, Action::Move}) {
        const Result checked = check(sources, path(target));
        QCOMPARE(int(checked.failure), failure);
        const Result result = transfer(sources, path(target), action);
        QCOMPARE(int(result.failure), failure);
        QVERIFY(!result.succeeded());
        QCOMPARE(tree(folder()), before);
    }
}

void tst_FileTransfer::refusesADirectoryThatIsNotWritable()
{
    const QString file = write(QStringLiteral("from/a"), "a");
    const OrdinaryUser user(folder());
    QFile::setPermissions(path(QStringLiteral("to")), QFile::ReadOwner | QFile::ExeOwner);

    const Result result = transfer({file}, path(QStringLiteral("to")), Action::Move);
    QFile::setPermissions(path(QStringLiteral("to")), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);

    QCOMPARE(int(result.failure), int(Failure::NotWritable));
    QCOMPARE(read(file), QByteArray("a"));
}

void tst_FileTransfer::takesEverythingBackWhenOneItemFails_data()
{
    QTest::addColumn<FileTransfer::Action>("action");
    QTest::newRow("copy") << Action::Copy;
    QTest::newRow("move") << Action::Move;
}

void tst_FileTransfer::takesEverythingBackWhenOneItemFails()
{
    QFETCH(FileTransfer::Action, action);
    const QString other = otherFileSystem(folder());
    if (other.isEmpty())
        QSKIP("there is no second file system to write to");
    const QTemporaryDir target(other + QStringLiteral("/tst_FileTransfer-XXXXXX"));
    write(QStringLiteral("from/d/a"), "a");
    const QStringList sources{write(QStringLiteral("from/a"), "a"), path(QStringLiteral("from/d")),
                              path(QStringLiteral("from/pipe"))};
    QVERIFY(makePipe(sources.last()));
    const QByteArray before = tree(folder());

    const Result result = transfer(sources, target.path(), action);

    QCOMPARE(int(result.failure), int(Failure::Failed));
    QCOMPARE(result.path, sources.last());
    QVERIFY(!result.reason.isEmpty());
    QCOMPARE(tree(folder()), before);
    QCOMPARE(tree(target.path()).count('\n'), 1);
}

void tst_FileTransfer::takesBackAFolderThatCannotBeCopiedWhole_data()
{
    takesEverythingBackWhenOneItemFails_data();
}

void tst_FileTransfer::takesBackAFolderThatCannotBeCopiedWhole()
{
    QFETCH(FileTransfer::Action, action);
    const QString other = otherFileSystem(folder());
    if (other.isEmpty())
        QSKIP("there is no second file system to write to");
    const QTemporaryDir target(other + QStringLiteral("/tst_FileTransfer-XXXXXX"));
    for (int i = 0; i < 20; ++i)
        write(QStringLiteral("from/d/sub%1/a").arg(i), "a");
    QVERIFY(makePipe(path(QStringLiteral("from/d/sub7/pipe"))));
    const QByteArray before = tree(folder());

    const Result result = transfer({path(QStringLiteral("from/d"))}, target.path(), action);

    QVERIFY(!result.succeeded());
    QCOMPARE(tree(folder()), before);
    QCOMPARE(tree(target.path()).count('\n'), 1);
}

void tst_FileTransfer::leavesTheSourceWhenTheDiskIsFull()
{
    if (geteuid() != 0)
        QSKIP("only root can mount a small file system");
    const SmallFileSystem small(path(QStringLiteral("small")));
    if (!small.isMounted())
        QSKIP("mounting is not allowed here");
    write(QStringLiteral("from/d/a"), QByteArray(100000, 'a'));
    write(QStringLiteral("from/d/b"), QByteArray(200000, 'b'));
    const QByteArray before = tree(path(QStringLiteral("from")));

    for (const Action action : {Action::Copy, Action::Move}) {
        const Result result =
            transfer({path(QStringLiteral("from/d"))}, path(QStringLiteral("small")), action);

        QCOMPARE(int(result.failure), int(Failure::Failed));
        QCOMPARE(tree(path(QStringLiteral("from"))), before);
        QCOMPARE(tree(path(QStringLiteral("small"))).count('\n'), 1);
    }
}

void tst_FileTransfer::copiesNoFolderThatIsTooDeep()
{
    QVERIFY(
        QDir().mkpath(path(QStringLiteral("deep") + QStringLiteral("/x").repeated(TreeLimits::MostLevels))));
    QVERIFY(QDir().mkpath(
        path(QStringLiteral("flat") + QStringLiteral("/x").repeated(TreeLimits::MostLevels - 1))));
    QVERIFY(QDir().mkpath(path(QStringLiteral("target"))));
    const QString target = path(QStringLiteral("target"));
    QCOMPARE(transfer({path(QStringLiteral("deep"))}, target, Action::Copy).failure, Failure::Failed);
    QVERIFY(QDir(target).isEmpty());
    QVERIFY(transfer({path(QStringLiteral("flat"))}, target, Action::Copy).succeeded());
    // What only gets another name is not walked over.
    QVERIFY(transfer({path(QStringLiteral("deep"))}, target, Action::Move).succeeded());
}

VEL_TEST_GUILESS_MAIN(tst_FileTransfer)

#include "tst_FileTransfer.moc"
