// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/FolderWatch.h>
#include <menuedit/KeptThing.h>
#include <menuedit/MenuDrop.h>

#include <QFileSystemModel>

#include <functional>
#include <memory>

#include <sys/stat.h>

namespace {

/// Answers as it was told to, and remembers what it was asked.
class Host : public MenuDropHost
{
public:
    bool confirmOverwrite(const QString &target) override
    {
        questions.append(target);
        return answer ? answer() : true;
    }

    NameClash::Answer askAbout(const NameClash &clash) override
    {
        questions.append(clash.target);
        return decide ? decide(clash) : NameClash::Answer();
    }

    std::optional<QStringList> orderWith(const QStringList &names, int row,
                                         const QModelIndex &folder) override
    {
        if (!hasOrder)
            return std::nullopt;
        places.append(QStringLiteral("%1 before %2 in %3")
                          .arg(names.join(QLatin1Char(' ')))
                          .arg(row)
                          .arg(folder.data().toString()));
        return QStringList(QStringLiteral("*")) + names;
    }

    std::unique_ptr<FileProgress> follow(Qt::DropAction) override { return std::make_unique<Follower>(this); }

    void begins(const QVector<DropItem> &, Qt::DropAction, const QString &) override
    {
        if (begin)
            begin();
    }

    void replaced(const QString &path, std::unique_ptr<KeptThing> kept) override
    {
        kepts.append(path);
        wereKept = wereKept && kept && kept->isThere();
    }

    void finished(const DropResult &) override { QFAIL("is told by the model"); }

    class Follower : public FileProgress
    {
    public:
        explicit Follower(Host *host)
            : m_host(host)
        {
        }
        bool goOn() override { return !m_host->goOn || m_host->goOn(); }

    private:
        Host *m_host;
    };

    std::function<bool()> answer;
    std::function<bool()> goOn;
    std::function<void()> begin;
    std::function<NameClash::Answer(const NameClash &)> decide;
    bool hasOrder = true;
    bool wereKept = true;
    QStringList kepts;
    QStringList questions;
    QStringList places;
};

} // namespace

class tst_MenuDrop : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void movesAndLists();
    void copiesAndListsNothingOnTheFolder();
    void writesNoOrderWhereNobodyShowsOne();
    void writesTheOrderOnlyWhenTheFilesAreThere();
    void onlyReordersInTheOwnFolder();
    void leavesTheOrderOfACopyInTheOwnFolder();
    void bringsInWhatLiesElsewhereBesideTheFirst_data();
    void bringsInWhatLiesElsewhereBesideTheFirst();
    void refusesAllWhereOneOfTheOthersExists();
    void doesNothingInAReadOnlyModel();
    void asksOnlyAboutTheFirstTarget();
    void doesNothingWithoutAYes();
    void refusesATargetThatIsStillThereAfterAYes();
    void goesOnWhenTheTargetIsGoneAfterAYes();
    void doesNothingWhenTheModelGoesWhileItAsks();
    void doesNothingWhenTheUserCancels();
    void takesBackWhenTheModelGoesWhileItCopies_data();
    void takesBackWhenTheModelGoesWhileItCopies();
    void tellsWhatFailed();
    void tellsThatTheOrderWasNotSaved_data();
    void tellsThatTheOrderWasNotSaved();
    void linksAllOrNothing();
    void asksAboutEachWithAssistance();
    void putsWhatMakesRoomIntoTheTrash_data();
    void putsWhatMakesRoomIntoTheTrash();
    void bringsBackWhatMadeRoom_data();
    void bringsBackWhatMadeRoom();
    void listsAllWithAssistance_data();
    void listsAllWithAssistance();
    void asksNothingThatCannotBeDone();
    void doesNothingWhenAllIsSkipped();
    void leavesAllWhenTheModelGoesInAQuestion();
    void makesEntriesOfAddresses();
    void takesEntriesBackWhenAFileFails();
    void tellsThatAnEntryWasNotSaved();

