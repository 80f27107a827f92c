// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OtherFileSystem.h"
#include "TestCase.h"

#include <menuedit/FileProgress.h>
#include <menuedit/FileTransfer.h>
#include <menuedit/TreeLimits.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <unistd.h>

#include <memory>

using namespace FileTransfer;

/// How much is copied in one go, and moved to another file system.
class tst_TreeLimits : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void tellsWhenItIsTooMuch_data();
    void tellsWhenItIsTooMuch();
    void copiesNothingOfAFolderWithTooManyItems();
    void movesNothingOfAFolderThatIsTooMuchAcrossFileSystems_data();
    void movesNothingOfAFolderThatIsTooMuchAcrossFileSystems();

private:
    bool hasOtherFileSystem() const { return !otherFileSystem(folder()).isEmpty(); }
    QString outside(const char *name) const { return m_outside->filePath(QLatin1String(name)); }

    // On another file system where there is one: a memory disk takes so many files in a second.
    std::unique_ptr<QTemporaryDir> m_outside;
};

namespace {

constexpr int MostItems = TreeLimits::MostItems;
constexpr int MostLevels = TreeLimits::MostLevels;

// A folder with so many children; a link is an item and takes one call.
bool fill(const QString &folder, int items)
{
    if (!QDir().mkpath(folder))
        return false;
    const QByteArray begin = QFile::encodeName(folder) + '/';
    bool done = true;
    for (int i = 0; i < items; ++i)
        done = symlink("x", (begin + QByteArray::number(i)).constData()) == 0 && done;
    return done;
}

bool makeDeep(const QString &folder, int levels)
{
    return QDir().mkpath(folder + QStringLiteral("/x").repeated(levels));
}

int childrenOf(const QString &folder)
{
    return QDir(folder)
        .entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot)
        .size();
}

} // namespace

void tst_TreeLimits::init()
{
    TestCase::init();
    const QString parent = hasOtherFileSystem() ? otherFileSystem(folder()) : folder();
    m_outside = std::make_unique<QTemporaryDir>(parent + QStringLiteral("/tst_TreeLimits-XXXXXX"));
}

void tst_TreeLimits::cleanup()
{
    m_outside.reset();
    TestCase::cleanup();
}

void tst_TreeLimits::tellsWhenItIsTooMuch_data()
{
    QTest::addColumn<int>("items");
    QTest::addColumn<int>("levels");
    QTest::addColumn<bool>("isTooMuch");
    QTest::newRow("most items") << MostItems - 1 << 0 << false;
    QTest::newRow("too many items") << int(MostItems) << 0 << true;
    QTest::newRow("too many items with a folder") << MostItems - 1 << 1 << true;
    QTest::newRow("most levels") << 0 << MostLevels - 1 << false;
    QTest::newRow("too many levels") << 0 << int(MostLevels) << true;
}

void tst_TreeLimits::tellsWhenItIsTooMuch()
{
    QFETCH(int, items);
    QFETCH(int, levels);
    QFETCH(bool, isTooMuch);
    const QString source = outside("from");
    QVERIFY(fill(source, items) && makeDeep(source, levels));
    FileProgress progress;
    const std::error_code error = TreeLimits::check(QFile::encodeName(source).constData(), progress);
    QCOMPARE(error == std::errc::file_too_large, isTooMuch);
    QCOMPARE(bool(error), isTooMuch);
}

void tst_TreeLimits::copiesNothingOfAFolderWithTooManyItems()
{
    const QString source = outside("from");
    const QString target = outside("to");
    QVERIFY(fill(source, MostItems) && QDir().mkpath(target));
    QCOMPARE(transfer({source}, target, Action::Copy).failure, Failure::Failed);
    QCOMPARE(childrenOf(target), 0);
    // What only gets another name is not walked over.
    QVERIFY(transfer({source}, target, Action::Move).succeeded());
    QCOMPARE(childrenOf(target + QStringLiteral("/from")), int(MostItems));
}

void tst_TreeLimits::movesNothingOfAFolderThatIsTooMuchAcrossFileSystems_data()
{
    QTest::addColumn<int>("items");
    QTest::addColumn<int>("levels");
    QTest::addColumn<bool>("isMoved");
    QTest::newRow("too many items") << int(MostItems) << 0 << false;
    QTest::newRow("too many levels") << 1 << int(MostLevels) << false;
    QTest::newRow("most levels") << 1 << MostLevels - 1 << true;
}

void tst_TreeLimits::movesNothingOfAFolderThatIsTooMuchAcrossFileSystems()
{
    QFETCH(int, items);
    QFETCH(int, levels);
    QFETCH(bool, isMoved);
    if (!hasOtherFileSystem())
        QSKIP("there is no second file system to write to");
    const QString source = outside("from");
    QVERIFY(fill(source, items) && makeDeep(source, levels));
    const int before = childrenOf(source);
    QCOMPARE(transfer({source}, folder(), Action::Move).succeeded(), isMoved);
    QCOMPARE(childrenOf(folder()), isMoved ? 1 : 0);
    QCOMPARE(childrenOf(source), isMoved ? 0 : before);
    QCOMPARE(childrenOf(m_outside->path()), isMoved ? 0 : 1); // nothing is left beside it either
}

VEL_TEST_GUILESS_MAIN(tst_TreeLimits)

#include "tst_TreeLimits.moc"
