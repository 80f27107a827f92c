// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <FolderReplacement.h>

#include <QDir>

#include <cerrno>
#include <cstdio>

/// What a start menu's tests cannot bring about: file systems that exchange nothing.
class FolderReplacementTest : public TestCase
{
    Q_OBJECT

private:
    std::filesystem::path target() const { return path(QStringLiteral("menu")).toStdString(); }
    QStringList names(const QString &folder) const
    {
        return QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot, QDir::Name);
    }
    void fill(const FolderReplacement &replacement)
    {
        QFile file(QString::fromStdString((replacement.folder() / "new").string()));
        QVERIFY(file.open(QIODevice::WriteOnly));
    }

    static int unknownExchange(const char *, const char *)
    {
        errno = EINVAL;
        return -1;
    }
    static int failingExchange(const char *, const char *)
    {
        errno = EIO;
        return -1;
    }
    // The exchange is unknown and the folder that was to take the place is gone.
    static int exchangeThatLosesTheNew(const char *first, const char *)
    {
        std::rename(first, (std::string(first) + "-lost").c_str());
        errno = ENOSYS;
        return -1;
    }

private Q_SLOTS:
    void replacesInTwoStepsWhereNothingCanBeExchanged()
    {
        write(QStringLiteral("menu/old"), "x");
        {
            FolderReplacement replacement(target(), unknownExchange);
            QVERIFY(replacement.isOpen());
            fill(replacement);
            QVERIFY(replacement.commit());
        }
        QCOMPARE(names(path(QStringLiteral("menu"))), QStringList(QStringLiteral("new")));
        QCOMPARE(names(folder()), QStringList(QStringLiteral("menu")));
    }

    void leavesTheOldWhenTheExchangeFails()
    {
        write(QStringLiteral("menu/old"), "x");
        {
            FolderReplacement replacement(target(), failingExchange);
            fill(replacement);
            QVERIFY(!replacement.commit());
        }
        QCOMPARE(names(path(QStringLiteral("menu"))), QStringList(QStringLiteral("old")));
        QCOMPARE(names(folder()), QStringList(QStringLiteral("menu")));
    }

    void putsTheOldBackWhenTheSecondStepFails()
    {
        write(QStringLiteral("menu/old"), "x");
        {
            FolderReplacement replacement(target(), exchangeThatLosesTheNew);
            QVERIFY(!replacement.commit());
        }
        QCOMPARE(names(path(QStringLiteral("menu"))), QStringList(QStringLiteral("old")));
    }

    void leavesNothingWithoutACommit()
    {
        {
            FolderReplacement replacement(target() / "deep" / "deeper");
            QVERIFY(replacement.isOpen());
            fill(replacement);
        }
        QCOMPARE(names(folder()), QStringList());
    }

    void buildsBesideTheTargetOutOfSight()
    {
        FolderReplacement replacement(target());
        QCOMPARE(replacement.folder().parent_path(), target().parent_path());
        QCOMPARE(replacement.folder().filename().string().front(), '.');
    }
};

VEL_TEST_GUILESS_MAIN(FolderReplacementTest)
#include "tst_FolderReplacement.moc"
