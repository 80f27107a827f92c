// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExactTree.h"
#include "OrdinaryUser.h"
#include "OtherFileSystem.h"
#include "TestCase.h"

#include <menuedit/FileProgress.h>
#include <menuedit/FileTransfer.h>
#include <menuedit/FolderOrder.h>
#include <menuedit/KeptThing.h>
#include <menuedit/MenuReplacement.h>
#include <menuedit/StepRecorder.h>
#include <menuedit/TreeRemoval.h>

#include <QDir>
#include <QElapsedTimer>
#include <QSaveFile>
#include <QTemporaryDir>

#include <functional>

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

using Meanwhile = std::function<void()>;
using Operation = std::function<void(StepRecorder &)>;
Q_DECLARE_METATYPE(Meanwhile)
Q_DECLARE_METATYPE(Operation)

/// Steps that are undone and done again on real trees.
class tst_FileStep : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void leavesTheTreeAsItWas_data();
    void leavesTheTreeAsItWas();
    void leavesTheTreeAsItWasAcrossFileSystems();
    void changesNothingWhenItIsCanceled();
    void keepsEverythingOfAFolderOfOddThings();
    void keepsTheAttributesOfARecord();
    void writesThroughALink();
    void givesALinkItsTextBack();
    void deletesSeveralInOneStep();
    void leavesNothingInTheTrashOfWhatIsBack();
    void worksWithoutATrashForWhatWasMade();
    void deletesNothingWithoutATrash_data();
    void deletesNothingWithoutATrash();
    void refusesWhatIsNotAsItWasLeft_data();
    void refusesWhatIsNotAsItWasLeft();
    void givesUpWhatIsNoMoreInTheTrash();
    void takesBackWhatItDidWhenTheThirdFails();
    void bringsTheMenuBackThatWasReplaced_data();
    void bringsTheMenuBackThatWasReplaced();
    void hasNothingToUndoWhereNothingChanged();
    void handlesThreeThousandFiles();

private:
    QString menu() const { return path(QStringLiteral("menu")); }
    QString in(const char *name) const { return menu() + QLatin1Char('/') + QLatin1String(name); }
    FileStep run(const Operation &operation) const;
    void make(const char *name) const;
    void edit(StepRecorder &recorder, const char *name, const char *bytes);
    void remove(StepRecorder &recorder, const char *name);
    void transfer(StepRecorder &recorder, const char *name, const QString &folder,
                  FileTransfer::Action action);
    void operations();
    QStringList inTrash() const;

    // Qt does not find names that are no text.
    static void drop(const QString &path)
    {
        FileProgress nobody;
        TreeRemoval::removeOwn(QFile::encodeName(path).toStdString(), nobody);
    }
    static QString home() { return QFile::decodeName(qgetenv("XDG_DATA_HOME")); }

    QByteArray m_dataHome;
};

void tst_FileStep::init()
{
    TestCase::init();
    m_dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
    write(QStringLiteral("menu/.directory"), "[Desktop Entry]\nType=Directory\nSortOrder=b;a;games;\n");
    for (const char *name : {"a", "b", "games/.directory", "games/x", "games/y", "games/deep/z", "office/o"})
        make(name);
    QCOMPARE(chmod(QFile::encodeName(in("games/x")), 0640), 0);
    QCOMPARE(symlink("../a", QFile::encodeName(in("games/link")).constData()), 0);
}

void tst_FileStep::cleanup()
{
    qputenv("XDG_DATA_HOME", m_dataHome);
    drop(folder());
    TestCase::cleanup();
}

void tst_FileStep::make(const char *name) const
{
    QDir().mkpath(QFileInfo(in(name)).path());
    QFile file(in(name));
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(QByteArray("[Desktop Entry]\nName=") + name + '\n');
}

FileStep tst_FileStep::run(const Operation &operation) const
{
    StepRecorder recorder;
    operation(recorder);
    return recorder.finish();
}

void tst_FileStep::edit(StepRecorder &recorder, const char *name, const char *bytes)
{
    recorder.mayWrite(in(name));
    QSaveFile file(in(name));
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(bytes);
    QVERIFY(file.commit());
}

void tst_FileStep::remove(StepRecorder &recorder, const char *name)
{
    std::unique_ptr<KeptThing> kept = KeptThing::inTrash(in(name));
    QVERIFY(kept);
    recorder.deleted(in(name), std::move(kept));
}