private:
    DropResult drop(const QStringList &files, Qt::DropAction action, int row, bool isAssisted = false);
    DropResult dropWithAddresses(const QStringList &files);
    QString trashed(const QString &name) const { return path(QStringLiteral("data/Trash/files/") + name); }
    QByteArray record() const { return read(path(QStringLiteral("to/.directory"))); }

    std::unique_ptr<QFileSystemModel> m_model;
    FolderWatch *m_watch = nullptr;
    Host m_host;
};

namespace {

const QByteArray Record = "[Desktop Entry]\nType=Directory\nName=To\n";

} // namespace

void tst_MenuDrop::init()
{
    TestCase::init();
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
    for (const char *name : {"to/a", "from/x", "from/y"})
        write(QString::fromUtf8(name), name);
    write(QStringLiteral("to/.directory"), Record);
    m_host = Host();
    m_model = std::make_unique<QFileSystemModel>();
    m_watch = new FolderWatch(m_model.get());
    m_model->setReadOnly(false);
    m_model->setRootPath(path(QStringLiteral("to")));
    QTRY_COMPARE(m_model->rowCount(m_model->index(path(QStringLiteral("to")))), 1);
}

void tst_MenuDrop::cleanup()
{
    m_model.reset();
    TestCase::cleanup();
}

DropResult tst_MenuDrop::drop(const QStringList &files, Qt::DropAction action, int row, bool isAssisted)
{
    QStringList sources;
    for (const QString &file : files)
        sources.append(path(file));
    const QModelIndex folder = m_model->index(path(QStringLiteral("to")));
    return MenuDrop(*m_model, *m_watch, m_host, {sources, action, row, folder, isAssisted}).carryOut();
}

void tst_MenuDrop::movesAndLists()
{
    const DropResult result = drop({QStringLiteral("from/x"), QStringLiteral("from/y")}, Qt::MoveAction, 0);

    QVERIFY(result.isDone);
    QVERIFY(result.sortAnew);
    QCOMPARE(result.complaint, QString());
    QCOMPARE(result.targets, (QStringList{path(QStringLiteral("to/x")), path(QStringLiteral("to/y"))}));
    QCOMPARE(result.moved, (QStringList{path(QStringLiteral("from/x")), path(QStringLiteral("from/y"))}));
    QCOMPARE(m_host.places, QStringList{QStringLiteral("x before 0 in to")});
    QCOMPARE(record(), Record + "SortOrder=*;x;\n");
    QVERIFY(!QFile::exists(path(QStringLiteral("from/y"))));
    QVERIFY(m_host.questions.isEmpty());
}

