// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FaultScene.h"
#include "OtherFileSystem.h"
#include "TestCase.h"

#include <menuedit/FileProgress.h>
#include <menuedit/FileTransfer.h>
#include <menuedit/TreeRemoval.h>

#include <QDir>
#include <QTemporaryDir>

using namespace FileTransfer;

namespace {

/// Says no from the question of that number on.
class Limited : public FileProgress
{
public:
    explicit Limited(int yeses)
        : m_yeses(yeses)
    {
    }

    bool goOn() override
    {
        ++questions;
        return m_yeses-- > 0;
    }

    int questions = 0;

private:
    int m_yeses;
};

} // namespace

/// What operations on files tell of themselves, and what is left of them when they are canceled.
class tst_FileProgress : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void leavesNothingOfACanceledTransfer_data();
    void leavesNothingOfACanceledTransfer();
    void counts_data();
    void counts();
    void asksWhileItCopiesALargeFile();
    void removesNoMoreAfterANo();

private:
    QString target(bool isElsewhere);
    QStringList sources() const
    {
        return {path(QStringLiteral("from/d")), path(QStringLiteral("from/x")),
                path(QStringLiteral("from/e"))};
    }

    std::unique_ptr<QTemporaryDir> m_other;
};

void tst_FileProgress::init()
{
    TestCase::init();
    for (const char *name : {"d/a", "d/b", "d/sub/c", "x", "e/f"})
        write(QStringLiteral("from/") + QLatin1String(name), name);
    QVERIFY(QFile::link(QStringLiteral("a"), path(QStringLiteral("from/d/link"))));
    QVERIFY(QDir().mkpath(path(QStringLiteral("to"))));
}

// A folder, on another file system if asked for; empty where there is none.
QString tst_FileProgress::target(bool isElsewhere)
{
    if (!isElsewhere)
        return path(QStringLiteral("to"));
    const QString other = otherFileSystem(folder());
    if (other.isEmpty())
        return QString();
    m_other = std::make_unique<QTemporaryDir>(other + QStringLiteral("/tst_FileProgress-XXXXXX"));
    return m_other->path();
}

void tst_FileProgress::leavesNothingOfACanceledTransfer_data()
{
    QTest::addColumn<bool>("isMove");
    QTest::addColumn<bool>("isElsewhere");
    QTest::newRow("copy") << false << false;
    QTest::newRow("copy to another file system") << false << true;
    QTest::newRow("move") << true << false;
    QTest::newRow("move to another file system") << true << true;
}

// Canceled at the first question, at the second, and so on until it is done.
void tst_FileProgress::leavesNothingOfACanceledTransfer()
{
    QFETCH(bool, isMove);
    QFETCH(bool, isElsewhere);
    const QString to = target(isElsewhere);
    if (to.isEmpty())
        QSKIP("there is no second file system to write to");
    const auto before = FaultScene::treeOf(path(QStringLiteral("from")));
    for (int yeses = 0;; ++yeses) {
        Limited progress(yeses);
        const Result result = transfer(sources(), to, isMove ? Action::Move : Action::Copy, progress);
        if (result.succeeded()) {
            QVERIFY(yeses >= 3);
            QCOMPARE(FaultScene::treeOf(to), before);
            break;
        }
        QCOMPARE(result.failure, Failure::Canceled);
        QCOMPARE(FaultScene::treeOf(path(QStringLiteral("from"))), before);
        QCOMPARE(FaultScene::treeOf(to), FaultScene::Tree());
    }
    if (!isMove)
        QCOMPARE(FaultScene::treeOf(path(QStringLiteral("from"))), before);
    else
        QCOMPARE(FaultScene::treeOf(path(QStringLiteral("from"))), FaultScene::Tree());
}

void tst_FileProgress::counts_data()
{
    QTest::addColumn<bool>("isMove");
    QTest::addColumn<bool>("isElsewhere");
    QTest::addColumn<int>("items");
    QTest::newRow("copy") << false << false << 9;
    QTest::newRow("move") << true << false << 3;
    QTest::newRow("move to another file system") << true << true << 9;
}

void tst_FileProgress::counts()
{
    QFETCH(bool, isMove);
    QFETCH(bool, isElsewhere);
    QFETCH(int, items);
    const QString to = target(isElsewhere);
    if (to.isEmpty())
        QSKIP("there is no second file system to write to");
    FileProgress progress;
    QVERIFY(transfer(sources(), to, isMove ? Action::Move : Action::Copy, progress).succeeded());
    QCOMPARE(progress.expected(), items);
    QCOMPARE(progress.done(), items);
}

void tst_FileProgress::asksWhileItCopiesALargeFile()
{
    write(QStringLiteral("from/large"), QByteArray(3 * 1024 * 1024, 'x'));
    Limited progress(1000);
    QVERIFY(transfer({path(QStringLiteral("from/large"))}, path(QStringLiteral("to")), Action::Copy, progress)
                .succeeded());
    QVERIFY(progress.questions >= 48);
}

void tst_FileProgress::removesNoMoreAfterANo()
{
    const int all = FaultScene::treeOf(path(QStringLiteral("from/d"))).size() + 1;
    Limited progress(2);
    const TreeRemoval::Result result =
        TreeRemoval::remove(path(QStringLiteral("from/d")).toStdString(), progress);
    QVERIFY(result.error == std::errc::operation_canceled);
    QCOMPARE(FaultScene::treeOf(path(QStringLiteral("from/d"))).size() + 1 + progress.done(), all);
    QVERIFY(progress.done() < all);
}

VEL_TEST_GUILESS_MAIN(tst_FileProgress)
#include "tst_FileProgress.moc"