void tst_FileStep::transfer(StepRecorder &recorder, const char *name, const QString &folder,
                            FileTransfer::Action action)
{
    const QString target = folder + QLatin1Char('/') + QFileInfo(in(name)).fileName();
    if (action == FileTransfer::Action::Move)
        recorder.mayMove(in(name), target);
    else
        recorder.mayMake(target);
    recorder.mayWrite(folder + QStringLiteral("/.directory"));
    QVERIFY(FileTransfer::transfer({in(name)}, folder, action).succeeded());
    QVERIFY(FolderOrder::write(folder, {QStringLiteral("*"), QFileInfo(in(name)).fileName()}));
}

QStringList tst_FileStep::inTrash() const
{
    return QDir(home() + QStringLiteral("/Trash/files")).entryList(QDir::AllEntries | QDir::NoDotAndDotDot)
        + QDir(home() + QStringLiteral("/Trash/info")).entryList(QDir::AllEntries | QDir::NoDotAndDotDot);
}

// What the rows of one table are made of.
void tst_FileStep::operations()
{
    QTest::addColumn<Operation>("operation");
    QTest::newRow("new entry") << Operation([this](StepRecorder &recorder) {
        recorder.mayMake(in("games/new"));
        make("games/new");
    });
    QTest::newRow("new folder") << Operation([this](StepRecorder &recorder) {
        recorder.mayMake(in("new"));
        make("new/.directory");
    });
    QTest::newRow("edit") << Operation([this](StepRecorder &recorder) { edit(recorder, "games/x", "new"); });
    QTest::newRow("first record of a folder")
        << Operation([this](StepRecorder &recorder) { edit(recorder, "office/.directory", "new"); });
    QTest::newRow("delete a file") << Operation(
        [this](StepRecorder &recorder) { remove(recorder, "games/x"); });
    QTest::newRow("delete a folder") << Operation(
        [this](StepRecorder &recorder) { remove(recorder, "games"); });
    QTest::newRow("delete a link") << Operation(
        [this](StepRecorder &recorder) { remove(recorder, "games/link"); });
    QTest::newRow("move a folder") << Operation([this](StepRecorder &recorder) {
        transfer(recorder, "games", in("office"), FileTransfer::Action::Move);
    });
    QTest::newRow("move a link") << Operation([this](StepRecorder &recorder) {
        transfer(recorder, "games/link", in("office"), FileTransfer::Action::Move);
    });
    QTest::newRow("copy a folder") << Operation([this](StepRecorder &recorder) {
        transfer(recorder, "games", in("office"), FileTransfer::Action::Copy);
    });
    QTest::newRow("reorder") << Operation([this](StepRecorder &recorder) {
        recorder.mayWrite(in(".directory"));
        QVERIFY(FolderOrder::write(menu(), {QStringLiteral("*"), QStringLiteral("a")}));
    });
}

void tst_FileStep::leavesTheTreeAsItWas_data()
{
    operations();
}

void tst_FileStep::leavesTheTreeAsItWas()
{
    QFETCH(Operation, operation);
    const QSet<QByteArray> rewritten{QFile::encodeName(in("games/x")), QFile::encodeName(in(".directory")),
                                     QFile::encodeName(in("games/link")),
                                     QFile::encodeName(in("office/link")),
                                     QFile::encodeName(in("office/.directory"))};
    const ExactTree before = ExactTree::of(menu());
    FileStep step = run(operation);
    const ExactTree after = ExactTree::of(menu());
    QVERIFY(!step.isEmpty());
    QVERIFY(!before.difference(after).isEmpty());

    for (int i = 0; i < 3; ++i) {
        QCOMPARE(step.undo().reason, QString());
        QCOMPARE(before.difference(ExactTree::of(menu()), rewritten), QString());
        QCOMPARE(step.redo().reason, QString());
        QCOMPARE(after.difference(ExactTree::of(menu()), rewritten), QString());
    }
}