void tst_MenuDrop::copiesAndListsNothingOnTheFolder()
{
    const DropResult result = drop({QStringLiteral("from/x")}, Qt::CopyAction, -1);

    QVERIFY(result.isDone);
    QVERIFY(!result.sortAnew);
    QVERIFY(result.moved.isEmpty());
    QVERIFY(m_host.places.isEmpty());
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::writesNoOrderWhereNobodyShowsOne()
{
    m_host.hasOrder = false;

    QVERIFY(drop({QStringLiteral("from/x")}, Qt::CopyAction, 0).isDone);

    QCOMPARE(record(), Record);
}

// Not even for a moment: the record file stays the same file.
void tst_MenuDrop::writesTheOrderOnlyWhenTheFilesAreThere()
{
    struct stat before = {};
    const QByteArray recordFile = QFile::encodeName(path(QStringLiteral("to/.directory")));
    QCOMPARE(stat(recordFile.constData(), &before), 0);
    // Such a thing cannot be copied.
    QVERIFY(mkfifo(QFile::encodeName(path(QStringLiteral("from/pipe"))).constData(), 0600) == 0);

    const DropResult result =
        drop({QStringLiteral("from/x"), QStringLiteral("from/pipe")}, Qt::CopyAction, 0);

    QVERIFY(!result.isDone);
    QVERIFY(!result.complaint.isEmpty());
    QVERIFY(!QFile::exists(path(QStringLiteral("to/x"))));
    struct stat after = {};
    QCOMPARE(stat(recordFile.constData(), &after), 0);
    QCOMPARE(after.st_ino, before.st_ino);
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::onlyReordersInTheOwnFolder()
{
    const DropResult result = drop({QStringLiteral("to/a")}, Qt::MoveAction, 1);

    QVERIFY(result.isDone);
    QVERIFY(result.sortAnew);
    QCOMPARE(m_host.places, QStringList{QStringLiteral("a before 1 in to")});
    QCOMPARE(record(), Record + "SortOrder=*;a;\n");
    QVERIFY(QFile::exists(path(QStringLiteral("to/a"))));
}

void tst_MenuDrop::leavesTheOrderOfACopyInTheOwnFolder()
{
    const DropResult result = drop({QStringLiteral("to/a")}, Qt::CopyAction, 0);

    QVERIFY(result.isDone);
    QVERIFY(m_host.places.isEmpty());
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::bringsInWhatLiesElsewhereBesideTheFirst_data()
{
    QTest::addColumn<Qt::DropAction>("action");
    QTest::addColumn<int>("row");
    QTest::addColumn<bool>("isListed");
    QTest::newRow("move between rows") << Qt::MoveAction << 0 << true;
    QTest::newRow("move onto the folder") << Qt::MoveAction << -1 << true;
    QTest::newRow("copy between rows") << Qt::CopyAction << 0 << false;
    QTest::newRow("copy onto the folder") << Qt::CopyAction << -1 << false;
    QTest::newRow("link") << Qt::LinkAction << -1 << false;
}

// The first takes its place as it does alone.
void tst_MenuDrop::bringsInWhatLiesElsewhereBesideTheFirst()
{
    QFETCH(Qt::DropAction, action);
    QFETCH(int, row);
    QFETCH(bool, isListed);
    const DropResult result =
        drop({QStringLiteral("to/a"), QStringLiteral("from/x"), QStringLiteral("from/y")}, action, row);
    QVERIFY(result.isDone);
    QCOMPARE(result.complaint, QString());
    QCOMPARE(m_host.questions, QStringList());
    for (const char *name : {"x", "y"}) {
        QCOMPARE(read(path(QStringLiteral("to/") + QLatin1String(name))), QByteArray("from/") + name);
        QCOMPARE(QFile::exists(path(QStringLiteral("from/") + QLatin1String(name))),
                 action != Qt::MoveAction);
    }
    QCOMPARE(read(path(QStringLiteral("to/a"))), QByteArray("to/a"));
    QCOMPARE(record() == Record + "SortOrder=*;a;\n", isListed);
    QCOMPARE(record() == Record, !isListed);
}

void tst_MenuDrop::refusesAllWhereOneOfTheOthersExists()
{
    write(QStringLiteral("to/y"), "mine");
    const DropResult result =
        drop({QStringLiteral("to/a"), QStringLiteral("from/x"), QStringLiteral("from/y")}, Qt::MoveAction, 0);
    QVERIFY(!result.isDone);
    QCOMPARE(result.complaint,
             path(QStringLiteral("to/y")) + QStringLiteral(" exists and was left as it is."));
    QVERIFY(QFile::exists(path(QStringLiteral("from/x"))) && !QFile::exists(path(QStringLiteral("to/x"))));
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::doesNothingInAReadOnlyModel()
{
    m_model->setReadOnly(true);

    QVERIFY(!drop({QStringLiteral("from/x")}, Qt::MoveAction, 0).isDone);

    QVERIFY(QFile::exists(path(QStringLiteral("from/x"))));
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::asksOnlyAboutTheFirstTarget()
{
    write(QStringLiteral("to/y"), "old");

    const DropResult result = drop({QStringLiteral("from/x"), QStringLiteral("from/y")}, Qt::MoveAction, 0);

    QVERIFY(!result.isDone);
    QVERIFY(m_host.questions.isEmpty());
    QCOMPARE(result.complaint,
             QStringLiteral("%1 exists and was left as it is.").arg(path(QStringLiteral("to/y"))));
    QVERIFY(QFile::exists(path(QStringLiteral("from/x"))));
}

void tst_MenuDrop::doesNothingWithoutAYes()
{
    write(QStringLiteral("to/x"), "old");
    m_host.answer = [] { return false; };

    const DropResult result = drop({QStringLiteral("from/x")}, Qt::MoveAction, 0);

    QVERIFY(!result.isDone);
    QCOMPARE(result.complaint, QString());
    QCOMPARE(m_host.questions, QStringList{path(QStringLiteral("to/x"))});
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::refusesATargetThatIsStillThereAfterAYes()
{
    const QString target = write(QStringLiteral("to/x"), "old");

    const DropResult result = drop({QStringLiteral("from/x")}, Qt::MoveAction, 0);

    QVERIFY(!result.isDone);
    QCOMPARE(result.complaint, QStringLiteral("%1 exists and was left as it is.").arg(target));
    QCOMPARE(read(target), QByteArray("old"));
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::goesOnWhenTheTargetIsGoneAfterAYes()
{
    const QString target = write(QStringLiteral("to/x"), "old");
    m_host.answer = [&target] { return QFile::remove(target); };

    QVERIFY(drop({QStringLiteral("from/x")}, Qt::MoveAction, 0).isDone);

    QCOMPARE(read(target), QByteArray("from/x"));
    QCOMPARE(record(), Record + "SortOrder=*;x;\n");
}

void tst_MenuDrop::doesNothingWhenTheModelGoesWhileItAsks()
{
    const QString target = write(QStringLiteral("to/x"), "old");
    m_host.answer = [this, &target] {
        m_model.reset();
        return QFile::remove(target);
    };

    QVERIFY(!drop({QStringLiteral("from/x")}, Qt::MoveAction, 0).isDone);

    QVERIFY(!QFile::exists(target));
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::doesNothingWhenTheUserCancels()
{
    m_host.goOn = [] { return false; };
    const DropResult result = drop({QStringLiteral("from/x"), QStringLiteral("from/y")}, Qt::CopyAction, 0);
    QVERIFY(!result.isDone);
    QCOMPARE(result.complaint, QString());
    QVERIFY(!QFile::exists(path(QStringLiteral("to/x"))));
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::takesBackWhenTheModelGoesWhileItCopies_data()
{
    QTest::addColumn<Qt::DropAction>("action");
    QTest::newRow("copy") << Qt::CopyAction;
    QTest::newRow("move") << Qt::MoveAction;
}

void tst_MenuDrop::takesBackWhenTheModelGoesWhileItCopies()
{
    QFETCH(Qt::DropAction, action);
    int questions = 0;
    m_host.goOn = [this, &questions] {
        if (++questions == 2)
            m_model.reset();
        return m_model != nullptr;
    };
    const DropResult result = drop({QStringLiteral("from/x"), QStringLiteral("from/y")}, action, 0);
    QVERIFY(!m_model);
    QVERIFY(!result.isDone);
    QCOMPARE(QDir(path(QStringLiteral("to"))).entryList(QDir::Files), QStringList(QStringLiteral("a")));
    QCOMPARE(QDir(path(QStringLiteral("from"))).entryList(QDir::Files),
             QStringList({QStringLiteral("x"), QStringLiteral("y")}));
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::tellsWhatFailed()
{
    DropResult result = drop({QStringLiteral("from/missing")}, Qt::MoveAction, 0);
    QCOMPARE(result.complaint,
             QStringLiteral("%1 does not exist.").arg(path(QStringLiteral("from/missing"))));
    QCOMPARE(result.targets, QStringList{path(QStringLiteral("to/missing"))});

    result = drop({QStringLiteral("to/missing")}, Qt::MoveAction, 0);
    QCOMPARE(result.complaint, QStringLiteral("%1 does not exist.").arg(path(QStringLiteral("to/missing"))));
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::tellsThatTheOrderWasNotSaved_data()
{
    QTest::addColumn<QString>("file");
    QTest::newRow("from elsewhere") << "from/x";
    QTest::newRow("own folder") << "to/a";
}

// The files are where they were dropped all the same.
void tst_MenuDrop::tellsThatTheOrderWasNotSaved()
{
    QFETCH(QString, file);
    QVERIFY(QFile::remove(path(QStringLiteral("to/.directory"))));
    QVERIFY(QDir().mkdir(path(QStringLiteral("to/.directory"))));

    const DropResult result = drop({file}, Qt::MoveAction, 0);

    QVERIFY(result.isDone);
    QVERIFY(QFile::exists(result.targets.constFirst()));
    QCOMPARE(result.complaint,
             QStringLiteral("The order of the folder %1 could not be saved. Make sure that the folder may be "
                            "written and that the disk is not full, then try again.")
                 .arg(path(QStringLiteral("to"))));
}

void tst_MenuDrop::linksAllOrNothing()
{
    m_host.begin = [this] { write(QStringLiteral("to/y"), "came meanwhile"); };

    const DropResult result = drop({QStringLiteral("from/x"), QStringLiteral("from/y")}, Qt::LinkAction, -1);

    QVERIFY(!result.isDone);
    QVERIFY2(
        result.complaint.startsWith(QStringLiteral("Can't link %1: ").arg(path(QStringLiteral("from/y")))),
        qPrintable(result.complaint));
    QCOMPARE(QDir(path(QStringLiteral("to"))).entryList(QDir::Files | QDir::System),
             QStringList({QStringLiteral("a"), QStringLiteral("y")}));
    QCOMPARE(read(path(QStringLiteral("to/y"))), QByteArray("came meanwhile"));
}

void tst_MenuDrop::asksAboutEachWithAssistance()
{
    write(QStringLiteral("to/x"), "old x");
    write(QStringLiteral("to/y"), "old y");
    m_host.decide = [this](const NameClash &clash) {
        return NameClash::Answer{clash.target.endsWith(QLatin1Char('x')) ? NameClash::Choice::KeepBoth
                                                                         : NameClash::Choice::Skip,
                                 false};
    };

    const DropResult result =
        drop({QStringLiteral("from/x"), QStringLiteral("from/y")}, Qt::MoveAction, 0, true);

    QVERIFY(result.isDone);
    QCOMPARE(result.complaint, QString());
    QCOMPARE(result.targets, QStringList{path(QStringLiteral("to/x-2"))});
    QCOMPARE(result.moved, QStringList{path(QStringLiteral("from/x"))});
    QCOMPARE(read(path(QStringLiteral("to/x"))), QByteArray("old x"));
    QCOMPARE(read(path(QStringLiteral("to/x-2"))), QByteArray("from/x"));
    QCOMPARE(read(path(QStringLiteral("to/y"))), QByteArray("old y"));
    QCOMPARE(read(path(QStringLiteral("from/y"))), QByteArray("from/y"));
    QCOMPARE(m_host.questions, (QStringList{path(QStringLiteral("to/x")), path(QStringLiteral("to/y"))}));
    QCOMPARE(record(), Record + "SortOrder=*;x-2;\n");
}

void tst_MenuDrop::putsWhatMakesRoomIntoTheTrash_data()
{
    QTest::addColumn<Qt::DropAction>("action");
    QTest::newRow("move") << Qt::MoveAction;
    QTest::newRow("copy") << Qt::CopyAction;
    QTest::newRow("link") << Qt::LinkAction;
}

void tst_MenuDrop::putsWhatMakesRoomIntoTheTrash()
{
    QFETCH(Qt::DropAction, action);
    write(QStringLiteral("to/x/inner"), "old");
    m_host.decide = [](const NameClash &) { return NameClash::Answer{NameClash::Choice::Replace, false}; };

    QVERIFY(drop({QStringLiteral("from/x")}, action, -1, true).isDone);

    QCOMPARE(read(path(QStringLiteral("to/x"))), QByteArray("from/x"));
    QCOMPARE(read(trashed(QStringLiteral("x/inner"))), QByteArray("old"));
    QCOMPARE(m_host.kepts, QStringList{path(QStringLiteral("to/x"))});
    QVERIFY(m_host.wereKept);
}

void tst_MenuDrop::bringsBackWhatMadeRoom_data()
{
    QTest::addColumn<bool>("isTrash");
    QTest::newRow("from the trash") << true;
    QTest::newRow("from beside") << false;
}

// Such a thing as the last cannot be copied.
void tst_MenuDrop::bringsBackWhatMadeRoom()
{
    QFETCH(bool, isTrash);
    if (!isTrash)
        write(QStringLiteral("data"), "is no folder");
    const QString old = write(QStringLiteral("to/x"), "old");
    QVERIFY(mkfifo(QFile::encodeName(path(QStringLiteral("from/pipe"))).constData(), 0600) == 0);
    m_host.decide = [](const NameClash &) { return NameClash::Answer{NameClash::Choice::Replace, true}; };
    bool wasAway = false;
    m_host.begin = [&] { wasAway = !QFile::exists(old); };

    const DropResult result =
        drop({QStringLiteral("from/x"), QStringLiteral("from/pipe")}, Qt::CopyAction, 0, true);

    QVERIFY(!result.isDone);
    QVERIFY(!result.complaint.isEmpty());
    QVERIFY(wasAway);
    QCOMPARE(read(old), QByteArray("old"));
    QCOMPARE(QDir(path(QStringLiteral("to"))).entryList(QDir::Files | QDir::Hidden),
             QStringList({QStringLiteral(".directory"), QStringLiteral("a"), QStringLiteral("x")}));
    QVERIFY(!QFile::exists(trashed(QStringLiteral("x"))));
    QCOMPARE(m_host.kepts, QStringList());
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::listsAllWithAssistance_data()
{
    QTest::addColumn<QStringList>("files");
    QTest::addColumn<Qt::DropAction>("action");
    QTest::addColumn<int>("row");
    QTest::addColumn<QString>("places");
    const QStringList both{QStringLiteral("from/y"), QStringLiteral("from/x")};
    const QStringList mixed{QStringLiteral("from/y"), QStringLiteral("to/a"), QStringLiteral("from/x")};
    const QStringList here{QStringLiteral("to/b"), QStringLiteral("to/a")};
    QTest::newRow("move") << both << Qt::MoveAction << 0 << "y x before 0 in to";
    QTest::newRow("copy") << both << Qt::CopyAction << 2 << "y x before 2 in to";
    QTest::newRow("link") << both << Qt::LinkAction << 0 << "y x before 0 in to";
    QTest::newRow("onto the folder") << both << Qt::MoveAction << -1 << "";
    QTest::newRow("move of all") << mixed << Qt::MoveAction << 1 << "y a x before 1 in to";
    QTest::newRow("copy of some") << mixed << Qt::CopyAction << 1 << "y x before 1 in to";
    QTest::newRow("within the folder") << here << Qt::MoveAction << 0 << "b a before 0 in to";
    QTest::newRow("copy within the folder") << here << Qt::CopyAction << 0 << "";
}

void tst_MenuDrop::listsAllWithAssistance()
{
    QFETCH(QStringList, files);
    QFETCH(Qt::DropAction, action);
    QFETCH(int, row);
    QFETCH(QString, places);
    write(QStringLiteral("to/b"), "b");
    QTRY_COMPARE(m_model->rowCount(m_model->index(path(QStringLiteral("to")))), 2);

    QVERIFY(drop(files, action, row, true).isDone);

    QCOMPARE(m_host.places.join(QString()), places);
    const QByteArray listed = places.section(QLatin1String(" before"), 0, 0).toLatin1().replace(' ', ';');
    QCOMPARE(record(), places.isEmpty() ? Record : Record + "SortOrder=*;" + listed + ";\n");
}

void tst_MenuDrop::asksNothingThatCannotBeDone()
{
    write(QStringLiteral("to/x"), "old");

    const DropResult result =
        drop({QStringLiteral("from/x"), QStringLiteral("from/missing")}, Qt::MoveAction, 0, true);

    QVERIFY(!result.isDone);
    QCOMPARE(result.complaint,
             QStringLiteral("%1 does not exist.").arg(path(QStringLiteral("from/missing"))));
    QVERIFY(m_host.questions.isEmpty());
}

void tst_MenuDrop::doesNothingWhenAllIsSkipped()
{
    write(QStringLiteral("to/x"), "old");
    m_host.decide = [](const NameClash &) { return NameClash::Answer{NameClash::Choice::Skip, false}; };
    m_host.begin = [] { QFAIL("begins"); };

    const DropResult result = drop({QStringLiteral("from/x")}, Qt::MoveAction, 0, true);

    QVERIFY(!result.isDone);
    QCOMPARE(result.complaint, QString());
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::leavesAllWhenTheModelGoesInAQuestion()
{
    const QString old = write(QStringLiteral("to/x"), "old");
    m_host.decide = [this](const NameClash &) {
        m_model.reset();
        return NameClash::Answer{NameClash::Choice::Replace, true};
    };

    QVERIFY(!drop({QStringLiteral("from/x"), QStringLiteral("from/y")}, Qt::MoveAction, 0, true).isDone);

    QCOMPARE(read(old), QByteArray("old"));
    QVERIFY(QFile::exists(path(QStringLiteral("from/y"))));
}

// Empty names stand for addresses.
DropResult tst_MenuDrop::dropWithAddresses(const QStringList &files)
{
    QStringList sources;
    for (const QString &file : files)
        sources.append(file.isEmpty() ? QString() : path(file));
    const QVector<WebAddress> addresses{{QUrl(QStringLiteral("http://a.org/")), QStringLiteral("A")},
                                        {QUrl(QStringLiteral("http://b.org/")), QString()}};
    const QModelIndex folder = m_model->index(path(QStringLiteral("to")));
    return MenuDrop(*m_model, *m_watch, m_host, {sources, Qt::MoveAction, 0, folder, true, addresses})
        .carryOut();
}

void tst_MenuDrop::makesEntriesOfAddresses()
{
    const QByteArray mine = "mine";
    write(QStringLiteral("to/b.org.desktop"), mine);

    const DropResult result = dropWithAddresses({QString(), QStringLiteral("from/x"), QString()});

    QVERIFY(result.isDone);
    QCOMPARE(m_host.questions, QStringList());
    QCOMPARE(m_host.places, QStringList{QStringLiteral("a.org.desktop x b.org-2.desktop before 0 in to")});
    QCOMPARE(result.moved, QStringList{path(QStringLiteral("from/x"))});
    QVERIFY(read(path(QStringLiteral("to/a.org.desktop"))).contains("URL=http://a.org/\n"));
    QVERIFY(read(path(QStringLiteral("to/b.org-2.desktop"))).contains("Name=b.org\n"));
    QCOMPARE(read(path(QStringLiteral("to/b.org.desktop"))), mine);
}

void tst_MenuDrop::takesEntriesBackWhenAFileFails()
{
    m_host.begin = [this] { write(QStringLiteral("to/x"), "came meanwhile"); };

    const DropResult result = dropWithAddresses({QString(), QStringLiteral("from/x")});

    QVERIFY(!result.isDone);
    QCOMPARE(result.complaint,
             QStringLiteral("%1 exists and was left as it is.").arg(path(QStringLiteral("to/x"))));
    QVERIFY(!QFile::exists(path(QStringLiteral("to/a.org.desktop"))));
    QCOMPARE(record(), Record);
}

void tst_MenuDrop::tellsThatAnEntryWasNotSaved()
{
    const QString second = path(QStringLiteral("to/b.org.desktop"));
    m_host.begin = [this] { write(QStringLiteral("to/b.org.desktop"), "came meanwhile"); };

    const DropResult result = dropWithAddresses({QString(), QString(), QStringLiteral("from/x")});

    QVERIFY(!result.isDone);
    QCOMPARE(result.complaint,
             QStringLiteral("%1 could not be saved. Make sure that the folder %2 may be written and that the "
                            "disk is not full, then try again.")
                 .arg(second, path(QStringLiteral("to"))));
    QCOMPARE(read(second), QByteArray("came meanwhile"));
    QVERIFY(!QFile::exists(path(QStringLiteral("to/a.org.desktop"))));
    QVERIFY(QFile::exists(path(QStringLiteral("from/x"))));
}

VEL_TEST_MAIN(tst_MenuDrop)

#include "tst_MenuDrop.moc"
