// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "TestCase.h"

#include <menuedit/FileProgress.h>
#include <menuedit/TreeRemoval.h>

#include <QDir>
#include <QFile>

#include <filesystem>
#include <fstream>

#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

/// Removing of folders with everything in them.
class tst_TreeRemoval : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void removesWhatIsNotThere();
    void removesNamesThatAreNoText();
    void removesLinksAndNotWhatTheyLeadTo();
    void tellsWhatStaysAndWhy();
    void removesItsOwnWhateverTheRights();
    void removesTheFolderThatCannotBeListedIfItIsEmpty();

private:
    TreeRemoval::Result remove(const char *name) const
    {
        FileProgress nobody;
        return TreeRemoval::remove(native(name), nobody);
    }
    fs::path native(const char *name) const { return fs::path(path(QLatin1String(name)).toStdString()); }
};

void tst_TreeRemoval::removesWhatIsNotThere()
{
    QVERIFY(remove("none").succeeded());
}

void tst_TreeRemoval::removesNamesThatAreNoText()
{
    write(QStringLiteral("d/plain"), "x");
    fs::create_directories(native("d") / "bad\xff\xfe");
    std::ofstream(native("d") / "bad\xff\xfe" / "also\xc3") << "x";
    QVERIFY(remove("d").succeeded());
    QVERIFY(!fs::exists(native("d")));
}

void tst_TreeRemoval::removesLinksAndNotWhatTheyLeadTo()
{
    write(QStringLiteral("elsewhere/kept"), "x");
    write(QStringLiteral("d/plain"), "x");
    QVERIFY(QFile::link(path(QStringLiteral("elsewhere")), path(QStringLiteral("d/link"))));
    QVERIFY(remove("d").succeeded());
    QVERIFY(QFile::link(path(QStringLiteral("elsewhere")), path(QStringLiteral("link"))));
    QVERIFY(remove("link").succeeded());
    QVERIFY(!fs::exists(fs::symlink_status(native("link"))));
    QVERIFY(QFile::exists(path(QStringLiteral("elsewhere/kept"))));
}

void tst_TreeRemoval::tellsWhatStaysAndWhy()
{
    write(QStringLiteral("d/a"), "x");
    write(QStringLiteral("d/closed/b"), "x");
    write(QStringLiteral("d/e"), "x");
    const OrdinaryUser user(folder());
    QCOMPARE(chmod(native("d/closed").c_str(), 0500), 0);
    const TreeRemoval::Result result = remove("d");
    QVERIFY(!result.succeeded());
    QVERIFY(result.error == std::errc::permission_denied);
    QCOMPARE(result.path.string(), native("d/closed/b").string());
    QVERIFY(!QFile::exists(path(QStringLiteral("d/a"))) && !QFile::exists(path(QStringLiteral("d/e"))));
    QVERIFY(QFile::exists(path(QStringLiteral("d/closed/b"))));
    QCOMPARE(chmod(native("d/closed").c_str(), 0700), 0);
}

void tst_TreeRemoval::removesItsOwnWhateverTheRights()
{
    write(QStringLiteral("d/closed/b"), "x");
    const OrdinaryUser user(folder());
    QCOMPARE(chmod(native("d/closed").c_str(), 0), 0);
    FileProgress nobody;
    TreeRemoval::removeOwn(native("d"), nobody);
    QVERIFY(!fs::exists(native("d")));
}

void tst_TreeRemoval::removesTheFolderThatCannotBeListedIfItIsEmpty()
{
    QVERIFY(QDir().mkpath(path(QStringLiteral("d/closed"))));
    write(QStringLiteral("full/closed/a"), "x");
    const OrdinaryUser user(folder());
    QCOMPARE(chmod(native("d/closed").c_str(), 0), 0);
    QVERIFY(remove("d").succeeded());
    QCOMPARE(chmod(native("full/closed").c_str(), 0), 0);
    const TreeRemoval::Result result = remove("full");
    QVERIFY(result.error == std::errc::permission_denied);
    QCOMPARE(result.path.string(), native("full/closed").string());
    QCOMPARE(chmod(native("full/closed").c_str(), 0700), 0);
}

VEL_TEST_GUILESS_MAIN(tst_TreeRemoval)
#include "tst_TreeRemoval.moc"