void tst_FileStep::leavesTheTreeAsItWasAcrossFileSystems()
{
    const QString other = otherFileSystem(folder());
    if (other.isEmpty())
        QSKIP("there is no second file system to write to");
    const QTemporaryDir target(other + QStringLiteral("/tst_FileStep-XXXXXX"));
    const auto state = [&] {
        ExactTree tree = ExactTree::of(menu());
        tree.add(target.path());
        return tree;
    };
    const ExactTree before = state();
    FileStep step = run([&](StepRecorder &recorder) {
        transfer(recorder, "games", target.path(), FileTransfer::Action::Move);
    });
    const ExactTree after = state();

    for (int i = 0; i < 2; ++i) {
        QCOMPARE(step.undo().reason, QString());
        QCOMPARE(before.difference(state(), {"*"}), QString());
        QCOMPARE(step.redo().reason, QString());
        QCOMPARE(after.difference(state(), {"*"}), QString());
    }
}

void tst_FileStep::changesNothingWhenItIsCanceled()
{
    const QString other = otherFileSystem(folder());
    if (other.isEmpty())
        QSKIP("there is no second file system to write to");
    class Impatient : public FileProgress
    {
    public:
        bool goOn() override { return ++m_asked < 40; }

    private:
        int m_asked = 0;
    };
    const QTemporaryDir target(other + QStringLiteral("/tst_FileStep-XXXXXX"));
    for (int i = 0; i < 50; ++i)
        make(qPrintable(QStringLiteral("games/%1.desktop").arg(i)));
    const ExactTree before = ExactTree::of(menu());
    FileStep step = run([&](StepRecorder &recorder) {
        transfer(recorder, "games", target.path(), FileTransfer::Action::Move);
        edit(recorder, "a", "new");
    });
    const ExactTree after = ExactTree::of(menu());
    const ExactTree there = ExactTree::of(target.path());

    Impatient progress;
    QCOMPARE(step.undo(progress).reason, QStringLiteral("It was canceled."));

    QCOMPARE(after.difference(ExactTree::of(menu()), {"*"}), QString());
    QCOMPARE(there.difference(ExactTree::of(target.path()), {"*"}), QString());
    QCOMPARE(step.undo().reason, QString());
    QCOMPARE(before.difference(ExactTree::of(menu()), {"*"}), QString());
}

// Names that are no text, links that lead nowhere, what may not be written.
void tst_FileStep::keepsEverythingOfAFolderOfOddThings()
{
    const QByteArray folder = QFile::encodeName(in("games"));
    QCOMPARE(close(open((folder + "/\xff\xfe.desktop").constData(), O_CREAT | O_WRONLY, 0400)), 0);
    QCOMPARE(mkdir((folder + "/\xe4").constData(), 0500), 0);
    QCOMPARE(symlink("nowhere/\xff", (folder + "/dangling").constData()), 0);
    QCOMPARE(symlink(".", (folder + "/itself").constData()), 0);
    const ExactTree before = ExactTree::of(menu());
    FileStep deletion = run([&](StepRecorder &recorder) { remove(recorder, "games"); });
    QCOMPARE(deletion.undo().reason, QString());
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());

    FileStep copy = run([&](StepRecorder &recorder) {
        recorder.mayMake(in("office/games"));
        QVERIFY(FileTransfer::transfer({in("games")}, in("office"), FileTransfer::Action::Copy).succeeded());
    });
    const ExactTree after = ExactTree::of(menu());
    QCOMPARE(copy.undo().reason, QString());
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    QCOMPARE(copy.redo().reason, QString());
    QCOMPARE(after.difference(ExactTree::of(menu())), QString());
}

void tst_FileStep::keepsTheAttributesOfARecord()
{
    const QByteArray file = QFile::encodeName(in("a"));
    if (setxattr(file.constData(), "user.note", "kept", 4, 0) != 0)
        QSKIP("the file system keeps no attributes");
    FileStep step = run([&](StepRecorder &recorder) {
        edit(recorder, "a", "new");
        QCOMPARE(chmod(file.constData(), 0600), 0);
    });
    QCOMPARE(step.undo().reason, QString());

    char value[8] = {};
    QCOMPARE(getxattr(file.constData(), "user.note", value, sizeof value), 4L);
    QCOMPARE(QByteArray(value), QByteArray("kept"));
    QCOMPARE(step.redo().reason, QString());
    struct stat status = {};
    QCOMPARE(stat(file.constData(), &status), 0);
    QCOMPARE(status.st_mode & 07777, 0600U);
    QCOMPARE(read(in("a")), QByteArray("new"));
}

void tst_FileStep::writesThroughALink()
{
    const QString outside = write(QStringLiteral("outside"), "old");
    QVERIFY(QFile::link(outside, in("led.desktop")));
    const ExactTree before = ExactTree::of(menu());
    FileStep step = run([&](StepRecorder &recorder) { edit(recorder, "led.desktop", "new"); });
    QCOMPARE(read(outside), QByteArray("new"));

    QCOMPARE(step.undo().reason, QString());

    QCOMPARE(read(outside), QByteArray("old"));
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

void tst_FileStep::givesALinkItsTextBack()
{
    FileStep step = run([&](StepRecorder &recorder) {
        transfer(recorder, "games/link", menu(), FileTransfer::Action::Move);
    });
    const QByteArray here = QFile::encodeName(in("link"));
    const QByteArray there = QFile::encodeName(in("games/link"));
    char text[4096] = {};
    QVERIFY(readlink(here.constData(), text, sizeof text) > 0);
    const QByteArray moved(text);
    QVERIFY(moved.startsWith('/'));

    QCOMPARE(step.undo().reason, QString());

    QCOMPARE(readlink(there.constData(), text, sizeof text), 4L);
    QCOMPARE(QByteArray(text, 4), QByteArray("../a"));
    QCOMPARE(step.redo().reason, QString());
    QCOMPARE(readlink(here.constData(), text, sizeof text), ssize_t(moved.size()));
    QCOMPARE(QByteArray(text, moved.size()), moved);
}

void tst_FileStep::deletesSeveralInOneStep()
{
    const ExactTree before = ExactTree::of(menu());
    FileStep step = run([&](StepRecorder &recorder) {
        for (const char *name : {"a", "games/x", "office", "games/deep", "games"})
            remove(recorder, name);
    });
    const ExactTree after = ExactTree::of(menu());
    QCOMPARE(step.undo().reason, QString());
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    QCOMPARE(step.redo().reason, QString());
    QCOMPARE(after.difference(ExactTree::of(menu())), QString());
    QCOMPARE(step.undo().reason, QString());
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

void tst_FileStep::leavesNothingInTheTrashOfWhatIsBack()
{
    write(QStringLiteral("data/Trash/files/a"), "of another day");
    write(QStringLiteral("data/Trash/info/a.trashinfo"), "[Trash Info]\nPath=/a\n");
    const QStringList before = inTrash();
    FileStep step = run([&](StepRecorder &recorder) { remove(recorder, "a"); });
    QCOMPARE(inTrash().size(), 4);

    QCOMPARE(step.undo().reason, QString());

    QCOMPARE(inTrash(), before);
}

// The trash can be had again by then, or not.
void tst_FileStep::worksWithoutATrashForWhatWasMade()
{
    write(QStringLiteral("data"), "no folder");
    const ExactTree before = ExactTree::of(menu());
    {
        FileStep folderStep = run([&](StepRecorder &recorder) {
            recorder.mayMake(in("new"));
            make("new/.directory");
        });
        FileStep entryStep = run([&](StepRecorder &recorder) {
            recorder.mayMake(in("new/entry"));
            make("new/entry");
        });
        const ExactTree after = ExactTree::of(menu());
        QCOMPARE(entryStep.undo().reason, QString());
        QCOMPARE(folderStep.undo().reason, QString());
        QVERIFY(!QFileInfo::exists(in("new")));
        QCOMPARE(folderStep.redo().reason, QString());
        QCOMPARE(entryStep.redo().reason, QString());
        QCOMPARE(after.difference(ExactTree::of(menu())), QString());
        QCOMPARE(entryStep.undo().reason, QString());
        QCOMPARE(folderStep.undo().reason, QString());
    }
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

void tst_FileStep::deletesNothingWithoutATrash_data()
{
    QTest::addColumn<bool>("isReadOnly");
    QTest::newRow("there is a file in its place") << false;
    QTest::newRow("it may not be written") << true;
}

void tst_FileStep::deletesNothingWithoutATrash()
{
    QFETCH(bool, isReadOnly);
    const QString previous = QDir::currentPath();
    QVERIFY(QDir::setCurrent(folder()));
    if (isReadOnly)
        QVERIFY(QDir().mkpath(path(QStringLiteral("data/Trash"))));
    else
        write(QStringLiteral("data/Trash"), "no folder");
    {
        const OrdinaryUser user(folder());
        if (isReadOnly)
            QVERIFY(QFile::setPermissions(path(QStringLiteral("data/Trash")),
                                          QFile::ReadOwner | QFile::ExeOwner));
        const ExactTree before = ExactTree::of(folder());

        QVERIFY(!KeptThing::inTrash(in("games")));

        QCOMPARE(before.difference(ExactTree::of(folder())), QString());
        QFile::setPermissions(path(QStringLiteral("data/Trash")),
                              QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }
    QVERIFY(QDir::setCurrent(previous));
}

void tst_FileStep::refusesWhatIsNotAsItWasLeft_data()
{
    QTest::addColumn<Operation>("operation");
    QTest::addColumn<Meanwhile>("meanwhile");
    QTest::addColumn<QString>("reason");
    const auto row = [this](const char *name, const Operation &operation, const Meanwhile &meanwhile,
                            const char *path, const char *reason) {
        QTest::newRow(name) << operation << meanwhile
                            << QString::fromLatin1(reason).arg(QLatin1String("menu/") + QLatin1String(path));
    };
    const auto rewrite = [this](const char *name) {
        return Meanwhile([=] { write(QLatin1String("menu/") + QLatin1String(name), "theirs"); });
    };
    const auto dropped = [this](const char *name) { return Meanwhile([=] { drop(in(name)); }); };
    const Operation makeFolder = [this](StepRecorder &recorder) {
        recorder.mayMake(in("new"));
        make("new/one");
    };
    const Operation editX = [this](StepRecorder &recorder) { edit(recorder, "games/x", "ours"); };
    const Operation removeX = [this](StepRecorder &recorder) { remove(recorder, "games/x"); };
    const Operation moveX = [this](StepRecorder &recorder) {
        recorder.mayMove(in("games/x"), in("office/x"));
        QVERIFY(QFile::rename(in("games/x"), in("office/x")));
    };
    const char gone[] = "%1 is not there any more.";
    const char changed[] = "%1 was changed by another program.";
    const char taken[] = "There is another %1 by now.";
    row("a new folder got something", makeFolder, rewrite("new/two"), "new", changed);
    row("a file in a new folder changed", makeFolder, rewrite("new/one"), "new", changed);
    row("a new folder is gone", makeFolder, dropped("new"), "new", gone);
    row("an edited file was edited", editX, rewrite("games/x"), "games/x", changed);
    row("an edited file is gone", editX, dropped("games/x"), "games/x", gone);
    row(
        "an edited file may be read by more", editX,
        [this] { chmod(QFile::encodeName(in("games/x")), 0604); }, "games/x", changed);
    row("the place of a deleted file is taken", removeX, rewrite("games/x"), "games/x", taken);
    row("the folder of a deleted file is gone", removeX, dropped("games"), "games", gone);
    row(
        "the folder of a deleted file is a link", removeX,
        [this] {
            QVERIFY(QFile::rename(in("games"), in("other")) && QFile::link(in("office"), in("games")));
        },
        "games", changed);
    row("the place before a move is taken", moveX, rewrite("games/x"), "games/x", taken);
    row("what was moved is gone", moveX, dropped("office/x"), "office/x", gone);
    row(
        "what was moved is another file", moveX,
        [this] {
            // Made beside the other one, so that the file system cannot give it the same number.
            make("office/new");
            QVERIFY(QFile::resize(in("office/new"), 3));
            QVERIFY(QFile::remove(in("office/x")) && QFile::rename(in("office/new"), in("office/x")));
        },
        "office/x", changed);
}

void tst_FileStep::refusesWhatIsNotAsItWasLeft()
{
    QFETCH(Operation, operation);
    QFETCH(Meanwhile, meanwhile);
    QFETCH(QString, reason);
    FileStep step = run(operation);
    meanwhile();
    const ExactTree before = ExactTree::of(menu());

    const Refusal refusal = step.undo();

    QCOMPARE(refusal.reason, QString(reason).replace(QLatin1String("menu/"), menu() + QLatin1Char('/')));
    QVERIFY(!refusal.isForGood);
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

void tst_FileStep::givesUpWhatIsNoMoreInTheTrash()
{
    FileStep step = run([&](StepRecorder &recorder) { remove(recorder, "games"); });
    QVERIFY(QDir(home() + QStringLiteral("/Trash")).removeRecursively());
    const Refusal refusal = step.undo();
    QCOMPARE(refusal.reason, QStringLiteral("games is not in the trash any more."));
    QVERIFY(refusal.isForGood);
}

// The disk cannot be foreseen: a folder that lets nothing in looks like any other until one tries.
void tst_FileStep::takesBackWhatItDidWhenTheThirdFails()
{
    const OrdinaryUser user(folder());
    FileStep step = run([&](StepRecorder &recorder) {
        for (const char *name : {"office/o", "games/x", "games/y", "a", "b"})
            remove(recorder, name);
    });
    const ExactTree before = ExactTree::of(menu());
    QVERIFY(QFile::setPermissions(in("games"), QFile::ReadOwner | QFile::ExeOwner));
    const ExactTree closed = ExactTree::of(menu());

    const Refusal refusal = step.undo();

    QVERIFY2(refusal.reason.startsWith(in("games/y")), qPrintable(refusal.reason));
    QCOMPARE(closed.difference(ExactTree::of(menu())), QString());
    QVERIFY(QFile::setPermissions(in("games"), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QVERIFY(chmod(QFile::encodeName(in("games")), 0755) == 0);
    QCOMPARE(step.undo().reason, QString());
    QVERIFY(QFileInfo::exists(in("games/y")) && QFileInfo::exists(in("office/o"))
            && QFileInfo::exists(in("b")));
    QCOMPARE(step.redo().reason, QString());
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

void tst_FileStep::bringsTheMenuBackThatWasReplaced_data()
{
    QTest::addColumn<bool>("hasOlder");
    QTest::newRow("with one that was kept before") << true;
    QTest::newRow("with none") << false;
}

void tst_FileStep::bringsTheMenuBackThatWasReplaced()
{
    QFETCH(bool, hasOlder);
    const QString previous = menu() + QStringLiteral(".previous");
    if (hasOlder)
        write(QStringLiteral("menu.previous/older"), "older");
    const auto state = [&] {
        ExactTree tree = ExactTree::of(menu());
        tree.add(previous);
        return tree;
    };
    const ExactTree before = state();
    FileStep step = run([&](StepRecorder &recorder) {
        std::unique_ptr<KeptThing> older = KeptThing::inTrash(previous);
        QCOMPARE(bool(older), hasOlder);
        QVERIFY(QDir().rename(menu(), previous));
        write(QStringLiteral("menu/new"), "new");
        recorder.changed(std::make_unique<MenuReplacement>(menu(), previous, std::move(older)));
    });
    const ExactTree after = state();
    for (int i = 0; i < 3; ++i) {
        QCOMPARE(step.undo().reason, QString());
        QCOMPARE(before.difference(state()), QString());
        QCOMPARE(step.redo().reason, QString());
        QCOMPARE(after.difference(state()), QString());
    }
    write(QStringLiteral("menu/theirs"), "theirs");
    const ExactTree changed = state();
    QCOMPARE(step.undo().reason, menu() + QStringLiteral(" was changed by another program."));
    QCOMPARE(changed.difference(state()), QString());
}

void tst_FileStep::hasNothingToUndoWhereNothingChanged()
{
    const FileStep step = run([&](StepRecorder &recorder) {
        recorder.mayWrite(in("a"));
        recorder.mayWrite(in("none"));
        recorder.mayMake(in("b"));
        recorder.mayMake(in("none"));
        recorder.mayMove(in("a"), in("b"));
        recorder.mayMove(in("a"), in("none"));
    });
    QVERIFY(step.isEmpty());
}

void tst_FileStep::handlesThreeThousandFiles()
{
    for (int i = 0; i < 3000; ++i)
        make(qPrintable(QStringLiteral("many/%1.desktop").arg(i)));
    const ExactTree before = ExactTree::of(menu());
    QElapsedTimer timer;
    timer.start();
    FileStep step = run([&](StepRecorder &recorder) { remove(recorder, "many"); });
    QCOMPARE(step.undo().reason, QString());
    QCOMPARE(step.redo().reason, QString());
    QCOMPARE(step.undo().reason, QString());
    qInfo("4 operations on 3,000 files: %lld ms", static_cast<long long>(timer.elapsed()));
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

VEL_TEST_GUILESS_MAIN(tst_FileStep)
#include "tst_FileStep.moc"
